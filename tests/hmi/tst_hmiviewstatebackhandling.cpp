#include "driving.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmibacktransition.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>

#include <QSignalSpy>
#include <QtTest>

using namespace HmiStateMachine;

class tst_HmiViewStateBackHandling : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void handlingBackEventsMakesATransition();
    void switchingBackHandlingOffRemovesTheTransition();
    void aBackPressThatWaitsMeanwhileIsNotHandledAnyMore();
    void aDirectBackTransitionLeadsToItsTarget();
    void aDirectBackTransitionTakesThePlaceOfBackHandling();
    void backHandlingTakesThePlaceOfADirectBackTransition();
    void aDirectBackTransitionTakesThePlaceOfAnother();
    void noDirectTargetRemovesAllBackHandling_data();
    void noDirectTargetRemovesAllBackHandling();
    void switchingBackHandlingOffKeepsADirectBackTransition();
    void aDestroyedDirectTargetIsNoTarget();
    void backHandlingMayChangeWhileTheViewIsLeft();
    void theBackStackIsClearedOnlyWithADirectBackTransition();
    void anEmptyNameIsNotPushed();
    void thePushedNameIsPoppedLastInFirstOut();
    void poppingAnEmptyBackStackIsSignalledToo();
};

void tst_HmiViewStateBackHandling::handlingBackEventsMakesATransition()
{
    HmiViewState view("Radio");
    QSignalSpy changes(&view, &HmiViewState::handlesBackEventChanged);
    QVERIFY(changes.isValid());

    view.setHandlesBackEvent(true);
    view.setHandlesBackEvent(true);

    QVERIFY(view.handlesBackEvent());
    QCOMPARE(view.backTarget(), QString());
    QCOMPARE(view.findChildren<HmiBackTransition *>().size(), 1);
    QCOMPARE(QList<QVariantList>(changes), QList<QVariantList>({{true}}));
}

void tst_HmiViewStateBackHandling::switchingBackHandlingOffRemovesTheTransition()
{
    HmiViewState view("Radio");
    QSignalSpy changes(&view, &HmiViewState::handlesBackEventChanged);
    QVERIFY(changes.isValid());
    view.setHandlesBackEvent(false);
    QCOMPARE(changes.size(), 0);
    view.setHandlesBackEvent(true);
    const QPointer<HmiBackTransition> transition = view.findChild<HmiBackTransition *>();

    view.setHandlesBackEvent(false);
    view.setHandlesBackEvent(false);
    settle();

    QVERIFY(!view.handlesBackEvent());
    QCOMPARE(view.transitions().size(), 1);
    QVERIFY(!transition);
    QCOMPARE(QList<QVariantList>(changes), QList<QVariantList>({{true}, {false}}));
}

void tst_HmiViewStateBackHandling::aBackPressThatWaitsMeanwhileIsNotHandledAnyMore()
{
    constexpr auto stop = QEvent::Type(QEvent::User + 3);
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.backView("Radio");
    lead(stop, radio, nullptr);
    connect(radio->transitions().last(), &QAbstractTransition::triggered, radio,
            [radio] { radio->setHandlesBackEvent(false); });
    flow.start(home);
    flow.request("Radio");
    QCOMPARE(radio->backTarget(), QString("Home"));

    flow.machine.postEvent(new QEvent(stop));
    flow.back();

    QVERIFY(radio->isActive());
}

void tst_HmiViewStateBackHandling::aDirectBackTransitionLeadsToItsTarget()
{
    HmiViewState view("Radio");
    QState home;
    QSignalSpy changes(&view, &HmiViewState::directBackTransitionTargetChanged);
    QVERIFY(changes.isValid());

    view.createDirectBackTransition(&home);

    QCOMPARE(view.directBackTransitionTarget(), &home);
    QVERIFY(!view.handlesBackEvent());
    QCOMPARE(view.backTarget(), QString());
    QCOMPARE(changes.size(), 1);
    QCOMPARE(changes.first().first().value<QAbstractState *>(), &home);
}

