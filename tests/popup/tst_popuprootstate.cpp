#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"
#include "popupflow.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popuptransition.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

HmiSignalTransition *resetTransitionOf(PopupRootState *root)
{
    return root->findChild<HmiSignalTransition *>();
}

} // namespace

class tst_PopupRootState : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void aNamedRootNamesItsNoPopupState();
    void anUnnamedRootNamesItsNoPopupStateAlone();
    void theNoPopupStateIsTheInitialOne();
    void theTransitionsHangOnNoPopupAndOnTheRoot();
    void noChildIsActiveBeforeTheLayerIsEntered();
    void theNoPopupStateIsActiveWithoutAPopup();
    void thePopupEnteredLastIsTheActiveOne();
    void theActivePopupStaysWhenTheLayerIsLeft();
    void nullIsIgnored();
    void aPopupWithoutARootCanBeAdded();
    void addingAPopupTwiceLeavesOneEntry();
    void aPopupMovesToTheRootThatAddsIt();
    void aWaitingPopupMovesToAnotherRoot();
    void aWaitingPopupThatMovedIsDismissedInItsNewRoot();
    void theActivePopupThatMovesIsResetFirst();
    void aRemovedPopupIsNotRequested();
    void aRemovedPopupCanBeAddedAgain();
    void removingTheActivePopupEmitsResetFirst();
    void removingAnotherPopupEmitsNoReset();
    void aPopupIsDeactivatedUntilItIsEntered();
    void aDeactivatedPopupDoesNotReturn();
    void theResetTransitionMovesWithTheActiveChild();
    void resetIsHandledOnlyWithAPopup();
    void resetForgetsThoseThatWait();
    void aResetTakesTheNameOfAStateForAView();
    void clearingWithoutAPopupOnlyForgets();
    void clearingLeavesAStackedSiblingStacked();
    void aPopupRenamedWhileItWaitsDoesNotReturn();
    void aPopupRenamedWhileItIsShownComesBackOnce();
    void theNoPopupStateTakesItsOwnDismissal();
    void leavingTheLayerForgetsThoseThatWait();
    void handlingAResetWithoutAViewLayerForgetsAllTheSame();
    void handlingAResetBeforeTheLayerIsEnteredHidesNothing();
    void aRootWithoutAMachineRequestsNothingAgain();
    void twoRootsActAlone();
    void aRootCanBeDeletedAlone();
};

void tst_PopupRootState::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(PopupRootState::staticMetaObject),
             QStringList({"signal reset()", "slot clearPopups()"}));
    QCOMPARE(PopupRootState::staticMetaObject.superClass(), &NamedState::staticMetaObject);
}

void tst_PopupRootState::aNamedRootNamesItsNoPopupState()
{
    const PopupRootState root("RootNamed");

    QCOMPARE(root.name(), QString("RootNamed"));
    QCOMPARE(root.noPopupState()->name(), QString("RootNamed_NONEPOPUP"));
    QCOMPARE(NamedState::stateForName("RootNamed_NONEPOPUP"), root.noPopupState());
}

void tst_PopupRootState::anUnnamedRootNamesItsNoPopupStateAlone()
{
    const PopupRootState root;

    QCOMPARE(root.name(), QString());
    QCOMPARE(root.noPopupState()->name(), QString("_NONEPOPUP"));
}

void tst_PopupRootState::theNoPopupStateIsTheInitialOne()
{
    const PopupRootState root("RootInitial");

    QCOMPARE(static_cast<const QState &>(root).initialState(), root.noPopupState());
    QCOMPARE(root.noPopupState()->parentState(), &root);
    QCOMPARE(root.noPopupState()->rootPopupState(), &root);
}

void tst_PopupRootState::theTransitionsHangOnNoPopupAndOnTheRoot()
{
    PopupRootState root("RootTransitions");

    const auto *request = root.findChild<PopupTransition *>();
    const HmiSignalTransition *reset = resetTransitionOf(&root);
    QCOMPARE(request->parent(), root.noPopupState());
    QCOMPARE(reset->sourceState(), &root);
    QCOMPARE(reset->senderObject(), &root);
    QCOMPARE(reset->signal(), QByteArray("2reset()"));
    QCOMPARE(reset->targetState(), root.noPopupState());
    QVERIFY(reset->blocked());
}

