#include "driving.h"
#include "emitter.h"
#include "librarytest.h"
#include "popupflow.h"
#include "popupsettings.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QTimer>
#include <QtTest>

using namespace HmiStateMachine;

Q_DECLARE_METATYPE(PopupState::InterruptionBehavior)

namespace {

// What the view layer is told of one of the popups below.
const QStringList fuelShown = {"requestPopupShow FuelView 3", "unstackPopup FuelView"};
const QStringList fuelComes = QStringList({"preparePopup FuelView false"}) + fuelShown;
const QStringList fuelGivesWay = {"requestPopupHide FuelView false", "unstackPopup FuelView"};
const QStringList fuelGoes = {"requestPopupHide FuelView true", "unstackPopup FuelView"};
const QStringList callShown = {"requestPopupShow CallView 4", "unstackPopup CallView"};
const QStringList callGivesWay = {"requestPopupHide CallView false", "unstackPopup CallView"};
const QStringList callGoes = {"requestPopupHide CallView true", "unstackPopup CallView"};
const QStringList warnShown = {"requestPopupShow WarnView 5", "unstackPopup WarnView"};
const QStringList warnGoes = {"requestPopupHide WarnView true", "unstackPopup WarnView"};
const QStringList prepareCall = {"preparePopup CallView false"};
const QStringList prepareWarn = {"preparePopup WarnView false"};

/** Three popups: two of the lower layer, one of the upper. */
struct ThreePopups : PopupFlow
{
    ThreePopups(MessageRecorder &messages, const QString &module)
        : PopupFlow(messages), fuel(popup(module + "/fuel", "FuelView", 3)),
          call(popup(module + "/call", "CallView", 4)),
          warn(upperPopup(module + "/warn", "WarnView", 5)), m_module(module)
    {
    }

    /** Requests the popups in turn, for instance {"fuel", "call_Dismiss"}; the journal is empty
     * afterwards. */
    void bringUp(const QStringList &names)
    {
        start();
        for (const QString &name : names) {
            ask(name);
        }
        take();
    }

    void ask(const QString &name) { request(m_module + "/" + name); }

    PopupState *const fuel;
    PopupState *const call;
    PopupState *const warn;

private:
    QString m_module;
};

} // namespace

class tst_PopupSequences : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void enteringBothLayersCallsNothing();
    void aRequestedPopupIsPreparedAndShown();
    void interruptingAPopupOfTheSameLayer_data();
    void interruptingAPopupOfTheSameLayer();
    void dismissingWhatInterruptedAPopupOfTheSameLayer_data();
    void dismissingWhatInterruptedAPopupOfTheSameLayer();
    void interruptingAPopupOfAnotherLayer_data();
    void interruptingAPopupOfAnotherLayer();
    void dismissingWhatInterruptedAPopupOfAnotherLayer_data();
    void dismissingWhatInterruptedAPopupOfAnotherLayer();
    void theInterruptedReturnLastOneFirst();
    void aPopupStackedByAnotherLayerIsUnstackedWhenItGoes();
    void dismissing_data();
    void dismissing();
    void anyPopupIsDismissedInEveryLayer();
    void aWaitingPopupIsDismissedBehindAnother_data();
    void aWaitingPopupIsDismissedBehindAnother();
    void aWaitingPopupIsRequestedAnew();
    void theCurrentPopupIsRequestedAnew();
    void timingOut();
    void timingOutBehindAnother();
    void aDriverRestrictionClosesThePopup();
    void resetThrowsAllPopupsOfTheLayerAway();
    void resetWithoutAPopupCallsNothing();
    void clearingDismissesTheOneInFront();
    void clearingWithoutAPopupCallsNothing();
    void removingThePopupInFrontResets();
    void removingAWaitingPopupCallsNothing();
    void leavingBothLayersHidesAll();
    void leavingALayeredStateHidesAll();
    void aDomainRefusesARequest();
    void aDomainHidesAndShowsThePopup();
    void aViewHidesAndShowsThePopup();
    void aViewRefusesNoRequest();
    void aBlockedPopupReturnsUnseen();
    void aProhibitedPopupReturnsAllTheSame();
    void aStackedPopupRefusesSilently();
    void aStackedPopupRefusesAReturnToo();
    void aRefusedPopupIsStoredAndReleased();
    void aStoredPopupIsDismissed();
    void aRefusedPopupThatIsNotStoredIgnoresItsDismissal();
    void aDismissingPopupOfTheSameLayer();
    void aDismissingPopupOfAnotherLayer();
};

