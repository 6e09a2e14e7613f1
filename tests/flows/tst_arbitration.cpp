#include "driving.h"
#include "emitter.h"
#include "guards.h"
#include "journal.h"
#include "librarytest.h"
#include "twostates.h"

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/named/guardedsignaltransition.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/intsignaltransition.h>
#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>
#include <HmiStateMachine/named/simpleeventtransition.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/**
 * Two regions that run side by side and both want the driver's input: the screens ("Map", "Zoomed")
 * and the volume ("Quiet", "Loud").
 */
struct HeadUnit
{
    explicit HeadUnit(Journal &journal)
    {
        screens->QState::setInitialState(map);
        volume->QState::setInitialState(quiet);
        for (NamedState *state : {map, zoomed, quiet, loud}) {
            QObject::connect(state, &QState::entered,
                             [state, &journal] { journal.add("enter " + state->name()); });
        }
        (new HmiTransition("Zoom out", zoomed))->setNamedTargetState("Map");
        (new HmiTransition("Turn down", loud))->setNamedTargetState("Quiet");
    }

    void start(Journal &journal)
    {
        startIn(machine, root);
        journal.clear();
    }

    void post(const QString &name)
    {
        machine.postEvent(new HmiEvent(name, QVariant()));
        settle();
    }

    StateMachine machine;
    NamedState *root = new NamedState("HeadUnit", QState::ParallelStates, &machine);
    NamedState *screens = new NamedState("Screens", root);
    NamedState *map = new NamedState("Map", screens);
    NamedState *zoomed = new NamedState("Zoomed", screens);
    NamedState *volume = new NamedState("Volume", root);
    NamedState *quiet = new NamedState("Quiet", volume);
    NamedState *loud = new NamedState("Loud", volume);
};

/** Lets the two transitions move their regions, the screen one with the higher priority. */
template <typename Transition> void rank(Transition *screen, Transition *volume)
{
    screen->setNamedTargetState("Zoomed");
    volume->setNamedTargetState("Loud");
    QVERIFY(volume->makeParallelExclusive(10));
    QVERIFY(screen->makeParallelExclusive(20));
}

// Transitions that refuse the plain signal of an emitter themselves.

NamedTargetTransitionBase *onAnotherSignal(Emitter &emitter, QState *source)
{
    return new HmiSignalTransition(&emitter, SIGNAL(other()), source);
}

NamedTargetTransitionBase *blocked(Emitter &emitter, QState *source)
{
    auto *transition = new HmiSignalTransition(&emitter, SIGNAL(plain()), source);
    transition->setBlocked(true);
    return transition;
}

NamedTargetTransitionBase *refusingSignals(Emitter &emitter, QState *source)
{
    return new GuardedSignalTransition(&emitter, SIGNAL(plain()), source);
}

NamedTargetTransitionBase *onANumber(Emitter &emitter, QState *source)
{
    return new IntSignalTransition(&emitter, SIGNAL(plain()), 1, source);
}

NamedTargetTransitionBase *onAKey(Emitter &emitter, QState *source)
{
    return new KeySignalTransition(&emitter, SIGNAL(plain()), 1, 0, source);
}

NamedTargetTransitionBase *refusing(Emitter &, QState *source)
{
    return new GuardedTransition(source);
}

NamedTargetTransitionBase *onAnEventType(Emitter &, QState *source)
{
    return new SimpleEventTransition(QEvent::User, source);
}

NamedTargetTransitionBase *onAnEvent(Emitter &, QState *source)
{
    return new HmiTransition("Asks no sibling", source);
}

} // namespace

using MakeRefusing = NamedTargetTransitionBase *(*)(Emitter &, QState *);
Q_DECLARE_METATYPE(MakeRefusing)

class tst_Arbitration : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void withoutPrioritiesBothRegionsReact();
    void anEventGoesToTheHigherRegionWhileItWantsIt();
    void aVetoPassesTheEventOn();
    void anEventGoesToWhomItsDataSuits();
    void aGuardedTransitionYieldsToItsSibling();
    void aViewEventGoesToOneRegion();
    void aSignalGoesToOneRegion();
    void aNumberGoesToWhomItSuits();
    void aKeyGoesToOneRegion();
    void aTransitionRemovedAtRunTimeSetsItsSiblingsFree();
    void whoRefusesItselfAsksNoSibling_data();
    void whoRefusesItselfAsksNoSibling();
    void whoAcceptsItselfAsksItsSiblingOnce();
};

