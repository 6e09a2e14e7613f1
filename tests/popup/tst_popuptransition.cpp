#include "driving.h"
#include "librarytest.h"
#include "makeevent.h"
#include "metadescription.h"
#include "popupflow.h"

#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popuptransition.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** A popup that answers requests itself, and writes them to the journal. */
class AnsweringPopup : public PopupState
{
public:
    AnsweringPopup(const QString &name, PopupRootState *root, Journal &journal)
        : PopupState(name, root, 1), m_journal(journal)
    {
    }

    InterruptionBehavior interruption(PopupState *requested) const override
    {
        m_journal.add("asked about " + requested->name());
        return answer;
    }

    InterruptionBehavior answer = Prohibit;

private:
    Journal &m_journal;
};

PopupTransition *transitionOf(PopupRootState *root)
{
    return root->findChild<PopupTransition *>();
}

} // namespace

class tst_PopupTransition : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectAddsNothing();
    void itIsMadeWithoutASource();
    void nullIsNoTarget();
    void anotherEventRequestsNothing_data();
    void anotherEventRequestsNothing();
    void anUnknownNameRequestsNothing_data();
    void anUnknownNameRequestsNothing();
    void aPopupIsRequestedByItsNameNotByItsView();
    void theFirstPopupOfANameKeepsIt();
    void aRenamedPopupIsKnownByTheNameItWasAddedWith();
    void aRenamedPopupCanBeRemoved();
    void theTransitionMovesToTheActiveChild();
    void anActivePopupIsNotEnteredAgain();
    void aReactivationOfTheActivePopupBringsNewDataToo();
    void aRefusalIsWrittenAndSignalled();
    void aRefusalByTheDomainIsWrittenWithoutAPopup();
    void anAllowedReactivationIsPreparedAsAnOrdinaryRequest();
    void aPopupWithItsOwnBehaviourIsAsked();
    void aPopupIsNotAskedUnlessItHasItsOwnBehaviour();
    void thePopupEnteredLastRulesOverAllLayers();
    void anUnknownBehaviourLetsTheRequestProceed();
    void nothingIsBlockedWithoutAViewLayer();
    void stackedPopupsAreAskedByTheirViews();
    void popupsWorkWithoutAViewLayer();
};

void tst_PopupTransition::itsMetaObjectAddsNothing()
{
    QCOMPARE(metaDescription(PopupTransition::staticMetaObject), QStringList());
    QCOMPARE(PopupTransition::staticMetaObject.superClass(),
             &QAbstractTransition::staticMetaObject);
}

void tst_PopupTransition::itIsMadeWithoutASource()
{
    const PopupTransition transition;

    QCOMPARE(transition.sourceState(), nullptr);
    QCOMPARE(transition.targetState(), nullptr);
    QCOMPARE(transition.parent(), nullptr);
}

void tst_PopupTransition::nullIsNoTarget()
{
    PopupTransition transition;

    transition.addTarget(nullptr);
    transition.removeTarget(nullptr);

    QCOMPARE(transition.targetState(), nullptr);
}

void tst_PopupTransition::anotherEventRequestsNothing_data()
{
    QTest::addColumn<MakeEvent>("makeEvent");

    QTest::newRow("named event") << MakeEvent(
        [] { return static_cast<QEvent *>(new HmiEvent("transother/fuel", QVariant())); });
    QTest::newRow("view event") << MakeEvent(
        [] { return static_cast<QEvent *>(new HmiViewEvent("transother/fuel", QVariant())); });
    QTest::newRow("plain event") << MakeEvent([] { return new QEvent(QEvent::User); });
}

void tst_PopupTransition::anotherEventRequestsNothing()
{
    QFETCH(MakeEvent, makeEvent);
    PopupFlow flow(messages());
    flow.popup("transother/fuel", "FuelView");
    flow.start();

    flow.machine.postEvent(makeEvent());
    settle();

    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupTransition::anUnknownNameRequestsNothing_data()
{
    QTest::addColumn<QString>("name");

    QTest::newRow("unknown") << "transunknown/call";
    QTest::newRow("empty") << "";
    QTest::newRow("other case") << "transunknown/Fuel";
    QTest::newRow("no-popup state's suffix") << "_NONEPOPUP";
    QTest::newRow("root") << "Lower";
}

void tst_PopupTransition::anUnknownNameRequestsNothing()
{
    QFETCH(QString, name);
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("transunknown/fuel", "FuelView");
    flow.record(popup);
    messages().enableDebug();
    flow.start();
    messages().take();

    flow.request(name);

    QCOMPARE(flow.take(), QStringList());
    QCOMPARE(messages().take(), QStringList());
}

void tst_PopupTransition::aPopupIsRequestedByItsNameNotByItsView()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("transname/fuel", "FuelView");
    flow.start();

    flow.request("FuelView");
    QVERIFY(!popup->isActive());

    flow.request("transname/fuel");
    QVERIFY(popup->isActive());
}

