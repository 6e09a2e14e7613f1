#include "parts.h"

#include "building.h"
#include "guards.h"
#include "hardkeys.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmitransition.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

void updateOnlyWhenParked(const Vehicle *vehicle, ViewLayer *viewLayer)
{
    HmiTransition *start = onEvent("StartUpdate", state("Settings/Main"), "Settings/Update");
    allowOnlyWhile([vehicle] { return vehicle->gear() == "P"; }, start);
    QObject::connect(start, &GuardedTransition::testFailed, viewLayer,
                     [viewLayer] { viewLayer->showHint("updates need gear P"); });
    onEvent("UpdateDone", state("Settings/Update"), "Settings/Main");
}

// The home key would abandon the update half way. Back presses are not taken at all.
void stayDuringUpdate(HardKeys *keys)
{
    HmiViewState *update = view("Settings/Update");
    update->setPopupBehavior(HmiState::PopupBehaviorOff);
    update->blockKey(HardKeys::Home, HardKeys::Pressed, keys, HardKeys::signal());
}

} // namespace

void addSettingsViews(QState *domain, const Surroundings &)
{
    HmiViewState *main = addView("Settings/Main", domain);
    domain->setInitialState(main);
    for (const char *name : {"Settings/Display", "Settings/Sound", "Settings/Devices"}) {
        addViewWithoutBack(name, domain)->createDirectBackTransition(main);
    }
    addViewWithoutBack("Settings/Update", domain)->setHasBackStackPresence(false);
}

void addSettingsTransitions(const Surroundings &surroundings)
{
    updateOnlyWhenParked(surroundings.vehicle, surroundings.viewLayer);
    stayDuringUpdate(surroundings.keys);
}

} // namespace headunit
