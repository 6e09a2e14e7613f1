#include "startup.h"

#include "building.h"
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
        if (vehicle->isFirstStart()) {
            pass->setAllowTransition(false);
        }
    });
    start->setTargetState(state("Home/Welcome"));
}

// What was forbidden above leads on here: of a state's transitions the first that may is taken.
void askOtherwise(HmiConditionalState *start)
{
    auto *ask = new GuardedTransition(start);
    ask->setAllowTransitionDefault(true);
    ask->setTargetState(state("Home/Language"));
}

void goOnWithLanguage(ViewLayer *viewLayer)
{
    HmiViewState *language = view("Home/Language");
    language->setIndirectViewTransitionsBlocked(true);
    HmiTransition *chosen = onEvent("LanguageChosen", language, "Home/Welcome");
    QObject::connect(chosen, &QAbstractTransition::triggered, viewLayer, [chosen, viewLayer] {
        viewLayer->showStatus("language " + chosen->transitionData().toString());
    });
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
    askOtherwise(start);
    goOnWithLanguage(surroundings.viewLayer);
}

} // namespace headunit
