#include "emitter.h"
#include "librarytest.h"
#include "metadescription.h"
#include "twostates.h"

#include <HmiStateMachine/hmi/hmidelayedsignaltransition.h>
#include <HmiStateMachine/hmi/hmistate.h>

#include <QElapsedTimer>
#include <QRegularExpression>
#include <QTimer>
#include <QtTest>

#include <memory>

using namespace HmiStateMachine;

namespace {

QTimer *delayOf(const HmiDelayedSignalTransition &transition)
{
    return transition.findChild<QTimer *>();
}

} // namespace

class tst_HmiDelayedSignalTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void itWaitsForTheDelayItWasGiven_data();
    void itWaitsForTheDelayItWasGiven();
    void itReactsToItsOwnSignalOnly();

    void aSignalDuringTheDelayFiresWhenTheDelayEnds();
    void aSignalAfterTheDelayFiresAtOnce();
    void severalSignalsDuringTheDelayFireOnce();
    void eachSignalAfterTheDelayFires();
    void aDelayWithoutASignalFiresNothing();
    void withoutADelayASignalOnEntryIsHeldBackAllTheSame();
    void theArgumentsOfTheWatchedSignalAreNotTold();

    void aSignalBeforeTheFirstEntryIsNotRemembered();
    void aSignalAfterTheExitIsNotRemembered();
    void leavingTheSourceDropsWhatWasHeldBack();
    void theDelayRunsFromEveryEntry();
    void whatWasHeldBackIsLostOnABlockedTransition();

    void addedToAnotherStateItFollowsThatState();
    void addedToAnotherStateDuringTheDelayItStartsAnew();
    void madeWithoutASourceItFollowsTheStateItIsAddedTo();
    void aFormerSourceMayBeDestroyed();
    void withoutAStateToFollowItNeverFires();

    void aSenderThatDiesDuringTheDelayStillFires();
    void aTransitionMayBeDestroyedDuringTheDelay();
    void aMachineStoppedDuringTheDelayStaysStopped();
    void aSignalThatCannotBeWatchedIsReported_data();
    void aSignalThatCannotBeWatchedIsReported();

    void theClockEndsTheDelay();
};

void tst_HmiDelayedSignalTransition::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(HmiDelayedSignalTransition::staticMetaObject),
             QStringList({"signal internalTrigger()", "private slot sourceEntered()",
                          "private slot sourceExited()", "private slot signalReceived()",
                          "private slot delayTriggered()"}));
}

void tst_HmiDelayedSignalTransition::itWaitsForTheDelayItWasGiven_data()
{
    QTest::addColumn<int>("delay");
    QTest::addColumn<int>("interval");

    QTest::newRow("half a second") << 500 << 500;
    QTest::newRow("no delay") << 0 << 0;
    QTest::newRow("a negative delay") << -1 << 0;
    QTest::newRow("a very negative delay") << -500 << 0;
}

void tst_HmiDelayedSignalTransition::itWaitsForTheDelayItWasGiven()
{
    QFETCH(int, delay);
    Emitter emitter;
    TwoStates flow;

    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), delay, flow.source);

    const QList<QTimer *> timers = transition.findChildren<QTimer *>();
    QCOMPARE(timers.size(), 1);
    QTEST(timers.first()->interval(), "interval");
    QVERIFY(timers.first()->isSingleShot());
    QVERIFY(!timers.first()->isActive());
    flow.start();
    QVERIFY(timers.first()->isActive());
}

void tst_HmiDelayedSignalTransition::itReactsToItsOwnSignalOnly()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    transition.setTargetState(flow.target);
    flow.start();
    QCOMPARE(transition.senderObject(), &transition);
    QCOMPARE(transition.signal(), QByteArray("2internalTrigger()"));

    Q_EMIT transition.internalTrigger();

    QVERIFY(flow.target->isActive());
}

void tst_HmiDelayedSignalTransition::aSignalDuringTheDelayFiresWhenTheDelayEnds()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    transition.setTargetState(flow.target);
    flow.start();

    Q_EMIT emitter.plain();
    QVERIFY(flow.source->isActive());

    QVERIFY(fire(delayOf(transition)));
    QVERIFY(flow.target->isActive());
}

