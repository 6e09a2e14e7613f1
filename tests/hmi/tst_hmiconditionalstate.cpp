#include "driving.h"
#include "guards.h"
#include "librarytest.h"
#include "metadescription.h"

#include <HmiStateMachine/hmi/hmiconditionalstate.h>
#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>

#include <QSignalSpy>
#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

Q_DECLARE_METATYPE(QEvent *)

namespace {

const QString tested = "debug operator(): \"HmiConditionalState::conditionTest\"";

/** A machine with a screen, a decision that "go" leads to, and a goal behind the decision. */
struct Decision
{
    QStateMachine machine;
    HmiState *const screen = new HmiState("Screen", &machine);
    HmiConditionalState *const decision = new HmiConditionalState("Decision", &machine);
    HmiState *const goal = new HmiState("Goal", &machine);

    Decision() { (new HmiTransition("go", screen))->setTargetState(decision); }

    GuardedTransition *transition() const { return decision->findChild<GuardedTransition *>(); }

    void start() { startIn(machine, screen); }

    void post(const QString &name)
    {
        machine.postEvent(new HmiEvent(name, QVariant()));
        settle();
    }
};

} // namespace

class tst_HmiConditionalState : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void itsMetaObjectIsAsPublished();
    void itOwnsOneGuardedTransitionThatAllows();
    void eitherKindOfParentWillDo();
    void inLayersItLandsInTheExclusiveLayer();
    void settingTheTargetIsLogged();
    void settingNoTargetIsLogged();
    void namingTheTargetIsLogged();
    void theTargetIsKnownByItsName();
    void anUnknownNameIsNoTarget();
    void aLaterTargetReplacesTheEarlierOne();
    void itPassesOnAtOnce();
    void eachTestIsLogged();
    void theTestIsAnnouncedWithItsEvent();
    void itsOwnSignalTellsAfterTheLog();
    void aReceiverMayForbidThePassage();
    void theReceiverThatAnswersLastDecides();
    void itPassesOnLaterWhenItIsAllowed();
    void withoutATargetItStaysWithOneWarning();
    void withoutATargetTheTestIsStillAnnounced();
    void withoutATargetTheMachineGoesOn();
    void aTargetThatIsSetLaterIsTaken();
    void aDestroyedTargetIsNone();
    void aChainOfDecisionsPassesOnInOneGo();
    void aChainStopsWhereItIsForbidden();
    void itMayBeTheInitialState();
    void aDecisionMayChooseItsTargetWhileItIsTested();
};

void tst_HmiConditionalState::initTestCase()
{
    qRegisterMetaType<QEvent *>("QEvent*");
}

void tst_HmiConditionalState::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(HmiConditionalState::staticMetaObject),
             QStringList("signal conditionTest(QEvent* event)"));
    QCOMPARE(HmiConditionalState::staticMetaObject.superClass(), &HmiState::staticMetaObject);
}

void tst_HmiConditionalState::itOwnsOneGuardedTransitionThatAllows()
{
    HmiConditionalState state("Decision");

    const auto transitions = state.transitions();
    QCOMPARE(transitions.size(), 1);
    const auto *transition = qobject_cast<GuardedTransition *>(transitions.first());
    QVERIFY(transition);
    QCOMPARE(transition->metaObject(), &GuardedTransition::staticMetaObject);
    QCOMPARE(transition->parent(), &state);
    QCOMPARE(transition->sourceState(), &state);
    QCOMPARE(transition->allowTransitionDefault(), true);
    QCOMPARE(transition->allowTransition(), false);
    QVERIFY(!transition->targetState());
}

