#include "driving.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmimoduleblacklistfilter.h>
#include <HmiStateMachine/hmi/hmimodulewhitelistfilter.h>
#include <HmiStateMachine/hmi/hmitargetblacklistfilter.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmifallbackevent.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** Home, then the player, its list and a song, each reached from the one before. */
struct MediaFlow : public ViewFlow
{
    MediaFlow() { target.followBackRequests(&machine); }

    void walkTo(const QStringList &views)
    {
        start(home);
        for (const QString &name : views) {
            request(name);
        }
        take();
    }

    HmiViewState *home = view("Home");
    HmiViewState *player = backView("Player");
    HmiViewState *list = backView("List");
    HmiViewState *song = backView("Song");
};

} // namespace

/** The road of a back press, one view at a time. */
class tst_BackNavigation : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void pressesWalkTheWayBack();
    void aPressOfManyStepsTakesOneViewAtATime();
    void moreStepsThanViewsEndAtTheFirstView_data();
    void moreStepsThanViewsEndAtTheFirstView();
    void aPressTowardsAViewGoesOnUntilItIsReached();
    void aPressTowardsTheViewThatIsReachedEndsThere();
    void aPressOfManyStepsForgetsItsTarget();
    void aTargetIdIsComparedWithTheTargetView();
    void aPressWithNobodyToTakeItMovesNothing();
    void goingBackAndForthKeepsTheWay();
    void aRoundTripIsWalkedBackInFull();
    void aViewWithADirectTargetLeadsThereFromEverywhere();
    void stepsGoOnThroughADirectTarget();
    void aFallbackLeavesNoTraceOnTheWayBack();
    void aViewWithoutPresenceIsPassedOver();
    void viewsOfOneProviderLeaveTogether();
    void filtersLeaveTheModuleInOnePress();
    void filtersOfTwoKindsWorkTogether();
    void aDummyStandsInForTheViewBeforeIt();
    void stepsEndAtADummy();
    void aModuleIsReachedThroughItsInitialView();
    void stepsGoOnBehindAModuleThatLeadsOn();
    void aViewThatIsGoneIsPassedOver();
    void theDataOfAViewTellsHowItWasReachedAndLeft();
    void eachRegionGoesBackByItself();
    void aViewLeftInAnotherRegionIsLastKnownToo();
    void aPressIsTakenByTheRegionThatHandlesIt();
};

void tst_BackNavigation::pressesWalkTheWayBack()
{
    MediaFlow flow;
    flow.walkTo({"Player", "List", "Song"});

    flow.back();
    flow.back();
    flow.back();

    QCOMPARE(
        flow.take(),
        QStringList({"deactivateView Song", "List backStackPop", "postFollowOnBackEvent 1  List",
                     "activateView List", "deactivateView List", "Player backStackPop",
                     "postFollowOnBackEvent 1  Player", "activateView Player",
                     "deactivateView Player", "activateView Home"}));
}

void tst_BackNavigation::aPressOfManyStepsTakesOneViewAtATime()
{
    MediaFlow flow;
    flow.walkTo({"Player", "List", "Song"});

    flow.back(3);

    QCOMPARE(
        flow.take(),
        QStringList({"deactivateView Song", "List backStackPop", "postFollowOnBackEvent 3  List",
                     "activateView List", "deactivateView List", "Player backStackPop",
                     "postFollowOnBackEvent 2  Player", "activateView Player",
                     "deactivateView Player", "activateView Home"}));
    QCOMPARE(flow.home->entryReason(), 1);
}

void tst_BackNavigation::moreStepsThanViewsEndAtTheFirstView_data()
{
    QTest::addColumn<bool>("handlesBack");
    QTest::addColumn<QStringList>("end");

    QTest::newRow("without back handling") << false << QStringList("activateView Home");
    QTest::newRow("with back handling")
        << true
        << QStringList(
               {"Home backStackPop", "postFollowOnBackEvent 254  Home", "activateView Home"});
}

void tst_BackNavigation::moreStepsThanViewsEndAtTheFirstView()
{
    QFETCH(bool, handlesBack);
    QFETCH(QStringList, end);
    MediaFlow flow;
    flow.home->setHandlesBackEvent(handlesBack);
    flow.walkTo({"Player", "List"});

    flow.back(255);

    QCOMPARE(flow.take(),
             QStringList({"deactivateView List", "Player backStackPop",
                          "postFollowOnBackEvent 255  Player", "activateView Player",
                          "deactivateView Player"})
                 + end);
}

