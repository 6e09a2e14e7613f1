#include "driving.h"
#include "emitter.h"
#include "fallbackflow.h"
#include "librarytest.h"

#include <HmiStateMachine/hmi/hmiconditionalstate.h>
#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmipropertyboundfallbackviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** A screen that needs a connection, 1 in the property, in a flow that knows ways back. */
struct Online
{
    Online()
    {
        flow.home->setHandlesBackEvent(true);
        flow.fallback->setHandlesBackEvent(true);
        store->setHandlesBackEvent(true);
    }

    void back() { flow.post(new HmiBackEvent(1, QString())); }

    Emitter connection;
    FallbackFlow flow;
    HmiViewState *const store = flow.add(new HmiPropertyBoundFallbackViewState(
        "StoreView", "Store", "Fallback", &connection, "value", {1}, flow.machine, true));
};

} // namespace

/** Screens that give way to another one while they may not be shown. */
class tst_FallbackViews : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aScreenComesWhenItsConditionHolds();
    void theWayBackFromAFallbackLeadsPastTheScreen();
    void aScreenThatIsLostIsNotOnTheWayBack();
    void aScreenInLayersFallsBackBehindItsPopup();
    void aDecisionMayLeadToAForbiddenScreen();
};

void tst_FallbackViews::aScreenComesWhenItsConditionHolds()
{
    Online online;
    online.flow.start(online.flow.home);
    online.flow.request("Store");
    QVERIFY(online.flow.fallback->isActive());

    online.connection.setValue(1);
    settle();
    QVERIFY(online.flow.fallback->isActive());
    online.flow.take();
    online.flow.request("StoreView");

    QVERIFY(online.store->isActive());
    QCOMPARE(online.flow.take(),
             QStringList({"deactivateView Fallback", "activateView StoreView"}));
}

void tst_FallbackViews::theWayBackFromAFallbackLeadsPastTheScreen()
{
    Online online;
    online.flow.start(online.flow.home);
    online.flow.request("Store");
    online.flow.take();

    online.back();

    QVERIFY(online.flow.home->isActive());
    QCOMPARE(online.flow.take(),
             QStringList({"deactivateView Fallback", "postFollowOnBackEvent 1  Home",
                          "activateView Home"}));
}

void tst_FallbackViews::aScreenThatIsLostIsNotOnTheWayBack()
{
    Online online;
    online.connection.setValue(1);
    online.flow.start(online.flow.home);
    online.flow.request("Store");
    QVERIFY(online.store->isActive());

    online.connection.setValue(0);
    settle();
    QVERIFY(online.flow.fallback->isActive());
    online.back();

    QVERIFY(online.flow.home->isActive());
}

void tst_FallbackViews::aScreenInLayersFallsBackBehindItsPopup()
{
    FallbackFlow flow;
    Emitter connection;
    connection.setValue(1);
    const QScopedPointer<HmiLayeredState> layers(new HmiLayeredState("Layers", flow.machine));
    auto *offline = new HmiViewState("Offline", layers.data());
    auto *store = new HmiPropertyBoundFallbackViewState("Store", "Offline", &connection, "value",
                                                        {1}, layers.data(), true);
    layers->setInitialHmiState(store);
    auto *popup = new PopupState("fallback/fuel", layers.data(), 3);
    startIn(*flow.machine, layers.data());
    flow.post(new PopupEvent("fallback/fuel", QVariant()));
    QCOMPARE(messages().take().size(), 1);
    flow.take();

    connection.setValue(0);
    settle();

    QVERIFY(offline->isActive());
    QVERIFY(popup->isActive());
    QCOMPARE(flow.take(), QStringList({"deactivateView Store", "activateView Offline"}));
    park(*flow.machine);
}

void tst_FallbackViews::aDecisionMayLeadToAForbiddenScreen()
{
    Online online;
    const QScopedPointer<HmiConditionalState> decision(
        new HmiConditionalState("Decision", online.flow.machine));
    decision->setNamedTargetState("Store");
    online.flow.start(online.flow.home);

    online.flow.request("Decision");
    settle();

    QVERIFY(online.flow.fallback->isActive());
    QCOMPARE(
        online.flow.take(),
        QStringList({"deactivateView Home", "deactivateView StoreView", "activateView Fallback"}));
}

QTEST_GUILESS_MAIN(tst_FallbackViews)
#include "tst_fallbackviews.moc"
