#include "driving.h"
#include "librarytest.h"
#include "makeevent.h"
#include "metadescription.h"

#include <HmiStateMachine/hmi/hmibacktransition.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmifallbackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/popupevent.h>

#include <QSignalSpy>
#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** A view that is left, in a module, and where back presses lead. */
struct Screens
{
    void start()
    {
        module->setInitialState(radio);
        startIn(machine, module);
    }

    void press(int depth = 1)
    {
        machine.postEvent(new HmiBackEvent(static_cast<unsigned char>(depth), QString()));
        settle();
    }

    QStateMachine machine;
    NamedState *module = new NamedState("Module", &machine);
    NamedState *radio = new NamedState("Radio", module);
    NamedState *home = new NamedState("Home", &machine);
    NamedState *map = new NamedState("Map", &machine);
};

} // namespace

class tst_HmiBackTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itAddsNothingToTheMetaObject();
    void itIsMadeWithASourceOrWithout();
    void itsTargetIsThatOfTheTransition();
    void itIsNoPartOfSiblingGroups();
    void anyBackEventTriggersIt_data();
    void anyBackEventTriggersIt();
    void otherEventsDoNotTriggerIt_data();
    void otherEventsDoNotTriggerIt();
    void withoutATargetThePressIsConsumed();
    void aDestroyedTargetIsNoTarget();
    void theInnermostTransitionTakesThePress();
    void theTargetIsFoundWhenItIsSet();
    void itIsListedUntilItHasFired();
    void withoutATargetItIsNotListed();
    void destroyedWhileListedItLeavesTheList();
};

void tst_HmiBackTransition::itAddsNothingToTheMetaObject()
{
    QCOMPARE(metaDescription(HmiBackTransition::staticMetaObject), QStringList());
}

void tst_HmiBackTransition::itIsMadeWithASourceOrWithout()
{
    NamedState radio("Radio");
    auto *transition = new HmiBackTransition(&radio);
    const HmiBackTransition alone;

    QCOMPARE(transition->sourceState(), &radio);
    QCOMPARE(transition->getSourceState(), &radio);
    QVERIFY(!transition->getTarget());
    QVERIFY(!alone.getSourceState());
}

void tst_HmiBackTransition::itsTargetIsThatOfTheTransition()
{
    NamedState radio("Radio");
    NamedState home("Home");
    HmiBackTransition transition(&radio);

    transition.changeTarget(&home);
    QCOMPARE(transition.targetState(), &home);
    QCOMPARE(transition.getTarget(), &home);
    QCOMPARE(transition.targetName(), QString("Home"));

    transition.setNamedTargetState("Radio");
    QCOMPARE(transition.targetState(), &radio);

    transition.setNamedTargetState("Nowhere");
    QVERIFY(!transition.targetState());
    QCOMPARE(transition.targetName(), QString());
}

void tst_HmiBackTransition::itIsNoPartOfSiblingGroups()
{
    HmiBackTransition transition;
    HmiBackEvent event(1, QString());

    QVERIFY(!transition.internalEventTest(&event));
}

void tst_HmiBackTransition::anyBackEventTriggersIt_data()
{
    QTest::addColumn<int>("depth");

    QTest::newRow("0") << 0;
    QTest::newRow("1") << 1;
    QTest::newRow("2") << 2;
    QTest::newRow("255") << 255;
}

void tst_HmiBackTransition::anyBackEventTriggersIt()
{
    QFETCH(int, depth);
    Screens screens;
    auto *transition = new HmiBackTransition(screens.radio);
    transition->changeTarget(screens.home);
    screens.start();

    screens.press(depth);

    QVERIFY(screens.home->isActive());
    QVERIFY(!screens.module->isActive());
}

void tst_HmiBackTransition::otherEventsDoNotTriggerIt_data()
{
    QTest::addColumn<MakeEvent>("make");

    const auto row = [](const char *tag, MakeEvent make) { QTest::newRow(tag) << make; };
    row("a named event", []() -> QEvent * { return new HmiEvent("Home", QVariant()); });
    row("a view", []() -> QEvent * { return new HmiViewEvent("Home", QVariant()); });
    row("a popup", []() -> QEvent * { return new PopupEvent("Home", QVariant()); });
    row("a fallback", []() -> QEvent * { return new HmiFallbackEvent("Home"); });
    row("the application's", []() -> QEvent * { return new QEvent(QEvent::User); });
}