void tst_BackNavigation::aPressTowardsAViewGoesOnUntilItIsReached()
{
    MediaFlow flow;
    flow.home->setHandlesBackEvent(true);
    flow.walkTo({"Player", "List", "Song"});

    flow.back(1, "Player");

    QCOMPARE(flow.take(),
             QStringList({"deactivateView Song", "List backStackPop",
                          "postFollowOnBackEvent 1 Player List", "activateView List",
                          "deactivateView List", "Player backStackPop",
                          "postFollowOnBackEvent 1 Player Player", "activateView Player"}));
    QCOMPARE(flow.player->backTarget(), QString("Home"));
}

void tst_BackNavigation::aPressTowardsTheViewThatIsReachedEndsThere()
{
    MediaFlow flow;
    flow.walkTo({"Player", "List"});

    flow.back(1, "Player");

    QCOMPARE(flow.take(),
             QStringList({"deactivateView List", "Player backStackPop",
                          "postFollowOnBackEvent 1 Player Player", "activateView Player"}));
}

void tst_BackNavigation::aPressOfManyStepsForgetsItsTarget()
{
    MediaFlow flow;
    flow.walkTo({"Player", "List", "Song"});

    flow.back(2, "Home");

    QCOMPARE(flow.take(),
             QStringList({"deactivateView Song", "List backStackPop",
                          "postFollowOnBackEvent 2 Home List", "activateView List",
                          "deactivateView List", "Player backStackPop",
                          "postFollowOnBackEvent 1  Player", "activateView Player"}));
}

// The view layer knows views, not states: a target given by a state's name is never reached, and
// the walk goes on to its end.
void tst_BackNavigation::aTargetIdIsComparedWithTheTargetView()
{
    MediaFlow flow;
    HmiViewState *radio = flow.viewOf("RadioScreen", "Radio");
    flow.walkTo({"Player", "Radio", "Song"});

    flow.back(1, "RadioScreen");
    QVERIFY(radio->isActive());
    flow.request("Song");
    flow.back(1, "Radio");

    QVERIFY(flow.home->isActive());
}

void tst_BackNavigation::aPressWithNobodyToTakeItMovesNothing()
{
    MediaFlow flow;
    flow.walkTo({});

    flow.back();
    flow.back(3, "Player");

    QVERIFY(flow.home->isActive());
    QCOMPARE(flow.take(), QStringList());
}

void tst_BackNavigation::goingBackAndForthKeepsTheWay()
{
    MediaFlow flow;
    flow.walkTo({"Player", "List"});

    flow.back();
    flow.request("List");
    flow.back();
    flow.request("List");
    flow.take();
    flow.back(2);

    QCOMPARE(flow.take(),
             QStringList({"deactivateView List", "Player backStackPop",
                          "postFollowOnBackEvent 2  Player", "activateView Player",
                          "deactivateView Player", "activateView Home"}));
}

void tst_BackNavigation::aRoundTripIsWalkedBackInFull()
{
    MediaFlow flow;
    flow.walkTo({"Player", "List", "Player"});

    flow.back();
    QCOMPARE(ViewFlow::activeView(), QString("List"));
    flow.back();
    QCOMPARE(ViewFlow::activeView(), QString("Player"));
    flow.back();

    QCOMPARE(ViewFlow::activeView(), QString("Home"));
}

void tst_BackNavigation::aViewWithADirectTargetLeadsThereFromEverywhere()
{
    MediaFlow flow;
    flow.song->createDirectBackTransition(flow.home);
    flow.walkTo({"Player", "Song"});

    flow.back();
    QCOMPARE(ViewFlow::activeView(), QString("Home"));
    flow.request("List");
    flow.request("Song");
    flow.back();

    QCOMPARE(ViewFlow::activeView(), QString("Home"));
}

void tst_BackNavigation::stepsGoOnThroughADirectTarget()
{
    MediaFlow flow;
    flow.list->createDirectBackTransition(flow.home);
    flow.walkTo({"Player", "List", "Song"});

    flow.back(2);

    QCOMPARE(flow.take(),
             QStringList({"deactivateView Song", "postFollowOnBackEvent 2  List",
                          "activateView List", "deactivateView List", "activateView Home"}));
}

void tst_BackNavigation::aFallbackLeavesNoTraceOnTheWayBack()
{
    MediaFlow flow;
    lead(HmiFallbackEvent::eventType(), flow.song, flow.list);
    flow.walkTo({"Player", "Song"});

    flow.post(new HmiFallbackEvent("List"));
    QCOMPARE(flow.take(), QStringList({"deactivateView Song", "activateView List"}));
    QCOMPARE(flow.list->backTarget(), QString("Player"));
    flow.back(2);

    QCOMPARE(ViewFlow::activeView(), QString("Home"));
}

