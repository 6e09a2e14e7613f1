#pragma once

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/hmistatemachine_export.h>

#include <QEvent> // complete, or the guard signals cannot be connected by member pointer

namespace HmiStateMachine {

/**
 * A signal transition that whoever listens may veto or allow at run time, as a GuardedTransition.
 *
 * The guard is asked only when sender and signal match. It denies by default.
 */
class HMISTATEMACHINE_EXPORT GuardedSignalTransition : public HmiSignalTransition
{
    Q_OBJECT
    Q_PROPERTY(bool allowTransition READ allowTransition WRITE setAllowTransition NOTIFY
                   allowTransitionChanged)
    Q_PROPERTY(bool allowTransitionDefault READ allowTransitionDefault WRITE
                   setAllowTransitionDefault NOTIFY allowTransitionDefaultChanged)

public:
    /** A transition without a sender, which fires once it has been given one. */
    explicit GuardedSignalTransition(QState *sourceState = nullptr);

    /**
     * @p signal is written with SIGNAL(). @p sender is not owned. Hangs on @p sourceState, and on
     * the exclusive layer of one that has layers.
     */
    GuardedSignalTransition(QObject *sender, const char *signal, QState *sourceState = nullptr);
    ~GuardedSignalTransition() override;

    /** The answer to the last test, or what has been set since. */
    bool allowTransition() const;

    /** What each test begins with. */
    bool allowTransitionDefault() const;

    /**
     * Asks the guard about @p e, which has matched otherwise: resets allowTransition, emits
     * transitionTest(), and emits testFailed() when the answer is no.
     */
    bool testTransition(QEvent *e);

    /** Sender and signal first, then the guard. */
    bool internalEventTest(QEvent *event) override;

public Q_SLOTS:
    /** Lets the event that is being tested pass, or not. */
    void setAllowTransition(bool arg);

    /** Leaves allowTransition as it is until the next test. */
    void setAllowTransitionDefault(bool arg);

Q_SIGNALS:
    /** Only on a change by setAllowTransition(); the reset before a test emits nothing. */
    void allowTransitionChanged(bool arg);
    void allowTransitionDefaultChanged(bool arg);

    /** The time to call setAllowTransition(). @p e lives until the emission returns. */
    void transitionTest(QEvent *e);

    /** The guard has refused @p e. */
    void testFailed(QEvent *e);

private:
    Q_DISABLE_COPY(GuardedSignalTransition)

    bool m_allowTransition = false;
    bool m_allowTransitionDefault = false;
};

} // namespace HmiStateMachine
