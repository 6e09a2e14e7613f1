#include "driving.h"
#include "guards.h"
#include "librarytest.h"
#include "metadescription.h"
#include "regions.h"

#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>
#include <HmiStateMachine/named/simpleeventtransition.h>

#include <QScopedPointer>
#include <QtTest>

#include <limits>
#include <memory>
#include <optional>

using namespace HmiStateMachine;

namespace {

constexpr int lowest = std::numeric_limits<int>::min();
constexpr int highest = std::numeric_limits<int>::max();

/** From the home of @p region to its other state, on the event "Go". */
HmiTransition *makeTransition(const Regions &regions, const QString &region)
{
    auto *transition = new HmiTransition("Go", regions.home(region));
    transition->setTargetState(regions.away(region));
    return transition;
}

/** On the event "Detour" @p other is entered from @p state, and left again at once. */
void makeDetour(QState *state, QState *other)
{
    (new HmiTransition("Detour", state))->setTargetState(other);
    (new SimpleEventTransition(QEvent::None, other))->setTargetState(state);
}

} // namespace

class tst_ParallelSiblingTransitionGroup : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void theLargerNumberWins_data();
    void theLargerNumberWins();
    void theHighestIsSuppressedByNobody();
    void aRefusingGuardLeavesTheEventToTheLower();
    void ofThreeTheNextInRankTakesOver_data();
    void ofThreeTheNextInRankTakesOver();
    void siblingsAreAskedOncePerArbitratingTransition();
    void theFirstSiblingThatAcceptsEndsTheWalk();
    void membersMayBeOfAnyClass();
    void anInactiveSiblingIsNotAsked();
    void aSiblingCountsFromEntryToExitOfItsSource();
    void registeredWhileActiveItCountsFromTheNextEntryOn();
    void theSamePriorityAgainIsAccepted();
    void anotherPriorityIsRefusedAndLogged();
    void withDebugOffTheRefusalIsSilent();
    void aTakenPriorityIsRefusedSilently();
    void aRefusedPriorityStaysFree();
    void aPriorityIsTakenOnceHoweverOftenItIsGiven();
    void prioritiesMayRepeatInAnotherGroup();
    void withoutASourceATransitionTakesNoPriority();
    void withoutASourceATransitionRanksAtZero_data();
    void withoutASourceATransitionRanksAtZero();
    void withoutASourceATransitionIsNeverTracked();
    void aSourceFoundLaterMayBeRegistered();
    void anOutsiderRanksAtZero_data();
    void anOutsiderRanksAtZero();
    void aTransitionMovedBeforeEntryIsNotTracked();
    void aTransitionMovedWhileActiveIsNotTrackedByTheExit();
    void aTransitionMovedBackIsTrackedAgain();
    void joiningAgainAfterAMoveTracksNoNewSource();
    void anyOfTwoGroupsSuppresses_data();
    void anyOfTwoGroupsSuppresses();
    void theFirstGroupThatClaimsTheEventEndsTheTest();
    void aDestroyedGroupArbitratesNoMore();
    void destructionInAnyOrderLeavesNothingBehind_data();
    void destructionInAnyOrderLeavesNothingBehind();
    void aGroupOwnedByTheSourceGoesWithIt();
    void aDestroyedTransitionIsNeverReachedAgain();
    void aDestroyedInactiveSourceTakesItsTransitionAlong();
    void thePriorityOfADestroyedTransitionStaysTaken();
    void aPriorityStaysTakenWhenItsTransitionMovesAndDies();
    void thePriorityOfATransitionWithoutASourceIsNotTakenByItsEnd();
    void aTransitionAtTheSameAddressIsANewOne();
    void aNewTransitionAtTheSameAddressMayJoin();
    void aGuardMayDestroyASibling();
    void aGuardMayRegisterATransition();
    void aGuardMayAddAnotherGroup();
    void aGuardMayDestroyTheGroup();
    void aSiblingActivatedTwiceIsDeactivatedOnce();
    void nothingIsNoTransition();
    void aFunctorIsSaneWhileAllThreeAreInPlace();
    void aFunctorIsNotSaneWithoutItsGroup();
    void aFunctorIsNotSaneWithoutItsState();
    void aFunctorIsNotSaneForAnotherSource();
    void functorsActivateAndDeactivate();
    void functorsThatAreNotSaneDoNothing();
};

void tst_ParallelSiblingTransitionGroup::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(ParallelSiblingTransitionGroup::staticMetaObject),
             QStringList({"slot siblingActivated(NamedTargetTransitionBase* transition)",
                          "slot siblingDeactivated(NamedTargetTransitionBase* transition)"}));
    QCOMPARE(ParallelSiblingTransitionGroup::staticMetaObject.superClass(),
             &QObject::staticMetaObject);
}

