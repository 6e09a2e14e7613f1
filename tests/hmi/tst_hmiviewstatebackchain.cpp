#include "driving.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmibackevent.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/**
 * Media leads on to its player without an event. The player goes by the name of Media on the back
 * stack, so a press on the map leads to Media and from there to the player.
 */
struct ChainFlow : public ViewFlow
{
    ChainFlow()
    {
        media->setInitialState(choice);
        player->setBackStackStateId("Media", false);
    }

    void startOnMap()
    {
        startIn(machine, media);
        request("Map");
        take();
    }

    /** Lets the choice in Media lead on, or hold. */
    void setOpen(bool open) { onwards->setAllowTransitionDefault(open); }

    /** Any event makes Qt look at what leads on without one. */
    void wakeUp() { post(new QEvent(QEvent::User)); }

    NamedState *media = new NamedState("Media", &machine);
    QState *choice = new QState(media);
    HmiViewState *player = backView("Player", media);
    HmiViewState *map = backView("Map");
    GuardedTransition *onwards = leadOnAtOnce(choice, player);
};

} // namespace

/** Back presses that reach a view by way of the state that it goes by on the back stack. */
class tst_HmiViewStateBackChain : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aBackPressReachesTheViewBehindTheWatchedState();
    void depthAndTargetAreThoseOfTheWatchedEntry();
    void aForwardEntryOfTheWatchedStateIsForward();
    void aPressWithoutStepsIsForward();
    void theChainHoldsForOneEntry();
    void theChainWaitsForTheView();
    void anEntryByAnotherEventBreaksTheChain();
    void theLastEntryOfTheWatchedStateCounts();
    void anEntryTogetherWithTheWatchedStateIsBackByItself();
    void aStateThatIsMadeLaterIsNotWatched();
    void aStateThatTakesThePlaceOfTheWatchedOneIsNotWatched();
    void anotherIdGivesUpTheWatchedState_data();
    void anotherIdGivesUpTheWatchedState();
    void theSameIdTwiceWatchesOnce();
    void aViewThatOnceWatchedItselfLosesTheChain();
    void withoutBackHandlingTheChainCountsToo();
};

void tst_HmiViewStateBackChain::aBackPressReachesTheViewBehindTheWatchedState()
{
    ChainFlow flow;
    flow.startOnMap();
    QCOMPARE(flow.map->backTarget(), QString("Media"));

    flow.back();

    QVERIFY(flow.player->isActive());
    QCOMPARE(flow.player->entryReason(), 1);
    QCOMPARE(flow.target.viewData("Player").value("entryReason"), QVariant(1));
    QCOMPARE(flow.take(),
             QStringList({"deactivateView Map", "Player backStackPop",
                          "postFollowOnBackEvent 1  Player", "activateView Player"}));
}

void tst_HmiViewStateBackChain::depthAndTargetAreThoseOfTheWatchedEntry()
{
    ChainFlow flow;
    flow.startOnMap();

    flow.back(3, "Map");

    QCOMPARE(flow.player->backTarget(), QString("Map"));
    QCOMPARE(flow.take(),
             QStringList({"deactivateView Map", "Player backStackPop",
                          "postFollowOnBackEvent 3 Map Player", "activateView Player"}));
}

void tst_HmiViewStateBackChain::aForwardEntryOfTheWatchedStateIsForward()
{
    ChainFlow flow;
    flow.startOnMap();

    flow.request("Media", "data");

    QCOMPARE(flow.player->entryReason(), 0);
    QCOMPARE(flow.player->backTarget(), QString("Map"));
    QVERIFY(!flow.target.viewData("Player").value("eventData").isValid());
}

void tst_HmiViewStateBackChain::aPressWithoutStepsIsForward()
{
    ChainFlow flow;
    flow.startOnMap();

    flow.back(0);

    QCOMPARE(flow.player->entryReason(), 0);
    QCOMPARE(flow.player->backTarget(), QString("Map"));
}

void tst_HmiViewStateBackChain::theChainHoldsForOneEntry()
{
    ChainFlow flow;
    flow.startOnMap();
    lead(QEvent::User, flow.player, flow.choice);
    flow.back();
    QCOMPARE(flow.player->entryReason(), 1);

    flow.wakeUp();

    QVERIFY(flow.player->isActive());
    QCOMPARE(flow.player->entryReason(), 0);
}

void tst_HmiViewStateBackChain::theChainWaitsForTheView()
{
    ChainFlow flow;
    flow.startOnMap();
    flow.setOpen(false);
    flow.back();
    QVERIFY(!flow.player->isActive());

    flow.setOpen(true);
    flow.wakeUp();

    QCOMPARE(flow.player->entryReason(), 1);
}

