#include "driving.h"
#include "fallbackflow.h"
#include "librarytest.h"
#include "metadescription.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmifallbacktransition.h>
#include <HmiStateMachine/hmi/hmifallbackviewstate.h>
#include <HmiStateMachine/hmi/hmilayeredstate.h>

#include <QSignalSpy>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** A view whose answers the test chooses; it counts the questions. */
class ChoosyView : public HmiFallbackViewState
{
public:
    using HmiFallbackViewState::HmiFallbackViewState;

    bool permitted() override
    {
        ++questions;
        return allowed;
    }

    QString fallbackTarget() override { return choice; }

    bool allowed = false;
    QString choice;
    int questions = 0;
};

} // namespace

class tst_HmiFallbackViewState : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void itIsConstructedWithOrWithoutATargetView();
    void itOwnsATransitionToTheFallbackState();
    void inLayersItLandsInTheExclusiveLayer();
    void itIsPermittedByDefault();
    void aPermittedViewIsShown();
    void aForbiddenViewIsNeverShown();
    void aForbiddenViewTellsNoActivationData();
    void oneFallbackEventIsPosted();
    void anOverriddenTargetWins();
    void anUnknownFallbackStateLeavesTheViewActive();
    void aFallbackStateThatIsMadeLaterIsNotFound();
    void reevaluatingAsksOnlyWhileActive();
    void reevaluatingLeavesAViewThatIsForbiddenNow();
    void reevaluatingLeavesAPermittedViewAlone();
    void postingLeadsAwayWhetherPermittedOrNot();
    void aFallbackExitLeavesTheWaysBackAlone();
    void anOrdinaryExitIsToldAsSuch();
    void aForbiddenInitialViewFallsBack();
    void fallbacksMayFollowOneAnother();
    void anEventForAViewThatIsLeftAlreadyIsDropped();
    void aViewInAnotherMachineDoesNotFallBack();
};

void tst_HmiFallbackViewState::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(HmiFallbackViewState::staticMetaObject),
             QStringList("slot reevaluate()"));
    QCOMPARE(HmiFallbackViewState::staticMetaObject.superClass(), &HmiViewState::staticMetaObject);
}

void tst_HmiFallbackViewState::itIsConstructedWithOrWithoutATargetView()
{
    QState parent;
    const auto *named = new HmiFallbackViewState("Named", "Fallback", &parent);
    const auto *shown = new HmiFallbackViewState("Shown", "Other", "Fallback", &parent);

    QCOMPARE(named->name(), QString("Named"));
    QCOMPARE(named->targetView(), QString("Named"));
    QCOMPARE(named->parentState(), &parent);
    QCOMPARE(shown->name(), QString("Other"));
    QCOMPARE(shown->targetView(), QString("Shown"));
    QCOMPARE(shown->parentState(), &parent);
}

void tst_HmiFallbackViewState::itOwnsATransitionToTheFallbackState()
{
    NamedState fallback("Fallback");
    const HmiFallbackViewState named("Named", "Fallback");
    const HmiFallbackViewState shown("Shown", "Other", "Fallback");

    for (const HmiFallbackViewState *view : {&named, &shown}) {
        const auto transitions = view->findChildren<HmiFallbackTransition *>();
        QCOMPARE(transitions.size(), 1);
        QCOMPARE(transitions.first()->sourceState(), view);
        QCOMPARE(transitions.first()->targetState(), &fallback);
    }
}

void tst_HmiFallbackViewState::inLayersItLandsInTheExclusiveLayer()
{
    HmiLayeredState layers("Layers");

    auto *view = new HmiFallbackViewState("View", "Fallback", &layers);

    QCOMPARE(view->parentState(), layers.exclusiveState());
    QCOMPARE(view->findChild<HmiFallbackTransition *>()->sourceState(), view);
}