void tst_ParallelSiblingTransitionGroup::theLargerNumberWins_data()
{
    QTest::addColumn<int>("radioPriority");
    QTest::addColumn<int>("mapPriority");
    QTest::addColumn<QStringList>("active");

    const QStringList map{"RadioHome", "MapAway"};
    const QStringList radio{"RadioAway", "MapHome"};
    QTest::newRow("second region higher") << 1 << 2 << map;
    QTest::newRow("first region higher") << 2 << 1 << radio;
    QTest::newRow("zero and one") << 0 << 1 << map;
    QTest::newRow("negative below zero") << -1 << 0 << map;
    QTest::newRow("positive above negative") << 1 << -2 << radio;
    QTest::newRow("two negative ones") << -3 << -5 << radio;
    QTest::newRow("the limits") << lowest << highest << map;
    QTest::newRow("the limits, swapped") << highest << lowest << radio;
}

void tst_ParallelSiblingTransitionGroup::theLargerNumberWins()
{
    QFETCH(int, radioPriority);
    QFETCH(int, mapPriority);
    QFETCH(QStringList, active);
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    QVERIFY(group.addTransition(makeTransition(regions, "Radio"), radioPriority));
    QVERIFY(group.addTransition(makeTransition(regions, "Map"), mapPriority));
    regions.start();

    regions.post("Go");

    QCOMPARE(regions.active(), active);
}

void tst_ParallelSiblingTransitionGroup::theHighestIsSuppressedByNobody()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *low = makeTransition(regions, "Radio");
    auto *high = makeTransition(regions, "Map");
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(high, 2));
    regions.start();
    HmiEvent event("Go", QVariant());
    HmiEvent other("Stop", QVariant());

    QCOMPARE(group.internalEventTest(high, &event), false);
    QCOMPARE(group.internalEventTest(low, &event), true);
    QCOMPARE(group.internalEventTest(low, &other), false);
    QCOMPARE(high->activeSiblingTest(&event), false);
    QCOMPARE(low->activeSiblingTest(&event), true);
}

void tst_ParallelSiblingTransitionGroup::aRefusingGuardLeavesTheEventToTheLower()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *high = makeTransition(regions, "Map");
    answer(high, false);
    QVERIFY(group.addTransition(makeTransition(regions, "Radio"), 1));
    QVERIFY(group.addTransition(high, 2));
    regions.start();

    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"RadioAway", "MapHome"}));
}

void tst_ParallelSiblingTransitionGroup::ofThreeTheNextInRankTakesOver_data()
{
    QTest::addColumn<bool>("mapAllows");
    QTest::addColumn<bool>("phoneAllows");
    QTest::addColumn<QStringList>("active");

    QTest::newRow("all accept") << true << true
                                << QStringList({"RadioHome", "MapHome", "PhoneAway"});
    QTest::newRow("the highest refuses")
        << true << false << QStringList({"RadioHome", "MapAway", "PhoneHome"});
    QTest::newRow("the middle one refuses")
        << false << true << QStringList({"RadioHome", "MapHome", "PhoneAway"});
    QTest::newRow("both refuse") << false << false
                                 << QStringList({"RadioAway", "MapHome", "PhoneHome"});
}

void tst_ParallelSiblingTransitionGroup::ofThreeTheNextInRankTakesOver()
{
    QFETCH(bool, mapAllows);
    QFETCH(bool, phoneAllows);
    QFETCH(QStringList, active);
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map", "Phone"});
    auto *map = makeTransition(regions, "Map");
    auto *phone = makeTransition(regions, "Phone");
    answer(map, mapAllows);
    answer(phone, phoneAllows);
    QVERIFY(group.addTransition(phone, 3));
    QVERIFY(group.addTransition(makeTransition(regions, "Radio"), 1));
    QVERIFY(group.addTransition(map, 2));
    regions.start();

    regions.post("Go");

    QCOMPARE(regions.active(), active);
}

void tst_ParallelSiblingTransitionGroup::siblingsAreAskedOncePerArbitratingTransition()
{
    Journal journal;
    ParallelSiblingTransitionGroup group;
    Regions regions({"Low", "Mid", "High"});
    int priority = 1;
    for (const char *name : {"Low", "Mid", "High"}) {
        auto *transition = makeTransition(regions, name);
        answer(transition, priority < 3);
        record(transition, name, journal);
        QVERIFY(group.addTransition(transition, priority++));
    }
    regions.start();

    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"LowHome", "MidAway", "HighHome"}));
    QCOMPARE(journal.lines(),
             QStringList({"Low asked", "Mid asked", // for the lowest
                          "Mid asked", "High asked", "High refused", // for the middle one
                          "High asked", "High refused"})); // for itself
}

