#include "inventory.h"

#include "flow/building.h"
#include "scenario/vocabulary.h"
#include "viewlayer.h"

#include <HmiStateMachine/popup/popupstate.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

namespace headunit {

namespace {

QJsonValue describe(const QString &popupName)
{
    const QString viewId = popup(popupName)->popupViewId();
    return viewId == popupName ? QJsonValue(popupName)
                               : QJsonObject{{"name", popupName}, {"viewId", viewId}};
}

} // namespace

QString inventory()
{
    QJsonArray popups;
    const QStringList names = popupNames();
    for (const QString &name : names) {
        popups.append(describe(name));
    }
    const QJsonObject all{{"popups", popups},
                          {"domains", QJsonArray::fromStringList(ViewLayer::domainNames())},
                          {"views", QJsonArray::fromStringList(viewIds())}};
    return QString::fromUtf8(QJsonDocument(all).toJson()).trimmed();
}

} // namespace headunit
