#include "building.h"
#include "popups.h"
#include "vehicle.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/named/intsignaltransition.h>
#include <HmiStateMachine/named/namedstate.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

constexpr int speedLimit = 130;
const char *const warning = "car/speed";

void onSpeed(IntSignalTransition::Operator comparison, Vehicle *vehicle, NamedState *from,
             NamedState *to)
{
    auto *transition =
        new IntSignalTransition(vehicle, SIGNAL(speedChanged(int)), speedLimit, comparison, from);
    transition->setTargetState(to);
}

} // namespace

// The popup follows a state: it is requested once, however often the speed changes above the limit.
void warnOfSpeed(const Surroundings &surroundings)
{
    HmiLayeredState *alerts = layer("Alerts");
    auto *allowed = new NamedState("Speed/Allowed", alerts->exclusiveState());
    auto *exceeded = new NamedState("Speed/Exceeded", alerts->exclusiveState());
    alerts->setInitialHmiState(allowed);

    onSpeed(IntSignalTransition::Less, surroundings.vehicle, allowed, exceeded);
    onSpeed(IntSignalTransition::GreaterOrEqual, surroundings.vehicle, exceeded, allowed);
    QObject::connect(exceeded, &QAbstractState::entered, exceeded, [] { requestPopup(warning); });
    QObject::connect(exceeded, &QAbstractState::exited, exceeded, [] { dismissPopup(warning); });
}

} // namespace headunit
