#include "building.h"
#include "popups.h"
#include "vehicle.h"

#include <HmiStateMachine/named/guardedpropertychangetransition.h>
#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/popup/popupstate.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

// Not to store them any longer hands them to the view layer, which requests them again. Those that
// are refused once more are kept for the next time.
void releaseBlockedPopups()
{
    PopupState::setStoreBlockedPopups(false);
    PopupState::setStoreBlockedPopups(true);
}

} // namespace

void keepBlockedPopups(const Surroundings &surroundings)
{
    PopupState::setStoreBlockedPopups(true);
    auto *parked =
        new GuardedPropertyChangeTransition(surroundings.vehicle, "gear", {}, "P", state("Keys"));
    QObject::connect(parked, &QAbstractTransition::triggered, parked, releaseBlockedPopups);
}

} // namespace headunit