void tst_HmiDelayedSignalTransition::aSignalAfterTheDelayFiresAtOnce()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    transition.setTargetState(flow.target);
    flow.start();
    QVERIFY(fire(delayOf(transition)));
    QVERIFY(flow.source->isActive());

    Q_EMIT emitter.plain();

    QVERIFY(flow.target->isActive());
}

void tst_HmiDelayedSignalTransition::severalSignalsDuringTheDelayFireOnce()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    flow.start();

    Q_EMIT emitter.plain();
    Q_EMIT emitter.plain();
    Q_EMIT emitter.plain();
    QCOMPARE(fired.size(), 0);

    QVERIFY(fire(delayOf(transition)));
    QCOMPARE(fired.size(), 1);
    QVERIFY(!delayOf(transition)->isActive());
}

void tst_HmiDelayedSignalTransition::eachSignalAfterTheDelayFires()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    flow.start();
    Q_EMIT emitter.plain();
    QVERIFY(fire(delayOf(transition)));
    QCOMPARE(fired.size(), 1);

    Q_EMIT emitter.plain();
    QCOMPARE(fired.size(), 2);
    Q_EMIT emitter.plain();
    QCOMPARE(fired.size(), 3);
}

void tst_HmiDelayedSignalTransition::aDelayWithoutASignalFiresNothing()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    QSignalSpy emitted(&transition, &HmiDelayedSignalTransition::internalTrigger);
    QVERIFY(emitted.isValid());
    flow.start();

    Q_EMIT emitter.other();
    QVERIFY(fire(delayOf(transition)));

    QCOMPARE(emitted.size(), 0);
}

void tst_HmiDelayedSignalTransition::withoutADelayASignalOnEntryIsHeldBackAllTheSame()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 0, flow.source);
    transition.setTargetState(flow.target);
    flow.start();

    Q_EMIT emitter.plain();
    QVERIFY(flow.source->isActive());

    QVERIFY(fire(delayOf(transition)));
    QVERIFY(flow.target->isActive());
}

void tst_HmiDelayedSignalTransition::theArgumentsOfTheWatchedSignalAreNotTold()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(withInt(int)), 500, flow.source);
    QSignalSpy told(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(told.isValid());
    flow.start();
    QVERIFY(fire(delayOf(transition)));

    Q_EMIT emitter.withInt(7);

    QCOMPARE(told.size(), 1);
    QCOMPARE(told.first().first().toList(), QVariantList());
}

void tst_HmiDelayedSignalTransition::aSignalBeforeTheFirstEntryIsNotRemembered()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    QSignalSpy emitted(&transition, &HmiDelayedSignalTransition::internalTrigger);
    QVERIFY(emitted.isValid());

    Q_EMIT emitter.plain();
    flow.start();
    QVERIFY(fire(delayOf(transition)));

    QCOMPARE(emitted.size(), 0);
}

void tst_HmiDelayedSignalTransition::aSignalAfterTheExitIsNotRemembered()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    flow.source->addTransition(&emitter, SIGNAL(other()), flow.target);
    flow.target->addTransition(&emitter, SIGNAL(other()), flow.source);
    QSignalSpy emitted(&transition, &HmiDelayedSignalTransition::internalTrigger);
    QVERIFY(emitted.isValid());
    flow.start();
    QVERIFY(fire(delayOf(transition)));

    Q_EMIT emitter.other();
    Q_EMIT emitter.plain();
    Q_EMIT emitter.other();
    QVERIFY(flow.source->isActive());
    QVERIFY(fire(delayOf(transition)));

    QCOMPARE(emitted.size(), 0);
}

