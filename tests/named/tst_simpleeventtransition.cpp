#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"
#include "probestate.h"
#include "recordingviewstatetarget.h"
#include "regions.h"

#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/simpleeventtransition.h>

#include <QSignalSpy>
#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

using Types = QList<QEvent::Type>;
Q_DECLARE_METATYPE(Types)

namespace {

constexpr auto hmiType = QEvent::Type(1260);
constexpr auto viewType = QEvent::Type(1261);
constexpr auto popupType = QEvent::Type(1262);
constexpr auto backType = QEvent::Type(1263);

} // namespace

class tst_SimpleEventTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void itKeepsTheTypesItIsGiven();
    void aSingleTypeReplacesTheFirst();
    void withoutTypesTheFirstOneIsNone();
    void itFiresOnAnyOfItsTypes_data();
    void itFiresOnAnyOfItsTypes();
    void theContentOfAnEventDoesNotMatter();
    void newTypesCountFromTheNextEventOn();
    void theNoneTypeFiresOnEntryAtOnce();
    void withoutATargetItIsNotTakenOnEntry();
    void withoutATargetItStillReactsToEvents();
    void anUnknownTargetNameLeavesItFiringInPlace();
    void itIsListedDuringTheExitOfItsSourceOnly();
    void aVoiceRequestIsPassedOn_data();
    void aVoiceRequestIsPassedOn();
    void aVoiceRequestWithoutAViewLayerIsDropped();
    void transitionsOfTheSameTypesShareAGroup();
    void theOrderOfTheTypesTellsGroupsApart();
    void withoutASourceItIsHarmless();
};

void tst_SimpleEventTransition::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(SimpleEventTransition::staticMetaObject), QStringList());
    QCOMPARE(SimpleEventTransition::staticMetaObject.superClass(),
             &QAbstractTransition::staticMetaObject);
}

void tst_SimpleEventTransition::itKeepsTheTypesItIsGiven()
{
    SimpleEventTransition single(hmiType);
    SimpleEventTransition several(Types{viewType, backType, viewType});

    QCOMPARE(single.eventType(), hmiType);
    QCOMPARE(single.eventTypes(), Types{hmiType});
    QCOMPARE(several.eventType(), viewType);
    QCOMPARE(several.eventTypes(), Types({viewType, backType, viewType}));

    several.setEventTypes({popupType});

    QCOMPARE(several.eventTypes(), Types{popupType});
}

void tst_SimpleEventTransition::aSingleTypeReplacesTheFirst()
{
    SimpleEventTransition transition(Types{hmiType, viewType});

    transition.setEventType(backType);

    QCOMPARE(transition.eventType(), backType);
    QCOMPARE(transition.eventTypes(), Types({backType, viewType}));
}

void tst_SimpleEventTransition::withoutTypesTheFirstOneIsNone()
{
    SimpleEventTransition transition{Types()};
    QCOMPARE(transition.eventType(), QEvent::None);

    transition.setEventType(hmiType);

    QCOMPARE(transition.eventTypes(), Types{hmiType});
}

void tst_SimpleEventTransition::itFiresOnAnyOfItsTypes_data()
{
    QTest::addColumn<Types>("types");
    QTest::addColumn<int>("posted");
    QTest::addColumn<QStringList>("active");

    const QStringList home{"RadioHome"};
    const QStringList away{"RadioAway"};
    const Types two{hmiType, viewType};
    QTest::newRow("the first of two") << two << 1260 << away;
    QTest::newRow("the second of two") << two << 1261 << away;
    QTest::newRow("neither of two") << two << 1262 << home;
    QTest::newRow("the only one") << Types{backType} << 1263 << away;
    QTest::newRow("not the only one") << Types{backType} << 1264 << home;
    QTest::newRow("twice in the list") << Types{hmiType, hmiType} << 1260 << away;
    QTest::newRow("empty list") << Types{} << 1260 << home;
    QTest::newRow("a type of Qt's") << Types{QEvent::User} << 1000 << away;
}

