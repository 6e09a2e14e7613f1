#include "driving.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmievent.h>

#include <QSignalSpy>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** A view with an activation of its own. */
class OwnActivation : public HmiViewState
{
public:
    using HmiViewState::HmiViewState;

    QStringList seen;

protected:
    void onActivated() override
    {
        seen.append(QString::number(entryReason()) + ' ' + activeViewState()->name());
    }
};

QVariantMap instanceData(const QVariant &eventData, int entryReason)
{
    return {{"eventData", eventData}, {"entryReason", entryReason}};
}

} // namespace

class tst_HmiViewStateActivation : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void entryActivatesTheTargetViewWithItsData();
    void eventDataIsStoredAlsoWhenThereIsNone();
    void exitDeactivatesTheTargetViewWithItsData();
    void ownInstanceDataIsHandedOver();
    void ownInstanceDataMayBeRemovedAgain();
    void reservedKeysAreWrittenOver();
    void activationIsLogged();
    void aSubclassMayReplaceTheActivation();
    void activationDataIsAProperty();
    void activationDataIsToldOnEveryActivation();
    void changedActivationDataIsToldWhileActive();
    void withoutAViewLayerTheMachineStillMoves();
};

void tst_HmiViewStateActivation::entryActivatesTheTargetViewWithItsData()
{
    ViewFlow flow;
    flow.viewOf("RadioScreen", "Radio");
    flow.start(flow.view("Home"));

    flow.request("Radio", 97.5);

    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView RadioScreen"}));
    QCOMPARE(flow.target.viewData("RadioScreen"), instanceData(97.5, 0));
}

void tst_HmiViewStateActivation::eventDataIsStoredAlsoWhenThereIsNone()
{
    ViewFlow flow;
    flow.view("Radio");
    HmiViewState *home = flow.view("Home");
    lead(HmiEvent::eventType(), home, NamedState::stateForName("Radio"));
    flow.start(home);
    QCOMPARE(flow.target.viewData("Home"), instanceData(QVariant(), 0));
    flow.request("Radio", "first");
    flow.request("Home");

    flow.post(new HmiEvent("Radio", "not for views"));

    const QVariantMap data = flow.target.viewData("Radio");
    QVERIFY(data.contains("eventData"));
    QVERIFY(!data.value("eventData").isValid());
}

void tst_HmiViewStateActivation::exitDeactivatesTheTargetViewWithItsData()
{
    ViewFlow flow;
    flow.viewOf("RadioScreen", "Radio");
    flow.start(flow.view("Home"));
    flow.request("Radio", 97.5);

    flow.request("Home");

    QCOMPARE(flow.target.viewData("RadioScreen"),
             QVariantMap({{"eventData", 97.5}, {"entryReason", 0}, {"exitReason", 0}}));
    QCOMPARE(flow.target.viewData("RadioScreen").value("exitReason").type(), QVariant::Int);
    QCOMPARE(flow.target.viewData("RadioScreen").value("entryReason").type(), QVariant::Int);
}

void tst_HmiViewStateActivation::ownInstanceDataIsHandedOver()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    home->addInstanceData("skin", "day");
    home->addInstanceData("skin", "night");
    home->addInstanceData("rows", 3);

    flow.start(home);

    QCOMPARE(flow.target.viewData("Home"),
             QVariantMap(
                 {{"eventData", QVariant()}, {"entryReason", 0}, {"skin", "night"}, {"rows", 3}}));
}

void tst_HmiViewStateActivation::ownInstanceDataMayBeRemovedAgain()
{
    ViewFlow flow;
    flow.view("Radio");
    HmiViewState *home = flow.view("Home");
    home->addInstanceData("skin", "night");
    flow.start(home);

    home->removeInstanceData("skin");
    home->removeInstanceData("unknown");
    flow.request("Radio");

    QCOMPARE(flow.target.viewData("Home"),
             QVariantMap({{"eventData", QVariant()}, {"entryReason", 0}, {"exitReason", 0}}));
}

void tst_HmiViewStateActivation::reservedKeysAreWrittenOver()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    home->addInstanceData("eventData", "own");
    home->addInstanceData("entryReason", 7);
    home->addInstanceData("exitReason", 8);

    flow.start(home);

    QCOMPARE(flow.target.viewData("Home"),
             QVariantMap({{"eventData", QVariant()}, {"entryReason", 0}, {"exitReason", 8}}));
}

