#include <HmiStateMachineQuick/hostedcomponent.h>

namespace HmiStateMachine {

HostedComponent::HostedComponent(QObject *parent) : QObject(parent)
{
}

HostedComponent::~HostedComponent() = default;

QUrl HostedComponent::source() const
{
    return m_source;
}

QQmlComponent *HostedComponent::delegate() const
{
    return m_delegate;
}

void HostedComponent::setDelegate(QQmlComponent *component)
{
    if (component != m_delegate) {
        m_delegate = component;
        Q_EMIT delegateChanged();
    }
}

} // namespace HmiStateMachine