void tst_BackNavigation::aViewWithoutPresenceIsPassedOver()
{
    MediaFlow flow;
    flow.list->setHasBackStackPresence(false);
    flow.walkTo({"Player", "List", "Song"});

    flow.back();

    QCOMPARE(ViewFlow::activeView(), QString("Player"));
}

void tst_BackNavigation::viewsOfOneProviderLeaveTogether()
{
    MediaFlow flow;
    flow.list->setBackTargetProviderState(flow.player);
    flow.song->setBackTargetProviderState(flow.player);
    flow.walkTo({"Player", "List", "Song", "List"});

    flow.back();

    QCOMPARE(flow.take(), QStringList({"deactivateView List", "activateView Home"}));
    flow.request("List");
    QCOMPARE(flow.list->backTarget(), QString("Home"));
}

void tst_BackNavigation::filtersLeaveTheModuleInOnePress()
{
    MediaFlow flow;
    HmiViewState *main = flow.backView("RadioMain");
    flow.backView("RadioList");
    HmiViewState *scan = flow.backView("RadioScan");
    scan->addBackTargetFilter(
        QSharedPointer<HmiTargetFilter>(new HmiModuleBlacklistFilter("Radio")));
    flow.walkTo({"Player", "RadioMain", "RadioList", "RadioScan"});
    QCOMPARE(main->backTarget(), QString("Player"));

    flow.back();

    QCOMPARE(ViewFlow::activeView(), QString("Player"));
    QCOMPARE(flow.player->backTarget(), QString("Home"));
}

void tst_BackNavigation::filtersOfTwoKindsWorkTogether()
{
    MediaFlow flow;
    flow.backView("RadioMain");
    flow.backView("RadioList");
    HmiViewState *scan = flow.backView("Scan");
    scan->addBackTargetFilter(
        QSharedPointer<HmiTargetFilter>(new HmiModuleWhitelistFilter("Radio")));
    scan->addBackTargetFilter(
        QSharedPointer<HmiTargetFilter>(new HmiTargetBlacklistFilter("RadioList")));
    flow.walkTo({"RadioMain", "RadioList", "Player", "Scan"});

    QCOMPARE(scan->backTarget(), QString("RadioMain"));
}

void tst_BackNavigation::aDummyStandsInForTheViewBeforeIt()
{
    MediaFlow flow;
    HmiViewState::createDummyViewState("Dummy", &flow.machine, 0, false);
    flow.walkTo({"Player", "List", "Dummy"});

    flow.back();

    QCOMPARE(flow.take(),
             QStringList({"Player backStackPop", "postFollowOnBackEvent 1  Player",
                          "activateView Player"}));
    QCOMPARE(flow.player->backTarget(), QString("Home"));
}

void tst_BackNavigation::stepsEndAtADummy()
{
    MediaFlow flow;
    HmiViewState *dummy = HmiViewState::createDummyViewState("Dummy", &flow.machine, 0, false);
    flow.song->createDirectBackTransition(dummy);
    flow.walkTo({"Player", "Song"});

    flow.back(3);

    QVERIFY(dummy->isActive());
    QCOMPARE(flow.take(), QStringList("deactivateView Song"));
}

void tst_BackNavigation::aModuleIsReachedThroughItsInitialView()
{
    MediaFlow flow;
    auto *radio = new NamedState("Radio", &flow.machine);
    HmiViewState *tuner = flow.backView("Tuner", radio);
    tuner->setBackStackStateId("Radio", false);
    radio->setInitialState(tuner);
    flow.walkTo({"Radio", "List"});
    QCOMPARE(flow.list->backTarget(), QString("Radio"));

    flow.back(2);

    QCOMPARE(
        flow.take(),
        QStringList({"deactivateView List", "Tuner backStackPop", "postFollowOnBackEvent 2  Tuner",
                     "activateView Tuner", "deactivateView Tuner", "activateView Home"}));
}

