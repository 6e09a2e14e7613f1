#include "driving.h"
#include "librarytest.h"
#include "makeevent.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmifallbackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>

#include <QtTest>

using namespace HmiStateMachine;

/** What a view does with a back press that leads to it, and what it leaves behind on exit. */
class tst_HmiViewStateBackEntry : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aBackEntryTakesItsTargetFromTheBackStack();
    void onAnEmptyBackStackTheTargetOfTheEventIsTaken();
    void aPoppedNameThatIsGoneGivesWayToTheTargetOfTheEvent();
    void aPoppedNameComesBeforeTheTargetOfTheEvent();
    void aBackEntryWithoutAnyTargetLeadsNowhere();
    void aBackEntryAsksForTheNextStepBeforeTheActivation_data();
    void aBackEntryAsksForTheNextStepBeforeTheActivation();
    void aBackEntryIsCountedAfterTheNextStepIsAskedFor();
    void aBackEntryWithADirectTargetPopsNothing();
    void aForwardEntryWithADirectTargetIsLogged();
    void depthZeroIsAnOrdinaryEntry();
    void anExitLeavesItsTrace_data();
    void anExitLeavesItsTrace();
    void thePresentTargetIsPushed();
    void aTargetThatIsGoneIsNotPushed();
    void aViewWithADirectTargetPushesNothing();
    void theTargetIsFoundOnEntryAndNotAgain();
};

void tst_HmiViewStateBackEntry::aBackEntryTakesItsTargetFromTheBackStack()
{
    ViewFlow flow;
    flow.backView("List");
    HmiViewState *player = flow.backView("Player");
    flow.start(flow.view("Home"));
    flow.request("Player");
    flow.request("List");
    QCOMPARE(flow.take(),
             QStringList({"deactivateView Home", "activateView Player", "Player backStackPush Home",
                          "deactivateView Player", "activateView List"}));
    messages().enableDebug();

    flow.back();

    QCOMPARE(player->backTarget(), QString("Home"));
    QCOMPARE(player->entryReason(), 1);
    QCOMPARE(flow.take(),
             QStringList({"deactivateView List", "Player backStackPop",
                          "postFollowOnBackEvent 1  Player", "activateView Player"}));
    QCOMPARE(messages().take().first(),
             QString("debug onEntry: \"Player\" Setting back state: \"Home\""));
}

void tst_HmiViewStateBackEntry::onAnEmptyBackStackTheTargetOfTheEventIsTaken()
{
    ViewFlow flow;
    flow.view("Map");
    flow.backView("Radio");
    HmiViewState *home = flow.backView("Home");
    flow.start(home);
    flow.request("Radio");

    flow.back(1, "Map");

    QCOMPARE(home->backTarget(), QString("Map"));
}

void tst_HmiViewStateBackEntry::aPoppedNameThatIsGoneGivesWayToTheTargetOfTheEvent()
{
    ViewFlow flow;
    flow.view("Map");
    flow.backView("Radio");
    HmiViewState *home = flow.backView("Home");
    flow.start(home);
    home->pushBackStack("Nowhere");
    flow.request("Radio");

    flow.back(1, "Map");

    QCOMPARE(home->backTarget(), QString("Map"));
    QCOMPARE(home->popBackStack(), QString());
}

void tst_HmiViewStateBackEntry::aPoppedNameComesBeforeTheTargetOfTheEvent()
{
    ViewFlow flow;
    flow.view("Map");
    flow.view("Phone");
    flow.backView("Radio");
    HmiViewState *home = flow.backView("Home");
    flow.start(home);
    home->pushBackStack("Phone");
    flow.request("Radio");

    flow.back(1, "Map");

    QCOMPARE(home->backTarget(), QString("Phone"));
}

void tst_HmiViewStateBackEntry::aBackEntryWithoutAnyTargetLeadsNowhere()
{
    ViewFlow flow;
    flow.backView("Radio");
    HmiViewState *home = flow.backView("Home");
    flow.start(home);
    flow.request("Radio");
    flow.back(1, "Nowhere");
    QCOMPARE(home->backTarget(), QString());
    flow.take();

    flow.back();

    QVERIFY(home->isActive());
    QCOMPARE(flow.take(), QStringList());
}

