#include "emitter.h"
#include "journal.h"
#include "librarytest.h"
#include "metadescription.h"
#include "twostates.h"

#include <HmiStateMachine/hmi/hmistate.h>
#include <HmiStateMachine/named/keysignaltransition.h>

#include <QtTest>

#include <memory>

using namespace HmiStateMachine;

/** Reports its keys in every way that an application might. */
class KeySource : public QObject
{
    Q_OBJECT

Q_SIGNALS:
    void numbers(int key, int status);
    void three(int key, int status, const QString &text);
    void wide(qlonglong key, uint status);
    void doubles(double key, double status);
    void textKey(const QString &key, int status);
    void textStatus(int key, const QString &status);
    void switches(bool key, bool status);
    void objectKey(QObject *key, int status);
    void listKey(const QVariantList &key, int status);
    void keyOnly(int key);
    void nothing();
};

using Press = void (*)(KeySource &);
Q_DECLARE_METATYPE(Press)

namespace {

/** The key and the status that the transition holds as the last ones. */
QVariantList lastKeyAndStatus(KeySignalTransition &transition)
{
    QSignalSpy told(&transition, &KeySignalTransition::keyTransitionTriggered);
    QMetaObject::invokeMethod(&transition, "onTransitionTriggered");
    return told.value(0);
}

/** The lowest priority from 1 on that is free for transitions of this kind. */
int firstFreePriority(QObject *sender, int key, int status)
{
    KeySignalTransition probe(sender, SIGNAL(key(int, int)), key, status);
    int priority = 1;
    while (!probe.makeParallelExclusive(priority)) {
        ++priority;
    }
    return priority;
}

} // namespace

class tst_KeySignalTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void aKeyFiresByCodeAndStatus_data();
    void aKeyFiresByCodeAndStatus();
    void anyKeyOfAListFires_data();
    void anyKeyOfAListFires();
    void argumentsAreReadAsNumbers_data();
    void argumentsAreReadAsNumbers();
    void anotherSenderOrSignalFiresNothing();

    void itTellsItsKeyAfterTheArgumentsAndBeforeLaterReceivers();
    void itTellsTheKeyThatFiredIt();
    void theLastKeyIsStoredBeforeItIsJudged_data();
    void theLastKeyIsStoredBeforeItIsJudged();
    void whatIsNoKeyIsNotStored_data();
    void whatIsNoKeyIsNotStored();

    void itAllowsByDefault();
    void theGuardMayRefuseAKey();
    void theGuardIsAskedOnceAndLast_data();
    void theGuardIsAskedOnceAndLast();

    void publishedTransitionsAreFoundTheLatestFirst();
    void onlyPublishedTransitionsAreFound();
    void transitionsAreFoundByExactlyWhatTheyReactTo_data();
    void transitionsAreFoundByExactlyWhatTheyReactTo();
    void aDestroyedTransitionIsWithdrawn();
    void aTransitionPublishedTwiceIsWithdrawnWhole();

    void theSiblingOfHigherPriorityTakesTheKey();
    void aListOfOneKeyIsASiblingOfTheSingleKey();
    void transitionsOnOtherKeysAreNoSiblings();

    void blockingNumbersThePublishedTransitionsTheLatestFirst();
    void blockingLeavesGivenPrioritiesAlone();
    void eachBlockerTakesTheNextFreePriority_data();
    void eachBlockerTakesTheNextFreePriority();
    void aBlockerStaysInItsStateAndIsNotPublished();
    void aBlockerTakesTheKeyWhileItsStateIsActive();
    void aBlockerOfAnActiveStateWorksFromTheNextEntry();
    void aTransitionPublishedAfterwardsIsNotBlocked();

    void aSenderDestroyedWhileTheMachineRunsIsForgotten();
    void withoutASenderItNeverFires();
};

void tst_KeySignalTransition::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(KeySignalTransition::staticMetaObject),
             QStringList({"signal keyTransitionTriggered(int key, int status)",
                          "private slot onTransitionTriggered()"}));
}

