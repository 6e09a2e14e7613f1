#include "driving.h"
#include "librarytest.h"
#include "popupflow.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

constexpr auto reactionEvent = QEvent::Type(QEvent::User + 3);

/** A popup with a reaction that has no target, which another one stacks. */
struct StackedPopup : PopupFlow
{
    StackedPopup(MessageRecorder &messages, const QString &module)
        : PopupFlow(messages), fuel(popup(module + "/fuel", "FuelView")),
          call(popup(module + "/call", "CallView"))
    {
        rule(fuel->name(), PopupState::AllowStack, call->name());
        lead(reactionEvent, fuel, nullptr);
        reaction = fuel->transitions().last();
        QObject::connect(reaction, &QAbstractTransition::triggered, fuel, [this] { ++reactions; });
    }

    void stack()
    {
        start();
        request(fuel->name());
        request(call->name());
        take();
    }

    void react()
    {
        machine.postEvent(new QEvent(reactionEvent));
        settle();
    }

    PopupState *const fuel;
    PopupState *const call;
    QAbstractTransition *reaction = nullptr;
    int reactions = 0;
};

} // namespace

class tst_PopupStateStacking : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void stackingBehindASiblingWaitsForTheExit();
    void stackingBehindAnotherLayerIsToldAtOnce();
    void stackingBehindAnotherLayerWithoutAViewLayerDoesNothing();
    void hidingEndsTheStacking();
    void showingEndsTheStacking();
    void givingUpEndsTheStacking();
    void reactionsOfAStackedPopupWorkOn();
    void reactionsOfAStackedPopupReturnWithIt();
    void reactionsOfAnInterruptedPopupDoNotWorkOn();
    void reactionsWithATargetStay();
    void anAutoDismissTransitionWithoutATargetStays();
    void reactionsReturnWhenTheStackedPopupIsDismissed();
    void reactionsReturnOnAReset();
    void reactionsReturnWhenThePopupIsRemoved();
    void aReactionThatIsDeletedWhileStackedIsForgotten();
    void aPopupWithoutARootStacksNoReactions();
    void makingWayForASiblingGivesThePopupUp();
    void makingWayForAnotherLayerDismissesThePopup();
    void makingWayForNothingDismissesThePopup();
};

void tst_PopupStateStacking::stackingBehindASiblingWaitsForTheExit()
{
    StackedPopup flow(messages(), "stacksibling");

    flow.fuel->stack(flow.call);
    QVERIFY(flow.fuel->stackedBySibling());
    QCOMPARE(flow.take(), QStringList());

    flow.fuel->hidePopup(true);
    QCOMPARE(flow.take(), QStringList({"stackPopup FuelView CallView"}));
}

void tst_PopupStateStacking::stackingBehindAnotherLayerIsToldAtOnce()
{
    StackedPopup flow(messages(), "stackother");
    PopupState *warn = flow.upperPopup("stackother/warn", "WarnView");

    flow.fuel->stack(warn);

    QVERIFY(!flow.fuel->stackedBySibling());
    QCOMPARE(flow.take(), QStringList({"stackPopup FuelView WarnView"}));
}

