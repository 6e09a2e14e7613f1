#include "parts.h"

#include "building.h"
#include "guards.h"
#include "hardkeys.h"
#include "priorities.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/hmi/hmipropertyboundfallbackviewstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedpropertychangetransition.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/keysignaltransition.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

void ringOverAnyScreen(const Vehicle *vehicle)
{
    HmiViewState *incoming = view("Phone/Incoming");
    HmiTransition *call = onEvent("IncomingCall", state("Screens"));
    leadTo("Phone/Incoming", call);
    refuseWhileActive(incoming, call);
    refuseInReverse(vehicle, call);
    QObject::connect(call, &QAbstractTransition::triggered, incoming,
                     [incoming, call] { incoming->setActivationData(call->transitionData()); });
}

void takeCall(HardKeys *keys)
{
    NamedState *incoming = state("Phone/Incoming");
    HmiTransition *confirm = onEvent("Confirm", incoming, "Phone/InCall");
    confirm->makeParallelExclusive(ConfirmIncomingCall);

    auto *key = new KeySignalTransition(keys, HardKeys::signal(), HardKeys::Phone,
                                        HardKeys::Pressed, incoming);
    key->setTargetState(state("Phone/InCall"));
    key->makeParallelExclusive(PhoneKeyTakesCall);
}

// The key raises the same event as the other side of the line does, so all regions hear of it.
void endCall(HardKeys *keys)
{
    auto *key = new KeySignalTransition(keys, HardKeys::signal(), HardKeys::Phone,
                                        HardKeys::Pressed, state("Phone/InCall"));
    key->makeParallelExclusive(PhoneKeyEndsCall);
    QObject::connect(key, &KeySignalTransition::keyTransitionTriggered, key,
                     [] { raiseEvent("CallEnded"); });
}

void goBackWhenCallEnds(NamedState *callView)
{
    HmiTransition *ended = onEvent("CallEnded", callView);
    QObject::connect(ended, &QAbstractTransition::triggered, ended, [] { requestBack(1); });
}

void dialContacts(const Vehicle *vehicle, ViewLayer *viewLayer)
{
    HmiTransition *open = onEvent("Confirm", state("Phone/Contacts"), "Phone/ContactDetails");
    open->makeParallelExclusive(ConfirmInContacts);

    HmiTransition *dial = onEvent("Dial", state("Phone/ContactDetails"), "Phone/InCall");
    allowOnlyWhile([vehicle] { return vehicle->phoneConnected(); }, dial);
    QObject::connect(dial, &GuardedTransition::testFailed, viewLayer,
                     [viewLayer] { viewLayer->showHint("no phone connected"); });
}

// Without a phone there are no favourites: however they are asked for, the devices are shown in
// their place, and the view layer hears no more of them than that they were left.
HmiViewState *addFavourites(QState *domain, Vehicle *vehicle)
{
    auto *favourites = new HmiPropertyBoundFallbackViewState(
        "Phone/Favourites", "Settings/Devices", vehicle, "phoneConnected", {true}, domain, true);
    favourites->setHandlesBackEvent(true);
    return favourites;
}

// From any view of the domain: there is nothing to see here without a phone. The favourites give
// way by themselves.
void leaveWithoutPhone(Vehicle *vehicle)
{
    auto *lost = new GuardedPropertyChangeTransition(vehicle, "phoneConnected", {true}, false,
                                                     state("Phone"));
    lost->setTargetState(state("Settings/Devices"));
    const NamedState *favourites = state("Phone/Favourites");
    QObject::connect(lost, &GuardedSignalTransition::transitionTest, lost,
                     [lost, favourites] { lost->setAllowTransition(!favourites->isActive()); });
}

} // namespace

void addPhoneViews(QState *domain, const Surroundings &surroundings)
{
    HmiViewState *favourites = addFavourites(domain, surroundings.vehicle);
    HmiViewState *contacts = addView("Phone/Contacts", domain);
    HmiViewState *details = addViewWithoutBack("Phone/ContactDetails", domain);
    HmiViewState *incoming = addView("Phone/Incoming", domain);
    HmiViewState *inCall = addView("Phone/InCall", domain);
    domain->setInitialState(favourites);
    details->createDirectBackTransition(contacts);

    for (HmiViewState *callView : {incoming, inCall}) {
        callView->setPopupBehavior(HmiState::PopupBehaviorOff);
        callView->setHasBackStackPresence(false); // a call that is over is nothing to go back to
    }
}

void addPhoneTransitions(const Surroundings &surroundings)
{
    ringOverAnyScreen(surroundings.vehicle);
    takeCall(surroundings.keys);
    endCall(surroundings.keys);
    goBackWhenCallEnds(state("Phone/Incoming"));
    goBackWhenCallEnds(state("Phone/InCall"));
    dialContacts(surroundings.vehicle, surroundings.viewLayer);
    leaveWithoutPhone(surroundings.vehicle);
}

} // namespace headunit
