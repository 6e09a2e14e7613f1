#include <HmiStateMachine/internal/helpers.h>

#include <HmiStateMachine/named/namedstate.h>

namespace HmiStateMachine {

QString Helpers::stateName(QState *state)
{
    const auto *named = qobject_cast<NamedState *>(state);
    return named ? named->name() : QString();
}

} // namespace HmiStateMachine
