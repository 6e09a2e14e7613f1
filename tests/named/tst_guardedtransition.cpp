#include "driving.h"
#include "guards.h"
#include "librarytest.h"
#include "metadescription.h"
#include "probestate.h"
#include "recordingviewstatetarget.h"
#include "regions.h"

#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>

#include <QSignalSpy>
#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

Q_DECLARE_METATYPE(QEvent *)

class tst_GuardedTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void itsMetaObjectIsAsPublished();
    void itDeniesAtFirst();
    void aFlagTellsOfRealChangesOnly();
    void theDefaultLeavesTheVerdictAlone();
    void itFiresAsTheDefaultSays_data();
    void itFiresAsTheDefaultSays();
    void eachRefusalTellsTheEvent();
    void anAllowingGuardTellsNoFailure();
    void theLastAnswerWins_data();
    void theLastAnswerWins();
    void theVerdictStartsAnewWithEachEvent();
    void theResetBeforeATestTellsNobody();
    void anAnswerIsToldForEachEvent();
    void aQueuedAnswerComesTooLate();
    void theGuardIsAskedAboutTheEntryItself();
    void anAllowingTransitionFiresOnEntryAtOnce();
    void withoutATargetItIsNotTakenOnEntry();
    void losingItsTargetAgainIsReportedAgain();
    void withoutATargetItStillReactsToEvents();
    void withWarningsOffItIsNotTakenEither();
    void anUnnamedSourceIsWarnedOfWithoutAName();
    void aDestroyedTargetIsNone();
    void aTargetIsFoundByItsName();
    void itIsListedFromItsTestToTheExitOfItsSource();
    void aRefusedTransitionIsNotListed();
    void aVoiceRequestReachesTheViewLayerBeforeTheTargetIsEntered();
    void anUnmarkedTransitionLeavesTheVoiceRequestAlone();
    void aRefusedVoiceRequestIsNotPassedOn();
    void aVoiceRequestWithoutAViewLayerIsDropped();
    void allGuardedTransitionsShareOneGroup();
    void theSharedGroupBelongsToTheApplication();
    void withoutASourceItJoinsWithoutTakingAPriority();
    void aTransitionWithoutASourceIsHarmless();
};

void tst_GuardedTransition::initTestCase()
{
    qRegisterMetaType<QEvent *>("QEvent*");
}

void tst_GuardedTransition::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(GuardedTransition::staticMetaObject),
             QStringList({"signal allowTransitionChanged(bool arg)",
                          "signal allowTransitionDefaultChanged(bool arg)",
                          "signal transitionTest(QEvent* e)", "signal testFailed(QEvent* e)",
                          "slot setAllowTransition(bool arg)",
                          "slot setAllowTransitionDefault(bool arg)",
                          "property bool allowTransition read write allowTransitionChanged(bool)",
                          "property bool allowTransitionDefault read write "
                          "allowTransitionDefaultChanged(bool)"}));
    QCOMPARE(GuardedTransition::staticMetaObject.superClass(),
             &QAbstractTransition::staticMetaObject);
}

void tst_GuardedTransition::itDeniesAtFirst()
{
    const GuardedTransition transition;

    QCOMPARE(transition.allowTransition(), false);
    QCOMPARE(transition.allowTransitionDefault(), false);
}

void tst_GuardedTransition::aFlagTellsOfRealChangesOnly()
{
    GuardedTransition transition;
    QSignalSpy verdict(&transition, &GuardedTransition::allowTransitionChanged);
    QSignalSpy byDefault(&transition, &GuardedTransition::allowTransitionDefaultChanged);
    QVERIFY(verdict.isValid() && byDefault.isValid());

    for (bool value : {false, true, true, false}) {
        QVERIFY(transition.setProperty("allowTransition", value));
        QCOMPARE(transition.property("allowTransition"), QVariant(value));
        QVERIFY(transition.setProperty("allowTransitionDefault", value));
        QCOMPARE(transition.property("allowTransitionDefault"), QVariant(value));
    }

    const QList<QVariantList> changes{{true}, {false}};
    QCOMPARE(verdict, changes);
    QCOMPARE(byDefault, changes);
}