void tst_PopupTransition::theFirstPopupOfANameKeepsIt()
{
    PopupFlow flow(messages());
    PopupState *first = flow.popup("transfirst/fuel", "FirstView");
    PopupState *second = flow.popup("transfirst/second", "SecondView");
    flow.lower->removePopupState(second);
    first->setName("transfirst/renamed");
    second->setName("transfirst/fuel");
    flow.lower->addPopupState(second);
    flow.start();

    flow.request("transfirst/fuel");

    QVERIFY(first->isActive());
    QVERIFY(!second->isActive());
}

void tst_PopupTransition::aRenamedPopupIsKnownByTheNameItWasAddedWith()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("transold/fuel", "FuelView");
    popup->setName("transnew/fuel");
    flow.start();

    flow.request("transnew/fuel");
    QVERIFY(!popup->isActive());

    flow.request("transold/fuel");
    QVERIFY(popup->isActive());
}

void tst_PopupTransition::aRenamedPopupCanBeRemoved()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("transgone/fuel", "FuelView");
    popup->setName("transgone/renamed");
    flow.lower->removePopupState(popup);
    delete popup;
    flow.start();

    flow.request("transgone/fuel");
    flow.request("transgone/renamed");

    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupTransition::theTransitionMovesToTheActiveChild()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("transmove/fuel", "FuelView");
    PopupTransition *transition = transitionOf(flow.lower);
    QCOMPARE(transition->sourceState(), flow.lower->noPopupState());
    flow.start();
    QCOMPARE(transition->sourceState(), flow.lower->noPopupState());

    flow.request("transmove/fuel");
    QCOMPARE(transition->sourceState(), popup);
    QCOMPARE(transition->targetState(), popup);

    flow.request("transmove/fuel_Dismiss");
    QCOMPARE(transition->sourceState(), flow.lower->noPopupState());
    QCOMPARE(transition->targetState(), popup);
}

void tst_PopupTransition::anActivePopupIsNotEnteredAgain()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("transagain/fuel", "FuelView");
    flow.record(popup);
    flow.start();
    flow.request("transagain/fuel", 1);
    flow.take();
    flow.takeMessages();
    QSignalSpy entered(popup, &QAbstractState::entered);
    QVERIFY(entered.isValid());
    messages().enableDebug();

    flow.request("transagain/fuel", 2);

    QCOMPARE(flow.take(), QStringList({"updatePopupData FuelView", "FuelView alreadyActivated"}));
    QCOMPARE(messages().take(),
             QStringList({"debug eventTest: Popup \"FuelView\" is already active"}));
    QCOMPARE(entered.size(), 0);
    QCOMPARE(flow.target.popupData("FuelView"), QVariantMap({{"eventData", 2}}));
}

void tst_PopupTransition::aReactivationOfTheActivePopupBringsNewDataToo()
{
    PopupFlow flow(messages());
    flow.popup("transreact/fuel", "FuelView");
    flow.start();
    flow.request("transreact/fuel", 1);
    flow.take();

    flow.requestAgain("transreact/fuel");

    QCOMPARE(flow.take(), QStringList({"updatePopupData FuelView"}));
    QCOMPARE(flow.target.popupData("FuelView"), QVariantMap({{"eventData", QVariant()}}));
}

void tst_PopupTransition::aRefusalIsWrittenAndSignalled()
{
    PopupFlow flow(messages());
    flow.popup("transrefuse/fuel", "FuelView");
    PopupState *call = flow.popup("transrefuse/call", "CallView");
    flow.record(call);
    PopupFlow::rule("transrefuse/fuel", PopupState::Prohibit, "transrefuse/call");
    flow.start();
    flow.request("transrefuse/fuel");
    flow.take();
    flow.takeMessages();
    messages().enableDebug();

    flow.request("transrefuse/call");

    QCOMPARE(flow.take(), QStringList({"CallView blocked"}));
    QCOMPARE(messages().take(),
             QStringList({"debug eventTest: Popup \"CallView\" blocked by \"FuelView\""}));
}

void tst_PopupTransition::aRefusalByTheDomainIsWrittenWithoutAPopup()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("transdomain/fuel", "TransDomainView");
    flow.record(popup);
    flow.target.setDomains({{"driving", 2}});
    PopupFlow::load(R"([{"popup": "TransDomainView", "domainBlacklist": ["driving"]}])");
    flow.start();
    flow.target.setActiveDomain(2);
    messages().enableDebug();

    flow.request("transdomain/fuel");

    QCOMPARE(flow.take(), QStringList({"TransDomainView blocked"}));
    QCOMPARE(messages().take(),
             QStringList({"debug eventTest: Popup \"TransDomainView\" blocked by \"Null popup\""}));
}

