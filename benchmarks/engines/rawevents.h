#pragma once

#include <QEvent>
#include <QString>
#include <QVariant>

namespace Raw {

constexpr auto ViewEventType = QEvent::Type(QEvent::User + 1);
constexpr auto BackEventType = QEvent::Type(QEvent::User + 2);
constexpr auto PopupEventType = QEvent::Type(QEvent::User + 3);

/** Asks for a view by its name or its screen. */
class ViewEvent : public QEvent
{
public:
    ViewEvent(const QString &wantedView, const QVariant &viewData)
        : QEvent(ViewEventType), viewId(wantedView), data(viewData)
    {
    }

    const QString viewId;
    const QVariant data;
};

/** Asks for the view that was left last. */
class BackEvent : public QEvent
{
public:
    BackEvent(quint8 backDepth, const QString &backTarget)
        : QEvent(BackEventType), depth(backDepth), targetId(backTarget)
    {
    }

    const quint8 depth;
    const QString targetId;
};

/** Asks for a popup, or for its dismissal. */
class PopupEvent : public QEvent
{
public:
    PopupEvent(const QString &wantedPopup, bool returns, const QVariant &popupData)
        : QEvent(PopupEventType), target(wantedPopup), reactivation(returns), data(popupData)
    {
    }

    const QString target;
    const bool reactivation;
    const QVariant data;
};

} // namespace Raw
