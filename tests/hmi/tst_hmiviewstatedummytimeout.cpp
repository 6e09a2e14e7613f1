#include "driving.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QSignalSpy>
#include <QTimer>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** The process-wide machine with a dummy that may go back to the last known view on its own. */
class Returning
{
public:
    explicit Returning(bool returns = true) : machine(StateMachine::instance()), target(journal)
    {
        home = new HmiViewState("Home", machine);
        dummy = HmiViewState::createDummyViewState("Dummy", machine, 2000, returns);
        home->createDirectBackTransition(dummy);
        startIn(*machine, home);
    }

    ~Returning()
    {
        park(*machine);
        delete home;
        delete dummy;
    }

    void enterDummy()
    {
        machine->postEvent(new HmiBackEvent(1, QString()));
        settle();
    }

    bool timeOut()
    {
        const bool fired = fire(dummy->findChild<QTimer *>());
        settle();
        return fired;
    }

    StateMachine *machine;
    Journal journal;
    RecordingViewStateTarget target;
    HmiViewState *home;
    HmiViewState *dummy;
};

} // namespace

/** What a dummy view does when its time is over. */
class tst_HmiViewStateDummyTimeout : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aTimerIsMadeOnlyForAPositiveTimeout_data();
    void aTimerIsMadeOnlyForAPositiveTimeout();
    void theTimerRunsWhileTheDummyIsActive();
    void theTimeoutIsSignalledAgainAndAgain();
    void withoutReturningTheTimeoutOnlySignals();
    void theTimeoutLeadsBackToTheLastKnownView();
    void theDataOfTheLastKnownViewGoesWithIt();
    void anUnknownLastKnownViewIsRequestedWithoutData();
    void theTimeoutIsSignalledBeforeTheReturn();
    void theReturnWaitsForItsTurn();
    void onlyAnActiveDummyReturns();
    void aViewThatShowsSomethingDoesNotReturn();
};

void tst_HmiViewStateDummyTimeout::aTimerIsMadeOnlyForAPositiveTimeout_data()
{
    QTest::addColumn<int>("timeout");
    QTest::addColumn<int>("timers");

    QTest::newRow("positive") << 1 << 1;
    QTest::newRow("zero") << 0 << 0;
    QTest::newRow("negative") << -1 << 0;
}

void tst_HmiViewStateDummyTimeout::aTimerIsMadeOnlyForAPositiveTimeout()
{
    QFETCH(int, timeout);

    const QScopedPointer<HmiViewState> dummy(
        HmiViewState::createDummyViewState("Dummy", nullptr, timeout, true));

    QVERIFY(!dummy->parent());
    QTEST(dummy->findChildren<QTimer *>().size(), "timers");
}

void tst_HmiViewStateDummyTimeout::theTimerRunsWhileTheDummyIsActive()
{
    ViewFlow flow;
    HmiViewState *dummy = HmiViewState::createDummyViewState("Dummy", &flow.machine, 1500, false);
    const auto *timer = dummy->findChild<QTimer *>();
    QVERIFY(timer);
    flow.start(flow.view("Home"));
    QCOMPARE(timer->interval(), 1500);
    QVERIFY(!timer->isSingleShot());
    QVERIFY(!timer->isActive());

    flow.request("Dummy");
    QVERIFY(timer->isActive());
    flow.request("Home");

    QVERIFY(!timer->isActive());
}

void tst_HmiViewStateDummyTimeout::theTimeoutIsSignalledAgainAndAgain()
{
    ViewFlow flow;
    HmiViewState *dummy = HmiViewState::createDummyViewState("Dummy", &flow.machine, 1500, false);
    QSignalSpy timeouts(dummy, &HmiViewState::dummyViewStateTimeout);
    QVERIFY(timeouts.isValid());
    flow.start(dummy);

    QVERIFY(fire(dummy->findChild<QTimer *>()));
    QVERIFY(fire(dummy->findChild<QTimer *>()));

    QCOMPARE(timeouts.size(), 2);
}

