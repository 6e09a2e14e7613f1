#include "parts.h"

#include "building.h"
#include "hardkeys.h"
#include "priorities.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/named/guardedpropertychangetransition.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/named/namedstate.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

const char *const withoutCall[] = {"Audio/Playing", "Audio/Muted", "Audio/Announcement"};
const char *const withCall[] = {"Audio/Ringing", "Audio/Call"};

void muteByKey(HardKeys *keys, const char *from, const char *to)
{
    auto *key = new KeySignalTransition(keys, HardKeys::signal(), HardKeys::Volume,
                                        HardKeys::Pressed, state(from));
    key->setTargetState(state(to));
    key->makeGloballyAvailable();
}

void readTrafficAlertOut()
{
    HmiTransition *alert = onEvent("TrafficAlert", state("Audio/Playing"), "Audio/Announcement");
    alert->makeParallelExclusive(AlertIsReadOut);
    onEvent("AnnouncementDone", state("Audio/Announcement"), "Audio/Playing");
}

// The screens know when a call is spoken: the entry of that view is a signal as any other.
void followCall(Vehicle *vehicle)
{
    NamedState *inCall = state("Phone/InCall");
    for (const char *name : withoutCall) {
        onEvent("IncomingCall", state(name), "Audio/Ringing");
        state(name)->addTransition(inCall, SIGNAL(entered()), state("Audio/Call"));
    }
    state("Audio/Ringing")->addTransition(inCall, SIGNAL(entered()), state("Audio/Call"));
    for (const char *name : withCall) {
        onEvent("CallEnded", state(name), "Audio/Playing");
        auto *lost = new GuardedPropertyChangeTransition(vehicle, "phoneConnected", {true}, false,
                                                         state(name));
        lost->setTargetState(state("Audio/Playing"));
    }
}

} // namespace

void addAudioStates(QState *region, const Surroundings &)
{
    for (const char *name : withoutCall) {
        new NamedState(name, region);
    }
    for (const char *name : withCall) {
        new NamedState(name, region);
    }
    region->setInitialState(state("Audio/Playing"));
}

void addAudioTransitions(const Surroundings &surroundings)
{
    muteByKey(surroundings.keys, "Audio/Playing", "Audio/Muted");
    muteByKey(surroundings.keys, "Audio/Muted", "Audio/Playing");
    readTrafficAlertOut();
    followCall(surroundings.vehicle);
    for (const char *name : withoutCall) {
        tellEntry(name, surroundings.viewLayer);
    }
    for (const char *name : withCall) {
        tellEntry(name, surroundings.viewLayer);
    }
}

} // namespace headunit
