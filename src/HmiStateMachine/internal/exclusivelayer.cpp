#include <HmiStateMachine/internal/exclusivelayer.h>

#include <HmiStateMachine/hmi/hmilayeredstate.h>

namespace HmiStateMachine {

QState *exclusiveLayerOf(QState *state)
{
    auto *layered = qobject_cast<HmiLayeredState *>(state);
    return layered ? layered->exclusiveState() : state;
}

} // namespace HmiStateMachine
