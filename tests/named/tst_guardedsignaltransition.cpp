#include "emitter.h"
#include "journal.h"
#include "librarytest.h"
#include "metadescription.h"
#include "twostates.h"

#include <HmiStateMachine/named/guardedsignaltransition.h>

#include <QEvent>
#include <QtTest>

#include <memory>

using namespace HmiStateMachine;

class tst_GuardedSignalTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void bothFlagsStartOff();
    void itDeniesByDefault();
    void itFiresWhenAllowedByDefault();
    void itFiresWhenTheGuardAllows();
    void theGuardMayRefuseWhatTheDefaultAllows();
    void theLastCallOfTheGuardDecides();
    void theVerdictIsNotCarriedOver();
    void aQueuedGuardComesTooLate();

    void aFlagAnnouncesRealChangesOnly_data();
    void aFlagAnnouncesRealChangesOnly();
    void theResetBeforeATestAnnouncesNothing();
    void theDefaultLeavesTheVerdictAlone();

    void theGuardIsAskedOncePerSignal();
    void theGuardIsNotAskedAboutOtherSignals();
    void theGuardSeesTheSignalAndItsArguments();
    void aBlockedTransitionDoesNotAskItsGuard();
    void aRefusedSignalsArgumentsAreNotKept();
    void theGuardCanBeAskedDirectly();

    void aSiblingWhoseGuardRefusesLeavesTheSignalToTheOthers();
    void theGuardOfASiblingIsAskedOnceMoreForEachLowerOne();

    void withoutASenderItsGuardIsNeverAsked();
    void aGuardMayDestroyTheSender();
    void aGuardMayBeDestroyed();
};

void tst_GuardedSignalTransition::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(GuardedSignalTransition::staticMetaObject),
             QStringList({"signal allowTransitionChanged(bool arg)",
                          "signal allowTransitionDefaultChanged(bool arg)",
                          "signal transitionTest(QEvent* e)", "signal testFailed(QEvent* e)",
                          "slot setAllowTransition(bool arg)",
                          "slot setAllowTransitionDefault(bool arg)",
                          "property bool allowTransition read write allowTransitionChanged(bool)",
                          "property bool allowTransitionDefault read write "
                          "allowTransitionDefaultChanged(bool)"}));
}

void tst_GuardedSignalTransition::bothFlagsStartOff()
{
    const GuardedSignalTransition bare;
    const GuardedSignalTransition complete(nullptr, SIGNAL(plain()));

    QVERIFY(!bare.allowTransition());
    QVERIFY(!bare.allowTransitionDefault());
    QVERIFY(!complete.allowTransition());
    QVERIFY(!complete.allowTransitionDefault());
}

void tst_GuardedSignalTransition::itDeniesByDefault()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setTargetState(flow.target);
    Journal journal;
    QEvent *asked = nullptr;
    connect(&transition, &GuardedSignalTransition::transitionTest, this, [&](QEvent *e) {
        asked = e;
        journal.add("transitionTest");
    });
    connect(&transition, &GuardedSignalTransition::testFailed, this, [&](QEvent *e) {
        journal.add(e == asked ? "testFailed" : "testFailed with another event");
    });
    flow.start();

    Q_EMIT emitter.plain();

    QCOMPARE(journal.lines(), QStringList({"transitionTest", "testFailed"}));
    QVERIFY(flow.source->isActive());
}

void tst_GuardedSignalTransition::itFiresWhenAllowedByDefault()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setTargetState(flow.target);
    transition.setAllowTransitionDefault(true);
    QSignalSpy failed(&transition, &GuardedSignalTransition::testFailed);
    QVERIFY(failed.isValid());
    flow.start();

    Q_EMIT emitter.plain();

    QCOMPARE(failed.size(), 0);
    QVERIFY(flow.target->isActive());
    QVERIFY(transition.allowTransition());
}

void tst_GuardedSignalTransition::itFiresWhenTheGuardAllows()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setTargetState(flow.target);
    connect(&transition, &GuardedSignalTransition::transitionTest, &transition,
            [&transition] { transition.setAllowTransition(true); });
    flow.start();

    Q_EMIT emitter.plain();

    QVERIFY(flow.target->isActive());
}

void tst_GuardedSignalTransition::theGuardMayRefuseWhatTheDefaultAllows()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setTargetState(flow.target);
    transition.setAllowTransitionDefault(true);
    connect(&transition, &GuardedSignalTransition::transitionTest, &transition,
            [&transition] { transition.setAllowTransition(false); });
    QSignalSpy failed(&transition, &GuardedSignalTransition::testFailed);
    QVERIFY(failed.isValid());
    flow.start();

    Q_EMIT emitter.plain();

    QCOMPARE(failed.size(), 1);
    QVERIFY(flow.source->isActive());
}

void tst_GuardedSignalTransition::theLastCallOfTheGuardDecides()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setTargetState(flow.target);
    connect(&transition, &GuardedSignalTransition::transitionTest, &transition,
            [&transition] { transition.setAllowTransition(true); });
    connect(&transition, &GuardedSignalTransition::transitionTest, &transition,
            [&transition] { transition.setAllowTransition(false); });
    flow.start();

    Q_EMIT emitter.plain();

    QVERIFY(flow.source->isActive());
}