void tst_HmiViewStateBackHandling::aDirectBackTransitionTakesThePlaceOfBackHandling()
{
    HmiViewState view("Radio");
    QState home;
    view.setHandlesBackEvent(true);
    const QPointer<HmiBackTransition> old = view.findChild<HmiBackTransition *>();
    QSignalSpy changes(&view, &HmiViewState::handlesBackEventChanged);
    QVERIFY(changes.isValid());

    view.createDirectBackTransition(&home);
    settle();

    QVERIFY(!view.handlesBackEvent());
    QVERIFY(!old);
    QCOMPARE(view.findChildren<HmiBackTransition *>().size(), 1);
    QCOMPARE(changes.size(), 0);
}

void tst_HmiViewStateBackHandling::backHandlingTakesThePlaceOfADirectBackTransition()
{
    HmiViewState view("Radio");
    QState home;
    view.createDirectBackTransition(&home);
    const QPointer<HmiBackTransition> old = view.findChild<HmiBackTransition *>();
    QSignalSpy handling(&view, &HmiViewState::handlesBackEventChanged);
    QSignalSpy direct(&view, &HmiViewState::directBackTransitionTargetChanged);
    QVERIFY(handling.isValid());
    QVERIFY(direct.isValid());

    view.setHandlesBackEvent(true);
    settle();

    QVERIFY(view.handlesBackEvent());
    QVERIFY(!view.directBackTransitionTarget());
    QVERIFY(!old);
    QCOMPARE(handling.size(), 1);
    QCOMPARE(direct.size(), 0);
}

void tst_HmiViewStateBackHandling::aDirectBackTransitionTakesThePlaceOfAnother()
{
    HmiViewState view("Radio");
    QState home;
    QState map;
    view.createDirectBackTransition(&home);
    const QPointer<HmiBackTransition> old = view.findChild<HmiBackTransition *>();
    QSignalSpy changes(&view, &HmiViewState::directBackTransitionTargetChanged);
    QVERIFY(changes.isValid());

    view.createDirectBackTransition(&map);
    view.createDirectBackTransition(&map);
    settle();

    QCOMPARE(view.directBackTransitionTarget(), &map);
    QVERIFY(!old);
    QCOMPARE(view.findChildren<HmiBackTransition *>().size(), 1);
    QCOMPARE(changes.size(), 2);
}

void tst_HmiViewStateBackHandling::noDirectTargetRemovesAllBackHandling_data()
{
    QTest::addColumn<bool>("handlesBack");
    QTest::addColumn<bool>("hasDirect");

    QTest::newRow("back handling") << true << false;
    QTest::newRow("a direct back transition") << false << true;
    QTest::newRow("neither") << false << false;
}

void tst_HmiViewStateBackHandling::noDirectTargetRemovesAllBackHandling()
{
    QFETCH(bool, handlesBack);
    QFETCH(bool, hasDirect);
    HmiViewState view("Radio");
    QState home;
    view.setHandlesBackEvent(handlesBack);
    if (hasDirect) {
        view.createDirectBackTransition(&home);
    }
    QSignalSpy handling(&view, &HmiViewState::handlesBackEventChanged);
    QSignalSpy direct(&view, &HmiViewState::directBackTransitionTargetChanged);
    QVERIFY(handling.isValid());
    QVERIFY(direct.isValid());

    view.createDirectBackTransition(nullptr);
    settle();

    QVERIFY(!view.handlesBackEvent());
    QVERIFY(!view.directBackTransitionTarget());
    QCOMPARE(view.findChildren<HmiBackTransition *>().size(), 0);
    QCOMPARE(handling.size(), 0);
    QCOMPARE(direct.size(), 1);
    QVERIFY(!direct.first().first().value<QAbstractState *>());
}