void tst_PopupRootState::noChildIsActiveBeforeTheLayerIsEntered()
{
    const PopupRootState root("RootIdle");

    QCOMPARE(root.activePopupState(), nullptr);
    QVERIFY(!root.isActivePopupState(root.noPopupState()));
    QVERIFY(!root.isActivePopupState(nullptr));
}

void tst_PopupRootState::theNoPopupStateIsActiveWithoutAPopup()
{
    PopupFlow flow(messages());

    flow.start();

    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
    QVERIFY(flow.lower->isActivePopupState(flow.lower->noPopupState()));
    QVERIFY(flow.lower->noPopupState()->isCurrentPopup());
}

void tst_PopupRootState::thePopupEnteredLastIsTheActiveOne()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("rootlast/fuel", "FuelView");
    PopupState *call = flow.popup("rootlast/call", "CallView");
    flow.start();

    flow.request("rootlast/fuel");
    QCOMPARE(flow.lower->activePopupState(), fuel);

    flow.request("rootlast/call");
    QCOMPARE(flow.lower->activePopupState(), call);
    QVERIFY(!flow.lower->isActivePopupState(fuel));
    QVERIFY(!fuel->isCurrentPopup());
}

void tst_PopupRootState::theActivePopupStaysWhenTheLayerIsLeft()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("rootleft/fuel", "FuelView");
    flow.start();
    flow.request("rootleft/fuel");

    flow.leave();
    QCOMPARE(flow.lower->activePopupState(), fuel);
    QVERIFY(!fuel->isActive());

    flow.comeBack();
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
}

void tst_PopupRootState::nullIsIgnored()
{
    PopupRootState root("RootNull");

    root.addPopupState(nullptr);
    root.removePopupState(nullptr);
    root.setActivePopupState(nullptr);
    root.deactivatePopupState(nullptr);

    QVERIFY(root.wasDeactivated(nullptr));
    QCOMPARE(root.activePopupState(), nullptr);
    QCOMPARE(messages().take(), QStringList());
}

void tst_PopupRootState::aPopupWithoutARootCanBeAdded()
{
    PopupFlow flow(messages());
    auto *popup = new PopupState("rootadd/fuel", 1);

    flow.lower->addPopupState(popup);
    QCOMPARE(popup->rootPopupState(), flow.lower);
    QCOMPARE(popup->parent(), flow.lower);

    flow.start();
    flow.request("rootadd/fuel");
    QVERIFY(popup->isActive());
    flow.request("rootadd/fuel_Dismiss");
    QVERIFY(!popup->isActive());
}

void tst_PopupRootState::addingAPopupTwiceLeavesOneEntry()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("roottwice/fuel", "FuelView");
    flow.lower->addPopupState(popup);
    flow.start();

    flow.lower->removePopupState(popup);

    flow.request("roottwice/fuel");
    QVERIFY(!popup->isActive());
}

void tst_PopupRootState::aPopupMovesToTheRootThatAddsIt()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("rootmove/fuel", "FuelView");
    popup->setAutoDismissTimeoutActive(true);

    flow.upper->addPopupState(popup);
    QCOMPARE(popup->rootPopupState(), flow.upper);
    QCOMPARE(popup->parent(), flow.upper);

    flow.start();
    flow.request("rootmove/fuel");
    QCOMPARE(flow.upper->activePopupState(), popup);
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
    QCOMPARE(flow.take(),
             QStringList({"preparePopup FuelView false", "requestPopupShow FuelView 1",
                          "unstackPopup FuelView"}));
}

