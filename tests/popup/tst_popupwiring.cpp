#include "driving.h"
#include "librarytest.h"
#include "popupflow.h"

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/popup/domainblockedpopupstate.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popuptransition.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** Keeps what is written while it lives, by Qt too; each message still goes its way. */
class EveryMessage
{
public:
    EveryMessage() : m_next(qInstallMessageHandler(&EveryMessage::handle)) { s_instance = this; }
    ~EveryMessage() { qInstallMessageHandler(m_next); }

    /** The messages of Qt, and of whoever has no category. */
    QStringList notOfTheLibrary() const { return m_texts; }

private:
    Q_DISABLE_COPY(EveryMessage)

    static void handle(QtMsgType type, const QMessageLogContext &context, const QString &text)
    {
        const QByteArray category(context.category);
        if (category == "default" || category.startsWith("qt.")) {
            s_instance->m_texts.append(text);
        }
        s_instance->m_next(type, context, text);
    }

    static EveryMessage *s_instance;
    QtMessageHandler m_next;
    QStringList m_texts;
};

EveryMessage *EveryMessage::s_instance = nullptr;

QString nameOf(const QAbstractState *state)
{
    return state ? state->objectName() : QString("nothing");
}

QString placeOf(const QAbstractTransition *transition)
{
    return nameOf(transition->sourceState()) + " to " + nameOf(transition->targetState());
}

/** Where the transitions of the lower layer and of its popups hang, one line each. */
QStringList places(const PopupFlow &flow, const QList<PopupState *> &popups)
{
    const auto *request = flow.lower->findChild<PopupTransition *>();
    const auto *reset = flow.lower->findChild<HmiSignalTransition *>();
    QStringList result = {"request " + nameOf(request->sourceState()), "reset " + placeOf(reset)};
    for (const PopupState *popup : popups) {
        result.append("dismiss " + placeOf(popup->dismissTransition()));
    }
    return result;
}

// Requests are called by the popup, other steps by what they are.
void take(const QString &step, PopupFlow &flow)
{
    if (step == "reset") {
        Q_EMIT flow.lower->reset();
        settle();
    } else if (step == "clear") {
        flow.lower->clearPopups();
        settle();
    } else if (step == "leave") {
        flow.leave();
    } else if (step == "come back") {
        flow.comeBack();
    } else {
        flow.request(step);
    }
}

constexpr int open = 1;
constexpr int blocking = 2;

void blockInDomain(PopupFlow &flow, const QByteArray &viewId)
{
    flow.target.setDomains({{"blocking", blocking}});
    flow.target.setActiveDomain(open);
    PopupFlow::load("[{\"popup\": \"" + viewId
                    + "\", \"domainBlacklist\": [\"blocking\"], \"viewBlacklist\": [\"Map\"]}]");
}

} // namespace

class tst_PopupWiring : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void transitionsHangWhereTheStepsLeaveThem_data();
    void transitionsHangWhereTheStepsLeaveThem();
    void aPopupEnteredAgainFollowsOnce();
    void aPopupThatWaitsDoesNotFollow();
    void aRetriedPopupFollowsOnceWhileItIsShown();
    void popupsOfTwoLayersFollowInTheOrderOfTheirEntry();
    void aPopupThatWasLeftWhileTheViewLayerWasAwayFollowsNoMoreOnceItIsBack();
};

