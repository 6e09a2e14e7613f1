#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"
#include "probestate.h"
#include "twostates.h"

#include <HmiStateMachine/hmi/hmifallbacktransition.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmifallbackevent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/hmiviewevent.h>

#include <QSignalSpy>
#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

void post(QStateMachine &machine, QEvent *event)
{
    machine.postEvent(event);
    settle();
}

} // namespace

class tst_HmiFallbackTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itAddsNothingToTheMetaObject();
    void itsSourceIsItsParent();
    void itsTargetIsSetByName();
    void aFallbackEventLeadsToTheTarget();
    void anEventMayNameTheTarget();
    void theTargetOfAnEventStays();
    void otherEventsAreLeftAlone_data();
    void otherEventsAreLeftAlone();
    void anUnknownTargetConsumesTheEvent();
    void withoutATargetTheEventIsConsumed();
    void anInnerTransitionTakesTheEventFirst();
    void itIsListedFromItsTestToTheExitOfItsSource();
    void withoutATargetItIsNotListed();
    void aDestroyedTargetIsNone();
    void aTransitionWithoutASourceIsHarmless();
};

void tst_HmiFallbackTransition::itAddsNothingToTheMetaObject()
{
    QCOMPARE(metaDescription(HmiFallbackTransition::staticMetaObject), QStringList());
    QCOMPARE(HmiFallbackTransition::staticMetaObject.superClass(),
             &QAbstractTransition::staticMetaObject);
}

void tst_HmiFallbackTransition::itsSourceIsItsParent()
{
    NamedState source("Source");

    auto *transition = new HmiFallbackTransition(&source);

    QCOMPARE(transition->parent(), &source);
    QCOMPARE(transition->getSourceState(), &source);
    QVERIFY(!transition->getTarget());
}

void tst_HmiFallbackTransition::itsTargetIsSetByName()
{
    NamedState target("Target");
    HmiFallbackTransition transition;

    transition.setNamedTargetState("Target");
    QCOMPARE(transition.getTarget(), &target);
    QCOMPARE(transition.targetName(), QString("Target"));
    transition.setNamedTargetState("Unknown");
    QVERIFY(!transition.getTarget());
    transition.changeTarget(&target);

    QCOMPARE(transition.targetState(), &target);
}

void tst_HmiFallbackTransition::aFallbackEventLeadsToTheTarget()
{
    TwoStates states;
    auto *transition = new HmiFallbackTransition(states.source);
    transition->setNamedTargetState("target");
    states.start();

    post(states.machine, new HmiFallbackEvent(QString()));

    QVERIFY(states.target->isActive());
    QVERIFY(!states.source->isActive());
}

void tst_HmiFallbackTransition::anEventMayNameTheTarget()
{
    TwoStates states;
    auto *other = new NamedState("other", &states.machine);
    auto *transition = new HmiFallbackTransition(states.source);
    transition->setNamedTargetState("target");
    states.start();

    post(states.machine, new HmiFallbackEvent("other"));

    QVERIFY(other->isActive());
    QVERIFY(!states.target->isActive());
}

void tst_HmiFallbackTransition::theTargetOfAnEventStays()
{
    TwoStates states;
    auto *other = new NamedState("other", &states.machine);
    auto *transition = new HmiFallbackTransition(states.source);
    transition->setNamedTargetState("target");
    (new HmiTransition("return", other))->setTargetState(states.source);
    states.start();
    post(states.machine, new HmiFallbackEvent("other"));
    post(states.machine, new HmiEvent("return", QVariant()));
    QVERIFY(states.source->isActive());

    post(states.machine, new HmiFallbackEvent(QString()));

    QCOMPARE(transition->targetName(), QString("other"));
    QVERIFY(other->isActive());
}

void tst_HmiFallbackTransition::otherEventsAreLeftAlone_data()
{
    QTest::addColumn<int>("kind");

    QTest::newRow("view request") << 1261;
    QTest::newRow("back press") << 1263;
    QTest::newRow("named event") << 1260;
    QTest::newRow("next free type") << 1265;
}

void tst_HmiFallbackTransition::otherEventsAreLeftAlone()
{
    QFETCH(int, kind);
    TwoStates states;
    auto *transition = new HmiFallbackTransition(states.source);
    transition->setNamedTargetState("target");
    QSignalSpy triggered(transition, &QAbstractTransition::triggered);
    QVERIFY(triggered.isValid());
    states.start();

    if (kind == 1261) {
        post(states.machine, new HmiViewEvent("target", QVariant()));
    } else if (kind == 1263) {
        post(states.machine, new HmiBackEvent(1, "target"));
    } else if (kind == 1260) {
        post(states.machine, new HmiEvent("target", QVariant()));
    } else {
        post(states.machine, new QEvent(QEvent::Type(kind)));
    }

    QVERIFY(states.source->isActive());
    QCOMPARE(triggered.size(), 0);
}