void tst_BackNavigation::stepsGoOnBehindAModuleThatLeadsOn()
{
    MediaFlow flow;
    auto *radio = new NamedState("Radio", &flow.machine);
    auto *choice = new QState(radio);
    HmiViewState *tuner = flow.backView("Tuner", radio);
    tuner->setBackStackStateId("Radio", false);
    radio->setInitialState(choice);
    leadOnAtOnce(choice, tuner);
    flow.walkTo({"Player", "Radio", "List"});
    QCOMPARE(flow.list->backTarget(), QString("Radio"));

    flow.back(3);

    QCOMPARE(
        flow.take(),
        QStringList({"deactivateView List", "Tuner backStackPop", "postFollowOnBackEvent 3  Tuner",
                     "activateView Tuner", "deactivateView Tuner", "Player backStackPop",
                     "postFollowOnBackEvent 2  Player", "activateView Player",
                     "deactivateView Player", "activateView Home"}));
}

void tst_BackNavigation::aViewThatIsGoneIsPassedOver()
{
    MediaFlow flow;
    flow.walkTo({"Player", "List", "Song"});

    delete flow.player;
    flow.back(2, "Home");

    QCOMPARE(flow.take(),
             QStringList({"deactivateView Song", "List backStackPop",
                          "postFollowOnBackEvent 2 Home List", "activateView List",
                          "deactivateView List", "activateView Home"}));
}

void tst_BackNavigation::theDataOfAViewTellsHowItWasReachedAndLeft()
{
    MediaFlow flow;
    flow.start(flow.home);
    flow.request("Player", "song");
    flow.request("List");
    QCOMPARE(flow.target.viewData("Player"),
             QVariantMap({{"eventData", "song"}, {"entryReason", 0}, {"exitReason", 0}}));

    flow.back();
    QCOMPARE(flow.target.viewData("Player"),
             QVariantMap({{"eventData", QVariant()}, {"entryReason", 1}, {"exitReason", 0}}));
    QCOMPARE(flow.target.viewData("List").value("exitReason"), QVariant(1));
    flow.back();

    QCOMPARE(flow.target.viewData("Player"),
             QVariantMap({{"eventData", QVariant()}, {"entryReason", 1}, {"exitReason", 1}}));
}

void tst_BackNavigation::eachRegionGoesBackByItself()
{
    ViewFlow flow;
    auto *both = new QState(QState::ParallelStates, &flow.machine);
    auto *left = new QState(both);
    HmiViewState *map = flow.view("Map", left);
    HmiViewState *route = flow.view("Route", left);
    auto *right = new QState(both);
    HmiViewState *radio = flow.view("Radio", right);
    HmiViewState *scan = flow.view("Scan", right);
    route->createDirectBackTransition(map);
    scan->createDirectBackTransition(radio);
    left->setInitialState(route);
    right->setInitialState(scan);
    startIn(flow.machine, both);
    flow.take();

    flow.back();

    QVERIFY(map->isActive());
    QVERIFY(radio->isActive());
    QCOMPARE(flow.take(),
             QStringList({"deactivateView Scan", "deactivateView Route", "activateView Map",
                          "activateView Radio"}));
}

void tst_BackNavigation::aViewLeftInAnotherRegionIsLastKnownToo()
{
    ViewFlow flow;
    auto *both = new QState(QState::ParallelStates, &flow.machine);
    auto *left = new QState(both);
    HmiViewState *map = flow.view("Map", left);
    HmiViewState *route = flow.view("Route", left);
    auto *right = new QState(both);
    HmiViewState *radio = flow.view("Radio", right);
    HmiViewState *scan = flow.backView("Scan", right);
    left->setInitialState(map);
    right->setInitialState(radio);
    lead(QEvent::Type(QEvent::User + 1), map, route);
    lead(QEvent::Type(QEvent::User + 1), radio, scan);
    startIn(flow.machine, both);

    flow.post(new QEvent(QEvent::Type(QEvent::User + 1)));

    // Both are left, the right one first, before either is entered.
    QCOMPARE(HmiViewState::lastKnownViewState(), QString("Map"));
    QCOMPARE(scan->backTarget(), QString("Map"));
}

void tst_BackNavigation::aPressIsTakenByTheRegionThatHandlesIt()
{
    ViewFlow flow;
    auto *both = new QState(QState::ParallelStates, &flow.machine);
    auto *left = new QState(both);
    HmiViewState *map = flow.view("Map", left);
    left->setInitialState(map);
    auto *right = new QState(both);
    HmiViewState *scan = flow.view("Scan", right);
    scan->createDirectBackTransition(flow.view("Radio", right));
    right->setInitialState(scan);
    startIn(flow.machine, both);
    flow.take();

    flow.back();

    QVERIFY(map->isActive());
    QCOMPARE(flow.take(), QStringList({"deactivateView Scan", "activateView Radio"}));
}

QTEST_GUILESS_MAIN(tst_BackNavigation)
#include "tst_backnavigation.moc"
