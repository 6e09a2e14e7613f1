#include "driving.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/hmi/hmiviewtransition.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** Posts a request of its own as soon as a view is shown. */
class EagerTarget : public RecordingViewStateTarget
{
public:
    EagerTarget(Journal &journal, QStateMachine &machine)
        : RecordingViewStateTarget(journal), m_machine(machine)
    {
    }

    void activateView(const QString &viewId, const QVariant &instanceData) override
    {
        RecordingViewStateTarget::activateView(viewId, instanceData);
        if (viewId == "Splash") {
            m_machine.postEvent(new HmiViewEvent("Home", "from splash"));
        }
    }

private:
    QStateMachine &m_machine;
};

/** Two regions that are active together, each with screens of its own. */
struct Regions : public ViewFlow
{
    Regions()
    {
        left->setInitialState(map);
        right->setInitialState(radio);
        startIn(machine, both);
        journal.clear();
    }

    QStringList activeViews() const
    {
        QStringList names;
        for (const HmiViewState *state : {map, route, radio, phone}) {
            if (state->isActive()) {
                names.append(state->name());
            }
        }
        return names;
    }

    QState *both = new QState(QState::ParallelStates, &machine);
    NamedState *left = new NamedState("Left", both);
    HmiViewState *map = view("Map", left);
    HmiViewState *route = view("Route", left);
    NamedState *right = new NamedState("Right", both);
    HmiViewState *radio = view("Radio", right);
    HmiViewState *phone = view("Phone", right);
};

} // namespace

/** The road of a request for a view, from the posted event to the view layer's report. */
class tst_ViewRequest : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aRequestLeavesOneScreenBeforeEnteringTheNext();
    void aRequestTakesItsDataToTheView();
    void eachVisitHasTheDataOfItsOwnRequest();
    void theReportOfTheViewLayerEndsTheRequest();
    void aRequestForTheActiveViewMovesNothing();
    void aRequestForAnUnknownViewMovesNothing();
    void requestsAreCarriedOutInTheOrderOfTheirPosting();
    void aRequestMadeOnEntryFollowsTheEntry();
    void aModuleOpensItsInitialViewWithTheData();
    void aViewInAnotherModuleIsReachedThroughIt();
    void theInnermostViewTakesTheRequest();
    void anUnknownViewIsConsumedByTheInnermostView();
    void aRequestForTheOuterViewLeavesTheInnerOne();
    void theOuterViewIsNotAskedForTheInnerOneThatIsActive();
    void theWholeEntryIsLoggedInOrder();
    void popupBehaviorIsToldBeforeTheActivation();
    void requestsThroughTheProcessWideMachine();
    void aRequestMovesOneRegionOnly();
    void aRequestForAnUnknownViewMovesNoRegion();
    void aRequestAcrossRegionsFromTheFirstStartsTheOthersAnew();
    void aViewThatIsActiveLeavesTheRequestToTheOtherRegion();
    void aTransitionThatLostAgainstAnotherIsListedUntilItFiresOrGoes();
};

void tst_ViewRequest::aRequestLeavesOneScreenBeforeEnteringTheNext()
{
    ViewFlow flow;
    flow.backView("Radio");
    flow.start(flow.backView("Map"));

    flow.request("Radio");

    QCOMPARE(flow.take(), QStringList({"deactivateView Map", "activateView Radio"}));
}

void tst_ViewRequest::aRequestTakesItsDataToTheView()
{
    ViewFlow flow;
    flow.view("Radio")->addInstanceData("skin", "night");
    flow.start(flow.view("Home"));

    flow.request("Radio", QVariantMap({{"station", 5}}));

    QCOMPARE(
        flow.target.viewData("Radio"),
        QVariantMap(
            {{"eventData", QVariantMap({{"station", 5}})}, {"entryReason", 0}, {"skin", "night"}}));
}

