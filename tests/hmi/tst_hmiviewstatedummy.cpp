#include "driving.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmibacktransition.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>

#include <QSignalSpy>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** A flow with a dummy in it, and two views to come from. */
struct DummyFlow : public ViewFlow
{
    /** The target names of the dummy's own transitions for back presses. */
    QStringList backTargets() const
    {
        QStringList names;
        const auto transitions = dummy->findChildren<HmiBackTransition *>();
        for (const HmiBackTransition *transition : transitions) {
            names.append(transition->targetName());
        }
        return names;
    }

    HmiViewState *home = view("Home");
    HmiViewState *radio = backView("Radio");
    HmiViewState *dummy = HmiViewState::createDummyViewState("Dummy", &machine, 0, false);
};

const QString activated = "debug onActivated: virtual void "
                          "HmiStateMachine::HmiViewState::onActivated() "
                          "Dummy view state activated";

} // namespace

/** What a view that shows nothing does, and where it leads back to. */
class tst_HmiViewStateDummy : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aDummyShowsNothingAndIsNeverKnown();
    void itBorrowsTheBackTargetOfTheViewLeftLast();
    void itBorrowsTheDirectTargetOfTheViewLeftLast();
    void aBorrowedTargetTakesThePressOfTheUser();
    void afterAViewWithoutBackHandlingItHasNoBackTarget();
    void withoutAViewLeftBeforeItHasNoBackTarget();
    void oneBorrowedTransitionReplacesTheOther();
    void theBorrowedTransitionIsKeptFromEntryToEntry();
    void theBorrowedDirectTransitionIsKeptFromEntryToEntry();
    void bothBorrowedTransitionsGoAfterAViewWithoutBackHandling();
    void ofTwoDummiesTheLastShownViewCounts();
    void aDummyWithBackHandlingOfItsOwnBorrowsNothing();
    void aDummyWithADirectTargetOfItsOwnBorrowsNothing();
    void aBackEntryIsCountedAndAsksForNoNextStep();
    void anEmptyTargetIsBorrowedToo();
    void aViewWithAnEmptyTargetViewIsADummyThatIsKnown();
    void itsExitTellsTheViewLayerNothing();
    void validActivationDataIsToldForADummyToo();
    void withoutAViewLayerADummyIsLoggedAllTheSame();
};

void tst_HmiViewStateDummy::aDummyShowsNothingAndIsNeverKnown()
{
    DummyFlow flow;
    QCOMPARE(flow.dummy->name(), QString("Dummy"));
    QCOMPARE(flow.dummy->targetView(), QString());
    QCOMPARE(flow.dummy->backStackStateId(), QString("Dummy"));
    QCOMPARE(flow.dummy->parentState(), &flow.machine);
    QVERIFY(!flow.dummy->hasBackStackPresence());
    flow.start(flow.home);
    messages().enableDebug();

    flow.request("Dummy");
    QCOMPARE(HmiViewState::activeViewState(), flow.dummy);
    QCOMPARE(messages().take(), QStringList(activated));
    flow.request("Radio");

    QCOMPARE(HmiViewState::lastKnownViewState(), QString("Home"));
    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView Radio"}));
    messages().take();
}

void tst_HmiViewStateDummy::itBorrowsTheBackTargetOfTheViewLeftLast()
{
    DummyFlow flow;
    flow.start(flow.home);
    flow.request("Radio");
    messages().enableDebug();

    flow.request("Dummy");

    QCOMPARE(flow.backTargets(), QStringList("Home"));
    QVERIFY(!flow.dummy->handlesBackEvent());
    QCOMPARE(flow.dummy->backTarget(), QString());
    QCOMPARE(
        messages().take(),
        QStringList({"debug onEntry: \"Dummy\" Setting dummy back state: \"Home\"", activated}));
}

void tst_HmiViewStateDummy::itBorrowsTheDirectTargetOfTheViewLeftLast()
{
    DummyFlow flow;
    flow.home->createDirectBackTransition(flow.radio);
    flow.start(flow.home);
    messages().enableDebug();

    flow.request("Dummy");

    QCOMPARE(flow.backTargets(), QStringList("Radio"));
    QVERIFY(!flow.dummy->directBackTransitionTarget());
    QCOMPARE(messages().take(),
             QStringList({"debug onEntry: \"Dummy\" Setting dummy direct back state: \"Radio\"",
                          activated}));
}

