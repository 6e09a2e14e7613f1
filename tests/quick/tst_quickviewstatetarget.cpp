#include "driving.h"
#include "interruptions.h"
#include "librarytest.h"
#include "metadescription.h"
#include "popupsettings.h"
#include "quickflow.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/popup/domainblockedpopupstate.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QTimer>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

void rule(const QString &front, PopupState::InterruptionBehavior answer, const QString &requested)
{
    PopupInterruptionStore::instance()->insertInterruptionBehavior(answer, front, requested);
}

QTimer *tickOf(const QuickFlow &flow)
{
    return flow.target->findChild<QTimer *>(QString(), Qt::FindDirectChildrenOnly);
}

QTimer *timerOf(const PopupState *popup)
{
    return popup->findChild<QTimer *>(QString(), Qt::FindDirectChildrenOnly);
}

} // namespace

class tst_QuickViewStateTarget : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itsMetaObjectIsAsPublished();
    void itPublishesItselfAndWithdraws();
    void itLeavesAnotherInstancePublished();
    void theOneMadeLastIsPublished();
    void anotherViewLayerIsNotTakenForIt();
    void twoTargetsOneAfterTheOtherServeTheSameMachine();

    void withoutASceneAViewIsReportedAtOnce();
    void thePropertiesAreThoseOfTheNewViewWhenItIsAnnounced();
    void aViewThatIsShownAgainIsNotAnnouncedAsAChange();
    void theViewDataIsThatOfTheActivation();
    void activationDataFollowsTheActiveView();
    void domainsAreNumberedInTheirOrder();
    void theDomainIsWhatStandsBeforeTheFirstSlash_data();
    void theDomainIsWhatStandsBeforeTheFirstSlash();
    void domainsThatAreNamedLateNumberTheActiveOne();
    void anotherDomainTakesOverWithoutAView();
    void popupsAreOffOnScreensThatSaySo();

    void theBackTargetIsThatOfTheActiveView();
    void theBackTargetFollowsAChangeOfTheView();
    void backIsPossibleToAStateWithoutAName();
    void aDirectBackTargetCounts();
    void theBackTargetOfADummyIsSeenAfterItsEntry();
    void aDummyBorrowsTheBackTargetOfTheViewBefore();
    void backByDepthGoesOnByItself();
    void backToATargetGoesOnUntilItIsReached_data();
    void backToATargetGoesOnUntilItIsReached();
    void backTowardsNoViewEndsAfterOneStep();

    void withoutASceneAPopupIsReportedAtOnce();
    void aPopupIsDescribedByItsEntry();
    void aPopupOfAnotherLayerCoversWithoutHiding();
    void aPopupOfTheSameLayerStacks();
    void aCoveredPopupThatIsDismissedGoes();
    void aLayerThatIsLeftTakesItsStackedPopupsAlong();
    void newDataOfAPopupReplacesTheOld();
    void remainingTimesTickOnlyWhileATimeRuns();
    void aBlockedPopupIsRequestedAgain();
    void blockedPopupsAreReleasedInTheOrderOfTheirRefusal();
    void refusedPopupsComeBackWhenStoringEnds();
};

void tst_QuickViewStateTarget::itsMetaObjectIsAsPublished()
{
    QCOMPARE(metaDescription(QuickViewStateTarget::staticMetaObject),
             QStringList({"signal domainsChanged()",
                          "signal activeDomainNameChanged()",
                          "signal viewDataChanged()",
                          "signal activationDataChanged()",
                          "signal backTargetChanged()",
                          "signal popupsEnabledChanged()",
                          "signal transitioningChanged()",
                          "signal loadFailed(QString id, QUrl file, int line, QString text)",
                          "slot setActiveDomain(QString name)",
                          "property QStringList domains read write domainsChanged()",
                          "property QString activeDomainName read activeDomainNameChanged()",
                          "property QVariantMap viewData read viewDataChanged()",
                          "property QVariant activationData read activationDataChanged()",
                          "property QString backTarget read backTargetChanged()",
                          "property bool backPossible read backTargetChanged()",
                          "property bool popupsEnabled read popupsEnabledChanged()",
                          "property bool transitioning read transitioningChanged()",
                          "property HmiStateMachine::PopupListModel* shownPopups read",
                          "property HmiStateMachine::PopupListModel* stackedPopups read",
                          "property HmiStateMachine::Requests* requests read",
                          "enum ViewAnimation",
                          "enum PopupAnimation"}));
    QCOMPARE(QuickViewStateTarget::staticMetaObject.superClass(),
             &ViewStateTarget::staticMetaObject);
    QCOMPARE(int(QuickViewStateTarget::ForwardAnimation), 1);
    QCOMPARE(int(QuickViewStateTarget::BackAnimation), 2);
    QCOMPARE(int(QuickViewStateTarget::AppearAnimation), 1);
    QCOMPARE(int(QuickViewStateTarget::DisappearAnimation), 2);
}

