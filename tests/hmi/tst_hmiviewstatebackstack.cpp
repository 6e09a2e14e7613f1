#include "driving.h"
#include "librarytest.h"
#include "viewflow.h"

#include <HmiStateMachine/hmi/hmimoduleblacklistfilter.h>
#include <HmiStateMachine/hmi/hmitargetblacklistfilter.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

using Filter = QSharedPointer<HmiTargetFilter>;

/** Gives in when it is asked for the thousandth time. */
struct ImpatientFilter : HmiTargetFilter
{
    bool isValid(const QString &target) const override
    {
        Q_UNUSED(target)
        return ++asked == 1000;
    }

    mutable int asked = 0;
};

} // namespace

/** How a view that is entered forwards finds its back target. */
class tst_HmiViewStateBackStack : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aForwardEntryLeadsBackToTheLastKnownView();
    void withoutALastKnownViewTheTargetStays();
    void anUnregisteredLastKnownViewIsNoTarget();
    void withoutBackHandlingNothingIsComputed();
    void theSameIdKeepsTheTarget_data();
    void theSameIdKeepsTheTarget();
    void theProvidersTargetComesFirst();
    void aProviderWithoutATargetIsPassedOver_data();
    void aProviderWithoutATargetIsPassedOver();
    void theProviderIsNotAskedWithoutALastKnownView();
    void theProviderLeavesATreatedEntryForLater();
    void theProviderKeepsTheBackStackEmpty();
    void anEntryTreatedAsBackTakesItsTargetFromTheBackStack_data();
    void anEntryTreatedAsBackTakesItsTargetFromTheBackStack();
    void treatingTheNextEntryAsBackIsUsedUpOnce();
    void treatingTheNextEntryAsBackMayBeWithdrawn();
    void treatingAsBackOutlivesEntriesThatDoNotNeedIt_data();
    void treatingAsBackOutlivesEntriesThatDoNotNeedIt();
    void anAcceptedLastKnownViewIsTheTarget();
    void aRefusedLastKnownViewHandsOnToItsOwnTarget();
    void theWalkUsesTheFiltersOfTheEnteredView();
    void theWalkFindsViewsByWhatTheyShow();
    void aCircleEndsAtTheFirstAcceptedView();
    void aCircleIsWalkedAsLongAsTheFiltersRefuse();
    void theEndOfTheWalkIsLogged();
    void anUnknownTargetOnTheWalkIsLogged();
    void aRefusedStateThatIsNoViewEndsTheWalk();
    void whenTheWalkFindsNothingTheBackStackIsPopped();
};

void tst_HmiViewStateBackStack::aForwardEntryLeadsBackToTheLastKnownView()
{
    ViewFlow flow;
    HmiViewState *radio = flow.backView("Radio");
    flow.start(flow.view("Home"));
    messages().enableDebug();

    flow.request("Radio");

    QCOMPARE(radio->backTarget(), QString("Home"));
    QCOMPARE(radio->entryReason(), 0);
    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView Radio"}));
    QCOMPARE(messages().take(),
             QStringList({"debug onEntry: \"Radio\" Setting back state: \"Home\"",
                          "debug onActivated: virtual void "
                          "HmiStateMachine::HmiViewState::onActivated() target name \"Radio\""}));
}

void tst_HmiViewStateBackStack::withoutALastKnownViewTheTargetStays()
{
    ViewFlow flow;
    HmiViewState *home = flow.backView("Home");
    home->pushBackStack("Map");
    messages().enableDebug();

    flow.start(home);

    QCOMPARE(home->backTarget(), QString());
    QCOMPARE(home->popBackStack(), QString("Map"));
    QCOMPARE(messages().take().first(),
             QString("debug onEntry: \"Home\" Setting back state: \"\""));
}