void tst_HmiViewStateActivation::activationIsLogged()
{
    ViewFlow flow;
    flow.viewOf("RadioScreen", "Radio")->setHandlesBackEvent(false);
    flow.start(flow.view("Home"));
    messages().enableDebug();

    flow.request("Radio");

    QCOMPARE(messages().take(),
             QStringList("debug onActivated: virtual void "
                         "HmiStateMachine::HmiViewState::onActivated() target name "
                         "\"RadioScreen\""));
}

void tst_HmiViewStateActivation::aSubclassMayReplaceTheActivation()
{
    ViewFlow flow;
    auto *own = new OwnActivation("Own", &flow.machine);
    HmiViewState *home = flow.view("Home");
    home->createDirectBackTransition(own);
    flow.start(home);

    flow.back();

    QCOMPARE(own->seen, QStringList("1 Own"));
    QCOMPARE(flow.take(), QStringList("deactivateView Home"));
}

void tst_HmiViewStateActivation::activationDataIsAProperty()
{
    HmiViewState view("Radio");
    QSignalSpy changes(&view, &HmiViewState::activationDataChanged);
    QVERIFY(changes.isValid());

    QVERIFY(view.setProperty("activationData", 5));
    view.setActivationData(5);
    view.setActivationData("five");

    QCOMPARE(view.property("activationData"), QVariant("five"));
    QCOMPARE(changes.size(), 2);
    QCOMPARE(changes.at(0).first().value<QVariant>(), QVariant(5));
    QCOMPARE(changes.at(1).first().value<QVariant>(), QVariant("five"));
}

void tst_HmiViewStateActivation::activationDataIsToldOnEveryActivation()
{
    ViewFlow flow;
    connect(&flow.target, &ViewStateTarget::activeViewDataChanged, this,
            [&](const QVariant &data) { flow.journal.add("data " + data.toString()); });
    flow.view("Radio")->setActivationData("station");
    flow.start(flow.view("Home"));

    flow.request("Radio");
    flow.request("Home");

    QCOMPARE(flow.take(),
             QStringList({"deactivateView Home", "activateView Radio", "data station",
                          "deactivateView Radio", "activateView Home", "data "}));
}

void tst_HmiViewStateActivation::changedActivationDataIsToldWhileActive()
{
    ViewFlow flow;
    flow.view("Radio");
    HmiViewState *home = flow.view("Home");
    flow.start(home);
    connect(home, &HmiViewState::activationDataChanged, this,
            [&] { flow.journal.add("activationDataChanged"); });
    connect(&flow.target, &ViewStateTarget::activeViewDataChanged, this,
            [&](const QVariant &data) { flow.journal.add("data " + data.toString()); });

    home->setActivationData("one");
    home->setActivationData("one");
    QCOMPARE(flow.take(), QStringList({"activationDataChanged", "data one"}));

    flow.request("Radio");
    flow.take();
    home->setActivationData("two");
    QCOMPARE(flow.take(), QStringList("activationDataChanged"));
}

void tst_HmiViewStateActivation::withoutAViewLayerTheMachineStillMoves()
{
    ViewFlow flow;
    HmiViewState *home = flow.backView("Home");
    HmiViewState *radio = flow.backView("Radio");
    radio->setReportsQmlViewStatus(true);
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;
    messages().enableDebug();
    flow.start(home);

    flow.request("Radio");
    radio->setActivationData("data");
    QCOMPARE(ViewFlow::activeView(), QString("Radio"));
    flow.back();

    QCOMPARE(ViewFlow::activeView(), QString("Home"));
    QCOMPARE(home->entryReason(), 1);
    QCOMPARE(flow.take(), QStringList("Home backStackPop"));
    QCOMPARE(messages().take(),
             QStringList({"debug onEntry: \"Home\" Setting back state: \"\"",
                          "debug onEntry: \"Radio\" Setting back state: \"Home\"",
                          "debug onEntry: \"Home\" Setting back state: \"\""}));
}

QTEST_GUILESS_MAIN(tst_HmiViewStateActivation)
#include "tst_hmiviewstateactivation.moc"