void tst_QuickViewStateTarget::itPublishesItselfAndWithdraws()
{
    auto target = std::make_unique<QuickViewStateTarget>();

    QCOMPARE(ViewStateTarget::instance(), target.get());
    QCOMPARE(QuickViewStateTarget::published(), target.get());

    target.reset();
    QCOMPARE(ViewStateTarget::instance(), nullptr);
    QCOMPARE(QuickViewStateTarget::published(), nullptr);
}

void tst_QuickViewStateTarget::itLeavesAnotherInstancePublished()
{
    Journal journal;
    auto target = std::make_unique<QuickViewStateTarget>();
    RecordingViewStateTarget other(journal);

    target.reset();

    QCOMPARE(ViewStateTarget::instance(), &other);
}

void tst_QuickViewStateTarget::theOneMadeLastIsPublished()
{
    QuickViewStateTarget first;
    QuickViewStateTarget second;

    QCOMPARE(QuickViewStateTarget::published(), &second);
}

void tst_QuickViewStateTarget::anotherViewLayerIsNotTakenForIt()
{
    Journal journal;
    RecordingViewStateTarget other(journal);

    QCOMPARE(QuickViewStateTarget::published(), nullptr);
}

void tst_QuickViewStateTarget::twoTargetsOneAfterTheOtherServeTheSameMachine()
{
    for (int i = 0; i < 2; ++i) {
        QuickFlow flow(messages());
        flow.view("Radio");
        flow.start();

        flow.request("Radio");

        QCOMPARE(flow.take(),
                 QStringList({"viewAboutToBeActivated Home Radio", "activeViewChanged Radio Home",
                              "viewActivated Home Radio"}));
    }
}

void tst_QuickViewStateTarget::withoutASceneAViewIsReportedAtOnce()
{
    QuickFlow flow(messages());
    flow.target->setDomains({"Home", "Media"});
    flow.view("Media/Player");
    flow.screens->setInitialHmiState(flow.home);

    startIn(*flow.machine, flow.unit);
    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated none Home", "activeDomainChanged 0 -1",
                          "activeViewChanged Home none", "viewActivated none Home"}));

    flow.request("Media/Player");
    QCOMPARE(
        flow.take(),
        QStringList({"viewAboutToBeActivated Home Media/Player", "activeDomainChanged 1 0",
                     "activeViewChanged Media/Player Home", "viewActivated Home Media/Player"}));
    QCOMPARE(flow.target->isTransitioning(), false);
}

void tst_QuickViewStateTarget::thePropertiesAreThoseOfTheNewViewWhenItIsAnnounced()
{
    QuickFlow flow(messages());
    flow.view("Radio")->setActivationData("FM");
    flow.start();
    QStringList seen;
    connect(flow.target.get(), &ViewStateTarget::activeViewChanged, this, [&] {
        seen = QStringList{flow.target->activeView(), flow.target->activeDomainName(),
                           flow.target->viewData().value("eventData").toString(),
                           flow.target->activationData().toString(), flow.target->backTarget()};
    });

    flow.request("Radio", "94.7");

    QCOMPARE(seen, QStringList({"Radio", "Radio", "94.7", "FM", "Home"}));
}

void tst_QuickViewStateTarget::aViewThatIsShownAgainIsNotAnnouncedAsAChange()
{
    QuickFlow flow(messages());
    auto *again = new HmiViewState("Home", "HomeAgain", flow.screens);
    flow.start();

    flow.request(again->name());

    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Home Home", "viewActivated Home Home"}));
}

