#include "childprocess.h"
#include "driving.h"
#include "emitter.h"
#include "librarytest.h"
#include "metadescription.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/hmi/hmistate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/keysignaltransition.h>

#include <QSignalSpy>
#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

using Behavior = HmiState::PopupBehavior;

const QString marker = "P12.R041.02 - Screen Entry: Start Marker";

class JournalingMonitor : public NamedState
{
public:
    explicit JournalingMonitor(Journal &journal) : m_journal(journal) { }
    void monitoredStateEntered(QEvent *) override { m_journal.add("monitored state entered"); }
    void monitoredStateExited(QEvent *) override { m_journal.add("monitored state exited"); }

private:
    Journal &m_journal;
};

class SourceListener : public HmiSignalTransition
{
public:
    using HmiSignalTransition::HmiSignalTransition;
    void sourceStateChange(QState *state) override { sources.append(state); }

    QList<QState *> sources;
};

/** Takes over the choice of the initial state, as a state with layers does. */
class ChoosingState : public HmiState
{
public:
    using HmiState::HmiState;
    void setInitialState(QState *) override { ++settings; }
    QState *initialState() const override { return choice; }

    QState *choice = nullptr;
    int settings = 0;
};

} // namespace

class tst_HmiState : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void aStateIsConstructedByNameOrWithout();
    void aChildStartsWithTheBehaviorOfItsParent_data();
    void aChildStartsWithTheBehaviorOfItsParent();
    void childrenOfAChildStartWithTheBehaviorToo();
    void startingWithABehaviorIsNotAnnouncedLater();
    void aStateUnderAnotherKindOfStateStartsWithTheDefault();
    void aChildFollowsLaterChangesOfItsParent();
    void aChangePassesDownTheWholeTree();
    void settingTheSameBehaviorEmitsNothing();
    void anOwnBehaviorCutsTheInheritanceForGood();
    void settingTheInheritedBehaviorKeepsTheInheritance();
    void anOwnBehaviorOfAChildOfAChildCutsItAlone();
    void anOwnBehaviorOverAnInheritedOneCutsIt();
    void anOwnBehaviorIsPassedOnToTheChildren();
    void takingOverABehaviorKeepsTheInheritance();
    void theNewBehaviorIsStoredWhenItIsAnnounced();
    void entryTellsTheViewLayerTheBehavior_data();
    void entryTellsTheViewLayerTheBehavior();
    void entryWithoutAViewLayerWritesOnlyTheMarkers();
    void theMarkersAreWrittenOnlyWhereDebugIsOn_data();
    void theMarkersAreWrittenOnlyWhereDebugIsOn();
    void theMarkersComeBeforeTheBaseEntry();
    void theBehaviorIsToldAfterTheMonitors();
    void exitIsLoggedByTheBaseAlone();
    void theInitialStateIsSetPastTheVirtualSetter();
    void theInitialStateIsReadThroughTheVirtualGetter();
    void addHmiTransitionTellsASignalTransitionItsNewSource();
    void addHmiTransitionTakesOtherTransitionsToo();
    void addHmiTransitionIgnoresNull();
    void addHmiTransitionRefusesAPlainSignalTransition();
    void aStateWithoutHashingIsNotFoundByName();
    void statesWithoutHashingMayShareAName();
    void aStateWithoutHashingInheritsItsBehavior();
    void destroyingAStateWithoutHashingFreesItsNameWhoeverHoldsIt();
    void aBlockedKeyIsSwallowed_data();
    void aBlockedKeyIsSwallowed();
    void blockingAKeyTakesTheFirstFreePriority();
    void inLayersOnlyANamedStateLandsInTheExclusiveLayer();
    void aStateInLayersStartsWithTheBehaviorOfTheLayers_data();
    void aStateInLayersStartsWithTheBehaviorOfTheLayers();
    void aStateInLayersFollowsTheLayers();
    void aStateInNestedLayersFollowsTheOuterOnes();
    void anOwnBehaviorInLayersCutsTheInheritanceForGood();
    void anOwnBehaviorOfTheExclusiveLayerCutsAllItsScreens();
    void theOtherScreensInLayersFollowOn();
    void enteringLayersTellsTheBehaviorOfEachState();
};

