#include <HmiStateMachine/hmi/hmilayeredstate.h>

#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>

namespace HmiStateMachine {

HmiLayeredState::HmiLayeredState(const QString &name, QState *parent) : HmiState(name, parent)
{
    setChildMode(QState::ParallelStates);
    HmiState *internal = HmiState::createWithoutHashing(QStringLiteral("Internal"), this);
    m_exclusiveState = HmiState::createWithoutHashing(QStringLiteral("Exclusive"), internal);
    internal->setInitialState(m_exclusiveState);
    m_popupState = new PopupRootState(name + QStringLiteral("_PopupRootState"), this);
}

HmiLayeredState::~HmiLayeredState() = default;

HmiState *HmiLayeredState::exclusiveState() const
{
    return m_exclusiveState;
}

PopupRootState *HmiLayeredState::popupState() const
{
    return m_popupState;
}

void HmiLayeredState::setInitialState(QState *state)
{
    HMI_WARNING(hmistatemachine()) << "Please use setInitialHmiState instead";
    setInitialHmiState(state);
}

QState *HmiLayeredState::initialState() const
{
    HMI_WARNING(hmistatemachine()) << "Please use initialHmiState instead";
    return qobject_cast<QState *>(initialHmiState());
}

void HmiLayeredState::setInitialHmiState(QState *state)
{
    if (qobject_cast<PopupState *>(state)) {
        HMI_WARNING(hmistatemachine())
            << "Setting an initial PopupState is not supported using setInitialHmiState.\n"
            << "Please consider making a popup request on state entry.";
        return;
    }
    m_exclusiveState->setInitialState(state);
}

QAbstractState *HmiLayeredState::initialHmiState() const
{
    return m_exclusiveState->initialState();
}

} // namespace HmiStateMachine
