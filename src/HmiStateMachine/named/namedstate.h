#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/identifier.h>

#include <QList>
#include <QState>

namespace HmiStateMachine {

class ChildChecks;
class HmiSignalTransition;
template <typename State> class TargetIndex;

/**
 * A state with a name that is unique in the process, under which transitions find it.
 *
 * The name is entered into one process-wide registry. A state that asks for a name which another
 * state holds is left without a name, with one warning. Entries and exits are logged with the path
 * of the state while setLoggingEnabled() is on, and told to the states that monitor this one.
 *
 * Signal transitions of a named state must be HmiSignalTransition or derive from it. A plain
 * QSignalTransition that becomes a child of a named state ends the process with the message
 * "Raw QSignalTransition usage detected!".
 *
 * It is made with new and belongs to its parent. On entry it is marked active, then tells the
 * states that monitor it, and writes the log last; so it does on exit.
 *
 * The registry may be used from any thread; all else belongs to the thread of the machine.
 */
class HMISTATEMACHINE_EXPORT NamedState : public QState
{
    Q_OBJECT
    Q_PROPERTY(Identifier name READ name WRITE setName NOTIFY nameChanged)

public:
    /** A state without a name. */
    explicit NamedState(QState *parent = nullptr);

    /** A state that takes @p name as setName() does; without one when @p name is empty. */
    explicit NamedState(const QString &name, QState *parent = nullptr);

    /** A state without a name, whose children are active one at a time or all together. */
    explicit NamedState(QState::ChildMode childMode, QState *parent = nullptr);

    /** A state with a name, as setName() takes it, and with a child mode. */
    NamedState(const QString &name, QState::ChildMode childMode, QState *parent = nullptr);

    /** Frees the state's name, by that name alone; see removeFromHash(). */
    ~NamedState() override;

    /** Empty while the state has none. */
    Identifier name() const;

    /**
     * Stores @p name without registering it, for states that share a name with others. The former
     * name is freed; the object name stays and nothing is emitted.
     */
    void setNameNonHashing(const QString &name);

    /** The state registered under @p name; null when the name is empty or unknown. Thread-safe. */
    static NamedState *stateForName(const QString &name);

    /** Every registered state, in the registry's order. Thread-safe. */
    static QList<NamedState *> namedStates();

    /**
     * Registers @p state under @p name. False when the name is empty or the state null, or when a
     * state holds the name, this one included, with a warning; the registry is unchanged then. What
     * name() returns stays as it is, so applications call setName(). Thread-safe.
     */
    static bool hash(const QString &name, NamedState *state);

    /**
     * Frees @p name, whichever state holds it; a name that nobody holds is ignored. Thread-safe.
     */
    static void removeFromHash(const QString &name);

    /** Switches the log of entries and exits for all named states; off at first. */
    static void setLoggingEnabled(bool enabled);

    /** Whether entries and exits are logged. */
    static bool loggingEnabled();

    /** True from the state's onEntry() to its onExit(). */
    bool isActive() const;

    /** Takes @p transition as QState does, but for a plain QSignalTransition, which is fatal. */
    void addTransition(QAbstractTransition *transition);

    /**
     * Adds an HmiSignalTransition from this state to @p target, as a child of this state.
     * @p signal is written with SIGNAL().
     */
    HmiSignalTransition *addTransition(const QObject *sender, const char *signal,
                                       QAbstractState *target);

    /**
     * Ends the process when @p object is a signal transition that is not the library's own. Null
     * and all other objects pass.
     */
    void transitionTypeTest(QObject *object);

    /**
     * Makes this state swallow a key while it is active, so that no transition in a parallel region
     * reacts to it.
     *
     * Covers the key transitions that have been published for this sender, signal, key and status
     * by now. On a state that is already active it takes effect with the next entry.
     */
    void blockKey(int key, int status, QObject *sender, const char *signal);

    /**
     * Lets @p state be told of every entry and exit of this state, in the order in which states
     * were registered. Not owned; null and a state that is registered already are ignored. A state
     * that is destroyed leaves the list.
     */
    void registerMonitoringState(NamedState *state);

    /** Takes @p state off that list; nothing when it is not there. */
    void unregisterMonitoringState(NamedState *state);

public Q_SLOTS:
    /**
     * Gives up the current name and registers @p name. A name that is empty or taken leaves the
     * state without a name, out of the registry and with its object name as it was.
     */
    void setName(const Identifier &name);

Q_SIGNALS:
    /**
     * Emitted by each setName() that is given another name than the present one, after it has taken
     * effect; @p name is empty when the state is left without one.
     */
    void nameChanged(Identifier name);

protected:
    /** Looks at each child that is added, as transitionTypeTest() does. */
    bool event(QEvent *e) override;

    /** What the class does on entry; an override calls it. */
    void onEntry(QEvent *e) override;

    /** What the class does on exit; an override calls it. */
    void onExit(QEvent *e) override;

public:
    /**
     * Subclasses take over the choice of the initial state here. Hides the function of QState,
     * which is not virtual and is the one that a machine uses.
     */
    virtual void setInitialState(QState *state);

    /** Null when there is none, or when it is no QState. */
    virtual QState *initialState() const;

    /** Called with the event that entered a state which this one monitors; does nothing here. */
    virtual void monitoredStateEntered(QEvent *e);

    /** Called with the event that left a state which this one monitors; does nothing here. */
    virtual void monitoredStateExited(QEvent *e);

private:
    Q_DISABLE_COPY(NamedState)

    friend class ChildChecks;
    template <typename State> friend class TargetIndex;

    static constexpr int noPlace = -1;

    static int registryChanges();
    static void noteRegistryChange();
    void checkChildren();
    void forgetMonitor(QObject *monitor);
    QString path() const;

    Identifier m_name;
    bool m_active = false;
    int m_childCheckPlace = noPlace; // here, where it takes no room of its own
    QList<NamedState *> m_monitoringStates;
};

} // namespace HmiStateMachine
