#include "parts.h"

#include "building.h"
#include "guards.h"
#include "hardkeys.h"
#include "startup.h"
#include "vehicle.h"

#include <HmiStateMachine/hmi/hmidelayedsignaltransition.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedpropertychangetransition.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/simpleeventtransition.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

// However fast the systems come up, the welcome screen can be seen.
void showWelcomeForAWhile(Vehicle *vehicle, int milliseconds)
{
    auto *ready = new HmiDelayedSignalTransition(vehicle, SIGNAL(systemReady()), milliseconds,
                                                 state("Home/Welcome"));
    ready->setTargetState(state("Home/Main"));
}

void showCameraInReverse(Vehicle *vehicle)
{
    auto *reverse = new GuardedPropertyChangeTransition(vehicle, "gear", {}, "R", state("Screens"));
    leadTo("Home/RearCamera", reverse);

    // Without a target, and so without a way of its own: it goes back to whatever was shown before.
    auto *forwards = new GuardedPropertyChangeTransition(vehicle, "gear", {"R"}, QVariant(),
                                                         state("Home/RearCamera"));
    QObject::connect(forwards, &QAbstractTransition::triggered, forwards, [] { requestBack(1); });
}

void keepCameraInFront(HardKeys *keys)
{
    HmiViewState *camera = view("Home/RearCamera");
    camera->setPopupBehavior(HmiState::PopupBehaviorOff);
    camera->setIndirectViewTransitionsBlocked(true);
    camera->blockKey(HardKeys::Back, HardKeys::Pressed, keys, HardKeys::signal());
    camera->blockKey(HardKeys::Back, HardKeys::Held, keys, HardKeys::signal());
}

// The first touch only wakes the display: which view it asked for does not matter.
void switchDisplayOff()
{
    HmiTransition *off = onEvent("DisplayOff", state("Screens"));
    leadTo("Home/Standby", off);
    refuseWhileActive(state("Home/Standby"), off);

    HmiViewState *standby = view("Home/Standby");
    standby->setIndirectViewTransitionsBlocked(true);
    auto *wake =
        new SimpleEventTransition({HmiViewEvent::eventType(), HmiBackEvent::eventType()}, standby);
    wake->setTargetState(state("Home/Main"));
}

// Back ends here: what the views kept to return to is not asked for any more. The library sets a
// back stack no limit, and a driver who opens one view after the other would let it grow for ever.
void forgetWaysBackAtHome()
{
    const auto views = state("Screens")->findChildren<HmiViewState *>();
    NamedState *home = state("Home/Main");
    QObject::connect(home, &QAbstractState::entered, home, [views] {
        for (HmiViewState *view : views) {
            while (!view->popBackStack().isEmpty()) { }
        }
    });
}

} // namespace

void addHomeViews(QState *domain, const Surroundings &)
{
    HmiViewState *welcome = addViewWithoutBack("Home/Welcome", domain);
    HmiViewState *main = addViewWithoutBack("Home/Main", domain); // back ends here
    HmiViewState *apps = addViewWithoutBack("Home/Apps", domain);
    HmiViewState *camera = addView("Home/RearCamera", domain);
    HmiViewState *standby = addViewWithoutBack("Home/Standby", domain);

    apps->createDirectBackTransition(main);
    addStartUpStates(domain);

    // Nobody wants to be led back to these.
    welcome->setHasBackStackPresence(false);
    camera->setHasBackStackPresence(false);
    standby->setHasBackStackPresence(false);
}

void addHomeTransitions(const Surroundings &surroundings)
{
    addStartUpTransitions(surroundings);
    showWelcomeForAWhile(surroundings.vehicle, surroundings.timing.welcome);
    showCameraInReverse(surroundings.vehicle);
    keepCameraInFront(surroundings.keys);
    switchDisplayOff();
    forgetWaysBackAtHome();
}

} // namespace headunit
