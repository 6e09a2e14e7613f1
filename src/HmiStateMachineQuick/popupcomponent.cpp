#include <HmiStateMachineQuick/popupcomponent.h>

namespace HmiStateMachine {

PopupComponent::PopupComponent(QObject *parent) : HostedComponent(parent)
{
}

PopupComponent::~PopupComponent() = default;

QString PopupComponent::popupId() const
{
    return m_popupId;
}

int PopupComponent::kind() const
{
    return m_kind;
}

} // namespace HmiStateMachine