void tst_ParallelSiblingTransitionGroup::theFirstSiblingThatAcceptsEndsTheWalk()
{
    Journal journal;
    ParallelSiblingTransitionGroup group;
    Regions regions({"Low", "Mid", "High"});
    auto *low = makeTransition(regions, "Low");
    auto *mid = makeTransition(regions, "Mid");
    auto *high = makeTransition(regions, "High");
    record(mid, "Mid", journal);
    record(high, "High", journal);
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(mid, 2));
    QVERIFY(group.addTransition(high, 3));
    regions.start();
    regions.leave("Mid");
    regions.comeBack("Mid");
    HmiEvent event("Go", QVariant());

    const bool taken = group.internalEventTest(low, &event);

    // In the order of activation: the middle one has been entered last.
    QCOMPARE(taken, true);
    QCOMPARE(journal.lines(), QStringList{"High asked"});
}

void tst_ParallelSiblingTransitionGroup::membersMayBeOfAnyClass()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *high = new SimpleEventTransition(QEvent::Type(1260), regions.home("Map"));
    high->setTargetState(regions.away("Map"));
    QVERIFY(group.addTransition(makeTransition(regions, "Radio"), 1));
    QVERIFY(group.addTransition(high, 2));
    regions.start();

    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"RadioHome", "MapAway"}));
}

void tst_ParallelSiblingTransitionGroup::anInactiveSiblingIsNotAsked()
{
    Journal journal;
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *high = makeTransition(regions, "Map");
    record(high, "Map", journal);
    QVERIFY(group.addTransition(makeTransition(regions, "Radio"), 1));
    QVERIFY(group.addTransition(high, 2));
    regions.beginAway("Map");
    regions.start();

    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"RadioAway", "MapAway"}));
    QCOMPARE(journal.lines(), QStringList());
}

void tst_ParallelSiblingTransitionGroup::aSiblingCountsFromEntryToExitOfItsSource()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *low = makeTransition(regions, "Radio");
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(makeTransition(regions, "Map"), 2));
    HmiEvent event("Go", QVariant());
    QList<bool> taken{group.internalEventTest(low, &event)};

    regions.start();
    taken.append(group.internalEventTest(low, &event));
    regions.leave("Map");
    taken.append(group.internalEventTest(low, &event));
    regions.comeBack("Map");
    taken.append(group.internalEventTest(low, &event));

    QCOMPARE(taken, QList<bool>({false, true, false, true}));
}

void tst_ParallelSiblingTransitionGroup::registeredWhileActiveItCountsFromTheNextEntryOn()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *low = makeTransition(regions, "Radio");
    auto *high = makeTransition(regions, "Map");
    regions.start();
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(high, 2));

    regions.post("Go");
    QCOMPARE(regions.active(), QStringList({"RadioAway", "MapAway"}));
    regions.comeBack("Radio");
    regions.comeBack("Map");
    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"RadioHome", "MapAway"}));
}

void tst_ParallelSiblingTransitionGroup::theSamePriorityAgainIsAccepted()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("AgainSource");
    HmiTransition transition("Go", &source);
    messages().enableDebug();

    QCOMPARE(group.addTransition(&transition, 3), true);
    QCOMPARE(group.addTransition(&transition, 3), true);

    QCOMPARE(messages().take(), QStringList());
}

void tst_ParallelSiblingTransitionGroup::anotherPriorityIsRefusedAndLogged()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *radio = makeTransition(regions, "Radio");
    NamedTargetTransitionBase *pointer = radio;
    QVERIFY(group.addTransition(radio, 3));
    QVERIFY(group.addTransition(makeTransition(regions, "Map"), 5));
    messages().enableDebug();

    const bool accepted = group.addTransition(radio, 9);

    const QString address = QString::number(quintptr(pointer), 16);
    QCOMPARE(accepted, false);
    QCOMPARE(messages().take(),
             QStringList({"debug addTransition: Altering a registered siblings priority is "
                          "prohibited.",
                          "debug addTransition: Sibling: 0x" + address,
                          "debug addTransition: Current priority: 3",
                          "debug addTransition: Proposed priority: 9"}));

    regions.start();
    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"RadioHome", "MapAway"}));
}

void tst_ParallelSiblingTransitionGroup::withDebugOffTheRefusalIsSilent()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("SilentSource");
    HmiTransition transition("Go", &source);
    QVERIFY(group.addTransition(&transition, 3));

    QCOMPARE(group.addTransition(&transition, 4), false);

    QCOMPARE(messages().take(), QStringList());
}

void tst_ParallelSiblingTransitionGroup::aTakenPriorityIsRefusedSilently()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map", "Phone"});
    auto *refused = makeTransition(regions, "Phone");
    QVERIFY(group.addTransition(makeTransition(regions, "Radio"), 1));
    QVERIFY(group.addTransition(makeTransition(regions, "Map"), 2));
    messages().enableDebug();

    QCOMPARE(group.addTransition(refused, 1), false);
    QCOMPARE(group.addTransition(refused, 2), false);

    QCOMPARE(messages().take(), QStringList());
    regions.start();
    regions.post("Go");

    // Outside of the group it neither yields nor takes the event from anybody.
    QCOMPARE(regions.active(), QStringList({"RadioHome", "MapAway", "PhoneAway"}));
}

