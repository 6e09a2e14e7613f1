#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>

#include <QAbstractTransition>
#include <QEvent> // complete, or the guard signals cannot be connected by member pointer

namespace HmiStateMachine {

/**
 * An event transition that whoever listens may veto or allow at run time.
 *
 * For each event allowTransition is reset to allowTransitionDefault and transitionTest() is
 * emitted, whatever the type of the event; receivers that are connected directly may then call
 * setAllowTransition(), and the last call wins. It denies by default.
 *
 * Qt offers every newly entered configuration an event of type QEvent::None first: a guard that
 * allows it lets the transition fire as soon as its source is entered. Without a target it is not
 * taken on such an event, with one warning, because it would be taken for ever.
 *
 * @code
 * auto *leave = new GuardedTransition(menu);
 * leave->setTargetState(home);
 * QObject::connect(leave, &GuardedTransition::transitionTest, leave, [leave](QEvent *event) {
 *     leave->setAllowTransition(event->type() == QEvent::User);
 * });
 * @endcode
 */
class HMISTATEMACHINE_EXPORT GuardedTransition : public QAbstractTransition,
                                                 public NamedTargetTransitionBase
{
    Q_OBJECT
    Q_PROPERTY(bool allowTransition READ allowTransition WRITE setAllowTransition NOTIFY
                   allowTransitionChanged)
    Q_PROPERTY(bool allowTransitionDefault READ allowTransitionDefault WRITE
                   setAllowTransitionDefault NOTIFY allowTransitionDefaultChanged)

public:
    /** Hangs on @p sourceState, and on the exclusive layer of one that has layers. */
    explicit GuardedTransition(QState *sourceState = nullptr);
    ~GuardedTransition() override;

    /** The answer to the last test, or what has been set since. */
    bool allowTransition() const;

    /** What each test begins with. */
    bool allowTransitionDefault() const;

    /**
     * Joins the one group that all guarded transitions of the process share. False when the
     * priority is taken, or when this transition has another one already.
     */
    bool makeParallelExclusive(int priority);

protected:
    /** Accepts what internalEventTest() accepts, unless a sibling takes it. */
    bool eventTest(QEvent *event) override;

    /** Takes the transition off the list of firing ones and passes a voice request on. */
    void onTransition(QEvent *event) override;

public:
    QState *getSourceState() const override;
    void changeTarget(QState *target) override;
    QAbstractState *getTarget() const override;

    /** Asks the guard, by transitionTest(). */
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
    Q_DISABLE_COPY(GuardedTransition)

    bool m_allowTransition = false;
    bool m_allowTransitionDefault = false;
};

} // namespace HmiStateMachine