void tst_HmiState::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(HmiState::staticMetaObject),
             QStringList({"signal popupBehaviorChanged(PopupBehavior arg)",
                          "slot setPopupBehavior(PopupBehavior behavior)",
                          "slot syncPopupBehavior(PopupBehavior behavior)"}));
}

void tst_HmiState::aStateIsConstructedByNameOrWithout()
{
    QState parent;
    auto *named = new HmiState("Named", &parent);
    auto *unnamed = new HmiState(&parent);
    HmiState alone("Alone");

    QCOMPARE(named->name(), QString("Named"));
    QCOMPARE(named->parentState(), &parent);
    QCOMPARE(NamedState::stateForName("Named"), named);
    QCOMPARE(named->popupBehavior(), HmiState::DefaultPopupBehavior);
    QCOMPARE(unnamed->name(), QString());
    QCOMPARE(unnamed->parentState(), &parent);
    QCOMPARE(unnamed->popupBehavior(), HmiState::DefaultPopupBehavior);
    QVERIFY(!alone.parent());
}

void tst_HmiState::aChildStartsWithTheBehaviorOfItsParent_data()
{
    QTest::addColumn<int>("behavior");

    QTest::newRow("default") << 0;
    QTest::newRow("off") << 1;
    QTest::newRow("on") << 2;
    QTest::newRow("beyond the named ones") << 7;
    QTest::newRow("negative") << -1;
}

void tst_HmiState::aChildStartsWithTheBehaviorOfItsParent()
{
    QFETCH(int, behavior);
    HmiState parent("Parent");
    parent.setPopupBehavior(Behavior(behavior));

    auto *named = new HmiState("Child", &parent);
    auto *unnamed = new HmiState(&parent);

    QCOMPARE(int(named->popupBehavior()), behavior);
    QCOMPARE(int(unnamed->popupBehavior()), behavior);
}

void tst_HmiState::childrenOfAChildStartWithTheBehaviorToo()
{
    HmiState top("Top");
    top.setPopupBehavior(HmiState::PopupBehaviorOff);
    auto *child = new HmiState("Child", &top);
    auto *view = new HmiViewState("View", child);
    auto *unnamed = new HmiState(view);

    QCOMPARE(view->popupBehavior(), HmiState::PopupBehaviorOff);
    QCOMPARE(unnamed->popupBehavior(), HmiState::PopupBehaviorOff);

    top.setPopupBehavior(HmiState::PopupBehaviorOn);

    QCOMPARE(view->popupBehavior(), HmiState::PopupBehaviorOn);
    QCOMPARE(unnamed->popupBehavior(), HmiState::PopupBehaviorOn);
}

void tst_HmiState::startingWithABehaviorIsNotAnnouncedLater()
{
    HmiState parent("Parent");
    parent.setPopupBehavior(HmiState::PopupBehaviorOn);

    HmiState child("Child", &parent);
    QSignalSpy changes(&child, &HmiState::popupBehaviorChanged);
    QSignalSpy changesOfParent(&parent, &HmiState::popupBehaviorChanged);
    QVERIFY(changes.isValid() && changesOfParent.isValid());
    settle();

    QCOMPARE(changes.size(), 0);
    QCOMPARE(changesOfParent.size(), 0);
}

void tst_HmiState::aStateUnderAnotherKindOfStateStartsWithTheDefault()
{
    HmiState top("Top");
    top.setPopupBehavior(HmiState::PopupBehaviorOn);
    NamedState between("Between", &top);

    HmiState child("Child", &between);
    child.setPopupBehavior(HmiState::PopupBehaviorOff);
    HmiState other("Other", &between);

    QCOMPARE(child.popupBehavior(), HmiState::PopupBehaviorOff);
    QCOMPARE(other.popupBehavior(), HmiState::DefaultPopupBehavior);
}

