#include <HmiStateMachineQuick/viewcomponent.h>

namespace HmiStateMachine {

ViewComponent::ViewComponent(QObject *parent) : HostedComponent(parent)
{
}

ViewComponent::~ViewComponent() = default;

QString ViewComponent::viewId() const
{
    return m_viewId;
}

} // namespace HmiStateMachine