void tst_KeySignalTransition::aKeyFiresByCodeAndStatus_data()
{
    QTest::addColumn<int>("status");
    QTest::addColumn<int>("pressedKey");
    QTest::addColumn<int>("pressedStatus");
    QTest::addColumn<bool>("fires");

    QTest::newRow("key and status") << 1 << 5 << 1 << true;
    QTest::newRow("another key") << 1 << 6 << 1 << false;
    QTest::newRow("another status") << 1 << 5 << 0 << false;
    QTest::newRow("status 0") << 0 << 5 << 0 << true;
    QTest::newRow("status 0, another status") << 0 << 5 << 1 << false;
    QTest::newRow("status 0, a negative status") << 0 << 5 << -1 << false;
    QTest::newRow("any status, 0") << -1 << 5 << 0 << true;
    QTest::newRow("any status, 7") << -1 << 5 << 7 << true;
    QTest::newRow("any status, negative") << -1 << 5 << -3 << true;
    QTest::newRow("any status, another key") << -1 << 6 << 0 << false;
    QTest::newRow("any negative status") << -2 << 5 << 4 << true;
}

void tst_KeySignalTransition::aKeyFiresByCodeAndStatus()
{
    QFETCH(int, status);
    QFETCH(int, pressedKey);
    QFETCH(int, pressedStatus);
    QFETCH(bool, fires);
    Emitter emitter;
    TwoStates flow;
    KeySignalTransition transition(&emitter, SIGNAL(key(int, int)), 5, status, flow.source);
    transition.setTargetState(flow.target);
    flow.start();

    Q_EMIT emitter.key(pressedKey, pressedStatus);

    QCOMPARE(flow.target->isActive(), fires);
    QCOMPARE(flow.source->isActive(), !fires);
}

void tst_KeySignalTransition::anyKeyOfAListFires_data()
{
    QTest::addColumn<QList<int>>("keys");
    QTest::addColumn<int>("pressed");
    QTest::addColumn<bool>("fires");

    QTest::newRow("the first") << QList<int>({5, 6}) << 5 << true;
    QTest::newRow("the last") << QList<int>({5, 6}) << 6 << true;
    QTest::newRow("no other") << QList<int>({5, 6}) << 7 << false;
    QTest::newRow("a list of one") << QList<int>({5}) << 5 << true;
    QTest::newRow("a negative key") << QList<int>({-5}) << -5 << true;
    QTest::newRow("an empty list") << QList<int>() << 0 << false;
}

void tst_KeySignalTransition::anyKeyOfAListFires()
{
    QFETCH(QList<int>, keys);
    QFETCH(int, pressed);
    Emitter emitter;
    TwoStates flow;
    KeySignalTransition transition(&emitter, SIGNAL(key(int, int)), keys, 1, flow.source);
    transition.setTargetState(flow.target);
    flow.start();

    Q_EMIT emitter.key(pressed, 1);

    QTEST(flow.target->isActive(), "fires");
}

