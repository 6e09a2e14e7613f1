#include "building.h"
#include "popups.h"

#include <HmiStateMachine/popup/popupstate.h>
#include <HmiStateMachine/popup/popuptimeoutmonitor.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

void closeAfter(int milliseconds, PopupState *popup)
{
    popup->setAutoDismissTimeoutInterval(milliseconds);
    popup->setAutoDismissTimeoutActive(true);
}

} // namespace

void setTimeouts(const Timing &timing)
{
    closeAfter(timing.note, popup("phone/ended"));
    closeAfter(timing.volume, popup("media/volume"));
    new PopupTimeoutMonitor(timing.volumeTick, popup("media/volume"));
}

} // namespace headunit