void tst_HmiViewStateBackEntry::aBackEntryAsksForTheNextStepBeforeTheActivation_data()
{
    QTest::addColumn<int>("depth");
    QTest::addColumn<QString>("targetId");
    QTest::addColumn<QString>("call");

    QTest::newRow("one step") << 1 << ""
                              << "postFollowOnBackEvent 1  HomeScreen";
    QTest::newRow("many steps") << 255 << ""
                                << "postFollowOnBackEvent 255  HomeScreen";
    QTest::newRow("to a target") << 1 << "Map"
                                 << "postFollowOnBackEvent 1 Map HomeScreen";
    QTest::newRow("to here") << 3 << "Home"
                             << "postFollowOnBackEvent 3 Home HomeScreen";
}

void tst_HmiViewStateBackEntry::aBackEntryAsksForTheNextStepBeforeTheActivation()
{
    QFETCH(int, depth);
    QFETCH(QString, targetId);
    QFETCH(QString, call);
    ViewFlow flow;
    HmiViewState *home = flow.viewOf("HomeScreen", "Home");
    flow.backView("Radio");
    flow.start(home);
    flow.request("Radio");
    flow.take();

    flow.back(depth, targetId);

    QCOMPARE(flow.take(),
             QStringList(
                 {"deactivateView Radio", "Home backStackPop", call, "activateView HomeScreen"}));
}

void tst_HmiViewStateBackEntry::aBackEntryIsCountedAfterTheNextStepIsAskedFor()
{
    ViewFlow flow;
    HmiViewState *home = flow.backView("Home");
    flow.backView("Radio");
    QStringList atPop;
    flow.start(home);
    connect(home, &HmiViewState::backStackPop, this, [&] {
        atPop.append(QString::number(home->entryReason()) + ' ' + ViewFlow::activeView());
    });

    for (int i = 0; i < 2; ++i) {
        flow.request("Radio");
        flow.back();
        QCOMPARE(home->entryReason(), 1);
    }

    QCOMPARE(atPop, QStringList({"0 ", "0 "}));
}

void tst_HmiViewStateBackEntry::aBackEntryWithADirectTargetPopsNothing()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    home->createDirectBackTransition(flow.view("Map"));
    home->pushBackStack("Phone");
    flow.backView("Radio");
    flow.start(home);
    flow.request("Radio");
    flow.take();
    messages().enableDebug();

    flow.back(2, "Phone");

    QCOMPARE(home->entryReason(), 1);
    QCOMPARE(home->directBackTransitionTarget(), NamedState::stateForName("Map"));
    QCOMPARE(flow.take(),
             QStringList({"deactivateView Radio", "postFollowOnBackEvent 2 Phone Home",
                          "activateView Home"}));
    QCOMPARE(messages().take().first(),
             QString("debug onEntry: \"Home\" Setting direct back state: \"Map\""));
}

void tst_HmiViewStateBackEntry::aForwardEntryWithADirectTargetIsLogged()
{
    ViewFlow flow;
    HmiViewState *radio = flow.view("Radio");
    radio->createDirectBackTransition(new QState(&flow.machine));
    flow.start(flow.view("Home"));
    messages().enableDebug();

    flow.request("Radio");

    QCOMPARE(messages().take().first(),
             QString("debug onEntry: \"Radio\" Setting direct back state: \"\""));
    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView Radio"}));
}

void tst_HmiViewStateBackEntry::depthZeroIsAnOrdinaryEntry()
{
    ViewFlow flow;
    HmiViewState *home = flow.backView("Home");
    flow.backView("Radio");
    flow.start(home);
    flow.request("Radio");
    flow.take();

    flow.back(0, "Radio");

    QCOMPARE(home->entryReason(), 0);
    QCOMPARE(home->backTarget(), QString("Radio"));
    QCOMPARE(HmiViewState::lastKnownViewState(), QString("Radio"));
    QCOMPARE(flow.target.viewData("Radio").value("exitReason"), QVariant(0));
    QCOMPARE(
        flow.take(),
        QStringList({"Radio backStackPush Home", "deactivateView Radio", "activateView Home"}));
}