void tst_HmiFallbackTransition::anUnknownTargetConsumesTheEvent()
{
    QStateMachine machine;
    auto *outer = new NamedState("Outer", &machine);
    auto *inner = new NamedState("Inner", outer);
    outer->QState::setInitialState(inner);
    auto *goal = new NamedState("Goal", &machine);
    (new HmiFallbackTransition(outer))->setTargetState(goal);
    auto *transition = new HmiFallbackTransition(inner);
    transition->setTargetState(goal);
    QSignalSpy triggered(transition, &QAbstractTransition::triggered);
    QVERIFY(triggered.isValid());
    startIn(machine, outer);

    post(machine, new HmiFallbackEvent("Unknown"));

    QVERIFY(inner->isActive());
    QCOMPARE(triggered.size(), 1);
    QCOMPARE(transition->targetName(), QString());
}

void tst_HmiFallbackTransition::withoutATargetTheEventIsConsumed()
{
    QStateMachine machine;
    auto *outer = new NamedState("Outer", &machine);
    auto *inner = new NamedState("Inner", outer);
    outer->QState::setInitialState(inner);
    auto *goal = new NamedState("Goal", &machine);
    (new HmiFallbackTransition(outer))->setTargetState(goal);
    new HmiFallbackTransition(inner);
    startIn(machine, outer);

    post(machine, new HmiFallbackEvent(QString()));

    QVERIFY(inner->isActive());
}

void tst_HmiFallbackTransition::anInnerTransitionTakesTheEventFirst()
{
    QStateMachine machine;
    auto *outer = new NamedState("Outer", &machine);
    auto *inner = new NamedState("Inner", outer);
    auto *next = new NamedState("Next", outer);
    outer->QState::setInitialState(inner);
    auto *goal = new NamedState("Goal", &machine);
    (new HmiFallbackTransition(outer))->setTargetState(goal);
    (new HmiFallbackTransition(inner))->setTargetState(next);
    startIn(machine, outer);

    post(machine, new HmiFallbackEvent(QString()));
    QVERIFY(next->isActive());
    post(machine, new HmiFallbackEvent(QString()));

    QVERIFY(goal->isActive());
}

void tst_HmiFallbackTransition::itIsListedFromItsTestToTheExitOfItsSource()
{
    Journal journal;
    QStateMachine machine;
    auto *source = new ProbeState(journal, "Source", &machine);
    auto *target = new ProbeState(journal, "Target", &machine);
    (new HmiFallbackTransition(source))->setTargetState(target);
    startIn(machine, source);
    journal.clear();

    post(machine, new HmiFallbackEvent(QString()));

    QCOMPARE(journal.lines(), QStringList({"Source exit, firing 1", "Target entry, firing 0"}));
}

// It is listed for the target it has before the event names another one.
void tst_HmiFallbackTransition::withoutATargetItIsNotListed()
{
    Journal journal;
    QStateMachine machine;
    auto *source = new ProbeState(journal, "Source", &machine);
    new ProbeState(journal, "Target", &machine);
    new HmiFallbackTransition(source);
    startIn(machine, source);
    journal.clear();

    post(machine, new HmiFallbackEvent("Target"));

    QCOMPARE(journal.lines(), QStringList({"Source exit, firing 0", "Target entry, firing 0"}));
}

void tst_HmiFallbackTransition::aDestroyedTargetIsNone()
{
    TwoStates states;
    auto *transition = new HmiFallbackTransition(states.source);
    auto *gone = new NamedState("gone", &states.machine);
    transition->setTargetState(gone);
    delete gone;
    states.start();

    post(states.machine, new HmiFallbackEvent(QString()));

    QVERIFY(states.source->isActive());
    QVERIFY(!transition->getTarget());
}

void tst_HmiFallbackTransition::aTransitionWithoutASourceIsHarmless()
{
    const HmiFallbackTransition transition;

    QVERIFY(!transition.getSourceState());
    QVERIFY(!transition.getTarget());
    QCOMPARE(transition.targetName(), QString());
}

QTEST_GUILESS_MAIN(tst_HmiFallbackTransition)
#include "tst_hmifallbacktransition.moc"
