#include "driving.h"
#include "librarytest.h"
#include "makeevent.h"
#include "metadescription.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/hmi/hmiviewtransition.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmifallbackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>

#include <QSignalSpy>
#include <QtTest>

using namespace HmiStateMachine;

class tst_HmiViewTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itAddsNothingToTheMetaObject();
    void itIsMadeWithASourceOrWithout();
    void itsTargetIsThatOfTheTransition();
    void itIsNoPartOfSiblingGroups();
    void aRequestLeadsToTheStateOfThatName();
    void aRequestLeadsToAnyKindOfNamedState();
    void aRequestLeadsToTheViewStateThatShowsTheView();
    void aNameComesBeforeATargetView_data();
    void aNameComesBeforeATargetView();
    void otherEventsDoNotTriggerIt_data();
    void otherEventsDoNotTriggerIt();
    void aRequestForNothingIsConsumed_data();
    void aRequestForNothingIsConsumed();
    void theTargetIsLookedUpWithEveryRequest();
    void aBlockedTransitionTakesNoRequest();
    void aBlockedTransitionLeavesTheRequestToItsAncestors();
    void aRequestForTheSourceEmitsAlreadyActive_data();
    void aRequestForTheSourceEmitsAlreadyActive();
    void aRequestForTheSourceIsLeftToOthers();
    void aSourceThatIsNoViewIsNotTold();
    void aBlockedViewDoesNotSayThatItIsActive();
    void itIsListedUntilItHasFired();
    void aRequestForNothingIsNotListed();
};

void tst_HmiViewTransition::itAddsNothingToTheMetaObject()
{
    QCOMPARE(metaDescription(HmiViewTransition::staticMetaObject), QStringList());
}

void tst_HmiViewTransition::itIsMadeWithASourceOrWithout()
{
    NamedState radio("Radio");
    auto *transition = new HmiViewTransition(&radio);
    const HmiViewTransition alone;

    QCOMPARE(transition->sourceState(), &radio);
    QCOMPARE(transition->getSourceState(), &radio);
    QVERIFY(!transition->blocked());
    QVERIFY(!transition->getTarget());
    QVERIFY(!alone.getSourceState());
    QVERIFY(!alone.blocked());
}

void tst_HmiViewTransition::itsTargetIsThatOfTheTransition()
{
    NamedState radio("Radio");
    NamedState home("Home");
    HmiViewTransition transition(&radio);

    transition.changeTarget(&home);
    QCOMPARE(transition.targetState(), &home);
    QCOMPARE(transition.getTarget(), &home);
    QCOMPARE(transition.targetName(), QString("Home"));

    transition.changeTarget(nullptr);
    QVERIFY(!transition.targetState());
}

void tst_HmiViewTransition::itIsNoPartOfSiblingGroups()
{
    NamedState home("Home");
    HmiViewTransition transition;
    HmiViewEvent event("Home", QVariant());

    QVERIFY(!transition.internalEventTest(&event));
    QVERIFY(!transition.getTarget());
}

void tst_HmiViewTransition::aRequestLeadsToTheStateOfThatName()
{
    ViewFlow flow;
    flow.view("Radio");
    flow.start(flow.view("Home"));

    flow.request("Radio");

    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView Radio"}));
}

void tst_HmiViewTransition::aRequestLeadsToAnyKindOfNamedState()
{
    ViewFlow flow;
    auto *module = new NamedState("Media", &flow.machine);
    module->setInitialState(flow.view("MediaMain", module));
    flow.start(flow.view("Home"));

    flow.request("Media");

    QVERIFY(module->isActive());
    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView MediaMain"}));
}

void tst_HmiViewTransition::aRequestLeadsToTheViewStateThatShowsTheView()
{
    ViewFlow flow;
    flow.viewOf("RadioScreen", "Radio");
    flow.start(flow.view("Home"));

    flow.request("RadioScreen");

    QCOMPARE(ViewFlow::activeView(), QString("Radio"));
    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView RadioScreen"}));
}