void tst_QuickViewStateTarget::theViewDataIsThatOfTheActivation()
{
    QuickFlow flow(messages());
    flow.view("Radio")->addInstanceData("band", "FM");
    flow.start();
    QSignalSpy spy(flow.target.get(), &QuickViewStateTarget::viewDataChanged);
    QVERIFY(spy.isValid());

    flow.request("Radio", "94.7");
    QCOMPARE(flow.target->viewData(),
             QVariantMap({{"eventData", "94.7"}, {"entryReason", 0}, {"band", "FM"}}));
    QCOMPARE(spy.size(), 1);

    flow.back();
    QCOMPARE(flow.target->viewData().value("entryReason"), QVariant(1));
    QCOMPARE(spy.size(), 2);
}

void tst_QuickViewStateTarget::activationDataFollowsTheActiveView()
{
    QuickFlow flow(messages());
    HmiViewState *radio = flow.view("Radio");
    flow.home->setActivationData("at home");
    radio->setActivationData("FM");
    flow.start();
    QSignalSpy spy(flow.target.get(), &QuickViewStateTarget::activationDataChanged);
    QVERIFY(spy.isValid());
    QCOMPARE(flow.target->activationData(), QVariant("at home"));

    flow.request("Radio");
    QCOMPARE(flow.target->activationData(), QVariant("FM"));
    QCOMPARE(spy.size(), 1);

    radio->setActivationData("AM");
    QCOMPARE(flow.target->activationData(), QVariant("AM"));
    QCOMPARE(spy.size(), 2);

    flow.home->setActivationData("not active");
    QCOMPARE(flow.target->activationData(), QVariant("AM"));
    QCOMPARE(spy.size(), 2);
}

void tst_QuickViewStateTarget::domainsAreNumberedInTheirOrder()
{
    QuickViewStateTarget target;
    QSignalSpy spy(&target, &QuickViewStateTarget::domainsChanged);
    QVERIFY(spy.isValid());

    target.setDomains({"Home", "Media"});
    target.setDomains({"Home", "Media"});

    QCOMPARE(spy.size(), 1);
    QCOMPARE(target.domains(), QStringList({"Home", "Media"}));
    QCOMPARE(target.domainFromName("Home"), 0);
    QCOMPARE(target.domainFromName("Media"), 1);
    QCOMPARE(target.domainFromName("media"), -1);
    QCOMPARE(target.activeDomain(), -1);
    QCOMPARE(target.activeDomainName(), QString());
}

void tst_QuickViewStateTarget::theDomainIsWhatStandsBeforeTheFirstSlash_data()
{
    QTest::addColumn<QString>("view");
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("number");

    QTest::newRow("no slash") << "Media"
                              << "Media" << 1;
    QTest::newRow("one slash") << "Media/Player"
                               << "Media" << 1;
    QTest::newRow("two slashes") << "Phone/Call/Details"
                                 << "Phone" << 2;
    QTest::newRow("a domain that nobody named") << "Seats/Heating"
                                                << "Seats" << -1;
}

void tst_QuickViewStateTarget::theDomainIsWhatStandsBeforeTheFirstSlash()
{
    QFETCH(QString, view);
    QuickFlow flow(messages());
    flow.target->setDomains({"Home", "Media", "Phone"});
    flow.view(view);
    flow.start();
    QSignalSpy spy(flow.target.get(), &QuickViewStateTarget::activeDomainNameChanged);
    QVERIFY(spy.isValid());

    flow.request(view);

    QTEST(flow.target->activeDomainName(), "name");
    QTEST(flow.target->activeDomain(), "number");
    QCOMPARE(spy.size(), 1);
}

void tst_QuickViewStateTarget::domainsThatAreNamedLateNumberTheActiveOne()
{
    QuickFlow flow(messages());
    flow.start();
    QCOMPARE(flow.target->activeDomain(), -1);

    flow.target->setDomains({"Media", "Home"});

    QCOMPARE(flow.target->activeDomain(), 1);
    QCOMPARE(flow.take(), QStringList({"activeDomainChanged 1 -1"}));
}

