#include <HmiStateMachine/named/popupevent.h>

namespace HmiStateMachine {

PopupEvent::PopupEvent(const QString &target, const QVariant &data)
    : PopupEvent(target, false, data)
{
}

PopupEvent::PopupEvent(const QString &target, bool reactivation, const QVariant &data)
    : m_target(target), m_reactivation(reactivation), m_data(data)
{
}

} // namespace HmiStateMachine