void tst_HmiDelayedSignalTransition::leavingTheSourceDropsWhatWasHeldBack()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    flow.source->addTransition(&emitter, SIGNAL(other()), flow.target);
    flow.target->addTransition(&emitter, SIGNAL(other()), flow.source);
    QSignalSpy emitted(&transition, &HmiDelayedSignalTransition::internalTrigger);
    QVERIFY(emitted.isValid());
    flow.start();
    Q_EMIT emitter.plain();

    Q_EMIT emitter.other();
    QVERIFY(!delayOf(transition)->isActive());

    Q_EMIT emitter.other();
    QVERIFY(fire(delayOf(transition)));
    QCOMPARE(emitted.size(), 0);
}

void tst_HmiDelayedSignalTransition::theDelayRunsFromEveryEntry()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    transition.setTargetState(flow.target);
    flow.target->addTransition(&emitter, SIGNAL(other()), flow.source);
    flow.start();
    QVERIFY(fire(delayOf(transition)));
    Q_EMIT emitter.plain();
    QVERIFY(flow.target->isActive());

    Q_EMIT emitter.other();
    Q_EMIT emitter.plain();
    QVERIFY(flow.source->isActive());

    QVERIFY(fire(delayOf(transition)));
    QVERIFY(flow.target->isActive());
}

void tst_HmiDelayedSignalTransition::whatWasHeldBackIsLostOnABlockedTransition()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    transition.setTargetState(flow.target);
    flow.start();
    Q_EMIT emitter.plain();

    transition.setBlocked(true);
    QVERIFY(fire(delayOf(transition)));
    transition.setBlocked(false);
    settle();
    QVERIFY(flow.source->isActive());

    Q_EMIT emitter.plain();
    QVERIFY(flow.target->isActive());
}

void tst_HmiDelayedSignalTransition::addedToAnotherStateItFollowsThatState()
{
    Emitter emitter;
    QStateMachine machine;
    auto *first = new HmiState("first", &machine);
    auto *second = new HmiState("second", &machine);
    auto *transition = new HmiDelayedSignalTransition(&emitter, SIGNAL(plain()), 500, first);
    transition->setTargetState(first);
    first->addTransition(&emitter, SIGNAL(other()), second);

    second->addHmiTransition(transition);
    startIn(machine, first);
    QVERIFY(!delayOf(*transition)->isActive());
    Q_EMIT emitter.other();
    QVERIFY(second->isActive());
    QCOMPARE(transition->getSourceState(), second);

    Q_EMIT emitter.plain();
    QVERIFY(fire(delayOf(*transition)));
    QVERIFY(first->isActive());
    QVERIFY(!delayOf(*transition)->isActive());
}

void tst_HmiDelayedSignalTransition::addedToAnotherStateDuringTheDelayItStartsAnew()
{
    Emitter emitter;
    QStateMachine machine;
    auto *first = new HmiState("first", &machine);
    auto *second = new HmiState("second", &machine);
    auto *transition = new HmiDelayedSignalTransition(&emitter, SIGNAL(plain()), 500, first);
    first->addTransition(&emitter, SIGNAL(other()), second);
    QSignalSpy emitted(transition, &HmiDelayedSignalTransition::internalTrigger);
    QVERIFY(emitted.isValid());
    startIn(machine, first);
    Q_EMIT emitter.plain();

    second->addHmiTransition(transition);
    Q_EMIT emitter.other();
    QVERIFY(fire(delayOf(*transition)));

    QCOMPARE(emitted.size(), 0);
}

void tst_HmiDelayedSignalTransition::madeWithoutASourceItFollowsTheStateItIsAddedTo()
{
    Emitter emitter;
    QStateMachine machine;
    auto *first = new HmiState("first", &machine);
    auto *second = new HmiState("second", &machine);
    auto *transition = new HmiDelayedSignalTransition(&emitter, SIGNAL(plain()), 500);
    transition->setTargetState(second);

    first->addHmiTransition(transition);
    startIn(machine, first);
    Q_EMIT emitter.plain();

    QVERIFY(fire(delayOf(*transition)));
    QVERIFY(second->isActive());
}

void tst_HmiDelayedSignalTransition::aFormerSourceMayBeDestroyed()
{
    Emitter emitter;
    QStateMachine machine;
    auto *former = new HmiState("former", &machine);
    auto *second = new HmiState("second", &machine);
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, former);
    transition.setParent(nullptr);

    delete former;
    second->addHmiTransition(&transition);
    startIn(machine, second);

    QVERIFY(fire(delayOf(transition)));
}