void tst_GuardedTransition::theDefaultLeavesTheVerdictAlone()
{
    GuardedTransition transition;
    QSignalSpy verdict(&transition, &GuardedTransition::allowTransitionChanged);
    QVERIFY(verdict.isValid());

    transition.setAllowTransitionDefault(true);

    QCOMPARE(transition.allowTransition(), false);
    QCOMPARE(verdict.size(), 0);
}

void tst_GuardedTransition::itFiresAsTheDefaultSays_data()
{
    QTest::addColumn<bool>("allow");
    QTest::addColumn<QStringList>("active");

    QTest::newRow("denied") << false << QStringList{"RadioHome"};
    QTest::newRow("allowed") << true << QStringList{"RadioAway"};
}

void tst_GuardedTransition::itFiresAsTheDefaultSays()
{
    QFETCH(bool, allow);
    QFETCH(QStringList, active);
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();
    QCOMPARE(regions.active(), QStringList{"RadioHome"});

    transition->setAllowTransitionDefault(allow);
    regions.post(new QEvent(QEvent::User));

    QCOMPARE(regions.active(), active);
    QCOMPARE(transition->allowTransition(), allow);
}

void tst_GuardedTransition::eachRefusalTellsTheEvent()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    QList<QEvent *> asked;
    QList<QEvent *> failed;
    connect(transition, &GuardedTransition::transitionTest, [&](QEvent *e) { asked.append(e); });
    connect(transition, &GuardedTransition::testFailed, [&](QEvent *e) { failed.append(e); });
    regions.start();

    auto *first = new HmiEvent("Dial", QVariant());
    regions.post(first);
    auto *second = new QEvent(QEvent::User);
    regions.post(second);

    QCOMPARE(failed, asked);
    QCOMPARE(failed.count(first), 1);
    QVERIFY(failed.contains(second));
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
}

void tst_GuardedTransition::anAllowingGuardTellsNoFailure()
{
    Journal journal;
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    record(transition, "guard", journal);
    connect(transition, &GuardedTransition::transitionTest, transition,
            [transition](QEvent *e) { transition->setAllowTransition(e->type() == QEvent::User); });
    regions.start();

    regions.post(new QEvent(QEvent::User));

    QCOMPARE(regions.active(), QStringList{"RadioAway"});
    QCOMPARE(journal.lines(), QStringList{"guard asked"});
}

void tst_GuardedTransition::theLastAnswerWins_data()
{
    QTest::addColumn<bool>("byDefault");
    QTest::addColumn<QList<bool>>("answers");
    QTest::addColumn<QStringList>("active");

    const QStringList home{"RadioHome"};
    const QStringList away{"RadioAway"};
    QTest::newRow("no answer, denied by default") << false << QList<bool>{} << home;
    QTest::newRow("no answer, allowed by default") << true << QList<bool>{} << away;
    QTest::newRow("allowed") << false << QList<bool>{true} << away;
    QTest::newRow("denied") << true << QList<bool>{false} << home;
    QTest::newRow("allowed, then denied") << false << QList<bool>{true, false} << home;
    QTest::newRow("denied, then allowed") << false << QList<bool>{false, true} << away;
    QTest::newRow("vetoed, then allowed again") << true << QList<bool>{false, true} << away;
    QTest::newRow("three answers") << true << QList<bool>{false, true, false} << home;
}

void tst_GuardedTransition::theLastAnswerWins()
{
    QFETCH(bool, byDefault);
    QFETCH(QList<bool>, answers);
    QFETCH(QStringList, active);
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    transition->setAllowTransitionDefault(byDefault);
    for (bool value : qAsConst(answers)) {
        answer(transition, value);
    }
    regions.post(new QEvent(QEvent::User));

    QCOMPARE(regions.active(), active);
}

