#include "parts.h"

#include "building.h"
#include "guards.h"
#include "priorities.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/hmi/hmimoduleblacklistfilter.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmitransition.h>

#include <QSharedPointer>

using namespace HmiStateMachine;

namespace headunit {

namespace {

// Two states may show one view: the traffic is a layer of the map.
void addTrafficView(QState *domain, HmiViewState *map)
{
    auto *traffic = new HmiViewState("Navigation/Map", "Navigation/Traffic", domain);
    traffic->addInstanceData("layer", "traffic");
    traffic->createDirectBackTransition(map);
}

void typeOnlyWhenStanding(const Vehicle *vehicle, ViewLayer *viewLayer)
{
    HmiTransition *search =
        onEvent("SearchDestination", state("Navigation/Map"), "Navigation/Destination");
    allowOnlyWhile([vehicle] { return vehicle->speed() <= walkingPace; }, search);
    QObject::connect(search, &GuardedTransition::testFailed, viewLayer,
                     [viewLayer] { viewLayer->showHint("no typing while driving"); });
}

void planRoute()
{
    onEvent("ResultsFound", state("Navigation/Destination"), "Navigation/Results");
    HmiTransition *confirm = onEvent("Confirm", state("Navigation/Results"), "Navigation/Overview");
    confirm->makeParallelExclusive(ConfirmInResults);

    HmiViewState *overview = view("Navigation/Overview");
    HmiTransition *ready = onEvent("RouteReady", overview);
    QObject::connect(ready, &QAbstractTransition::triggered, overview,
                     [overview, ready] { overview->setActivationData(ready->transitionData()); });
    onEvent("StartGuidance", overview, "Navigation/Map");
}

} // namespace

void addNavigationViews(QState *domain, const Surroundings &)
{
    HmiViewState *map = addView("Navigation/Map", domain);
    HmiViewState *destination = addViewWithoutBack("Navigation/Destination", domain);
    HmiViewState *results = addViewWithoutBack("Navigation/Results", domain);
    HmiViewState *overview = addViewWithoutBack("Navigation/Overview", domain);
    addTrafficView(domain, map);
    domain->setInitialState(map);

    destination->createDirectBackTransition(map);
    results->createDirectBackTransition(destination);
    overview->createDirectBackTransition(results);

    // The map leads out of the domain, never back into the steps that planned the route.
    map->addBackTargetFilter(QSharedPointer<HmiModuleBlacklistFilter>::create("Navigation/"));
}

void addNavigationTransitions(const Surroundings &surroundings)
{
    typeOnlyWhenStanding(surroundings.vehicle, surroundings.viewLayer);
    planRoute();
}

} // namespace headunit
