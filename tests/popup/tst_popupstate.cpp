#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"
#include "popupflow.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QtTest>

using namespace HmiStateMachine;

class tst_PopupState : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void theBehavioursHaveTheirNumbers();
    void aPopupBeginsWithItsDefaults();
    void aPopupWithoutARootSaysNothing();
    void aNullRootIsReported();
    void aNullLayerIsReported();
    void aPopupOfALayerBelongsToItsPopupRoot();
    void aPopupOfARootBelongsToIt();
    void thePopupViewIdIsTheNameUnlessSet();
    void aRenameLeavesThePopupViewIdAsItIs();
    void siblingsHaveTheSameParent();
    void theKindIsHandedOnUnchanged_data();
    void theKindIsHandedOnUnchanged();
    void everyShownPopupIsWritten();
    void aPopupThatCannotBeDismissedIsReportedOnEntry();
    void thatReportCanBeTurnedOff();
    void entryKeepsValidDataOnly();
    void refreshingStoresInvalidDataToo();
    void refreshingWithoutAnEventDoesNothing();
    void instanceDataIsHandedOver();
    void removedInstanceDataIsNotHandedOver();
    void preparingAnnouncesThePopup_data();
    void preparingAnnouncesThePopup();
    void aNoPopupStateCallsNothing_data();
    void aNoPopupStateCallsNothing();
    void activePopupsAreListedInOrderOfEntry();
    void activePopupsAreFoundByViewIdOrIdentity();
    void aNoPopupStateIsNeverAnActivePopup();
    void aTargetIsANameBeforeItIsAViewId();
    void aPopupWithoutARootCanBeEntered();
    void theStateReportsOfTheViewLayerAreOffAtFirst();
    void theStateReportsOfTheViewLayerAreSignalled();
    void reportsAreFollowedUntilTheHiddenOneIsReported();
    void reportsSwitchedOnWhileActiveAreFollowedAtOnce();
    void reportsSwitchedOffAreNotFollowed();
    void connectingReportsTwiceTellsOnce();
    void theStateHooksDoNothing();
    void aDismissingTransitionOfNothingIsReported();
    void aDismissingPopupOfNothingIsReported();
    void aDismissingTransitionToASiblingGivesThePopupUp();
    void aDismissingTransitionElsewhereClosesThePopup();
};

void tst_PopupState::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(PopupState::staticMetaObject),
             QStringList({"signal popupTimeOut()", "signal aboutToBeActivated()",
                          "signal alreadyActivated()", "signal blocked()",
                          "signal exitingDueToDriverRestrictions()", "signal popupHidden()",
                          "signal popupShown()", "signal popupAnimationStarted(int type)",
                          "slot deactivateSource(PopupState* target)", "slot deactivate()",
                          "slot activeDomainChanged(int newDomain, int oldDomain)",
                          "slot activeViewChanged(Identifier newView, Identifier oldView)",
                          "slot stateEntry()", "slot stateExit()",
                          "slot onViewStateTargetPopupStateChanged(Identifier popupId, bool shown)",
                          "slot onPopupAnimationStarted(Identifier popupId, int type)"}));
    QCOMPARE(PopupState::staticMetaObject.superClass(), &NamedState::staticMetaObject);
}

void tst_PopupState::theBehavioursHaveTheirNumbers()
{
    QCOMPARE(int(PopupState::Prohibit), 0);
    QCOMPARE(int(PopupState::Allow), 1);
    QCOMPARE(int(PopupState::AllowStack), 2);
    QCOMPARE(int(PopupState::AllowNoReturn), 3);
    QCOMPARE(PopupState::noneStatePostfix(), QString("_NONEPOPUP"));
}