void tst_ViewRequest::eachVisitHasTheDataOfItsOwnRequest()
{
    ViewFlow flow;
    flow.view("Radio");
    flow.start(flow.view("Home"));

    flow.request("Radio", "first");
    flow.request("Home");
    flow.request("Radio");

    QCOMPARE(flow.target.viewData("Radio"),
             QVariantMap({{"eventData", QVariant()}, {"entryReason", 0}, {"exitReason", 0}}));
}

void tst_ViewRequest::theReportOfTheViewLayerEndsTheRequest()
{
    ViewFlow flow;
    HmiViewState *radio = flow.viewOf("RadioScreen", "Radio");
    radio->setReportsQmlViewStatus(true);
    connect(radio, &HmiViewState::viewActivated, this,
            [&] { flow.journal.add("Radio viewActivated"); });
    connect(radio, &HmiViewState::viewAnimationStarted, this,
            [&](int type) { flow.journal.add("Radio animation " + QString::number(type)); });
    flow.start(flow.view("Home"));

    flow.request("RadioScreen");
    Q_EMIT flow.target.viewAnimationStarted("RadioScreen", 4);
    Q_EMIT flow.target.viewActivated("Home", "RadioScreen");

    QCOMPARE(flow.take(),
             QStringList({"deactivateView Home", "activateView RadioScreen", "Radio animation 4",
                          "Radio viewActivated"}));
}

void tst_ViewRequest::aRequestForTheActiveViewMovesNothing()
{
    ViewFlow flow;
    HmiViewState *radio = flow.view("Radio");
    connect(radio, &HmiViewState::alreadyActive, this, [&] { flow.journal.add("alreadyActive"); });
    flow.start(radio);

    flow.request("Radio", "data");
    flow.request("Radio");

    QCOMPARE(flow.take(), QStringList({"alreadyActive", "alreadyActive"}));
    QVERIFY(!flow.target.viewData("Radio").value("eventData").isValid());
    QCOMPARE(HmiViewState::lastKnownViewState(), QString());
}

void tst_ViewRequest::aRequestForAnUnknownViewMovesNothing()
{
    ViewFlow flow;
    flow.view("Radio");
    flow.start(flow.view("Home"));

    flow.request("Nowhere");
    QCOMPARE(flow.take(), QStringList());
    flow.request("Radio");

    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView Radio"}));
}

void tst_ViewRequest::requestsAreCarriedOutInTheOrderOfTheirPosting()
{
    ViewFlow flow;
    flow.view("Radio");
    flow.view("Map");
    flow.start(flow.view("Home"));

    flow.machine.postEvent(new HmiViewEvent("Radio", QVariant()));
    flow.machine.postEvent(new HmiViewEvent("Radio", QVariant()));
    flow.machine.postEvent(new HmiViewEvent("Map", QVariant()));
    settle();

    QCOMPARE(flow.take(),
             QStringList({"deactivateView Home", "activateView Radio", "deactivateView Radio",
                          "activateView Map"}));
}

void tst_ViewRequest::aRequestMadeOnEntryFollowsTheEntry()
{
    ViewFlow flow;
    HmiViewState *splash = flow.view("Splash");
    flow.view("Home");
    EagerTarget target(flow.journal, flow.machine);

    startIn(flow.machine, splash);

    QCOMPARE(flow.take(),
             QStringList({"activateView Splash", "deactivateView Splash", "activateView Home"}));
    QCOMPARE(target.viewData("Home").value("eventData"), QVariant("from splash"));
}

void tst_ViewRequest::aModuleOpensItsInitialViewWithTheData()
{
    ViewFlow flow;
    auto *media = new NamedState("Media", &flow.machine);
    media->setInitialState(flow.view("Player", media));
    flow.start(flow.view("Home"));

    flow.request("Media", "song");

    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView Player"}));
    QCOMPARE(flow.target.viewData("Player").value("eventData"), QVariant("song"));
}

