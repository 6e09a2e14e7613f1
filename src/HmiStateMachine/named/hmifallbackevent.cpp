#include <HmiStateMachine/named/hmifallbackevent.h>

namespace HmiStateMachine {

HmiFallbackEvent::HmiFallbackEvent(const QString &targetId) : m_targetId(targetId)
{
}

} // namespace HmiStateMachine
