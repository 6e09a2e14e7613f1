#include <HmiStateMachineQuick/hostattached.h>

namespace HmiStateMachine {

HostAttached::HostAttached(QObject *parent) : QObject(parent)
{
}

HostAttached::~HostAttached() = default;

qreal HostAttached::position() const
{
    return m_position;
}

void HostAttached::setPosition(qreal position)
{
    // 0 and 1 are exact, and nothing between them is compared.
    if (position < m_position || position > m_position) {
        m_position = position;
        Q_EMIT positionChanged();
    }
}

} // namespace HmiStateMachine
