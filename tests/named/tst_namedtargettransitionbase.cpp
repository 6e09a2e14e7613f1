#include "driving.h"
#include "emitter.h"
#include "librarytest.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>
#include <HmiStateMachine/named/simpleeventtransition.h>

#include <QFinalState>
#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

const auto go = static_cast<QEvent::Type>(QEvent::User + 1);
const auto ignored = static_cast<QEvent::Type>(QEvent::User + 2);

// The mix-in alone, with its target kept in a member.
class BareTransition : public NamedTargetTransitionBase
{
public:
    QState *getSourceState() const override { return nullptr; }
    void changeTarget(QState *target) override { m_target = target; }
    QAbstractState *getTarget() const override { return m_target; }
    void setTarget(QAbstractState *target) { m_target = target; }

private:
    QAbstractState *m_target = nullptr;
};

using Triggering = QList<NamedTargetTransitionBase *>;

// Two regions, each with one transition on the same event.
struct Regions
{
    QStateMachine machine;
    NamedState *both = new NamedState("Both", QState::ParallelStates, &machine);
    NamedState *left = new NamedState("Left", both);
    NamedState *right = new NamedState("Right", both);
    SimpleEventTransition *leftGo = new SimpleEventTransition(go, left);
    SimpleEventTransition *rightGo = new SimpleEventTransition(go, right);
};

} // namespace

class tst_NamedTargetTransitionBase : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itHasNeitherTargetNorMarkAtFirst();
    void aNameIsResolvedThroughTheRegistry();
    void anUnknownNameLeavesNoTarget_data();
    void anUnknownNameLeavesNoTarget();
    void aNameIsLookedUpAtTheMomentOfTheCall();
    void renamingTheTargetDoesNotChangeIt();
    void aNameTakenOverByAnotherStateDoesNotChangeTheTarget();
    void aTargetWithoutANameReportsNone_data();
    void aTargetWithoutANameReportsNone();
    void aDestroyedTargetIsNoTarget();
    void everyKindOfTransitionMovesToANamedTarget();
    void aVoiceMarkIsKeptUntilItIsChanged();
    void aVoiceRequestReachesTheViewLayerBeforeTheTargetIsEntered();
    void anUnmarkedTransitionLeavesTheViewLayersVoiceRequest();
    void aVoiceMarkNeedsNoViewLayer();
    void aTransitionAboutToFireIsListed();
    void aTransitionWithoutATargetIsNeverListed();
    void firingRemovesEveryEntry();
    void theListIsACopy();
    void aDestroyedTransitionLeavesTheList();
    void aFiringTransitionIsListedWhileItsSourceIsLeft();
    void aFiringTransitionWithoutATargetIsNotListed();
    void aRefusedEventListsNothing();
    void aTransitionThatIsNotTakenStaysListedUntilItGoes();
    void aTransitionThatIsNotTakenIsClearedWhenItFiresLater();
    void itAcceptsNoEventOfItsOwn();
    void withoutAGroupNoSiblingTakesTheEvent();
    void aSiblingOfHigherPriorityTakesTheEvent();
    void aSiblingThatIsNotActiveTakesNothing();
    void aDestroyedGroupTakesNothing();
    void aGroupBehindADestroyedOneIsAsked();
    void anyOneOfSeveralGroupsSuffices();
    void aDestroyedSiblingTakesNothing();
    void anEventlessTransitionWithoutATargetDoesNotHangTheMachine();
};

void tst_NamedTargetTransitionBase::itHasNeitherTargetNorMarkAtFirst()
{
    const BareTransition transition;

    QCOMPARE(transition.getTarget(), nullptr);
    QCOMPARE(transition.targetName(), QString());
    QCOMPARE(transition.isVREventTransition(), false);
    QCOMPARE(transition.vrEventData(), QVariant());
    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(), Triggering());
}

void tst_NamedTargetTransitionBase::aNameIsResolvedThroughTheRegistry()
{
    NamedState radio("Radio");
    NamedState map("Map");
    BareTransition transition;

    transition.setNamedTargetState("Radio");
    QCOMPARE(transition.getTarget(), &radio);
    QCOMPARE(transition.targetName(), QString("Radio"));

    transition.setNamedTargetState("Map");
    QCOMPARE(transition.getTarget(), &map);
    QCOMPARE(transition.targetName(), QString("Map"));
}