void tst_HmiViewStateBackStack::anUnregisteredLastKnownViewIsNoTarget()
{
    ViewFlow flow;
    HmiViewState *radio = flow.backView("Radio");
    HmiViewState::setLastKnownViewState("Nowhere");

    flow.start(radio);
    QCOMPARE(radio->backTarget(), QString());
    flow.back();

    QVERIFY(radio->isActive());
    QCOMPARE(flow.take(), QStringList());
}

void tst_HmiViewStateBackStack::withoutBackHandlingNothingIsComputed()
{
    ViewFlow flow;
    HmiViewState *home = flow.view("Home");
    home->pushBackStack("Map");
    flow.backView("Radio");
    flow.start(home);
    flow.request("Radio");
    flow.take();
    messages().enableDebug();

    flow.back(2, "Map");

    QCOMPARE(home->entryReason(), 1);
    QCOMPARE(flow.target.viewData("Home").value("entryReason"), QVariant(1));
    QCOMPARE(flow.take(), QStringList({"deactivateView Radio", "activateView Home"}));
    QCOMPARE(messages().take(),
             QStringList("debug onActivated: virtual void "
                         "HmiStateMachine::HmiViewState::onActivated() target name \"Home\""));
}

void tst_HmiViewStateBackStack::theSameIdKeepsTheTarget_data()
{
    QTest::addColumn<bool>("acrossSameId");
    QTest::addColumn<QString>("target");

    QTest::newRow("unless asked otherwise") << false << "Home";
    QTest::newRow("not across the same id") << true << "Media";
}

void tst_HmiViewStateBackStack::theSameIdKeepsTheTarget()
{
    QFETCH(bool, acrossSameId);
    ViewFlow flow;
    const HmiViewState *media = flow.view("Media");
    QVERIFY(media);
    HmiViewState *player = flow.backView("Player");
    player->setBackStackStateId("Media", acrossSameId);
    flow.view("List")->setBackStackStateId("Media", false);
    flow.start(flow.view("Home"));
    flow.request("Player");
    QCOMPARE(player->backTarget(), QString("Home"));

    flow.request("List");
    QCOMPARE(HmiViewState::lastKnownViewState(), QString("Media"));
    flow.request("Player");

    QTEST(player->backTarget(), "target");
}

void tst_HmiViewStateBackStack::theProvidersTargetComesFirst()
{
    ViewFlow flow;
    HmiViewState *player = flow.backView("Player");
    HmiViewState *list = flow.backView("List");
    list->setBackTargetProviderState(player);
    list->setTreatNextEntryAsBackTransition(true);
    flow.start(flow.view("Home"));
    flow.request("Player");

    flow.request("List");

    QCOMPARE(HmiViewState::lastKnownViewState(), QString("Player"));
    QCOMPARE(list->backTarget(), QString("Home"));
}

void tst_HmiViewStateBackStack::aProviderWithoutATargetIsPassedOver_data()
{
    QTest::addColumn<bool>("destroyed");

    QTest::newRow("that handles no back events") << false;
    QTest::newRow("that is destroyed") << true;
}

void tst_HmiViewStateBackStack::aProviderWithoutATargetIsPassedOver()
{
    QFETCH(bool, destroyed);
    ViewFlow flow;
    HmiViewState *provider = flow.view("Provider");
    HmiViewState *list = flow.backView("List");
    list->setBackTargetProviderState(provider);
    flow.start(flow.view("Home"));
    if (destroyed) {
        delete provider;
    }

    flow.request("List");
    QCOMPARE(list->backTarget(), QString("Home"));
    flow.request("Home");

    QCOMPARE(flow.take(),
             QStringList({"deactivateView Home", "activateView List", "List backStackPush Home",
                          "deactivateView List", "activateView Home"}));
}

void tst_HmiViewStateBackStack::theProviderIsNotAskedWithoutALastKnownView()
{
    ViewFlow flow;
    HmiViewState *player = flow.backView("Player");
    HmiViewState *list = flow.backView("List");
    list->setBackTargetProviderState(player);
    flow.start(flow.view("Home"));
    flow.request("Player");

    HmiViewState::setLastKnownViewState(QString());
    player->setHasBackStackPresence(false);
    flow.request("List");

    QCOMPARE(list->backTarget(), QString());
}

