#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>

#include <QAbstractTransition>
#include <QEvent>
#include <QList>

namespace HmiStateMachine {

/** Fires on any event of one of its types, whatever the event carries. */
class HMISTATEMACHINE_EXPORT SimpleEventTransition : public QAbstractTransition,
                                                     public NamedTargetTransitionBase
{
    Q_OBJECT

public:
    /**
     * Reacts to events of @p type. Hangs on @p sourceState, and on the exclusive layer of one that
     * has layers.
     */
    explicit SimpleEventTransition(QEvent::Type type, QState *sourceState = nullptr);

    /** Reacts to events of any of @p types; to none when the list is empty. */
    explicit SimpleEventTransition(const QList<QEvent::Type> &types, QState *sourceState = nullptr);
    ~SimpleEventTransition() override;

    /** Replaces the first type, or adds @p type when there is none yet. */
    void setEventType(QEvent::Type type);

    /** The first type; QEvent::None when there is none. */
    QEvent::Type eventType() const;

    /** Replaces all types. A group that was joined before is not left. */
    void setEventTypes(const QList<QEvent::Type> &types);

    /** All types, in the order in which they were given. */
    QList<QEvent::Type> eventTypes() const;

    /**
     * Joins the group of all transitions with the same types in the same order. False when the
     * priority is taken, or when this transition has another one already.
     */
    bool makeParallelExclusive(int priority);

protected:
    /** Accepts an event of one of the types, unless a sibling takes it. */
    bool eventTest(QEvent *event) override;

    /** Takes the transition off the list of firing ones and passes a voice request on. */
    void onTransition(QEvent *event) override;

public:
    QState *getSourceState() const override;
    void changeTarget(QState *target) override;
    QAbstractState *getTarget() const override;

    /** Whether the type of @p event is one of the types. */
    bool internalEventTest(QEvent *event) override;

private:
    Q_DISABLE_COPY(SimpleEventTransition)

    QList<QEvent::Type> m_eventTypes;
};

} // namespace HmiStateMachine
