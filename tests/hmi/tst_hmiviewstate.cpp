#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/hmi/hmiviewtransition.h>

#include <QSignalSpy>
#include <QtTest>

using namespace HmiStateMachine;

class tst_HmiViewState : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void aNewViewHasTheDefaults();
    void theTargetViewMayDifferFromTheName();
    void aViewTakesRequestsFromTheStart();
    void blockingIsThatOfTheViewTransition();
    void theActiveViewIsTheOneEnteredLast();
    void anEarlierViewThatIsLeftLeavesTheRecordAlone();
    void aViewIsNotKnownBeforeItIsLeft();
    void theLastKnownViewMayBeSet();
    void leavingAViewIsRemembered_data();
    void leavingAViewIsRemembered();
    void aViewIsFoundForATarget();
    void oneOfTheViewsThatShowATargetIsFound();
};

void tst_HmiViewState::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(HmiViewState::staticMetaObject),
             QStringList(
                 {"signal backStackPop()", "signal backStackPush(Identifier id)",
                  "signal handlesBackEventChanged(bool handlesBackEvent)",
                  "signal directBackTransitionTargetChanged(QAbstractState* backTarget)",
                  "signal viewActivated()", "signal viewDeactivated()",
                  "signal viewAnimationStarted(int type)",
                  "signal activationDataChanged(QVariant data)", "signal dummyViewStateTimeout()",
                  "signal alreadyActive()", "slot setActivationData(QVariant data)",
                  "private slot onViewStateTargetViewChange(HmiStateMachine::Identifier oldViewId, "
                  "HmiStateMachine::Identifier newViewId)",
                  "private slot onViewAnimationStarted(HmiStateMachine::Identifier viewId, "
                  "int type)",
                  "private slot backToLastKnownView()",
                  "property QVariant activationData read write activationDataChanged(QVariant)"}));
}

void tst_HmiViewState::aNewViewHasTheDefaults()
{
    const HmiViewState view("Radio");

    QCOMPARE(view.name(), QString("Radio"));
    QCOMPARE(view.targetView(), QString("Radio"));
    QCOMPARE(view.backStackStateId(), QString("Radio"));
    QVERIFY(!view.handlesBackEvent());
    QCOMPARE(view.backTarget(), QString());
    QVERIFY(!view.directBackTransitionTarget());
    QVERIFY(view.hasBackStackPresence());
    QVERIFY(!view.reportsQmlViewStatus());
    QVERIFY(!view.indirectViewTransitionsBlocked());
    QVERIFY(!view.activationData().isValid());
    QCOMPARE(view.entryReason(), 0);
    QVERIFY(!view.isActive());
}

void tst_HmiViewState::theTargetViewMayDifferFromTheName()
{
    QState parent;
    const auto *view = new HmiViewState("RadioScreen", "Radio", &parent);

    QCOMPARE(view->name(), QString("Radio"));
    QCOMPARE(view->targetView(), QString("RadioScreen"));
    QCOMPARE(view->backStackStateId(), QString("Radio"));
    QCOMPARE(view->parentState(), &parent);
}

void tst_HmiViewState::aViewTakesRequestsFromTheStart()
{
    const HmiViewState view("Radio");

    const auto transitions = view.transitions();

    QCOMPARE(transitions.size(), 1);
    QVERIFY(qobject_cast<HmiViewTransition *>(transitions.first()));
}

void tst_HmiViewState::blockingIsThatOfTheViewTransition()
{
    HmiViewState view("Radio");
    auto *transition = view.findChild<HmiViewTransition *>();
    QVERIFY(transition);

    view.setIndirectViewTransitionsBlocked(true);
    QVERIFY(transition->blocked());
    transition->setBlocked(false);

    QVERIFY(!view.indirectViewTransitionsBlocked());
}