void tst_ParallelSiblingTransitionGroup::aRefusedPriorityStaysFree()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("RefusedSource");
    HmiTransition first("Go", &source);
    HmiTransition second("Go", &source);
    QVERIFY(group.addTransition(&first, 1));

    QCOMPARE(group.addTransition(&first, 2), false);

    QCOMPARE(group.addTransition(&second, 2), true);
}

void tst_ParallelSiblingTransitionGroup::aPriorityIsTakenOnceHoweverOftenItIsGiven()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("OftenSource");
    auto *first = new HmiTransition("Go", &source);
    HmiTransition second("Go", &source);
    QVERIFY(group.addTransition(first, 0));
    QVERIFY(group.addTransition(first, 0));

    delete first;

    QCOMPARE(group.addTransition(&second, 0), false);
    QCOMPARE(group.addTransition(&second, 1), true);
}

void tst_ParallelSiblingTransitionGroup::prioritiesMayRepeatInAnotherGroup()
{
    ParallelSiblingTransitionGroup first;
    ParallelSiblingTransitionGroup second;
    Regions regions({"Radio", "Map"});
    QVERIFY(first.addTransition(makeTransition(regions, "Radio"), 1));
    QVERIFY(second.addTransition(makeTransition(regions, "Map"), 1));
    regions.start();

    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"RadioAway", "MapAway"}));
}

void tst_ParallelSiblingTransitionGroup::withoutASourceATransitionTakesNoPriority()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("SettledSource");
    HmiTransition homeless("Go");
    HmiTransition settled("Go", &source);
    messages().enableDebug();

    QCOMPARE(group.addTransition(&homeless, 1), true);
    QCOMPARE(group.addTransition(&homeless, 2), true);
    QCOMPARE(group.addTransition(&settled, 1), true);
    QCOMPARE(group.addTransition(&homeless, 1), false);

    QCOMPARE(messages().take(), QStringList());
}

void tst_ParallelSiblingTransitionGroup::withoutASourceATransitionRanksAtZero_data()
{
    QTest::addColumn<int>("siblingPriority");
    QTest::addColumn<bool>("suppressed");

    QTest::newRow("sibling above") << 1 << true;
    QTest::newRow("sibling at zero") << 0 << false;
    QTest::newRow("sibling below") << -1 << false;
}

void tst_ParallelSiblingTransitionGroup::withoutASourceATransitionRanksAtZero()
{
    QFETCH(int, siblingPriority);
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio"});
    HmiTransition homeless("Go");
    QVERIFY(group.addTransition(&homeless, 9));
    QVERIFY(group.addTransition(makeTransition(regions, "Radio"), siblingPriority));
    regions.start();
    HmiEvent event("Go", QVariant());

    // The transition knows of the group, though the group does not know the transition.
    QTEST(homeless.activeSiblingTest(&event), "suppressed");
}

void tst_ParallelSiblingTransitionGroup::withoutASourceATransitionIsNeverTracked()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *late = new HmiTransition("Go");
    QVERIFY(group.addTransition(late, 9));
    QVERIFY(group.addTransition(makeTransition(regions, "Radio"), -1));
    regions.home("Map")->addTransition(late);
    regions.start();

    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"RadioAway", "MapHome"}));
}

void tst_ParallelSiblingTransitionGroup::aSourceFoundLaterMayBeRegistered()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *late = new HmiTransition("Go");
    late->setTargetState(regions.away("Map"));
    QVERIFY(group.addTransition(late, 2));
    QVERIFY(group.addTransition(makeTransition(regions, "Radio"), 1));
    regions.home("Map")->addTransition(late);

    QVERIFY(group.addTransition(late, 2));
    regions.start();
    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"RadioHome", "MapAway"}));
}

void tst_ParallelSiblingTransitionGroup::anOutsiderRanksAtZero_data()
{
    withoutASourceATransitionRanksAtZero_data();
}

void tst_ParallelSiblingTransitionGroup::anOutsiderRanksAtZero()
{
    QFETCH(int, siblingPriority);
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *outsider = makeTransition(regions, "Radio");
    QVERIFY(group.addTransition(makeTransition(regions, "Map"), siblingPriority));
    regions.start();
    HmiEvent event("Go", QVariant());

    QTEST(group.internalEventTest(outsider, &event), "suppressed");
    QCOMPARE(outsider->activeSiblingTest(&event), false);
}

void tst_ParallelSiblingTransitionGroup::aTransitionMovedBeforeEntryIsNotTracked()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map", "Phone"});
    auto *low = makeTransition(regions, "Radio");
    auto *moved = makeTransition(regions, "Map");
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(moved, 2));

    regions.home("Phone")->addTransition(moved);
    regions.start();
    HmiEvent event("Go", QVariant());

    QCOMPARE(moved->getSourceState(), regions.home("Phone"));
    QCOMPARE(group.internalEventTest(low, &event), false);
}