void tst_HmiBackTransition::otherEventsDoNotTriggerIt()
{
    QFETCH(MakeEvent, make);
    Screens screens;
    auto *transition = new HmiBackTransition(screens.radio);
    transition->changeTarget(screens.home);
    screens.start();

    screens.machine.postEvent(make());
    settle();

    QVERIFY(screens.radio->isActive());
}

void tst_HmiBackTransition::withoutATargetThePressIsConsumed()
{
    Screens screens;
    auto *transition = new HmiBackTransition(screens.radio);
    QSignalSpy triggered(transition, &QAbstractTransition::triggered);
    QVERIFY(triggered.isValid());
    auto *outer = new HmiBackTransition(screens.module);
    outer->changeTarget(screens.home);
    screens.start();

    screens.press();

    QVERIFY(screens.radio->isActive());
    QCOMPARE(triggered.size(), 1);
}

void tst_HmiBackTransition::aDestroyedTargetIsNoTarget()
{
    Screens screens;
    auto *transition = new HmiBackTransition(screens.radio);
    transition->changeTarget(screens.home);
    screens.start();

    delete screens.home;
    screens.press();

    QVERIFY(screens.radio->isActive());
    QVERIFY(!transition->getTarget());
    QCOMPARE(transition->targetName(), QString());
}

void tst_HmiBackTransition::theInnermostTransitionTakesThePress()
{
    Screens screens;
    auto *outer = new HmiBackTransition(screens.module);
    outer->changeTarget(screens.map);
    auto *inner = new HmiBackTransition(screens.radio);
    inner->changeTarget(screens.home);
    screens.start();

    screens.press();

    QVERIFY(screens.home->isActive());
}

void tst_HmiBackTransition::theTargetIsFoundWhenItIsSet()
{
    Screens screens;
    auto *transition = new HmiBackTransition(screens.radio);
    transition->setNamedTargetState("Home");
    screens.home->setName("Start");
    screens.map->setName("Home");
    screens.start();

    QCOMPARE(transition->targetName(), QString("Start"));
    screens.press();

    QVERIFY(screens.home->isActive());
}

void tst_HmiBackTransition::itIsListedUntilItHasFired()
{
    Screens screens;
    auto *transition = new HmiBackTransition(screens.radio);
    transition->changeTarget(screens.home);
    QList<NamedTargetTransitionBase *> atExit;
    QList<NamedTargetTransitionBase *> atEntry = {transition};
    connect(screens.radio, &QState::exited, this,
            [&] { atExit = NamedTargetTransitionBase::triggeringTransition(); });
    connect(screens.home, &QState::entered, this,
            [&] { atEntry = NamedTargetTransitionBase::triggeringTransition(); });
    screens.start();

    screens.press();

    QCOMPARE(atExit, QList<NamedTargetTransitionBase *>({transition}));
    QCOMPARE(atEntry, QList<NamedTargetTransitionBase *>());
}

void tst_HmiBackTransition::withoutATargetItIsNotListed()
{
    Screens screens;
    auto *transition = new HmiBackTransition(screens.radio);
    int listed = -1;
    connect(transition, &QAbstractTransition::triggered, this,
            [&] { listed = NamedTargetTransitionBase::triggeringTransition().size(); });
    screens.start();

    screens.press();

    QCOMPARE(listed, 0);
}

void tst_HmiBackTransition::destroyedWhileListedItLeavesTheList()
{
    NamedState home("Home");
    QScopedPointer<HmiBackTransition> transition(new HmiBackTransition);
    transition->changeTarget(&home);
    transition->aboutToBeTriggered();
    QCOMPARE(NamedTargetTransitionBase::triggeringTransition().size(), 1);

    transition.reset();

    QCOMPARE(NamedTargetTransitionBase::triggeringTransition().size(), 0);
}

QTEST_GUILESS_MAIN(tst_HmiBackTransition)
#include "tst_hmibacktransition.moc"
