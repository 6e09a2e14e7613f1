#include "seenbyuser.h"

#include "viewlayer.h"

#include <HmiStateMachineQuick/hostattached.h>
#include <HmiStateMachineQuick/popuphost.h>
#include <HmiStateMachineQuick/screenhost.h>

#include <QJSValue>
#include <QQuickItem>
#include <QQuickWindow>

#include <qqml.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

const char *const objectKey = "timeoutMonitor"; // an object is nothing to be compared

struct Finding
{
    bool right;
    QString wrong;
};

QString firstWrong(std::initializer_list<Finding> findings)
{
    for (const Finding &finding : findings) {
        if (!finding.right) {
            return finding.wrong;
        }
    }
    return QString();
}

qreal opacityInWindow(const QQuickItem *item)
{
    qreal opacity = 1;
    for (; item; item = item->parentItem()) {
        opacity *= item->opacity();
    }
    return opacity;
}

bool declares(const QObject *item, const char *property)
{
    return item->metaObject()->indexOfProperty(property) >= 0;
}

QVariant comparable(const QVariant &value)
{
    if (value.userType() != QMetaType::QVariantMap) {
        return value;
    }
    QVariantMap map = value.toMap();
    map.remove(objectKey);
    return map;
}

bool hasData(const QObject *item, const char *property, const QVariant &expected)
{
    return !declares(item, property)
        || comparable(plainValue(item, property)) == comparable(expected);
}

bool fills(const QQuickItem *item, const QQuickItem *host)
{
    return item->parentItem() == host && item->position().isNull() && item->size() == host->size();
}

template <typename Host> qreal attachedPosition(QQuickItem *item)
{
    const auto *attached =
        qobject_cast<HostAttached *>(qmlAttachedPropertiesObject<Host>(item, false));
    return attached ? attached->position() : 0;
}

QString wrongScreen(const ScreenHost *host, const ViewLayer *viewLayer)
{
    const QString view = viewLayer->activeView();
    QQuickItem *screen = host->currentItem();
    if (!screen) {
        return view.isEmpty() ? QString() : "no screen for " + view;
    }
    const QString id = screen->property("viewId").toString();
    const QString wrong = firstWrong({
        {id == view, "the screen of " + id + " for " + view},
        {fills(screen, host), view + " is not in its place"},
        {qFuzzyIsNull(attachedPosition<ScreenHost>(screen)), view + " has not arrived"},
        {isSeen(screen), view + " cannot be seen"},
        {isTouchable(screen), view + " takes no touches"},
        {hasData(screen, "viewData", viewLayer->viewData()), view + " has other view data"},
        {hasData(screen, "activationData", viewLayer->activationData()),
         view + " has other activation data"},
    });
    if (!wrong.isEmpty()) {
        return wrong;
    }
    const auto items = host->childItems();
    for (const QQuickItem *item : items) {
        if (item != screen && item->isVisible()) {
            return "a second screen, " + item->property("viewId").toString() + ", beside " + view;
        }
    }
    return QString();
}

QQuickItem *itemOf(const PopupHost *host, const QString &popupId)
{
    const auto items = host->childItems();
    for (QQuickItem *item : items) {
        if (item->property("popupId").toString() == popupId) {
            return item;
        }
    }
    return nullptr;
}

QString wrongPopup(const PopupHost *host, QQuickItem *popup, const PopupEntry &entry)
{
    const QString &id = entry.popupId;
    const bool wanted = !entry.covered && !host->suppressedLayers().contains(entry.layer);
    if (!wanted) {
        return popup->isVisible() ? id + " can be seen though it is covered" : QString();
    }
    return firstWrong({
        {fills(popup, host), id + " is not in its place"},
        {qFuzzyIsNull(attachedPosition<PopupHost>(popup)), id + " has not arrived"},
        {qFuzzyCompare(popup->scale(), 1), id + " is not in its size"},
        {isSeen(popup), id + " cannot be seen"},
        {isTouchable(popup), id + " takes no touches"},
        {popup->property("popupKind") == entry.kind, id + " is of another kind"},
        {hasData(popup, "popupData", entry.data), id + " has other data"},
        {popup->property("totalTime") == entry.totalTime, id + " has another time"},
    });
}