void tst_ViewRequest::aViewInAnotherModuleIsReachedThroughIt()
{
    ViewFlow flow;
    auto *media = new HmiState("Media", &flow.machine);
    media->setInitialState(flow.view("Player", media));
    flow.view("List", media);
    flow.start(flow.view("Home"));

    flow.request("List");

    QVERIFY(media->isActive());
    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView List"}));
}

void tst_ViewRequest::theInnermostViewTakesTheRequest()
{
    ViewFlow flow;
    HmiViewState *outer = flow.view("Outer");
    HmiViewState *inner = flow.view("Inner", outer);
    HmiViewState *other = flow.view("Other", outer);
    flow.start(inner);

    flow.request("Other");

    QVERIFY(outer->isActive());
    QCOMPARE(HmiViewState::activeViewState(), other);
    QCOMPARE(flow.take(), QStringList({"deactivateView Inner", "activateView Other"}));
}

void tst_ViewRequest::anUnknownViewIsConsumedByTheInnermostView()
{
    ViewFlow flow;
    HmiViewState *outer = flow.view("Outer");
    HmiViewState *inner = flow.view("Inner", outer);
    flow.start(inner);
    QStringList triggered;
    for (HmiViewState *view : {outer, inner}) {
        auto *transition = view->findChild<HmiViewTransition *>({}, Qt::FindDirectChildrenOnly);
        connect(transition, &QAbstractTransition::triggered, this,
                [&triggered, view] { triggered.append(view->name()); });
    }

    flow.request("Nowhere");

    QCOMPARE(triggered, QStringList("Inner"));
    QCOMPARE(flow.take(), QStringList());
}

void tst_ViewRequest::aRequestForTheOuterViewLeavesTheInnerOne()
{
    ViewFlow flow;
    HmiViewState *outer = flow.view("Outer");
    HmiViewState *inner = flow.view("Inner", outer);
    flow.start(flow.view("First", outer));
    flow.request("Inner");
    QVERIFY(inner->isActive());
    flow.take();

    flow.request("Outer");

    QCOMPARE(flow.take(),
             QStringList({"deactivateView Inner", "deactivateView Outer", "activateView Outer",
                          "activateView First"}));
}

void tst_ViewRequest::theOuterViewIsNotAskedForTheInnerOneThatIsActive()
{
    ViewFlow flow;
    HmiViewState *outer = flow.view("Outer");
    HmiViewState *inner = flow.view("Inner", outer);
    outer->setIndirectViewTransitionsBlocked(true);
    connect(inner, &HmiViewState::alreadyActive, this,
            [&] { flow.journal.add("Inner alreadyActive"); });
    connect(outer, &HmiViewState::alreadyActive, this,
            [&] { flow.journal.add("Outer alreadyActive"); });
    flow.start(inner);

    flow.request("Inner");
    QCOMPARE(flow.take(), QStringList("Inner alreadyActive"));

    outer->setIndirectViewTransitionsBlocked(false);
    flow.request("Inner");
    QCOMPARE(flow.take(),
             QStringList({"Inner alreadyActive", "deactivateView Inner", "deactivateView Outer",
                          "activateView Outer", "activateView Inner"}));
}

void tst_ViewRequest::theWholeEntryIsLoggedInOrder()
{
    ViewFlow flow;
    flow.backView("Radio");
    flow.start(flow.view("Home"));
    NamedState::setLoggingEnabled(true);
    messages().enableDebug({"vosk.hmistatemachine", "hmi.performance", "hmi.trace"});

    flow.request("Radio");

    QCOMPARE(messages().take(),
             QStringList({"debug onExit: Exiting state: \"Unnamed->Home\"",
                          "debug onEntry: P12.R041.02 - Screen Entry: Start Marker",
                          "debug onEntry: P12.R041.02 - Screen Entry: Start Marker",
                          "debug onEntry: Entering state: \"Unnamed->Radio\"",
                          "debug onEntry: \"Radio\" Setting back state: \"Home\"",
                          "debug onActivated: virtual void "
                          "HmiStateMachine::HmiViewState::onActivated() target name \"Radio\""}));
}

