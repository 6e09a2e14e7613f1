#include "driving.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmibacktransition.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QtTest>

#include <algorithm>

using namespace HmiStateMachine;

namespace {

/** A row for each order of the views that know of one another. */
void addOrders()
{
    QTest::addColumn<QStringList>("order");

    QStringList order = {"Active", "Left", "Module", "Provider"};
    do {
        QTest::newRow(qPrintable(order.join(", "))) << order;
    } while (std::next_permutation(order.begin(), order.end()));
}

/** An active view with a provider and a watched state, come from another view. */
struct Relations : public ViewFlow
{
    explicit Relations(const QStringList &order)
    {
        for (const QString &name : order) {
            backView(name);
        }
        HmiViewState *active = named("Active");
        active->setBackTargetProviderState(named("Provider"));
        active->setBackStackStateId("Module", false);
        active->setReportsQmlViewStatus(true);
        start(named("Provider"));
        request("Left");
        request("Active");
        request("Module");
        request("Left");
        request("Active");
        take();
    }

    static HmiViewState *named(const QString &name)
    {
        return qobject_cast<HmiViewState *>(NamedState::stateForName(name));
    }
};

} // namespace

/** Views go in any order; what knew of them forgets them. */
class tst_HmiViewStateLifetime : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aMachineThatRunsMayBeDestroyed_data();
    void aMachineThatRunsMayBeDestroyed();
    void viewsOfAStoppedMachineMayBeDestroyedInAnyOrder_data();
    void viewsOfAStoppedMachineMayBeDestroyedInAnyOrder();
    void onlyTheActiveViewTakesTheRecordWithIt();
    void theProcessWideMachineIsParkedBeforeItsViewsGo();
    void aDummyBorrowsNothingFromAViewThatIsGone();
    void anotherViewMayGoBeforeADummyBorrows();
    void aBorrowedTargetOutlivesItsLender();
    void aBorrowedTargetThatIsGoneLeadsNowhere();
    void aProviderThatIsGoneNoLongerKeepsTheBackStackEmpty();
    void aWatchedStateThatIsGoneIsForgotten();
    void aWatchingViewThatIsGoneIsForgotten();
    void aViewThatWatchesItselfMayGo();
    void aViewThatIsGoneIsNoLongerFound();
    void theLoserOfANameKeepsItsTargetView();
    void aViewLayerThatIsGoneIsNotTold();
};

void tst_HmiViewStateLifetime::aMachineThatRunsMayBeDestroyed_data()
{
    addOrders();
}

void tst_HmiViewStateLifetime::aMachineThatRunsMayBeDestroyed()
{
    QFETCH(QStringList, order);
    QScopedPointer<Relations> flow(new Relations(order));
    QCOMPARE(ViewFlow::activeView(), QString("Active"));

    flow.reset();

    QVERIFY(!HmiViewState::activeViewState());
    QCOMPARE(NamedState::namedStates().size(), 0);
}

void tst_HmiViewStateLifetime::viewsOfAStoppedMachineMayBeDestroyedInAnyOrder_data()
{
    addOrders();
}

void tst_HmiViewStateLifetime::viewsOfAStoppedMachineMayBeDestroyedInAnyOrder()
{
    QFETCH(QStringList, order);
    Relations flow({"Active", "Left", "Module", "Provider"});
    HmiViewState *next = flow.backView("Next");
    park(flow.machine);

    for (const QString &name : order) {
        delete Relations::named(name);
        QCOMPARE(ViewFlow::activeView(), QString(Relations::named("Active") ? "Active" : ""));
    }
    flow.start(next);
    flow.back();

    QVERIFY(next->isActive());
    QCOMPARE(next->backTarget(), QString());
}

void tst_HmiViewStateLifetime::onlyTheActiveViewTakesTheRecordWithIt()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.view("Radio");
    flow.start(home);

    delete radio;
    QCOMPARE(HmiViewState::activeViewState(), home);

    flow.machine.stop();
    settle();
    QCOMPARE(HmiViewState::activeViewState(), home);
    delete home;
    QVERIFY(!HmiViewState::activeViewState());
}

void tst_HmiViewStateLifetime::theProcessWideMachineIsParkedBeforeItsViewsGo()
{
    StateMachine *machine = StateMachine::instance();
    auto *first = new HmiViewState("First", machine);
    startIn(*machine, first);
    park(*machine);
    delete first;
    auto *second = new HmiViewState("Second", machine);

    startIn(*machine, second);

    QCOMPARE(HmiViewState::activeViewState(), second);
    park(*machine);
    delete second;
}

void tst_HmiViewStateLifetime::aDummyBorrowsNothingFromAViewThatIsGone()
{
    ViewFlow flow;
    flow.view("Home");
    HmiViewState *radio = flow.backView("Radio");
    auto *between = new NamedState("Between", &flow.machine);
    HmiViewState *dummy = HmiViewState::createDummyViewState("Dummy", &flow.machine, 0, false);
    lead(QEvent::User, between, dummy);
    flow.start(radio);
    flow.request("Between");

    delete radio;
    flow.post(new QEvent(QEvent::User));

    QVERIFY(dummy->isActive());
    QCOMPARE(dummy->findChildren<HmiBackTransition *>().size(), 0);
}