void tst_KeySignalTransition::argumentsAreReadAsNumbers_data()
{
    QTest::addColumn<QByteArray>("signal");
    QTest::addColumn<Press>("press");
    QTest::addColumn<int>("key");
    QTest::addColumn<bool>("fires");

    const auto row = [](const char *tag, const char *signal, Press press, int key, bool fires) {
        QTest::newRow(tag) << QByteArray(signal) << press << key << fires;
    };
    row(
        "numbers", SIGNAL(numbers(int, int)), [](KeySource &s) { Q_EMIT s.numbers(5, 1); }, 5,
        true);
    row(
        "a third argument", SIGNAL(three(int, int, QString)),
        [](KeySource &s) { Q_EMIT s.three(5, 1, "long"); }, 5, true);
    row(
        "other integers", SIGNAL(wide(qlonglong, uint)), [](KeySource &s) { Q_EMIT s.wide(5, 1); },
        5, true);
    row(
        "doubles", SIGNAL(doubles(double, double)),
        [](KeySource &s) { Q_EMIT s.doubles(5.0, 1.0); }, 5, true);
    row(
        "doubles are rounded", SIGNAL(doubles(double, double)),
        [](KeySource &s) { Q_EMIT s.doubles(4.6, 1.2); }, 5, true);
    row(
        "truth values", SIGNAL(switches(bool, bool)),
        [](KeySource &s) { Q_EMIT s.switches(true, true); }, 1, true);
    row(
        "a number as text", SIGNAL(textKey(QString, int)),
        [](KeySource &s) { Q_EMIT s.textKey("5", 1); }, 5, true);
    row(
        "a text that is no number", SIGNAL(textKey(QString, int)),
        [](KeySource &s) { Q_EMIT s.textKey("five", 1); }, 5, false);
    row(
        "a text that is no number, key 0", SIGNAL(textKey(QString, int)),
        [](KeySource &s) { Q_EMIT s.textKey("five", 1); }, 0, false);
    row(
        "an empty text, key 0", SIGNAL(textKey(QString, int)),
        [](KeySource &s) { Q_EMIT s.textKey(QString(), 1); }, 0, false);
    row(
        "a status as text", SIGNAL(textStatus(int, QString)),
        [](KeySource &s) { Q_EMIT s.textStatus(5, "1"); }, 5, true);
    row(
        "a status that is no number", SIGNAL(textStatus(int, QString)),
        [](KeySource &s) { Q_EMIT s.textStatus(5, "down"); }, 5, false);
    row(
        "an object", SIGNAL(objectKey(QObject *, int)),
        [](KeySource &s) { Q_EMIT s.objectKey(&s, 1); }, 0, false);
    row(
        "a list", SIGNAL(listKey(QVariantList, int)),
        [](KeySource &s) { Q_EMIT s.listKey({5}, 1); }, 0, false);
    row(
        "one argument", SIGNAL(keyOnly(int)), [](KeySource &s) { Q_EMIT s.keyOnly(5); }, 5, false);
    row(
        "one argument, key 0", SIGNAL(keyOnly(int)), [](KeySource &s) { Q_EMIT s.keyOnly(0); }, 0,
        false);
    row(
        "no argument", SIGNAL(nothing()), [](KeySource &s) { Q_EMIT s.nothing(); }, 0, false);
}

void tst_KeySignalTransition::argumentsAreReadAsNumbers()
{
    QFETCH(QByteArray, signal);
    QFETCH(Press, press);
    QFETCH(int, key);
    KeySource source;
    for (int status : {1, -1}) {
        TwoStates flow;
        KeySignalTransition transition(&source, signal.constData(), key, status, flow.source);
        QSignalSpy fired(&transition, &KeySignalTransition::keyTransitionTriggered);
        QVERIFY(fired.isValid());
        flow.start();

        press(source);

        QTEST(fired.size() == 1, "fires");
    }
}

void tst_KeySignalTransition::anotherSenderOrSignalFiresNothing()
{
    KeySource watched;
    KeySource another;
    TwoStates flow;
    KeySignalTransition transition(&watched, SIGNAL(numbers(int, int)), 5, 1, flow.source);
    // The machine listens to these too, so that the test of the event decides.
    HmiSignalTransition anotherSignal(&watched, SIGNAL(textKey(QString, int)), flow.source);
    HmiSignalTransition anotherSender(&another, SIGNAL(numbers(int, int)), flow.source);
    QSignalSpy fired(&transition, &KeySignalTransition::keyTransitionTriggered);
    QVERIFY(fired.isValid());
    flow.start();

    Q_EMIT watched.textKey("5", 1);
    Q_EMIT another.numbers(5, 1);

    QCOMPARE(fired.size(), 0);
    QCOMPARE(lastKeyAndStatus(transition), QVariantList({0, 0}));
}

void tst_KeySignalTransition::itTellsItsKeyAfterTheArgumentsAndBeforeLaterReceivers()
{
    Emitter emitter;
    TwoStates flow;
    KeySignalTransition transition(&emitter, SIGNAL(key(int, int)), 5, -1, flow.source);
    transition.setTargetState(flow.target);
    Journal journal;
    connect(&transition, &QAbstractTransition::triggered, this,
            [&journal] { journal.add("triggered"); });
    connect(&transition, &KeySignalTransition::keyTransitionTriggered, this,
            [&journal](int key, int status) {
                journal.add(QString("keyTransitionTriggered %1 %2").arg(key).arg(status));
            });
    connect(&transition, &HmiSignalTransition::triggeredWithArguments, this,
            [&journal](const QVariantList &arguments) {
                journal.add(QString("triggeredWithArguments %1 %2")
                                .arg(arguments.at(0).toInt())
                                .arg(arguments.at(1).toInt()));
            });
    connect(flow.source, &QState::exited, this, [&journal] { journal.add("source exited"); });
    connect(flow.target, &QState::entered, this, [&journal] { journal.add("target entered"); });
    flow.start();

    Q_EMIT emitter.key(5, 7);

    QCOMPARE(journal.lines(),
             QStringList({"source exited", "triggeredWithArguments 5 7",
                          "keyTransitionTriggered 5 7", "triggered", "target entered"}));
}

