#include "driving.h"
#include "guards.h"
#include "librarytest.h"
#include "metadescription.h"
#include "recordingviewstatetarget.h"
#include "regions.h"

#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>

#include <QSignalSpy>
#include <QtTest>

using namespace HmiStateMachine;

class tst_HmiTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void itAllowsByDefaultOnceItIsAsked();
    void itFiresOnEventsOfItsNameOnly_data();
    void itFiresOnEventsOfItsNameOnly();
    void withoutANameItReactsToUnnamedEvents();
    void otherEventTypesAreIgnored();
    void entryAloneDoesNotFireIt();
    void withoutATargetItFiresInPlace();
    void theFilterComparesTypeAndValue_data();
    void theFilterComparesTypeAndValue();
    void anInvalidFilterAcceptsAnyDataAgain();
    void theFilterDecidesWhetherTheMachineMoves();
    void theGuardIsAskedOncePerMatchingEvent();
    void theGuardFindsTheDataInPlace();
    void dataIsKeptThoughTheGuardRefuses();
    void dataIsKeptThoughASiblingTakesTheEvent();
    void dataOfEventsThatDoNotMatchIsNotKept();
    void anEventWithoutDataClearsTheData();
    void anAnswerMayStillVeto();
    void aVoiceRequestIsPassedOn();
    void transitionsOfOneNameShareAGroup();
    void otherNamesHaveGroupsOfTheirOwn();
    void aGroupIsMadeOnceForTheApplication();
    void withoutASourceItHasNoParent();
};

void tst_HmiTransition::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(HmiTransition::staticMetaObject), QStringList());
    QCOMPARE(HmiTransition::staticMetaObject.superClass(), &GuardedTransition::staticMetaObject);
}

void tst_HmiTransition::itAllowsByDefaultOnceItIsAsked()
{
    HmiTransition named("Dial");
    HmiTransition unnamed;
    HmiEvent event("Dial", QVariant());

    QCOMPARE(named.allowTransitionDefault(), true);
    QCOMPARE(unnamed.allowTransitionDefault(), true);
    QCOMPARE(named.allowTransition(), false);
    QCOMPARE(unnamed.allowTransition(), false);
    QCOMPARE(named.transitionData(), QVariant());

    QVERIFY(named.internalEventTest(&event));

    QCOMPARE(named.allowTransition(), true);
}

void tst_HmiTransition::itFiresOnEventsOfItsNameOnly_data()
{
    QTest::addColumn<QString>("eventName");
    QTest::addColumn<QStringList>("active");

    QTest::newRow("its own") << "Dial" << QStringList{"RadioAway"};
    QTest::newRow("another") << "Hang up" << QStringList{"RadioHome"};
    QTest::newRow("other case") << "dial" << QStringList{"RadioHome"};
    QTest::newRow("a longer one") << "Dial again" << QStringList{"RadioHome"};
    QTest::newRow("none") << "" << QStringList{"RadioHome"};
}

