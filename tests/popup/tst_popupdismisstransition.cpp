#include "driving.h"
#include "librarytest.h"
#include "makeevent.h"
#include "metadescription.h"
#include "popupflow.h"

#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QtTest>

using namespace HmiStateMachine;

class tst_PopupDismissTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void theFixedPartsOfDismissIdentifiers();
    void itBelongsToItsPopup();
    void aNullPopupMakesATransitionThatDoesNothing();
    void aTransitionOfNoPopupMovesNothing();
    void theDismissTargetIsTheNameWithItsSuffix_data();
    void theDismissTargetIsTheNameWithItsSuffix();
    void theEventsThatDismiss_data();
    void theEventsThatDismiss();
    void anEmptyTargetDismissesNothing();
    void aPopupCanBeDismissedByItsViewAlone();
    void aRenamedPopupIsDismissedByItsNewName();
    void aRenameLeavesTheViewAsItIs();
    void theViewFollowsThePopupViewId();
    void aSlotCanBeGivenTheName();
    void triggeringPostsTheDismissEvent();
    void triggeringWithoutAMachineDoesNothing();
    void triggeringAPopupThatCannotBeDismissedMovesNothing();
    void aDismissalIsSignalled();
    void theDismissalOfAWaitingPopupIsNotSignalled();
    void theTransitionLeadsFromTheActivePopupToNoPopup();
    void theTransitionOfAWaitingPopupHangsOnTheRoot();
    void aPopupThatCannotBeDismissedIgnoresItsEvents();
    void theWildcardHidesAPopupThatCannotBeDismissed();
};

void tst_PopupDismissTransition::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(PopupDismissTransition::staticMetaObject),
             QStringList({"slot sourceNameChanged(Identifier identifier)", "slot trigger()"}));
    QCOMPARE(PopupDismissTransition::staticMetaObject.superClass(),
             &QAbstractTransition::staticMetaObject);
}

void tst_PopupDismissTransition::theFixedPartsOfDismissIdentifiers()
{
    QCOMPARE(PopupDismissTransition::dismissEventSigniture, QString("_Dismiss"));
    QCOMPARE(PopupDismissTransition::dismissEventWildCard, QString("DismissAnyPopup"));
}

void tst_PopupDismissTransition::itBelongsToItsPopup()
{
    const PopupState popup("dismissown/fuel", 1);

    QCOMPARE(popup.dismissTransition()->sourceState(), &popup);
    QCOMPARE(popup.dismissTransition()->targetState(), nullptr);
    QCOMPARE(popup.dismissEventIdentifier(), QString("dismissown/fuel_Dismiss"));
}

void tst_PopupDismissTransition::aNullPopupMakesATransitionThatDoesNothing()
{
    PopupDismissTransition transition(nullptr);
    PopupEvent empty("", QVariant());

    transition.trigger();

    QCOMPARE(transition.dismissTargetSigniture(), QString());
    QVERIFY(!transition.isDismissable());
    QVERIFY(!transition.isDismissEvent(&empty));
    QCOMPARE(transition.sourceState(), nullptr);
}

void tst_PopupDismissTransition::aTransitionOfNoPopupMovesNothing()
{
    PopupFlow flow(messages());
    (new PopupDismissTransition(nullptr))->setParent(flow.away);
    flow.start();
    flow.leave();

    flow.request("DismissAnyPopup");

    QVERIFY(flow.away->isActive());
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupDismissTransition::theDismissTargetIsTheNameWithItsSuffix_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QString>("target");
    QTest::addColumn<bool>("dismissable");

    QTest::newRow("name") << "phone/call"
                          << "phone/call_Dismiss" << true;
    QTest::newRow("suffix alone") << "_Dismiss"
                                  << "_Dismiss_Dismiss" << true;
    QTest::newRow("blank") << " "
                           << " _Dismiss" << true;
    QTest::newRow("empty") << ""
                           << "" << false;
}

void tst_PopupDismissTransition::theDismissTargetIsTheNameWithItsSuffix()
{
    QFETCH(QString, name);
    QFETCH(QString, target);
    QFETCH(bool, dismissable);
    PopupDismissTransition transition(nullptr);

    transition.setDismissTarget(name);

    QCOMPARE(transition.dismissTargetSigniture(), target);
    QCOMPARE(transition.isDismissable(), dismissable);
}