void tst_GuardedTransition::theVerdictStartsAnewWithEachEvent()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    bool once = false;
    connect(transition, &GuardedTransition::transitionTest, transition, [&] {
        if (once) {
            once = false;
            transition->setAllowTransition(true);
        }
    });
    regions.start();
    once = true;
    regions.post(new QEvent(QEvent::User));
    QCOMPARE(regions.active(), QStringList{"RadioAway"});
    regions.comeBack("Radio");

    regions.post(new QEvent(QEvent::User));

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    QCOMPARE(transition->allowTransition(), false);
}

void tst_GuardedTransition::theResetBeforeATestTellsNobody()
{
    GuardedTransition transition;
    transition.setAllowTransition(true);
    QSignalSpy verdict(&transition, &GuardedTransition::allowTransitionChanged);
    QVERIFY(verdict.isValid());
    QEvent event(QEvent::User);

    const bool denied = transition.internalEventTest(&event);
    transition.setAllowTransitionDefault(true);
    const bool allowed = transition.internalEventTest(&event);

    QCOMPARE(denied, false);
    QCOMPARE(allowed, true);
    QCOMPARE(verdict.size(), 0);
}

void tst_GuardedTransition::anAnswerIsToldForEachEvent()
{
    GuardedTransition transition;
    answer(&transition, true);
    QSignalSpy verdict(&transition, &GuardedTransition::allowTransitionChanged);
    QVERIFY(verdict.isValid());
    QEvent event(QEvent::User);

    QVERIFY(transition.internalEventTest(&event));
    QVERIFY(transition.internalEventTest(&event));

    // Each test has reset the verdict in silence, so each answer is a change.
    QCOMPARE(verdict, QList<QVariantList>({{true}, {true}}));
}

void tst_GuardedTransition::aQueuedAnswerComesTooLate()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    int answers = 0;
    connect(
        transition, &GuardedTransition::transitionTest, transition,
        [&] {
            ++answers;
            transition->setAllowTransition(true);
        },
        Qt::QueuedConnection);
    regions.start();

    regions.post(new QEvent(QEvent::User));
    regions.post(new QEvent(QEvent::User));
    settle(); // the answer to the second event

    QCOMPARE(answers, 5); // on entry, and twice for each event
    QCOMPARE(transition->allowTransition(), true);
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
}

void tst_GuardedTransition::theGuardIsAskedAboutTheEntryItself()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    QList<int> asked;
    connect(transition, &GuardedTransition::transitionTest,
            [&](QEvent *e) { asked.append(int(e->type())); });

    regions.start();

    QCOMPARE(asked, QList<int>{0});
}

void tst_GuardedTransition::anAllowingTransitionFiresOnEntryAtOnce()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    transition->setAllowTransitionDefault(true);
    QSignalSpy triggered(transition, &GuardedTransition::triggered);
    QVERIFY(triggered.isValid());

    regions.start();

    QCOMPARE(regions.active(), QStringList{"RadioAway"});
    QCOMPARE(triggered.size(), 1);
}

void tst_GuardedTransition::withoutATargetItIsNotTakenOnEntry()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setAllowTransitionDefault(true);
    QSignalSpy triggered(transition, &GuardedTransition::triggered);
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

void tst_GuardedTransition::losingItsTargetAgainIsReportedAgain()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setAllowTransitionDefault(true);
    const QString warning =
        "warning eventTest: Eventless transition without a target is not taken, "
        "source state: \"RadioHome\"";
    regions.start();
    QCOMPARE(messages().take(), QStringList(warning));
    transition->setTargetState(regions.away("Radio"));
    regions.post(new QEvent(QEvent::User));
    QCOMPARE(regions.active(), QStringList{"RadioAway"});

    transition->setTargetState(nullptr);
    regions.comeBack("Radio");

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    QCOMPARE(messages().take(), QStringList(warning));
}

void tst_GuardedTransition::withoutATargetItStillReactsToEvents()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setAllowTransitionDefault(true);
    QSignalSpy triggered(transition, &GuardedTransition::triggered);
    QVERIFY(triggered.isValid());
    regions.start();
    QCOMPARE(triggered.size(), 0);
    QCOMPARE(messages().take().size(), 1);

    regions.post(new QEvent(QEvent::User));
    regions.post("Dial");

    QCOMPARE(triggered.size(), 2);
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    QVERIFY(NamedTargetTransitionBase::triggeringTransition().isEmpty());
}

