#include "building.h"
#include "popups.h"

#include <HmiStateMachine/popup/popupstate.h>
#include <HmiStateMachine/popup/popuptimeoutmonitor.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

constexpr int noteMs = 100;
constexpr int volumeMs = 200;
constexpr int volumeTickMs = 50;

void closeAfter(int milliseconds, PopupState *popup)
{
    popup->setAutoDismissTimeoutInterval(milliseconds);
    popup->setAutoDismissTimeoutActive(true);
}

} // namespace

void setTimeouts()
{
    closeAfter(noteMs, popup("phone/ended"));
    closeAfter(volumeMs, popup("media/volume"));
    new PopupTimeoutMonitor(volumeTickMs, popup("media/volume"));
}

} // namespace headunit