void tst_SimpleEventTransition::itFiresOnAnyOfItsTypes()
{
    QFETCH(Types, types);
    QFETCH(int, posted);
    QFETCH(QStringList, active);
    Regions regions({"Radio"});
    auto *transition = new SimpleEventTransition(types, regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    // The helper's own transitions read an HmiEvent, so the event has to be a real one.
    auto *event =
        posted == 1260 ? new HmiEvent("Dial", QVariant()) : new QEvent(QEvent::Type(posted));
    regions.start();

    regions.post(event);

    QCOMPARE(regions.active(), active);
}

void tst_SimpleEventTransition::theContentOfAnEventDoesNotMatter()
{
    Regions regions({"Radio"});
    auto *transition =
        new SimpleEventTransition(Types{hmiType, viewType, popupType}, regions.home("Radio"));
    QSignalSpy triggered(transition, &SimpleEventTransition::triggered);
    QVERIFY(triggered.isValid());
    regions.start();

    regions.post(new HmiEvent("Dial", 5));
    regions.post(new HmiEvent("", QVariant()));
    regions.post(new HmiViewEvent("Nowhere", QVariant()));
    regions.post(new PopupEvent("", QVariant()));
    regions.post(new HmiBackEvent(1, "Radio"));

    QCOMPARE(triggered.size(), 4);
}

void tst_SimpleEventTransition::newTypesCountFromTheNextEventOn()
{
    Regions regions({"Radio"});
    auto *transition = new SimpleEventTransition(viewType, regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    transition->setEventType(backType);
    regions.post(new HmiViewEvent("Radio", QVariant()));
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    regions.post(new HmiBackEvent(1, QString()));

    QCOMPARE(regions.active(), QStringList{"RadioAway"});
}

void tst_SimpleEventTransition::theNoneTypeFiresOnEntryAtOnce()
{
    Regions regions({"Radio"});
    auto *transition = new SimpleEventTransition(QEvent::None, regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    QSignalSpy triggered(transition, &SimpleEventTransition::triggered);
    QVERIFY(triggered.isValid());

    regions.start();

    QCOMPARE(regions.active(), QStringList{"RadioAway"});
    QCOMPARE(triggered.size(), 1);
}

void tst_SimpleEventTransition::withoutATargetItIsNotTakenOnEntry()
{
    Regions regions({"Radio"});
    auto *transition = new SimpleEventTransition(QEvent::None, regions.home("Radio"));
    QSignalSpy triggered(transition, &SimpleEventTransition::triggered);
    QVERIFY(triggered.isValid());

    regions.start();
    regions.leave("Radio");
    regions.comeBack("Radio");

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    QCOMPARE(triggered.size(), 0);
    QCOMPARE(messages().take(),
             QStringList{"warning eventTest: Eventless transition without a target is not taken, "
                         "source state: \"RadioHome\""});
}

void tst_SimpleEventTransition::withoutATargetItStillReactsToEvents()
{
    Regions regions({"Radio"});
    auto *transition =
        new SimpleEventTransition(Types{QEvent::None, viewType}, regions.home("Radio"));
    QSignalSpy triggered(transition, &SimpleEventTransition::triggered);
    QVERIFY(triggered.isValid());
    regions.start();

    regions.post(new HmiViewEvent("Radio", QVariant()));
    regions.post(new HmiBackEvent(1, QString()));

    QCOMPARE(triggered.size(), 1);
    QCOMPARE(messages().take().size(), 1);
}

void tst_SimpleEventTransition::anUnknownTargetNameLeavesItFiringInPlace()
{
    Regions regions({"Radio"});
    auto *transition = new SimpleEventTransition(viewType, regions.home("Radio"));
    transition->setNamedTargetState("RadioAway");
    QCOMPARE(transition->targetName(), QString("RadioAway"));
    transition->setNamedTargetState("Nowhere");
    QSignalSpy triggered(transition, &SimpleEventTransition::triggered);
    QVERIFY(triggered.isValid());
    regions.start();

    regions.post(new HmiViewEvent("Radio", QVariant()));

    QCOMPARE(triggered.size(), 1);
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
}

void tst_SimpleEventTransition::itIsListedDuringTheExitOfItsSourceOnly()
{
    Journal journal;
    QStateMachine machine;
    auto *source = new ProbeState(journal, "ListedSource", &machine);
    auto *target = new ProbeState(journal, "ListedTarget", &machine);
    auto *transition = new SimpleEventTransition(viewType, source);
    transition->setTargetState(target);
    startIn(machine, source);
    journal.clear();

    machine.postEvent(new HmiViewEvent("Radio", QVariant()));
    settle();

    QCOMPARE(journal.lines(),
             QStringList({"ListedSource exit, firing 1", "ListedTarget entry, firing 0"}));
}

void tst_SimpleEventTransition::aVoiceRequestIsPassedOn_data()
{
    QTest::addColumn<bool>("marked");
    QTest::addColumn<QVariant>("data");

    QTest::newRow("marked") << true << QVariant(7);
    QTest::newRow("not marked") << false << QVariant();
}

void tst_SimpleEventTransition::aVoiceRequestIsPassedOn()
{
    QFETCH(bool, marked);
    QFETCH(QVariant, data);
    Journal journal;
    RecordingViewStateTarget viewLayer(journal);
    Regions regions({"Radio"});
    auto *transition = new SimpleEventTransition(viewType, regions.home("Radio"));
    transition->setIsVREventTransition(marked, 7);
    regions.start();

    regions.post(new HmiViewEvent("Radio", QVariant()));

    QCOMPARE(viewLayer.vrViewRequest(), marked);
    QCOMPARE(viewLayer.vrViewRequestData(), data);
}

void tst_SimpleEventTransition::aVoiceRequestWithoutAViewLayerIsDropped()
{
    Regions regions({"Radio"});
    auto *transition = new SimpleEventTransition(viewType, regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    transition->setIsVREventTransition(true, 7);
    regions.start();

    regions.post(new HmiViewEvent("Radio", QVariant()));

    QCOMPARE(regions.active(), QStringList{"RadioAway"});
}

void tst_SimpleEventTransition::transitionsOfTheSameTypesShareAGroup()
{
    Regions regions({"Radio", "Map"});
    const Types types{QEvent::Type(2001), QEvent::Type(2002)};
    auto *radio = new SimpleEventTransition(types, regions.home("Radio"));
    auto *map = new SimpleEventTransition(types, regions.home("Map"));
    radio->setTargetState(regions.away("Radio"));
    map->setTargetState(regions.away("Map"));

    QVERIFY(radio->makeParallelExclusive(1));
    QVERIFY(!map->makeParallelExclusive(1));
    QVERIFY(map->makeParallelExclusive(2));
    regions.start();
    regions.post(new QEvent(QEvent::Type(2002)));
    QCOMPARE(regions.active(), QStringList({"RadioHome", "MapAway"}));
    regions.post(new QEvent(QEvent::Type(2001)));

    QCOMPARE(regions.active(), QStringList({"RadioAway", "MapAway"}));
}

void tst_SimpleEventTransition::theOrderOfTheTypesTellsGroupsApart()
{
    NamedState source("OrderedSource");
    const int before = qApp->findChildren<ParallelSiblingTransitionGroup *>().size();
    SimpleEventTransition forwards(Types{QEvent::Type(2011), QEvent::Type(2012)}, &source);
    SimpleEventTransition backwards(Types{QEvent::Type(2012), QEvent::Type(2011)}, &source);
    SimpleEventTransition onlyOne(QEvent::Type(2011), &source);
    SimpleEventTransition asList(Types{QEvent::Type(2011)}, &source);

    QVERIFY(forwards.makeParallelExclusive(1));
    QVERIFY(backwards.makeParallelExclusive(1));
    QVERIFY(onlyOne.makeParallelExclusive(1));
    QVERIFY(!asList.makeParallelExclusive(1));

    QCOMPARE(qApp->findChildren<ParallelSiblingTransitionGroup *>().size(), before + 3);
}

void tst_SimpleEventTransition::withoutASourceItIsHarmless()
{
    NamedState target("HomelessTarget");
    SimpleEventTransition transition(QEvent::Type(2021), nullptr);

    transition.changeTarget(&target);

    QCOMPARE(transition.getSourceState(), nullptr);
    QCOMPARE(transition.getTarget(), &target);
    QVERIFY(transition.makeParallelExclusive(1));
}

QTEST_GUILESS_MAIN(tst_SimpleEventTransition)
#include "tst_simpleeventtransition.moc"
