// Decisions, delays, keys, and one event for several regions.

#include "hardkeys.h"
#include "printing.h"
#include "recipes.h"
#include "vehicle.h"

#include <HmiStateMachine/hmi/hmiconditionalstate.h>
#include <HmiStateMachine/hmi/hmidelayedsignaltransition.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/keysignaltransition.h>

#include <QTimer>

using namespace HmiStateMachine;

void blockedKeys()
{
    PrintingViewLayer viewLayer;
    HardKeys keys;
    StateMachine *machine = StateMachine::instance();
    auto *regions = new NamedState("Regions", QState::ParallelStates, machine);

    auto *homeKey = new KeySignalTransition(&keys, SIGNAL(changed(int, int)), HardKeys::Home,
                                            HardKeys::Pressed, new HmiState("Keys", regions));
    homeKey->makeGloballyAvailable(); // before it is blocked
    QObject::connect(homeKey, &KeySignalTransition::keyTransitionTriggered, machine,
                     [machine] { machine->postEvent(new HmiViewEvent("Home", QVariant())); });

    auto *screens = new HmiState("Screens", regions);
    screens->setInitialState(new HmiViewState("Home", screens));
    new HmiViewState("Radio", screens);
    auto *update = new HmiViewState("Update", screens);
    update->blockKey(HardKeys::Home, HardKeys::Pressed, &keys, SIGNAL(changed(int, int)));
    startIn(regions);

    for (const QString view : {"Radio", "Update"}) {
        request("The view " + view, new HmiViewEvent(view, QVariant()));
        say("The home key.");
        keys.press(HardKeys::Home);
        QCoreApplication::sendPostedEvents();
    }
}

void conditions()
{
    PrintingViewLayer viewLayer;
    bool firstStart = true;
    StateMachine *machine = StateMachine::instance();
    auto *check = new HmiConditionalState("FirstStart?", machine);
    check->setTargetState(new HmiViewState("Welcome", machine));
    auto *yes = check->findChild<GuardedTransition *>(); // its own, while there is no other
    QObject::connect(check, &HmiConditionalState::conditionTest, check,
                     [yes, &firstStart] { yes->setAllowTransition(firstStart); });

    auto *otherwise = new GuardedTransition(check);
    otherwise->setAllowTransitionDefault(true);
    otherwise->setTargetState(new HmiViewState("Home", machine));

    say("The first start.");
    startIn(check);
    machine->stop();
    QCoreApplication::sendPostedEvents();
    say("The second start.");
    firstStart = false;
    startIn(check);
}

void delayedTransitions()
{
    PrintingViewLayer viewLayer;
    Vehicle vehicle;
    StateMachine *machine = StateMachine::instance();
    auto *map = new HmiViewState("Map", machine);
    auto *noSignal = new HmiViewState("NoSignal", machine);
    auto *lost = new HmiDelayedSignalTransition(&vehicle, SIGNAL(satellitesLost()), 5000, map);
    lost->setTargetState(noSignal);
    startIn(map);

    say("The satellites are lost at once.");
    Q_EMIT vehicle.satellitesLost();
    QCoreApplication::sendPostedEvents();
    say("Five seconds after the map came up:");
    fire(lost->findChild<QTimer *>());
    request("The map again.", new HmiViewEvent("Map", QVariant()));
    say("Five seconds later:");
    fire(lost->findChild<QTimer *>());
    say("The satellites are lost.");
    Q_EMIT vehicle.satellitesLost();
    QCoreApplication::sendPostedEvents();
}

namespace {

HmiTransition *onCancel(HmiState *from, HmiState *to)
{
    auto *transition = new HmiTransition("cancel", from);
    transition->setTargetState(to);
    return transition;
}

} // namespace

void siblings()
{
    PrintingViewLayer viewLayer;
    StateMachine *machine = StateMachine::instance();
    auto *regions = new NamedState("Regions", QState::ParallelStates, machine);
    auto *menu = new HmiState("Menu", regions);
    auto *open = new HmiState("MenuOpen", menu);
    auto *closed = new HmiState("MenuClosed", menu);
    menu->setInitialState(open);
    auto *screens = new HmiState("Screens", regions);
    auto *route = new HmiViewState("Route", screens);
    screens->setInitialState(route);

    onCancel(open, closed)->makeParallelExclusive(2); // the larger number goes first
    onCancel(route, new HmiViewState("Map", screens))->makeParallelExclusive(1);
    startIn(regions);

    request("Cancel.", new HmiEvent("cancel", QVariant()));
    say(closed->isActive() ? "  the menu is closed" : "  the menu is open");
    request("Cancel.", new HmiEvent("cancel", QVariant()));
}