void tst_HmiState::aChildFollowsLaterChangesOfItsParent()
{
    HmiState parent("Parent");
    parent.setPopupBehavior(HmiState::PopupBehaviorOn);
    auto *child = new HmiState("Child", &parent);
    auto *unnamed = new HmiState(&parent);
    QSignalSpy changes(child, &HmiState::popupBehaviorChanged);
    QVERIFY(changes.isValid());

    parent.setPopupBehavior(HmiState::PopupBehaviorOff);

    QCOMPARE(child->popupBehavior(), HmiState::PopupBehaviorOff);
    QCOMPARE(unnamed->popupBehavior(), HmiState::PopupBehaviorOff);
    QCOMPARE(changes.size(), 1);
    QCOMPARE(changes.first().first().toInt(), 1);
}

void tst_HmiState::aChangePassesDownTheWholeTree()
{
    HmiState top("Top");
    auto *middle = new HmiState("Middle", &top);
    auto *leaf = new HmiState("Leaf", middle);

    top.setPopupBehavior(HmiState::PopupBehaviorOn);

    QCOMPARE(middle->popupBehavior(), HmiState::PopupBehaviorOn);
    QCOMPARE(leaf->popupBehavior(), HmiState::PopupBehaviorOn);
}

void tst_HmiState::settingTheSameBehaviorEmitsNothing()
{
    HmiState state("State");
    QSignalSpy changes(&state, &HmiState::popupBehaviorChanged);
    QVERIFY(changes.isValid());

    state.setPopupBehavior(HmiState::DefaultPopupBehavior);
    state.syncPopupBehavior(HmiState::DefaultPopupBehavior);
    state.setPopupBehavior(HmiState::PopupBehaviorOn);
    state.setPopupBehavior(HmiState::PopupBehaviorOn);
    state.syncPopupBehavior(HmiState::PopupBehaviorOn);

    QCOMPARE(changes.size(), 1);
}

void tst_HmiState::anOwnBehaviorCutsTheInheritanceForGood()
{
    HmiState parent("Parent");
    auto *child = new HmiState("Child", &parent);

    child->setPopupBehavior(HmiState::PopupBehaviorOff);
    parent.setPopupBehavior(HmiState::PopupBehaviorOn);
    QCOMPARE(child->popupBehavior(), HmiState::PopupBehaviorOff);

    child->setPopupBehavior(HmiState::PopupBehaviorOn);
    parent.setPopupBehavior(HmiState::DefaultPopupBehavior);
    QCOMPARE(child->popupBehavior(), HmiState::PopupBehaviorOn);
}

void tst_HmiState::settingTheInheritedBehaviorKeepsTheInheritance()
{
    HmiState parent("Parent");
    parent.setPopupBehavior(HmiState::PopupBehaviorOn);
    auto *child = new HmiState("Child", &parent);

    child->setPopupBehavior(HmiState::PopupBehaviorOn);
    parent.setPopupBehavior(HmiState::PopupBehaviorOff);

    QCOMPARE(child->popupBehavior(), HmiState::PopupBehaviorOff);
}

void tst_HmiState::anOwnBehaviorOfAChildOfAChildCutsItAlone()
{
    HmiState top("Top");
    top.setPopupBehavior(HmiState::PopupBehaviorOff);
    auto *middle = new HmiState("Middle", &top);
    auto *leaf = new HmiState("Leaf", middle);
    auto *other = new HmiState("Other", middle);

    leaf->setPopupBehavior(HmiState::DefaultPopupBehavior);
    top.setPopupBehavior(HmiState::PopupBehaviorOn);

    QCOMPARE(leaf->popupBehavior(), HmiState::DefaultPopupBehavior);
    QCOMPARE(other->popupBehavior(), HmiState::PopupBehaviorOn);
}

