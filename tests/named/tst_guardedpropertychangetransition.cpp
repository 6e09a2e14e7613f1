#include "emitter.h"
#include "librarytest.h"
#include "metadescription.h"
#include "twostates.h"

#include <HmiStateMachine/named/guardedpropertychangetransition.h>

#include <QtTest>

#include <memory>

using namespace HmiStateMachine;

class tst_GuardedPropertyChangeTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void itAllowsByDefault();
    void aChangeFiresByItsValues_data();
    void aChangeFiresByItsValues();
    void thePreviousValueIsRightOnEveryEntryOfTheSource_data();
    void thePreviousValueIsRightOnEveryEntryOfTheSource();
    void everyNotificationFiresWhenAnyValueWillDo();
    void aChangeWhileTheSourceIsInactiveIsRecorded();
    void changesThatAreQueuedAreJudgedByTheLastValue();
    void aNewValueIsTestedAlone_data();
    void aNewValueIsTestedAlone();

    void theGuardIsAskedBeforeTheValues();
    void aRefusingGuardStopsAChangeThatMatches_data();
    void aRefusingGuardStopsAChangeThatMatches();
    void theValuesAreReadAfterTheGuard();
    void aGuardMayDestroyTheSender();

    void aPropertyThatCannotBeWatchedIsReported_data();
    void aPropertyThatCannotBeWatchedIsReported();
    void aPropertyThatCannotBeWatchedNeverFires_data();
    void aPropertyThatCannotBeWatchedNeverFires();
    void theReportIsOffWithWarnings();
    void withoutASenderItNeverFires();
    void aSenderThatIsTakenAwayNeverFires();
    void aSenderDestroyedWhileTheMachineRunsIsForgotten();
    void aTransitionMayBeDestroyedBeforeItsSender();
};

void tst_GuardedPropertyChangeTransition::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(GuardedPropertyChangeTransition::staticMetaObject),
             QStringList({"private slot propertyChanged()"}));
}

void tst_GuardedPropertyChangeTransition::itAllowsByDefault()
{
    Emitter emitter;
    TwoStates flow;

    const GuardedPropertyChangeTransition transition(&emitter, "value", {}, QVariant(),
                                                     flow.source);
    const GuardedPropertyChangeTransition senderless(nullptr, "value", {}, QVariant());

    QVERIFY(transition.allowTransitionDefault());
    QVERIFY(!transition.allowTransition());
    QVERIFY(senderless.allowTransitionDefault());
}

void tst_GuardedPropertyChangeTransition::aChangeFiresByItsValues_data()
{
    QTest::addColumn<bool>("machineListensFirst");
    QTest::addColumn<QVariantList>("fromValues");
    QTest::addColumn<QVariant>("toValue");
    QTest::addColumn<int>("before");
    QTest::addColumn<int>("after");
    QTest::addColumn<bool>("fires");

    const QVariantList any;
    const QVariant notFrom;
    for (bool machineFirst : {false, true}) {
        const auto row = [machineFirst](const char *tag) -> QTestData & {
            return QTest::addRow("%s, %s", tag,
                                 machineFirst ? "the machine told first" : "recorded first")
                << machineFirst;
        };
        row("0 to 1: 0, 1") << QVariantList({0}) << QVariant(1) << 0 << 1 << true;
        row("0 to 1: 2, 1") << QVariantList({0}) << QVariant(1) << 2 << 1 << false;
        row("0 to 1: 0, 2") << QVariantList({0}) << QVariant(1) << 0 << 2 << false;
        row("0 to 1: 1, 0") << QVariantList({0}) << QVariant(1) << 1 << 0 << false;
        row("any: 0, 1") << any << notFrom << 0 << 1 << true;
        row("any to 1: 0, 1") << any << QVariant(1) << 0 << 1 << true;
        row("any to 1: 0, 2") << any << QVariant(1) << 0 << 2 << false;
        row("1 or 2: 1, 3") << QVariantList({1, 2}) << notFrom << 1 << 3 << true;
        row("1 or 2: 2, 3") << QVariantList({1, 2}) << notFrom << 2 << 3 << true;
        row("1 or 2: 1, 2") << QVariantList({1, 2}) << notFrom << 1 << 2 << false;
        row("1 or 2: 3, 4") << QVariantList({1, 2}) << notFrom << 3 << 4 << false;
        row("texts") << QVariantList({"0"}) << QVariant("1") << 0 << 1 << true;
        row("floating point") << QVariantList({0.0}) << QVariant(1.0) << 0 << 1 << true;
        row("truth values") << QVariantList({false}) << QVariant(true) << 0 << 1 << true;
        row("a text that is no number, from")
            << QVariantList({"nil"}) << QVariant(1) << 5 << 1 << false;
        row("a text that is no number, to")
            << QVariantList({0}) << QVariant("one") << 0 << 1 << false;
        row("a text among the from values") << QVariantList({1, "2"}) << notFrom << 1 << 2 << false;
    }
}