void tst_HmiViewStateDummyTimeout::withoutReturningTheTimeoutOnlySignals()
{
    Returning flow(false);
    HmiViewState::setLastKnownViewState("Home");
    QSignalSpy timeouts(flow.dummy, &HmiViewState::dummyViewStateTimeout);
    QVERIFY(timeouts.isValid());
    flow.enterDummy();

    QVERIFY(flow.timeOut());

    QCOMPARE(timeouts.size(), 1);
    QVERIFY(flow.dummy->isActive());
}

void tst_HmiViewStateDummyTimeout::theTimeoutLeadsBackToTheLastKnownView()
{
    Returning flow;
    HmiViewState::setLastKnownViewState("Home");
    flow.enterDummy();
    QVERIFY(flow.dummy->isActive());
    flow.journal.clear();

    QVERIFY(flow.timeOut());

    QVERIFY(flow.home->isActive());
    QCOMPARE(flow.home->entryReason(), 0);
    QCOMPARE(flow.journal.lines(), QStringList("activateView Home"));
    QVERIFY(!flow.timeOut());
}

void tst_HmiViewStateDummyTimeout::theDataOfTheLastKnownViewGoesWithIt()
{
    Returning flow;
    flow.home->addInstanceData("eventData", "station 5");
    HmiViewState::setLastKnownViewState("Home");
    flow.enterDummy();

    QVERIFY(flow.timeOut());

    QCOMPARE(flow.target.viewData("Home").value("eventData"), QVariant("station 5"));
}

void tst_HmiViewStateDummyTimeout::anUnknownLastKnownViewIsRequestedWithoutData()
{
    Returning flow;
    NamedState module("Module");
    flow.enterDummy();

    HmiViewState::setLastKnownViewState("Nowhere");
    QVERIFY(flow.timeOut());
    HmiViewState::setLastKnownViewState(QString());
    QVERIFY(flow.timeOut());

    QVERIFY(flow.dummy->isActive());
}

void tst_HmiViewStateDummyTimeout::theTimeoutIsSignalledBeforeTheReturn()
{
    Returning flow;
    HmiViewState::setLastKnownViewState("Home");
    bool activeAtTimeout = false;
    connect(flow.dummy, &HmiViewState::dummyViewStateTimeout, this, [&] {
        activeAtTimeout = flow.dummy->isActive();
        HmiViewState::setLastKnownViewState(QString());
    });
    flow.enterDummy();

    QVERIFY(flow.timeOut());

    QVERIFY(activeAtTimeout);
    QVERIFY(flow.dummy->isActive());
}

void tst_HmiViewStateDummyTimeout::theReturnWaitsForItsTurn()
{
    Returning flow;
    const QScopedPointer<HmiViewState> map(new HmiViewState("Map", flow.machine));
    HmiViewState::setLastKnownViewState("Home");
    connect(flow.dummy, &HmiViewState::dummyViewStateTimeout, this,
            [&] { flow.machine->postEvent(new HmiViewEvent("Map", QVariant())); });
    flow.enterDummy();
    flow.journal.clear();

    QVERIFY(flow.timeOut());

    QCOMPARE(flow.journal.lines(),
             QStringList({"activateView Map", "deactivateView Map", "activateView Home"}));
}

void tst_HmiViewStateDummyTimeout::onlyAnActiveDummyReturns()
{
    Returning flow;
    HmiViewState::setLastKnownViewState("Dummy");
    auto *timer = flow.dummy->findChild<QTimer *>();
    timer->start();

    QVERIFY(flow.timeOut());

    QVERIFY(flow.home->isActive());
}

void tst_HmiViewStateDummyTimeout::aViewThatShowsSomethingDoesNotReturn()
{
    Returning flow;
    HmiViewState::setLastKnownViewState("Dummy");
    QTimer timer;
    connect(&timer, SIGNAL(timeout()), flow.home, SLOT(backToLastKnownView()));
    timer.start(2000);

    QVERIFY(fire(&timer));
    settle();

    QVERIFY(flow.home->isActive());
}

QTEST_GUILESS_MAIN(tst_HmiViewStateDummyTimeout)
#include "tst_hmiviewstatedummytimeout.moc"