void tst_HmiState::anOwnBehaviorOverAnInheritedOneCutsIt()
{
    HmiState parent("Parent");
    parent.setPopupBehavior(HmiState::PopupBehaviorOn);
    auto *child = new HmiState("Child", &parent);
    auto *unnamed = new HmiState(&parent);

    child->setPopupBehavior(HmiState::DefaultPopupBehavior);
    unnamed->setPopupBehavior(HmiState::DefaultPopupBehavior);
    parent.setPopupBehavior(HmiState::PopupBehaviorOff);

    QCOMPARE(child->popupBehavior(), HmiState::DefaultPopupBehavior);
    QCOMPARE(unnamed->popupBehavior(), HmiState::DefaultPopupBehavior);
}

void tst_HmiState::anOwnBehaviorIsPassedOnToTheChildren()
{
    HmiState top("Top");
    auto *middle = new HmiState("Middle", &top);
    auto *leaf = new HmiState("Leaf", middle);

    middle->setPopupBehavior(HmiState::PopupBehaviorOn);
    top.setPopupBehavior(HmiState::PopupBehaviorOff);

    QCOMPARE(leaf->popupBehavior(), HmiState::PopupBehaviorOn);
    QCOMPARE(top.popupBehavior(), HmiState::PopupBehaviorOff);
}

void tst_HmiState::takingOverABehaviorKeepsTheInheritance()
{
    HmiState parent("Parent");
    auto *child = new HmiState("Child", &parent);

    child->syncPopupBehavior(HmiState::PopupBehaviorOff);
    QCOMPARE(child->popupBehavior(), HmiState::PopupBehaviorOff);
    parent.setPopupBehavior(HmiState::PopupBehaviorOn);

    QCOMPARE(child->popupBehavior(), HmiState::PopupBehaviorOn);
}

void tst_HmiState::theNewBehaviorIsStoredWhenItIsAnnounced()
{
    HmiState state("State");
    QList<int> seen;
    connect(&state, &HmiState::popupBehaviorChanged, &state,
            [&](Behavior behavior) { seen << behavior << state.popupBehavior(); });

    state.setPopupBehavior(HmiState::PopupBehaviorOn);
    state.syncPopupBehavior(HmiState::PopupBehaviorOff);

    QCOMPARE(seen, QList<int>({2, 2, 1, 1}));
}

void tst_HmiState::entryTellsTheViewLayerTheBehavior_data()
{
    QTest::addColumn<int>("behavior");
    QTest::addColumn<QStringList>("calls");

    QTest::newRow("default") << 0 << QStringList("resetScreenPopupBehavior");
    QTest::newRow("off") << 1 << QStringList("setScreenPopupBehavior false");
    QTest::newRow("on") << 2 << QStringList("setScreenPopupBehavior true");
    QTest::newRow("first beyond the named ones") << 3 << QStringList();
    QTest::newRow("negative") << -1 << QStringList();
}

void tst_HmiState::entryTellsTheViewLayerTheBehavior()
{
    QFETCH(int, behavior);
    QFETCH(QStringList, calls);
    Journal journal;
    RecordingViewStateTarget target(journal);
    target.recordPopupBehavior(true);
    QStateMachine machine;
    auto *state = new HmiState("Screen", &machine);
    state->setPopupBehavior(Behavior(behavior));

    startIn(machine, state);

    QCOMPARE(journal.lines(), calls);
    QVERIFY(state->isActive());
}

void tst_HmiState::entryWithoutAViewLayerWritesOnlyTheMarkers()
{
    QStateMachine machine;
    auto *state = new HmiState("Screen", &machine);
    messages().enableDebug({"hmi.performance", "hmi.trace", "vosk.hmistatemachine"});

    startIn(machine, state);

    QVERIFY(state->isActive());
    QCOMPARE(messages().take(),
             QStringList({"debug onEntry: " + marker, "debug onEntry: " + marker}));
}