void tst_PopupRootState::aWaitingPopupMovesToAnotherRoot()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("rootwait/fuel", "FuelView");
    PopupState *call = flow.popup("rootwait/call", "CallView");
    flow.start();
    flow.request("rootwait/fuel");
    flow.request("rootwait/call");

    flow.upper->addPopupState(fuel);
    flow.request("rootwait/fuel");
    QVERIFY(fuel->isActive());
    QVERIFY(call->isActive());
    QCOMPARE(flow.upper->activePopupState(), fuel);

    flow.request("rootwait/fuel_Dismiss");
    QVERIFY(!fuel->isActive());
    QCOMPARE(flow.upper->activePopupState(), flow.upper->noPopupState());
}

void tst_PopupRootState::aWaitingPopupThatMovedIsDismissedInItsNewRoot()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("rootmoved/fuel", "FuelView");
    flow.popup("rootmoved/call", "CallView");
    flow.start();
    flow.request("rootmoved/fuel");
    flow.request("rootmoved/call");

    fuel->setRootState(flow.upper);

    QCOMPARE(fuel->rootPopupState(), flow.upper);
    QVERIFY(flow.upper->wasDeactivated(fuel));
    flow.take();
    flow.request("rootmoved/fuel_Dismiss");
    QCOMPARE(flow.take(), QStringList({"requestPopupHide FuelView true", "unstackPopup FuelView"}));
    flow.request("rootmoved/call_Dismiss");
    QVERIFY(!fuel->isActive());
}

void tst_PopupRootState::theActivePopupThatMovesIsResetFirst()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("rootactive/fuel", "FuelView");
    flow.start();
    flow.request("rootactive/fuel");

    flow.lower->removePopupState(fuel);
    settle();
    flow.upper->addPopupState(fuel);

    QVERIFY(!fuel->isActive());
    flow.request("rootactive/fuel");
    QCOMPARE(flow.upper->activePopupState(), fuel);
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
}

void tst_PopupRootState::aRemovedPopupIsNotRequested()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("rootremove/fuel", "FuelView");
    flow.start();

    flow.lower->removePopupState(popup);
    flow.request("rootremove/fuel");

    QCOMPARE(flow.take(), QStringList());
    QCOMPARE(popup->rootPopupState(), flow.lower);
}

void tst_PopupRootState::aRemovedPopupCanBeAddedAgain()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("rootreturn/fuel", "FuelView");
    flow.start();

    flow.lower->removePopupState(popup);
    flow.lower->addPopupState(popup);

    flow.request("rootreturn/fuel");
    QVERIFY(popup->isActive());
}

void tst_PopupRootState::removingTheActivePopupEmitsResetFirst()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("rootfirst/fuel", "FuelView");
    flow.start();
    flow.request("rootfirst/fuel");
    int resets = 0;
    QStringList answers;
    connect(flow.lower, &PopupRootState::reset, flow.lower, [&] {
        ++resets;
        flow.request("rootfirst/fuel");
        answers.append(popup->isActive() ? "still requested" : "gone");
    });

    flow.lower->removePopupState(popup);
    settle();

    QCOMPARE(resets, 1);
    QCOMPARE(answers, QStringList({"still requested"}));
    flow.request("rootfirst/fuel");
    QCOMPARE(resets, 1);
}

void tst_PopupRootState::removingAnotherPopupEmitsNoReset()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("rootnoreset/fuel", "FuelView");
    PopupState *call = flow.popup("rootnoreset/call", "CallView");
    QSignalSpy resets(flow.lower, &PopupRootState::reset);
    QVERIFY(resets.isValid());
    flow.start();
    flow.request("rootnoreset/fuel");

    flow.lower->removePopupState(call);

    QCOMPARE(resets.size(), 0);
    QVERIFY(fuel->isActive());
}

void tst_PopupRootState::aPopupIsDeactivatedUntilItIsEntered()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("rootwas/fuel", "FuelView");
    flow.start();
    QVERIFY(flow.lower->wasDeactivated(popup));
    QVERIFY(flow.lower->wasDeactivated(flow.lower->noPopupState()));

    flow.request("rootwas/fuel");
    QVERIFY(!flow.lower->wasDeactivated(popup));
    QVERIFY(flow.upper->wasDeactivated(popup));

    flow.request("rootwas/fuel_Dismiss");
    QVERIFY(flow.lower->wasDeactivated(popup));
}