void tst_HmiViewStateBackChain::anEntryByAnotherEventBreaksTheChain()
{
    ChainFlow flow;
    lead(QEvent::User, flow.choice, flow.player);
    lead(QEvent::User, flow.player, flow.choice);
    flow.startOnMap();
    flow.setOpen(false);
    flow.back();

    flow.wakeUp();
    QVERIFY(flow.player->isActive());
    QCOMPARE(flow.player->entryReason(), 0);

    flow.setOpen(true);
    flow.wakeUp();
    QVERIFY(flow.player->isActive());
    QCOMPARE(flow.player->entryReason(), 0);
}

void tst_HmiViewStateBackChain::theLastEntryOfTheWatchedStateCounts()
{
    ChainFlow flow;
    lead(QEvent::User, flow.media, flow.map);
    flow.startOnMap();
    flow.setOpen(false);
    flow.back();
    flow.wakeUp();
    QVERIFY(flow.map->isActive());

    flow.setOpen(true);
    flow.request("Media");

    QCOMPARE(flow.player->entryReason(), 0);
}

void tst_HmiViewStateBackChain::anEntryTogetherWithTheWatchedStateIsBackByItself()
{
    ChainFlow flow;
    flow.startOnMap();
    flow.media->setInitialState(flow.player);

    flow.back(2);
    QCOMPARE(flow.player->entryReason(), 1);
    QCOMPARE(flow.take(),
             QStringList({"deactivateView Map", "Player backStackPop",
                          "postFollowOnBackEvent 2  Player", "activateView Player"}));

    lead(QEvent::User, flow.player, flow.choice);
    flow.wakeUp();
    QCOMPARE(flow.player->entryReason(), 0);
}

void tst_HmiViewStateBackChain::aStateThatIsMadeLaterIsNotWatched()
{
    ChainFlow flow;
    flow.player->setBackStackStateId("Later", false);
    flow.media->setName("Later");
    flow.startOnMap();
    QCOMPARE(flow.map->backTarget(), QString("Later"));

    flow.back();

    QVERIFY(flow.player->isActive());
    QCOMPARE(flow.player->entryReason(), 0);
}

void tst_HmiViewStateBackChain::aStateThatTakesThePlaceOfTheWatchedOneIsNotWatched()
{
    ChainFlow flow;
    flow.player->setBackStackStateId("Nowhere", false);
    {
        const NamedState watched("Shared");
        flow.player->setBackStackStateId("Shared", false);
    }
    flow.media->setName("Shared");
    flow.startOnMap();

    flow.back();

    QVERIFY(flow.player->isActive());
    QCOMPARE(flow.player->entryReason(), 0);
}

void tst_HmiViewStateBackChain::anotherIdGivesUpTheWatchedState_data()
{
    QTest::addColumn<QString>("id");

    QTest::newRow("another state") << "Map";
    QTest::newRow("an unknown state") << "Nowhere";
    QTest::newRow("no state") << QString();
    QTest::newRow("its own name") << "Player";
}

void tst_HmiViewStateBackChain::anotherIdGivesUpTheWatchedState()
{
    QFETCH(QString, id);
    ChainFlow flow;
    flow.startOnMap();

    flow.player->setBackStackStateId(id, false);
    QCOMPARE(flow.player->backStackStateId(), id);
    flow.back();

    QVERIFY(flow.player->isActive());
    QCOMPARE(flow.player->entryReason(), 0);
}

void tst_HmiViewStateBackChain::theSameIdTwiceWatchesOnce()
{
    ChainFlow flow;
    flow.player->setBackStackStateId("Media", true);
    flow.startOnMap();

    flow.back();
    QCOMPARE(flow.player->entryReason(), 1);

    flow.request("Map");
    flow.player->setBackStackStateId("Map", false);
    flow.back();
    QCOMPARE(flow.player->entryReason(), 0);
}

// Giving up an id unregisters the view from any state but itself: its own entry, by no back press,
// comes between the entry of the watched state and the look at the chain.
void tst_HmiViewStateBackChain::aViewThatOnceWatchedItselfLosesTheChain()
{
    ChainFlow flow;
    flow.player->setBackStackStateId("Player", false);
    flow.player->setBackStackStateId("Media", false);
    flow.startOnMap();

    flow.back();

    QVERIFY(flow.player->isActive());
    QCOMPARE(flow.player->entryReason(), 0);
}

void tst_HmiViewStateBackChain::withoutBackHandlingTheChainCountsToo()
{
    ChainFlow flow;
    flow.player->setHandlesBackEvent(false);
    flow.startOnMap();

    flow.back();

    QCOMPARE(flow.player->entryReason(), 1);
    QCOMPARE(flow.take(), QStringList({"deactivateView Map", "activateView Player"}));
}

QTEST_GUILESS_MAIN(tst_HmiViewStateBackChain)
#include "tst_hmiviewstatebackchain.moc"