void tst_ParallelSiblingTransitionGroup::aTransitionMovedWhileActiveIsNotTrackedByTheExit()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map", "Phone"});
    auto *low = makeTransition(regions, "Radio");
    auto *moved = makeTransition(regions, "Map");
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(moved, 2));
    regions.start();
    HmiEvent event("Go", QVariant());

    regions.home("Phone")->addTransition(moved);
    regions.leave("Map");

    // Nothing ends what the entry began: the state that was left is not its source any more.
    QCOMPARE(group.internalEventTest(low, &event), true);
}

void tst_ParallelSiblingTransitionGroup::aTransitionMovedBackIsTrackedAgain()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map", "Phone"});
    auto *low = makeTransition(regions, "Radio");
    auto *moved = makeTransition(regions, "Map");
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(moved, 2));
    regions.start();
    HmiEvent event("Go", QVariant());
    regions.home("Phone")->addTransition(moved);
    regions.leave("Map");
    regions.home("Map")->addTransition(moved);
    regions.comeBack("Map");
    QCOMPARE(group.internalEventTest(low, &event), true);

    regions.leave("Map");

    // It had been activated twice by then, and both are undone.
    QCOMPARE(group.internalEventTest(low, &event), false);
}

void tst_ParallelSiblingTransitionGroup::joiningAgainAfterAMoveTracksNoNewSource()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map", "Phone"});
    auto *low = makeTransition(regions, "Radio");
    auto *moved = makeTransition(regions, "Map");
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(moved, 2));
    regions.home("Phone")->addTransition(moved);

    QCOMPARE(group.addTransition(moved, 2), true);
    regions.start();
    HmiEvent event("Go", QVariant());

    QCOMPARE(group.internalEventTest(low, &event), false);
}

void tst_ParallelSiblingTransitionGroup::anyOfTwoGroupsSuppresses_data()
{
    QTest::addColumn<bool>("mapAllows");
    QTest::addColumn<bool>("phoneAllows");
    QTest::addColumn<QStringList>("active");

    QTest::newRow("both") << true << true << QStringList({"RadioHome", "MapAway", "PhoneAway"});
    QTest::newRow("the first") << true << false
                               << QStringList({"RadioHome", "MapAway", "PhoneHome"});
    QTest::newRow("the second") << false << true
                                << QStringList({"RadioHome", "MapHome", "PhoneAway"});
    QTest::newRow("neither") << false << false
                             << QStringList({"RadioAway", "MapHome", "PhoneHome"});
}

void tst_ParallelSiblingTransitionGroup::anyOfTwoGroupsSuppresses()
{
    QFETCH(bool, mapAllows);
    QFETCH(bool, phoneAllows);
    QFETCH(QStringList, active);
    ParallelSiblingTransitionGroup first;
    ParallelSiblingTransitionGroup second;
    Regions regions({"Radio", "Map", "Phone"});
    auto *radio = makeTransition(regions, "Radio");
    auto *map = makeTransition(regions, "Map");
    auto *phone = makeTransition(regions, "Phone");
    answer(map, mapAllows);
    answer(phone, phoneAllows);
    QVERIFY(first.addTransition(radio, 1) && first.addTransition(map, 2));
    QVERIFY(second.addTransition(radio, 1) && second.addTransition(phone, 2));
    regions.start();

    regions.post("Go");

    QCOMPARE(regions.active(), active);
}

void tst_ParallelSiblingTransitionGroup::theFirstGroupThatClaimsTheEventEndsTheTest()
{
    Journal journal;
    ParallelSiblingTransitionGroup first;
    ParallelSiblingTransitionGroup second;
    Regions regions({"Radio", "Map", "Phone"});
    auto *radio = makeTransition(regions, "Radio");
    auto *map = makeTransition(regions, "Map");
    auto *phone = makeTransition(regions, "Phone");
    record(map, "Map", journal);
    record(phone, "Phone", journal);
    QVERIFY(second.addTransition(radio, 1) && second.addTransition(phone, 2));
    QVERIFY(first.addTransition(radio, 1) && first.addTransition(map, 2));
    regions.start();
    HmiEvent event("Go", QVariant());

    QCOMPARE(radio->activeSiblingTest(&event), true);

    QCOMPARE(journal.lines(), QStringList{"Phone asked"});
}

void tst_ParallelSiblingTransitionGroup::aDestroyedGroupArbitratesNoMore()
{
    QScopedPointer<ParallelSiblingTransitionGroup> group(new ParallelSiblingTransitionGroup);
    Regions regions({"Radio", "Map"});
    auto *low = makeTransition(regions, "Radio");
    QVERIFY(group->addTransition(low, 1));
    QVERIFY(group->addTransition(makeTransition(regions, "Map"), 2));
    regions.start();

    group.reset();
    regions.leave("Map");
    regions.comeBack("Map");
    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"RadioAway", "MapAway"}));
}

