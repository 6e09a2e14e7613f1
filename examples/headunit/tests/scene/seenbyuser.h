#pragma once

#include <QString>
#include <QVariant>

#include <optional>

class QQuickItem;
class QQuickWindow;

namespace headunit {

class ViewLayer;

/** The item of that name below @p root that the user can see; null when there is none. */
QQuickItem *seenItem(QQuickItem *root, const QString &objectName);

/** Whether it is visible and opaque, up to the window, and has a size. */
bool isSeen(const QQuickItem *item);

/** Whether it takes touches, up to the window. */
bool isTouchable(const QQuickItem *item);

/** A property of an item as C++ wrote it, whatever QML made of it meanwhile. */
QVariant plainValue(const QObject *item, const char *property);

/** The items that the user sees as text below @p root, in the order of the tree. */
QStringList seenTexts(QQuickItem *root);

/**
 * What a user sees at rest that is not what @p viewLayer was told to show; empty when all is well:
 * the one screen of the active view, the shown popups in their order, the one in front before all
 * others, no covered one, and no error or warning.
 */
QString wrongInScene(const QQuickWindow *window, const ViewLayer *viewLayer);

} // namespace headunit