void tst_QuickViewStateTarget::anotherDomainTakesOverWithoutAView()
{
    QuickFlow flow(messages());
    flow.target->setDomains({"Home", "Media"});
    flow.start();

    flow.target->setActiveDomain("Media");
    flow.target->setActiveDomain("Media");
    QCOMPARE(flow.target->activeDomainName(), QString("Media"));

    flow.target->setActiveDomain("Seats");
    QCOMPARE(flow.target->activeDomainName(), QString("Seats"));
    QCOMPARE(flow.take(), QStringList({"activeDomainChanged 1 0", "activeDomainChanged -1 1"}));
    QCOMPARE(flow.target->activeView(), QString("Home"));
}

void tst_QuickViewStateTarget::popupsAreOffOnScreensThatSaySo()
{
    QuickFlow flow(messages());
    flow.view("Camera")->setPopupBehavior(HmiState::PopupBehaviorOff);
    flow.view("Radio")->setPopupBehavior(HmiState::PopupBehaviorOn);
    flow.start();
    QSignalSpy spy(flow.target.get(), &QuickViewStateTarget::popupsEnabledChanged);
    QVERIFY(spy.isValid());
    QCOMPARE(flow.target->popupsEnabled(), true);

    flow.request("Camera");
    QCOMPARE(flow.target->popupsEnabled(), false);

    flow.request("Radio");
    QCOMPARE(flow.target->popupsEnabled(), true);

    flow.request("Camera");
    flow.request("Home");
    QCOMPARE(flow.target->popupsEnabled(), true);
    QCOMPARE(spy.size(), 4);
}

void tst_QuickViewStateTarget::theBackTargetIsThatOfTheActiveView()
{
    QuickFlow flow(messages());
    flow.view("Radio");
    flow.start();
    QSignalSpy spy(flow.target.get(), &QuickViewStateTarget::backTargetChanged);
    QVERIFY(spy.isValid());
    QCOMPARE(flow.target->backTarget(), QString());
    QCOMPARE(flow.target->isBackPossible(), false);

    flow.request("Radio");
    QCOMPARE(flow.target->backTarget(), QString("Home"));
    QCOMPARE(flow.target->isBackPossible(), true);

    flow.back();
    QCOMPARE(flow.target->backTarget(), QString());
    QCOMPARE(flow.target->isBackPossible(), false);
    QCOMPARE(spy.size(), 2);
}

void tst_QuickViewStateTarget::theBackTargetFollowsAChangeOfTheView()
{
    QuickFlow flow(messages());
    HmiViewState *radio = flow.view("Radio");
    flow.start();
    flow.request("Radio");

    radio->setHandlesBackEvent(false);
    QCOMPARE(flow.target->isBackPossible(), false);

    flow.request("Home");
    QCOMPARE(flow.target->backTarget(), QString("Radio"));
    radio->setHandlesBackEvent(true);
    QCOMPARE(flow.target->backTarget(), QString("Radio"));
}

void tst_QuickViewStateTarget::backIsPossibleToAStateWithoutAName()
{
    QuickFlow flow(messages());
    HmiViewState *radio = flow.view("Radio");
    auto *nameless = new QState(flow.screens->exclusiveState());
    flow.start(radio);
    QCOMPARE(flow.target->isBackPossible(), false);

    radio->createDirectBackTransition(nameless);

    QCOMPARE(flow.target->backTarget(), QString());
    QCOMPARE(flow.target->isBackPossible(), true);
}

void tst_QuickViewStateTarget::aDirectBackTargetCounts()
{
    QuickFlow flow(messages());
    HmiViewState *radio = flow.view("Radio");
    flow.view("Map");
    flow.start();
    flow.request("Map");
    flow.request("Radio");

    radio->createDirectBackTransition(flow.home);
    QCOMPARE(flow.target->backTarget(), QString("Home"));
    QCOMPARE(flow.target->isBackPossible(), true);

    flow.back();
    QCOMPARE(flow.activeView(), QString("Home"));

    flow.request("Radio");
    QCOMPARE(flow.target->backTarget(), QString("Home"));
    radio->createDirectBackTransition(nullptr);
    QCOMPARE(flow.target->isBackPossible(), false);
}