void tst_GuardedSignalTransition::theVerdictIsNotCarriedOver()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    const auto guard = connect(&transition, &GuardedSignalTransition::transitionTest, &transition,
                               [&transition] { transition.setAllowTransition(true); });
    flow.start();
    Q_EMIT emitter.plain();
    QCOMPARE(fired.size(), 1);

    disconnect(guard);
    Q_EMIT emitter.plain();

    QCOMPARE(fired.size(), 1);
    QVERIFY(!transition.allowTransition());
}

void tst_GuardedSignalTransition::aQueuedGuardComesTooLate()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setTargetState(flow.target);
    qRegisterMetaType<QEvent *>("QEvent*");
    connect(
        &transition, &GuardedSignalTransition::transitionTest, &transition,
        [&transition] { transition.setAllowTransition(true); }, Qt::QueuedConnection);
    flow.start();

    Q_EMIT emitter.plain();
    settle();

    QVERIFY(flow.source->isActive());
    QVERIFY(transition.allowTransition());
}

void tst_GuardedSignalTransition::aFlagAnnouncesRealChangesOnly_data()
{
    QTest::addColumn<QByteArray>("property");
    QTest::addColumn<QByteArray>("signal");

    QTest::newRow("verdict") << QByteArray("allowTransition")
                             << QByteArray(SIGNAL(allowTransitionChanged(bool)));
    QTest::newRow("default") << QByteArray("allowTransitionDefault")
                             << QByteArray(SIGNAL(allowTransitionDefaultChanged(bool)));
}

void tst_GuardedSignalTransition::aFlagAnnouncesRealChangesOnly()
{
    QFETCH(QByteArray, property);
    QFETCH(QByteArray, signal);
    GuardedSignalTransition transition;
    QSignalSpy changed(&transition, signal.constData());
    QVERIFY(changed.isValid());

    for (bool value : {false, true, true, false, false}) {
        QVERIFY(transition.setProperty(property.constData(), value));
        QCOMPARE(transition.property(property.constData()).toBool(), value);
    }

    QCOMPARE(changed.size(), 2);
    QCOMPARE(changed.at(0), QVariantList({true}));
    QCOMPARE(changed.at(1), QVariantList({false}));
}

void tst_GuardedSignalTransition::theResetBeforeATestAnnouncesNothing()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setAllowTransition(true);
    QSignalSpy changed(&transition, &GuardedSignalTransition::allowTransitionChanged);
    QVERIFY(changed.isValid());
    flow.start();

    Q_EMIT emitter.plain();

    QVERIFY(!transition.allowTransition());
    QCOMPARE(changed.size(), 0);
}

void tst_GuardedSignalTransition::theDefaultLeavesTheVerdictAlone()
{
    GuardedSignalTransition transition;

    transition.setAllowTransitionDefault(true);

    QVERIFY(!transition.allowTransition());
}

void tst_GuardedSignalTransition::theGuardIsAskedOncePerSignal()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    QSignalSpy asked(&transition, &GuardedSignalTransition::transitionTest);
    QVERIFY(asked.isValid());
    flow.start();

    Q_EMIT emitter.plain();
    QCOMPARE(asked.size(), 1);

    transition.setAllowTransitionDefault(true);
    Q_EMIT emitter.plain();
    QCOMPARE(asked.size(), 2);
}

void tst_GuardedSignalTransition::theGuardIsNotAskedAboutOtherSignals()
{
    Emitter watched;
    Emitter another;
    TwoStates flow;
    GuardedSignalTransition transition(&watched, SIGNAL(plain()), flow.source);
    // The machine listens to these too, so that the test of the event decides.
    HmiSignalTransition anotherSignal(&watched, SIGNAL(other()), flow.source);
    HmiSignalTransition anotherSender(&another, SIGNAL(plain()), flow.source);
    QSignalSpy asked(&transition, &GuardedSignalTransition::transitionTest);
    QVERIFY(asked.isValid());
    flow.start();

    Q_EMIT watched.other();
    Q_EMIT another.plain();

    QCOMPARE(asked.size(), 0);
}

void tst_GuardedSignalTransition::theGuardSeesTheSignalAndItsArguments()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(withInt(int)), flow.source);
    QVariantList seen;
    connect(&transition, &GuardedSignalTransition::transitionTest, this, [&](QEvent *e) {
        QCOMPARE(e->type(), QEvent::StateMachineSignal);
        const auto *event = static_cast<QStateMachine::SignalEvent *>(e);
        QCOMPARE(event->sender(), &emitter);
        seen = event->arguments();
    });
    flow.start();

    Q_EMIT emitter.withInt(7);

    QCOMPARE(seen, QVariantList({7}));
}