void tst_HmiViewStateBackHandling::switchingBackHandlingOffKeepsADirectBackTransition()
{
    HmiViewState view("Radio");
    QState home;
    view.createDirectBackTransition(&home);

    view.setHandlesBackEvent(false);

    QCOMPARE(view.directBackTransitionTarget(), &home);
}

void tst_HmiViewStateBackHandling::aDestroyedDirectTargetIsNoTarget()
{
    ViewFlow flow;
    auto *home = new QState(&flow.machine);
    HmiViewState *radio = flow.view("Radio");
    radio->createDirectBackTransition(home);
    flow.start(radio);

    delete home;
    flow.back();

    QVERIFY(!radio->directBackTransitionTarget());
    QVERIFY(radio->isActive());
}

void tst_HmiViewStateBackHandling::backHandlingMayChangeWhileTheViewIsLeft()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.view("Radio");
    radio->createDirectBackTransition(home);
    connect(radio, &QState::exited, radio, [radio] { radio->createDirectBackTransition(nullptr); });
    flow.start(radio);

    flow.back();

    QVERIFY(home->isActive());
    QCOMPARE(radio->findChildren<HmiBackTransition *>().size(), 0);
}

void tst_HmiViewStateBackHandling::theBackStackIsClearedOnlyWithADirectBackTransition()
{
    HmiViewState view("Radio");
    QState home;

    view.pushBackStack("Kept");
    view.setHandlesBackEvent(true);
    view.setHandlesBackEvent(false);
    view.setHandlesBackEvent(true);
    view.createDirectBackTransition(nullptr);
    view.createDirectBackTransition(&home);
    QCOMPARE(view.popBackStack(), QString("Kept"));

    view.pushBackStack("Cleared");
    view.setHandlesBackEvent(true);
    QCOMPARE(view.popBackStack(), QString());

    view.createDirectBackTransition(&home);
    view.pushBackStack("Cleared");
    view.createDirectBackTransition(&home);
    QCOMPARE(view.popBackStack(), QString());

    view.pushBackStack("Cleared");
    view.createDirectBackTransition(nullptr);
    QCOMPARE(view.popBackStack(), QString());
}

void tst_HmiViewStateBackHandling::anEmptyNameIsNotPushed()
{
    HmiViewState view("Radio");
    QSignalSpy pushes(&view, &HmiViewState::backStackPush);
    QVERIFY(pushes.isValid());

    view.pushBackStack("Home");
    view.pushBackStack(QString());

    QCOMPARE(QList<QVariantList>(pushes), QList<QVariantList>({{QString("Home")}}));
    QCOMPARE(view.popBackStack(), QString("Home"));
}

void tst_HmiViewStateBackHandling::thePushedNameIsPoppedLastInFirstOut()
{
    HmiViewState view("Radio");
    for (int i = 0; i < 1000; ++i) {
        view.pushBackStack("Home");
    }
    view.pushBackStack("Map");
    view.pushBackStack("Map");

    QCOMPARE(view.popBackStack(), QString("Map"));
    QCOMPARE(view.popBackStack(), QString("Map"));
    for (int i = 0; i < 1000; ++i) {
        QCOMPARE(view.popBackStack(), QString("Home"));
    }
    QCOMPARE(view.popBackStack(), QString());
}

void tst_HmiViewStateBackHandling::poppingAnEmptyBackStackIsSignalledToo()
{
    HmiViewState view("Radio");
    QSignalSpy pops(&view, &HmiViewState::backStackPop);
    QVERIFY(pops.isValid());

    QCOMPARE(view.popBackStack(), QString());
    view.pushBackStack("Home");
    QCOMPARE(view.popBackStack(), QString("Home"));

    QCOMPARE(pops.size(), 2);
}

QTEST_GUILESS_MAIN(tst_HmiViewStateBackHandling)
#include "tst_hmiviewstatebackhandling.moc"