void tst_QuickViewStateTarget::theBackTargetOfADummyIsSeenAfterItsEntry()
{
    QuickFlow flow(messages());
    auto *dummy = HmiViewState::createDummyViewState("Waiting", flow.screens, 0, false);
    dummy->setHandlesBackEvent(true);
    flow.view("Radio");
    flow.start();
    flow.request("Radio");
    flow.take();

    flow.request("Waiting");

    QCOMPARE(flow.activeView(), QString("Waiting"));
    QCOMPARE(flow.take(), QStringList());
    QCOMPARE(flow.target->activeView(), QString("Radio"));
    QCOMPARE(flow.target->backTarget(), QString("Radio"));
    flow.back();
    QCOMPARE(flow.activeView(), QString("Radio"));
}

void tst_QuickViewStateTarget::aDummyBorrowsTheBackTargetOfTheViewBefore()
{
    QuickFlow flow(messages());
    HmiViewState::createDummyViewState("Waiting", flow.screens, 0, false);
    flow.view("Radio");
    flow.start();
    flow.request("Radio");

    flow.request("Waiting");

    QCOMPARE(flow.activeView(), QString("Waiting"));
    QCOMPARE(flow.target->backTarget(), QString("Home"));
    flow.back();
    QCOMPARE(flow.activeView(), QString("Home"));
}

void tst_QuickViewStateTarget::backByDepthGoesOnByItself()
{
    QuickFlow flow(messages());
    flow.view("Radio");
    flow.view("Map");
    flow.start();
    flow.request("Radio");
    flow.request("Map");
    flow.take();

    flow.back(2);

    QCOMPARE(flow.take(),
             QStringList({"viewAboutToBeActivated Map Radio", "activeViewChanged Radio Map",
                          "viewActivated Map Radio", "viewAboutToBeActivated Radio Home",
                          "activeViewChanged Home Radio", "viewActivated Radio Home"}));
}

void tst_QuickViewStateTarget::backToATargetGoesOnUntilItIsReached_data()
{
    QTest::addColumn<QString>("target");

    QTest::newRow("named by its state") << "Start";
    QTest::newRow("named by the view that it shows") << "StartView";
}

void tst_QuickViewStateTarget::backToATargetGoesOnUntilItIsReached()
{
    QFETCH(QString, target);
    QuickFlow flow(messages());
    auto *begin = new HmiViewState("StartView", "Start", flow.screens);
    begin->setHandlesBackEvent(true);
    flow.view("Radio");
    flow.view("Map");
    flow.start(); // one further than the target
    flow.request("Start");
    flow.request("Radio");
    flow.request("Map");

    flow.back(1, target);

    QCOMPARE(flow.activeView(), QString("Start"));
}

void tst_QuickViewStateTarget::backTowardsNoViewEndsAfterOneStep()
{
    QuickFlow flow(messages());
    flow.view("Radio");
    flow.view("Map");
    flow.start();
    flow.request("Radio");
    flow.request("Map");

    flow.back(1, "Screens");

    QCOMPARE(flow.activeView(), QString("Radio"));
}

void tst_QuickViewStateTarget::withoutASceneAPopupIsReportedAtOnce()
{
    QuickFlow flow(messages());
    flow.popup("car/fuel", "FuelView");
    flow.start();

    flow.requestPopup("car/fuel");
    QCOMPARE(flow.take(), QStringList({"popupStatusChanged FuelView true"}));
    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList({"FuelView"}));

    flow.dismiss("car/fuel");
    QCOMPARE(flow.take(), QStringList({"popupStatusChanged FuelView false"}));
    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList());
}

void tst_QuickViewStateTarget::aPopupIsDescribedByItsEntry()
{
    QuickFlow flow(messages());
    PopupState *fuel = flow.overlayPopup("car/fuel", "FuelView", 4);
    fuel->setAutoDismissTimeoutActive(true);
    fuel->setAutoDismissTimeoutInterval(7000);
    flow.start();

    flow.requestPopup("car/fuel", "low");

    const PopupEntry entry = flow.target->shownPopups()->entry(0);
    QCOMPARE(entry.popupId, QString("FuelView"));
    QCOMPARE(entry.kind, 4);
    QCOMPARE(entry.data, QVariant(QVariantMap({{"eventData", "low"}})));
    QCOMPARE(entry.layer, QString("Overlay"));
    QCOMPARE(entry.totalTime, 7000);
    QVERIFY(entry.remainingTime > 6000 && entry.remainingTime < 7400);
    QCOMPARE(entry.covered, false);
}

