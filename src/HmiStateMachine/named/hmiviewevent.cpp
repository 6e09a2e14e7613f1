#include <HmiStateMachine/named/hmiviewevent.h>

namespace HmiStateMachine {

HmiViewEvent::HmiViewEvent(const QString &viewId, const QVariant &data)
    : m_viewId(viewId), m_data(data)
{
}

} // namespace HmiStateMachine