void tst_HmiConditionalState::eitherKindOfParentWillDo()
{
    HmiState parent("Parent");
    parent.setPopupBehavior(HmiState::PopupBehaviorOff);
    QState plainParent;

    auto *child = new HmiConditionalState("Child", &parent);
    auto *plainChild = new HmiConditionalState("PlainChild", &plainParent);

    QCOMPARE(child->parentState(), &parent);
    QCOMPARE(child->popupBehavior(), HmiState::PopupBehaviorOff);
    QCOMPARE(plainChild->parentState(), &plainParent);
    for (HmiConditionalState *state : {child, plainChild}) {
        QCOMPARE(NamedState::stateForName(state->name()), state);
        QCOMPARE(state->findChildren<GuardedTransition *>().size(), 1);
        QVERIFY(state->findChild<GuardedTransition *>()->allowTransitionDefault());
    }
}

void tst_HmiConditionalState::inLayersItLandsInTheExclusiveLayer()
{
    HmiLayeredState layers("Layers");

    auto *state = new HmiConditionalState("Decision", &layers);

    QCOMPARE(state->parentState(), layers.exclusiveState());
    QCOMPARE(state->findChild<GuardedTransition *>()->sourceState(), state);
}

void tst_HmiConditionalState::settingTheTargetIsLogged()
{
    HmiConditionalState state("Decision");
    NamedState goal("Goal");
    messages().enableDebug();

    state.setTargetState(&goal);

    const QString address = QString::number(reinterpret_cast<quintptr>(&goal), 16);
    const auto taken = messages().takeMessages();
    QCOMPARE(taken.size(), 1);
    QCOMPARE(taken.first().category, QString("vosk.hmistatemachine"));
    QCOMPARE(taken.first().toString(),
             "debug setTargetState: void HmiStateMachine::HmiConditionalState::setTargetState("
             "QAbstractState*) HmiStateMachine::NamedState(0x"
                 + address + ", name = \"Goal\")");
    QCOMPARE(state.findChild<GuardedTransition *>()->targetState(), &goal);
}

void tst_HmiConditionalState::settingNoTargetIsLogged()
{
    HmiConditionalState state("Decision");
    messages().enableDebug();

    state.setTargetState(nullptr);

    QCOMPARE(messages().take(),
             QStringList("debug setTargetState: void HmiStateMachine::HmiConditionalState::"
                         "setTargetState(QAbstractState*) QObject(0x0)"));
}

void tst_HmiConditionalState::namingTheTargetIsLogged()
{
    HmiConditionalState state("Decision");
    NamedState goal("Goal");
    messages().enableDebug();

    state.setNamedTargetState("Goal");

    QCOMPARE(messages().take(),
             QStringList("debug setNamedTargetState: void HmiStateMachine::HmiConditionalState::"
                         "setNamedTargetState(const HmiStateMachine::Identifier&) \"Goal\""));
    QCOMPARE(state.findChild<GuardedTransition *>()->targetState(), &goal);
}

void tst_HmiConditionalState::theTargetIsKnownByItsName()
{
    HmiConditionalState state("Decision");
    NamedState goal("Goal");
    NamedState other("Other");
    QCOMPARE(state.targetStateName(), QString());

    state.setNamedTargetState("Goal");
    QCOMPARE(state.targetStateName(), QString("Goal"));
    state.setTargetState(&other);

    QCOMPARE(state.targetStateName(), QString("Other"));
}

void tst_HmiConditionalState::anUnknownNameIsNoTarget()
{
    HmiConditionalState state("Decision");
    NamedState goal("Goal");

    for (const QString name : {"Unknown", ""}) {
        state.setNamedTargetState("Goal");
        state.setNamedTargetState(name);

        QCOMPARE(state.targetStateName(), QString());
        QVERIFY(!state.findChild<GuardedTransition *>()->targetState());
    }
}

void tst_HmiConditionalState::aLaterTargetReplacesTheEarlierOne()
{
    Decision flow;
    auto *other = new HmiState("Other", &flow.machine);
    flow.decision->setTargetState(other);
    flow.decision->setNamedTargetState("Goal");
    flow.start();

    flow.post("go");

    QVERIFY(flow.goal->isActive());
}