void tst_PopupSequences::enteringBothLayersCallsNothing()
{
    ThreePopups flow(messages(), "seqnone");

    startIn(flow.machine, flow.work);

    QCOMPARE(flow.take(), QStringList());
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
    QCOMPARE(flow.upper->activePopupState(), flow.upper->noPopupState());
}

void tst_PopupSequences::aRequestedPopupIsPreparedAndShown()
{
    ThreePopups flow(messages(), "seqenter");
    flow.record(flow.fuel);
    flow.start();

    flow.request("seqenter/fuel", "low");

    QCOMPARE(flow.take(),
             QStringList({"preparePopup FuelView false", "FuelView aboutToBeActivated",
                          "requestPopupShow FuelView 3", "unstackPopup FuelView"}));
    QCOMPARE(flow.target.popupData("FuelView"), QVariantMap({{"eventData", "low"}}));
}

void tst_PopupSequences::interruptingAPopupOfTheSameLayer_data()
{
    QTest::addColumn<PopupState::InterruptionBehavior>("answer");
    QTest::addColumn<QStringList>("calls");

    QTest::newRow("Prohibit") << PopupState::Prohibit << QStringList();
    QTest::newRow("Allow") << PopupState::Allow << prepareCall + fuelGivesWay + callShown;
    QTest::newRow("AllowStack") << PopupState::AllowStack
                                << prepareCall + QStringList({"stackPopup FuelView CallView"})
            + callShown;
    QTest::newRow("AllowNoReturn")
        << PopupState::AllowNoReturn << fuelGoes + prepareCall + fuelGoes + callShown;
}

void tst_PopupSequences::interruptingAPopupOfTheSameLayer()
{
    QFETCH(PopupState::InterruptionBehavior, answer);
    QFETCH(QStringList, calls);
    ThreePopups flow(messages(), "seqsame");
    PopupFlow::rule("seqsame/fuel", answer, "seqsame/call");
    flow.bringUp({"fuel"});

    flow.ask("call");

    QCOMPARE(flow.take(), calls);
}

void tst_PopupSequences::dismissingWhatInterruptedAPopupOfTheSameLayer_data()
{
    QTest::addColumn<PopupState::InterruptionBehavior>("answer");
    QTest::addColumn<QStringList>("calls");

    QTest::newRow("Allow") << PopupState::Allow << callGoes + callGoes + fuelComes;
    QTest::newRow("AllowStack") << PopupState::AllowStack << callGoes + callGoes + fuelComes;
    QTest::newRow("AllowNoReturn") << PopupState::AllowNoReturn << callGoes + callGoes;
}

void tst_PopupSequences::dismissingWhatInterruptedAPopupOfTheSameLayer()
{
    QFETCH(PopupState::InterruptionBehavior, answer);
    QFETCH(QStringList, calls);
    ThreePopups flow(messages(), "seqsameback");
    PopupFlow::rule("seqsameback/fuel", answer, "seqsameback/call");
    flow.bringUp({"fuel", "call"});

    flow.ask("call_Dismiss");

    QCOMPARE(flow.take(), calls);
    QCOMPARE(flow.target.stackedPopups(), QList<QString>());
}

void tst_PopupSequences::interruptingAPopupOfAnotherLayer_data()
{
    QTest::addColumn<PopupState::InterruptionBehavior>("answer");
    QTest::addColumn<QStringList>("calls");

    QTest::newRow("Prohibit") << PopupState::Prohibit << QStringList();
    QTest::newRow("Allow") << PopupState::Allow << prepareWarn + warnShown;
    QTest::newRow("AllowStack") << PopupState::AllowStack
                                << QStringList({"stackPopup FuelView WarnView"}) + prepareWarn
            + warnShown;
    QTest::newRow("AllowNoReturn")
        << PopupState::AllowNoReturn << prepareWarn + warnShown + fuelGoes + fuelGoes;
}