// Each above the one before.
QString wrongOrder(const PopupHost *host, const PopupListModel *popups)
{
    qreal below = 0;
    for (int row = 0; row < popups->count(); ++row) {
        const QQuickItem *popup = itemOf(host, popups->entry(row).popupId);
        if (popup->z() <= below) {
            return popups->entry(row).popupId + " is not above the popup before it";
        }
        below = popup->z();
    }
    return QString();
}

// popupInFront() does not know of layers that are not drawn.
QString wrongFront(const PopupHost *host, const ViewLayer *viewLayer)
{
    const PopupListModel *popups = viewLayer->shownPopups();
    const QString front = viewLayer->popupInFront();
    const QString layer = popups->entry(popups->indexOf(front)).layer;
    if (host->suppressedLayers().contains(layer)) {
        return QString();
    }
    const QQuickItem *expected = front.isEmpty() ? nullptr : itemOf(host, front);
    return host->topItem() == expected ? QString() : front + " is not the one in front";
}

QString wrongPopups(const PopupHost *host, const ViewLayer *viewLayer)
{
    const PopupListModel *popups = viewLayer->shownPopups();
    if (host->childItems().size() != popups->count()) {
        return QString("%1 popups instead of %2")
            .arg(host->childItems().size())
            .arg(popups->count());
    }
    for (int row = 0; row < popups->count(); ++row) {
        const PopupEntry entry = popups->entry(row);
        QQuickItem *popup = itemOf(host, entry.popupId);
        const QString wrong =
            popup ? wrongPopup(host, popup, entry) : "no item for the popup " + entry.popupId;
        if (!wrong.isEmpty()) {
            return wrong;
        }
    }
    const QString wrong = wrongOrder(host, popups);
    return wrong.isEmpty() ? wrongFront(host, viewLayer) : wrong;
}

void collectSeenTexts(QQuickItem *root, QStringList *texts)
{
    const auto items = root->childItems();
    for (QQuickItem *item : items) {
        if (item->inherits("QQuickText") && isSeen(item)) {
            texts->append(item->property("text").toString());
        }
        collectSeenTexts(item, texts);
    }
}

} // namespace

QQuickItem *seenItem(QQuickItem *root, const QString &objectName)
{
    const auto items = root->childItems();
    for (QQuickItem *item : items) {
        if (item->objectName() == objectName && isSeen(item)) {
            return item;
        }
        if (QQuickItem *found = seenItem(item, objectName)) {
            return found;
        }
    }
    return nullptr;
}

bool isSeen(const QQuickItem *item)
{
    return item->window() && item->isVisible() && qFuzzyCompare(opacityInWindow(item), 1)
        && item->width() > 0 && item->height() > 0;
}

bool isTouchable(const QQuickItem *item)
{
    return item->isEnabled(); // takes its parents into account
}

QVariant plainValue(const QObject *item, const char *property)
{
    const QVariant value = item->property(property);
    return value.userType() == qMetaTypeId<QJSValue>() ? value.value<QJSValue>().toVariant()
                                                       : value;
}

QStringList seenTexts(QQuickItem *root)
{
    QStringList texts;
    collectSeenTexts(root, &texts);
    return texts;
}

QString wrongInScene(const QQuickWindow *window, const ViewLayer *viewLayer)
{
    const auto *screens = window->findChild<ScreenHost *>("screenHost");
    const auto *popups = window->findChild<PopupHost *>("popupHost");
    if (!screens || !popups) {
        return "no host";
    }
    for (const char *name : {"errorCard", "warningBanner"}) {
        if (const auto *item = window->findChild<QQuickItem *>(name)) {
            return QString("%1: %2").arg(name, item->property("text").toString());
        }
    }
    const QString wrong = wrongScreen(screens, viewLayer);
    return wrong.isEmpty() ? wrongPopups(popups, viewLayer) : wrong;
}

} // namespace headunit