void tst_HmiFallbackViewState::itIsPermittedByDefault()
{
    HmiFallbackViewState view("View", "Fallback");

    QVERIFY(view.permitted());
    QCOMPARE(view.fallbackTarget(), QString());
}

void tst_HmiFallbackViewState::aPermittedViewIsShown()
{
    FallbackFlow flow;
    auto *view = flow.add(new HmiFallbackViewState("Shown", "View", "Fallback", flow.machine));
    flow.start(flow.home);

    flow.request("View");

    QVERIFY(view->isActive());
    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView Shown"}));
}

void tst_HmiFallbackViewState::aForbiddenViewIsNeverShown()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("Shown", "View", "Fallback", flow.machine));
    flow.start(flow.home);

    flow.request("View");

    QVERIFY(flow.fallback->isActive());
    QVERIFY(!view->isActive());
    QCOMPARE(view->questions, 1);
    QCOMPARE(flow.take(),
             QStringList({"deactivateView Home", "deactivateView Shown", "activateView Fallback"}));
}

void tst_HmiFallbackViewState::aForbiddenViewTellsNoActivationData()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Fallback", flow.machine));
    view->setActivationData("data");
    flow.start(flow.home);
    QSignalSpy told(&flow.target, &ViewStateTarget::activeViewDataChanged);
    QVERIFY(told.isValid());

    flow.request("View");

    QCOMPARE(told, QList<QVariantList>({{QVariant()}}));
}

void tst_HmiFallbackViewState::oneFallbackEventIsPosted()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "nowhere", flow.machine));
    QSignalSpy fallbacks(view->findChild<HmiFallbackTransition *>(),
                         &QAbstractTransition::triggered);
    QVERIFY(fallbacks.isValid());
    flow.start(flow.home);

    flow.request("View");

    QVERIFY(view->isActive());
    QCOMPARE(fallbacks.size(), 1);
    QCOMPARE(flow.take(), QStringList("deactivateView Home"));
}

void tst_HmiFallbackViewState::anOverriddenTargetWins()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Fallback", flow.machine));
    auto *other = flow.add(new HmiViewState("Other", flow.machine));
    view->choice = "Other";
    flow.start(flow.home);

    flow.request("View");

    QVERIFY(other->isActive());
    QCOMPARE(view->findChild<HmiFallbackTransition *>()->targetName(), QString("Other"));
}

void tst_HmiFallbackViewState::anUnknownFallbackStateLeavesTheViewActive()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Unknown", flow.machine));
    flow.start(flow.home);

    flow.request("View");
    QVERIFY(view->isActive());
    QCOMPARE(ViewFlow::activeView(), QString("View"));
    QCOMPARE(flow.take(), QStringList("deactivateView Home"));

    flow.request("Home");
    QVERIFY(flow.home->isActive());
}

void tst_HmiFallbackViewState::aFallbackStateThatIsMadeLaterIsNotFound()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Late", flow.machine));
    flow.add(new HmiViewState("Late", flow.machine));
    flow.start(flow.home);

    flow.request("View");

    QVERIFY(view->isActive());
}

void tst_HmiFallbackViewState::reevaluatingAsksOnlyWhileActive()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Fallback", flow.machine));
    flow.start(flow.home);

    view->reevaluate();
    settle();

    QCOMPARE(view->questions, 0);
    QVERIFY(flow.home->isActive());
    QCOMPARE(flow.take(), QStringList());
}

void tst_HmiFallbackViewState::reevaluatingLeavesAViewThatIsForbiddenNow()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Fallback", flow.machine));
    view->allowed = true;
    flow.start(view);

    view->allowed = false;
    QVERIFY(view->isActive());
    QVERIFY(QMetaObject::invokeMethod(view, "reevaluate"));
    QVERIFY(view->isActive());
    settle();

    QVERIFY(flow.fallback->isActive());
    QCOMPARE(flow.take(), QStringList({"deactivateView View", "activateView Fallback"}));
}