void tst_QuickViewStateTarget::aPopupOfAnotherLayerCoversWithoutHiding()
{
    QuickFlow flow(messages());
    flow.popup("qvst1/fuel", "FuelView", 4);
    flow.overlayPopup("qvst1/call", "CallView");
    rule("qvst1/fuel", PopupState::AllowStack, "qvst1/call");
    flow.start();
    flow.requestPopup("qvst1/fuel", "low");

    flow.requestPopup("qvst1/call");
    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList({"FuelView (covered)", "CallView"}));
    QCOMPARE(popupsIn(flow.target->stackedPopupList()), QStringList({"FuelView (covered)"}));
    QCOMPARE(flow.target->stackedPopupList()->entry(0).kind, 4);
    QCOMPARE(flow.target->stackedPopupList()->entry(0).data,
             QVariant(QVariantMap({{"eventData", "low"}})));

    flow.dismiss("qvst1/call");
    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList({"FuelView"}));
    QCOMPARE(popupsIn(flow.target->stackedPopupList()), QStringList());
    QCOMPARE(flow.take(),
             QStringList({"popupStatusChanged FuelView true", "popupStatusChanged CallView true",
                          "popupStatusChanged CallView false"}));
}

void tst_QuickViewStateTarget::aPopupOfTheSameLayerStacks()
{
    QuickFlow flow(messages());
    flow.popup("qvst2/fuel", "FuelView");
    flow.popup("qvst2/call", "CallView");
    rule("qvst2/fuel", PopupState::AllowStack, "qvst2/call");
    flow.start();
    flow.requestPopup("qvst2/fuel", "low");

    flow.requestPopup("qvst2/call");
    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList({"FuelView (covered)", "CallView"}));
    QCOMPARE(popupsIn(flow.target->stackedPopupList()), QStringList({"FuelView (covered)"}));

    flow.dismiss("qvst2/call");
    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList({"FuelView"}));
    QCOMPARE(popupsIn(flow.target->stackedPopupList()), QStringList());
}

void tst_QuickViewStateTarget::aCoveredPopupThatIsDismissedGoes()
{
    QuickFlow flow(messages());
    flow.popup("qvst3/fuel", "FuelView");
    flow.popup("qvst3/call", "CallView");
    rule("qvst3/fuel", PopupState::AllowStack, "qvst3/call");
    flow.start();
    flow.requestPopup("qvst3/fuel");
    flow.requestPopup("qvst3/call");

    flow.dismiss("qvst3/fuel");

    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList({"CallView"}));
    QCOMPARE(popupsIn(flow.target->stackedPopupList()), QStringList());
}

void tst_QuickViewStateTarget::aLayerThatIsLeftTakesItsStackedPopupsAlong()
{
    QuickFlow flow(messages());
    flow.popup("qvst4/fuel", "FuelView");
    flow.popup("qvst4/call", "CallView");
    rule("qvst4/fuel", PopupState::AllowStack, "qvst4/call");
    flow.start();
    flow.requestPopup("qvst4/fuel");
    flow.requestPopup("qvst4/call");

    Q_EMIT flow.screens->popupState()->reset();
    settle();

    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList());
    QCOMPARE(popupsIn(flow.target->stackedPopupList()), QStringList());
}