void tst_PopupSequences::interruptingAPopupOfAnotherLayer()
{
    QFETCH(PopupState::InterruptionBehavior, answer);
    QFETCH(QStringList, calls);
    ThreePopups flow(messages(), "seqother");
    PopupFlow::rule("seqother/fuel", answer, "seqother/warn");
    flow.bringUp({"fuel"});

    flow.ask("warn");

    QCOMPARE(flow.take(), calls);
}

void tst_PopupSequences::dismissingWhatInterruptedAPopupOfAnotherLayer_data()
{
    QTest::addColumn<PopupState::InterruptionBehavior>("answer");
    QTest::addColumn<bool>("stays");

    QTest::newRow("Allow") << PopupState::Allow << true;
    QTest::newRow("AllowStack") << PopupState::AllowStack << true;
    QTest::newRow("AllowNoReturn") << PopupState::AllowNoReturn << false;
}

void tst_PopupSequences::dismissingWhatInterruptedAPopupOfAnotherLayer()
{
    QFETCH(PopupState::InterruptionBehavior, answer);
    QFETCH(bool, stays);
    ThreePopups flow(messages(), "seqotherback");
    PopupFlow::rule("seqotherback/fuel", answer, "seqotherback/warn");
    flow.bringUp({"fuel", "warn"});

    flow.ask("warn_Dismiss");

    QCOMPARE(flow.take(), warnGoes + warnGoes);
    QCOMPARE(flow.fuel->isActive(), stays);
}

void tst_PopupSequences::theInterruptedReturnLastOneFirst()
{
    ThreePopups flow(messages(), "seqorder");
    flow.popup("seqorder/mail", "MailView", 6);
    flow.bringUp({"fuel", "call", "mail"});

    flow.ask("mail_Dismiss");
    QCOMPARE(flow.take(),
             QStringList({"requestPopupHide MailView true", "unstackPopup MailView",
                          "requestPopupHide MailView true", "unstackPopup MailView",
                          "preparePopup CallView false", "requestPopupShow CallView 4",
                          "unstackPopup CallView"}));

    flow.ask("call_Dismiss");
    QCOMPARE(flow.take(), callGoes + callGoes + fuelComes);

    flow.ask("fuel_Dismiss");
    QCOMPARE(flow.take(), fuelGoes + fuelGoes);
}

void tst_PopupSequences::aPopupStackedByAnotherLayerIsUnstackedWhenItGoes()
{
    ThreePopups flow(messages(), "seqstacked");
    PopupFlow::rule("seqstacked/fuel", PopupState::AllowStack, "seqstacked/warn");
    flow.bringUp({"fuel", "warn"});
    QCOMPARE(flow.target.stackedPopups(), QList<QString>({"FuelView"}));

    flow.ask("fuel_Dismiss");

    QCOMPARE(flow.take(), fuelGoes + fuelGoes);
    QCOMPARE(flow.target.stackedPopups(), QList<QString>());
}

void tst_PopupSequences::dismissing_data()
{
    QTest::addColumn<QString>("target");
    QTest::addColumn<QStringList>("calls");

    QTest::newRow("by name") << "seqdismiss/fuel_Dismiss" << fuelGoes + fuelGoes;
    QTest::newRow("by view id") << "FuelView_Dismiss" << fuelGoes + fuelGoes;
    QTest::newRow("by the wildcard") << "DismissAnyPopup" << fuelGoes + fuelGoes;
    QTest::newRow("of another popup") << "seqdismiss/call_Dismiss" << QStringList();
    QTest::newRow("of another case") << "fuelview_Dismiss" << QStringList();
    QTest::newRow("of nothing") << "" << QStringList();
    QTest::newRow("of an empty name") << "_Dismiss" << QStringList();
}

void tst_PopupSequences::dismissing()
{
    QFETCH(QString, target);
    QFETCH(QStringList, calls);
    ThreePopups flow(messages(), "seqdismiss");
    flow.bringUp({"fuel"});

    flow.request(target);

    QCOMPARE(flow.take(), calls);
}

void tst_PopupSequences::anyPopupIsDismissedInEveryLayer()
{
    ThreePopups flow(messages(), "seqany");
    flow.bringUp({"fuel", "call", "warn"});

    flow.request("DismissAnyPopup");

    // The one in front takes the event, so the one behind it returns.
    QCOMPARE(flow.take(), callGoes + warnGoes + warnGoes + callGoes + fuelComes);
    QCOMPARE(flow.upper->activePopupState(), flow.upper->noPopupState());
}