void tst_HmiViewTransition::aNameComesBeforeATargetView_data()
{
    QTest::addColumn<bool>("isView");

    QTest::newRow("of a view state") << true;
    QTest::newRow("of another state") << false;
}

void tst_HmiViewTransition::aNameComesBeforeATargetView()
{
    QFETCH(bool, isView);
    ViewFlow flow;
    flow.viewOf("Radio", "Tuner");
    NamedState *named =
        isView ? flow.viewOf("Player", "Radio") : new NamedState("Radio", &flow.machine);
    flow.start(flow.view("Home"));

    flow.request("Radio");

    QVERIFY(named->isActive());
}

void tst_HmiViewTransition::otherEventsDoNotTriggerIt_data()
{
    QTest::addColumn<MakeEvent>("make");

    const auto row = [](const char *tag, MakeEvent make) { QTest::newRow(tag) << make; };
    row("a named event", []() -> QEvent * { return new HmiEvent("Radio", QVariant()); });
    row("a back press", []() -> QEvent * { return new HmiBackEvent(1, "Radio"); });
    row("a popup", []() -> QEvent * { return new PopupEvent("Radio", QVariant()); });
    row("a fallback", []() -> QEvent * { return new HmiFallbackEvent("Radio"); });
    row("the application's", []() -> QEvent * { return new QEvent(QEvent::User); });
}

void tst_HmiViewTransition::otherEventsDoNotTriggerIt()
{
    QFETCH(MakeEvent, make);
    ViewFlow flow;
    flow.view("Radio");
    flow.start(flow.view("Home"));

    flow.post(make());

    QCOMPARE(flow.take(), QStringList());
}

void tst_HmiViewTransition::aRequestForNothingIsConsumed_data()
{
    QTest::addColumn<QString>("viewId");

    QTest::newRow("an unknown view") << "Nowhere";
    QTest::newRow("no view") << QString();
}

void tst_HmiViewTransition::aRequestForNothingIsConsumed()
{
    QFETCH(QString, viewId);
    ViewFlow flow;
    HmiViewState::createDummyViewState("Dummy", &flow.machine, 0, false);
    auto *module = new NamedState("Module", &flow.machine);
    HmiViewState *home = flow.view("Home", module);
    lead(HmiViewEvent::eventType(), module, flow.view("Radio"));
    QSignalSpy alreadyActive(home, &HmiViewState::alreadyActive);
    QVERIFY(alreadyActive.isValid());
    flow.start(home);

    flow.request(viewId);

    QVERIFY(home->isActive());
    QCOMPARE(flow.take(), QStringList());
    QCOMPARE(alreadyActive.size(), 0);
}

void tst_HmiViewTransition::theTargetIsLookedUpWithEveryRequest()
{
    ViewFlow flow;
    HmiViewState *radio = flow.view("Radio");
    HmiViewState *map = flow.view("Map");
    flow.start(flow.view("Home"));
    flow.request("Radio");
    flow.request("Home");
    flow.take();

    radio->setName("Tuner");
    map->setName("Radio");
    flow.request("Radio");

    QCOMPARE(ViewFlow::activeView(), QString("Radio"));
    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView Map"}));
}

void tst_HmiViewTransition::aBlockedTransitionTakesNoRequest()
{
    ViewFlow flow;
    flow.view("Radio");
    HmiViewState *home = flow.view("Home");
    home->setIndirectViewTransitionsBlocked(true);
    flow.start(home);

    flow.request("Radio");
    flow.request("Nowhere");
    QCOMPARE(flow.take(), QStringList());

    home->setIndirectViewTransitionsBlocked(false);
    flow.request("Radio");
    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView Radio"}));
}

