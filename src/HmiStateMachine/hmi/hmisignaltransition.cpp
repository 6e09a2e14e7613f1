#include <HmiStateMachine/hmi/hmisignaltransition.h>

#include <HmiStateMachine/internal/exclusivelayer.h>
#include <HmiStateMachine/internal/siblinggroups.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>

#include <QSignalBlocker>
#include <QState>
#include <QStateMachine>

namespace HmiStateMachine {

HmiSignalTransition::HmiSignalTransition(QState *sourceState)
    : HmiSignalTransition(nullptr, nullptr, sourceState)
{
}

HmiSignalTransition::HmiSignalTransition(const QObject *sender, const char *signal,
                                         QState *sourceState)
    : QSignalTransition(sender, signal, exclusiveLayerOf(sourceState))
{
    // First of all connections to triggered(), so that the arguments are told before anything else.
    connect(this, &QAbstractTransition::triggered, TriggerFunctor(this));
    connect(this, &QSignalTransition::senderObjectChanged, this,
            &HmiSignalTransition::followSender);
    followSender();
}

HmiSignalTransition::~HmiSignalTransition()
{
    // Takes the sender off the machine's list of connections, where Qt would leave it. Nobody is
    // told, and a transition that is its own sender must not hear of its own end.
    disconnect(m_senderDestroyed);
    const QSignalBlocker quiet(this);
    setSenderObject(nullptr);
}

bool HmiSignalTransition::blocked() const
{
    return isBlocked();
}

void HmiSignalTransition::setBlocked(bool blocked)
{
    block(blocked);
}

bool HmiSignalTransition::makeParallelExclusive(int priority)
{
    static SiblingGroups siblingGroups;
    const QString sender = QString::number(reinterpret_cast<quintptr>(senderObject()), 16);
    const QString key = QStringLiteral("%1::%2").arg(sender, QString::fromLatin1(signal()));
    return ensureGroup(siblingGroups[key])->addTransition(this, priority);
}

bool HmiSignalTransition::eventTest(QEvent *event)
{
    // Short: Qt asks every transition of an active state three times for every event.
    return !isBlocked() && internalEventTest(event) && takeSignal(event);
}

void HmiSignalTransition::onTransition(QEvent *event)
{
    QSignalTransition::onTransition(event);
    finishTransition();
}

QState *HmiSignalTransition::getSourceState() const
{
    return sourceState();
}

void HmiSignalTransition::changeTarget(QState *target)
{
    setTargetState(target);
}

QAbstractState *HmiSignalTransition::getTarget() const
{
    return targetState();
}

void HmiSignalTransition::sourceStateChange(QState *state)
{
    Q_UNUSED(state)
}

bool HmiSignalTransition::takeSignal(QEvent *event)
{
    if (!arbitrate(event)) {
        return false;
    }
    m_triggerArguments = static_cast<QStateMachine::SignalEvent *>(event)->arguments();
    return true;
}

// Qt keeps the sender as a bare pointer and disconnects from it when the machine stops or the
// source is left for good: a sender that is destroyed before has to be given up in time.
void HmiSignalTransition::followSender()
{
    disconnect(m_senderDestroyed);
    if (const QObject *sender = senderObject()) {
        m_senderDestroyed =
            connect(sender, &QObject::destroyed, this, &HmiSignalTransition::forgetSender);
    }
}

void HmiSignalTransition::forgetSender()
{
    setSenderObject(nullptr);
}

TriggerFunctor::TriggerFunctor(HmiSignalTransition *transition) : m_transition(transition)
{
}

void TriggerFunctor::operator()() const
{
    if (m_transition) {
        Q_EMIT m_transition->triggeredWithArguments(m_transition->m_triggerArguments);
    }
}

} // namespace HmiStateMachine