void tst_PopupSequences::aWaitingPopupIsDismissedBehindAnother_data()
{
    QTest::addColumn<QString>("target");

    QTest::newRow("by name") << "seqwaiting/fuel_Dismiss";
    QTest::newRow("by view id") << "FuelView_Dismiss";
}

void tst_PopupSequences::aWaitingPopupIsDismissedBehindAnother()
{
    QFETCH(QString, target);
    ThreePopups flow(messages(), "seqwaiting");
    flow.bringUp({"fuel", "call"});

    flow.request(target);
    QCOMPARE(flow.take(), fuelGoes);
    QVERIFY(flow.call->isActive());

    flow.ask("call_Dismiss");
    QCOMPARE(flow.take(), callGoes + callGoes);
}

void tst_PopupSequences::aWaitingPopupIsRequestedAnew()
{
    ThreePopups flow(messages(), "seqanew");
    flow.bringUp({"fuel", "call"});

    flow.ask("fuel");
    QCOMPARE(flow.take(), QStringList({"preparePopup FuelView false"}) + callGivesWay + fuelShown);

    flow.ask("fuel_Dismiss");
    QCOMPARE(flow.take(), fuelGoes + fuelGoes + prepareCall + callShown);

    flow.ask("call_Dismiss");
    QCOMPARE(flow.take(), callGoes + callGoes);
}

void tst_PopupSequences::theCurrentPopupIsRequestedAnew()
{
    ThreePopups flow(messages(), "seqcurrent");
    flow.record(flow.fuel);
    flow.bringUp({"fuel"});

    flow.request("seqcurrent/fuel", "empty");

    QCOMPARE(flow.take(), QStringList({"updatePopupData FuelView", "FuelView alreadyActivated"}));
    QCOMPARE(flow.target.popupData("FuelView"), QVariantMap({{"eventData", "empty"}}));
}

void tst_PopupSequences::timingOut()
{
    ThreePopups flow(messages(), "seqtime");
    flow.fuel->setAutoDismissTimeoutActive(true);
    flow.record(flow.fuel);
    flow.bringUp({"fuel"});
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);

    QVERIFY(fire(flow.fuel->findChild<QTimer *>()));
    settle();

    QCOMPARE(flow.take(),
             QStringList({"FuelView popupShown", "requestPopupHide FuelView true",
                          "unstackPopup FuelView", "FuelView popupTimeOut",
                          "requestPopupHide FuelView true", "unstackPopup FuelView"}));
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
}

void tst_PopupSequences::timingOutBehindAnother()
{
    ThreePopups flow(messages(), "seqtimeback");
    flow.fuel->setAutoDismissTimeoutActive(true);
    flow.record(flow.fuel);
    flow.bringUp({"fuel"});
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);
    flow.ask("call");
    flow.take();

    QVERIFY(fire(flow.fuel->findChild<QTimer *>()));
    QCOMPARE(flow.take(), fuelGoes + QStringList({"FuelView popupTimeOut"}));
    QVERIFY(flow.call->isActive());

    flow.ask("call_Dismiss");
    QCOMPARE(flow.take(), callGoes + callGoes);
}

void tst_PopupSequences::aDriverRestrictionClosesThePopup()
{
    Emitter car;
    const DriverRestriction restriction(car);
    ThreePopups flow(messages(), "seqdriver");
    flow.record(flow.call);
    flow.call->setDriverRestricted(true);
    flow.bringUp({"fuel", "call"});

    car.setValue(2);
    QCOMPARE(flow.take(), QStringList());

    car.setValue(3);
    settle();
    QCOMPARE(flow.take(),
             QStringList({"CallView exitingDueToDriverRestrictions"}) + callGoes + callGoes
                 + callGoes + fuelComes);
}

void tst_PopupSequences::resetThrowsAllPopupsOfTheLayerAway()
{
    ThreePopups flow(messages(), "seqreset");
    flow.bringUp({"fuel", "warn", "call"});

    Q_EMIT flow.lower->reset();
    settle();

    QCOMPARE(flow.take(),
             QStringList({"requestPopupHide CallView false", "unstackPopup CallView",
                          "unstackPopup seqreset/fuel", "requestPopupHide seqreset/fuel true",
                          "unstackPopup seqreset/call", "requestPopupHide seqreset/call true",
                          "requestPopupHide CallView true"}));
    QVERIFY(flow.warn->isActive());
}