void tst_ParallelSiblingTransitionGroup::destructionInAnyOrderLeavesNothingBehind_data()
{
    QTest::addColumn<QString>("order");

    QTest::newRow("state, group") << "sg";
    QTest::newRow("group, state") << "gs";
    QTest::newRow("transition, state, group") << "tsg";
    QTest::newRow("transition, group, state") << "tgs";
    QTest::newRow("group, transition, state") << "gts";
    QTest::newRow("transition off its state, state, group") << "osg";
    QTest::newRow("transition off its state, group, state") << "ogs";
}

void tst_ParallelSiblingTransitionGroup::destructionInAnyOrderLeavesNothingBehind()
{
    QFETCH(QString, order);
    Regions regions({"Radio", "Map"});
    regions.beginAway("Map");
    QPointer<QState> state(new NamedState("MapOther", regions.away("Map")->parentState()));
    QPointer<ParallelSiblingTransitionGroup> group(new ParallelSiblingTransitionGroup);
    QPointer<HmiTransition> transition(new HmiTransition("Go", state));
    QScopedPointer<HmiTransition> orphan;
    QVERIFY(group->addTransition(makeTransition(regions, "Radio"), 1));
    QVERIFY(group->addTransition(transition, 2));
    makeDetour(regions.away("Map"), state);
    regions.start();

    for (const QChar step : qAsConst(order)) {
        if (step == 's') {
            delete state;
        } else if (step == 'g') {
            delete group;
        } else if (step == 't') {
            delete transition;
        } else {
            state->removeTransition(transition);
            orphan.reset(transition);
        }
        regions.post("Detour");
        regions.post("Go");
        QCOMPARE(regions.active(), QStringList({"RadioAway", "MapAway"}));
        regions.comeBack("Radio");
    }
}

void tst_ParallelSiblingTransitionGroup::aGroupOwnedByTheSourceGoesWithIt()
{
    Regions regions({"Radio", "Map"});
    regions.beginAway("Map");
    auto *low = makeTransition(regions, "Radio");
    auto *state = new NamedState("MapOther", regions.away("Map")->parentState());
    auto *before = new HmiTransition("Go", state);
    auto *group = new ParallelSiblingTransitionGroup(state);
    auto *after = new HmiTransition("Go", state);
    QVERIFY(group->addTransition(low, 1));
    QVERIFY(group->addTransition(before, 2) && group->addTransition(after, 3));
    regions.start();

    delete state;
    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"RadioAway", "MapAway"}));
}

void tst_ParallelSiblingTransitionGroup::aDestroyedTransitionIsNeverReachedAgain()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *low = makeTransition(regions, "Radio");
    auto *high = makeTransition(regions, "Map");
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(high, 2));
    regions.start();
    HmiEvent event("Go", QVariant());
    QCOMPARE(group.internalEventTest(low, &event), true);

    delete high;

    QCOMPARE(group.internalEventTest(low, &event), false);
    regions.leave("Map");
    regions.comeBack("Map");
    QCOMPARE(group.internalEventTest(low, &event), false);
    regions.post("Go");
    QCOMPARE(regions.active(), QStringList({"RadioAway", "MapHome"}));
}

void tst_ParallelSiblingTransitionGroup::aDestroyedInactiveSourceTakesItsTransitionAlong()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *low = makeTransition(regions, "Radio");
    auto *other = new NamedState("MapOther", regions.home("Map")->parentState());
    auto *high = new HmiTransition("Go", other);
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(high, 2));
    regions.start();
    group.siblingActivated(high);

    delete other;
    regions.post("Go");

    QCOMPARE(regions.active(), QStringList({"RadioAway", "MapHome"}));
}

void tst_ParallelSiblingTransitionGroup::thePriorityOfADestroyedTransitionStaysTaken()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("RetiringSource");
    NamedState other("RetiringOther");
    auto *first = new HmiTransition("Go", &source);
    auto *second = new HmiTransition("Go", &other);
    HmiTransition late("Go", &source);
    QVERIFY(group.addTransition(first, 1) && group.addTransition(second, -2));
    messages().enableDebug();

    delete first;
    delete second;

    QCOMPARE(group.addTransition(&late, 1), false);
    QCOMPARE(group.addTransition(&late, -2), false);
    QCOMPARE(group.addTransition(&late, 3), true);
    QCOMPARE(messages().take(), QStringList());
}

void tst_ParallelSiblingTransitionGroup::aPriorityStaysTakenWhenItsTransitionMovesAndDies()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("MovingSource");
    HmiTransition late("Go", &source);
    {
        NamedState other("MovingOther");
        auto *moved = new HmiTransition("Go", &source);
        QVERIFY(group.addTransition(moved, 1));
        moved->setParent(&other);
        QCOMPARE(group.addTransition(&late, 1), false);
    }

    QCOMPARE(group.addTransition(&late, 1), false);
    QCOMPARE(group.addTransition(&late, 2), true);
}

void tst_ParallelSiblingTransitionGroup::thePriorityOfATransitionWithoutASourceIsNotTakenByItsEnd()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("EndingSource");
    HmiTransition late("Go", &source);
    auto homeless = std::make_unique<HmiTransition>("Go");
    QVERIFY(group.addTransition(homeless.get(), 1));

    homeless.reset();

    QCOMPARE(group.addTransition(&late, 1), true);
}

