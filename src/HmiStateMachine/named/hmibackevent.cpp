#include <HmiStateMachine/named/hmibackevent.h>

namespace HmiStateMachine {

HmiBackEvent::HmiBackEvent(unsigned char depth, const QString &targetId)
    : m_depth(depth), m_targetId(targetId)
{
}

HmiBackEvent *HmiBackEvent::followOnEvent(unsigned char depth, const QString &targetId,
                                          const QString &currentId)
{
    if (depth > 1) {
        return new HmiBackEvent(static_cast<unsigned char>(depth - 1), QString());
    }
    if (!targetId.isEmpty() && targetId != currentId) {
        return new HmiBackEvent(1, targetId);
    }
    return nullptr;
}

} // namespace HmiStateMachine