void tst_PopupRootState::aDeactivatedPopupDoesNotReturn()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("rootdeact/fuel", "FuelView");
    flow.popup("rootdeact/call", "CallView");
    flow.start();
    flow.request("rootdeact/fuel");
    flow.request("rootdeact/call");
    flow.request("rootdeact/fuel");
    flow.request("rootdeact/call");

    flow.lower->deactivatePopupState(fuel);

    QVERIFY(flow.lower->wasDeactivated(fuel));
    flow.request("rootdeact/call_Dismiss");
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
}

void tst_PopupRootState::theResetTransitionMovesWithTheActiveChild()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("rootresetmove/fuel", "FuelView");
    const HmiSignalTransition *reset = resetTransitionOf(flow.lower);
    flow.start();

    flow.request("rootresetmove/fuel");
    QCOMPARE(reset->sourceState(), popup);
    QVERIFY(!reset->blocked());

    flow.request("rootresetmove/fuel_Dismiss");
    QCOMPARE(reset->sourceState(), flow.lower);
    QVERIFY(reset->blocked());
}

void tst_PopupRootState::resetIsHandledOnlyWithAPopup()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("rootresets/fuel", "FuelView");
    QSignalSpy handled(resetTransitionOf(flow.lower), &QAbstractTransition::triggered);
    QVERIFY(handled.isValid());
    flow.start();

    Q_EMIT flow.lower->reset();
    QCOMPARE(handled.size(), 0);

    flow.request("rootresets/fuel");
    Q_EMIT flow.lower->reset();
    QCOMPARE(handled.size(), 1);
    QVERIFY(!popup->isActive());

    Q_EMIT flow.lower->reset();
    QCOMPARE(handled.size(), 1);
}

void tst_PopupRootState::resetForgetsThoseThatWait()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("rootforget/fuel", "FuelView");
    PopupState *call = flow.popup("rootforget/call", "CallView");
    flow.start();
    flow.request("rootforget/fuel");
    flow.request("rootforget/call");

    Q_EMIT flow.lower->reset();

    QVERIFY(flow.lower->wasDeactivated(fuel));
    QVERIFY(flow.lower->wasDeactivated(call));
    settle();
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
}

void tst_PopupRootState::aResetTakesTheNameOfAStateForAView()
{
    PopupFlow flow(messages());
    flow.popup("rootresetname/fuel", "FuelView");
    flow.upperPopup("rootresetname/warn", "rootresetname/fuel");
    flow.upperPopup("rootresetname/alarm", "AlarmView");
    PopupFlow::rule("rootresetname/warn", PopupState::AllowStack, "rootresetname/alarm");
    flow.start();
    flow.request("rootresetname/fuel");
    flow.request("rootresetname/warn");
    flow.request("rootresetname/alarm");
    QCOMPARE(flow.target.stackedPopups(), QStringList({"rootresetname/fuel"}));

    Q_EMIT flow.lower->reset();
    settle();

    // What was stacked is the upper layer's, whose view is called like the lower layer's popup.
    QCOMPARE(flow.target.stackedPopups(), QStringList());
}

void tst_PopupRootState::clearingWithoutAPopupOnlyForgets()
{
    PopupRootState root("RootClear");
    PopupState popup("rootclear/fuel", &root, 1);
    root.setActivePopupState(&popup);
    root.setActivePopupState(root.noPopupState());
    QVERIFY(!root.wasDeactivated(&popup));

    root.clearPopups();

    QVERIFY(root.wasDeactivated(&popup));
    QCOMPARE(root.activePopupState(), root.noPopupState());
}

void tst_PopupRootState::clearingLeavesAStackedSiblingStacked()
{
    PopupFlow flow(messages());
    flow.popup("rootclearstack/fuel", "FuelView");
    flow.popup("rootclearstack/call", "CallView");
    PopupFlow::rule("rootclearstack/fuel", PopupState::AllowStack, "rootclearstack/call");
    flow.start();
    flow.request("rootclearstack/fuel");
    flow.request("rootclearstack/call");
    flow.take();

    flow.lower->clearPopups();
    settle();

    // The view layer is told nothing of the one that was stacked, and goes on listing it.
    QCOMPARE(flow.take(),
             QStringList({"requestPopupHide CallView true", "unstackPopup CallView",
                          "requestPopupHide CallView true", "unstackPopup CallView"}));
    QCOMPARE(flow.target.stackedPopups(), QStringList({"FuelView"}));
}

