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
    explicit SimpleEventTransition(QEvent::Type type, QState *sourceState = nullptr);
    explicit SimpleEventTransition(const QList<QEvent::Type> &types, QState *sourceState = nullptr);
    ~SimpleEventTransition() override;

    /** Replaces the first type, or adds @p type when there is none yet. */
    void setEventType(QEvent::Type type);

    /** The first type; QEvent::None when there is none. */
    QEvent::Type eventType() const;
    void setEventTypes(const QList<QEvent::Type> &types);
    QList<QEvent::Type> eventTypes() const;

    /**
     * Joins the group of all transitions with the same types in the same order. False when the
     * priority is taken, or when this transition has another one already.
     */
    bool makeParallelExclusive(int priority);

protected:
    bool eventTest(QEvent *event) override;
    void onTransition(QEvent *event) override;

public:
    QState *getSourceState() const override;
    void changeTarget(QState *target) override;
    QAbstractState *getTarget() const override;
    bool internalEventTest(QEvent *event) override;

private:
    Q_DISABLE_COPY(SimpleEventTransition)

    QList<QEvent::Type> m_eventTypes;
};

} // namespace HmiStateMachine
