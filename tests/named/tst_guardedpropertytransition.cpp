#include "emitter.h"
#include "librarytest.h"
#include "metadescription.h"
#include "twostates.h"

#include <HmiStateMachine/named/guardedpropertytransition.h>

#include <QtTest>

#include <memory>

using namespace HmiStateMachine;

class tst_GuardedPropertyTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void theNotifySignalIsFoundByThePropertysName_data();
    void theNotifySignalIsFoundByThePropertysName();
    void aNullNameIsNoProperty();
    void itWatchesTheNotifySignal();
    void itDeniesByDefault();
    void aChangeFiresWhenTheGuardAllows();
    void itTellsTheArgumentsOfTheNotifySignal();
    void otherSignalsOfTheSenderFireNothing();
    void theGuardIsAskedOncePerChange();
    void withoutANotifySignalItNeverFires_data();
    void withoutANotifySignalItNeverFires();
    void withoutASenderItNeverFires();
    void itCanBeBoundLater();
    void itIsNoSiblingOfASignalTransitionOnTheSameSignal();
    void propertyTransitionsOnTheSameSignalAreSiblings();
    void aSenderDestroyedWhileTheMachineRunsIsForgotten();
};

void tst_GuardedPropertyTransition::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(GuardedPropertyTransition::staticMetaObject), QStringList());
}

void tst_GuardedPropertyTransition::theNotifySignalIsFoundByThePropertysName_data()
{
    QTest::addColumn<bool>("hasObject");
    QTest::addColumn<QByteArray>("property");
    QTest::addColumn<QByteArray>("signal");

    QTest::newRow("with a notify signal")
        << true << QByteArray("value") << QByteArray("valueChanged()");
    QTest::newRow("inherited") << true << QByteArray("objectName")
                               << QByteArray("objectNameChanged(QString)");
    QTest::newRow("without a notify signal") << true << QByteArray("silent") << QByteArray();
    QTest::newRow("unknown") << true << QByteArray("missing") << QByteArray();
    QTest::newRow("an empty name") << true << QByteArray("") << QByteArray();
    QTest::newRow("no object") << false << QByteArray("value") << QByteArray();
}

void tst_GuardedPropertyTransition::theNotifySignalIsFoundByThePropertysName()
{
    QFETCH(bool, hasObject);
    QFETCH(QByteArray, property);
    Emitter emitter;

    QTEST(extractNotifySignal(hasObject ? &emitter : nullptr, property.constData()), "signal");
}

void tst_GuardedPropertyTransition::aNullNameIsNoProperty()
{
    Emitter emitter;
    TwoStates flow;

    const GuardedPropertyTransition transition(&emitter, nullptr, flow.source);

    QCOMPARE(extractNotifySignal(&emitter, nullptr), QByteArray());
    QCOMPARE(transition.signal(), QByteArray());
}

void tst_GuardedPropertyTransition::itWatchesTheNotifySignal()
{
    Emitter emitter;
    TwoStates flow;

    const GuardedPropertyTransition transition(&emitter, "value", flow.source);

    QCOMPARE(transition.senderObject(), &emitter);
    QCOMPARE(transition.signal(), QByteArray("valueChanged()"));
    QCOMPARE(transition.getSourceState(), flow.source);
}

void tst_GuardedPropertyTransition::itDeniesByDefault()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyTransition transition(&emitter, "value", flow.source);
    transition.setTargetState(flow.target);
    QSignalSpy failed(&transition, &GuardedSignalTransition::testFailed);
    QVERIFY(failed.isValid());
    flow.start();

    emitter.setValue(1);

    QCOMPARE(failed.size(), 1);
    QVERIFY(!transition.allowTransitionDefault());
    QVERIFY(flow.source->isActive());
}

void tst_GuardedPropertyTransition::aChangeFiresWhenTheGuardAllows()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyTransition transition(&emitter, "value", flow.source);
    transition.setTargetState(flow.target);
    connect(&transition, &GuardedSignalTransition::transitionTest, &transition,
            [&] { transition.setAllowTransition(emitter.value() == 2); });
    flow.start();

    emitter.setValue(1);
    QVERIFY(flow.source->isActive());

    emitter.setValue(2);
    QVERIFY(flow.target->isActive());
}

void tst_GuardedPropertyTransition::itTellsTheArgumentsOfTheNotifySignal()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyTransition transition(&emitter, "objectName", flow.source);
    transition.setAllowTransitionDefault(true);
    QSignalSpy told(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(told.isValid());
    flow.start();

    emitter.setObjectName("wheel");

    QCOMPARE(told.size(), 1);
    QCOMPARE(told.first().first().toList(), QVariantList({"wheel"}));
}