void tst_NamedTargetTransitionBase::anUnknownNameLeavesNoTarget_data()
{
    QTest::addColumn<QString>("name");

    QTest::newRow("unknown") << "Nowhere";
    QTest::newRow("of another case") << "radio";
    QTest::newRow("empty") << "";
}

void tst_NamedTargetTransitionBase::anUnknownNameLeavesNoTarget()
{
    QFETCH(QString, name);
    messages().enableDebug();
    NamedState radio("Radio");
    NamedState unnamed;
    SimpleEventTransition transition(go);
    transition.setNamedTargetState("Radio");

    transition.setNamedTargetState(name);

    QCOMPARE(transition.targetState(), nullptr);
    QCOMPARE(transition.targetName(), QString());
    QCOMPARE(messages().take(), QStringList());
}

void tst_NamedTargetTransitionBase::aNameIsLookedUpAtTheMomentOfTheCall()
{
    BareTransition transition;
    transition.setNamedTargetState("Late");

    NamedState late("Late");
    QCOMPARE(transition.getTarget(), nullptr);

    transition.setNamedTargetState("Late");
    QCOMPARE(transition.getTarget(), &late);
}

void tst_NamedTargetTransitionBase::renamingTheTargetDoesNotChangeIt()
{
    NamedState state("Before");
    BareTransition transition;
    transition.setNamedTargetState("Before");

    state.setName("After");

    QCOMPARE(transition.getTarget(), &state);
    QCOMPARE(transition.targetName(), QString("After"));
}

void tst_NamedTargetTransitionBase::aNameTakenOverByAnotherStateDoesNotChangeTheTarget()
{
    NamedState first("Seat");
    BareTransition transition;
    transition.setNamedTargetState("Seat");

    first.setName("Stand");
    NamedState second("Seat");

    QCOMPARE(transition.getTarget(), &first);
    QCOMPARE(transition.targetName(), QString("Stand"));
}

void tst_NamedTargetTransitionBase::aTargetWithoutANameReportsNone_data()
{
    QTest::addColumn<QAbstractState *>("target");

    auto *plain = new QState;
    plain->setObjectName("Plain");
    QTest::newRow("no target") << static_cast<QAbstractState *>(nullptr);
    QTest::newRow("plain state") << static_cast<QAbstractState *>(plain);
    QTest::newRow("final state") << static_cast<QAbstractState *>(new QFinalState);
    QTest::newRow("unnamed state") << static_cast<QAbstractState *>(new NamedState);
}

void tst_NamedTargetTransitionBase::aTargetWithoutANameReportsNone()
{
    QFETCH(QAbstractState *, target);
    const QScopedPointer<QAbstractState> owner(target);
    BareTransition transition;

    transition.setTarget(target);

    QCOMPARE(transition.targetName(), QString());
}

void tst_NamedTargetTransitionBase::aDestroyedTargetIsNoTarget()
{
    QScopedPointer<NamedState> target(new NamedState("Gone"));
    SimpleEventTransition transition(go);
    transition.setNamedTargetState("Gone");

    target.reset();
    transition.aboutToBeTriggered();

    QCOMPARE(transition.getTarget(), nullptr);
    QCOMPARE(transition.targetName(), QString());
    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(), Triggering());
}

void tst_NamedTargetTransitionBase::everyKindOfTransitionMovesToANamedTarget()
{
    NamedState source("Source");
    NamedState target("Target");
    const QList<QAbstractTransition *> transitions = {new GuardedTransition(&source),
                                                      new SimpleEventTransition(go, &source),
                                                      new HmiSignalTransition(&source)};
    const auto asNamed = [](QAbstractTransition *transition) {
        return dynamic_cast<NamedTargetTransitionBase *>(transition);
    };

    for (QAbstractTransition *transition : transitions) {
        asNamed(transition)->setNamedTargetState("Target");
    }

    for (QAbstractTransition *transition : transitions) {
        QCOMPARE(transition->targetState(), &target);
        QCOMPARE(asNamed(transition)->getTarget(), &target);
        QCOMPARE(asNamed(transition)->getSourceState(), &source);
    }
}