void tst_PopupState::aPopupBeginsWithItsDefaults()
{
    PopupState popup("statedefaults/fuel", 1);

    QVERIFY(!popup.stackedBySibling());
    QVERIFY(!popup.hasOwnInterruptionBehavior());
    QVERIFY(!popup.reportsQmlPopupStatus());
    QVERIFY(!popup.autoDismissActive());
    QVERIFY(!popup.driverRestricted());
    QVERIFY(!popup.isCurrentPopup());
    QCOMPARE(popup.autoDismissInterval(), 5000);
    QCOMPARE(popup.autoDismissRemainingTime(), 0);
    QCOMPARE(popup.autoDismissTransition(), nullptr);
    QCOMPARE(popup.interruption(&popup), PopupState::Allow);
    QVERIFY(!popup.handleDomainBlocked());
    QVERIFY(!popup.handleInterruptionBlocked());
    QVERIFY(!popup.handleBlocked());
}

void tst_PopupState::aPopupWithoutARootSaysNothing()
{
    const PopupState popup("statelone/fuel", 1);

    QCOMPARE(popup.rootPopupState(), nullptr);
    QCOMPARE(popup.parent(), nullptr);
    QCOMPARE(messages().take(), QStringList());
}

void tst_PopupState::aNullRootIsReported()
{
    const PopupState popup("statenull/fuel", static_cast<PopupRootState *>(nullptr), 1);

    QCOMPARE(messages().take(),
             QStringList({"warning PopupState: PopupState: Invalid popup root state instance."}));
    QCOMPARE(popup.rootPopupState(), nullptr);
}

void tst_PopupState::aNullLayerIsReported()
{
    const PopupState popup("statenulllayer/fuel", static_cast<HmiLayeredState *>(nullptr), 1);

    QCOMPARE(messages().take(),
             QStringList({"warning PopupState: PopupState: Invalid popup root state instance."}));
    QCOMPARE(popup.rootPopupState(), nullptr);
}

void tst_PopupState::aPopupOfALayerBelongsToItsPopupRoot()
{
    HmiLayeredState layer("StateLayer");

    const auto *popup = new PopupState("statelayer/fuel", &layer, 1);

    QCOMPARE(popup->rootPopupState(), layer.popupState());
    QCOMPARE(popup->parentState(), layer.popupState());
}

void tst_PopupState::aPopupOfARootBelongsToIt()
{
    PopupRootState root("StateRoot");

    const auto *popup = new PopupState("stateroot/fuel", &root, 1);

    QCOMPARE(popup->rootPopupState(), &root);
    QCOMPARE(popup->parentState(), &root);
}

void tst_PopupState::thePopupViewIdIsTheNameUnlessSet()
{
    PopupState popup("stateid/fuel", 1);
    QCOMPARE(popup.popupViewId(), QString("stateid/fuel"));

    popup.setPopupViewId("FuelView");
    QCOMPARE(popup.popupViewId(), QString("FuelView"));
    QCOMPARE(popup.name(), QString("stateid/fuel"));

    popup.setPopupViewId("");
    QCOMPARE(popup.popupViewId(), QString());
}

void tst_PopupState::aRenameLeavesThePopupViewIdAsItIs()
{
    PopupState popup("stateold/fuel", 1);

    popup.setName("statenew/fuel");

    QCOMPARE(popup.popupViewId(), QString("stateold/fuel"));
    QCOMPARE(popup.dismissEventIdentifier(), QString("statenew/fuel_Dismiss"));
}

void tst_PopupState::siblingsHaveTheSameParent()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("statesibling/fuel", "FuelView");
    PopupState *call = flow.popup("statesibling/call", "CallView");
    PopupState *warn = flow.upperPopup("statesibling/warn", "WarnView");

    QVERIFY(fuel->isSibling(call));
    QVERIFY(fuel->isSibling(flow.lower->noPopupState()));
    QVERIFY(fuel->isSibling(fuel));
    QVERIFY(!fuel->isSibling(warn));
    QVERIFY(!fuel->isSibling(flow.lower));
    QVERIFY(!fuel->isSibling(nullptr));
}