void tst_KeySignalTransition::itTellsTheKeyThatFiredIt()
{
    Emitter emitter;
    TwoStates flow;
    KeySignalTransition transition(&emitter, SIGNAL(key(int, int)), QList<int>({5, 6}), -1,
                                   flow.source);
    QSignalSpy told(&transition, &KeySignalTransition::keyTransitionTriggered);
    QVERIFY(told.isValid());
    flow.start();

    Q_EMIT emitter.key(5, 1);
    Q_EMIT emitter.key(7, 2);
    Q_EMIT emitter.key(6, 0);

    QCOMPARE(told.size(), 2);
    QCOMPARE(told.at(0), QVariantList({5, 1}));
    QCOMPARE(told.at(1), QVariantList({6, 0}));
}

void tst_KeySignalTransition::theLastKeyIsStoredBeforeItIsJudged_data()
{
    QTest::addColumn<int>("pressedKey");
    QTest::addColumn<int>("pressedStatus");
    QTest::addColumn<bool>("allowed");

    QTest::newRow("another key") << 6 << 1 << true;
    QTest::newRow("another status") << 5 << 2 << true;
    QTest::newRow("refused by the guard") << 5 << 1 << false;
}

void tst_KeySignalTransition::theLastKeyIsStoredBeforeItIsJudged()
{
    QFETCH(int, pressedKey);
    QFETCH(int, pressedStatus);
    QFETCH(bool, allowed);
    Emitter emitter;
    TwoStates flow;
    KeySignalTransition transition(&emitter, SIGNAL(key(int, int)), 5, 1, flow.source);
    transition.setTargetState(flow.target);
    transition.setAllowTransitionDefault(allowed);
    flow.start();

    Q_EMIT emitter.key(pressedKey, pressedStatus);

    QVERIFY(flow.source->isActive());
    QCOMPARE(lastKeyAndStatus(transition), QVariantList({pressedKey, pressedStatus}));
}

void tst_KeySignalTransition::whatIsNoKeyIsNotStored_data()
{
    QTest::addColumn<QByteArray>("signal");
    QTest::addColumn<Press>("press");

    QTest::newRow("one argument") << QByteArray(SIGNAL(keyOnly(int)))
                                  << Press([](KeySource &s) { Q_EMIT s.keyOnly(5); });
    QTest::newRow("an object") << QByteArray(SIGNAL(objectKey(QObject *, int)))
                               << Press([](KeySource &s) { Q_EMIT s.objectKey(&s, 1); });
}

void tst_KeySignalTransition::whatIsNoKeyIsNotStored()
{
    QFETCH(QByteArray, signal);
    QFETCH(Press, press);
    KeySource source;
    TwoStates flow;
    KeySignalTransition transition(&source, signal.constData(), 5, -1, flow.source);
    flow.start();

    press(source);

    QCOMPARE(lastKeyAndStatus(transition), QVariantList({0, 0}));
}

void tst_KeySignalTransition::itAllowsByDefault()
{
    const KeySignalTransition single(nullptr, SIGNAL(key(int, int)), 5, 1);
    const KeySignalTransition list(nullptr, SIGNAL(key(int, int)), QList<int>({5}), 1);

    QVERIFY(single.allowTransitionDefault());
    QVERIFY(!single.allowTransition());
    QVERIFY(list.allowTransitionDefault());
}

void tst_KeySignalTransition::theGuardMayRefuseAKey()
{
    Emitter emitter;
    TwoStates flow;
    KeySignalTransition transition(&emitter, SIGNAL(key(int, int)), 5, 1, flow.source);
    transition.setTargetState(flow.target);
    connect(&transition, &GuardedSignalTransition::transitionTest, &transition,
            [&transition] { transition.setAllowTransition(false); });
    QSignalSpy failed(&transition, &GuardedSignalTransition::testFailed);
    QVERIFY(failed.isValid());
    flow.start();

    Q_EMIT emitter.key(5, 1);

    QCOMPARE(failed.size(), 1);
    QVERIFY(flow.source->isActive());
}