void tst_PopupDismissTransition::theEventsThatDismiss_data()
{
    QTest::addColumn<MakeEvent>("makeEvent");
    QTest::addColumn<bool>("dismisses");

    const auto row = [](const char *tag, bool dismisses, MakeEvent make) {
        QTest::newRow(tag) << make << dismisses;
    };
    row("name", true, [] { return static_cast<QEvent *>(new PopupEvent("m/p_Dismiss", 1)); });
    row("view", true, [] { return static_cast<QEvent *>(new PopupEvent("View_Dismiss", 1)); });
    row("any", true, [] { return static_cast<QEvent *>(new PopupEvent("DismissAnyPopup", 1)); });
    row("reactivation", true,
        [] { return static_cast<QEvent *>(new PopupEvent("m/p_Dismiss", true, 1)); });
    row("name alone", false, [] { return static_cast<QEvent *>(new PopupEvent("m/p", 1)); });
    row("view alone", false, [] { return static_cast<QEvent *>(new PopupEvent("View", 1)); });
    row("empty", false, [] { return static_cast<QEvent *>(new PopupEvent("", 1)); });
    row("suffix", false, [] { return static_cast<QEvent *>(new PopupEvent("_Dismiss", 1)); });
    row("case", false, [] { return static_cast<QEvent *>(new PopupEvent("m/P_Dismiss", 1)); });
    row("named event", false, [] { return static_cast<QEvent *>(new HmiEvent("m/p_Dismiss", 1)); });
    row("view event", false,
        [] { return static_cast<QEvent *>(new HmiViewEvent("View_Dismiss", 1)); });
    row("none", false, [] { return new QEvent(QEvent::None); });
}

void tst_PopupDismissTransition::theEventsThatDismiss()
{
    QFETCH(MakeEvent, makeEvent);
    QFETCH(bool, dismisses);
    PopupState popup("m/p", 1);
    popup.setPopupViewId("View");
    const QScopedPointer<QEvent> event(makeEvent());

    QCOMPARE(popup.dismissTransition()->isDismissEvent(event.data()), dismisses);
}

void tst_PopupDismissTransition::anEmptyTargetDismissesNothing()
{
    PopupDismissTransition transition(nullptr);
    transition.setDismissTarget("");
    transition.setDismissView("");
    PopupEvent empty("", QVariant());
    PopupEvent any("DismissAnyPopup", QVariant());

    QVERIFY(!transition.isDismissEvent(&empty));
    QVERIFY(transition.isDismissEvent(&any));
}

void tst_PopupDismissTransition::aPopupCanBeDismissedByItsViewAlone()
{
    PopupDismissTransition transition(nullptr);
    transition.setDismissView("View");
    PopupEvent byView("View_Dismiss", QVariant());

    QVERIFY(transition.isDismissEvent(&byView));
    QVERIFY(!transition.isDismissable());
}

void tst_PopupDismissTransition::aRenamedPopupIsDismissedByItsNewName()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("dismissold/fuel", "FuelView");
    popup->setName("dismissnew/fuel");
    flow.start();
    flow.request("dismissold/fuel");

    flow.request("dismissold/fuel_Dismiss");
    QVERIFY(popup->isActive());
    QCOMPARE(popup->dismissEventIdentifier(), QString("dismissnew/fuel_Dismiss"));

    flow.request("dismissnew/fuel_Dismiss");
    QVERIFY(!popup->isActive());
}

void tst_PopupDismissTransition::aRenameLeavesTheViewAsItIs()
{
    PopupState popup("dismissview/fuel", 1);

    popup.setName("dismissview/charge");

    PopupEvent byFormerName("dismissview/fuel_Dismiss", QVariant());
    QCOMPARE(popup.popupViewId(), QString("dismissview/fuel"));
    QVERIFY(popup.dismissTransition()->isDismissEvent(&byFormerName));
}

void tst_PopupDismissTransition::theViewFollowsThePopupViewId()
{
    PopupState popup("dismissid/fuel", 1);
    popup.setPopupViewId("Old");
    PopupEvent byOldId("Old_Dismiss", QVariant());
    PopupEvent byNewId("New_Dismiss", QVariant());

    popup.setPopupViewId("New");

    QVERIFY(!popup.dismissTransition()->isDismissEvent(&byOldId));
    QVERIFY(popup.dismissTransition()->isDismissEvent(&byNewId));
    QCOMPARE(popup.dismissEventIdentifier(), QString("dismissid/fuel_Dismiss"));
}

void tst_PopupDismissTransition::aSlotCanBeGivenTheName()
{
    PopupDismissTransition transition(nullptr);

    QVERIFY(QMetaObject::invokeMethod(&transition, "sourceNameChanged",
                                      Q_ARG(Identifier, Identifier("other"))));

    QCOMPARE(transition.dismissTargetSigniture(), QString("other_Dismiss"));
}