void tst_PopupStateStacking::stackingBehindAnotherLayerWithoutAViewLayerDoesNothing()
{
    StackedPopup flow(messages(), "stacknoview");
    PopupState *warn = flow.upperPopup("stacknoview/warn", "WarnView");
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;

    flow.fuel->stack(warn);
    flow.fuel->stack(flow.call);
    flow.fuel->hidePopup(true);

    QVERIFY(!flow.fuel->stackedBySibling());
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupStateStacking::hidingEndsTheStacking()
{
    StackedPopup flow(messages(), "stackhide");
    flow.fuel->stack(flow.call);

    flow.fuel->hidePopup(true);
    QVERIFY(!flow.fuel->stackedBySibling());
    flow.take();

    flow.fuel->hidePopup(false);
    QCOMPARE(flow.take(), QStringList({"requestPopupHide FuelView true", "unstackPopup FuelView"}));
}

void tst_PopupStateStacking::showingEndsTheStacking()
{
    StackedPopup flow(messages(), "stackshow");
    flow.fuel->stack(flow.call);

    flow.fuel->showPopup(true);

    QVERIFY(!flow.fuel->stackedBySibling());
}

void tst_PopupStateStacking::givingUpEndsTheStacking()
{
    StackedPopup flow(messages(), "stackgiveup");
    flow.fuel->stack(flow.call);

    flow.fuel->deactivate();

    QVERIFY(!flow.fuel->stackedBySibling());
    QCOMPARE(flow.take(), QStringList({"requestPopupHide FuelView true", "unstackPopup FuelView"}));
}

void tst_PopupStateStacking::reactionsOfAStackedPopupWorkOn()
{
    StackedPopup flow(messages(), "stackwork");
    flow.stack();
    QCOMPARE(flow.reaction->sourceState(), flow.lower);
    QVERIFY(!flow.fuel->isActive());

    flow.react();

    QCOMPARE(flow.reactions, 1);
    QVERIFY(flow.call->isActive());
}

void tst_PopupStateStacking::reactionsOfAStackedPopupReturnWithIt()
{
    StackedPopup flow(messages(), "stackback");
    flow.stack();

    flow.request("CallView_Dismiss");

    QVERIFY(flow.fuel->isActive());
    QCOMPARE(flow.reaction->sourceState(), flow.fuel);
    flow.react();
    QCOMPARE(flow.reactions, 1);
    flow.request("FuelView_Dismiss");
    flow.react();
    QCOMPARE(flow.reactions, 1);
}

void tst_PopupStateStacking::reactionsOfAnInterruptedPopupDoNotWorkOn()
{
    StackedPopup flow(messages(), "stackallow");
    PopupFlow::rule("stackallow/fuel", PopupState::Allow, "stackallow/call");
    flow.stack();

    flow.react();

    QCOMPARE(flow.reactions, 0);
    QCOMPARE(flow.reaction->sourceState(), flow.fuel);
}

void tst_PopupStateStacking::reactionsWithATargetStay()
{
    StackedPopup flow(messages(), "stacktarget");
    lead(QEvent::Type(QEvent::User + 4), flow.fuel, flow.lower->noPopupState());
    const QAbstractTransition *leading = flow.fuel->transitions().last();
    flow.fuel->setAutoDismissTimeoutActive(true);

    flow.stack();

    QCOMPARE(leading->sourceState(), flow.fuel);
    QCOMPARE(flow.fuel->dismissTransition()->sourceState(), flow.lower);
}

void tst_PopupStateStacking::anAutoDismissTransitionWithoutATargetStays()
{
    StackedPopup flow(messages(), "stacktimer");
    flow.fuel->setAutoDismissTimeoutActive(true);
    flow.fuel->autoDismissTransition()->setTargetState(nullptr);

    flow.stack();

    QCOMPARE(flow.fuel->autoDismissTransition()->sourceState(), flow.fuel);
    QCOMPARE(flow.reaction->sourceState(), flow.lower);
}

void tst_PopupStateStacking::reactionsReturnWhenTheStackedPopupIsDismissed()
{
    StackedPopup flow(messages(), "stackdismiss");
    flow.stack();

    flow.request("FuelView_Dismiss");

    QCOMPARE(flow.reaction->sourceState(), flow.fuel);
    flow.react();
    QCOMPARE(flow.reactions, 0);
}

void tst_PopupStateStacking::reactionsReturnOnAReset()
{
    StackedPopup flow(messages(), "stackreset");
    flow.stack();

    Q_EMIT flow.lower->reset();

    QCOMPARE(flow.reaction->sourceState(), flow.fuel);
}

void tst_PopupStateStacking::reactionsReturnWhenThePopupIsRemoved()
{
    StackedPopup flow(messages(), "stackremove");
    flow.stack();

    flow.lower->removePopupState(flow.fuel);

    QCOMPARE(flow.reaction->sourceState(), flow.fuel);
}

void tst_PopupStateStacking::aReactionThatIsDeletedWhileStackedIsForgotten()
{
    StackedPopup flow(messages(), "stackdelete");
    flow.stack();

    delete flow.reaction;
    flow.request("CallView_Dismiss");

    QVERIFY(flow.fuel->isActive());
}

void tst_PopupStateStacking::aPopupWithoutARootStacksNoReactions()
{
    PopupState popup("stackrootless/fuel", 1);
    lead(reactionEvent, &popup, nullptr);
    const QAbstractTransition *reaction = popup.transitions().last();

    popup.stackTransitions();
    popup.activateDismissTransition();
    popup.unstackTransitions();

    QCOMPARE(reaction->sourceState(), &popup);
    QCOMPARE(popup.dismissTransition()->sourceState(), &popup);
}

void tst_PopupStateStacking::makingWayForASiblingGivesThePopupUp()
{
    StackedPopup flow(messages(), "stackway");
    flow.start();
    flow.request("stackway/fuel");

    flow.fuel->deactivateSource(flow.call);
    settle();

    QVERIFY(flow.fuel->isActive());
    QVERIFY(flow.lower->wasDeactivated(flow.fuel));
}

void tst_PopupStateStacking::makingWayForAnotherLayerDismissesThePopup()
{
    StackedPopup flow(messages(), "stackwayother");
    PopupState *warn = flow.upperPopup("stackwayother/warn", "WarnView");
    flow.start();
    flow.request("stackwayother/fuel");

    flow.fuel->deactivateSource(warn);
    QVERIFY(!flow.lower->wasDeactivated(flow.fuel));

    settle();
    QVERIFY(!flow.fuel->isActive());
}

void tst_PopupStateStacking::makingWayForNothingDismissesThePopup()
{
    StackedPopup flow(messages(), "stackwaynone");
    flow.start();
    flow.request("stackwaynone/fuel");

    flow.fuel->deactivateSource(nullptr);
    settle();

    QVERIFY(!flow.fuel->isActive());
}

QTEST_GUILESS_MAIN(tst_PopupStateStacking)
#include "tst_popupstatestacking.moc"