void tst_HmiViewStateBackStack::theProviderLeavesATreatedEntryForLater()
{
    ViewFlow flow;
    flow.view("Map");
    HmiViewState *player = flow.backView("Player");
    HmiViewState *list = flow.backView("List");
    list->setBackTargetProviderState(player);
    list->setTreatNextEntryAsBackTransition(true);
    flow.start(flow.view("Home"));
    flow.request("Player");
    flow.request("List");
    flow.request("Home");

    list->setBackTargetProviderState(nullptr);
    list->pushBackStack("Map");
    flow.request("List");

    QCOMPARE(list->backTarget(), QString("Map"));
}

void tst_HmiViewStateBackStack::theProviderKeepsTheBackStackEmpty()
{
    ViewFlow flow;
    HmiViewState *player = flow.backView("Player");
    flow.backView("List")->setBackTargetProviderState(player);
    flow.start(flow.view("Home"));
    flow.request("Player");
    flow.request("List");
    flow.take();

    flow.request("Home");

    QCOMPARE(flow.take(), QStringList({"deactivateView List", "activateView Home"}));
    QCOMPARE(HmiViewState::lastKnownViewState(), QString("List"));
}

void tst_HmiViewStateBackStack::anEntryTreatedAsBackTakesItsTargetFromTheBackStack_data()
{
    QTest::addColumn<QString>("pushed");
    QTest::addColumn<QString>("target");

    QTest::newRow("the top") << "Map"
                             << "Map";
    QTest::newRow("the last known view when it is empty") << ""
                                                          << "Home";
    QTest::newRow("nothing when the top is gone") << "Nowhere"
                                                  << "";
}

void tst_HmiViewStateBackStack::anEntryTreatedAsBackTakesItsTargetFromTheBackStack()
{
    QFETCH(QString, pushed);
    ViewFlow flow;
    flow.view("Map");
    HmiViewState *radio = flow.backView("Radio");
    radio->pushBackStack(pushed);
    radio->addBackTargetFilter(Filter(new HmiTargetBlacklistFilter("Home")));
    radio->setTreatNextEntryAsBackTransition(true);
    flow.start(flow.view("Home"));

    flow.request("Radio");

    QTEST(radio->backTarget(), "target");
    QCOMPARE(radio->entryReason(), 0);
    QCOMPARE(flow.take(),
             QStringList({"deactivateView Home", "Radio backStackPop", "activateView Radio"}));
}

void tst_HmiViewStateBackStack::treatingTheNextEntryAsBackIsUsedUpOnce()
{
    ViewFlow flow;
    flow.view("Map");
    HmiViewState *radio = flow.backView("Radio");
    radio->pushBackStack("Home");
    radio->pushBackStack("Map");
    radio->setTreatNextEntryAsBackTransition(true);
    flow.start(flow.view("Home"));
    flow.request("Radio");
    QCOMPARE(radio->backTarget(), QString("Map"));

    flow.request("Home");
    flow.request("Radio");

    QCOMPARE(radio->backTarget(), QString("Home"));
    QCOMPARE(radio->popBackStack(), QString("Map"));
}

void tst_HmiViewStateBackStack::treatingTheNextEntryAsBackMayBeWithdrawn()
{
    ViewFlow flow;
    flow.view("Map");
    HmiViewState *radio = flow.backView("Radio");
    radio->pushBackStack("Map");
    radio->setTreatNextEntryAsBackTransition(true);
    radio->setTreatNextEntryAsBackTransition(false);
    flow.start(flow.view("Home"));

    flow.request("Radio");

    QCOMPARE(radio->backTarget(), QString("Home"));
}

