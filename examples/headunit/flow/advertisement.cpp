#include "building.h"
#include "popups.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/popup/domainblockedpopupstate.h>

using namespace HmiStateMachine;

namespace headunit {

// In which domains it has to wait, the rules say.
void addAdvertisement()
{
    new DomainBlockedPopupState("navigation/advert", layer("Screens"), NotePopup);
}

} // namespace headunit