void tst_HmiState::theMarkersAreWrittenOnlyWhereDebugIsOn_data()
{
    QTest::addColumn<QStringList>("categories");

    QTest::newRow("none") << QStringList();
    QTest::newRow("performance") << QStringList("hmi.performance");
    QTest::newRow("trace") << QStringList("hmi.trace");
    QTest::newRow("both") << QStringList({"hmi.performance", "hmi.trace"});
}

void tst_HmiState::theMarkersAreWrittenOnlyWhereDebugIsOn()
{
    QFETCH(QStringList, categories);
    QStateMachine machine;
    auto *state = new HmiState("Screen", &machine);
    messages().enableDebug(categories);

    startIn(machine, state);

    QStringList written;
    const auto taken = messages().takeMessages();
    for (const Message &message : taken) {
        QCOMPARE(message.text, marker);
        QVERIFY(message.file.endsWith("hmistate.cpp"));
        written.append(message.category);
    }
    QCOMPARE(written, categories);
}

void tst_HmiState::theMarkersComeBeforeTheBaseEntry()
{
    QStateMachine machine;
    auto *state = new HmiState("Screen", &machine);
    NamedState::setLoggingEnabled(true);
    messages().enableDebug({"hmi.performance", "hmi.trace", "vosk.hmistatemachine"});

    startIn(machine, state);

    QStringList written;
    const auto taken = messages().takeMessages();
    for (const Message &message : taken) {
        written.append(message.category + ' ' + message.toString());
    }
    QCOMPARE(written,
             QStringList({"hmi.performance debug onEntry: " + marker,
                          "hmi.trace debug onEntry: " + marker,
                          "vosk.hmistatemachine debug onEntry: "
                          "Entering state: \"Unnamed->Screen\""}));
}

void tst_HmiState::theBehaviorIsToldAfterTheMonitors()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    target.recordPopupBehavior(true);
    JournalingMonitor monitor(journal);
    QStateMachine machine;
    auto *state = new HmiState("Screen", &machine);
    state->registerMonitoringState(&monitor);

    startIn(machine, state);

    QCOMPARE(journal.lines(), QStringList({"monitored state entered", "resetScreenPopupBehavior"}));
}

void tst_HmiState::exitIsLoggedByTheBaseAlone()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    target.recordPopupBehavior(true);
    JournalingMonitor monitor(journal);
    QStateMachine machine;
    auto *state = new HmiState("Screen", &machine);
    auto *next = new QState(&machine);
    Emitter emitter;
    state->addTransition(&emitter, SIGNAL(plain()), next);
    state->registerMonitoringState(&monitor);
    startIn(machine, state);
    journal.clear();
    NamedState::setLoggingEnabled(true);
    messages().enableDebug({"hmi.performance", "hmi.trace", "vosk.hmistatemachine"});

    Q_EMIT emitter.plain();

    QVERIFY(!state->isActive());
    QCOMPARE(journal.lines(), QStringList("monitored state exited"));
    QCOMPARE(messages().take(), QStringList("debug onExit: Exiting state: \"Unnamed->Screen\""));
}

void tst_HmiState::theInitialStateIsSetPastTheVirtualSetter()
{
    ChoosingState state("Chooser");
    auto *child = new QState(&state);

    state.setInitialHmiState(child);

    QCOMPARE(state.settings, 0);
    QCOMPARE(state.QState::initialState(), child);
}

void tst_HmiState::theInitialStateIsReadThroughTheVirtualGetter()
{
    ChoosingState state("Chooser");
    auto *child = new QState(&state);
    auto *choice = new QState(&state);
    state.setInitialHmiState(child);
    state.choice = choice;
    HmiState plain("Plain");
    auto *plainChild = new QState(&plain);
    plain.setInitialHmiState(plainChild);

    QCOMPARE(state.initialHmiState(), choice);
    QCOMPARE(plain.initialHmiState(), plainChild);
}

