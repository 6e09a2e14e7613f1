#include "driving.h"
#include "emitter.h"
#include "journal.h"
#include "librarytest.h"
#include "metadescription.h"
#include "recordingviewstatetarget.h"
#include "regions.h"

#include <HmiStateMachine/named/intsignaltransition.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>

#include <QSignalSpy>
#include <QtTest>

#include <functional>
#include <limits>

using namespace HmiStateMachine;

Q_DECLARE_METATYPE(HmiStateMachine::IntSignalTransition::Operator)
Q_DECLARE_METATYPE(std::function<void(Emitter &)>)

namespace {

/** A sender whose signal carries an enumerator. */
class LevelEmitter : public QObject
{
    Q_OBJECT

public:
    enum Level { Low = 3 };
    Q_ENUM(Level)

Q_SIGNALS:
    void level(LevelEmitter::Level value);
};

/** Whether an operator fires for arguments below, at and above the stored value. */
struct Comparison
{
    IntSignalTransition::Operator op;
    const char *name;
    bool below;
    bool equal;
    bool above;
};

constexpr Comparison comparisons[] = {
    {IntSignalTransition::Equal, "equal", false, true, false},
    {IntSignalTransition::NotEqual, "not equal", true, false, true},
    {IntSignalTransition::Greater, "greater", true, false, false},
    {IntSignalTransition::GreaterOrEqual, "greater or equal", true, true, false},
    {IntSignalTransition::Less, "less", false, false, true},
    {IntSignalTransition::LessOrEqual, "less or equal", false, true, true},
};

constexpr int lowest = std::numeric_limits<int>::min();
constexpr int highest = std::numeric_limits<int>::max();

} // namespace

class tst_IntSignalTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void theOperatorsAreNumberedFromZero();
    void theStoredValueStandsOnTheLeft_data();
    void theStoredValueStandsOnTheLeft();
    void theMachineMovesWhenTheComparisonHolds_data();
    void theMachineMovesWhenTheComparisonHolds();
    void withoutAnOperatorItComparesForEquality();
    void anUnknownOperatorNeverFires_data();
    void anUnknownOperatorNeverFires();
    void onlyAnIntWillDo_data();
    void onlyAnIntWillDo();
    void anEnumeratorIsNoInt();
    void onlyTheFirstArgumentIsCompared();
    void anotherSignalOrSenderIsIgnored();
    void theArgumentsAreToldWhenItFires();
    void aBlockedTransitionNeverFires();
    void aVoiceRequestIsPassedOnWhenItFires();
    void withoutATargetItFiresInPlace();
    void withoutASenderItNeverFires();
    void aDestroyedSenderIsSurvived();
    void anUnknownSignalIsQtsWarning();
    void itSharesItsGroupWithOtherTransitionsOnTheSignal();
    void aComparisonThatFailsLeavesTheSignalToTheLower();
    void aBlockedSiblingStillTakesTheSignal();
};

void tst_IntSignalTransition::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(IntSignalTransition::staticMetaObject), QStringList());
    QCOMPARE(IntSignalTransition::staticMetaObject.superClass(),
             &HmiSignalTransition::staticMetaObject);
}

void tst_IntSignalTransition::theOperatorsAreNumberedFromZero()
{
    const QList<int> numbers{IntSignalTransition::Equal,   IntSignalTransition::NotEqual,
                             IntSignalTransition::Greater, IntSignalTransition::GreaterOrEqual,
                             IntSignalTransition::Less,    IntSignalTransition::LessOrEqual};

    QCOMPARE(numbers, QList<int>({0, 1, 2, 3, 4, 5}));
}

void tst_IntSignalTransition::theStoredValueStandsOnTheLeft_data()
{
    QTest::addColumn<IntSignalTransition::Operator>("op");
    QTest::addColumn<int>("value");
    QTest::addColumn<int>("argument");
    QTest::addColumn<bool>("fires");

    for (const Comparison &o : comparisons) {
        const auto row = [&o](int value, int argument, bool fires) {
            QTest::addRow("%d %s %d", value, o.name, argument)
                << o.op << value << argument << fires;
        };
        row(3, 2, o.below);
        row(3, 3, o.equal);
        row(3, 4, o.above);
        row(0, -1, o.below);
        row(-1, -1, o.equal);
        row(-1, 0, o.above);
        row(highest, lowest, o.below);
        row(highest, highest, o.equal);
        row(lowest, lowest, o.equal);
        row(lowest, highest, o.above);
    }
}