void tst_HmiViewStateDummy::aBorrowedTargetTakesThePressOfTheUser()
{
    DummyFlow flow;
    flow.start(flow.home);
    flow.request("Radio");
    flow.request("Dummy");
    flow.take();

    flow.back();

    QVERIFY(flow.home->isActive());
    QCOMPARE(flow.home->entryReason(), 1);
    QCOMPARE(flow.take(), QStringList("activateView Home"));
}

void tst_HmiViewStateDummy::afterAViewWithoutBackHandlingItHasNoBackTarget()
{
    DummyFlow flow;
    flow.start(flow.home);
    messages().enableDebug();

    flow.request("Dummy");
    flow.back();

    QCOMPARE(flow.backTargets(), QStringList());
    QVERIFY(flow.dummy->isActive());
    QCOMPARE(messages().take(), QStringList(activated));
}

void tst_HmiViewStateDummy::withoutAViewLeftBeforeItHasNoBackTarget()
{
    DummyFlow flow;

    flow.start(flow.dummy);

    QCOMPARE(flow.backTargets(), QStringList());
    QCOMPARE(flow.dummy->entryReason(), 0);
}

void tst_HmiViewStateDummy::oneBorrowedTransitionReplacesTheOther()
{
    DummyFlow flow;
    flow.home->createDirectBackTransition(flow.radio);
    flow.start(flow.home);
    flow.request("Radio");
    flow.request("Dummy");
    QCOMPARE(flow.backTargets(), QStringList("Home"));
    flow.request("Home");

    flow.request("Dummy");
    QCOMPARE(flow.backTargets(), QStringList("Radio"));

    flow.request("Radio");
    flow.request("Dummy");
    QCOMPARE(flow.backTargets(), QStringList("Home"));
}

void tst_HmiViewStateDummy::theBorrowedTransitionIsKeptFromEntryToEntry()
{
    DummyFlow flow;
    HmiViewState *map = flow.backView("Map");
    flow.start(flow.home);
    flow.request("Radio");
    flow.request("Dummy");
    const QPointer<HmiBackTransition> first = flow.dummy->findChild<HmiBackTransition *>();
    flow.request("Radio");
    flow.request("Map");
    QCOMPARE(map->backTarget(), QString("Radio"));

    flow.request("Dummy");

    QVERIFY(first);
    QCOMPARE(flow.dummy->findChild<HmiBackTransition *>(), first.data());
    QCOMPARE(flow.backTargets(), QStringList("Radio"));
}

void tst_HmiViewStateDummy::theBorrowedDirectTransitionIsKeptFromEntryToEntry()
{
    DummyFlow flow;
    HmiViewState *map = flow.view("Map");
    flow.home->createDirectBackTransition(flow.radio);
    map->createDirectBackTransition(flow.home);
    flow.start(flow.home);
    flow.request("Dummy");
    const QPointer<HmiBackTransition> first = flow.dummy->findChild<HmiBackTransition *>();
    flow.request("Map");

    flow.request("Dummy");

    QVERIFY(first);
    QCOMPARE(flow.dummy->findChild<HmiBackTransition *>(), first.data());
    QCOMPARE(flow.backTargets(), QStringList("Home"));
}

void tst_HmiViewStateDummy::bothBorrowedTransitionsGoAfterAViewWithoutBackHandling()
{
    DummyFlow flow;
    flow.start(flow.home);
    flow.request("Radio");
    flow.request("Dummy");
    const QPointer<HmiBackTransition> borrowed = flow.dummy->findChild<HmiBackTransition *>();
    flow.request("Home");

    flow.request("Dummy");
    QCOMPARE(flow.backTargets(), QStringList());
    QVERIFY(!borrowed);

    flow.home->createDirectBackTransition(flow.radio);
    flow.request("Home");
    flow.request("Dummy");
    QCOMPARE(flow.backTargets(), QStringList("Radio"));
    flow.request("Home");
    flow.home->createDirectBackTransition(nullptr);
    flow.request("Dummy");
    QCOMPARE(flow.backTargets(), QStringList());
}

void tst_HmiViewStateDummy::ofTwoDummiesTheLastShownViewCounts()
{
    DummyFlow flow;
    HmiViewState *other = HmiViewState::createDummyViewState("Other", &flow.machine, 0, false);
    other->setHandlesBackEvent(true);
    flow.start(flow.home);
    flow.request("Radio");

    flow.request("Other");
    QCOMPARE(other->backTarget(), QString("Radio"));
    flow.request("Dummy");

    QCOMPARE(flow.backTargets(), QStringList("Home"));
}