void tst_HmiFallbackViewState::reevaluatingLeavesAPermittedViewAlone()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Fallback", flow.machine));
    view->allowed = true;
    flow.start(view);

    view->reevaluate();
    settle();

    QVERIFY(view->isActive());
    QCOMPARE(view->questions, 2);
    QCOMPARE(flow.take(), QStringList());
}

void tst_HmiFallbackViewState::postingLeadsAwayWhetherPermittedOrNot()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Fallback", flow.machine));
    view->allowed = true;
    flow.start(view);

    view->postFallbackEvent();
    settle();

    QVERIFY(flow.fallback->isActive());
    QCOMPARE(view->questions, 1);
}

void tst_HmiFallbackViewState::aFallbackExitLeavesTheWaysBackAlone()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Fallback", flow.machine));
    view->setHandlesBackEvent(true);
    flow.fallback->setHandlesBackEvent(true);
    QSignalSpy pushes(view, &HmiViewState::backStackPush);
    QVERIFY(pushes.isValid());
    flow.start(flow.home);

    flow.request("View");

    QCOMPARE(view->backTarget(), QString("Home"));
    QCOMPARE(pushes.size(), 0);
    QCOMPARE(HmiViewState::lastKnownViewState(), QString("Home"));
    QCOMPARE(flow.fallback->backTarget(), QString("Home"));
    QCOMPARE(flow.target.viewData("View").value("exitReason"), QVariant(1));
    QCOMPARE(flow.fallback->entryReason(), 0);
}

void tst_HmiFallbackViewState::anOrdinaryExitIsToldAsSuch()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Fallback", flow.machine));
    view->allowed = true;
    flow.start(view);

    flow.request("Home");

    QCOMPARE(flow.target.viewData("View").value("exitReason"), QVariant(0));
    QCOMPARE(HmiViewState::lastKnownViewState(), QString("View"));
}

void tst_HmiFallbackViewState::aForbiddenInitialViewFallsBack()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Fallback", flow.machine));

    startIn(*flow.machine, view);

    QVERIFY(flow.fallback->isActive());
    QCOMPARE(flow.take(), QStringList({"deactivateView View", "activateView Fallback"}));
}

void tst_HmiFallbackViewState::fallbacksMayFollowOneAnother()
{
    FallbackFlow flow;
    flow.add(new ChoosyView("Second", "Fallback", flow.machine));
    flow.add(new ChoosyView("First", "Second", flow.machine));
    flow.start(flow.home);

    flow.request("First");

    QVERIFY(flow.fallback->isActive());
    QCOMPARE(flow.take(),
             QStringList({"deactivateView Home", "deactivateView First", "deactivateView Second",
                          "activateView Fallback"}));
}

void tst_HmiFallbackViewState::anEventForAViewThatIsLeftAlreadyIsDropped()
{
    FallbackFlow flow;
    auto *view = flow.add(new ChoosyView("View", "Fallback", flow.machine));
    view->allowed = true;
    flow.start(view);
    view->allowed = false;

    view->reevaluate();
    view->reevaluate();
    settle();

    QVERIFY(flow.fallback->isActive());
    QCOMPARE(flow.take(), QStringList({"deactivateView View", "activateView Fallback"}));
}

void tst_HmiFallbackViewState::aViewInAnotherMachineDoesNotFallBack()
{
    FallbackFlow flow;
    auto *shown = flow.add(new ChoosyView("Shown", "Fallback", flow.machine));
    shown->allowed = true;
    flow.start(shown);
    QStateMachine another;
    auto *forbidden = new ChoosyView("Forbidden", "Fallback", &another);

    startIn(another, forbidden);
    settle();

    // The process-wide machine got the event, for the view that is active there.
    QVERIFY(forbidden->isActive());
    QCOMPARE(flow.take(), QStringList({"deactivateView Shown", "activateView Fallback"}));
}

QTEST_GUILESS_MAIN(tst_HmiFallbackViewState)
#include "tst_hmifallbackviewstate.moc"
