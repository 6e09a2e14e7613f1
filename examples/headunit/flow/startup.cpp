#include "startup.h"

#include "building.h"
#include "guards.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/hmi/hmiconditionalstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmitransition.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

// The decision passes on unless someone forbids it, and there is no other way to its transition
// than to look for it.
void welcomeWhoHasChosen(HmiConditionalState *start, const Vehicle *vehicle)
{
    auto *pass = start->findChild<GuardedTransition *>();
    QObject::connect(start, &HmiConditionalState::conditionTest, start, [pass, vehicle] {
        if (vehicle->isFirstStart() || vehicle->ready()) {
            pass->setAllowTransition(false);
        }
    });
    start->setTargetState(state("Home/Welcome"));
}

// What was forbidden above leads on below: of a state's transitions the first that may is taken.
// Whoever asks for the domain while the car is in use comes home, and is not welcomed again.
void goHomeOnceReady(HmiConditionalState *start, const Vehicle *vehicle)
{
    auto *home = new GuardedTransition(start);
    home->setAllowTransitionDefault(true);
    allowOnlyWhile([vehicle] { return vehicle->ready(); }, home);
    home->setTargetState(state("Home/Main"));
}

void askOtherwise(HmiConditionalState *start)
{
    auto *ask = new GuardedTransition(start);
    ask->setAllowTransitionDefault(true);
    ask->setTargetState(state("Home/Language"));
}

// The systems may have come up while the driver was choosing; the welcome screen waits for that.
void goOnWithLanguage(const Vehicle *vehicle, ViewLayer *viewLayer)
{
    HmiViewState *language = view("Home/Language");
    language->setIndirectViewTransitionsBlocked(true);
    HmiTransition *home = onEvent("LanguageChosen", language, "Home/Main");
    allowOnlyWhile([vehicle] { return vehicle->ready(); }, home);
    HmiTransition *welcome = onEvent("LanguageChosen", language, "Home/Welcome");
    for (HmiTransition *chosen : {home, welcome}) {
        QObject::connect(chosen, &QAbstractTransition::triggered, viewLayer, [chosen, viewLayer] {
            viewLayer->showStatus("language " + chosen->transitionData().toString());
        });
    }
}

} // namespace

void addStartUpStates(QState *domain)
{
    domain->setInitialState(new HmiConditionalState("Home/Start", domain));
    addViewWithoutBack("Home/Language", domain)->setHasBackStackPresence(false);
}

void addStartUpTransitions(const Surroundings &surroundings)
{
    auto *start = qobject_cast<HmiConditionalState *>(state("Home/Start"));
    welcomeWhoHasChosen(start, surroundings.vehicle);
    goHomeOnceReady(start, surroundings.vehicle);
    askOtherwise(start);
    goOnWithLanguage(surroundings.vehicle, surroundings.viewLayer);
}

} // namespace headunit
