#pragma once

#include <QEvent>

namespace HmiStateMachine {

/** The library's events: each value is the distance of the event's type from QEvent::User. */
enum SimpleEventType : int {
    HmiEventType = 260, ///< HmiEvent
    HmiViewEventType = 261, ///< HmiViewEvent
    PopupEventType = 262, ///< PopupEvent
    HmiBackEventType = 263, ///< HmiBackEvent
    HmiFallbackEventType = 264 ///< HmiFallbackEvent
};

/**
 * Base of the library's events. The type number alone tells an event's class: an event of type
 * HmiViewEvent::eventType() is an HmiViewEvent.
 */
template <SimpleEventType N> class SimpleEvent : public QEvent
{
public:
    /** An event of the type eventType(). */
    SimpleEvent() : QEvent(eventType()) { }

    ~SimpleEvent() override = default;

    /** What type() returns for every event of this class. */
    static constexpr QEvent::Type eventType()
    {
        return static_cast<QEvent::Type>(QEvent::User + static_cast<int>(N));
    }
};

} // namespace HmiStateMachine