void tst_NamedTargetTransitionBase::aVoiceMarkIsKeptUntilItIsChanged()
{
    BareTransition transition;

    transition.setIsVREventTransition(true, "call Anna");
    QCOMPARE(transition.isVREventTransition(), true);
    QCOMPARE(transition.vrEventData(), QVariant("call Anna"));

    transition.setIsVREventTransition(false, 4);
    QCOMPARE(transition.isVREventTransition(), false);
    QCOMPARE(transition.vrEventData(), QVariant(4));
}

void tst_NamedTargetTransitionBase::aVoiceRequestReachesTheViewLayerBeforeTheTargetIsEntered()
{
    Journal journal;
    RecordingViewStateTarget view(journal);
    QStateMachine machine;
    auto *home = new NamedState("Home", &machine);
    auto *phone = new NamedState("Phone", &machine);
    auto *transition = new SimpleEventTransition(go, home);
    transition->setNamedTargetState("Phone");
    transition->setIsVREventTransition(true, "call Anna");
    const auto note = [&] { journal.add(view.vrViewRequest() ? "requested" : "not requested"); };
    connect(home, &QAbstractState::exited, home, note);
    connect(phone, &QAbstractState::entered, phone, note);
    startIn(machine, home);

    machine.postEvent(new QEvent(go));
    settle();

    QCOMPARE(journal.lines(), QStringList({"not requested", "requested"}));
    QCOMPARE(view.vrViewRequestData(), QVariant("call Anna"));
    QCOMPARE(transition->isVREventTransition(), true);
}

void tst_NamedTargetTransitionBase::anUnmarkedTransitionLeavesTheViewLayersVoiceRequest()
{
    Journal journal;
    RecordingViewStateTarget view(journal);
    view.setVRViewRequest(true, "earlier");
    QStateMachine machine;
    auto *home = new NamedState("Home", &machine);
    auto *phone = new NamedState("Phone", &machine);
    auto *transition = new SimpleEventTransition(go, home);
    transition->setNamedTargetState("Phone");
    transition->setIsVREventTransition(false, "unused");
    startIn(machine, home);

    machine.postEvent(new QEvent(go));
    settle();

    QVERIFY(phone->isActive());
    QCOMPARE(view.vrViewRequest(), true);
    QCOMPARE(view.vrViewRequestData(), QVariant("earlier"));
}

void tst_NamedTargetTransitionBase::aVoiceMarkNeedsNoViewLayer()
{
    QStateMachine machine;
    auto *home = new NamedState("Home", &machine);
    auto *phone = new NamedState("Phone", &machine);
    auto *transition = new SimpleEventTransition(go, home);
    transition->setNamedTargetState("Phone");
    transition->setIsVREventTransition(true, "call Anna");
    startIn(machine, home);

    machine.postEvent(new QEvent(go));
    settle();

    QVERIFY(phone->isActive());
}

void tst_NamedTargetTransitionBase::aTransitionAboutToFireIsListed()
{
    NamedState target("Target");
    BareTransition first;
    BareTransition second;
    first.setNamedTargetState("Target");
    second.setNamedTargetState("Target");

    second.aboutToBeTriggered();
    first.aboutToBeTriggered();

    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(), Triggering({&second, &first}));
}

void tst_NamedTargetTransitionBase::aTransitionWithoutATargetIsNeverListed()
{
    BareTransition transition;
    transition.setNamedTargetState("Nowhere");

    transition.aboutToBeTriggered();

    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(), Triggering());
}

void tst_NamedTargetTransitionBase::firingRemovesEveryEntry()
{
    NamedState target("Target");
    BareTransition fired;
    BareTransition other;
    fired.setNamedTargetState("Target");
    other.setNamedTargetState("Target");
    fired.aboutToBeTriggered();
    other.aboutToBeTriggered();
    fired.aboutToBeTriggered();
    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(),
             Triggering({&fired, &other, &fired}));

    fired.wasTriggered();

    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(), Triggering({&other}));
}

void tst_NamedTargetTransitionBase::theListIsACopy()
{
    NamedState target("Target");
    BareTransition transition;
    transition.setNamedTargetState("Target");
    transition.aboutToBeTriggered();
    Triggering list = NamedTargetTransitionBase::triggeringTransition();

    list.clear();

    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(), Triggering({&transition}));
}

void tst_NamedTargetTransitionBase::aDestroyedTransitionLeavesTheList()
{
    NamedState target("Target");
    BareTransition other;
    QScopedPointer<BareTransition> transition(new BareTransition);
    for (BareTransition *each : {transition.data(), &other, transition.data()}) {
        each->setNamedTargetState("Target");
        each->aboutToBeTriggered();
    }

    transition.reset();

    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(), Triggering({&other}));
}