void tst_GuardedSignalTransition::aBlockedTransitionDoesNotAskItsGuard()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    transition.setAllowTransitionDefault(true);
    transition.setBlocked(true);
    QSignalSpy asked(&transition, &GuardedSignalTransition::transitionTest);
    QVERIFY(asked.isValid());
    flow.start();

    Q_EMIT emitter.plain();

    QCOMPARE(asked.size(), 0);
}

void tst_GuardedSignalTransition::aRefusedSignalsArgumentsAreNotKept()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(withInt(int)), flow.source);
    transition.setAllowTransitionDefault(true);
    flow.start();
    Q_EMIT emitter.withInt(7);
    transition.setAllowTransitionDefault(false);
    Q_EMIT emitter.withInt(8);
    QSignalSpy told(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(told.isValid());

    TriggerFunctor tell(&transition);
    tell();

    QCOMPARE(told.size(), 1);
    QCOMPARE(told.first().first().toList(), QVariantList({7}));
}

void tst_GuardedSignalTransition::theGuardCanBeAskedDirectly()
{
    GuardedSignalTransition transition;
    QSignalSpy failed(&transition, &GuardedSignalTransition::testFailed);
    QVERIFY(failed.isValid());
    QEvent event(QEvent::User);

    QVERIFY(!transition.testTransition(&event));
    transition.setAllowTransitionDefault(true);
    QVERIFY(transition.testTransition(&event));

    QCOMPARE(failed.size(), 1);
}

void tst_GuardedSignalTransition::aSiblingWhoseGuardRefusesLeavesTheSignalToTheOthers()
{
    Emitter emitter;
    TwoRegions regions;
    HmiSignalTransition low(&emitter, SIGNAL(plain()), regions.left);
    GuardedSignalTransition high(&emitter, SIGNAL(plain()), regions.right);
    QVERIFY(low.makeParallelExclusive(1));
    QVERIFY(high.makeParallelExclusive(2));
    QSignalSpy lowFired(&low, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(lowFired.isValid());
    regions.start();

    Q_EMIT emitter.plain();
    QCOMPARE(lowFired.size(), 1);

    high.setAllowTransitionDefault(true);
    Q_EMIT emitter.plain();
    QCOMPARE(lowFired.size(), 1);
}

void tst_GuardedSignalTransition::theGuardOfASiblingIsAskedOnceMoreForEachLowerOne()
{
    Emitter emitter;
    TwoRegions regions;
    auto *middle = new NamedState("middle", regions.both);
    HmiSignalTransition lowest(&emitter, SIGNAL(plain()), regions.left);
    HmiSignalTransition low(&emitter, SIGNAL(plain()), middle);
    GuardedSignalTransition high(&emitter, SIGNAL(plain()), regions.right);
    QVERIFY(lowest.makeParallelExclusive(1));
    QVERIFY(low.makeParallelExclusive(2));
    QVERIFY(high.makeParallelExclusive(3));
    high.setAllowTransitionDefault(true);
    QSignalSpy asked(&high, &GuardedSignalTransition::transitionTest);
    QVERIFY(asked.isValid());
    regions.start();

    Q_EMIT emitter.plain();

    QCOMPARE(asked.size(), 3);
}

void tst_GuardedSignalTransition::withoutASenderItsGuardIsNeverAsked()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition bare(flow.source);
    GuardedSignalTransition senderless(nullptr, SIGNAL(plain()), flow.source);
    QSignalSpy bareAsked(&bare, &GuardedSignalTransition::transitionTest);
    QSignalSpy senderlessAsked(&senderless, &GuardedSignalTransition::transitionTest);
    QVERIFY(bareAsked.isValid() && senderlessAsked.isValid());
    flow.start();

    Q_EMIT emitter.plain();

    QCOMPARE(bareAsked.size(), 0);
    QCOMPARE(senderlessAsked.size(), 0);
}

void tst_GuardedSignalTransition::aGuardMayDestroyTheSender()
{
    auto emitter = std::make_unique<Emitter>();
    TwoStates flow;
    GuardedSignalTransition transition(emitter.get(), SIGNAL(plain()), flow.source);
    transition.setTargetState(flow.target);
    transition.setAllowTransitionDefault(true);
    connect(&transition, &GuardedSignalTransition::transitionTest, this,
            [&emitter] { emitter.reset(); });
    flow.start();

    Q_EMIT emitter->plain();
    flow.machine.stop();
    settle();

    QVERIFY(flow.target->isActive());
    QVERIFY(!transition.senderObject());
    QVERIFY(!flow.machine.isRunning());
}

void tst_GuardedSignalTransition::aGuardMayBeDestroyed()
{
    Emitter emitter;
    TwoStates flow;
    GuardedSignalTransition transition(&emitter, SIGNAL(plain()), flow.source);
    auto guard = std::make_unique<QObject>();
    connect(&transition, &GuardedSignalTransition::transitionTest, guard.get(),
            [&transition] { transition.setAllowTransition(true); });
    flow.start();

    guard.reset();
    Q_EMIT emitter.plain();

    QVERIFY(!transition.allowTransition());
}

QTEST_GUILESS_MAIN(tst_GuardedSignalTransition)
#include "tst_guardedsignaltransition.moc"