void tst_GuardedPropertyChangeTransition::aChangeFiresByItsValues()
{
    QFETCH(bool, machineListensFirst);
    QFETCH(QVariantList, fromValues);
    QFETCH(QVariant, toValue);
    QFETCH(int, before);
    QFETCH(int, after);
    Emitter emitter;
    emitter.setValue(before);
    TwoStates flow;
    // The machine's one connection to the signal serves all transitions on it.
    HmiSignalTransition listening(&emitter, SIGNAL(valueChanged()), flow.source);
    listening.setBlocked(true);
    if (machineListensFirst) {
        flow.start();
    }
    GuardedPropertyChangeTransition transition(&emitter, "value", fromValues, toValue, flow.source);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    if (!machineListensFirst) {
        flow.start();
    }

    emitter.setValue(after);

    QTEST(fired.size() == 1, "fires");
}

void tst_GuardedPropertyChangeTransition::thePreviousValueIsRightOnEveryEntryOfTheSource_data()
{
    QTest::addColumn<bool>("restart");

    QTest::newRow("entered again") << false;
    QTest::newRow("machine started again") << true;
}

void tst_GuardedPropertyChangeTransition::thePreviousValueIsRightOnEveryEntryOfTheSource()
{
    QFETCH(bool, restart);
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyChangeTransition transition(&emitter, "value", {0}, 1, flow.source);
    transition.setTargetState(flow.target);
    flow.target->addTransition(&emitter, SIGNAL(plain()), flow.source);
    flow.start();
    QStringList moves;
    const auto note = [&] {
        moves.append(flow.machine.configuration().contains(flow.target) ? "moved" : "stayed");
    };

    for (int entry = 1; entry <= 3; ++entry) {
        emitter.setValue(2);
        emitter.setValue(1);
        note();
        emitter.setValue(0);
        emitter.setValue(1);
        note();
        if (restart) {
            park(flow.machine);
            flow.start();
        }
        Q_EMIT emitter.plain();
    }

    QCOMPARE(moves, QStringList({"stayed", "moved", "stayed", "moved", "stayed", "moved"}));
}

void tst_GuardedPropertyChangeTransition::everyNotificationFiresWhenAnyValueWillDo()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyChangeTransition transition(&emitter, "value", {}, QVariant(), flow.source);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    flow.start();

    emitter.setValue(1);
    emitter.setValue(2);
    Q_EMIT emitter.valueChanged(); // without a change

    QCOMPARE(fired.size(), 3);
}

void tst_GuardedPropertyChangeTransition::aChangeWhileTheSourceIsInactiveIsRecorded()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyChangeTransition transition(&emitter, "value", {5}, 1, flow.target);
    transition.setTargetState(flow.source);
    flow.source->addTransition(&emitter, SIGNAL(plain()), flow.target);
    flow.start();
    emitter.setValue(5);
    Q_EMIT emitter.plain();
    QVERIFY(flow.target->isActive());

    emitter.setValue(1);

    QVERIFY(flow.source->isActive());
}