void tst_HmiState::addHmiTransitionTellsASignalTransitionItsNewSource()
{
    Emitter emitter;
    HmiState first("First");
    HmiState second("Second");
    auto *transition = new SourceListener(&emitter, SIGNAL(plain()));

    first.addHmiTransition(transition);
    second.addHmiTransition(transition);

    QCOMPARE(transition->sources, QList<QState *>({&first, &second}));
    QCOMPARE(transition->sourceState(), &second);
    QCOMPARE(first.transitions().size(), 0);
}

void tst_HmiState::addHmiTransitionTakesOtherTransitionsToo()
{
    HmiState state("State");
    auto *transition = new HmiTransition("Call");

    state.addHmiTransition(transition);

    QCOMPARE(state.transitions(), QList<QAbstractTransition *>({transition}));
}

void tst_HmiState::addHmiTransitionIgnoresNull()
{
    HmiState state("State");
    QTest::ignoreMessage(QtWarningMsg, "QState::addTransition: cannot add null transition");

    state.addHmiTransition(nullptr);

    QCOMPARE(state.transitions().size(), 0);
}

void tst_HmiState::addHmiTransitionRefusesAPlainSignalTransition()
{
    if (isChildProcess()) {
        Emitter emitter;
        HmiState state("State");
        state.addHmiTransition(new QSignalTransition(&emitter, SIGNAL(plain())));
        return;
    }

    const ChildResult result = runAsChild("addHmiTransitionRefusesAPlainSignalTransition");

    QVERIFY(result.crashed);
    QVERIFY(result.output.contains("Raw QSignalTransition usage detected!"));
}

void tst_HmiState::aStateWithoutHashingIsNotFoundByName()
{
    HmiState parent("Parent");

    HmiState *state = HmiState::createWithoutHashing("Shared", &parent);

    QCOMPARE(state->name(), QString("Shared"));
    QCOMPARE(state->objectName(), QString());
    QCOMPARE(state->parent(), &parent);
    QVERIFY(!NamedState::stateForName("Shared"));
    QCOMPARE(NamedState::namedStates(), QList<NamedState *>({&parent}));
}

void tst_HmiState::statesWithoutHashingMayShareAName()
{
    HmiState parent("Parent");

    HmiState *first = HmiState::createWithoutHashing("Shared", &parent);
    HmiState *second = HmiState::createWithoutHashing("Shared", nullptr);
    const QScopedPointer<HmiState> owner(second);

    QCOMPARE(first->name(), QString("Shared"));
    QCOMPARE(second->name(), QString("Shared"));
    QVERIFY(!second->parent());
}

void tst_HmiState::aStateWithoutHashingInheritsItsBehavior()
{
    HmiState parent("Parent");
    parent.setPopupBehavior(HmiState::PopupBehaviorOn);

    HmiState *state = HmiState::createWithoutHashing("Shared", &parent);
    QCOMPARE(state->popupBehavior(), HmiState::PopupBehaviorOn);
    parent.setPopupBehavior(HmiState::PopupBehaviorOff);

    QCOMPARE(state->popupBehavior(), HmiState::PopupBehaviorOff);
}

void tst_HmiState::destroyingAStateWithoutHashingFreesItsNameWhoeverHoldsIt()
{
    HmiState holder("Shared");
    QScopedPointer<HmiState> other(HmiState::createWithoutHashing("Shared", nullptr));
    QCOMPARE(NamedState::stateForName("Shared"), &holder);

    other.reset();

    QVERIFY(!NamedState::stateForName("Shared"));
    QCOMPARE(holder.name(), QString("Shared"));
}

