#include "parts.h"

#include "building.h"
#include "guards.h"
#include "priorities.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/hmi/hmitargetblacklistfilter.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedpropertytransition.h>
#include <HmiStateMachine/named/hmitransition.h>

#include <QSharedPointer>

using namespace HmiStateMachine;

namespace headunit {

namespace {

// While a source connects nothing new is shown. When it takes too long, the sources come back.
void addConnectingView(QState *domain, int timeoutMs)
{
    HmiViewState::createDummyViewState("Media/Connecting", domain, timeoutMs, true);
}

void connectSources()
{
    onEvent("SelectSource", state("Media/Sources"), "Media/Connecting");
    onEvent("SourceReady", state("Media/Connecting"), "Media/Browser");
}

void playSelection()
{
    HmiTransition *confirm = onEvent("Confirm", state("Media/Browser"), "Media/Player");
    confirm->makeParallelExclusive(ConfirmInBrowser);
}

void tellTrack()
{
    HmiViewState *player = view("Media/Player");
    HmiTransition *changed = onEvent("TrackChanged", player);
    QObject::connect(changed, &QAbstractTransition::triggered, player,
                     [player, changed] { player->setActivationData(changed->transitionData()); });
}

void openVideoOnlyWhenStanding(const Vehicle *vehicle, ViewLayer *viewLayer)
{
    HmiTransition *show = onEvent("ShowVideo", state("Media/Player"), "Media/Video");
    allowOnlyWhile([vehicle] { return vehicle->speed() <= walkingPace; }, show);
    QObject::connect(show, &GuardedTransition::testFailed, viewLayer,
                     [viewLayer] { viewLayer->showHint("no video while driving"); });
}

// A guarded property transition denies unless its guard allows.
void closeVideoWhenMoving(Vehicle *vehicle)
{
    auto *moving = new GuardedPropertyTransition(vehicle, "speed", state("Media/Video"));
    moving->setTargetState(state("Media/Player"));
    QObject::connect(moving, &GuardedSignalTransition::transitionTest, moving, [moving, vehicle] {
        moving->setAllowTransition(vehicle->speed() > walkingPace);
    });
}

} // namespace

void addMediaViews(QState *domain, const Surroundings &surroundings)
{
    HmiViewState *sources = addView("Media/Sources", domain);
    addConnectingView(domain, surroundings.timing.connecting);
    addView("Media/Browser", domain);
    HmiViewState *player = addView("Media/Player", domain);
    HmiViewState *queue = addViewWithoutBack("Media/Queue", domain);
    HmiViewState *video = addViewWithoutBack("Media/Video", domain);
    domain->setInitialState(sources);

    queue->createDirectBackTransition(player);
    video->createDirectBackTransition(player);

    // When driving off has closed the video, the player must not lead back to it. A view that is
    // refused leads back by a fixed way, so the search for another target ends with it.
    player->addBackTargetFilter(QSharedPointer<HmiTargetBlacklistFilter>::create("Media/Video"));
}

void addMediaTransitions(const Surroundings &surroundings)
{
    connectSources();
    playSelection();
    tellTrack();
    openVideoOnlyWhenStanding(surroundings.vehicle, surroundings.viewLayer);
    closeVideoWhenMoving(surroundings.vehicle);
}

} // namespace headunit