void tst_GuardedPropertyChangeTransition::changesThatAreQueuedAreJudgedByTheLastValue()
{
    Emitter emitter;
    TwoStates flow;
    flow.source->addTransition(&emitter, SIGNAL(plain()), flow.target);
    GuardedPropertyChangeTransition fromTheStart(&emitter, "value", {0}, QVariant(), flow.target);
    GuardedPropertyChangeTransition throughOne(&emitter, "value", {1}, 2, flow.target);
    QSignalSpy firedFromTheStart(&fromTheStart, &HmiSignalTransition::triggeredWithArguments);
    QSignalSpy firedThroughOne(&throughOne, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(firedFromTheStart.isValid() && firedThroughOne.isValid());
    // The machine is busy entering the target here, so it keeps both signals for later.
    connect(flow.target, &QState::entered, this, [&emitter] {
        emitter.setValue(1);
        emitter.setValue(2);
    });
    flow.start();

    Q_EMIT emitter.plain();
    settle();

    QCOMPARE(firedFromTheStart.size(), 0);
    QCOMPARE(firedThroughOne.size(), 2);
}

void tst_GuardedPropertyChangeTransition::aNewValueIsTestedAlone_data()
{
    QTest::addColumn<QVariantList>("fromValues");
    QTest::addColumn<QVariant>("toValue");
    QTest::addColumn<QVariant>("value");
    QTest::addColumn<bool>("accepted");

    const QVariantList any;
    const QVariant notFrom;
    QTest::newRow("the to value") << any << QVariant(1) << QVariant(1) << true;
    QTest::newRow("another value") << any << QVariant(1) << QVariant(2) << false;
    QTest::newRow("the to value as text") << any << QVariant(1) << QVariant("1") << true;
    QTest::newRow("the to value among the from values")
        << QVariantList({1}) << QVariant(1) << QVariant(1) << true;
    QTest::newRow("no from value") << QVariantList({1, 2}) << notFrom << QVariant(3) << true;
    QTest::newRow("a from value") << QVariantList({1, 2}) << notFrom << QVariant(2) << false;
    QTest::newRow("a from value as text")
        << QVariantList({1, 2}) << notFrom << QVariant("2") << false;
    QTest::newRow("any value") << any << notFrom << QVariant(1) << true;
    QTest::newRow("no value") << any << notFrom << QVariant() << true;
    QTest::newRow("no value for the to value") << any << QVariant(1) << QVariant() << false;
}

void tst_GuardedPropertyChangeTransition::aNewValueIsTestedAlone()
{
    QFETCH(QVariantList, fromValues);
    QFETCH(QVariant, toValue);
    QFETCH(QVariant, value);
    Emitter emitter;

    const GuardedPropertyChangeTransition transition(&emitter, "value", fromValues, toValue);

    QTEST(transition.valueTest(value), "accepted");
}

void tst_GuardedPropertyChangeTransition::theGuardIsAskedBeforeTheValues()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyChangeTransition transition(&emitter, "value", {5}, 6, flow.source);
    QSignalSpy asked(&transition, &GuardedSignalTransition::transitionTest);
    QSignalSpy failed(&transition, &GuardedSignalTransition::testFailed);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(asked.isValid() && failed.isValid() && fired.isValid());
    flow.start();

    emitter.setValue(1);

    QCOMPARE(asked.size(), 1);
    QCOMPARE(failed.size(), 0);
    QCOMPARE(fired.size(), 0);
}

void tst_GuardedPropertyChangeTransition::aRefusingGuardStopsAChangeThatMatches_data()
{
    QTest::addColumn<bool>("byDefault");

    QTest::newRow("by default") << true;
    QTest::newRow("for this change") << false;
}

void tst_GuardedPropertyChangeTransition::aRefusingGuardStopsAChangeThatMatches()
{
    QFETCH(bool, byDefault);
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyChangeTransition transition(&emitter, "value", {0}, 1, flow.source);
    transition.setTargetState(flow.target);
    if (byDefault) {
        transition.setAllowTransitionDefault(false);
    } else {
        connect(&transition, &GuardedSignalTransition::transitionTest, &transition,
                [&transition] { transition.setAllowTransition(false); });
    }
    QSignalSpy failed(&transition, &GuardedSignalTransition::testFailed);
    QVERIFY(failed.isValid());
    flow.start();

    emitter.setValue(1);

    QCOMPARE(failed.size(), 1);
    QVERIFY(flow.source->isActive());
}

void tst_GuardedPropertyChangeTransition::theValuesAreReadAfterTheGuard()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyChangeTransition transition(&emitter, "value", {1}, 2, flow.source);
    QSignalSpy fired(&transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(fired.isValid());
    connect(&transition, &GuardedSignalTransition::transitionTest, this,
            [&emitter] { emitter.setValue(2); });
    flow.start();

    emitter.setValue(1);

    // For the signal of the first change and for that of the guard's own.
    QCOMPARE(fired.size(), 2);
}

void tst_GuardedPropertyChangeTransition::aGuardMayDestroyTheSender()
{
    auto emitter = std::make_unique<Emitter>();
    TwoStates flow;
    GuardedPropertyChangeTransition transition(emitter.get(), "value", {}, QVariant(), flow.source);
    transition.setTargetState(flow.target);
    connect(&transition, &GuardedSignalTransition::transitionTest, this,
            [&emitter] { emitter.reset(); });
    flow.start();

    emitter->setValue(1);

    QVERIFY(!transition.senderObject());
    QVERIFY(flow.source->isActive());
}

void tst_GuardedPropertyChangeTransition::aPropertyThatCannotBeWatchedIsReported_data()
{
    QTest::addColumn<QByteArray>("property");
    QTest::addColumn<bool>("namedSource");
    QTest::addColumn<QString>("warning");

    const QString prefix = "warning GuardedPropertyChangeTransition: ";
    const QString unknown = prefix + "The sender object does not contain the following property: ";
    const QString silent = prefix + "The following property does not provide a notify signal: ";
    QTest::newRow("unknown") << QByteArray("missing") << true
                             << unknown + "\"missing\" %1 \"source\"";
    QTest::newRow("dynamic") << QByteArray("added") << true << unknown + "\"added\" %1 \"source\"";
    QTest::newRow("unknown, no named source")
        << QByteArray("missing") << false << unknown + "\"missing\" %1 \"\"";
    QTest::newRow("without a notify signal")
        << QByteArray("silent") << true << silent + "\"silent\" %1 \"source\"";
    QTest::newRow("without a notify signal, no named source")
        << QByteArray("silent") << false << silent + "\"silent\" %1 \"\"";
}

