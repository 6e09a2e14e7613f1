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
    explicit GuardedSignalTransition(QState *sourceState = nullptr);

    /** @p signal is written with SIGNAL(). */
    GuardedSignalTransition(QObject *sender, const char *signal, QState *sourceState = nullptr);
    ~GuardedSignalTransition() override;

    bool allowTransition() const;
    bool allowTransitionDefault() const;

    /** Asks the guard about @p e, which has matched otherwise. */
    bool testTransition(QEvent *e);

    bool internalEventTest(QEvent *event) override;

public Q_SLOTS:
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
