#include "parts.h"

#include "building.h"
#include "priorities.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/intsignaltransition.h>
#include <HmiStateMachine/named/namedstate.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

constexpr int fuelReserve = 10;

void startAndStop()
{
    // The route's overview reacts to the same event, and both act: they are no siblings in
    // arbitration.
    onEvent("StartGuidance", state("Guidance/Idle"), "Guidance/Running");
    onEvent("StopGuidance", state("Guidance/Running"), "Guidance/Idle");
}

void offerFuelStation(Vehicle *vehicle)
{
    // Greater reads: the reserve is greater than what is left.
    auto *low = new IntSignalTransition(vehicle, SIGNAL(fuelChanged(int)), fuelReserve,
                                        IntSignalTransition::Greater, state("Guidance/Running"));
    low->setTargetState(state("Guidance/Offer"));
}

void offerDetour()
{
    HmiTransition *alert = onEvent("TrafficAlert", state("Guidance/Running"), "Guidance/Offer");
    alert->makeParallelExclusive(AlertReroutes);
}

// Only the OK on the steering wheel answers an offer; a touch is meant for the screen beneath.
void answerOffer()
{
    HmiTransition *accept = onEvent("Confirm", state("Guidance/Offer"), "Guidance/Running");
    accept->setEventDataFilter("wheel");
    accept->makeParallelExclusive(ConfirmOffer);
    onEvent("Dismiss", state("Guidance/Offer"), "Guidance/Running");
}

} // namespace

void addGuidanceStates(QState *region, const Surroundings &)
{
    region->setInitialState(new NamedState("Guidance/Idle", region));
    new NamedState("Guidance/Running", region);
    new NamedState("Guidance/Offer", region);
}

void addGuidanceTransitions(const Surroundings &surroundings)
{
    startAndStop();
    offerFuelStation(surroundings.vehicle);
    offerDetour();
    answerOffer();
    for (const char *name : {"Guidance/Idle", "Guidance/Running", "Guidance/Offer"}) {
        tellEntry(name, surroundings.viewLayer);
    }
}

} // namespace headunit