void tst_Arbitration::withoutPrioritiesBothRegionsReact()
{
    Journal journal;
    HeadUnit unit(journal);
    (new HmiTransition("Turn both", unit.map))->setNamedTargetState("Zoomed");
    (new HmiTransition("Turn both", unit.quiet))->setNamedTargetState("Loud");
    unit.start(journal);

    unit.post("Turn both");

    QCOMPARE(journal.lines(), QStringList({"enter Zoomed", "enter Loud"}));
}

void tst_Arbitration::anEventGoesToTheHigherRegionWhileItWantsIt()
{
    Journal journal;
    HeadUnit unit(journal);
    rank(new HmiTransition("Turn", unit.map), new HmiTransition("Turn", unit.quiet));
    unit.start(journal);

    unit.post("Turn");
    unit.post("Turn");
    unit.post("Turn down");
    unit.post("Zoom out");
    unit.post("Turn");

    QCOMPARE(journal.lines(),
             QStringList({"enter Zoomed", // the screen takes the first turn
                          "enter Loud", // and, zoomed, leaves the second one to the volume
                          "enter Quiet", "enter Map", "enter Zoomed"}));
}

void tst_Arbitration::aVetoPassesTheEventOn()
{
    Journal journal;
    HeadUnit unit(journal);
    bool driving = true;
    auto *zoom = new HmiTransition("Turn or veto", unit.map);
    connect(zoom, &HmiTransition::transitionTest, zoom,
            [&driving, zoom] { zoom->setAllowTransition(!driving); });
    rank(zoom, new HmiTransition("Turn or veto", unit.quiet));
    unit.start(journal);

    unit.post("Turn or veto");
    unit.post("Turn down");
    driving = false;
    unit.post("Turn or veto");

    QCOMPARE(journal.lines(), QStringList({"enter Loud", "enter Quiet", "enter Zoomed"}));
}

void tst_Arbitration::anEventGoesToWhomItsDataSuits()
{
    Journal journal;
    HeadUnit unit(journal);
    auto *zoom = new HmiTransition("Turn by", unit.map);
    zoom->setEventDataFilter("screen");
    rank(zoom, new HmiTransition("Turn by", unit.quiet));
    unit.start(journal);

    unit.machine.postEvent(new HmiEvent("Turn by", "volume"));
    settle();
    unit.post("Turn down");
    unit.machine.postEvent(new HmiEvent("Turn by", "screen"));
    settle();

    QCOMPARE(journal.lines(), QStringList({"enter Loud", "enter Quiet", "enter Zoomed"}));
}

void tst_Arbitration::aGuardedTransitionYieldsToItsSibling()
{
    Journal journal;
    HeadUnit unit(journal);
    auto *zoom = new GuardedTransition(unit.map);
    auto *turnUp = new GuardedTransition(unit.quiet);
    for (GuardedTransition *transition : {zoom, turnUp}) {
        connect(transition, &GuardedTransition::transitionTest, transition,
                [transition](QEvent *event) {
                    transition->setAllowTransition(event->type() == QEvent::User);
                });
    }
    rank(zoom, turnUp);
    unit.start(journal);

    unit.machine.postEvent(new QEvent(QEvent::User));
    settle();

    QCOMPARE(journal.lines(), QStringList{"enter Zoomed"});
}

void tst_Arbitration::aViewEventGoesToOneRegion()
{
    Journal journal;
    HeadUnit unit(journal);
    const auto type = QEvent::Type(1261);
    rank(new SimpleEventTransition(type, unit.map), new SimpleEventTransition(type, unit.quiet));
    unit.start(journal);

    unit.machine.postEvent(new HmiViewEvent("Anywhere", QVariant()));
    settle();

    QCOMPARE(journal.lines(), QStringList{"enter Zoomed"});
}