void tst_NamedTargetTransitionBase::aFiringTransitionIsListedWhileItsSourceIsLeft()
{
    QStateMachine machine;
    auto *home = new NamedState("Home", &machine);
    auto *phone = new NamedState("Phone", &machine);
    auto *transition = new SimpleEventTransition(go, home);
    transition->setNamedTargetState("Phone");
    QList<Triggering> seen;
    const auto look = [&] { seen.append(NamedTargetTransitionBase::triggeringTransition()); };
    connect(home, &QAbstractState::exited, home, look);
    connect(transition, &QAbstractTransition::triggered, home, look);
    connect(phone, &QAbstractState::entered, phone, look);
    startIn(machine, home);

    machine.postEvent(new QEvent(go));
    settle();

    QCOMPARE(seen, QList<Triggering>({{transition}, {}, {}}));
}

void tst_NamedTargetTransitionBase::aFiringTransitionWithoutATargetIsNotListed()
{
    QStateMachine machine;
    auto *home = new NamedState("Home", &machine);
    auto *transition = new SimpleEventTransition(go, home);
    QSignalSpy fired(transition, &QAbstractTransition::triggered);
    QVERIFY(fired.isValid());
    QList<Triggering> seen;
    connect(transition, &QAbstractTransition::triggered, home,
            [&] { seen.append(NamedTargetTransitionBase::triggeringTransition()); });
    startIn(machine, home);

    machine.postEvent(new QEvent(go));
    settle();

    QCOMPARE(fired.size(), 1);
    QCOMPARE(seen, QList<Triggering>({{}}));
}

void tst_NamedTargetTransitionBase::aRefusedEventListsNothing()
{
    QStateMachine machine;
    auto *home = new NamedState("Home", &machine);
    auto *phone = new NamedState("Phone", &machine);
    auto *transition = new SimpleEventTransition(go, home);
    transition->setTargetState(phone);
    startIn(machine, home);

    machine.postEvent(new QEvent(ignored));
    settle();

    QVERIFY(home->isActive());
    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(), Triggering());
}

void tst_NamedTargetTransitionBase::aTransitionThatIsNotTakenStaysListedUntilItGoes()
{
    Regions regions;
    auto *away = new NamedState("Away", &regions.machine);
    regions.leftGo->setTargetState(away);
    regions.rightGo->setTargetState(away);
    startIn(regions.machine, regions.both);

    regions.machine.postEvent(new QEvent(go));
    settle();

    QVERIFY(away->isActive());
    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(), Triggering({regions.rightGo}));
    delete regions.rightGo;
    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(), Triggering());
}

void tst_NamedTargetTransitionBase::aTransitionThatIsNotTakenIsClearedWhenItFiresLater()
{
    Regions regions;
    auto *away = new NamedState("Away", &regions.machine);
    Emitter emitter;
    away->addTransition(&emitter, SIGNAL(plain()), regions.both);
    regions.leftGo->setTargetState(away);
    regions.rightGo->setTargetState(away);
    startIn(regions.machine, regions.both);
    regions.machine.postEvent(new QEvent(go));
    settle();
    regions.leftGo->setEventType(ignored);
    Q_EMIT emitter.plain();
    QVERIFY(regions.right->isActive());

    regions.machine.postEvent(new QEvent(go));
    settle();

    QVERIFY(away->isActive());
    QCOMPARE(NamedTargetTransitionBase::triggeringTransition(), Triggering());
}

void tst_NamedTargetTransitionBase::itAcceptsNoEventOfItsOwn()
{
    BareTransition transition;
    QEvent event(go);

    QCOMPARE(transition.internalEventTest(&event), false);
}

void tst_NamedTargetTransitionBase::withoutAGroupNoSiblingTakesTheEvent()
{
    Regions regions;
    startIn(regions.machine, regions.both);
    QEvent event(go);

    QCOMPARE(regions.leftGo->activeSiblingTest(&event), false);
    QCOMPARE(regions.rightGo->activeSiblingTest(&event), false);
}

