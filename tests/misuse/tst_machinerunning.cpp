#include "driving.h"
#include "emitter.h"
#include "goingon.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/hmiviewevent.h>

#include <QPointer>
#include <QThread>
#include <QtTest>

#include <memory>

using namespace HmiStateMachine;

/** Starting, stopping and posting at odd times, and trees that cannot run. */
class tst_MachineRunning : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void anEventBeforeTheStartIsRefused();
    void anEventAfterTheStopIsRefused();
    void startingTwiceStartsOnce();
    void stoppingWhatDoesNotRunDoesNothing();
    void stoppingInASlotEndsTheMachine();
    void startingAgainEntersTheInitialStates();
    void aRequestFromOnEntryIsTakenNext();
    void aRequestFromOnExitIsTakenAfterTheStep();
    void aRequestFromAGuardIsTakenAfterTheStep();
    void aThreadMayPost();
    void aMachineWithoutAnInitialStateDoesNotStart();
    void aRegionWithoutAnInitialStateStopsTheMachine();
    void aStateOfAnotherMachineStopsTheMachine();
    void aRunningMachineIsDeletedLaterFromASlot();
    void aMachineIsDestroyedBetweenTwoEvents();
    void aPlainQtStateMayStandAmongTheOthers();
    void aPlainTransitionMayStandAmongTheOthers();
};

namespace {

constexpr char notRunning[] =
    "QStateMachine::postEvent: cannot post event when the state machine is not running";

} // namespace

// Qt keeps the event, so that the caller still owns it.
void tst_MachineRunning::anEventBeforeTheStartIsRefused()
{
    TwoStates flow;
    goOn(flow);
    flow.machine.setInitialState(flow.source);
    HmiEvent early(QStringLiteral("go"), QVariant());
    QTest::ignoreMessage(QtWarningMsg, notRunning);

    flow.machine.postEvent(&early);
    flow.start();

    QVERIFY(flow.source->isActive());
}

void tst_MachineRunning::anEventAfterTheStopIsRefused()
{
    TwoStates flow;
    goOn(flow);
    flow.start();
    flow.machine.stop();
    settle();
    HmiEvent late(QStringLiteral("go"), QVariant());
    QTest::ignoreMessage(QtWarningMsg, notRunning);

    flow.machine.postEvent(&late);
    settle();

    QVERIFY(!flow.target->isActive());
}

void tst_MachineRunning::startingTwiceStartsOnce()
{
    TwoStates flow;
    flow.start();
    QSignalSpy entered(flow.source, &QAbstractState::entered);
    QTest::ignoreMessage(QtWarningMsg, "QStateMachine::start(): already running");

    flow.machine.start();
    settle();

    QCOMPARE(entered.size(), 0);
    QVERIFY(flow.machine.isRunning());
}

void tst_MachineRunning::stoppingWhatDoesNotRunDoesNothing()
{
    TwoStates flow;

    flow.machine.stop();
    settle();

    QVERIFY(!flow.machine.isRunning());
    flow.start();
    QVERIFY(flow.source->isActive());
}

// The state keeps that it was active: a stopped machine leaves no state.
void tst_MachineRunning::stoppingInASlotEndsTheMachine()
{
    TwoStates flow;
    goOn(flow);
    connect(flow.target, &QAbstractState::entered, &flow.machine, &QStateMachine::stop);
    flow.start();

    post(flow);

    QVERIFY(!flow.machine.isRunning());
    QVERIFY(flow.target->isActive());
}

void tst_MachineRunning::startingAgainEntersTheInitialStates()
{
    ViewFlow flow;
    HmiViewState *home = flow.view(QStringLiteral("Home"));
    flow.view(QStringLiteral("Radio"));
    flow.start(home);
    flow.request(QStringLiteral("Radio"));
    flow.machine.stop();
    settle();
    flow.take();

    flow.machine.start();
    settle();

    QCOMPARE(flow.take(), QStringList("activateView Home"));
    QCOMPARE(ViewFlow::activeView(), QString("Home"));
}

void tst_MachineRunning::aRequestFromOnEntryIsTakenNext()
{
    ViewFlow flow;
    HmiViewState *home = flow.view(QStringLiteral("Home"));
    HmiViewState *radio = flow.view(QStringLiteral("Radio"));
    flow.view(QStringLiteral("Media"));
    connect(radio, &QAbstractState::entered, radio, [&flow] {
        flow.machine.postEvent(new HmiViewEvent(QStringLiteral("Media"), QVariant()));
    });
    flow.start(home);

    flow.request(QStringLiteral("Radio"));

    QCOMPARE(flow.take(),
             QStringList({"deactivateView Home", "activateView Radio", "deactivateView Radio",
                          "activateView Media"}));
}

void tst_MachineRunning::aRequestFromOnExitIsTakenAfterTheStep()
{
    ViewFlow flow;
    HmiViewState *home = flow.view(QStringLiteral("Home"));
    flow.view(QStringLiteral("Radio"));
    flow.view(QStringLiteral("Media"));
    connect(home, &QAbstractState::exited, home, [&flow] {
        flow.machine.postEvent(new HmiViewEvent(QStringLiteral("Media"), QVariant()));
    });
    flow.start(home);

    flow.request(QStringLiteral("Radio"));

    QCOMPARE(flow.take(),
             QStringList({"deactivateView Home", "activateView Radio", "deactivateView Radio",
                          "activateView Media"}));
}

