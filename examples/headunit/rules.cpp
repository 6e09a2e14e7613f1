#include "rules.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QFile>
#include <QFileInfo>
#include <QJsonDocument>

using namespace HmiStateMachine;

namespace headunit {

namespace {

std::optional<LocatedFault> rulesFault(const QString &found, const QString &remedy = QString())
{
    return LocatedFault{0, {"a readable file of popup rules", found, remedy}};
}

} // namespace

QString builtInRules()
{
    return QStringLiteral(":/interruptions.json");
}

std::optional<LocatedFault> loadRules(const QString &path)
{
    if (!QFileInfo(path).isFile()) {
        return rulesFault(QFileInfo::exists(path) ? "something that is no regular file"
                                                  : "no such file");
    }
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        return rulesFault("an error: " + file.errorString());
    }
    QJsonParseError error;
    const QJsonDocument document = QJsonDocument::fromJson(file.readAll(), &error);
    if (error.error != QJsonParseError::NoError) {
        return rulesFault("text that is no JSON (" + error.errorString() + ')');
    }
    if (!document.isArray()) {
        return rulesFault("JSON that is no array", "write an array of objects, one a popup");
    }
    PopupInterruptionStore::instance()->loadInterruptionBehaviors(path);
    return std::nullopt;
}

} // namespace headunit
