#include "driving.h"
#include "emitter.h"
#include "librarytest.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmibacktransition.h>
#include <HmiStateMachine/hmi/hmidelayedsignaltransition.h>
#include <HmiStateMachine/hmi/hmifallbacktransition.h>
#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/hmi/hmiviewtransition.h>
#include <HmiStateMachine/named/guardedpropertychangetransition.h>
#include <HmiStateMachine/named/guardedpropertytransition.h>
#include <HmiStateMachine/named/guardedsignaltransition.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/intsignaltransition.h>
#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/named/simpleeventtransition.h>

#include <QStateMachine>
#include <QTimer>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** Makes a transition of one kind from @p source; @p emitter is the sender of the signal kinds. */
using Make = QAbstractTransition *(*)(Emitter *emitter, QState *source);

/** Has a transition happen, by a signal or by an event of @p machine. */
using Cause = void (*)(Emitter *emitter, QStateMachine *machine);

/** One transition class and one of its constructors. */
struct Kind
{
    const char *tag;
    Make make;
    Cause cause;
};

void postGo(Emitter *, QStateMachine *machine)
{
    machine->postEvent(new HmiEvent("go", QVariant()));
}

void emitPlain(Emitter *emitter, QStateMachine *)
{
    Q_EMIT emitter->plain();
}

void emitKey(Emitter *emitter, QStateMachine *)
{
    Q_EMIT emitter->key(5, 1);
}

void emitInt(Emitter *emitter, QStateMachine *)
{
    Q_EMIT emitter->withInt(3);
}

void changeValue(Emitter *emitter, QStateMachine *)
{
    emitter->setValue(1);
}

template <typename Transition> Transition *allowing(Transition *transition)
{
    transition->setAllowTransitionDefault(true);
    return transition;
}

/** Answers every event but the one without a type, which a guard is asked about on entry. */
class EventGuard : public GuardedTransition
{
public:
    explicit EventGuard(QState *source) : GuardedTransition(source)
    {
        connect(this, &GuardedTransition::transitionTest, this,
                [this](QEvent *event) { setAllowTransition(event->type() != QEvent::None); });
    }
};

/** A machine with a layered state of one screen beside a state outside. */
struct Layers
{
    QStateMachine machine;
    HmiLayeredState *const layers = new HmiLayeredState("Layers", &machine);
    HmiState *const screen = new HmiState("Screen", layers);
    HmiState *const outside = new HmiState("Outside", &machine);
    Emitter emitter;

    void start()
    {
        layers->setInitialHmiState(screen);
        startIn(machine, layers);
    }
};

const Kind movedKinds[] = {
    {"GuardedTransition",
     [](Emitter *, QState *source) -> QAbstractTransition * { return new EventGuard(source); },
     postGo},
    {"HmiTransition",
     [](Emitter *, QState *source) -> QAbstractTransition * {
         return new HmiTransition("go", source);
     },
     postGo},
    {"SimpleEventTransition, one type",
     [](Emitter *, QState *source) -> QAbstractTransition * {
         return new SimpleEventTransition(QEvent::Type(1260), source);
     },
     postGo},
    {"SimpleEventTransition, types",
     [](Emitter *, QState *source) -> QAbstractTransition * {
         const QList<QEvent::Type> types{QEvent::Type(1260), QEvent::Type(1262)};
         return new SimpleEventTransition(types, source);
     },
     postGo},
    {"HmiSignalTransition, set up later",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         auto *transition = new HmiSignalTransition(source);
         transition->setSenderObject(emitter);
         transition->setSignal(SIGNAL(plain()));
         return transition;
     },
     emitPlain},
    {"HmiSignalTransition",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         return new HmiSignalTransition(emitter, SIGNAL(plain()), source);
     },
     emitPlain},
    {"HmiDelayedSignalTransition",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         return new HmiDelayedSignalTransition(emitter, SIGNAL(plain()), 0, source);
     },
     emitPlain},
    {"IntSignalTransition",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         return new IntSignalTransition(emitter, SIGNAL(withInt(int)), 3, source);
     },
     emitInt},
    {"IntSignalTransition, operator",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         return new IntSignalTransition(emitter, SIGNAL(withInt(int)), 3,
                                        IntSignalTransition::LessOrEqual, source);
     },
     emitInt},
    {"GuardedSignalTransition, set up later",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         auto *transition = allowing(new GuardedSignalTransition(source));
         transition->setSenderObject(emitter);
         transition->setSignal(SIGNAL(plain()));
         return transition;
     },
     emitPlain},
    {"GuardedSignalTransition",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         return allowing(new GuardedSignalTransition(emitter, SIGNAL(plain()), source));
     },
     emitPlain},
    {"GuardedPropertyTransition, set up later",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         auto *transition = allowing(new GuardedPropertyTransition(source));
         transition->setSenderObject(emitter);
         transition->setSignal(SIGNAL(valueChanged()));
         return transition;
     },
     changeValue},
    {"GuardedPropertyTransition",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         return allowing(new GuardedPropertyTransition(emitter, "value", source));
     },
     changeValue},
    {"GuardedPropertyChangeTransition",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         return new GuardedPropertyChangeTransition(emitter, "value", {0}, 1, source);
     },
     changeValue},
    {"KeySignalTransition, one key",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         return new KeySignalTransition(emitter, SIGNAL(key(int, int)), 5, 1, source);
     },
     emitKey},
    {"KeySignalTransition, keys",
     [](Emitter *emitter, QState *source) -> QAbstractTransition * {
         return new KeySignalTransition(emitter, SIGNAL(key(int, int)), QList<int>{4, 5}, 1,
                                        source);
     },
     emitKey},
};

} // namespace