void tst_Arbitration::aSignalGoesToOneRegion()
{
    Journal journal;
    Emitter knob;
    HeadUnit unit(journal);
    rank(unit.map->addTransition(&knob, SIGNAL(plain()), nullptr),
         unit.quiet->addTransition(&knob, SIGNAL(plain()), nullptr));
    unit.start(journal);

    knob.plain();
    knob.plain();

    QCOMPARE(journal.lines(), QStringList({"enter Zoomed", "enter Loud"}));
}

void tst_Arbitration::aNumberGoesToWhomItSuits()
{
    Journal journal;
    Emitter knob;
    HeadUnit unit(journal);
    const char *watched = SIGNAL(withInt(int));
    rank(new IntSignalTransition(&knob, watched, 5, IntSignalTransition::Less, unit.map),
         new IntSignalTransition(&knob, watched, 2, IntSignalTransition::LessOrEqual, unit.quiet));
    unit.start(journal);

    knob.withInt(1);
    knob.withInt(5);
    unit.post("Turn down");
    knob.withInt(6);

    QCOMPARE(journal.lines(), QStringList({"enter Loud", "enter Quiet", "enter Zoomed"}));
}

void tst_Arbitration::aKeyGoesToOneRegion()
{
    Journal journal;
    Emitter keys;
    HeadUnit unit(journal);
    const char *watched = SIGNAL(key(int, int));
    rank(new KeySignalTransition(&keys, watched, 7, 1, unit.map),
         new KeySignalTransition(&keys, watched, 7, 1, unit.quiet));
    unit.start(journal);

    keys.key(7, 0);
    keys.key(7, 1);

    QCOMPARE(journal.lines(), QStringList{"enter Zoomed"});
}

void tst_Arbitration::aTransitionRemovedAtRunTimeSetsItsSiblingsFree()
{
    Journal journal;
    HeadUnit unit(journal);
    auto *zoom = new HmiTransition("Turn until removed", unit.map);
    rank(zoom, new HmiTransition("Turn until removed", unit.quiet));
    unit.start(journal);

    delete zoom;
    unit.post("Turn until removed");

    QCOMPARE(journal.lines(), QStringList{"enter Loud"});
}

void tst_Arbitration::whoRefusesItselfAsksNoSibling_data()
{
    QTest::addColumn<MakeRefusing>("make");

    QTest::newRow("on another signal") << MakeRefusing(onAnotherSignal);
    QTest::newRow("blocked") << MakeRefusing(blocked);
    QTest::newRow("refusing by its guard") << MakeRefusing(refusingSignals);
    QTest::newRow("on a number") << MakeRefusing(onANumber);
    QTest::newRow("on a key") << MakeRefusing(onAKey);
    QTest::newRow("refusing all events") << MakeRefusing(refusing);
    QTest::newRow("on a type of events") << MakeRefusing(onAnEventType);
    QTest::newRow("on an event of a name") << MakeRefusing(onAnEvent);
}

void tst_Arbitration::whoRefusesItselfAsksNoSibling()
{
    QFETCH(MakeRefusing, make);
    Journal journal;
    Emitter emitter;
    ParallelSiblingTransitionGroup group;
    TwoRegions regions;
    NamedTargetTransitionBase *low = make(emitter, regions.left);
    GuardedSignalTransition high(&emitter, SIGNAL(plain()), regions.right);
    record(&high, "high", journal);
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(&high, 2));
    regions.start();

    Q_EMIT emitter.plain();

    // By the machine, for itself.
    QCOMPARE(journal.lines(), QStringList({"high asked", "high refused"}));
}

void tst_Arbitration::whoAcceptsItselfAsksItsSiblingOnce()
{
    Journal journal;
    Emitter emitter;
    TwoRegions regions;
    GuardedSignalTransition low(&emitter, SIGNAL(plain()), regions.left);
    GuardedSignalTransition high(&emitter, SIGNAL(plain()), regions.right);
    record(&low, "low", journal);
    record(&high, "high", journal);
    answer(&low, true);
    QVERIFY(low.makeParallelExclusive(1));
    QVERIFY(high.makeParallelExclusive(2));
    regions.start();

    Q_EMIT emitter.plain();

    QCOMPARE(journal.lines(),
             QStringList({"low asked", "high asked", "high refused", // by the lower one
                          "high asked", "high refused"})); // by the machine
}

QTEST_GUILESS_MAIN(tst_Arbitration)
#include "tst_arbitration.moc"