void tst_HmiConditionalState::itPassesOnAtOnce()
{
    Decision flow;
    flow.decision->setTargetState(flow.goal);
    QSignalSpy entered(flow.decision, &QState::entered);
    QVERIFY(entered.isValid());
    flow.start();

    flow.post("go");

    QVERIFY(flow.goal->isActive());
    QVERIFY(!flow.decision->isActive());
    QCOMPARE(entered.size(), 1);
    QCOMPARE(messages().take(), QStringList());
}

void tst_HmiConditionalState::eachTestIsLogged()
{
    Decision flow;
    flow.decision->setTargetState(flow.goal);
    QSignalSpy tests(flow.decision, &HmiConditionalState::conditionTest);
    QVERIFY(tests.isValid());
    flow.start();
    messages().enableDebug();

    flow.post("go");

    QCOMPARE(tests.size(), 1);
    const auto taken = messages().takeMessages();
    QCOMPARE(taken.size(), 1);
    QCOMPARE(taken.first().toString(), tested);
    QCOMPARE(taken.first().category, QString("vosk.hmistatemachine"));
}

void tst_HmiConditionalState::theTestIsAnnouncedWithItsEvent()
{
    Decision flow;
    flow.decision->setTargetState(flow.goal);
    QList<QEvent *> own;
    QList<QEvent *> announced;
    connect(flow.transition(), &GuardedTransition::transitionTest, flow.decision,
            [&](QEvent *event) { own.append(event); });
    connect(flow.decision, &HmiConditionalState::conditionTest, flow.decision, [&](QEvent *event) {
        announced.append(event);
        QCOMPARE(event->type(), QEvent::None);
    });
    flow.start();

    flow.post("go");

    QCOMPARE(announced.size(), 1);
    QCOMPARE(announced, own);
}

void tst_HmiConditionalState::itsOwnSignalTellsAfterTheLog()
{
    Decision flow;
    flow.decision->setTargetState(flow.goal);
    QStringList logged;
    connect(flow.decision, &HmiConditionalState::conditionTest, flow.decision,
            [&] { logged = messages().take(); });
    flow.start();
    messages().enableDebug();

    flow.post("go");

    QCOMPARE(logged, QStringList(tested));
}

void tst_HmiConditionalState::aReceiverMayForbidThePassage()
{
    Decision flow;
    flow.decision->setTargetState(flow.goal);
    GuardedTransition *transition = flow.transition();
    connect(flow.decision, &HmiConditionalState::conditionTest, transition,
            [transition] { transition->setAllowTransition(false); });
    QSignalSpy failures(transition, &GuardedTransition::testFailed);
    QVERIFY(failures.isValid());
    flow.start();

    flow.post("go");

    QVERIFY(flow.decision->isActive());
    QVERIFY(!flow.goal->isActive());
    QVERIFY(failures.size() > 0);
}

void tst_HmiConditionalState::theReceiverThatAnswersLastDecides()
{
    Decision flow;
    flow.decision->setTargetState(flow.goal);
    GuardedTransition *transition = flow.transition();
    answer(transition, false);
    flow.start();
    flow.post("go");
    QVERIFY(flow.decision->isActive());

    answer(transition, true);
    flow.post("anything");

    QVERIFY(flow.goal->isActive());
}

void tst_HmiConditionalState::itPassesOnLaterWhenItIsAllowed()
{
    Decision flow;
    flow.decision->setTargetState(flow.goal);
    GuardedTransition *transition = flow.transition();
    bool allowed = false;
    connect(flow.decision, &HmiConditionalState::conditionTest, transition,
            [&] { transition->setAllowTransition(allowed); });
    flow.start();
    flow.post("go");
    flow.post("anything");
    QVERIFY(flow.decision->isActive());

    allowed = true;
    QVERIFY(flow.decision->isActive());
    flow.post("anything");

    QVERIFY(flow.goal->isActive());
}

void tst_HmiConditionalState::withoutATargetItStaysWithOneWarning()
{
    Decision flow;
    flow.start();

    flow.post("go");
    flow.post("anything");

    QVERIFY(flow.decision->isActive());
    QCOMPARE(messages().take(),
             QStringList("warning eventTest: Eventless transition without a target is not taken, "
                         "source state: \"Decision\""));
}