Q_DECLARE_METATYPE(Make)
Q_DECLARE_METATYPE(Cause)

/** Transitions of every class that are made with a layered state as their source. */
class tst_LayeredSources : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aTransitionMovesToTheExclusiveLayer_data();
    void aTransitionMovesToTheExclusiveLayer();
    void itFiresWhicheverScreenIsActive_data();
    void itFiresWhicheverScreenIsActive();
    void aTransitionOfAViewStays_data();
    void aTransitionOfAViewStays();
    void anExclusiveLayerOfANestedStateIsTheInnerOne();
    void aTransitionAddedLaterStays();
    void theSignalTransitionThatAStateMakesMoves();
    void aScreenTakesTheEventBeforeTheLayer();
    void theDelayFollowsTheEntriesOfTheExclusiveLayer();
    void addingADelayedTransitionMakesItFollowTheStateItself();
    void aSiblingGroupFollowsTheExclusiveLayer_data();
    void aSiblingGroupFollowsTheExclusiveLayer();
    void aBlockedKeyIsSwallowedWhileTheLayersAreActive();
    void aMissingPropertyIsWarnedOf_data();
    void aMissingPropertyIsWarnedOf();
    void aVoiceRequestOfAMovedTransitionReachesTheViewLayer();

private:
    static void addMovedKinds();
};

void tst_LayeredSources::addMovedKinds()
{
    QTest::addColumn<Make>("make");
    QTest::addColumn<Cause>("cause");
    for (const Kind &kind : movedKinds) {
        QTest::newRow(kind.tag) << kind.make << kind.cause;
    }
}

void tst_LayeredSources::aTransitionMovesToTheExclusiveLayer_data()
{
    addMovedKinds();
}

void tst_LayeredSources::aTransitionMovesToTheExclusiveLayer()
{
    QFETCH(Make, make);
    Emitter emitter;
    HmiLayeredState layers("Layers");
    HmiState *exclusive = layers.exclusiveState();

    QAbstractTransition *transition = make(&emitter, &layers);

    QCOMPARE(transition->parent(), exclusive);
    QCOMPARE(transition->sourceState(), exclusive);
    auto *named = dynamic_cast<NamedTargetTransitionBase *>(transition);
    QVERIFY(named);
    QCOMPARE(named->getSourceState(), exclusive);
    QCOMPARE(exclusive->transitions(), QList<QAbstractTransition *>{transition});
    QCOMPARE(layers.transitions().size(), 0);
}

void tst_LayeredSources::itFiresWhicheverScreenIsActive_data()
{
    addMovedKinds();
}

void tst_LayeredSources::itFiresWhicheverScreenIsActive()
{
    QFETCH(Make, make);
    QFETCH(Cause, cause);
    Layers tree;
    QAbstractTransition *transition = make(&tree.emitter, tree.layers);
    transition->setTargetState(tree.outside);
    tree.start();
    fire(transition->findChild<QTimer *>());
    QVERIFY(tree.screen->isActive());

    cause(&tree.emitter, &tree.machine);
    settle();

    QVERIFY(tree.outside->isActive());
    QVERIFY(!tree.layers->isActive());
}

