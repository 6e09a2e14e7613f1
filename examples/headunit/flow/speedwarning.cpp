#include "building.h"
#include "popups.h"
#include "vehicle.h"

#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/intsignaltransition.h>
#include <HmiStateMachine/named/namedstate.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

constexpr int speedLimit = 130;

// Neither has a target: that a popup comes or goes moves no other state.
void onSpeed(IntSignalTransition::Operator comparison, Vehicle *vehicle,
             void (*action)(const QString &))
{
    auto *transition = new IntSignalTransition(vehicle, SIGNAL(speedChanged(int)), speedLimit,
                                               comparison, state("Keys"));
    QObject::connect(transition, &QAbstractTransition::triggered, transition,
                     [action] { action("car/speed"); });
}

} // namespace

void warnOfSpeed(const Surroundings &surroundings)
{
    onSpeed(IntSignalTransition::Less, surroundings.vehicle, requestPopup);
    onSpeed(IntSignalTransition::GreaterOrEqual, surroundings.vehicle, dismissPopup);
}

} // namespace headunit