void tst_PopupState::theKindIsHandedOnUnchanged_data()
{
    QTest::addColumn<int>("kind");
    QTest::addColumn<QString>("line");

    QTest::newRow("zero") << 0 << "requestPopupShow FuelView 0";
    QTest::newRow("negative") << -7 << "requestPopupShow FuelView -7";
    QTest::newRow("large") << 2147483647 << "requestPopupShow FuelView 2147483647";
}

void tst_PopupState::theKindIsHandedOnUnchanged()
{
    QFETCH(int, kind);
    QFETCH(QString, line);
    PopupFlow flow(messages());
    flow.popup("statekind/fuel", "FuelView", kind);
    flow.start();

    flow.request("statekind/fuel");

    QCOMPARE(flow.take(),
             QStringList({"preparePopup FuelView false", line, "unstackPopup FuelView"}));
}

void tst_PopupState::everyShownPopupIsWritten()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("statewritten/fuel", "FuelView");
    const QString line = "warning showPopup: virtual void "
                         "HmiStateMachine::PopupState::showPopup(bool)  target name  \"FuelView\"";
    flow.start();

    flow.request("statewritten/fuel");
    QCOMPARE(messages().take(), QStringList({line}));

    popup->showPopup(false);
    QCOMPARE(messages().take(), QStringList({line}));
}

void tst_PopupState::aPopupThatCannotBeDismissedIsReportedOnEntry()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("statestuck/fuel", "FuelView");
    popup->dismissTransition()->setDismissTarget("");
    flow.start();

    flow.request("statestuck/fuel");

    QCOMPARE(flow.takeMessages(),
             QStringList({"warning onEntry: You are entering a non dismissible popup state!! \n "
                          "State name:  \"statestuck/fuel\" \n Dismiss event identifier;  \"\" \n "
                          "Dismiss wildcard:  \"DismissAnyPopup\""}));
    // It is left as it is, without a target.
    QCOMPARE(popup->dismissTransition()->targetState(), nullptr);
    QCOMPARE(popup->dismissTransition()->sourceState(), popup);
}

void tst_PopupState::thatReportCanBeTurnedOff()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("statequiet/fuel", "FuelView");
    popup->dismissTransition()->setDismissTarget("");
    popup->turnOffNonDismissibleWarning();
    flow.start();

    flow.request("statequiet/fuel");
    QCOMPARE(popup->dismissTransition()->targetState(), flow.lower->noPopupState());

    flow.request("FuelView_Dismiss");
    QVERIFY(!popup->isActive());
}

void tst_PopupState::entryKeepsValidDataOnly()
{
    PopupFlow flow(messages());
    flow.popup("statedata/fuel", "FuelView");
    flow.start();

    flow.request("statedata/fuel");
    QCOMPARE(flow.target.popupData("FuelView"), QVariantMap());

    flow.request("statedata/fuel_Dismiss");
    flow.request("statedata/fuel", "low");
    QCOMPARE(flow.target.popupData("FuelView"), QVariantMap({{"eventData", "low"}}));

    flow.request("statedata/fuel_Dismiss");
    flow.request("statedata/fuel");
    QCOMPARE(flow.target.popupData("FuelView"), QVariantMap({{"eventData", "low"}}));
}

void tst_PopupState::refreshingStoresInvalidDataToo()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("staterefresh/fuel", "FuelView");
    popup->addInstanceData("unit", "litres");
    QEvent other(QEvent::User);
    PopupEvent low("staterefresh/fuel", "low");

    popup->updateEventData(&low);
    QCOMPARE(flow.target.popupData("FuelView"),
             QVariantMap({{"eventData", "low"}, {"unit", "litres"}}));

    popup->updateEventData(&other);
    QCOMPARE(flow.target.popupData("FuelView"),
             QVariantMap({{"eventData", QVariant()}, {"unit", "litres"}}));
}