void tst_KeySignalTransition::theGuardIsAskedOnceAndLast_data()
{
    QTest::addColumn<Press>("press");
    QTest::addColumn<int>("asked");

    QTest::newRow("all matches") << Press([](KeySource &s) { Q_EMIT s.numbers(5, 1); }) << 1;
    QTest::newRow("another key") << Press([](KeySource &s) { Q_EMIT s.numbers(6, 1); }) << 0;
    QTest::newRow("another status") << Press([](KeySource &s) { Q_EMIT s.numbers(5, 0); }) << 0;
    QTest::newRow("another signal")
        << Press([](KeySource &s) { Q_EMIT s.three(5, 1, QString()); }) << 0;
    QTest::newRow("another sender")
        << Press([](KeySource &s) { Q_EMIT s.findChild<KeySource *>()->numbers(5, 1); }) << 0;
}

void tst_KeySignalTransition::theGuardIsAskedOnceAndLast()
{
    QFETCH(Press, press);
    KeySource source;
    KeySource another;
    another.setParent(&source);
    TwoStates flow;
    KeySignalTransition transition(&source, SIGNAL(numbers(int, int)), 5, 1, flow.source);
    HmiSignalTransition anotherSignal(&source, SIGNAL(three(int, int, QString)), flow.source);
    HmiSignalTransition anotherSender(&another, SIGNAL(numbers(int, int)), flow.source);
    QSignalSpy asked(&transition, &GuardedSignalTransition::transitionTest);
    QVERIFY(asked.isValid());
    flow.start();

    press(source);

    QTEST(asked.size(), "asked");
}

void tst_KeySignalTransition::publishedTransitionsAreFoundTheLatestFirst()
{
    Emitter emitter;
    KeySignalTransition first(&emitter, SIGNAL(key(int, int)), 5, 1);
    KeySignalTransition second(&emitter, SIGNAL(key(int, int)), 5, 1);
    KeySignalTransition third(&emitter, SIGNAL(key(int, int)), 5, 1);

    second.makeGloballyAvailable();
    first.makeGloballyAvailable();
    third.makeGloballyAvailable();

    QCOMPARE(KeySignalTransition::keySignalTransitions(&emitter, SIGNAL(key(int, int)), 5, 1),
             QList<KeySignalTransition *>({&third, &first, &second}));
}

void tst_KeySignalTransition::onlyPublishedTransitionsAreFound()
{
    Emitter emitter;
    const KeySignalTransition transition(&emitter, SIGNAL(key(int, int)), 5, 1);

    QCOMPARE(KeySignalTransition::keySignalTransitions(&emitter, SIGNAL(key(int, int)), 5, 1),
             QList<KeySignalTransition *>());
}

void tst_KeySignalTransition::transitionsAreFoundByExactlyWhatTheyReactTo_data()
{
    QTest::addColumn<QList<int>>("keys");
    QTest::addColumn<QList<int>>("wantedKeys");
    QTest::addColumn<int>("wantedStatus");
    QTest::addColumn<QByteArray>("wantedSignal");
    QTest::addColumn<bool>("found");

    const QByteArray signal = "2key(int,int)";
    const QList<int> one = {5};
    const QList<int> two = {5, 6};
    QTest::newRow("one key") << one << one << 1 << signal << true;
    QTest::newRow("two keys") << two << two << 1 << signal << true;
    QTest::newRow("two keys in another order") << two << QList<int>({6, 5}) << 1 << signal << false;
    QTest::newRow("one key of two") << two << one << 1 << signal << false;
    QTest::newRow("two keys for one") << one << two << 1 << signal << false;
    QTest::newRow("another key") << one << QList<int>({6}) << 1 << signal << false;
    QTest::newRow("another status") << one << one << 0 << signal << false;
    QTest::newRow("any status") << one << one << -1 << signal << false;
    QTest::newRow("another signal") << one << one << 1 << QByteArray("2plain()") << false;
    QTest::newRow("the signal written with another space")
        << one << one << 1 << QByteArray("2key(int, int)") << false;
    QTest::newRow("the signal without its code")
        << one << one << 1 << QByteArray("key(int,int)") << false;
}