void tst_QuickViewStateTarget::newDataOfAPopupReplacesTheOld()
{
    QuickFlow flow(messages());
    flow.popup("qvst5/fuel", "FuelView");
    flow.overlayPopup("qvst5/call", "CallView");
    rule("qvst5/fuel", PopupState::AllowStack, "qvst5/call");
    flow.start();
    flow.requestPopup("qvst5/fuel", "low");
    flow.requestPopup("qvst5/call");
    QSignalSpy shown(flow.target->shownPopups(), &QAbstractItemModel::dataChanged);
    QVERIFY(shown.isValid());

    flow.requestPopup("qvst5/fuel", "empty");

    const QVariant data = QVariantMap({{"eventData", "empty"}});
    QCOMPARE(flow.target->shownPopups()->entry(0).data, data);
    QCOMPARE(flow.target->stackedPopupList()->entry(0).data, data);
    QCOMPARE(shown.size(), 1);
    QCOMPARE(shown.first().at(2).value<QVector<int>>(),
             QVector<int>({PopupListModel::PopupDataRole}));
}

void tst_QuickViewStateTarget::remainingTimesTickOnlyWhileATimeRuns()
{
    QuickFlow flow(messages());
    PopupState *fuel = flow.popup("car/fuel", "FuelView");
    fuel->setAutoDismissTimeoutActive(true);
    flow.popup("car/oil", "OilView");
    flow.start();
    QVERIFY(!tickOf(flow)->isActive());

    flow.requestPopup("car/oil");
    QVERIFY(!tickOf(flow)->isActive());
    QCOMPARE(flow.target->shownPopups()->entry(0).remainingTime, 0);
    QCOMPARE(flow.target->shownPopups()->entry(0).totalTime, 0);

    flow.requestPopup("car/fuel");
    QVERIFY(tickOf(flow)->isActive());
    timerOf(fuel)->start(2000);
    QVERIFY(fire(tickOf(flow)));
    QVERIFY(flow.target->shownPopups()->entry(0).remainingTime <= 2100);

    QVERIFY(fire(timerOf(fuel)));
    settle();
    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList({"OilView"}));
    QVERIFY(!tickOf(flow)->isActive());
}

void tst_QuickViewStateTarget::aBlockedPopupIsRequestedAgain()
{
    QuickFlow flow(messages());
    flow.target->setDomains({"Home", "Media"});
    QVERIFY(loadInterruptions(*PopupInterruptionStore::instance(),
                              R"([{"popup": "FuelBlockedAtHome", "domainBlacklist": ["Home"]}])"));
    auto *fuel = new DomainBlockedPopupState("qvst6/fuel", flow.screens, 1);
    fuel->setPopupViewId("FuelBlockedAtHome");
    flow.view("Media");
    flow.start();
    flow.requestPopup("qvst6/fuel");
    QCOMPARE(flow.take(), QStringList());

    flow.request("Media");

    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList({"FuelBlockedAtHome"}));
}

void tst_QuickViewStateTarget::blockedPopupsAreReleasedInTheOrderOfTheirRefusal()
{
    QuickFlow flow(messages());
    PopupState *fuel = flow.popup("car/fuel", "FuelView");
    PopupState *call = flow.popup("phone/call", "CallView");
    PopupState *oil = flow.popup("car/oil", "OilView");
    PopupState *door = flow.popup("car/door", "DoorView");
    flow.start();
    const QTime now = QTime::currentTime();

    flow.target->releaseBlockedPopups({{fuel, now.addSecs(-10)},
                                       {call, now.addSecs(-20)},
                                       {oil, now.addSecs(-30)},
                                       {door, now.addSecs(-20)}});
    settle();

    QStringList shown = flow.take().filter("true");
    QCOMPARE(shown,
             QStringList({"popupStatusChanged OilView true", "popupStatusChanged DoorView true",
                          "popupStatusChanged CallView true", "popupStatusChanged FuelView true"}));
}

void tst_QuickViewStateTarget::refusedPopupsComeBackWhenStoringEnds()
{
    QuickFlow flow(messages());
    flow.popup("qvst7/fuel", "FuelView");
    flow.popup("qvst7/call", "CallView");
    rule("qvst7/call", PopupState::Prohibit, "qvst7/fuel");
    flow.start();
    {
        StoringBlocked storing;
        flow.requestPopup("qvst7/call");
        flow.requestPopup("qvst7/fuel");
        flow.dismiss("qvst7/call");
        QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList());
    }
    settle();

    QCOMPARE(popupsIn(flow.target->shownPopups()), QStringList({"FuelView"}));
}

QTEST_MAIN(tst_QuickViewStateTarget)
#include "tst_quickviewstatetarget.moc"