void tst_HmiViewTransition::aBlockedTransitionLeavesTheRequestToItsAncestors()
{
    ViewFlow flow;
    HmiViewState *radio = flow.view("Radio");
    auto *module = new NamedState("Module", &flow.machine);
    HmiViewState *home = flow.view("Home", module);
    home->setIndirectViewTransitionsBlocked(true);
    lead(HmiViewEvent::eventType(), module, radio);
    flow.start(home);

    flow.request("Nowhere");

    QVERIFY(radio->isActive());
}

void tst_HmiViewTransition::aRequestForTheSourceEmitsAlreadyActive_data()
{
    QTest::addColumn<QString>("viewId");

    QTest::newRow("by its name") << "Radio";
    QTest::newRow("by its target view") << "RadioScreen";
}

void tst_HmiViewTransition::aRequestForTheSourceEmitsAlreadyActive()
{
    QFETCH(QString, viewId);
    ViewFlow flow;
    HmiViewState *radio = flow.viewOf("RadioScreen", "Radio");
    QSignalSpy alreadyActive(radio, &HmiViewState::alreadyActive);
    QVERIFY(alreadyActive.isValid());
    flow.start(radio);

    flow.request(viewId);

    QCOMPARE(alreadyActive.size(), 1);
    QVERIFY(radio->isActive());
    QCOMPARE(flow.take(), QStringList());
}

void tst_HmiViewTransition::aRequestForTheSourceIsLeftToOthers()
{
    ViewFlow flow;
    auto *module = new NamedState("Module", &flow.machine);
    HmiViewState *home = flow.view("Home", module);
    HmiViewState *radio = flow.view("Radio");
    lead(HmiViewEvent::eventType(), module, radio);
    flow.start(home);

    flow.request("Home");

    QVERIFY(radio->isActive());
}

void tst_HmiViewTransition::aSourceThatIsNoViewIsNotTold()
{
    ViewFlow flow;
    auto *module = new NamedState("Module", &flow.machine);
    auto *screen = new NamedState("Screen", module);
    auto *transition = new HmiViewTransition(screen);
    QSignalSpy triggered(transition, &QAbstractTransition::triggered);
    QVERIFY(triggered.isValid());
    HmiViewState *radio = flow.view("Radio");
    lead(HmiViewEvent::eventType(), module, radio);
    flow.start(screen);

    flow.request("Screen");

    QCOMPARE(triggered.size(), 0);
    QVERIFY(radio->isActive());
}

void tst_HmiViewTransition::aBlockedViewDoesNotSayThatItIsActive()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    home->setIndirectViewTransitionsBlocked(true);
    QSignalSpy alreadyActive(home, &HmiViewState::alreadyActive);
    QVERIFY(alreadyActive.isValid());
    flow.start(home);

    flow.request("Home");

    QCOMPARE(alreadyActive.size(), 0);
}

void tst_HmiViewTransition::itIsListedUntilItHasFired()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.view("Radio");
    QStringList atExit;
    int atEntry = -1;
    connect(home, &QState::exited, this, [&] {
        const auto listed = NamedTargetTransitionBase::triggeringTransition();
        for (const NamedTargetTransitionBase *transition : listed) {
            atExit.append(transition->targetName());
        }
    });
    connect(radio, &QState::entered, this,
            [&] { atEntry = NamedTargetTransitionBase::triggeringTransition().size(); });
    flow.start(home);

    flow.request("Radio");

    QCOMPARE(atExit, QStringList("Radio"));
    QCOMPARE(atEntry, 0);
}

void tst_HmiViewTransition::aRequestForNothingIsNotListed()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    auto *transition = home->findChild<HmiViewTransition *>();
    QVERIFY(transition);
    int listed = -1;
    connect(transition, &QAbstractTransition::triggered, this,
            [&] { listed = NamedTargetTransitionBase::triggeringTransition().size(); });
    flow.start(home);

    flow.request("Nowhere");

    QCOMPARE(listed, 0);
}

QTEST_GUILESS_MAIN(tst_HmiViewTransition)
#include "tst_hmiviewtransition.moc"