void tst_GuardedTransition::withWarningsOffItIsNotTakenEither()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setAllowTransitionDefault(true);
    messages().disableWarnings();

    regions.start();

    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    QCOMPARE(messages().take(), QStringList());
}

void tst_GuardedTransition::anUnnamedSourceIsWarnedOfWithoutAName()
{
    QStateMachine machine;
    auto *source = new QState(&machine);
    auto *transition = new GuardedTransition(source);
    transition->setAllowTransitionDefault(true);

    startIn(machine, source);

    QVERIFY(machine.isRunning());
    QCOMPARE(messages().take(),
             QStringList{"warning eventTest: Eventless transition without a target is not taken, "
                         "source state: \"\""});
}

void tst_GuardedTransition::aDestroyedTargetIsNone()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    auto *target = new NamedState("RadioGone", regions.home("Radio")->parentState());
    transition->setTargetState(target);
    regions.start();

    delete target;
    transition->setAllowTransitionDefault(true);
    regions.post(new QEvent(QEvent::User));

    QCOMPARE(transition->getTarget(), nullptr);
    QCOMPARE(transition->targetName(), QString());
    QCOMPARE(regions.active(), QStringList{"RadioHome"});
    QCOMPARE(messages().take().size(), 1);
}

void tst_GuardedTransition::aTargetIsFoundByItsName()
{
    Regions regions({"Radio"});
    GuardedTransition transition(regions.home("Radio"));

    transition.setNamedTargetState("RadioAway");

    QCOMPARE(transition.getTarget(), regions.away("Radio"));
    QCOMPARE(transition.targetState(), regions.away("Radio"));
    QCOMPARE(transition.targetName(), QString("RadioAway"));
    QCOMPARE(transition.getSourceState(), regions.home("Radio"));

    transition.setNamedTargetState("Nowhere");

    QCOMPARE(transition.getTarget(), nullptr);
}

void tst_GuardedTransition::itIsListedFromItsTestToTheExitOfItsSource()
{
    Journal journal;
    QStateMachine machine;
    auto *source = new ProbeState(journal, "ListedSource", &machine);
    auto *target = new ProbeState(journal, "ListedTarget", &machine);
    auto *transition = new GuardedTransition(source);
    transition->setTargetState(target);
    connect(transition, &GuardedTransition::triggered, [&] {
        const auto firing = NamedTargetTransitionBase::triggeringTransition();
        journal.add("triggered, firing " + QString::number(firing.size()));
    });
    startIn(machine, source);
    journal.clear();

    transition->setAllowTransitionDefault(true);
    machine.postEvent(new QEvent(QEvent::User));
    settle();

    QCOMPARE(journal.lines(),
             QStringList({"ListedSource exit, firing 1", "triggered, firing 0",
                          "ListedTarget entry, firing 0"}));
}

void tst_GuardedTransition::aRefusedTransitionIsNotListed()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    regions.start();

    regions.post(new QEvent(QEvent::User));

    QVERIFY(NamedTargetTransitionBase::triggeringTransition().isEmpty());
}

void tst_GuardedTransition::aVoiceRequestReachesTheViewLayerBeforeTheTargetIsEntered()
{
    Journal journal;
    RecordingViewStateTarget viewLayer(journal);
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    transition->setIsVREventTransition(true, "call home");
    connect(regions.home("Radio"), &QState::exited,
            [&] { journal.add(viewLayer.vrViewRequest() ? "exited, told" : "exited"); });
    connect(regions.away("Radio"), &QState::entered,
            [&] { journal.add(viewLayer.vrViewRequest() ? "entered, told" : "entered"); });
    regions.start();

    transition->setAllowTransitionDefault(true);
    regions.post(new QEvent(QEvent::User));

    QCOMPARE(journal.lines(), QStringList({"exited", "entered, told"}));
    QCOMPARE(viewLayer.vrViewRequestData(), QVariant("call home"));
}