void tst_ViewRequest::popupBehaviorIsToldBeforeTheActivation()
{
    ViewFlow flow;
    auto *media = new HmiState("Media", &flow.machine);
    media->setPopupBehavior(HmiState::PopupBehaviorOff);
    media->setInitialState(flow.view("Player", media));
    flow.view("Map")->setPopupBehavior(HmiState::PopupBehaviorOn);
    flow.start(flow.view("Home"));
    flow.target.recordPopupBehavior(true);

    flow.request("Media");
    flow.request("Map");
    flow.request("Home");

    QCOMPARE(
        flow.take(),
        QStringList({"deactivateView Home", "setScreenPopupBehavior false",
                     "setScreenPopupBehavior false", "activateView Player", "deactivateView Player",
                     "setScreenPopupBehavior true", "activateView Map", "deactivateView Map",
                     "resetScreenPopupBehavior", "activateView Home"}));
}

void tst_ViewRequest::requestsThroughTheProcessWideMachine()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    StateMachine *machine = StateMachine::instance();
    QScopedPointer<HmiViewState> home(new HmiViewState("Home", machine));
    QScopedPointer<HmiViewState> radio(new HmiViewState("Radio", machine));
    startIn(*machine, home.data());

    StateMachine::instance()->postEvent(new HmiViewEvent("Radio", QVariant()));
    settle();
    park(*machine);

    QCOMPARE(journal.lines(),
             QStringList({"activateView Home", "deactivateView Home", "activateView Radio"}));
}

void tst_ViewRequest::aRequestMovesOneRegionOnly()
{
    Regions flow;
    flow.map->setIndirectViewTransitionsBlocked(true);
    flow.route->setIndirectViewTransitionsBlocked(true);

    flow.request("Phone");

    QCOMPARE(flow.activeViews(), QStringList({"Map", "Phone"}));
    QCOMPARE(flow.take(), QStringList({"deactivateView Radio", "activateView Phone"}));
}

void tst_ViewRequest::aRequestForAnUnknownViewMovesNoRegion()
{
    Regions flow;

    flow.request("Nowhere");

    QCOMPARE(flow.take(), QStringList());
}

void tst_ViewRequest::aRequestAcrossRegionsFromTheFirstStartsTheOthersAnew()
{
    Regions flow;
    flow.request("Route");
    flow.take();

    flow.request("Phone");

    QCOMPARE(flow.activeViews(), QStringList({"Map", "Phone"}));
    QCOMPARE(flow.take(),
             QStringList({"deactivateView Radio", "deactivateView Route", "activateView Map",
                          "activateView Phone"}));
}

void tst_ViewRequest::aViewThatIsActiveLeavesTheRequestToTheOtherRegion()
{
    Regions flow;
    connect(flow.map, &HmiViewState::alreadyActive, this,
            [&] { flow.journal.add("Map alreadyActive"); });

    flow.request("Map");

    QCOMPARE(flow.activeViews(), QStringList({"Map", "Radio"}));
    QCOMPARE(flow.take(),
             QStringList({"Map alreadyActive", "deactivateView Radio", "deactivateView Map",
                          "activateView Map", "activateView Radio"}));
}

void tst_ViewRequest::aTransitionThatLostAgainstAnotherIsListedUntilItFiresOrGoes()
{
    QScopedPointer<Regions> flow(new Regions);

    flow->request("Route");

    const auto listed = NamedTargetTransitionBase::triggeringTransition();
    QCOMPARE(listed.size(), 1);
    QCOMPARE(listed.first()->getSourceState(), flow->radio);
    flow.reset();
    QCOMPARE(NamedTargetTransitionBase::triggeringTransition().size(), 0);
}

QTEST_GUILESS_MAIN(tst_ViewRequest)
#include "tst_viewrequest.moc"
