#include <HmiStateMachine/named/namedstate.h>

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/internal/childchecks.h>
#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/internal/metatypes.h>
#include <HmiStateMachine/named/keysignaltransition.h>

#include <QAtomicInt>
#include <QChildEvent>
#include <QHash>
#include <QMutex>
#include <QPointer>
#include <QThread>
#include <QVector>

#include <mutex>

namespace HmiStateMachine {

Q_CONSTRUCTOR_FUNCTION(registerMetaTypes)

namespace {

// Locks and unlocks in place when nobody else does, which QMutexLocker leaves to a call.
using Lock = std::lock_guard<QBasicMutex>;

struct Registry
{
    QHash<QString, NamedState *> stateHash;
    QBasicMutex hashGuard;
    QAtomicInt changes; // read without the lock
    bool s_loggingEnabled = false;
};

// Made with the first state, so that it outlives every state, also those of static storage. In
// place, as every view request asks for a name.
Q_ALWAYS_INLINE Registry &registry()
{
    static Registry instance;
    return instance;
}

struct Holder
{
    const QObject *state;
    const QString &name;
};

// A state of another thread may be renamed or destroyed meanwhile: not even its object name is
// read, and what is written of it is what the registry knows.
QDebug operator<<(QDebug debug, Holder holder)
{
    if (holder.state->thread() == QThread::currentThread()) {
        return debug << holder.state;
    }
    const QDebugStateSaver saver(debug);
    debug.nospace() << NamedState::staticMetaObject.className() << '('
                    << static_cast<const void *>(holder.state) << ", name = " << holder.name << ')';
    return debug;
}

void warnOfCollision(const QString &name, const QObject *state, const QObject *holder)
{
    // The registry is locked: nothing here may call it.
    HMI_WARNING_FROM(hmistatemachine(), "hash")
        << "NamedState name collision detected!\n"
        << QStringLiteral("Name: \"") + name + QStringLiteral("\"\n") << "This state: " << state
        << "\n"
        << "Colliding state: " << Holder{holder, name};
}

// One walk up the bases in place of two casts: every child of every state comes through here.
bool isRawSignalTransition(const QObject *object)
{
    for (const QMetaObject *base = object ? object->metaObject() : nullptr; base;
         base = base->superClass()) {
        if (base == &HmiSignalTransition::staticMetaObject) {
            return false;
        }
        if (base == &QSignalTransition::staticMetaObject) {
            return true;
        }
    }
    return false;
}

// Guarded, so that a monitor that is deleted by another one is not called any more.
QVector<QPointer<NamedState>> guarded(const QList<NamedState *> &states)
{
    QVector<QPointer<NamedState>> result;
    result.reserve(states.size());
    for (NamedState *state : states) {
        result.append(state);
    }
    return result;
}

} // namespace

NamedState::NamedState(QState *parent) : QState(parent)
{
}

NamedState::NamedState(const QString &name, QState *parent) : QState(parent)
{
    setName(name);
}

NamedState::NamedState(QState::ChildMode childMode, QState *parent) : QState(childMode, parent)
{
}

NamedState::NamedState(const QString &name, QState::ChildMode childMode, QState *parent)
    : QState(childMode, parent)
{
    setName(name);
}

NamedState::~NamedState()
{
    if (m_childCheckPlace != noPlace) {
        ChildChecks::ofThisThread().remove(this);
    }
    // The list of monitors goes before the base does: from here on no monitor's end may reach it,
    // this state's own included.
    for (const NamedState *monitor : qAsConst(m_monitoringStates)) {
        disconnect(monitor, &QObject::destroyed, this, &NamedState::forgetMonitor);
    }
    // By the name alone: the entry goes whichever state holds it.
    removeFromHash(m_name);
}

Identifier NamedState::name() const
{
    return m_name;
}

void NamedState::setNameNonHashing(const QString &name)
{
    removeFromHash(m_name);
    m_name = name;
}

NamedState *NamedState::stateForName(const QString &name)
{
    Registry &r = registry();
    const Lock lock(r.hashGuard);
    return r.stateHash.value(name, nullptr);
}

QList<NamedState *> NamedState::namedStates()
{
    Registry &r = registry();
    const Lock lock(r.hashGuard);
    return r.stateHash.values();
}

bool NamedState::hash(const QString &name, NamedState *state)
{
    if (name.isEmpty() || !state) {
        return false;
    }
    Registry &r = registry();
    const Lock lock(r.hashGuard);
    NamedState *&entry = r.stateHash[name];
    if (entry) {
        warnOfCollision(name, state, entry);
        return false;
    }
    entry = state;
    r.changes.ref();
    return true;
}

void NamedState::removeFromHash(const QString &name)
{
    if (name.isEmpty()) {
        return;
    }
    Registry &r = registry();
    const Lock lock(r.hashGuard);
    if (r.stateHash.remove(name) > 0) {
        r.changes.ref();
    }
}

int NamedState::registryChanges()
{
    return registry().changes.loadAcquire();
}

void NamedState::noteRegistryChange()
{
    registry().changes.ref();
}

void NamedState::setLoggingEnabled(bool enabled)
{
    registry().s_loggingEnabled = enabled;
}

bool NamedState::loggingEnabled()
{
    return registry().s_loggingEnabled;
}

bool NamedState::isActive() const
{
    return m_active;
}

void NamedState::addTransition(QAbstractTransition *transition)
{
    transitionTypeTest(transition);
    QState::addTransition(transition);
}

HmiSignalTransition *NamedState::addTransition(const QObject *sender, const char *signal,
                                               QAbstractState *target)
{
    auto *transition = new HmiSignalTransition(sender, signal, this);
    transition->setTargetState(target);
    return transition;
}

void NamedState::transitionTypeTest(QObject *object)
{
    if (isRawSignalTransition(object)) {
        QMessageLogger(__FILE__, __LINE__, __func__).fatal("Raw QSignalTransition usage detected!");
    }
}

void NamedState::blockKey(int key, int status, QObject *sender, const char *signal)
{
    int priority = 1;
    const auto published = KeySignalTransition::keySignalTransitions(sender, signal, key, status);
    for (KeySignalTransition *transition : published) {
        transition->makeParallelExclusive(priority++);
    }
    auto *blocker = new KeySignalTransition(sender, signal, key, status, this);
    while (!blocker->makeParallelExclusive(priority)) {
        ++priority;
    }
}

void NamedState::registerMonitoringState(NamedState *state)
{
    if (!state || m_monitoringStates.contains(state)) {
        return;
    }
    m_monitoringStates.append(state);
    connect(state, &QObject::destroyed, this, &NamedState::forgetMonitor);
}

void NamedState::unregisterMonitoringState(NamedState *state)
{
    if (m_monitoringStates.removeAll(state) > 0) {
        disconnect(state, &QObject::destroyed, this, &NamedState::forgetMonitor);
    }
}

void NamedState::setName(const Identifier &name)
{
    if (name == m_name) {
        return;
    }
    removeFromHash(m_name);
    if (hash(name, this)) {
        m_name = name;
        setObjectName(name);
    } else {
        m_name.clear();
    }
    Q_EMIT nameChanged(m_name);
}

bool NamedState::event(QEvent *e)
{
    if (e->type() == QEvent::ChildAdded) {
        QObject *child = static_cast<QChildEvent *>(e)->child();
        // A child that is made with this state as its parent announces itself from the constructor
        // of QObject, as yet a mere QObject. It is looked at again when the event loop runs, or on
        // entry.
        if (child->metaObject() != &QObject::staticMetaObject) {
            transitionTypeTest(child);
        } else if (m_childCheckPlace == noPlace) {
            ChildChecks::ofThisThread().add(this);
        }
    } else if (e->type() == QEvent::ThreadChange && m_childCheckPlace != noPlace) {
        // The children are all whole when they move.
        ChildChecks::ofThisThread().remove(this);
        checkChildren();
    }
    return QState::event(e);
}

void NamedState::onEntry(QEvent *e)
{
    m_active = true;
    if (m_childCheckPlace != noPlace) {
        ChildChecks::ofThisThread().remove(this);
        checkChildren();
    }
    if (!m_monitoringStates.isEmpty()) {
        const auto monitors = guarded(m_monitoringStates);
        for (const QPointer<NamedState> &monitor : monitors) {
            if (monitor) {
                monitor->monitoredStateEntered(e);
            }
        }
    }
    if (loggingEnabled()) {
        HMI_DEBUG(hmistatemachine()) << "Entering state:" << path();
    }
}

void NamedState::onExit(QEvent *e)
{
    m_active = false;
    if (!m_monitoringStates.isEmpty()) {
        const auto monitors = guarded(m_monitoringStates);
        for (const QPointer<NamedState> &monitor : monitors) {
            if (monitor) {
                monitor->monitoredStateExited(e);
            }
        }
    }
    if (loggingEnabled()) {
        HMI_DEBUG(hmistatemachine()) << "Exiting state:" << path();
    }
}

void NamedState::setInitialState(QState *state)
{
    QState::setInitialState(state);
}

QState *NamedState::initialState() const
{
    return qobject_cast<QState *>(QState::initialState());
}

void NamedState::monitoredStateEntered(QEvent *e)
{
    Q_UNUSED(e)
}

void NamedState::monitoredStateExited(QEvent *e)
{
    Q_UNUSED(e)
}

void NamedState::checkChildren()
{
    const QObjectList list = children();
    for (QObject *child : list) {
        transitionTypeTest(child);
    }
}

void NamedState::forgetMonitor(QObject *monitor)
{
    // Compared as an address: all that is left of the monitor is its QObject.
    for (int i = m_monitoringStates.size() - 1; i >= 0; --i) {
        if (static_cast<QObject *>(m_monitoringStates.at(i)) == monitor) {
            m_monitoringStates.removeAt(i);
        }
    }
}

QString NamedState::path() const
{
    QString result = m_name;
    for (auto *ancestor = qobject_cast<QState *>(parentState()); ancestor;
         ancestor = ancestor->parentState()) {
        const auto *named = qobject_cast<NamedState *>(ancestor);
        const QString segment = named ? named->name() : QStringLiteral("Unnamed");
        result.prepend(segment + QStringLiteral("->"));
    }
    return result;
}

} // namespace HmiStateMachine