void tst_HmiViewStateLifetime::anotherViewMayGoBeforeADummyBorrows()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    flow.backView("Radio");
    auto *between = new NamedState("Between", &flow.machine);
    HmiViewState *dummy = HmiViewState::createDummyViewState("Dummy", &flow.machine, 0, false);
    lead(QEvent::User, between, dummy);
    flow.start(home);
    flow.request("Radio");
    flow.request("Between");

    delete home;
    flow.post(new QEvent(QEvent::User));

    QCOMPARE(dummy->findChildren<HmiBackTransition *>().size(), 1);
}

void tst_HmiViewStateLifetime::aBorrowedTargetOutlivesItsLender()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.backView("Radio");
    HmiViewState::createDummyViewState("Dummy", &flow.machine, 0, false);
    flow.start(home);
    flow.request("Radio");
    flow.request("Dummy");

    delete radio;
    flow.back();

    QVERIFY(home->isActive());
}

void tst_HmiViewStateLifetime::aBorrowedTargetThatIsGoneLeadsNowhere()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    flow.backView("Radio");
    HmiViewState *dummy = HmiViewState::createDummyViewState("Dummy", &flow.machine, 0, false);
    flow.start(home);
    flow.request("Radio");
    flow.request("Dummy");

    delete home;
    flow.back();

    QVERIFY(dummy->isActive());
}

void tst_HmiViewStateLifetime::aProviderThatIsGoneNoLongerKeepsTheBackStackEmpty()
{
    ViewFlow flow;
    HmiViewState *player = flow.backView("Player");
    flow.backView("List")->setBackTargetProviderState(player);
    flow.start(flow.view("Home"));
    flow.request("Player");
    flow.request("List");
    flow.take();

    delete player;
    flow.request("Home");

    QCOMPARE(flow.take(),
             QStringList({"List backStackPush Home", "deactivateView List", "activateView Home"}));
}

void tst_HmiViewStateLifetime::aWatchedStateThatIsGoneIsForgotten()
{
    HmiViewState view("Player");
    QScopedPointer<NamedState> watched(new NamedState("Media"));
    view.setBackStackStateId("Media", false);

    watched.reset();
    view.setBackStackStateId("Other", false);

    QCOMPARE(view.backStackStateId(), QString("Other"));
}

void tst_HmiViewStateLifetime::aWatchingViewThatIsGoneIsForgotten()
{
    ViewFlow flow;
    auto *media = new NamedState("Media", &flow.machine);
    HmiViewState *player = flow.backView("Player");
    player->setBackStackStateId("Media", false);
    flow.start(flow.view("Home"));

    delete player;
    flow.request("Media");

    QVERIFY(media->isActive());
}

void tst_HmiViewStateLifetime::aViewThatWatchesItselfMayGo()
{
    QScopedPointer<HmiViewState> view(new HmiViewState("Radio"));
    view->setBackStackStateId("Radio", false);

    view.reset();

    QCOMPARE(NamedState::namedStates().size(), 0);
}

void tst_HmiViewStateLifetime::aViewThatIsGoneIsNoLongerFound()
{
    ViewFlow flow;
    HmiViewState *radio = flow.viewOf("RadioScreen", "Radio");
    HmiViewState *home = flow.view("Home");
    flow.start(home);

    delete radio;
    flow.request("Radio");
    flow.request("RadioScreen");

    QVERIFY(home->isActive());
    QVERIFY(!HmiViewState::stateForTarget("RadioScreen"));
}

void tst_HmiViewStateLifetime::theLoserOfANameKeepsItsTargetView()
{
    HmiViewState first("Radio");
    {
        const HmiViewState second("Radio");
        QCOMPARE(messages().take().size(), 1);
        QCOMPARE(second.name(), QString());
        QCOMPARE(second.targetView(), QString("Radio"));
        QCOMPARE(second.backStackStateId(), QString("Radio"));
    }

    QCOMPARE(HmiViewState::stateForTarget("Radio"), &first);
}

void tst_HmiViewStateLifetime::aViewLayerThatIsGoneIsNotTold()
{
    ViewFlow flow;
    HmiViewState *radio = flow.view("Radio");
    radio->setReportsQmlViewStatus(true);
    flow.view("Home");
    QScopedPointer<RecordingViewStateTarget> layer(new RecordingViewStateTarget(flow.journal));
    flow.start(radio);

    layer.reset();
    radio->setActivationData("data");
    radio->setReportsQmlViewStatus(false);
    flow.request("Home");

    QCOMPARE(ViewFlow::activeView(), QString("Home"));
    QCOMPARE(flow.take(), QStringList());
}

QTEST_GUILESS_MAIN(tst_HmiViewStateLifetime)
#include "tst_hmiviewstatelifetime.moc"