void tst_LayeredSources::aTransitionOfAViewStays_data()
{
    QTest::addColumn<Make>("make");

    QTest::newRow("HmiViewTransition")
        << Make([](Emitter *, QState *source) -> QAbstractTransition * {
               return new HmiViewTransition(source);
           });
    QTest::newRow("HmiBackTransition")
        << Make([](Emitter *, QState *source) -> QAbstractTransition * {
               return new HmiBackTransition(source);
           });
    QTest::newRow("HmiFallbackTransition")
        << Make([](Emitter *, QState *source) -> QAbstractTransition * {
               return new HmiFallbackTransition(source);
           });
}

void tst_LayeredSources::aTransitionOfAViewStays()
{
    QFETCH(Make, make);
    HmiLayeredState layers("Layers");

    const QAbstractTransition *transition = make(nullptr, &layers);

    QCOMPARE(transition->sourceState(), &layers);
    QCOMPARE(layers.exclusiveState()->transitions().size(), 0);
}

void tst_LayeredSources::anExclusiveLayerOfANestedStateIsTheInnerOne()
{
    HmiLayeredState outer("Outer");
    auto *inner = new HmiLayeredState("Inner", &outer);

    const HmiTransition toOuter("go", &outer);
    const HmiTransition toInner("go", inner);

    QCOMPARE(toOuter.sourceState(), outer.exclusiveState());
    QCOMPARE(toInner.sourceState(), inner->exclusiveState());
}

void tst_LayeredSources::aTransitionAddedLaterStays()
{
    HmiLayeredState layers("Layers");
    auto *added = new HmiTransition("go");
    auto *addedByState = new HmiTransition("go", &layers);

    layers.addTransition(added);
    layers.addHmiTransition(addedByState);

    QCOMPARE(added->sourceState(), &layers);
    QCOMPARE(addedByState->sourceState(), &layers);
}

void tst_LayeredSources::theSignalTransitionThatAStateMakesMoves()
{
    Layers tree;
    const HmiSignalTransition *transition =
        tree.layers->addTransition(&tree.emitter, SIGNAL(plain()), tree.outside);
    QCOMPARE(transition->sourceState(), tree.layers->exclusiveState());
    tree.start();

    Q_EMIT tree.emitter.plain();

    QVERIFY(tree.outside->isActive());
}

void tst_LayeredSources::aScreenTakesTheEventBeforeTheLayer()
{
    Layers tree;
    auto *next = new HmiState("Next", tree.layers);
    (new HmiTransition("go", tree.layers))->setTargetState(tree.outside);
    (new HmiTransition("go", tree.screen))->setTargetState(next);
    tree.start();

    postGo(nullptr, &tree.machine);
    settle();
    QVERIFY(next->isActive());
    postGo(nullptr, &tree.machine);
    settle();

    QVERIFY(tree.outside->isActive());
}

void tst_LayeredSources::theDelayFollowsTheEntriesOfTheExclusiveLayer()
{
    Layers tree;
    auto *delayed =
        new HmiDelayedSignalTransition(&tree.emitter, SIGNAL(plain()), 500, tree.layers);
    delayed->setTargetState(tree.outside);
    (new HmiTransition("go", tree.layers))->setTargetState(tree.layers->exclusiveState());
    auto *timer = delayed->findChild<QTimer *>();
    tree.start();
    QVERIFY(fire(timer));
    QVERIFY(!timer->isActive());

    // The layered state itself is not left by this.
    postGo(nullptr, &tree.machine);
    settle();
    QVERIFY(timer->isActive());
    Q_EMIT tree.emitter.plain();
    QVERIFY(tree.screen->isActive());
    QVERIFY(fire(timer));

    QVERIFY(tree.outside->isActive());
    QVERIFY(!timer->isActive());
}

void tst_LayeredSources::addingADelayedTransitionMakesItFollowTheStateItself()
{
    Layers tree;
    auto *delayed =
        new HmiDelayedSignalTransition(&tree.emitter, SIGNAL(plain()), 500, tree.layers);
    tree.layers->addHmiTransition(delayed);
    delayed->setTargetState(tree.outside);
    (new HmiTransition("go", tree.layers))->setTargetState(tree.layers->exclusiveState());
    auto *timer = delayed->findChild<QTimer *>();
    tree.start();
    QVERIFY(fire(timer));

    postGo(nullptr, &tree.machine);
    settle();
    QVERIFY(!timer->isActive());
    Q_EMIT tree.emitter.plain();

    QVERIFY(tree.outside->isActive());
}