void tst_HmiState::aBlockedKeyIsSwallowed_data()
{
    QTest::addColumn<int>("key");
    QTest::addColumn<int>("status");
    QTest::addColumn<bool>("reaches");

    QTest::newRow("the blocked key") << 5 << 1 << false;
    QTest::newRow("another key") << 6 << 1 << true;
    QTest::newRow("another status") << 5 << 2 << true;
}

void tst_HmiState::aBlockedKeyIsSwallowed()
{
    QFETCH(int, key);
    QFETCH(int, status);
    QFETCH(bool, reaches);
    Emitter emitter;
    QStateMachine machine;
    auto *both = new QState(QState::ParallelStates, &machine);
    auto *region = new HmiState("Region", both);
    auto *before = new HmiState("Before", region);
    auto *after = new HmiState("After", region);
    region->setInitialState(before);
    auto *blocker = new HmiState("Blocker", both);
    for (const auto &pair : {qMakePair(5, 1), qMakePair(5, 2), qMakePair(6, 1)}) {
        auto *transition = new KeySignalTransition(&emitter, SIGNAL(key(int, int)), pair.first,
                                                   pair.second, before);
        transition->setTargetState(after);
        transition->makeGloballyAvailable();
    }
    blocker->blockKey(5, 1, &emitter, SIGNAL(key(int, int)));
    startIn(machine, both);

    Q_EMIT emitter.key(key, status);

    QCOMPARE(after->isActive(), reaches);
    QVERIFY(blocker->isActive());
}

void tst_HmiState::blockingAKeyTakesTheFirstFreePriority()
{
    Emitter emitter;
    HmiState state("Blocker");
    QState other;
    auto *unpublished = new KeySignalTransition(&emitter, SIGNAL(key(int, int)), 5, 1, &other);
    QVERIFY(unpublished->makeParallelExclusive(2));
    auto *published = new KeySignalTransition(&emitter, SIGNAL(key(int, int)), 5, 1, &other);
    published->makeGloballyAvailable();

    state.blockKey(5, 1, &emitter, SIGNAL(key(int, int)));

    const auto blocking = state.findChildren<KeySignalTransition *>();
    QCOMPARE(blocking.size(), 1);
    QVERIFY(published->makeParallelExclusive(1));
    QVERIFY(unpublished->makeParallelExclusive(2));
    QVERIFY(blocking.first()->makeParallelExclusive(3));
    QVERIFY(!blocking.first()->targetState());
}

void tst_HmiState::inLayersOnlyANamedStateLandsInTheExclusiveLayer()
{
    HmiLayeredState layers("Layers");

    const auto *named = new HmiState("Named", &layers);
    const auto *unnamed = new HmiState(&layers);
    const HmiState *unhashed = HmiState::createWithoutHashing("Unhashed", &layers);

    QCOMPARE(named->parent(), layers.exclusiveState());
    QCOMPARE(unnamed->parent(), &layers);
    QCOMPARE(unhashed->parent(), &layers);
}

void tst_HmiState::aStateInLayersStartsWithTheBehaviorOfTheLayers_data()
{
    QTest::addColumn<int>("behavior");

    QTest::newRow("default") << 0;
    QTest::newRow("off") << 1;
    QTest::newRow("on") << 2;
    QTest::newRow("beyond the named ones") << 7;
}

void tst_HmiState::aStateInLayersStartsWithTheBehaviorOfTheLayers()
{
    QFETCH(int, behavior);
    HmiLayeredState layers("Layers");
    layers.setPopupBehavior(Behavior(behavior));

    const auto *named = new HmiState("Named", &layers);
    const auto *unnamed = new HmiState(&layers);

    QCOMPARE(int(layers.exclusiveState()->popupBehavior()), behavior);
    QCOMPARE(int(named->popupBehavior()), behavior);
    QCOMPARE(int(unnamed->popupBehavior()), behavior);
}

