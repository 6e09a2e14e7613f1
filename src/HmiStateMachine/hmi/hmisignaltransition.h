#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>

#include <QList>
#include <QPointer>
#include <QSignalTransition>
#include <QVariant>

namespace HmiStateMachine {

/**
 * The library's signal transition; named states accept no other kind.
 *
 * It can be blocked, and tells the arguments of the signal that fired it by
 * triggeredWithArguments(). A sender that is destroyed leaves the transition without one.
 */
class HMISTATEMACHINE_EXPORT HmiSignalTransition : public QSignalTransition,
                                                   public NamedTargetTransitionBase
{
    Q_OBJECT

public:
    /** A transition without a sender, which fires once it has been given one. */
    explicit HmiSignalTransition(QState *sourceState = nullptr);

    /**
     * @p signal is written with SIGNAL(). @p sender is not owned. Hangs on @p sourceState, and on
     * the exclusive layer of one that has layers.
     */
    HmiSignalTransition(const QObject *sender, const char *signal, QState *sourceState = nullptr);
    ~HmiSignalTransition() override;

    /** Whether it is blocked. Off at first. */
    bool blocked() const;

    /**
     * A blocked transition never fires. It still counts in its sibling groups, where it takes the
     * event from those of lower priority.
     */
    void setBlocked(bool blocked);

    /**
     * Joins the group of all transitions for the same sender and signal. False when the priority is
     * taken, or when this transition has another one already.
     */
    bool makeParallelExclusive(int priority);

protected:
    /**
     * Accepts what internalEventTest() accepts, unless it is blocked or a sibling takes the event.
     */
    bool eventTest(QEvent *event) override;

    /** Takes the transition off the list of firing ones and passes a voice request on. */
    void onTransition(QEvent *event) override;

public:
    QState *getSourceState() const override;
    void changeTarget(QState *target) override;
    QAbstractState *getTarget() const override;

    // In place, because every transition of an active state is asked three times for every event.
    /** Sender and signal, as QSignalTransition compares them. */
    bool internalEventTest(QEvent *event) override { return QSignalTransition::eventTest(event); }

    /** HmiState::addHmiTransition() has made @p state the source; does nothing here. */
    virtual void sourceStateChange(QState *state);

Q_SIGNALS:
    /**
     * Follows each firing, before the target is entered and before any other receiver of
     * triggered() is called. The arguments are those of the signal, in its order; none for a signal
     * without.
     */
    void triggeredWithArguments(QVariantList triggerArguments);

private:
    Q_DISABLE_COPY(HmiSignalTransition)

    friend class TriggerFunctor;

    bool takeSignal(QEvent *event);
    void followSender();
    void forgetSender();

    QList<QVariant> m_triggerArguments;
    QMetaObject::Connection m_senderDestroyed;
};

/** Emits a transition's triggeredWithArguments() when it is called; nothing once that is gone. */
class HMISTATEMACHINE_EXPORT TriggerFunctor
{
public:
    /** @p transition is not owned. */
    explicit TriggerFunctor(HmiSignalTransition *transition);

    /** Emits the arguments with which the transition was fired last. */
    void operator()() const;

private:
    QPointer<HmiSignalTransition> m_transition;
};

} // namespace HmiStateMachine