void tst_HmiDelayedSignalTransition::withoutAStateToFollowItNeverFires()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    QSignalSpy emitted(&transition, &HmiDelayedSignalTransition::internalTrigger);
    QVERIFY(emitted.isValid());

    transition.sourceStateChange(nullptr);
    flow.start();
    Q_EMIT emitter.plain();

    QVERIFY(!delayOf(transition)->isActive());
    QCOMPARE(emitted.size(), 0);
}

void tst_HmiDelayedSignalTransition::aSenderThatDiesDuringTheDelayStillFires()
{
    auto emitter = std::make_unique<Emitter>();
    TwoStates flow;
    HmiDelayedSignalTransition transition(emitter.get(), SIGNAL(plain()), 500, flow.source);
    transition.setTargetState(flow.target);
    flow.start();
    Q_EMIT emitter->plain();

    emitter.reset();

    QVERIFY(fire(delayOf(transition)));
    QVERIFY(flow.target->isActive());
}

void tst_HmiDelayedSignalTransition::aTransitionMayBeDestroyedDuringTheDelay()
{
    Emitter emitter;
    TwoStates flow;
    auto *transition = new HmiDelayedSignalTransition(&emitter, SIGNAL(plain()), 500, flow.source);
    transition->setTargetState(flow.target);
    flow.start();
    Q_EMIT emitter.plain();

    delete transition;
    Q_EMIT emitter.plain();
    flow.machine.stop();
    settle();

    QVERIFY(flow.source->isActive());
    QVERIFY(!flow.machine.isRunning());
}

void tst_HmiDelayedSignalTransition::aMachineStoppedDuringTheDelayStaysStopped()
{
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), 500, flow.source);
    transition.setTargetState(flow.target);
    flow.start();
    Q_EMIT emitter.plain();

    flow.machine.stop();
    settle();
    QVERIFY(fire(delayOf(transition)));

    QVERIFY(!flow.target->isActive());
    QVERIFY(!flow.machine.isRunning());
}

void tst_HmiDelayedSignalTransition::aSignalThatCannotBeWatchedIsReported_data()
{
    QTest::addColumn<bool>("hasSender");
    QTest::addColumn<QRegularExpression>("warning");

    QTest::newRow("no sender") << false << QRegularExpression("^QObject::connect: Cannot connect ");
    QTest::newRow("an unknown signal")
        << true << QRegularExpression("^QObject::connect: No such signal Emitter::missing\\(\\)");
}

void tst_HmiDelayedSignalTransition::aSignalThatCannotBeWatchedIsReported()
{
    QFETCH(bool, hasSender);
    QFETCH(QRegularExpression, warning);
    Emitter emitter;
    TwoStates flow;
    QTest::ignoreMessage(QtWarningMsg, warning);

    HmiDelayedSignalTransition transition(hasSender ? &emitter : nullptr, SIGNAL(missing()), 500,
                                          flow.source);
    transition.setTargetState(flow.target);
    flow.start();

    QVERIFY(fire(delayOf(transition)));
    QVERIFY(flow.source->isActive());
}

void tst_HmiDelayedSignalTransition::theClockEndsTheDelay()
{
    constexpr int delayMs = 100;
    constexpr int atLeastMs = 90; // coarse timers stray by a twentieth
    constexpr int patienceMs = 5000;
    Emitter emitter;
    TwoStates flow;
    HmiDelayedSignalTransition transition(&emitter, SIGNAL(plain()), delayMs, flow.source);
    transition.setTargetState(flow.target);
    QElapsedTimer clock;
    clock.start();
    flow.start();

    Q_EMIT emitter.plain();

    QTRY_VERIFY_WITH_TIMEOUT(flow.target->isActive(), patienceMs);
    QVERIFY(clock.elapsed() >= atLeastMs);
}

QTEST_GUILESS_MAIN(tst_HmiDelayedSignalTransition)
#include "tst_hmidelayedsignaltransition.moc"
