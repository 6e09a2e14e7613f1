#include <HmiStateMachine/named/hmievent.h>

namespace HmiStateMachine {

HmiEvent::HmiEvent(const QString &name, const QVariant &data) : m_name(name), m_data(data)
{
}

} // namespace HmiStateMachine