void tst_HmiState::aStateInLayersFollowsTheLayers()
{
    HmiLayeredState layers("Layers");
    auto *named = new HmiState("Named", &layers);
    auto *unnamed = new HmiState(&layers);
    QSignalSpy changes(named, &HmiState::popupBehaviorChanged);
    QVERIFY(changes.isValid());

    layers.setPopupBehavior(HmiState::PopupBehaviorOn);
    layers.setPopupBehavior(HmiState::PopupBehaviorOff);

    QCOMPARE(named->popupBehavior(), HmiState::PopupBehaviorOff);
    QCOMPARE(unnamed->popupBehavior(), HmiState::PopupBehaviorOff);
    QCOMPARE(changes.size(), 2);
    QCOMPARE(changes.at(0).first().toInt(), 2);
    QCOMPARE(changes.at(1).first().toInt(), 1);
}

void tst_HmiState::aStateInNestedLayersFollowsTheOuterOnes()
{
    HmiLayeredState outer("Outer");
    auto *inner = new HmiLayeredState("Inner", &outer);
    auto *screen = new HmiState("Screen", inner);

    outer.setPopupBehavior(HmiState::PopupBehaviorOn);

    QCOMPARE(inner->popupBehavior(), HmiState::PopupBehaviorOn);
    QCOMPARE(screen->popupBehavior(), HmiState::PopupBehaviorOn);
}

void tst_HmiState::anOwnBehaviorInLayersCutsTheInheritanceForGood()
{
    HmiLayeredState layers("Layers");
    auto *screen = new HmiState("Screen", &layers);
    auto *unnamed = new HmiState(&layers);

    for (HmiState *child : {screen, unnamed}) {
        child->setPopupBehavior(HmiState::PopupBehaviorOff);
    }
    layers.setPopupBehavior(HmiState::PopupBehaviorOn);
    layers.setPopupBehavior(HmiState::DefaultPopupBehavior);
    layers.setPopupBehavior(HmiState::PopupBehaviorOn);

    QCOMPARE(screen->popupBehavior(), HmiState::PopupBehaviorOff);
    QCOMPARE(unnamed->popupBehavior(), HmiState::PopupBehaviorOff);
}

void tst_HmiState::anOwnBehaviorOfTheExclusiveLayerCutsAllItsScreens()
{
    HmiLayeredState layers("Layers");
    auto *screen = new HmiState("Screen", &layers);

    layers.exclusiveState()->setPopupBehavior(HmiState::PopupBehaviorOn);
    layers.setPopupBehavior(HmiState::PopupBehaviorOff);

    QCOMPARE(screen->popupBehavior(), HmiState::PopupBehaviorOn);
}

void tst_HmiState::theOtherScreensInLayersFollowOn()
{
    HmiLayeredState layers("Layers");
    auto *own = new HmiState("Own", &layers);
    auto *following = new HmiState("Following", &layers);

    own->setPopupBehavior(HmiState::PopupBehaviorOff);
    layers.setPopupBehavior(HmiState::PopupBehaviorOn);

    QCOMPARE(own->popupBehavior(), HmiState::PopupBehaviorOff);
    QCOMPARE(following->popupBehavior(), HmiState::PopupBehaviorOn);
}

void tst_HmiState::enteringLayersTellsTheBehaviorOfEachState()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    target.recordPopupBehavior(true);
    QStateMachine machine;
    auto *layers = new HmiLayeredState("Layers", &machine);
    auto *screen = new HmiState("Screen", layers);
    layers->setInitialHmiState(screen);
    layers->setPopupBehavior(HmiState::PopupBehaviorOff);
    screen->setPopupBehavior(HmiState::PopupBehaviorOn);

    startIn(machine, layers);

    QCOMPARE(journal.lines(),
             QStringList({"setScreenPopupBehavior false", "setScreenPopupBehavior false",
                          "setScreenPopupBehavior false", "setScreenPopupBehavior true"}));
}

QTEST_GUILESS_MAIN(tst_HmiState)
#include "tst_hmistate.moc"