void tst_PopupTransition::anAllowedReactivationIsPreparedAsAnOrdinaryRequest()
{
    PopupFlow flow(messages());
    flow.popup("transordinary/fuel", "FuelView");
    flow.start();

    flow.requestAgain("transordinary/fuel");

    QCOMPARE(flow.take(),
             QStringList({"preparePopup FuelView false", "requestPopupShow FuelView 1",
                          "unstackPopup FuelView"}));
}

void tst_PopupTransition::aPopupWithItsOwnBehaviourIsAsked()
{
    PopupFlow flow(messages());
    auto *front = new AnsweringPopup("transown/fuel", flow.lower, flow.journal);
    front->setHasOwnInterruptionBehavior(true);
    PopupState *call = flow.popup("transown/call", "CallView");
    PopupFlow::rule("transown/fuel", PopupState::Allow, "transown/call");
    flow.start();
    flow.request("transown/fuel");
    flow.take();

    flow.request("transown/call");
    QCOMPARE(flow.take(), QStringList({"asked about transown/call"}));
    QVERIFY(front->isActive());

    front->answer = PopupState::AllowStack;
    flow.request("transown/call");
    QVERIFY(call->isActive());
    QCOMPARE(flow.take(),
             QStringList({"asked about transown/call", "preparePopup CallView false",
                          "stackPopup transown/fuel CallView", "requestPopupShow CallView 1",
                          "unstackPopup CallView"}));
}

void tst_PopupTransition::aPopupIsNotAskedUnlessItHasItsOwnBehaviour()
{
    PopupFlow flow(messages());
    auto *front = new AnsweringPopup("transnotown/fuel", flow.lower, flow.journal);
    QVERIFY(!front->hasOwnInterruptionBehavior());
    PopupState *call = flow.popup("transnotown/call", "CallView");
    flow.start();
    flow.request("transnotown/fuel");
    flow.take();

    flow.request("transnotown/call");

    QVERIFY(call->isActive());
    QVERIFY(!flow.take().contains("asked about transnotown/call"));
}

void tst_PopupTransition::thePopupEnteredLastRulesOverAllLayers()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("transfront/fuel", "FuelView");
    PopupState *call = flow.popup("transfront/call", "CallView");
    flow.upperPopup("transfront/warn", "WarnView");
    PopupFlow::rule("transfront/warn", PopupState::Prohibit, "transfront/call");
    flow.start();
    flow.request("transfront/fuel");
    flow.request("transfront/warn");

    flow.request("transfront/call");
    QVERIFY(fuel->isActive());

    flow.request("transfront/warn_Dismiss");
    flow.request("transfront/call");
    QVERIFY(call->isActive());
}

void tst_PopupTransition::anUnknownBehaviourLetsTheRequestProceed()
{
    PopupFlow flow(messages());
    flow.popup("transinvalid/fuel", "FuelView");
    PopupState *call = flow.popup("transinvalid/call", "CallView");
    PopupFlow::load(R"([{"popup": "transinvalid/fuel", "default": "Sometimes"}])");
    flow.start();
    flow.request("transinvalid/fuel");

    flow.request("transinvalid/call");

    QVERIFY(call->isActive());
    flow.request("transinvalid/call_Dismiss");
    QVERIFY(!call->isActive());
}

void tst_PopupTransition::nothingIsBlockedWithoutAViewLayer()
{
    PopupState popup("transnolayer/fuel", 1);
    const PopupTransition transition;

    QVERIFY(!transition.blockedByStacked(&popup));
}

void tst_PopupTransition::stackedPopupsAreAskedByTheirViews()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    PopupState popup("transstack/fuel", 1);
    popup.setPopupViewId("TransFuelView");
    const PopupTransition transition;
    PopupFlow::rule("TransStackedView", PopupState::Prohibit, "TransFuelView");
    PopupFlow::rule("TransOtherView", PopupState::Prohibit, "transstack/fuel");
    target.stackPopup("TransOtherView", "");
    QVERIFY(!transition.blockedByStacked(&popup));

    target.stackPopup("TransStackedView", "");
    QVERIFY(transition.blockedByStacked(&popup));

    target.unstackPopup("TransStackedView");
    QVERIFY(!transition.blockedByStacked(&popup));
}

void tst_PopupTransition::popupsWorkWithoutAViewLayer()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("transnoview/fuel", "FuelView");
    PopupState *call = flow.popup("transnoview/call", "CallView");
    PopupFlow::rule("transnoview/fuel", PopupState::AllowStack, "transnoview/call");
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;
    flow.start();

    flow.request("transnoview/fuel");
    flow.request("transnoview/fuel", 2);
    flow.request("transnoview/call");
    QVERIFY(call->isActive());

    flow.request("transnoview/call_Dismiss");
    QVERIFY(fuel->isActive());
    Q_EMIT flow.lower->reset();
    QVERIFY(!fuel->isActive());
    QCOMPARE(flow.take(), QStringList());
}

QTEST_GUILESS_MAIN(tst_PopupTransition)
#include "tst_popuptransition.moc"