void tst_MachineRunning::aRequestFromAGuardIsTakenAfterTheStep()
{
    TwoStates flow;
    HmiTransition *first = goOn(flow);
    auto *second = new HmiTransition(QStringLiteral("back"), flow.target);
    second->setTargetState(flow.source);
    connect(first, &GuardedTransition::transitionTest, first,
            [&flow] { flow.machine.postEvent(new HmiEvent(QStringLiteral("back"), QVariant())); });
    flow.start();
    QSignalSpy entered(flow.target, &QAbstractState::entered);

    post(flow);

    QCOMPARE(entered.size(), 1);
    QVERIFY(flow.source->isActive());
}

void tst_MachineRunning::aThreadMayPost()
{
    TwoStates flow;
    goOn(flow);
    flow.start();
    std::unique_ptr<QThread> thread(QThread::create(
        [&flow] { flow.machine.postEvent(new HmiEvent(QStringLiteral("go"), QVariant())); }));

    thread->start();
    QVERIFY(thread->wait());
    settle();

    QVERIFY(flow.target->isActive());
}

void tst_MachineRunning::aMachineWithoutAnInitialStateDoesNotStart()
{
    TwoStates flow;
    QTest::ignoreMessage(
        QtWarningMsg, "QStateMachine::start: No initial state set for machine. Refusing to start.");

    flow.machine.start();
    settle();

    QVERIFY(!flow.machine.isRunning());
}

void tst_MachineRunning::aRegionWithoutAnInitialStateStopsTheMachine()
{
    TwoStates flow;
    new NamedState(QStringLiteral("inner"), flow.source);
    flow.source->setObjectName(QStringLiteral("source"));
    QTest::ignoreMessage(QtWarningMsg,
                         "Unrecoverable error detected in running state machine: Missing initial "
                         "state in compound state 'source'");

    flow.start();

    QVERIFY(!flow.machine.isRunning());
    QCOMPARE(flow.machine.error(), QStateMachine::NoInitialStateError);
}

// Names are unique in the process, and Qt looks too late whose state a target is.
void tst_MachineRunning::aStateOfAnotherMachineStopsTheMachine()
{
    TwoStates flow;
    QStateMachine other;
    auto *foreign = new NamedState(QStringLiteral("foreign"), &other);
    auto *transition = new HmiTransition(QStringLiteral("go"), flow.source);
    transition->setNamedTargetState(QStringLiteral("foreign"));
    flow.start();
    QTest::ignoreMessage(QtWarningMsg,
                         "Unrecoverable error detected in running state machine: Child mode of "
                         "state machine '' is not 'ExclusiveStates'.");

    post(flow);

    QVERIFY(foreign->isActive());
    QVERIFY(!flow.source->isActive());
    QVERIFY(!other.isRunning());
    QVERIFY(!flow.machine.isRunning());
}

void tst_MachineRunning::aRunningMachineIsDeletedLaterFromASlot()
{
    QPointer<QStateMachine> machine = new QStateMachine;
    auto *first = new HmiViewState(QStringLiteral("First"), machine);
    auto *second = new HmiViewState(QStringLiteral("Second"), machine);
    connect(second, &QAbstractState::entered, machine, &QObject::deleteLater);
    startIn(*machine, first);

    machine->postEvent(new HmiViewEvent(QStringLiteral("Second"), QVariant()));
    settle();

    QVERIFY(!machine);
    QVERIFY(!NamedState::stateForName("First"));
}

void tst_MachineRunning::aMachineIsDestroyedBetweenTwoEvents()
{
    auto machine = std::make_unique<QStateMachine>();
    auto *first = new HmiViewState(QStringLiteral("First"), machine.get());
    new HmiViewState(QStringLiteral("Second"), machine.get());
    startIn(*machine, first);
    machine->postEvent(new HmiViewEvent(QStringLiteral("Second"), QVariant()));

    machine.reset();
    settle();

    QVERIFY(!HmiViewState::activeViewState());
    QCOMPARE(NamedState::namedStates().size(), 0);
}

void tst_MachineRunning::aPlainQtStateMayStandAmongTheOthers()
{
    TwoStates flow;
    auto *plain = new QState(flow.source);
    flow.source->setInitialState(plain);
    auto *transition = new HmiTransition(QStringLiteral("go"), plain);
    transition->setTargetState(flow.target);
    flow.start();

    post(flow);

    QVERIFY(flow.target->isActive());
}

void tst_MachineRunning::aPlainTransitionMayStandAmongTheOthers()
{
    Emitter emitter;
    TwoStates flow;
    auto *plain = new QState(&flow.machine);
    plain->addTransition(&emitter, SIGNAL(plain()), flow.target);
    startIn(flow.machine, plain);

    Q_EMIT emitter.plain();
    settle();

    QVERIFY(flow.target->isActive());
}

QTEST_GUILESS_MAIN(tst_MachineRunning)
#include "tst_machinerunning.moc"