void tst_HmiViewStateBackStack::treatingAsBackOutlivesEntriesThatDoNotNeedIt_data()
{
    QTest::addColumn<QString>("lastKnown");
    QTest::addColumn<bool>("handlesBack");
    QTest::addColumn<bool>("byBackPress");

    QTest::newRow("with no last known view") << "" << true << false;
    QTest::newRow("of the same id") << "Radio" << true << false;
    QTest::newRow("without back handling") << "Home" << false << false;
    QTest::newRow("by a back press") << "Home" << true << true;
}

void tst_HmiViewStateBackStack::treatingAsBackOutlivesEntriesThatDoNotNeedIt()
{
    QFETCH(QString, lastKnown);
    QFETCH(bool, handlesBack);
    QFETCH(bool, byBackPress);
    ViewFlow flow;
    flow.view("Map");
    HmiViewState *home = flow.view("Home");
    HmiViewState *radio = flow.view("Radio");
    home->createDirectBackTransition(radio);
    home->setHasBackStackPresence(false);
    radio->setHandlesBackEvent(handlesBack);
    flow.start(home);
    HmiViewState::setLastKnownViewState(lastKnown);
    radio->setTreatNextEntryAsBackTransition(true);
    flow.post(byBackPress ? static_cast<QEvent *>(new HmiBackEvent(1, QString()))
                          : new HmiViewEvent("Radio", QVariant()));
    QVERIFY(radio->isActive());
    flow.request("Home");

    radio->setHandlesBackEvent(true);
    radio->pushBackStack("Map");
    HmiViewState::setLastKnownViewState("Home");
    flow.request("Radio");

    QCOMPARE(radio->backTarget(), QString("Map"));
}

void tst_HmiViewStateBackStack::anAcceptedLastKnownViewIsTheTarget()
{
    ViewFlow flow;
    HmiViewState *radio = flow.backView("Radio");
    radio->pushBackStack("Map");
    radio->addBackTargetFilter(Filter(new HmiTargetBlacklistFilter("Map")));
    flow.start(flow.view("Home"));

    flow.request("Radio");

    QCOMPARE(radio->backTarget(), QString("Home"));
    QCOMPARE(flow.take(), QStringList({"deactivateView Home", "activateView Radio"}));
}

void tst_HmiViewStateBackStack::aRefusedLastKnownViewHandsOnToItsOwnTarget()
{
    ViewFlow flow;
    flow.backView("MediaMain");
    flow.backView("MediaList");
    HmiViewState *radio = flow.backView("Radio");
    radio->addBackTargetFilter(Filter(new HmiModuleBlacklistFilter("Media")));
    flow.start(flow.view("Home"));
    flow.request("MediaMain");
    flow.request("MediaList");

    flow.request("Radio");

    QCOMPARE(radio->backTarget(), QString("Home"));
    QCOMPARE(radio->getValidBackTarget("MediaList"), QString("Home"));
}

void tst_HmiViewStateBackStack::theWalkUsesTheFiltersOfTheEnteredView()
{
    ViewFlow flow;
    HmiViewState *list = flow.backView("MediaList");
    HmiViewState *radio = flow.backView("Radio");
    radio->addBackTargetFilter(Filter(new HmiTargetBlacklistFilter("MediaList")));
    flow.start(flow.view("Home"));
    flow.request("MediaList");
    list->addBackTargetFilter(Filter(new HmiTargetBlacklistFilter("Home")));

    flow.request("Radio");

    QCOMPARE(radio->backTarget(), QString("Home"));
}

void tst_HmiViewStateBackStack::theWalkFindsViewsByWhatTheyShow()
{
    ViewFlow flow;
    flow.viewOf("PlayerScreen", "Player");
    HmiViewState *radio = flow.backView("Radio");
    radio->addBackTargetFilter(Filter(new HmiTargetBlacklistFilter("PlayerScreen")));
    flow.start(flow.view("Home"));
    flow.request("Player");

    QCOMPARE(radio->getValidBackTarget("PlayerScreen"), QString("Home"));
    QCOMPARE(radio->getValidBackTarget("Player"), QString("Player"));
}