void tst_PopupWiring::transitionsHangWhereTheStepsLeaveThem_data()
{
    QTest::addColumn<QStringList>("steps");
    QTest::addColumn<QStringList>("expected");

    const QString noReset = "reset Lower to Lower_NONEPOPUP";
    const QString fuelWaits = "dismiss Lower to nothing";
    const QString fuelLeads = "dismiss wiring/fuel to Lower_NONEPOPUP";
    const QString callWaits = "dismiss Lower to nothing";
    const QString callLeads = "dismiss wiring/call to Lower_NONEPOPUP";
    const QStringList noneInFront = {"request Lower_NONEPOPUP", noReset, fuelWaits, callWaits};
    const QStringList fuelInFront = {"request wiring/fuel", "reset wiring/fuel to Lower_NONEPOPUP",
                                     fuelLeads, callWaits};
    const QStringList callInFront = {"request wiring/call", "reset wiring/call to Lower_NONEPOPUP",
                                     fuelWaits, callLeads};
    const QString neverEntered = "dismiss wiring/call to nothing";

    QTest::newRow("no request") << QStringList()
                                << QStringList({"request Lower_NONEPOPUP", noReset,
                                                "dismiss wiring/fuel to nothing", neverEntered});
    QTest::newRow("a request") << QStringList(
        "wiring/fuel") << QStringList({fuelInFront[0], fuelInFront[1], fuelLeads, neverEntered});
    QTest::newRow("an interruption") << QStringList({"wiring/fuel", "wiring/call"}) << callInFront;
    QTest::newRow("a dismissal") << QStringList({"wiring/fuel", "wiring/fuel_Dismiss"})
                                 << QStringList({noneInFront[0], noReset, fuelWaits, neverEntered});
    QTest::newRow("a return") << QStringList({"wiring/fuel", "wiring/call", "wiring/call_Dismiss"})
                              << fuelInFront;
    QTest::newRow("the dismissal of a returned one")
        << QStringList({"wiring/fuel", "wiring/call", "wiring/call_Dismiss", "wiring/fuel_Dismiss"})
        << noneInFront;
    QTest::newRow("the dismissal of a waiting one")
        << QStringList({"wiring/fuel", "wiring/call", "wiring/fuel_Dismiss"}) << callInFront;
    QTest::newRow("a dismissal of any, by which the other one returns")
        << QStringList({"wiring/fuel", "wiring/call", "DismissAnyPopup"}) << fuelInFront;
    QTest::newRow("the same request again")
        << QStringList({"wiring/fuel", "wiring/call", "wiring/call"}) << callInFront;
    QTest::newRow("a reset") << QStringList({"wiring/fuel", "wiring/call", "reset"}) << noneInFront;
    QTest::newRow("a request after a reset")
        << QStringList({"wiring/fuel", "wiring/call", "reset", "wiring/fuel"}) << fuelInFront;
    QTest::newRow("a clearance") << QStringList({"wiring/fuel", "wiring/call", "clear"})
                                 << noneInFront;
    QTest::newRow("the layer's exit and entry")
        << QStringList({"wiring/fuel", "wiring/call", "leave", "come back"}) << noneInFront;
}

void tst_PopupWiring::transitionsHangWhereTheStepsLeaveThem()
{
    QFETCH(QStringList, steps);
    QFETCH(QStringList, expected);
    const EveryMessage written;
    PopupFlow flow(messages());
    const QList<PopupState *> popups = {flow.popup("wiring/fuel", "FuelView"),
                                        flow.popup("wiring/call", "CallView")};
    flow.start();

    for (const QString &step : qAsConst(steps)) {
        take(step, flow);
    }

    QCOMPARE(places(flow, popups), expected);
    QCOMPARE(written.notOfTheLibrary(), QStringList());
}

void tst_PopupWiring::aPopupEnteredAgainFollowsOnce()
{
    PopupFlow flow(messages());
    flow.popup("wiringagain/fuel", "WiringAgainView");
    blockInDomain(flow, "WiringAgainView");
    flow.start();
    for (int count = 0; count < 3; ++count) {
        flow.request("wiringagain/fuel");
        flow.request("wiringagain/fuel_Dismiss");
    }
    flow.request("wiringagain/fuel");
    flow.take();

    flow.target.setActiveDomain(blocking);
    flow.target.setActiveDomain(open);
    flow.target.setActiveView("Map");
    flow.target.setActiveView("Home");

    const QStringList hidden = {"requestPopupHide WiringAgainView false",
                                "unstackPopup WiringAgainView"};
    const QStringList shown = {"requestPopupShow WiringAgainView 1",
                               "unstackPopup WiringAgainView"};
    QCOMPARE(flow.take(), hidden + shown + hidden + shown);
}

