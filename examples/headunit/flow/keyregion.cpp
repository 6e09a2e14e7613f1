#include "parts.h"

#include "building.h"
#include "hardkeys.h"
#include "priorities.h"
#include "vehicle.h"

#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/named/namedstate.h>

#include <functional>

using namespace HmiStateMachine;

namespace headunit {

namespace {

// The keys have a region of their own, so they work on every screen. None has a target: it asks
// for a view, as a touch on the screen would. All are published, so that states can block them.
KeySignalTransition *onKey(HardKeys *keys, int key, int status, std::function<void()> action)
{
    auto *transition =
        new KeySignalTransition(keys, HardKeys::signal(), key, status, state("Keys"));
    transition->makeGloballyAvailable();
    QObject::connect(transition, &KeySignalTransition::keyTransitionTriggered, transition, action);
    return transition;
}

QString phoneView(const Vehicle *vehicle)
{
    if (state("Audio/Call")->isActive()) {
        return "Phone/InCall";
    }
    return vehicle->phoneConnected() ? "Phone/Favourites" : "Settings/Devices";
}

} // namespace

void addKeyTransitions(const Surroundings &surroundings)
{
    HardKeys *keys = surroundings.keys;
    const Vehicle *vehicle = surroundings.vehicle;

    onKey(keys, HardKeys::Home, HardKeys::Pressed, [] { requestView("Home/Main"); });
    onKey(keys, HardKeys::Back, HardKeys::Pressed, [] { requestBack(1); });
    onKey(keys, HardKeys::Back, HardKeys::Held, [] { requestBack(1, "Home/Main"); });
    auto *phone = onKey(keys, HardKeys::Phone, HardKeys::Pressed,
                        [vehicle] { requestView(phoneView(vehicle)); });
    phone->makeParallelExclusive(PhoneKeyOpens);
}

} // namespace headunit