void tst_HmiViewStateBackStack::aCircleEndsAtTheFirstAcceptedView()
{
    ViewFlow flow;
    HmiViewState *player = flow.backView("Player");
    HmiViewState *list = flow.backView("List");
    HmiViewState *radio = flow.backView("Radio");
    radio->addBackTargetFilter(Filter(new HmiTargetBlacklistFilter("Player")));
    flow.start(player);
    flow.request("List");
    flow.request("Player");
    QCOMPARE(player->backTarget(), QString("List"));
    QCOMPARE(list->backTarget(), QString("Player"));

    flow.request("Radio");

    QCOMPARE(radio->backTarget(), QString("List"));
}

void tst_HmiViewStateBackStack::aCircleIsWalkedAsLongAsTheFiltersRefuse()
{
    ViewFlow flow;
    HmiViewState *player = flow.backView("Player");
    flow.backView("List");
    HmiViewState *radio = flow.backView("Radio");
    const auto patience = QSharedPointer<ImpatientFilter>::create();
    radio->addBackTargetFilter(patience);
    flow.start(player);
    flow.request("List");
    flow.request("Player");

    flow.request("Radio");

    // Nothing but the filter ends the walk.
    QCOMPARE(patience->asked, 1000);
    QCOMPARE(radio->backTarget(), QString("List"));
}

void tst_HmiViewStateBackStack::theEndOfTheWalkIsLogged()
{
    HmiViewState home("Home");
    HmiViewState radio("Radio");
    radio.addBackTargetFilter(Filter(new HmiTargetBlacklistFilter("Home")));
    messages().enableDebug();

    QCOMPARE(radio.getValidBackTarget("Home"), QString());

    QCOMPARE(messages().take(),
             QStringList("debug getValidBackTarget: HmiStateMachine::Identifier "
                         "HmiStateMachine::HmiViewState::getValidBackTarget(const "
                         "HmiStateMachine::Identifier&) const Back stack end reached"));
}

void tst_HmiViewStateBackStack::anUnknownTargetOnTheWalkIsLogged()
{
    HmiViewState radio("Radio");
    radio.addBackTargetFilter(Filter(new HmiTargetBlacklistFilter("Nowhere")));
    messages().enableDebug();

    QCOMPARE(radio.getValidBackTarget("Nowhere"), QString());

    QCOMPARE(messages().take(),
             QStringList("debug getValidBackTarget: HmiStateMachine::Identifier "
                         "HmiStateMachine::HmiViewState::getValidBackTarget(const "
                         "HmiStateMachine::Identifier&) const Invalid back target type detected "
                         "\"Nowhere\""));
}

void tst_HmiViewStateBackStack::aRefusedStateThatIsNoViewEndsTheWalk()
{
    NamedState module("Module");
    HmiViewState radio("Radio");
    radio.addBackTargetFilter(Filter(new HmiTargetBlacklistFilter("Module")));
    messages().enableDebug();

    QCOMPARE(radio.getValidBackTarget("Module"), QString());

    const QStringList written = messages().take();
    QCOMPARE(written.size(), 1);
    QVERIFY(written.first().endsWith("Invalid back target type detected \"Module\""));
}

void tst_HmiViewStateBackStack::whenTheWalkFindsNothingTheBackStackIsPopped()
{
    ViewFlow flow;
    flow.view("Map");
    HmiViewState *radio = flow.backView("Radio");
    radio->addBackTargetFilter(Filter(new HmiTargetBlacklistFilter("Home")));
    radio->pushBackStack("Map");
    flow.start(flow.view("Home"));

    flow.request("Radio");

    QCOMPARE(radio->backTarget(), QString("Map"));
    QCOMPARE(flow.take(),
             QStringList({"deactivateView Home", "Radio backStackPop", "activateView Radio"}));
}

QTEST_GUILESS_MAIN(tst_HmiViewStateBackStack)
#include "tst_hmiviewstatebackstack.moc"