void tst_PopupState::refreshingWithoutAnEventDoesNothing()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("statenorefresh/fuel", "FuelView");

    popup->updateEventData(nullptr);

    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupState::instanceDataIsHandedOver()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("stateinstance/fuel", "FuelView");
    popup->addInstanceData("unit", "litres");
    popup->addInstanceData("unit", "gallons");
    flow.start();

    flow.request("stateinstance/fuel", 5);

    QCOMPARE(flow.target.popupData("FuelView"),
             QVariantMap({{"eventData", 5}, {"unit", "gallons"}}));
}

void tst_PopupState::removedInstanceDataIsNotHandedOver()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("stateremoved/fuel", "FuelView");
    popup->addInstanceData("unit", "litres");
    flow.start();

    popup->removeInstanceData("unit");
    popup->removeInstanceData("unknown");
    flow.request("stateremoved/fuel");

    QCOMPARE(flow.target.popupData("FuelView"), QVariantMap());
}

void tst_PopupState::preparingAnnouncesThePopup_data()
{
    QTest::addColumn<bool>("reactivation");
    QTest::addColumn<QString>("line");

    QTest::newRow("request") << false << "preparePopup FuelView false";
    QTest::newRow("return") << true << "preparePopup FuelView true";
}

void tst_PopupState::preparingAnnouncesThePopup()
{
    QFETCH(bool, reactivation);
    QFETCH(QString, line);
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("stateprepare/fuel", "FuelView");
    flow.record(popup);

    popup->prepareForActivation(reactivation);

    QCOMPARE(flow.take(), QStringList({line, "FuelView aboutToBeActivated"}));
}

void tst_PopupState::aNoPopupStateCallsNothing_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<bool>("silent");

    QTest::newRow("ending") << "statenone_NONEPOPUP" << true;
    QTest::newRow("ending alone") << "_NONEPOPUP" << true;
    QTest::newRow("of another case") << "statenone_NonePopup" << false;
    QTest::newRow("in the middle") << "statenone_NONEPOPUP_" << false;
}

void tst_PopupState::aNoPopupStateCallsNothing()
{
    QFETCH(QString, name);
    QFETCH(bool, silent);
    PopupFlow flow(messages());
    PopupState popup(name, 1);

    popup.showPopup(true);
    popup.hidePopup(true);

    QCOMPARE(flow.take().isEmpty(), silent);
}

void tst_PopupState::activePopupsAreListedInOrderOfEntry()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("statestack/fuel", "FuelView");
    PopupState *warn = flow.upperPopup("statestack/warn", "WarnView");
    QCOMPARE(PopupState::getActivePopupState(), nullptr);
    flow.start();
    QCOMPARE(PopupState::getActivePopupState(), nullptr);

    flow.request("statestack/warn");
    flow.request("statestack/fuel");
    QCOMPARE(PopupState::getActivePopupState(), fuel);

    flow.request("statestack/fuel_Dismiss");
    QCOMPARE(PopupState::getActivePopupState(), warn);

    flow.request("statestack/warn_Dismiss");
    QCOMPARE(PopupState::getActivePopupState(), nullptr);
}

void tst_PopupState::activePopupsAreFoundByViewIdOrIdentity()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("statefound/fuel", "FuelView");
    PopupState *call = flow.popup("statefound/call", "CallView");
    flow.start();

    flow.request("statefound/fuel");

    QVERIFY(PopupState::isStateActive("FuelView"));
    QVERIFY(PopupState::isStateActive(fuel));
    QVERIFY(!PopupState::isStateActive("statefound/fuel"));
    QVERIFY(!PopupState::isStateActive("CallView"));
    QVERIFY(!PopupState::isStateActive(call));
    QVERIFY(!PopupState::isStateActive(static_cast<PopupState *>(nullptr)));
    QVERIFY(!PopupState::isStateActive(QString()));
}

void tst_PopupState::aNoPopupStateIsNeverAnActivePopup()
{
    PopupFlow flow(messages());

    flow.start();

    QVERIFY(!PopupState::isStateActive(flow.lower->noPopupState()));
    QVERIFY(!PopupState::isStateActive("Lower_NONEPOPUP"));
}

