#include <HmiStateMachine/internal/metatypes.h>

#include <HmiStateMachine/hmi/hmistate.h>
#include <HmiStateMachine/named/identifier.h>

#include <QEvent>
#include <QMetaType>

Q_DECLARE_METATYPE(QEvent *)
Q_DECLARE_METATYPE(HmiStateMachine::HmiState::PopupBehavior)

namespace HmiStateMachine {

void registerMetaTypes()
{
    // Both spellings: moc records a type as it stands in the class, without its namespace.
    qRegisterMetaType<Identifier>("Identifier");
    qRegisterMetaType<Identifier>("HmiStateMachine::Identifier");
    qRegisterMetaType<HmiState::PopupBehavior>("PopupBehavior");
    qRegisterMetaType<QEvent *>("QEvent*");
}

} // namespace HmiStateMachine
