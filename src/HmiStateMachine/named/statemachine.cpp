#include <HmiStateMachine/named/statemachine.h>

#include <HmiStateMachine/hmi/hmistate.h>

#include <QCoreApplication>

namespace HmiStateMachine {

StateMachine::StateMachine(QObject *parent) : QStateMachine(parent)
{
}

StateMachine::~StateMachine() = default;

StateMachine *StateMachine::instance()
{
    // Guarded, because the application object deletes the machine with its other children.
    static QPointer<StateMachine> machine;
    if (!machine) {
        machine = new StateMachine(QCoreApplication::instance());
    }
    return machine;
}

void StateMachine::setInfotainmentState(HmiState *state)
{
    m_infotainmentState = state;
    connect(state, &QAbstractState::entered, this, &StateMachine::updateActive);
    connect(state, &QAbstractState::exited, this, &StateMachine::updateActive);
}

bool StateMachine::infotainmentStateActive() const
{
    return m_infotainmentStateActive;
}

void StateMachine::updateActive()
{
    const bool active = m_infotainmentState && m_infotainmentState->isActive();
    if (active == m_infotainmentStateActive) {
        return;
    }
    m_infotainmentStateActive = active;
    Q_EMIT infotainmentStateActiveChanged();
}

} // namespace HmiStateMachine