void tst_PopupState::aTargetIsANameBeforeItIsAViewId()
{
    PopupState first("statetarget/first", 1);
    PopupState second("statetarget/second", 1);
    const NamedState other("statetarget/state");
    first.setPopupViewId("statetarget/second");
    second.setPopupViewId("SecondView");

    QCOMPARE(PopupState::stateForTarget("statetarget/first"), &first);
    QCOMPARE(PopupState::stateForTarget("statetarget/second"), &second);
    QCOMPARE(PopupState::stateForTarget("SecondView"), &second);
    QCOMPARE(PopupState::stateForTarget("statetarget/state"), nullptr);
    QCOMPARE(PopupState::stateForTarget("unknown"), nullptr);

    second.setPopupViewId("statetarget/state");
    QCOMPARE(PopupState::stateForTarget("statetarget/state"), &second);
}

void tst_PopupState::aPopupWithoutARootCanBeEntered()
{
    PopupFlow flow(messages());
    auto *popup = new PopupState("staterootless/fuel", 1);
    popup->setParent(&flow.machine);
    lead(QEvent::Type(QEvent::User + 3), flow.away, popup);
    lead(QEvent::Type(QEvent::User + 4), popup, flow.away);
    popup->setAutoDismissTimeoutActive(true);
    startIn(flow.machine, flow.away);
    flow.machine.postEvent(new QEvent(QEvent::Type(QEvent::User + 3)));
    settle();
    QVERIFY(popup->isActive());
    QVERIFY(!popup->isCurrentPopup());
    QCOMPARE(popup->autoDismissTransition(), nullptr);

    flow.request("staterootless/fuel_Dismiss");
    flow.machine.postEvent(new QEvent(QEvent::Type(QEvent::User + 4)));
    settle();
    QVERIFY(!popup->isActive());
}

void tst_PopupState::theStateReportsOfTheViewLayerAreOffAtFirst()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("statenoreport/fuel", "FuelView");
    flow.record(popup);
    flow.start();
    flow.request("statenoreport/fuel");
    flow.take();

    Q_EMIT flow.target.popupStatusChanged("FuelView", true);
    Q_EMIT flow.target.popupStatusChanged("FuelView", false);

    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupState::theStateReportsOfTheViewLayerAreSignalled()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("statereport/fuel", "FuelView");
    popup->setReportsQmlPopupStatus(true);
    flow.record(popup);
    QSignalSpy animations(popup, &PopupState::popupAnimationStarted);
    QVERIFY(animations.isValid());
    flow.start();
    flow.request("statereport/fuel");
    flow.take();

    Q_EMIT flow.target.popupStatusChanged("FuelView", true);
    Q_EMIT flow.target.popupStatusChanged("CallView", false);
    Q_EMIT flow.target.popupStatusChanged("statereport/fuel", false);
    Q_EMIT flow.target.popupAnimationStarted("FuelView", 3);
    Q_EMIT flow.target.popupAnimationStarted("CallView", 4);
    Q_EMIT flow.target.popupStatusChanged("FuelView", false);

    QCOMPARE(flow.take(), QStringList({"FuelView popupShown", "FuelView popupHidden"}));
    QCOMPARE(animations.size(), 1);
    QCOMPARE(animations.first(), QVariantList({3}));
}

void tst_PopupState::reportsAreFollowedUntilTheHiddenOneIsReported()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("statehidden/fuel", "FuelView");
    popup->setReportsQmlPopupStatus(true);
    flow.start();
    flow.request("statehidden/fuel");
    flow.request("statehidden/fuel_Dismiss");
    flow.record(popup);
    flow.take();

    Q_EMIT flow.target.popupStatusChanged("FuelView", false);
    Q_EMIT flow.target.popupStatusChanged("FuelView", false);

    QCOMPARE(flow.take(), QStringList({"FuelView popupHidden"}));
}