void tst_IntSignalTransition::theStoredValueStandsOnTheLeft()
{
    QFETCH(IntSignalTransition::Operator, op);
    QFETCH(int, value);
    QFETCH(int, argument);
    Emitter emitter;
    const IntSignalTransition transition(&emitter, SIGNAL(withInt(int)), value, op);

    QTEST(transition.match(argument), "fires");
}

void tst_IntSignalTransition::theMachineMovesWhenTheComparisonHolds_data()
{
    theStoredValueStandsOnTheLeft_data();
}

void tst_IntSignalTransition::theMachineMovesWhenTheComparisonHolds()
{
    QFETCH(IntSignalTransition::Operator, op);
    QFETCH(int, value);
    QFETCH(int, argument);
    QFETCH(bool, fires);
    Emitter emitter;
    Regions regions({"Radio"});
    auto *transition =
        new IntSignalTransition(&emitter, SIGNAL(withInt(int)), value, op, regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    emitter.withInt(argument);

    QCOMPARE(regions.active(), QStringList{fires ? "RadioAway" : "RadioHome"});
}

void tst_IntSignalTransition::withoutAnOperatorItComparesForEquality()
{
    Emitter emitter;
    const IntSignalTransition transition(&emitter, SIGNAL(withInt(int)), 3);

    QCOMPARE(transition.match(2), false);
    QCOMPARE(transition.match(3), true);
    QCOMPARE(transition.match(4), false);
}

void tst_IntSignalTransition::anUnknownOperatorNeverFires_data()
{
    QTest::addColumn<int>("op");

    QTest::newRow("below") << -1;
    QTest::newRow("just above") << 6;
    QTest::newRow("far above") << highest;
}

void tst_IntSignalTransition::anUnknownOperatorNeverFires()
{
    QFETCH(int, op);
    Emitter emitter;
    Regions regions({"Radio"});
    auto *transition =
        new IntSignalTransition(&emitter, SIGNAL(withInt(int)), 3,
                                IntSignalTransition::Operator(op), regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    for (int argument : {2, 3, 4}) {
        QVERIFY(!transition->match(argument));
        emitter.withInt(argument);
    }

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
}

void tst_IntSignalTransition::onlyAnIntWillDo_data()
{
    using Send = std::function<void(Emitter &)>;
    QTest::addColumn<QByteArray>("watched");
    QTest::addColumn<Send>("send");
    QTest::addColumn<QStringList>("active");

    const QStringList home{"RadioHome"};
    QTest::newRow("int") << QByteArray(SIGNAL(withInt(int)))
                         << Send([](Emitter &e) { e.withInt(3); }) << QStringList{"RadioAway"};
    QTest::newRow("unsigned") << QByteArray(SIGNAL(withUInt(uint)))
                              << Send([](Emitter &e) { e.withUInt(3); }) << home;
    QTest::newRow("long") << QByteArray(SIGNAL(withLongLong(qlonglong)))
                          << Send([](Emitter &e) { e.withLongLong(3); }) << home;
    QTest::newRow("double") << QByteArray(SIGNAL(withDouble(double)))
                            << Send([](Emitter &e) { e.withDouble(3.0); }) << home;
    QTest::newRow("text") << QByteArray(SIGNAL(withText(QString)))
                          << Send([](Emitter &e) { e.withText("3"); }) << home;
    QTest::newRow("no argument") << QByteArray(SIGNAL(plain()))
                                 << Send([](Emitter &e) { e.plain(); }) << home;
}

void tst_IntSignalTransition::onlyAnIntWillDo()
{
    QFETCH(QByteArray, watched);
    QFETCH(std::function<void(Emitter &)>, send);
    Emitter emitter;
    Regions regions({"Radio"});
    auto *transition =
        new IntSignalTransition(&emitter, watched.constData(), 3, regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    send(emitter);

    QTEST(regions.active(), "active");
}

void tst_IntSignalTransition::anEnumeratorIsNoInt()
{
    qRegisterMetaType<LevelEmitter::Level>("LevelEmitter::Level");
    LevelEmitter emitter;
    const char *watched = SIGNAL(level(LevelEmitter::Level));
    Regions regions({"Radio", "Map"});
    auto *strict = new IntSignalTransition(&emitter, watched, 3, regions.home("Radio"));
    auto *plain = new HmiSignalTransition(&emitter, watched, regions.home("Map"));
    strict->setTargetState(regions.away("Radio"));
    QSignalSpy told(plain, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(told.isValid());
    regions.start();

    emitter.level(LevelEmitter::Low);

    // The argument would convert, but that does not count.
    QCOMPARE(told.size(), 1);
    QCOMPARE(told.first().first().toList().first().toInt(), 3);
    QCOMPARE(regions.active(), QStringList({"RadioHome", "MapHome"}));
}

void tst_IntSignalTransition::onlyTheFirstArgumentIsCompared()
{
    Emitter emitter;
    Regions regions({"Radio"});
    auto *transition =
        new IntSignalTransition(&emitter, SIGNAL(key(int, int)), 3, regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    emitter.key(4, 3);
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    emitter.key(3, 4);

    QCOMPARE(regions.active(), QStringList{"RadioAway"});
}

void tst_IntSignalTransition::anotherSignalOrSenderIsIgnored()
{
    Emitter emitter;
    Emitter stranger;
    Regions regions({"Radio"});
    auto *transition =
        new IntSignalTransition(&emitter, SIGNAL(withInt(int)), 3, regions.home("Radio"));
    // Has the machine listen to the other signal and sender too.
    new IntSignalTransition(&emitter, SIGNAL(key(int, int)), 9, regions.home("Radio"));
    new IntSignalTransition(&stranger, SIGNAL(withInt(int)), 9, regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    emitter.key(3, 3);
    stranger.withInt(3);

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
}

void tst_IntSignalTransition::theArgumentsAreToldWhenItFires()
{
    Emitter emitter;
    Regions regions({"Radio"});
    auto *transition = new IntSignalTransition(&emitter, SIGNAL(withTwo(int, QString)), 3,
                                               IntSignalTransition::Less, regions.home("Radio"));
    QSignalSpy told(transition, &HmiSignalTransition::triggeredWithArguments);
    QVERIFY(told.isValid());
    regions.start();

    emitter.withTwo(3, "three");
    emitter.withTwo(4, "four");

    QCOMPARE(told.size(), 1);
    QCOMPARE(told.first().first().toList(), QVariantList({4, "four"}));
}

void tst_IntSignalTransition::aBlockedTransitionNeverFires()
{
    Emitter emitter;
    Regions regions({"Radio"});
    auto *transition =
        new IntSignalTransition(&emitter, SIGNAL(withInt(int)), 3, regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    transition->setBlocked(true);
    emitter.withInt(3);
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    transition->setBlocked(false);
    emitter.withInt(3);

    QCOMPARE(regions.active(), QStringList{"RadioAway"});
}

void tst_IntSignalTransition::aVoiceRequestIsPassedOnWhenItFires()
{
    Journal journal;
    RecordingViewStateTarget viewLayer(journal);
    Emitter emitter;
    Regions regions({"Radio"});
    auto *transition =
        new IntSignalTransition(&emitter, SIGNAL(withInt(int)), 3, regions.home("Radio"));
    transition->setIsVREventTransition(true, 7);
    regions.start();

    emitter.withInt(4);
    QCOMPARE(viewLayer.vrViewRequest(), false);
    emitter.withInt(3);

    QCOMPARE(viewLayer.vrViewRequest(), true);
    QCOMPARE(viewLayer.vrViewRequestData(), QVariant(7));
}

void tst_IntSignalTransition::withoutATargetItFiresInPlace()
{
    Emitter emitter;
    Regions regions({"Radio"});
    auto *transition =
        new IntSignalTransition(&emitter, SIGNAL(withInt(int)), 3, regions.home("Radio"));
    QSignalSpy triggered(transition, &IntSignalTransition::triggered);
    QVERIFY(triggered.isValid());
    regions.start();

    emitter.withInt(3);

    QCOMPARE(triggered.size(), 1);
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
}

void tst_IntSignalTransition::withoutASenderItNeverFires()
{
    Emitter emitter;
    Regions regions({"Radio"});
    auto *transition =
        new IntSignalTransition(nullptr, SIGNAL(withInt(int)), 3, regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    emitter.withInt(3);

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
}

void tst_IntSignalTransition::aDestroyedSenderIsSurvived()
{
    QScopedPointer<Emitter> emitter(new Emitter);
    Regions regions({"Radio"});
    auto *transition =
        new IntSignalTransition(emitter.data(), SIGNAL(withInt(int)), 3, regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    emitter.reset();
    regions.leave("Radio");
    regions.comeBack("Radio");

    QCOMPARE(transition->senderObject(), nullptr);
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
}

void tst_IntSignalTransition::anUnknownSignalIsQtsWarning()
{
    Emitter emitter;
    Regions regions({"Radio"});
    new IntSignalTransition(&emitter, SIGNAL(missing(int)), 3, regions.home("Radio"));
    QTest::ignoreMessage(QtWarningMsg, "QSignalTransition: no such signal: Emitter::missing(int)");

    regions.start();

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
}

void tst_IntSignalTransition::itSharesItsGroupWithOtherTransitionsOnTheSignal()
{
    Emitter emitter;
    Regions regions({"Radio", "Map"});
    auto *radio = new HmiSignalTransition(&emitter, SIGNAL(withInt(int)), regions.home("Radio"));
    auto *map = new IntSignalTransition(&emitter, SIGNAL(withInt(int)), 3, regions.home("Map"));
    auto *other = new IntSignalTransition(&emitter, SIGNAL(key(int, int)), 3, regions.home("Map"));
    radio->setTargetState(regions.away("Radio"));
    map->setTargetState(regions.away("Map"));
    QVERIFY(radio->makeParallelExclusive(1));
    QVERIFY(!map->makeParallelExclusive(1));
    QVERIFY(map->makeParallelExclusive(2));
    QVERIFY(other->makeParallelExclusive(1));
    regions.start();

    emitter.withInt(3);

    QCOMPARE(regions.active(), QStringList({"RadioHome", "MapAway"}));
}

void tst_IntSignalTransition::aComparisonThatFailsLeavesTheSignalToTheLower()
{
    Emitter emitter;
    Regions regions({"Radio", "Map"});
    auto *radio = new IntSignalTransition(&emitter, SIGNAL(withInt(int)), 4, regions.home("Radio"));
    auto *map = new IntSignalTransition(&emitter, SIGNAL(withInt(int)), 3, regions.home("Map"));
    radio->setTargetState(regions.away("Radio"));
    map->setTargetState(regions.away("Map"));
    ParallelSiblingTransitionGroup group;
    QVERIFY(group.addTransition(radio, 1));
    QVERIFY(group.addTransition(map, 2));
    regions.start();

    emitter.withInt(4);

    QCOMPARE(regions.active(), QStringList({"RadioAway", "MapHome"}));
}

void tst_IntSignalTransition::aBlockedSiblingStillTakesTheSignal()
{
    Emitter emitter;
    Regions regions({"Radio", "Map"});
    auto *radio = new IntSignalTransition(&emitter, SIGNAL(withInt(int)), 3, regions.home("Radio"));
    auto *map = new IntSignalTransition(&emitter, SIGNAL(withInt(int)), 3, regions.home("Map"));
    radio->setTargetState(regions.away("Radio"));
    map->setTargetState(regions.away("Map"));
    ParallelSiblingTransitionGroup group;
    QVERIFY(group.addTransition(radio, 1));
    QVERIFY(group.addTransition(map, 2));
    map->setBlocked(true);
    regions.start();

    emitter.withInt(3);

    QCOMPARE(regions.active(), QStringList({"RadioHome", "MapHome"}));
}

QTEST_GUILESS_MAIN(tst_IntSignalTransition)
#include "tst_intsignaltransition.moc"