void tst_GuardedTransition::anUnmarkedTransitionLeavesTheVoiceRequestAlone()
{
    Journal journal;
    RecordingViewStateTarget viewLayer(journal);
    viewLayer.setVRViewRequest(true, 5);
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    transition->setIsVREventTransition(false, 7);
    transition->setAllowTransitionDefault(true);

    regions.start();

    QCOMPARE(regions.active(), QStringList{"RadioAway"});
    QCOMPARE(viewLayer.vrViewRequest(), true);
    QCOMPARE(viewLayer.vrViewRequestData(), QVariant(5));
}

void tst_GuardedTransition::aRefusedVoiceRequestIsNotPassedOn()
{
    Journal journal;
    RecordingViewStateTarget viewLayer(journal);
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    transition->setIsVREventTransition(true, 7);
    regions.start();

    regions.post(new QEvent(QEvent::User));

    QCOMPARE(viewLayer.vrViewRequest(), false);
    QCOMPARE(viewLayer.vrViewRequestData(), QVariant());
}

void tst_GuardedTransition::aVoiceRequestWithoutAViewLayerIsDropped()
{
    Regions regions({"Radio"});
    auto *transition = new GuardedTransition(regions.home("Radio"));
    transition->setTargetState(regions.away("Radio"));
    transition->setIsVREventTransition(true, 7);
    transition->setAllowTransitionDefault(true);

    regions.start();

    QCOMPARE(regions.active(), QStringList{"RadioAway"});
}

void tst_GuardedTransition::allGuardedTransitionsShareOneGroup()
{
    Regions regions({"Radio", "Map"});
    auto *radio = new GuardedTransition(regions.home("Radio"));
    auto *map = new GuardedTransition(regions.home("Map"));
    radio->setTargetState(regions.away("Radio"));
    map->setTargetState(regions.away("Map"));
    QVERIFY(radio->makeParallelExclusive(101));
    QVERIFY(radio->makeParallelExclusive(101));
    QVERIFY(!map->makeParallelExclusive(101));
    QVERIFY(map->makeParallelExclusive(102));
    QVERIFY(!map->makeParallelExclusive(103));
    regions.start();
    QStringList fired;
    connect(radio, &GuardedTransition::triggered, [&] { fired.append("RadioAway"); });
    connect(map, &GuardedTransition::triggered, [&] { fired.append("MapAway"); });

    // The lower one is free again once the higher one's source has been left.
    radio->setAllowTransitionDefault(true);
    map->setAllowTransitionDefault(true);
    regions.post(new QEvent(QEvent::User));

    QCOMPARE(fired, QStringList({"MapAway", "RadioAway"}));
}

void tst_GuardedTransition::theSharedGroupBelongsToTheApplication()
{
    NamedState source("GroupSource");
    GuardedTransition first(&source);
    GuardedTransition second(&source);
    QVERIFY(first.makeParallelExclusive(111));
    const auto groups = qApp->findChildren<ParallelSiblingTransitionGroup *>();

    QVERIFY(second.makeParallelExclusive(112));

    QVERIFY(!groups.isEmpty());
    QCOMPARE(qApp->findChildren<ParallelSiblingTransitionGroup *>(), groups);
}

void tst_GuardedTransition::withoutASourceItJoinsWithoutTakingAPriority()
{
    NamedState source("LateSource");
    GuardedTransition homeless;
    GuardedTransition settled(&source);

    QVERIFY(homeless.makeParallelExclusive(121));
    QVERIFY(settled.makeParallelExclusive(121));
    QVERIFY(homeless.makeParallelExclusive(122));
}

void tst_GuardedTransition::aTransitionWithoutASourceIsHarmless()
{
    GuardedTransition transition;
    NamedState target("HomelessTarget");

    transition.changeTarget(&target);

    QCOMPARE(transition.getSourceState(), nullptr);
    QCOMPARE(transition.getTarget(), &target);
    QCOMPARE(transition.parent(), nullptr);

    transition.changeTarget(nullptr);

    QCOMPARE(transition.getTarget(), nullptr);
}

QTEST_GUILESS_MAIN(tst_GuardedTransition)
#include "tst_guardedtransition.moc"