void tst_PopupState::reportsSwitchedOnWhileActiveAreFollowedAtOnce()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("statelate/fuel", "FuelView");
    flow.record(popup);
    popup->setReportsQmlPopupStatus(true);
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);
    QCOMPARE(flow.take(), QStringList());
    popup->setReportsQmlPopupStatus(false);
    flow.start();
    flow.request("statelate/fuel");
    flow.take();

    popup->setReportsQmlPopupStatus(true);
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);

    QCOMPARE(flow.take(), QStringList({"FuelView popupShown"}));
}

void tst_PopupState::reportsSwitchedOffAreNotFollowed()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("stateoff/fuel", "FuelView");
    flow.record(popup);
    popup->setReportsQmlPopupStatus(true);
    flow.start();
    flow.request("stateoff/fuel");
    flow.take();

    popup->setReportsQmlPopupStatus(false);
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);

    QCOMPARE(flow.take(), QStringList());
    QVERIFY(!popup->reportsQmlPopupStatus());
}

void tst_PopupState::connectingReportsTwiceTellsOnce()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("stateonce/fuel", "FuelView");
    flow.record(popup);

    popup->setPopupStatusConnectionActive(true);
    popup->setPopupStatusConnectionActive(true);
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);
    QCOMPARE(flow.take(), QStringList({"FuelView popupShown"}));

    popup->setPopupStatusConnectionActive(false);
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupState::theStateHooksDoNothing()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("statehooks/fuel", "FuelView");
    flow.record(popup);

    popup->stateEntry();
    popup->stateExit();
    popup->onDeactivated();

    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupState::aDismissingTransitionOfNothingIsReported()
{
    PopupState popup("statenotransition/fuel", 1);

    popup.registerDismissingTransition(nullptr);

    QCOMPARE(messages().take(),
             QStringList({"warning registerDismissingTransition: Dismissing transition "
                          "registration failed:\n Null transition provided"}));
}

void tst_PopupState::aDismissingPopupOfNothingIsReported()
{
    PopupState popup("statenopopup/fuel", 1);

    popup.registerDismissingPopup(nullptr);

    QCOMPARE(messages().take(),
             QStringList({"warning registerDismissingPopup: Dismissing popup registration "
                          "failed:\n Null popup provided."}));
}

void tst_PopupState::aDismissingTransitionToASiblingGivesThePopupUp()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("statetosibling/fuel", "FuelView");
    PopupState *call = flow.popup("statetosibling/call", "CallView");
    lead(QEvent::Type(QEvent::User + 3), fuel, call);
    fuel->registerDismissingTransition(fuel->transitions().last());
    flow.start();
    flow.request("statetosibling/fuel");
    flow.take();

    flow.machine.postEvent(new QEvent(QEvent::Type(QEvent::User + 3)));
    settle();

    QCOMPARE(flow.take(),
             QStringList({"requestPopupHide FuelView false", "unstackPopup FuelView",
                          "requestPopupHide FuelView true", "unstackPopup FuelView",
                          "requestPopupShow CallView 1", "unstackPopup CallView"}));
    QVERIFY(flow.lower->wasDeactivated(fuel));
}

void tst_PopupState::aDismissingTransitionElsewhereClosesThePopup()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("stateelsewhere/fuel", "FuelView");
    lead(QEvent::Type(QEvent::User + 3), flow.upper, nullptr);
    fuel->registerDismissingTransition(flow.upper->transitions().last());
    flow.start();
    flow.request("stateelsewhere/fuel");
    flow.take();

    flow.machine.postEvent(new QEvent(QEvent::Type(QEvent::User + 3)));
    settle();

    QVERIFY(!fuel->isActive());
    QCOMPARE(flow.take(),
             QStringList({"requestPopupHide FuelView true", "unstackPopup FuelView",
                          "requestPopupHide FuelView true", "unstackPopup FuelView",
                          "requestPopupHide FuelView true", "unstackPopup FuelView"}));
}

QTEST_GUILESS_MAIN(tst_PopupState)
#include "tst_popupstate.moc"