void tst_PopupSequences::resetWithoutAPopupCallsNothing()
{
    ThreePopups flow(messages(), "seqresetnone");
    flow.bringUp({"warn"});

    Q_EMIT flow.lower->reset();
    settle();

    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupSequences::clearingDismissesTheOneInFront()
{
    ThreePopups flow(messages(), "seqclear");
    flow.bringUp({"fuel", "call"});

    flow.lower->clearPopups();
    settle();

    QCOMPARE(flow.take(), callGoes + callGoes);
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
}

void tst_PopupSequences::clearingWithoutAPopupCallsNothing()
{
    ThreePopups flow(messages(), "seqclearnone");
    flow.bringUp({"warn"});

    flow.lower->clearPopups();
    settle();

    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupSequences::removingThePopupInFrontResets()
{
    ThreePopups flow(messages(), "seqremove");
    flow.bringUp({"fuel", "call"});

    flow.lower->removePopupState(flow.call);
    settle();

    QCOMPARE(flow.take(),
             QStringList({"requestPopupHide CallView false", "unstackPopup CallView",
                          "unstackPopup seqremove/fuel", "requestPopupHide seqremove/fuel true",
                          "unstackPopup seqremove/call", "requestPopupHide seqremove/call true",
                          "requestPopupHide CallView true"}));
    flow.ask("call");
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupSequences::removingAWaitingPopupCallsNothing()
{
    ThreePopups flow(messages(), "seqremoveback");
    flow.bringUp({"fuel", "call"});

    flow.lower->removePopupState(flow.fuel);
    settle();
    QCOMPARE(flow.take(), QStringList());

    flow.ask("call_Dismiss");
    QCOMPARE(flow.take(), callGoes + callGoes);
}

void tst_PopupSequences::leavingBothLayersHidesAll()
{
    ThreePopups flow(messages(), "seqleave");
    flow.bringUp({"fuel", "call", "warn"});

    flow.leave();
    QCOMPARE(
        flow.take(),
        QStringList({"requestPopupHide WarnView false", "unstackPopup WarnView",
                     "unstackPopup seqleave/warn", "requestPopupHide seqleave/warn true",
                     "requestPopupHide WarnView true", "requestPopupHide CallView false",
                     "unstackPopup CallView", "unstackPopup seqleave/fuel",
                     "requestPopupHide seqleave/fuel true", "unstackPopup seqleave/call",
                     "requestPopupHide seqleave/call true", "requestPopupHide CallView true"}));

    flow.comeBack();
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupSequences::leavingALayeredStateHidesAll()
{
    PopupFlow flow(messages());
    auto *layer = new HmiLayeredState("Layer", &flow.machine);
    layer->setInitialHmiState(new HmiViewState("Home", layer));
    new HmiViewState("Map", &flow.machine);
    (new PopupState("seqlayer/fuel", layer, 3))->setPopupViewId("FuelView");
    startIn(flow.machine, layer);
    flow.request("seqlayer/fuel");
    flow.take();

    flow.machine.postEvent(new HmiViewEvent("Map", QVariant()));
    settle();

    QCOMPARE(
        flow.take(),
        QStringList({"requestPopupHide FuelView false", "unstackPopup FuelView",
                     "unstackPopup seqlayer/fuel", "requestPopupHide seqlayer/fuel true",
                     "requestPopupHide FuelView true", "deactivateView Home", "activateView Map"}));
}

void tst_PopupSequences::aDomainRefusesARequest()
{
    PopupFlow flow(messages());
    PopupState *lane = flow.popup("seqdomain/lane", "SeqLaneView");
    flow.record(lane);
    flow.target.setDomains({{"driving", 2}});
    PopupFlow::load(R"([{"popup": "SeqLaneView", "domainBlacklist": ["driving"]}])");
    flow.start();
    flow.target.setActiveDomain(2);

    flow.request("seqdomain/lane");
    QCOMPARE(flow.take(), QStringList({"SeqLaneView blocked"}));

    flow.target.setActiveDomain(1);
    QCOMPARE(flow.take(), QStringList());
    flow.request("seqdomain/lane");
    QCOMPARE(flow.take(),
             QStringList({"preparePopup SeqLaneView false", "SeqLaneView aboutToBeActivated",
                          "requestPopupShow SeqLaneView 1", "unstackPopup SeqLaneView"}));
}

void tst_PopupSequences::aDomainHidesAndShowsThePopup()
{
    PopupFlow flow(messages());
    flow.popup("seqdomains/lane", "SeqDomainsView", 7);
    flow.target.setDomains({{"driving", 2}, {"parking", 3}});
    PopupFlow::load(R"([{"popup": "SeqDomainsView", "domainBlacklist": ["driving", "parking"]}])");
    flow.start();
    flow.request("seqdomains/lane");
    flow.take();

    flow.target.setActiveDomain(2);
    QCOMPARE(flow.take(),
             QStringList({"requestPopupHide SeqDomainsView false", "unstackPopup SeqDomainsView"}));
    flow.target.setActiveDomain(3);
    QCOMPARE(flow.take(), QStringList());

    flow.target.setActiveDomain(4);
    QCOMPARE(flow.take(),
             QStringList({"requestPopupShow SeqDomainsView 7", "unstackPopup SeqDomainsView"}));
    flow.target.setActiveDomain(5);
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupSequences::aViewHidesAndShowsThePopup()
{
    PopupFlow flow(messages());
    flow.popup("seqviews/lane", "SeqViewsView", 7);
    PopupFlow::load(R"([{"popup": "SeqViewsView", "viewBlacklist": ["Map", "Camera"]}])");
    flow.start();
    flow.request("seqviews/lane");
    flow.take();

    flow.target.setActiveView("Map");
    QCOMPARE(flow.take(),
             QStringList({"requestPopupHide SeqViewsView false", "unstackPopup SeqViewsView"}));
    flow.target.setActiveView("Camera");
    QCOMPARE(flow.take(), QStringList());

    flow.target.setActiveView("Home");
    QCOMPARE(flow.take(),
             QStringList({"requestPopupShow SeqViewsView 7", "unstackPopup SeqViewsView"}));
    flow.target.setActiveView("Radio");
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupSequences::aViewRefusesNoRequest()
{
    PopupFlow flow(messages());
    flow.popup("seqview/lane", "SeqViewView", 7);
    PopupFlow::load(R"([{"popup": "SeqViewView", "viewBlacklist": ["Map"]}])");
    flow.start();
    flow.target.setActiveView("Map");

    flow.request("seqview/lane");

    QCOMPARE(flow.take(),
             QStringList({"preparePopup SeqViewView false", "requestPopupShow SeqViewView 7",
                          "unstackPopup SeqViewView"}));
}

void tst_PopupSequences::aBlockedPopupReturnsUnseen()
{
    ThreePopups flow(messages(), "sequnseen");
    flow.fuel->setPopupViewId("SeqUnseenView");
    flow.target.setDomains({{"driving", 2}});
    PopupFlow::load(R"([{"popup": "SeqUnseenView", "domainBlacklist": ["driving"]}])");
    flow.bringUp({"fuel", "call"});
    flow.target.setActiveDomain(2);
    QCOMPARE(flow.take(), QStringList());

    flow.ask("call_Dismiss");
    QCOMPARE(flow.take(), callGoes + callGoes + QStringList({"preparePopup SeqUnseenView true"}));
    QVERIFY(flow.fuel->isActive());

    flow.target.setActiveDomain(1);
    QCOMPARE(flow.take(),
             QStringList({"requestPopupShow SeqUnseenView 3", "unstackPopup SeqUnseenView"}));
}

void tst_PopupSequences::aProhibitedPopupReturnsAllTheSame()
{
    ThreePopups flow(messages(), "seqprohibited");
    PopupFlow::rule("seqprohibited/warn", PopupState::Prohibit, "seqprohibited/fuel");
    flow.bringUp({"fuel", "call", "warn"});

    flow.ask("call_Dismiss");

    QCOMPARE(flow.take(),
             callGoes + callGoes + QStringList({"preparePopup FuelView true"}) + fuelShown);
}

void tst_PopupSequences::aStackedPopupRefusesSilently()
{
    ThreePopups flow(messages(), "seqsilent");
    flow.fuel->setPopupViewId("SeqSilentView");
    flow.record(flow.warn);
    PopupFlow::rule("seqsilent/fuel", PopupState::AllowStack, "seqsilent/call");
    PopupFlow::rule("SeqSilentView", PopupState::Prohibit, "WarnView");
    flow.bringUp({"fuel", "call"});
    messages().enableDebug();

    flow.ask("warn");
    QCOMPARE(flow.take(), QStringList());

    flow.ask("fuel_Dismiss");
    flow.take();
    flow.ask("warn");
    QCOMPARE(flow.take(),
             QStringList({"preparePopup WarnView false", "WarnView aboutToBeActivated",
                          "requestPopupShow WarnView 5", "unstackPopup WarnView"}));
}

void tst_PopupSequences::aStackedPopupRefusesAReturnToo()
{
    ThreePopups flow(messages(), "seqlost");
    flow.warn->setPopupViewId("SeqLostView");
    flow.upperPopup("seqlost/alarm", "AlarmView");
    PopupFlow::rule("seqlost/warn", PopupState::AllowStack, "seqlost/alarm");
    PopupFlow::rule("SeqLostView", PopupState::Prohibit, "FuelView");
    flow.bringUp({"fuel", "call", "warn", "alarm"});

    flow.ask("call_Dismiss");

    QCOMPARE(flow.take(), callGoes + callGoes);
    QCOMPARE(flow.lower->activePopupState(), flow.lower->noPopupState());
}

void tst_PopupSequences::aRefusedPopupIsStoredAndReleased()
{
    ThreePopups flow(messages(), "seqstored");
    const StoringBlocked storing;
    flow.record(flow.call);
    flow.record(flow.warn);
    PopupFlow::rule("seqstored/fuel", PopupState::Prohibit, "seqstored/call");
    PopupFlow::rule("seqstored/fuel", PopupState::Prohibit, "seqstored/warn");
    flow.bringUp({"fuel"});

    flow.ask("call");
    flow.ask("warn");
    flow.ask("call");
    QCOMPARE(flow.take(),
             QStringList({"CallView blocked", "WarnView blocked", "CallView blocked"}));

    PopupState::setStoreBlockedPopups(false);
    QCOMPARE(flow.take(), QStringList({"releaseBlockedPopups 2"}));
    PopupState::setStoreBlockedPopups(false);
    QCOMPARE(flow.take(), QStringList({"releaseBlockedPopups 0"}));
}

void tst_PopupSequences::aStoredPopupIsDismissed()
{
    ThreePopups flow(messages(), "seqstoreddismiss");
    const StoringBlocked storing;
    PopupFlow::rule("seqstoreddismiss/fuel", PopupState::Prohibit, "seqstoreddismiss/call");
    flow.bringUp({"fuel", "call"});

    flow.ask("call_Dismiss");
    QCOMPARE(flow.take(), callGoes);
    QVERIFY(flow.fuel->isActive());

    PopupState::setStoreBlockedPopups(false);
    QCOMPARE(flow.take(), QStringList({"releaseBlockedPopups 0"}));
}

void tst_PopupSequences::aRefusedPopupThatIsNotStoredIgnoresItsDismissal()
{
    ThreePopups flow(messages(), "seqnotstored");
    PopupFlow::rule("seqnotstored/fuel", PopupState::Prohibit, "seqnotstored/call");
    flow.bringUp({"fuel", "call"});

    flow.ask("call_Dismiss");

    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupSequences::aDismissingPopupOfTheSameLayer()
{
    ThreePopups flow(messages(), "seqregistered");
    flow.fuel->registerDismissingPopup(flow.call);
    flow.bringUp({"fuel"});

    flow.ask("call");
    QCOMPARE(flow.take(), prepareCall + fuelGoes + fuelGoes + callShown);

    flow.ask("call_Dismiss");
    QCOMPARE(flow.take(), callGoes + callGoes);
}

void tst_PopupSequences::aDismissingPopupOfAnotherLayer()
{
    ThreePopups flow(messages(), "seqregisteredother");
    flow.fuel->registerDismissingPopup(flow.warn);
    flow.bringUp({"fuel"});

    flow.ask("warn");

    QCOMPARE(flow.take(), prepareWarn + fuelGoes + warnShown + fuelGoes + fuelGoes);
}

QTEST_GUILESS_MAIN(tst_PopupSequences)
#include "tst_popupsequences.moc"