void tst_KeySignalTransition::transitionsAreFoundByExactlyWhatTheyReactTo()
{
    QFETCH(QList<int>, keys);
    QFETCH(QList<int>, wantedKeys);
    QFETCH(int, wantedStatus);
    QFETCH(QByteArray, wantedSignal);
    QFETCH(bool, found);
    Emitter emitter;
    Emitter another;
    KeySignalTransition transition(&emitter, "2key(int,int)", keys, 1);
    transition.makeGloballyAvailable();
    const auto search = [&](QObject *sender) {
        return KeySignalTransition::keySignalTransitions(sender, wantedSignal.constData(),
                                                         wantedKeys, wantedStatus);
    };

    QCOMPARE(search(&emitter).contains(&transition), found);
    QCOMPARE(search(&another).size(), 0);
    QCOMPARE(search(nullptr).size(), 0);
    if (wantedKeys.size() == 1) {
        const auto single = KeySignalTransition::keySignalTransitions(
            &emitter, wantedSignal.constData(), wantedKeys.first(), wantedStatus);
        QCOMPARE(single.contains(&transition), found);
    }
}

void tst_KeySignalTransition::aDestroyedTransitionIsWithdrawn()
{
    Emitter emitter;
    KeySignalTransition first(&emitter, SIGNAL(key(int, int)), 5, 1);
    auto second = std::make_unique<KeySignalTransition>(&emitter, SIGNAL(key(int, int)), 5, 1);
    first.makeGloballyAvailable();
    second->makeGloballyAvailable();

    second.reset();

    QCOMPARE(KeySignalTransition::keySignalTransitions(&emitter, SIGNAL(key(int, int)), 5, 1),
             QList<KeySignalTransition *>({&first}));
}

void tst_KeySignalTransition::aTransitionPublishedTwiceIsWithdrawnWhole()
{
    Emitter emitter;
    auto transition = std::make_unique<KeySignalTransition>(&emitter, SIGNAL(key(int, int)), 5, 1);
    transition->makeGloballyAvailable();
    transition->makeGloballyAvailable();

    transition.reset();

    QCOMPARE(KeySignalTransition::keySignalTransitions(&emitter, SIGNAL(key(int, int)), 5, 1),
             QList<KeySignalTransition *>());
}

void tst_KeySignalTransition::theSiblingOfHigherPriorityTakesTheKey()
{
    Emitter emitter;
    TwoRegions regions;
    KeySignalTransition low(&emitter, SIGNAL(key(int, int)), 5, 1, regions.left);
    KeySignalTransition high(&emitter, SIGNAL(key(int, int)), 5, 1, regions.right);
    QVERIFY(low.makeParallelExclusive(1));
    QVERIFY(!high.makeParallelExclusive(1));
    QVERIFY(high.makeParallelExclusive(2));
    QSignalSpy lowFired(&low, &KeySignalTransition::keyTransitionTriggered);
    QSignalSpy highFired(&high, &KeySignalTransition::keyTransitionTriggered);
    QVERIFY(lowFired.isValid() && highFired.isValid());
    regions.start();

    Q_EMIT emitter.key(5, 1);
    QCOMPARE(lowFired.size(), 0);
    QCOMPARE(highFired.size(), 1);

    high.setAllowTransitionDefault(false);
    Q_EMIT emitter.key(5, 1);
    QCOMPARE(lowFired.size(), 1);
    QCOMPARE(highFired.size(), 1);
}

void tst_KeySignalTransition::aListOfOneKeyIsASiblingOfTheSingleKey()
{
    Emitter emitter;
    TwoRegions regions;
    KeySignalTransition single(&emitter, SIGNAL(key(int, int)), 5, 1, regions.left);
    KeySignalTransition list(&emitter, SIGNAL(key(int, int)), QList<int>({5}), 1, regions.right);

    QVERIFY(single.makeParallelExclusive(1));
    QVERIFY(!list.makeParallelExclusive(1));
}