void tst_LayeredSources::aSiblingGroupFollowsTheExclusiveLayer_data()
{
    QTest::addColumn<bool>("inLayers");
    QTest::addColumn<bool>("yields");

    QTest::newRow("active") << true << true;
    QTest::newRow("left") << false << false;
}

// The layers and a region run beside each other; the layers' transition has the higher priority.
void tst_LayeredSources::aSiblingGroupFollowsTheExclusiveLayer()
{
    QFETCH(bool, inLayers);
    QStateMachine machine;
    auto *both = new QState(QState::ParallelStates, &machine);
    auto *first = new HmiState("First", both);
    auto *layers = new HmiLayeredState("Layers", first);
    auto *screen = new HmiState("Screen", layers);
    layers->setInitialHmiState(screen);
    auto *aside = new HmiState("Aside", first);
    first->setInitialState(layers);
    (new HmiTransition("leave", layers))->setTargetState(aside);
    auto *second = new HmiState("Second", both);
    auto *before = new HmiState("Before", second);
    auto *after = new HmiState("After", second);
    second->setInitialState(before);
    auto *high = new HmiTransition("go", layers);
    auto *low = new HmiTransition("go", before);
    low->setTargetState(after);
    QVERIFY(high->makeParallelExclusive(2));
    QVERIFY(low->makeParallelExclusive(1));
    startIn(machine, both);
    machine.postEvent(new HmiEvent(inLayers ? "stay" : "leave", QVariant()));

    postGo(nullptr, &machine);
    settle();

    QCOMPARE(screen->isActive(), inLayers);
    QTEST(before->isActive(), "yields");
}

void tst_LayeredSources::aBlockedKeyIsSwallowedWhileTheLayersAreActive()
{
    Emitter emitter;
    QStateMachine machine;
    auto *both = new QState(QState::ParallelStates, &machine);
    auto *layers = new HmiLayeredState("Layers", both);
    layers->setInitialHmiState(new HmiState("Screen", layers));
    auto *region = new HmiState("Region", both);
    auto *before = new HmiState("Before", region);
    auto *after = new HmiState("After", region);
    region->setInitialState(before);
    auto *key = new KeySignalTransition(&emitter, SIGNAL(key(int, int)), 5, 1, before);
    key->setTargetState(after);
    key->makeGloballyAvailable();

    layers->blockKey(5, 1, &emitter, SIGNAL(key(int, int)));
    const auto *blocker = layers->exclusiveState()->findChild<KeySignalTransition *>(
        QString(), Qt::FindDirectChildrenOnly);
    QVERIFY(blocker);
    startIn(machine, both);
    Q_EMIT emitter.key(5, 1);

    QVERIFY(before->isActive());
    QVERIFY(layers->isActive());
}

void tst_LayeredSources::aMissingPropertyIsWarnedOf_data()
{
    QTest::addColumn<QByteArray>("property");
    QTest::addColumn<QString>("text");

    QTest::newRow("no such property")
        << QByteArray("absent") << "The sender object does not contain the following property:";
    QTest::newRow("no notify signal")
        << QByteArray("silent") << "The following property does not provide a notify signal:";
}

void tst_LayeredSources::aMissingPropertyIsWarnedOf()
{
    QFETCH(QByteArray, property);
    QFETCH(QString, text);
    Emitter emitter;
    emitter.setObjectName("Vehicle");
    HmiLayeredState layers("Layers");

    new GuardedPropertyChangeTransition(&emitter, property, {}, QVariant(), &layers);

    const QString address = QString::number(reinterpret_cast<quintptr>(&emitter), 16);
    QCOMPARE(messages().take(),
             QStringList("warning GuardedPropertyChangeTransition: " + text + " \"" + property
                         + "\" Emitter(0x" + address + ", name = \"Vehicle\") \"Layers\""));
}

void tst_LayeredSources::aVoiceRequestOfAMovedTransitionReachesTheViewLayer()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    Layers tree;
    auto *transition = new HmiTransition("go", tree.layers);
    transition->setTargetState(tree.outside);
    transition->setIsVREventTransition(true, "spoken");
    tree.start();

    postGo(nullptr, &tree.machine);
    settle();

    QVERIFY(tree.outside->isActive());
    QVERIFY(target.vrViewRequest());
    QCOMPARE(target.vrViewRequestData(), QVariant("spoken"));
}

QTEST_GUILESS_MAIN(tst_LayeredSources)
#include "tst_layeredsources.moc"