void tst_ParallelSiblingTransitionGroup::aTransitionAtTheSameAddressIsANewOne()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *low = makeTransition(regions, "Radio");
    std::optional<HmiTransition> place;
    auto *old = &place.emplace("Go", regions.home("Map"));
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(old, 2));
    regions.start();
    HmiEvent event("Go", QVariant());

    place.reset();
    auto *fresh = &place.emplace("Go", regions.home("Map"));
    QCOMPARE(fresh, old);

    QCOMPARE(group.internalEventTest(low, &event), false);
    regions.leave("Map");
    regions.comeBack("Map");
    QCOMPARE(group.internalEventTest(low, &event), false);
    QCOMPARE(fresh->activeSiblingTest(&event), false);
}

void tst_ParallelSiblingTransitionGroup::aNewTransitionAtTheSameAddressMayJoin()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Radio", "Map"});
    auto *low = makeTransition(regions, "Radio");
    std::optional<HmiTransition> place;
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(&place.emplace("Go", regions.home("Map")), 2));
    regions.start();
    messages().enableDebug();

    auto *fresh = &place.emplace("Go", regions.home("Map"));
    QCOMPARE(group.addTransition(fresh, 2), false);
    QCOMPARE(group.addTransition(fresh, 3), true);

    QCOMPARE(messages().take(), QStringList());
    HmiEvent event("Go", QVariant());
    QCOMPARE(group.internalEventTest(low, &event), false);
    regions.leave("Map");
    regions.comeBack("Map");
    QCOMPARE(group.internalEventTest(low, &event), true);
}

void tst_ParallelSiblingTransitionGroup::aGuardMayDestroyASibling()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Low", "Mid", "High"});
    auto *mid = makeTransition(regions, "Mid");
    QPointer<HmiTransition> high(makeTransition(regions, "High"));
    connect(mid, &HmiTransition::transitionTest, mid, [&high, mid] {
        delete high;
        mid->setAllowTransition(false);
    });
    QVERIFY(group.addTransition(makeTransition(regions, "Low"), 1));
    QVERIFY(group.addTransition(mid, 2));
    QVERIFY(group.addTransition(high, 3));
    regions.start();

    regions.post("Go");

    QVERIFY(!high);
    QCOMPARE(regions.active(), QStringList({"LowAway", "MidHome", "HighHome"}));
}

void tst_ParallelSiblingTransitionGroup::aGuardMayRegisterATransition()
{
    ParallelSiblingTransitionGroup group;
    Regions regions({"Low", "Mid", "High"});
    auto *low = makeTransition(regions, "Low");
    auto *mid = makeTransition(regions, "Mid");
    auto *high = makeTransition(regions, "High");
    connect(mid, &HmiTransition::transitionTest, mid, [&group, mid, high] {
        group.addTransition(high, 3);
        group.siblingActivated(high);
        mid->setAllowTransition(false);
    });
    QVERIFY(group.addTransition(low, 1));
    QVERIFY(group.addTransition(mid, 2));
    regions.start();
    HmiEvent event("Go", QVariant());

    // A walk that has begun does not see it, the next one does.
    QCOMPARE(group.internalEventTest(low, &event), false);
    QCOMPARE(group.internalEventTest(low, &event), true);
}

void tst_ParallelSiblingTransitionGroup::aGuardMayAddAnotherGroup()
{
    ParallelSiblingTransitionGroup first;
    ParallelSiblingTransitionGroup second;
    Regions regions({"Low", "Mid", "High"});
    auto *low = makeTransition(regions, "Low");
    auto *mid = makeTransition(regions, "Mid");
    connect(mid, &HmiTransition::transitionTest, mid, [&second, low, mid] {
        second.addTransition(low, 1);
        mid->setAllowTransition(false);
    });
    QVERIFY(first.addTransition(low, 1) && first.addTransition(mid, 2));
    QVERIFY(second.addTransition(makeTransition(regions, "High"), 2));
    regions.start();
    HmiEvent event("Go", QVariant());

    QCOMPARE(low->activeSiblingTest(&event), false);
    QCOMPARE(low->activeSiblingTest(&event), true);
}

void tst_ParallelSiblingTransitionGroup::aGuardMayDestroyTheGroup()
{
    QPointer<ParallelSiblingTransitionGroup> group(new ParallelSiblingTransitionGroup);
    Regions regions({"Low", "Mid", "High"});
    auto *mid = makeTransition(regions, "Mid");
    connect(mid, &HmiTransition::transitionTest, mid, [&group, mid] {
        delete group;
        mid->setAllowTransition(false);
    });
    QVERIFY(group->addTransition(makeTransition(regions, "Low"), 1));
    QVERIFY(group->addTransition(mid, 2));
    QVERIFY(group->addTransition(makeTransition(regions, "High"), 3));
    regions.start();

    regions.post("Go");

    QVERIFY(!group);
    QCOMPARE(regions.active(), QStringList({"LowAway", "MidHome", "HighAway"}));
}