void tst_KeySignalTransition::transitionsOnOtherKeysAreNoSiblings()
{
    Emitter emitter;
    TwoRegions regions;
    KeySignalTransition low(&emitter, SIGNAL(key(int, int)), 5, 1, regions.left);
    KeySignalTransition anyStatus(&emitter, SIGNAL(key(int, int)), 5, -1, regions.right);
    KeySignalTransition twoKeys(&emitter, SIGNAL(key(int, int)), QList<int>({5, 6}), 1,
                                regions.right);
    QVERIFY(low.makeParallelExclusive(1));
    QVERIFY(anyStatus.makeParallelExclusive(2));
    QVERIFY(twoKeys.makeParallelExclusive(3));
    QSignalSpy fired(&low, &KeySignalTransition::keyTransitionTriggered);
    QVERIFY(fired.isValid());
    regions.start();

    Q_EMIT emitter.key(5, 1);

    QCOMPARE(fired.size(), 1);
}

void tst_KeySignalTransition::blockingNumbersThePublishedTransitionsTheLatestFirst()
{
    Emitter emitter;
    TwoRegions regions;
    KeySignalTransition first(&emitter, SIGNAL(key(int, int)), 5, 1, regions.left);
    KeySignalTransition second(&emitter, SIGNAL(key(int, int)), 5, 1, regions.left);
    first.makeGloballyAvailable();
    second.makeGloballyAvailable();

    regions.right->blockKey(5, 1, &emitter, SIGNAL(key(int, int)));

    // A member accepts the priority that it has, and no other one.
    QVERIFY(second.makeParallelExclusive(1));
    QVERIFY(first.makeParallelExclusive(2));
    QVERIFY(!first.makeParallelExclusive(1));
}

void tst_KeySignalTransition::blockingLeavesGivenPrioritiesAlone()
{
    Emitter emitter;
    TwoRegions regions;
    KeySignalTransition first(&emitter, SIGNAL(key(int, int)), 5, 1, regions.left);
    KeySignalTransition second(&emitter, SIGNAL(key(int, int)), 5, 1, regions.left);
    first.makeGloballyAvailable();
    second.makeGloballyAvailable();
    QVERIFY(second.makeParallelExclusive(3));

    regions.right->blockKey(5, 1, &emitter, SIGNAL(key(int, int)));

    QVERIFY(second.makeParallelExclusive(3));
    QVERIFY(first.makeParallelExclusive(2));
    // 3 comes after two published transitions and is taken, so that the blocker has 4.
    QCOMPARE(firstFreePriority(&emitter, 5, 1), 1);
    KeySignalTransition probe(&emitter, SIGNAL(key(int, int)), 5, 1);
    QVERIFY(!probe.makeParallelExclusive(4));
    QVERIFY(probe.makeParallelExclusive(5));
}

void tst_KeySignalTransition::eachBlockerTakesTheNextFreePriority_data()
{
    QTest::addColumn<int>("published");
    QTest::addColumn<int>("freeAfterOne");
    QTest::addColumn<int>("freeAfterTwo");

    QTest::newRow("nothing published") << 0 << 2 << 3;
    QTest::newRow("one published") << 1 << 3 << 4;
    QTest::newRow("three published") << 3 << 5 << 6;
}

void tst_KeySignalTransition::eachBlockerTakesTheNextFreePriority()
{
    QFETCH(int, published);
    Emitter emitter;
    TwoRegions regions;
    for (int i = 0; i < published; ++i) {
        auto *transition =
            new KeySignalTransition(&emitter, SIGNAL(key(int, int)), 5, 1, regions.left);
        transition->makeGloballyAvailable();
    }

    regions.right->blockKey(5, 1, &emitter, SIGNAL(key(int, int)));
    QTEST(firstFreePriority(&emitter, 5, 1), "freeAfterOne");

    regions.left->blockKey(5, 1, &emitter, SIGNAL(key(int, int)));
    QTEST(firstFreePriority(&emitter, 5, 1), "freeAfterTwo");
    QCOMPARE(firstFreePriority(&emitter, 5, 0), 1);
}

void tst_KeySignalTransition::aBlockerStaysInItsStateAndIsNotPublished()
{
    Emitter emitter;
    TwoRegions regions;

    regions.right->blockKey(5, 1, &emitter, SIGNAL(key(int, int)));

    const auto blockers = regions.right->findChildren<KeySignalTransition *>();
    QCOMPARE(blockers.size(), 1);
    QCOMPARE(blockers.first()->getSourceState(), regions.right);
    QVERIFY(!blockers.first()->getTarget());
    QCOMPARE(blockers.first()->senderObject(), &emitter);
    QCOMPARE(KeySignalTransition::keySignalTransitions(&emitter, SIGNAL(key(int, int)), 5, 1),
             QList<KeySignalTransition *>());
}

