#include "building.h"
#include "popups.h"
#include "vehicle.h"

#include <HmiStateMachine/popup/popupstate.h>

using namespace HmiStateMachine;

namespace headunit {

// The property comes first: a popup looks at it when it is restricted.
void restrictToStanding(const Surroundings &surroundings)
{
    PopupState::setDriverRestrictionProperty(surroundings.vehicle, "moving", true);
    popup("system/update")->setDriverRestricted(true);
    popup("navigation/advert")->setDriverRestricted(true);
}

} // namespace headunit