void tst_HmiConditionalState::withoutATargetTheTestIsStillAnnounced()
{
    Decision flow;
    QSignalSpy tests(flow.decision, &HmiConditionalState::conditionTest);
    QVERIFY(tests.isValid());
    flow.start();
    flow.post("go");
    QVERIFY(tests.size() > 0);
    const int before = tests.size();

    flow.post("anything");

    QVERIFY(tests.size() > before);
    QCOMPARE(messages().take().size(), 1);
}

// Beside it, that is: events that reach the decision itself end there.
void tst_HmiConditionalState::withoutATargetTheMachineGoesOn()
{
    QStateMachine machine;
    auto *both = new QState(QState::ParallelStates, &machine);
    auto *decision = new HmiConditionalState("Decision", both);
    auto *region = new HmiState("Region", both);
    auto *before = new HmiState("Before", region);
    auto *after = new HmiState("After", region);
    region->setInitialState(before);
    (new HmiTransition("go", before))->setTargetState(after);
    startIn(machine, both);

    machine.postEvent(new HmiEvent("go", QVariant()));
    settle();

    QVERIFY(after->isActive());
    QVERIFY(decision->isActive());
    QCOMPARE(messages().take().size(), 1);
}

void tst_HmiConditionalState::aTargetThatIsSetLaterIsTaken()
{
    Decision flow;
    flow.start();
    flow.post("go");
    QCOMPARE(messages().take().size(), 1);

    flow.decision->setTargetState(flow.goal);
    flow.post("anything");

    QVERIFY(flow.goal->isActive());
}

void tst_HmiConditionalState::aDestroyedTargetIsNone()
{
    Decision flow;
    auto *gone = new HmiState("Gone", &flow.machine);
    flow.decision->setTargetState(gone);
    delete gone;
    QCOMPARE(flow.decision->targetStateName(), QString());
    flow.start();

    flow.post("go");

    QVERIFY(flow.decision->isActive());
    QCOMPARE(messages().take().size(), 1);
}

void tst_HmiConditionalState::aChainOfDecisionsPassesOnInOneGo()
{
    Decision flow;
    auto *second = new HmiConditionalState("Second", &flow.machine);
    auto *third = new HmiConditionalState("Third", &flow.machine);
    flow.decision->setTargetState(second);
    second->setNamedTargetState("Third");
    third->setTargetState(flow.goal);
    QStringList entered;
    for (NamedState *state : QList<NamedState *>{flow.decision, second, third, flow.goal}) {
        connect(state, &QState::entered, state, [&entered, state] { entered << state->name(); });
    }
    flow.start();

    flow.post("go");

    QCOMPARE(entered, QStringList({"Decision", "Second", "Third", "Goal"}));
    QVERIFY(flow.goal->isActive());
}

void tst_HmiConditionalState::aChainStopsWhereItIsForbidden()
{
    Decision flow;
    auto *second = new HmiConditionalState("Second", &flow.machine);
    flow.decision->setTargetState(second);
    second->setTargetState(flow.goal);
    answer(second->findChild<GuardedTransition *>(), false);
    flow.start();

    flow.post("go");

    QVERIFY(second->isActive());
}

void tst_HmiConditionalState::itMayBeTheInitialState()
{
    Decision flow;
    flow.decision->setTargetState(flow.goal);

    startIn(flow.machine, flow.decision);

    QVERIFY(flow.goal->isActive());
    QVERIFY(!flow.decision->isActive());
}

void tst_HmiConditionalState::aDecisionMayChooseItsTargetWhileItIsTested()
{
    Decision flow;
    connect(flow.decision, &HmiConditionalState::conditionTest, flow.decision,
            [&] { flow.decision->setNamedTargetState("Goal"); });
    flow.start();

    flow.post("go");

    QVERIFY(flow.goal->isActive());
    QCOMPARE(messages().take(), QStringList());
}

QTEST_GUILESS_MAIN(tst_HmiConditionalState)
#include "tst_hmiconditionalstate.moc"