void tst_KeySignalTransition::aBlockerTakesTheKeyWhileItsStateIsActive()
{
    Emitter emitter;
    TwoRegions regions;
    auto *blocking = new NamedState("blocking", regions.right);
    auto *open = new NamedState("open", regions.right);
    regions.right->setInitialState(blocking);
    blocking->addTransition(&emitter, SIGNAL(plain()), open);
    KeySignalTransition transition(&emitter, SIGNAL(key(int, int)), 5, 1, regions.left);
    transition.makeGloballyAvailable();
    QSignalSpy fired(&transition, &KeySignalTransition::keyTransitionTriggered);
    QVERIFY(fired.isValid());
    blocking->blockKey(5, 1, &emitter, SIGNAL(key(int, int)));
    regions.start();

    Q_EMIT emitter.key(5, 1);
    QCOMPARE(fired.size(), 0);
    QVERIFY(blocking->isActive());

    Q_EMIT emitter.plain();
    Q_EMIT emitter.key(5, 1);
    QCOMPARE(fired.size(), 1);
}

void tst_KeySignalTransition::aBlockerOfAnActiveStateWorksFromTheNextEntry()
{
    Emitter emitter;
    TwoRegions regions;
    auto *blocking = new NamedState("blocking", regions.right);
    regions.right->setInitialState(blocking);
    blocking->addTransition(&emitter, SIGNAL(plain()), blocking);
    KeySignalTransition transition(&emitter, SIGNAL(key(int, int)), 5, 1, regions.left);
    transition.makeGloballyAvailable();
    QSignalSpy fired(&transition, &KeySignalTransition::keyTransitionTriggered);
    QVERIFY(fired.isValid());
    regions.start();

    blocking->blockKey(5, 1, &emitter, SIGNAL(key(int, int)));
    Q_EMIT emitter.key(5, 1);
    QCOMPARE(fired.size(), 1);

    Q_EMIT emitter.plain();
    Q_EMIT emitter.key(5, 1);
    QCOMPARE(fired.size(), 1);
}

void tst_KeySignalTransition::aTransitionPublishedAfterwardsIsNotBlocked()
{
    Emitter emitter;
    TwoRegions regions;
    KeySignalTransition transition(&emitter, SIGNAL(key(int, int)), 5, 1, regions.left);
    QSignalSpy fired(&transition, &KeySignalTransition::keyTransitionTriggered);
    QVERIFY(fired.isValid());
    regions.right->blockKey(5, 1, &emitter, SIGNAL(key(int, int)));
    regions.start();

    transition.makeGloballyAvailable();
    Q_EMIT emitter.key(5, 1);

    QCOMPARE(fired.size(), 1);
}

void tst_KeySignalTransition::aSenderDestroyedWhileTheMachineRunsIsForgotten()
{
    auto emitter = std::make_unique<Emitter>();
    TwoRegions regions;
    KeySignalTransition transition(emitter.get(), SIGNAL(key(int, int)), 5, 1, regions.left);
    transition.makeGloballyAvailable();
    regions.right->blockKey(5, 1, emitter.get(), SIGNAL(key(int, int)));
    regions.start();

    emitter.reset();

    QVERIFY(!transition.senderObject());
    regions.machine.stop();
    settle();
    QVERIFY(!regions.machine.isRunning());
}

void tst_KeySignalTransition::withoutASenderItNeverFires()
{
    Emitter emitter;
    TwoStates flow;
    KeySignalTransition transition(nullptr, SIGNAL(key(int, int)), 5, -1, flow.source);
    QSignalSpy fired(&transition, &KeySignalTransition::keyTransitionTriggered);
    QVERIFY(fired.isValid());
    flow.source->blockKey(5, -1, nullptr, SIGNAL(key(int, int)));
    flow.start();

    Q_EMIT emitter.key(5, 1);

    QCOMPARE(fired.size(), 0);
}

QTEST_GUILESS_MAIN(tst_KeySignalTransition)
#include "tst_keysignaltransition.moc"