void tst_HmiViewStateBackEntry::anExitLeavesItsTrace_data()
{
    QTest::addColumn<MakeEvent>("make");
    QTest::addColumn<int>("exitReason");

    const auto row = [](const char *tag, MakeEvent make, int exitReason) {
        QTest::newRow(tag) << make << exitReason;
    };
    row(
        "a view", []() -> QEvent * { return new HmiViewEvent("Map", QVariant()); }, 0);
    row(
        "a named event", []() -> QEvent * { return new HmiEvent("", QVariant()); }, 0);
    row(
        "the application's", []() -> QEvent * { return new QEvent(QEvent::User); }, 0);
    row(
        "back, no steps", []() -> QEvent * { return new HmiBackEvent(0, "Map"); }, 0);
    row(
        "back", []() -> QEvent * { return new HmiBackEvent(1, QString()); }, 1);
    row(
        "back to a target", []() -> QEvent * { return new HmiBackEvent(9, "Map"); }, 1);
    row(
        "a fallback", []() -> QEvent * { return new HmiFallbackEvent("Map"); }, 1);
}

void tst_HmiViewStateBackEntry::anExitLeavesItsTrace()
{
    QFETCH(MakeEvent, make);
    QFETCH(int, exitReason);
    ViewFlow flow;
    HmiViewState *map = flow.view("Map");
    HmiViewState *radio = flow.backView("Radio");
    for (QEvent::Type type : {HmiEvent::eventType(), HmiFallbackEvent::eventType(), QEvent::User}) {
        lead(type, radio, map);
    }
    flow.start(flow.view("Home"));
    flow.request("Radio");

    flow.post(make());

    QVERIFY(!radio->isActive());
    QCOMPARE(flow.target.viewData("Radio").value("exitReason"), QVariant(exitReason));
    QCOMPARE(flow.journal.lines().contains("Radio backStackPush Home"), exitReason == 0);
    QCOMPARE(HmiViewState::lastKnownViewState(), QString(exitReason == 0 ? "Radio" : "Home"));
}

void tst_HmiViewStateBackEntry::thePresentTargetIsPushed()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.backView("Radio");
    flow.start(home);
    flow.request("Radio");
    flow.take();

    home->setName("Start");
    flow.request("Start");

    QCOMPARE(
        flow.take(),
        QStringList({"Radio backStackPush Start", "deactivateView Radio", "activateView Home"}));
    QCOMPARE(radio->popBackStack(), QString("Start"));
}

void tst_HmiViewStateBackEntry::aTargetThatIsGoneIsNotPushed()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    flow.backView("Radio");
    flow.view("Map");
    flow.start(home);
    flow.request("Radio");
    flow.take();

    delete home;
    flow.request("Map");

    QCOMPARE(flow.take(), QStringList({"deactivateView Radio", "activateView Map"}));
}

void tst_HmiViewStateBackEntry::aViewWithADirectTargetPushesNothing()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    flow.view("Radio")->createDirectBackTransition(home);
    flow.view("Map");
    flow.start(home);
    flow.request("Radio");
    flow.take();

    flow.request("Map");

    QCOMPARE(flow.take(), QStringList({"deactivateView Radio", "activateView Map"}));
    QCOMPARE(HmiViewState::lastKnownViewState(), QString("Radio"));
}

void tst_HmiViewStateBackEntry::theTargetIsFoundOnEntryAndNotAgain()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    flow.backView("Radio");
    HmiViewState *map = flow.view("Map");
    flow.start(home);
    flow.request("Radio");

    home->setName("Start");
    map->setName("Home");
    flow.back();

    QCOMPARE(HmiViewState::activeViewState(), home);
}

QTEST_GUILESS_MAIN(tst_HmiViewStateBackEntry)
#include "tst_hmiviewstatebackentry.moc"