void tst_HmiTransition::itFiresOnEventsOfItsNameOnly()
{
    QFETCH(QString, eventName);
    QFETCH(QStringList, active);
    Regions regions({"Radio"});
    auto *transition = new HmiTransition("Dial", regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    regions.post(eventName);

    QCOMPARE(regions.active(), active);
}

void tst_HmiTransition::withoutANameItReactsToUnnamedEvents()
{
    Regions regions({"Radio"});
    auto *transition = new HmiTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    regions.post("Dial");
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    regions.post("");

    QCOMPARE(regions.active(), QStringList{"RadioAway"});
}

void tst_HmiTransition::otherEventTypesAreIgnored()
{
    Journal journal;
    Regions regions({"Radio"});
    auto *transition = new HmiTransition("Dial", regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    record(transition, "guard", journal);
    regions.start();

    regions.post(new HmiViewEvent("Dial", 5));
    regions.post(new QEvent(QEvent::User));

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    QCOMPARE(journal.lines(), QStringList());
    QCOMPARE(transition->transitionData(), QVariant());
}

void tst_HmiTransition::entryAloneDoesNotFireIt()
{
    Regions regions({"Radio"});
    auto *transition = new HmiTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    int asked = 0;
    connect(transition, &HmiTransition::transitionTest, [&] { ++asked; });

    regions.start();

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    QCOMPARE(asked, 0);
}

void tst_HmiTransition::withoutATargetItFiresInPlace()
{
    Regions regions({"Radio"});
    auto *transition = new HmiTransition("Dial", regions.home("Radio"));
    transition->setNamedTargetState("Nowhere");
    QSignalSpy triggered(transition, &HmiTransition::triggered);
    QSignalSpy exited(regions.home("Radio"), &QState::exited);
    QVERIFY(triggered.isValid() && exited.isValid());
    regions.start();

    regions.post("Dial");

    QCOMPARE(triggered.size(), 1);
    QCOMPARE(exited.size(), 0);
}

void tst_HmiTransition::theFilterComparesTypeAndValue_data()
{
    QTest::addColumn<QVariant>("filter");
    QTest::addColumn<QVariant>("data");
    QTest::addColumn<bool>("accepted");

    const QVariant none;
    const QVariant five(5);
    QTest::newRow("no filter, no data") << none << none << true;
    QTest::newRow("no filter, any data") << none << five << true;
    QTest::newRow("int, equal") << five << QVariant(5) << true;
    QTest::newRow("int, another") << five << QVariant(6) << false;
    QTest::newRow("int, unsigned") << five << QVariant(5u) << false;
    QTest::newRow("int, long") << five << QVariant(5ll) << false;
    QTest::newRow("int, double") << five << QVariant(5.0) << false;
    QTest::newRow("int, text") << five << QVariant("5") << false;
    QTest::newRow("int, bool") << QVariant(1) << QVariant(true) << false;
    QTest::newRow("int, no data") << five << none << false;
    QTest::newRow("zero, no data") << QVariant(0) << none << false;
    QTest::newRow("unsigned, int") << QVariant(5u) << five << false;
    QTest::newRow("text, equal") << QVariant("jazz") << QVariant("jazz") << true;
    QTest::newRow("text, other case") << QVariant("jazz") << QVariant("Jazz") << false;
    QTest::newRow("text, bytes") << QVariant("jazz") << QVariant(QByteArray("jazz")) << false;
    QTest::newRow("empty text, no data") << QVariant("") << none << false;
    QTest::newRow("list, equal") << QVariant(QVariantList{1, "a"}) << QVariant(QVariantList{1, "a"})
                                 << true;
    QTest::newRow("list, longer") << QVariant(QVariantList{1}) << QVariant(QVariantList{1, 2})
                                  << false;
    QTest::newRow("list, text list")
        << QVariant(QVariantList{"a"}) << QVariant(QStringList{"a"}) << false;
}

void tst_HmiTransition::theFilterComparesTypeAndValue()
{
    QFETCH(QVariant, filter);
    QFETCH(QVariant, data);
    QFETCH(bool, accepted);
    HmiTransition transition("Dial");
    HmiEvent event("Dial", data);

    transition.setEventDataFilter(filter);

    QCOMPARE(transition.dataTest(data), accepted);
    QCOMPARE(transition.internalEventTest(&event), accepted);
}

void tst_HmiTransition::anInvalidFilterAcceptsAnyDataAgain()
{
    HmiTransition transition("Dial");
    transition.setEventDataFilter(5);
    QVERIFY(!transition.dataTest("112"));

    transition.setEventDataFilter("112");
    QVERIFY(transition.dataTest("112"));
    QVERIFY(!transition.dataTest(5));
    transition.setEventDataFilter(QVariant());

    QVERIFY(transition.dataTest(5));
    QVERIFY(transition.dataTest(QVariant()));
}

void tst_HmiTransition::theFilterDecidesWhetherTheMachineMoves()
{
    Regions regions({"Radio"});
    auto *transition = new HmiTransition("Dial", regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    transition->setEventDataFilter(5);
    regions.start();

    regions.post(new HmiEvent("Dial", 5u));
    regions.post(new HmiEvent("Dial", QVariant()));
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    regions.post(new HmiEvent("Dial", 5));

    QCOMPARE(regions.active(), QStringList{"RadioAway"});
}

void tst_HmiTransition::theGuardIsAskedOncePerMatchingEvent()
{
    Journal journal;
    Regions regions({"Radio"});
    auto *transition = new HmiTransition("Dial", regions.home("Radio"));
    transition->setEventDataFilter(5);
    answer(transition, false);
    record(transition, "guard", journal);
    regions.start();

    regions.post(new HmiEvent("Hang up", 5));
    regions.post(new HmiEvent("Dial", 6));
    QCOMPARE(journal.lines(), QStringList());
    regions.post(new HmiEvent("Dial", 5));

    QCOMPARE(journal.lines(), QStringList({"guard asked", "guard refused"}));
}

void tst_HmiTransition::theGuardFindsTheDataInPlace()
{
    Regions regions({"Radio"});
    auto *transition = new HmiTransition("Dial", regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    QVariant seen;
    connect(transition, &HmiTransition::transitionTest,
            [&] { seen = transition->transitionData(); });
    regions.start();

    regions.post(new HmiEvent("Dial", "112"));

    QCOMPARE(seen, QVariant("112"));
}

void tst_HmiTransition::dataIsKeptThoughTheGuardRefuses()
{
    Regions regions({"Radio"});
    auto *transition = new HmiTransition("Dial", regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    transition->setAllowTransitionDefault(false);
    regions.start();

    regions.post(new HmiEvent("Dial", 5));

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    QCOMPARE(transition->transitionData(), QVariant(5));
}

void tst_HmiTransition::dataIsKeptThoughASiblingTakesTheEvent()
{
    Regions regions({"Radio", "Map"});
    auto *radio = new HmiTransition("Keep data", regions.home("Radio"));
    auto *map = new HmiTransition("Keep data", regions.home("Map"));
    radio->setTargetState(regions.away("Radio"));
    map->setTargetState(regions.away("Map"));
    QVERIFY(radio->makeParallelExclusive(1));
    QVERIFY(map->makeParallelExclusive(2));
    regions.start();

    regions.post(new HmiEvent("Keep data", 5));

    QCOMPARE(regions.active(), QStringList({"RadioHome", "MapAway"}));
    QCOMPARE(radio->transitionData(), QVariant(5));
    QCOMPARE(map->transitionData(), QVariant(5));
}

void tst_HmiTransition::dataOfEventsThatDoNotMatchIsNotKept()
{
    Regions regions({"Radio"});
    auto *transition = new HmiTransition("Dial", regions.home("Radio"));
    transition->setEventDataFilter(5);
    regions.start();
    regions.post(new HmiEvent("Dial", 5));

    regions.post(new HmiEvent("Dial", 6));
    QCOMPARE(transition->transitionData(), QVariant(5));
    regions.post(new HmiEvent("Hang up", 7));

    QCOMPARE(transition->transitionData(), QVariant(5));
}

void tst_HmiTransition::anEventWithoutDataClearsTheData()
{
    Regions regions({"Radio"});
    auto *transition = new HmiTransition("Dial", regions.home("Radio"));
    regions.start();
    regions.post(new HmiEvent("Dial", 5));
    QCOMPARE(transition->transitionData(), QVariant(5));

    regions.post("Dial");

    QVERIFY(!transition->transitionData().isValid());
}

void tst_HmiTransition::anAnswerMayStillVeto()
{
    Regions regions({"Radio"});
    auto *transition = new HmiTransition("Dial", regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    answer(transition, false);
    regions.start();

    regions.post("Dial");

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
}

void tst_HmiTransition::aVoiceRequestIsPassedOn()
{
    Journal journal;
    RecordingViewStateTarget viewLayer(journal);
    Regions regions({"Radio"});
    auto *transition = new HmiTransition("Dial", regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    transition->setIsVREventTransition(true, 7);
    regions.start();
    QCOMPARE(viewLayer.vrViewRequest(), false);

    regions.post("Dial");

    QCOMPARE(viewLayer.vrViewRequest(), true);
    QCOMPARE(viewLayer.vrViewRequestData(), QVariant(7));
}

void tst_HmiTransition::transitionsOfOneNameShareAGroup()
{
    Regions regions({"Radio", "Map"});
    auto *radio = new HmiTransition("Share", regions.home("Radio"));
    auto *map = new HmiTransition("Share", regions.home("Map"));
    radio->setTargetState(regions.away("Radio"));
    map->setTargetState(regions.away("Map"));

    QVERIFY(radio->makeParallelExclusive(1));
    QVERIFY(radio->makeParallelExclusive(1));
    QVERIFY(!map->makeParallelExclusive(1));
    QVERIFY(map->makeParallelExclusive(2));
    regions.start();
    regions.post("Share");

    QCOMPARE(regions.active(), QStringList({"RadioHome", "MapAway"}));
}

void tst_HmiTransition::otherNamesHaveGroupsOfTheirOwn()
{
    Regions regions({"Radio", "Map"});
    auto *radio = new HmiTransition("Own group of the radio", regions.home("Radio"));
    auto *map = new HmiTransition("Own group of the map", regions.home("Map"));

    QVERIFY(radio->makeParallelExclusive(1));
    QVERIFY(map->makeParallelExclusive(1));
}

void tst_HmiTransition::aGroupIsMadeOnceForTheApplication()
{
    NamedState source("GroupSource");
    HmiTransition first("Make one group", &source);
    HmiTransition second("Make one group", &source);
    const int before = qApp->findChildren<ParallelSiblingTransitionGroup *>().size();

    QVERIFY(first.makeParallelExclusive(1));
    QVERIFY(second.makeParallelExclusive(2));

    const auto groups = qApp->findChildren<ParallelSiblingTransitionGroup *>();
    QCOMPARE(groups.size(), before + 1);
    QCOMPARE(groups.last()->parent(), qApp);
}

void tst_HmiTransition::withoutASourceItHasNoParent()
{
    HmiTransition named("Dial", nullptr);
    HmiTransition unnamed(static_cast<QState *>(nullptr));

    QCOMPARE(named.parent(), nullptr);
    QCOMPARE(named.getSourceState(), nullptr);
    QCOMPARE(unnamed.getSourceState(), nullptr);
    QVERIFY(named.makeParallelExclusive(1));
}

QTEST_GUILESS_MAIN(tst_HmiTransition)
#include "tst_hmitransition.moc"