void tst_HmiViewState::theActiveViewIsTheOneEnteredLast()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.view("Radio");
    auto *other = new NamedState("Other", &flow.machine);
    HmiViewState *between = home;
    connect(home, &QState::exited, this, [&] { between = HmiViewState::activeViewState(); });
    QVERIFY(!HmiViewState::activeViewState());

    flow.start(home);
    QCOMPARE(HmiViewState::activeViewState(), home);

    flow.request("Radio");
    QVERIFY(!between);
    QCOMPARE(HmiViewState::activeViewState(), radio);

    flow.request("Other");
    QVERIFY(other->isActive());
    QVERIFY(!HmiViewState::activeViewState());
}

void tst_HmiViewState::anEarlierViewThatIsLeftLeavesTheRecordAlone()
{
    ViewFlow flow;
    auto *both = new QState(QState::ParallelStates, &flow.machine);
    auto *left = new NamedState("Left", both);
    HmiViewState *list = flow.view("List", left);
    auto *leftEnd = new QState(left);
    left->setInitialState(list);
    HmiViewState *player = flow.view("Player", both);
    lead(QEvent::User, list, leftEnd);
    flow.start(both);
    QCOMPARE(HmiViewState::activeViewState(), player);

    flow.post(new QEvent(QEvent::User));

    QVERIFY(!list->isActive());
    QCOMPARE(HmiViewState::activeViewState(), player);
}

void tst_HmiViewState::aViewIsNotKnownBeforeItIsLeft()
{
    ViewFlow flow;
    flow.view("Radio");
    flow.start(flow.view("Home"));
    QCOMPARE(HmiViewState::lastKnownViewState(), QString());

    flow.request("Radio");

    QCOMPARE(HmiViewState::lastKnownViewState(), QString("Home"));
}

void tst_HmiViewState::theLastKnownViewMayBeSet()
{
    HmiViewState::setLastKnownViewState("Map");
    ViewFlow flow;
    flow.view("Map");
    HmiViewState *radio = flow.backView("Radio");

    flow.start(radio);

    QCOMPARE(HmiViewState::lastKnownViewState(), QString("Map"));
    QCOMPARE(radio->backTarget(), QString("Map"));
}

void tst_HmiViewState::leavingAViewIsRemembered_data()
{
    QTest::addColumn<QString>("id");
    QTest::addColumn<bool>("hasPresence");
    QTest::addColumn<QString>("lastKnown");

    QTest::newRow("by its name") << "Home" << true << "Home";
    QTest::newRow("by its back-stack id") << "Module" << true << "Module";
    QTest::newRow("not without presence") << "Home" << false << "";
}

void tst_HmiViewState::leavingAViewIsRemembered()
{
    QFETCH(QString, id);
    QFETCH(bool, hasPresence);
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    home->setBackStackStateId(id, false);
    home->setHasBackStackPresence(hasPresence);
    flow.view("Radio");
    flow.start(home);

    flow.request("Radio");

    QCOMPARE(home->hasBackStackPresence(), hasPresence);
    QTEST(HmiViewState::lastKnownViewState(), "lastKnown");
}

void tst_HmiViewState::aViewIsFoundForATarget()
{
    HmiViewState radio("RadioScreen", "Radio");
    HmiViewState player("Radio", "Player");
    HmiViewState dummy("", "Dummy");
    NamedState module("Module");
    HmiViewState main("Module", "Main");

    QCOMPARE(HmiViewState::stateForTarget("Radio"), &radio);
    QCOMPARE(HmiViewState::stateForTarget("RadioScreen"), &radio);
    QCOMPARE(HmiViewState::stateForTarget("Dummy"), &dummy);
    QCOMPARE(HmiViewState::stateForTarget("Module"), &main);
    QVERIFY(!HmiViewState::stateForTarget("radio"));
    QVERIFY(!HmiViewState::stateForTarget("Nowhere"));
    QVERIFY(!HmiViewState::stateForTarget(QString()));
}

void tst_HmiViewState::oneOfTheViewsThatShowATargetIsFound()
{
    HmiViewState first("Map", "First");
    HmiViewState second("Map", "Second");
    NamedState *expected = NamedState::namedStates().first();

    QCOMPARE(HmiViewState::stateForTarget("Map"), expected);
}

QTEST_GUILESS_MAIN(tst_HmiViewState)
#include "tst_hmiviewstate.moc"