void tst_HmiViewStateDummy::aDummyWithBackHandlingOfItsOwnBorrowsNothing()
{
    DummyFlow flow;
    flow.dummy->setHandlesBackEvent(true);
    flow.start(flow.home);
    flow.request("Radio");
    messages().enableDebug();

    flow.request("Dummy");

    QCOMPARE(flow.backTargets(), QStringList("Radio"));
    QCOMPARE(flow.dummy->backTarget(), QString("Radio"));
    QCOMPARE(messages().take(),
             QStringList({"debug onEntry: \"Dummy\" Setting back state: \"Radio\"", activated}));
}

void tst_HmiViewStateDummy::aDummyWithADirectTargetOfItsOwnBorrowsNothing()
{
    DummyFlow flow;
    flow.dummy->createDirectBackTransition(flow.radio);
    flow.start(flow.home);
    flow.request("Radio");
    flow.take();
    messages().enableDebug();

    flow.request("Dummy");

    QCOMPARE(flow.backTargets(), QStringList("Radio"));
    QCOMPARE(
        messages().take(),
        QStringList({"debug onEntry: \"Dummy\" Setting direct back state: \"Radio\"", activated}));
}

void tst_HmiViewStateDummy::aBackEntryIsCountedAndAsksForNoNextStep()
{
    DummyFlow flow;
    HmiViewState *map = flow.view("Map");
    map->createDirectBackTransition(flow.dummy);
    flow.start(map);

    flow.back(3);

    QCOMPARE(flow.dummy->entryReason(), 1);
    QCOMPARE(flow.backTargets(), QStringList("Dummy"));
    QCOMPARE(flow.take(), QStringList("deactivateView Map"));
}

void tst_HmiViewStateDummy::anEmptyTargetIsBorrowedToo()
{
    DummyFlow flow;
    messages().enableDebug();
    flow.start(flow.radio);
    messages().take();

    flow.request("Dummy");
    flow.back();

    QCOMPARE(flow.backTargets(), QStringList(QString()));
    QVERIFY(flow.dummy->isActive());
    QCOMPARE(messages().take().first(),
             QString("debug onEntry: \"Dummy\" Setting dummy back state: \"\""));
}

void tst_HmiViewStateDummy::aViewWithAnEmptyTargetViewIsADummyThatIsKnown()
{
    ViewFlow flow;
    auto *bare = new HmiViewState(QString(), "Bare", &flow.machine);
    flow.view("Radio");
    flow.start(bare);
    QVERIFY(bare->hasBackStackPresence());

    flow.request("Radio");

    QCOMPARE(HmiViewState::lastKnownViewState(), QString("Bare"));
    QCOMPARE(flow.take(), QStringList("activateView Radio"));
}

void tst_HmiViewStateDummy::itsExitTellsTheViewLayerNothing()
{
    DummyFlow flow;
    flow.start(flow.dummy);

    flow.request("Home");

    QCOMPARE(flow.take(), QStringList("activateView Home"));
    QCOMPARE(HmiViewState::activeViewState(), flow.home);
}

void tst_HmiViewStateDummy::validActivationDataIsToldForADummyToo()
{
    DummyFlow flow;
    flow.start(flow.home);
    QSignalSpy told(&flow.target, &ViewStateTarget::activeViewDataChanged);
    QVERIFY(told.isValid());

    flow.request("Dummy");
    QCOMPARE(told.size(), 0);
    flow.request("Home");
    told.clear();
    flow.dummy->setActivationData("data");
    flow.request("Dummy");

    QCOMPARE(told.size(), 1);
    QCOMPARE(told.first().first().value<QVariant>(), QVariant("data"));
}

void tst_HmiViewStateDummy::withoutAViewLayerADummyIsLoggedAllTheSame()
{
    DummyFlow flow;
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;
    flow.dummy->setActivationData("data");
    messages().enableDebug();

    flow.start(flow.dummy);

    QCOMPARE(messages().take(), QStringList(activated));
}

QTEST_GUILESS_MAIN(tst_HmiViewStateDummy)
#include "tst_hmiviewstatedummy.moc"