void tst_PopupRootState::aPopupRenamedWhileItWaitsDoesNotReturn()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("rootrename/fuel", "FuelView");
    flow.popup("rootrename/call", "CallView");
    fuel->setName("rootrename/charge");
    flow.start();
    flow.request("rootrename/fuel");
    flow.request("rootrename/call");

    flow.request("rootrename/call_Dismiss");

    // It is on the list by its new name, and known to the layer by the one it was added with.
    QVERIFY(!fuel->isActive());
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
}

void tst_PopupRootState::aPopupRenamedWhileItIsShownComesBackOnce()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("rootrenameshown/fuel", "FuelView");
    flow.start();
    flow.request("rootrenameshown/fuel");
    fuel->setName("rootrenameshown/charge");

    flow.request("rootrenameshown/charge_Dismiss");
    QVERIFY(fuel->isActive());

    flow.request("rootrenameshown/charge_Dismiss");
    QVERIFY(!fuel->isActive());
}

void tst_PopupRootState::theNoPopupStateTakesItsOwnDismissal()
{
    PopupFlow flow(messages());
    PopupState *none = flow.lower->noPopupState();
    flow.start();
    QSignalSpy entered(none, &QAbstractState::entered);

    flow.request(none->name() + "_Dismiss");
    flow.request("DismissAnyPopup");

    QCOMPARE(entered.size(), 2);
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupRootState::leavingTheLayerForgetsThoseThatWait()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("rootaway/fuel", "FuelView");
    flow.popup("rootaway/call", "CallView");
    flow.start();
    flow.request("rootaway/fuel");
    flow.request("rootaway/call");

    flow.leave();

    QVERIFY(flow.lower->wasDeactivated(fuel));
    flow.comeBack();
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
}

void tst_PopupRootState::handlingAResetWithoutAViewLayerForgetsAllTheSame()
{
    PopupRootState root("RootHandle");
    PopupState popup("roothandle/fuel", &root, 1);
    root.setActivePopupState(&popup);

    root.handleReset();

    QVERIFY(root.wasDeactivated(&popup));
    QCOMPARE(root.activePopupState(), &popup);
}

void tst_PopupRootState::handlingAResetBeforeTheLayerIsEnteredHidesNothing()
{
    PopupFlow flow(messages());
    QCOMPARE(flow.lower->activePopupState(), nullptr);

    flow.lower->handleReset();

    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupRootState::aRootWithoutAMachineRequestsNothingAgain()
{
    PopupRootState root("RootLone");
    PopupState popup("rootlone/fuel", &root, 1);
    root.setActivePopupState(&popup);

    root.setActivePopupState(root.noPopupState());

    QVERIFY(!root.wasDeactivated(&popup));
    QCOMPARE(root.activePopupState(), root.noPopupState());
}

void tst_PopupRootState::twoRootsActAlone()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("roottwo/fuel", "FuelView");
    PopupState *warn = flow.upperPopup("roottwo/warn", "WarnView");
    flow.start();
    flow.request("roottwo/fuel");
    flow.request("roottwo/warn");

    Q_EMIT flow.lower->reset();
    QVERIFY(!fuel->isActive());
    QVERIFY(warn->isActive());

    flow.upper->clearPopups();
    settle();
    QVERIFY(!warn->isActive());
}

void tst_PopupRootState::aRootCanBeDeletedAlone()
{
    auto *root = new PopupRootState("RootDeleted");
    new PopupState("rootdeleted/fuel", root, 1);

    delete root;

    QCOMPARE(NamedState::namedStates().size(), 0);
}

QTEST_GUILESS_MAIN(tst_PopupRootState)
#include "tst_popuprootstate.moc"