void tst_PopupWiring::aPopupThatWaitsDoesNotFollow()
{
    PopupFlow flow(messages());
    flow.popup("wiringwait/fuel", "WiringWaitView");
    flow.popup("wiringwait/call", "WiringOtherView");
    blockInDomain(flow, "WiringWaitView");
    flow.start();
    flow.request("wiringwait/fuel");
    flow.request("wiringwait/call");
    flow.take();

    flow.target.setActiveDomain(blocking);
    flow.target.setActiveDomain(open);
    flow.target.setActiveView("Map");
    flow.target.setActiveView("Home");

    QCOMPARE(flow.take(), QStringList());
}

// Its own slot, by which it waits, has the name of the one by which every popup follows.
void tst_PopupWiring::aRetriedPopupFollowsOnceWhileItIsShown()
{
    PopupFlow flow(messages());
    flow.target.repostBlockedPopups(&flow.machine);
    (new DomainBlockedPopupState("wiringretry/ad", flow.lower, 7))->setPopupViewId("WiringRetry");
    blockInDomain(flow, "WiringRetry");
    flow.start();
    flow.target.setActiveDomain(blocking);
    flow.request("wiringretry/ad");
    flow.target.setActiveDomain(open);
    settle();
    QCOMPARE(flow.take(),
             QStringList({"retryBlockedPopup wiringretry/ad", "preparePopup WiringRetry false",
                          "requestPopupShow WiringRetry 7", "unstackPopup WiringRetry"}));

    flow.target.setActiveDomain(blocking);
    flow.target.setActiveDomain(open);
    QCOMPARE(flow.take(),
             QStringList({"requestPopupHide WiringRetry false", "unstackPopup WiringRetry",
                          "requestPopupShow WiringRetry 7", "unstackPopup WiringRetry"}));

    flow.request("wiringretry/ad_Dismiss");
    flow.take();
    flow.target.setActiveDomain(blocking);
    flow.target.setActiveDomain(open);
    settle();
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupWiring::popupsOfTwoLayersFollowInTheOrderOfTheirEntry()
{
    PopupFlow flow(messages());
    flow.popup("wiringtwo/fuel", "WiringLower");
    flow.upperPopup("wiringtwo/call", "WiringUpper");
    blockInDomain(flow, "WiringLower");
    blockInDomain(flow, "WiringUpper");
    const QStringList lowerHidden = {"requestPopupHide WiringLower false",
                                     "unstackPopup WiringLower"};
    const QStringList upperHidden = {"requestPopupHide WiringUpper false",
                                     "unstackPopup WiringUpper"};
    flow.start();
    flow.request("wiringtwo/fuel");
    flow.request("wiringtwo/call");
    flow.take();

    flow.target.setActiveDomain(blocking);
    QCOMPARE(flow.take(), lowerHidden + upperHidden);
    flow.target.setActiveDomain(open);

    flow.request("wiringtwo/fuel_Dismiss");
    flow.request("wiringtwo/fuel");
    flow.take();
    flow.target.setActiveDomain(blocking);
    QCOMPARE(flow.take(), upperHidden + lowerHidden);
}

void tst_PopupWiring::aPopupThatWasLeftWhileTheViewLayerWasAwayFollowsNoMoreOnceItIsBack()
{
    PopupFlow flow(messages());
    flow.popup("wiringaway/fuel", "WiringAwayView");
    blockInDomain(flow, "WiringAwayView");
    flow.start();
    flow.request("wiringaway/fuel");
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;
    flow.request("wiringaway/fuel_Dismiss");
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = &flow.target;

    flow.request("wiringaway/fuel");
    flow.request("wiringaway/fuel_Dismiss");
    flow.take();
    flow.target.setActiveDomain(blocking);
    flow.target.setActiveView("Map");

    QCOMPARE(flow.take(), QStringList());
}

QTEST_GUILESS_MAIN(tst_PopupWiring)
#include "tst_popupwiring.moc"