void tst_GuardedPropertyTransition::otherSignalsOfTheSenderFireNothing()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyTransition transition(&emitter, "value", flow.source);
    transition.setAllowTransitionDefault(true);
    HmiSignalTransition listening(&emitter, SIGNAL(plain()), flow.source);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    flow.start();

    Q_EMIT emitter.plain();

    QCOMPARE(fired.size(), 0);
}

void tst_GuardedPropertyTransition::theGuardIsAskedOncePerChange()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyTransition transition(&emitter, "value", flow.source);
    transition.setAllowTransitionDefault(true);
    QSignalSpy asked(&transition, &GuardedSignalTransition::transitionTest);
    QVERIFY(asked.isValid());
    flow.start();

    emitter.setValue(1);

    QCOMPARE(asked.size(), 1);
}

void tst_GuardedPropertyTransition::withoutANotifySignalItNeverFires_data()
{
    QTest::addColumn<QByteArray>("property");

    QTest::newRow("a silent property") << QByteArray("silent");
    QTest::newRow("an unknown property") << QByteArray("missing");
}

void tst_GuardedPropertyTransition::withoutANotifySignalItNeverFires()
{
    QFETCH(QByteArray, property);
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyTransition transition(&emitter, property.constData(), flow.source);
    transition.setAllowTransitionDefault(true);
    transition.setTargetState(flow.target);
    flow.start();

    emitter.setValue(1);

    QCOMPARE(transition.signal(), QByteArray());
    QVERIFY(flow.source->isActive());
}

void tst_GuardedPropertyTransition::withoutASenderItNeverFires()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyTransition transition(nullptr, "value", flow.source);
    transition.setAllowTransitionDefault(true);
    transition.setTargetState(flow.target);
    flow.start();

    emitter.setValue(1);

    QVERIFY(!transition.senderObject());
    QVERIFY(flow.source->isActive());
}

void tst_GuardedPropertyTransition::itCanBeBoundLater()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyTransition transition(flow.source);
    transition.setAllowTransitionDefault(true);
    transition.setTargetState(flow.target);
    flow.start();

    transition.setSenderObject(&emitter);
    transition.setSignal(extractNotifySignal(&emitter, "value"));
    emitter.setValue(1);

    QVERIFY(flow.target->isActive());
}

void tst_GuardedPropertyTransition::itIsNoSiblingOfASignalTransitionOnTheSameSignal()
{
    Emitter emitter;
    TwoRegions regions;
    GuardedPropertyTransition low(&emitter, "value", regions.left);
    HmiSignalTransition high(&emitter, SIGNAL(valueChanged()), regions.right);
    low.setAllowTransitionDefault(true);
    QVERIFY(low.makeParallelExclusive(1));
    QVERIFY(high.makeParallelExclusive(2));
    QSignalSpy fired(&low, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    regions.start();

    emitter.setValue(1);

    QCOMPARE(fired.size(), 1);
}

void tst_GuardedPropertyTransition::propertyTransitionsOnTheSameSignalAreSiblings()
{
    Emitter emitter;
    TwoRegions regions;
    GuardedPropertyTransition low(&emitter, "value", regions.left);
    GuardedPropertyTransition high(&emitter, "value", regions.right);
    low.setAllowTransitionDefault(true);
    high.setAllowTransitionDefault(true);
    QVERIFY(low.makeParallelExclusive(1));
    QVERIFY(!high.makeParallelExclusive(1));
    QVERIFY(high.makeParallelExclusive(2));
    QSignalSpy lowFired(&low, &HmiSignalTransition::triggeredWithArguments);
    QSignalSpy highFired(&high, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(lowFired.isValid() && highFired.isValid());
    regions.start();

    emitter.setValue(1);

    QCOMPARE(lowFired.size(), 0);
    QCOMPARE(highFired.size(), 1);
}

void tst_GuardedPropertyTransition::aSenderDestroyedWhileTheMachineRunsIsForgotten()
{
    auto emitter = std::make_unique<Emitter>();
    TwoStates flow;
    GuardedPropertyTransition transition(emitter.get(), "value", flow.source);
    flow.start();

    emitter.reset();

    QVERIFY(!transition.senderObject());
    flow.machine.stop();
    settle();
    QVERIFY(!flow.machine.isRunning());
}

QTEST_GUILESS_MAIN(tst_GuardedPropertyTransition)
#include "tst_guardedpropertytransition.moc"