void tst_PopupDismissTransition::triggeringPostsTheDismissEvent()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("dismisstrigger/fuel", "FuelView");
    flow.start();
    flow.request("dismisstrigger/fuel");

    popup->dismissTransition()->trigger();
    QVERIFY(popup->isActive());

    settle();
    QVERIFY(!popup->isActive());
}

void tst_PopupDismissTransition::triggeringWithoutAMachineDoesNothing()
{
    PopupRootState root("dismisslone");
    PopupState popup("dismisslone/fuel", &root, 1);

    popup.dismissTransition()->trigger();
    settle();

    QVERIFY(!popup.isActive());
}

void tst_PopupDismissTransition::triggeringAPopupThatCannotBeDismissedMovesNothing()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("dismissnever/fuel", "FuelView");
    popup->turnOffNonDismissibleWarning();
    popup->dismissTransition()->setDismissTarget("");
    flow.start();
    flow.request("dismissnever/fuel");
    flow.take();

    popup->dismissTransition()->trigger();
    settle();

    QVERIFY(popup->isActive());
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupDismissTransition::aDismissalIsSignalled()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("dismisssignal/fuel", "FuelView");
    QSignalSpy dismissed(popup->dismissTransition(), &QAbstractTransition::triggered);
    QVERIFY(dismissed.isValid());
    flow.start();
    flow.request("dismisssignal/fuel");

    flow.request("FuelView_Dismiss");

    QCOMPARE(dismissed.size(), 1);
}

void tst_PopupDismissTransition::theDismissalOfAWaitingPopupIsNotSignalled()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("dismisswait/fuel", "FuelView");
    flow.popup("dismisswait/call", "CallView");
    QSignalSpy dismissed(popup->dismissTransition(), &QAbstractTransition::triggered);
    QVERIFY(dismissed.isValid());
    flow.start();
    flow.request("dismisswait/fuel");
    flow.request("dismisswait/call");

    flow.request("FuelView_Dismiss");

    QCOMPARE(dismissed.size(), 0);
    QVERIFY(flow.lower->wasDeactivated(popup));
}

void tst_PopupDismissTransition::theTransitionLeadsFromTheActivePopupToNoPopup()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("dismisslead/fuel", "FuelView");
    flow.start();

    flow.request("dismisslead/fuel");

    QCOMPARE(popup->dismissTransition()->sourceState(), popup);
    QCOMPARE(popup->dismissTransition()->targetState(), flow.lower->noPopupState());
}

void tst_PopupDismissTransition::theTransitionOfAWaitingPopupHangsOnTheRoot()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("dismisshang/fuel", "FuelView");
    flow.popup("dismisshang/call", "CallView");
    flow.start();
    flow.request("dismisshang/fuel");

    flow.request("dismisshang/call");

    QCOMPARE(popup->dismissTransition()->sourceState(), flow.lower);
    QCOMPARE(popup->dismissTransition()->targetState(), nullptr);
}

void tst_PopupDismissTransition::aPopupThatCannotBeDismissedIgnoresItsEvents()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("dismisscannot/fuel", "FuelView");
    popup->dismissTransition()->setDismissTarget("");
    flow.start();
    flow.request("dismisscannot/fuel");
    QCOMPARE(flow.takeMessages(),
             QStringList({"warning onEntry: You are entering a non dismissible popup state!! \n "
                          "State name:  \"dismisscannot/fuel\" \n Dismiss event identifier;  \"\" "
                          "\n Dismiss wildcard:  \"DismissAnyPopup\""}));

    flow.request("dismisscannot/fuel_Dismiss");

    QVERIFY(popup->isActive());
}

void tst_PopupDismissTransition::theWildcardHidesAPopupThatCannotBeDismissed()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("dismisswild/fuel", "FuelView");
    popup->dismissTransition()->setDismissTarget("");
    flow.start();
    flow.request("dismisswild/fuel");
    flow.takeMessages();
    flow.take();

    flow.request("DismissAnyPopup");

    // It stays in front, unseen.
    QCOMPARE(flow.take(), QStringList({"requestPopupHide FuelView true", "unstackPopup FuelView"}));
    QVERIFY(popup->isActive());
    QCOMPARE(PopupState::getActivePopupState(), popup);
}

QTEST_GUILESS_MAIN(tst_PopupDismissTransition)
#include "tst_popupdismisstransition.moc"