void tst_GuardedPropertyChangeTransition::aPropertyThatCannotBeWatchedIsReported()
{
    QFETCH(QByteArray, property);
    QFETCH(bool, namedSource);
    QFETCH(QString, warning);
    Emitter emitter;
    emitter.setObjectName("wheel");
    emitter.setProperty("added", 1);
    TwoStates flow;
    QState plain;
    QString sender;
    QDebug(&sender).nospace() << &emitter;

    const GuardedPropertyChangeTransition transition(&emitter, property.constData(), {}, QVariant(),
                                                     namedSource ? flow.source : &plain);

    QCOMPARE(messages().take(), QStringList({warning.arg(sender)}));
}

void tst_GuardedPropertyChangeTransition::aPropertyThatCannotBeWatchedNeverFires_data()
{
    QTest::addColumn<QByteArray>("property");

    QTest::newRow("unknown") << QByteArray("missing");
    QTest::newRow("without a notify signal") << QByteArray("silent");
}

void tst_GuardedPropertyChangeTransition::aPropertyThatCannotBeWatchedNeverFires()
{
    QFETCH(QByteArray, property);
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyChangeTransition transition(&emitter, property.constData(), {}, QVariant(),
                                               flow.source);
    transition.setTargetState(flow.target);
    QCOMPARE(messages().take().size(), 1);
    QVERIFY(transition.allowTransitionDefault());
    flow.start();

    emitter.setValue(1);

    QCOMPARE(transition.signal(), QByteArray());
    QVERIFY(flow.source->isActive());
    QCOMPARE(messages().take(), QStringList());
}

void tst_GuardedPropertyChangeTransition::theReportIsOffWithWarnings()
{
    Emitter emitter;
    messages().disableWarnings();

    const GuardedPropertyChangeTransition unknown(&emitter, "missing", {}, QVariant());
    const GuardedPropertyChangeTransition silent(&emitter, "silent", {}, QVariant());

    QCOMPARE(messages().take(), QStringList());
}

void tst_GuardedPropertyChangeTransition::withoutASenderItNeverFires()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyChangeTransition transition(nullptr, "value", {}, QVariant(), flow.source);
    transition.setTargetState(flow.target);
    flow.start();

    emitter.setValue(1);

    QVERIFY(flow.source->isActive());
    QCOMPARE(messages().take(), QStringList());
}

void tst_GuardedPropertyChangeTransition::aSenderThatIsTakenAwayNeverFires()
{
    Emitter emitter;
    TwoStates flow;
    GuardedPropertyChangeTransition transition(&emitter, "value", {}, QVariant(), flow.source);
    transition.setTargetState(flow.target);
    flow.start();

    transition.setSenderObject(nullptr);
    emitter.setValue(1);

    QVERIFY(flow.source->isActive());
}

void tst_GuardedPropertyChangeTransition::aSenderDestroyedWhileTheMachineRunsIsForgotten()
{
    Emitter emitter;
    auto dying = std::make_unique<Emitter>();
    TwoStates flow;
    flow.source->addTransition(&emitter, SIGNAL(plain()), flow.target);
    GuardedPropertyChangeTransition transition(dying.get(), "value", {}, QVariant(), flow.target);
    transition.setTargetState(flow.source);
    // The machine is busy entering the target here, so it keeps the signal for later.
    connect(flow.target, &QState::entered, this, [&dying] {
        dying->setValue(1);
        dying.reset();
    });
    flow.start();

    Q_EMIT emitter.plain();
    settle();

    QVERIFY(!transition.senderObject());
    QVERIFY(flow.target->isActive());
    flow.machine.stop();
    settle();
    QVERIFY(!flow.machine.isRunning());
}

void tst_GuardedPropertyChangeTransition::aTransitionMayBeDestroyedBeforeItsSender()
{
    Emitter emitter;
    TwoStates flow;
    auto *transition =
        new GuardedPropertyChangeTransition(&emitter, "value", {}, QVariant(), flow.source);
    transition->setTargetState(flow.target);
    flow.start();

    delete transition;
    emitter.setValue(1);

    QVERIFY(flow.source->isActive());
}

QTEST_GUILESS_MAIN(tst_GuardedPropertyChangeTransition)
#include "tst_guardedpropertychangetransition.moc"