void tst_NamedTargetTransitionBase::aSiblingOfHigherPriorityTakesTheEvent()
{
    Regions regions;
    ParallelSiblingTransitionGroup group;
    QVERIFY(group.addTransition(regions.leftGo, 1));
    QVERIFY(group.addTransition(regions.rightGo, 2));
    startIn(regions.machine, regions.both);
    QEvent event(go);
    QEvent other(ignored);

    QCOMPARE(regions.leftGo->activeSiblingTest(&event), true);
    QCOMPARE(regions.rightGo->activeSiblingTest(&event), false);
    QCOMPARE(regions.leftGo->activeSiblingTest(&other), false);
}

void tst_NamedTargetTransitionBase::aSiblingThatIsNotActiveTakesNothing()
{
    Regions regions;
    ParallelSiblingTransitionGroup group;
    QVERIFY(group.addTransition(regions.leftGo, 1));
    QVERIFY(group.addTransition(regions.rightGo, 2));
    QEvent event(go);

    QCOMPARE(regions.leftGo->activeSiblingTest(&event), false);
}

void tst_NamedTargetTransitionBase::aDestroyedGroupTakesNothing()
{
    Regions regions;
    QScopedPointer<ParallelSiblingTransitionGroup> group(new ParallelSiblingTransitionGroup);
    QVERIFY(group->addTransition(regions.leftGo, 1));
    QVERIFY(group->addTransition(regions.rightGo, 2));
    startIn(regions.machine, regions.both);
    QEvent event(go);
    QCOMPARE(regions.leftGo->activeSiblingTest(&event), true);

    group.reset();

    QCOMPARE(regions.leftGo->activeSiblingTest(&event), false);
}

void tst_NamedTargetTransitionBase::aGroupBehindADestroyedOneIsAsked()
{
    Regions regions;
    QScopedPointer<ParallelSiblingTransitionGroup> gone(new ParallelSiblingTransitionGroup);
    ParallelSiblingTransitionGroup group;
    for (ParallelSiblingTransitionGroup *each : {gone.data(), &group}) {
        QVERIFY(each->addTransition(regions.leftGo, 1));
        QVERIFY(each->addTransition(regions.rightGo, 2));
    }
    startIn(regions.machine, regions.both);
    QEvent event(go);

    gone.reset();

    QCOMPARE(regions.leftGo->activeSiblingTest(&event), true);
}

void tst_NamedTargetTransitionBase::anyOneOfSeveralGroupsSuffices()
{
    Regions regions;
    ParallelSiblingTransitionGroup leftFirst;
    ParallelSiblingTransitionGroup rightFirst;
    QVERIFY(leftFirst.addTransition(regions.leftGo, 2));
    QVERIFY(leftFirst.addTransition(regions.rightGo, 1));
    QVERIFY(rightFirst.addTransition(regions.leftGo, 1));
    QVERIFY(rightFirst.addTransition(regions.rightGo, 2));
    startIn(regions.machine, regions.both);
    QEvent event(go);

    QCOMPARE(regions.leftGo->activeSiblingTest(&event), true);
    QCOMPARE(regions.rightGo->activeSiblingTest(&event), true);
}

void tst_NamedTargetTransitionBase::aDestroyedSiblingTakesNothing()
{
    Regions regions;
    ParallelSiblingTransitionGroup group;
    QVERIFY(group.addTransition(regions.leftGo, 1));
    QVERIFY(group.addTransition(regions.rightGo, 2));
    startIn(regions.machine, regions.both);
    QEvent event(go);

    delete regions.rightGo;

    QCOMPARE(regions.leftGo->activeSiblingTest(&event), false);
}

void tst_NamedTargetTransitionBase::anEventlessTransitionWithoutATargetDoesNotHangTheMachine()
{
    QStateMachine machine;
    auto *home = new NamedState("Home", &machine);
    auto *phone = new NamedState("Phone", &machine);
    auto *transition = new SimpleEventTransition(QEvent::None, home);
    auto *exit = new SimpleEventTransition(go, home);
    exit->setTargetState(phone);

    startIn(machine, home);

    QVERIFY(home->isActive());
    QCOMPARE(messages().take(),
             QStringList({"warning eventTest: Eventless transition without a target is not taken, "
                          "source state: \"Home\""}));
    QCOMPARE(transition->getTarget(), nullptr);

    machine.postEvent(new QEvent(go));
    settle();

    QVERIFY(phone->isActive());
}

QTEST_GUILESS_MAIN(tst_NamedTargetTransitionBase)
#include "tst_namedtargettransitionbase.moc"