void tst_ParallelSiblingTransitionGroup::aSiblingActivatedTwiceIsDeactivatedOnce()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("TwiceSource");
    HmiTransition low("Go", &source);
    HmiTransition high("Go", &source);
    QVERIFY(group.addTransition(&low, 1) && group.addTransition(&high, 2));
    HmiEvent event("Go", QVariant());

    group.siblingActivated(&high);
    group.siblingActivated(&high);
    QCOMPARE(group.internalEventTest(&low, &event), true);
    group.siblingDeactivated(&high);

    QCOMPARE(group.internalEventTest(&low, &event), false);
}

void tst_ParallelSiblingTransitionGroup::nothingIsNoTransition()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("NothingSource");
    HmiTransition transition("Go", &source);
    HmiEvent event("Go", QVariant());

    QCOMPARE(group.addTransition(nullptr, 1), false);
    group.siblingActivated(nullptr);
    QVERIFY(group.addTransition(&transition, -1));
    QCOMPARE(group.internalEventTest(&transition, &event), false);
    group.siblingDeactivated(nullptr);

    QCOMPARE(group.internalEventTest(nullptr, &event), false);
}

void tst_ParallelSiblingTransitionGroup::aFunctorIsSaneWhileAllThreeAreInPlace()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("SaneSource");
    HmiTransition transition("Go", &source);
    const SiblingFunctorBase functor(&group, &transition, &source);

    QVERIFY(functor.sanityTest());

    const SiblingFunctorBase copy = functor;
    QVERIFY(copy.sanityTest());
}

void tst_ParallelSiblingTransitionGroup::aFunctorIsNotSaneWithoutItsGroup()
{
    auto *group = new ParallelSiblingTransitionGroup;
    NamedState source("GrouplessSource");
    auto *transition = new HmiTransition("Go", &source);
    const SiblingFunctorBase functor(group, transition, &source);
    const SiblingFunctorBase never(nullptr, transition, &source);

    delete group;

    QVERIFY(!functor.sanityTest());
    QVERIFY(!never.sanityTest());
    delete transition;
    QVERIFY(!functor.sanityTest());
}

void tst_ParallelSiblingTransitionGroup::aFunctorIsNotSaneWithoutItsState()
{
    ParallelSiblingTransitionGroup group;
    auto *source = new NamedState("GoneSource");
    HmiTransition transition("Go", source);
    const SiblingFunctorBase functor(&group, &transition, source);

    source->removeTransition(&transition);
    delete source;
    const SiblingFunctorBase never(&group, &transition, nullptr);

    // The transition has no source either, and that is no match.
    QCOMPARE(transition.getSourceState(), nullptr);
    QVERIFY(!functor.sanityTest());
    QVERIFY(!never.sanityTest());
}

void tst_ParallelSiblingTransitionGroup::aFunctorIsNotSaneForAnotherSource()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("FirstSource");
    NamedState other("OtherSource");
    HmiTransition transition("Go", &source);
    const SiblingFunctorBase functor(&group, &transition, &source);

    other.addTransition(&transition);
    QVERIFY(!functor.sanityTest());
    source.addTransition(&transition);

    QVERIFY(functor.sanityTest());
}

void tst_ParallelSiblingTransitionGroup::functorsActivateAndDeactivate()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("FunctorSource");
    HmiTransition low("Go", &source);
    HmiTransition high("Go", &source);
    QVERIFY(group.addTransition(&low, 1) && group.addTransition(&high, 2));
    const SiblingActivatedFunctor activated(&group, &high, &source);
    const SiblingDeactivatedFunctor deactivated(&group, &high, &source);
    HmiEvent event("Go", QVariant());

    activated();
    QCOMPARE(group.internalEventTest(&low, &event), true);
    deactivated();

    QCOMPARE(group.internalEventTest(&low, &event), false);
}

void tst_ParallelSiblingTransitionGroup::functorsThatAreNotSaneDoNothing()
{
    ParallelSiblingTransitionGroup group;
    NamedState source("LeftSource");
    NamedState other("NewSource");
    HmiTransition low("Go", &source);
    HmiTransition high("Go", &source);
    QVERIFY(group.addTransition(&low, 1) && group.addTransition(&high, 2));
    const SiblingActivatedFunctor activated(&group, &high, &source);
    const SiblingDeactivatedFunctor deactivated(&group, &high, &source);
    HmiEvent event("Go", QVariant());

    other.addTransition(&high);
    activated();
    QCOMPARE(group.internalEventTest(&low, &event), false);
    group.siblingActivated(&high);
    deactivated();

    QCOMPARE(group.internalEventTest(&low, &event), true);
}

QTEST_GUILESS_MAIN(tst_ParallelSiblingTransitionGroup)
#include "tst_parallelsiblingtransitiongroup.moc"
