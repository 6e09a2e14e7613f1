#include "driving.h"
#include "librarytest.h"
#include "popupflow.h"
#include "popupsettings.h"

#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** A popup that looks after its refused requests itself, or not. */
class CarefulPopup : public PopupState
{
public:
    CarefulPopup(const QString &name, PopupRootState *root, Journal &journal)
        : PopupState(name, root, 1), m_journal(journal)
    {
    }

    bool handleDomainBlocked() override
    {
        m_journal.add("handleDomainBlocked");
        return handlesDomain;
    }

    bool handleInterruptionBlocked() override
    {
        m_journal.add("handleInterruptionBlocked");
        return handlesInterruption;
    }

    bool handlesDomain = false;
    bool handlesInterruption = false;

private:
    Journal &m_journal;
};

/** Deletes the popups that it is handed, and tells how many it still holds then. */
class DeletingTarget : public RecordingViewStateTarget
{
public:
    using RecordingViewStateTarget::RecordingViewStateTarget;

    void releaseBlockedPopups(const QMap<PopupState *, QTime> &blockedPopups) override
    {
        const auto popups = blockedPopups.keys();
        qDeleteAll(popups);
        heldAfterwards = blockedPopups.size();
    }

    int heldAfterwards = -1;
};

/** Keeps what it is handed. */
class KeepingTarget : public RecordingViewStateTarget
{
public:
    using RecordingViewStateTarget::RecordingViewStateTarget;

    void releaseBlockedPopups(const QMap<PopupState *, QTime> &blockedPopups) override
    {
        released = blockedPopups;
    }

    QMap<PopupState *, QTime> released;
};

} // namespace

class tst_PopupStateBlocking : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aPopupThatIsBlockedOnEntryIsEnteredUnseen();
    void aPopupBlockedOnEntryWithoutAViewLayerIsShown();
    void aPopupFollowsTheDomainOnlyWhileItIsActive();
    void aPopupFollowsTheDomainByTheSignalsValues_data();
    void aPopupFollowsTheDomainByTheSignalsValues();
    void aPopupFollowsTheViewByTheSignalsValues_data();
    void aPopupFollowsTheViewByTheSignalsValues();
    void nothingIsStoredUnlessAskedFor();
    void aRefusedPopupIsStoredWithTheTimeOfItsLastRefusal();
    void aStoredPopupsDismissTransitionHangsOnTheRoot();
    void aPopupIsAskedToLookAfterItselfAlsoWhileNothingIsStored_data();
    void aPopupIsAskedToLookAfterItselfAlsoWhileNothingIsStored();
    void aPopupThatLooksAfterItselfIsNotStored();
    void switchingStoringOffWithoutAViewLayerForgets();
    void aStoredPopupThatIsGivenUpIsForgotten();
    void aStoredPopupThatIsDeletedIsForgotten();
    void whoIsHandedStoredPopupsMayDeleteThem();
};

void tst_PopupStateBlocking::aPopupThatIsBlockedOnEntryIsEnteredUnseen()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("blockentry/fuel", "BlockEntryView", 3);
    flow.popup("blockentry/call", "CallView");
    flow.target.setDomains({{"driving", 2}});
    PopupFlow::load(R"([{"popup": "BlockEntryView", "domainBlacklist": ["driving"]}])");
    flow.start();
    flow.request("blockentry/fuel");
    flow.request("blockentry/call");
    flow.target.setActiveDomain(2);
    messages().enableDebug();
    flow.takeMessages();
    flow.take();

    flow.request("blockentry/call_Dismiss");

    QVERIFY(fuel->isActive());
    QCOMPARE(PopupState::getActivePopupState(), fuel);
    QCOMPARE(flow.takeMessages(),
             QStringList({"debug onEntry: Popup: \"BlockEntryView\" blocked by domain: 2"}));
    QCOMPARE(flow.take().last(), QString("preparePopup BlockEntryView true"));
}

void tst_PopupStateBlocking::aPopupBlockedOnEntryWithoutAViewLayerIsShown()
{
    PopupFlow flow(messages());
    PopupState *fuel = flow.popup("blocknoview/fuel", "BlockNoView");
    flow.target.setDomains({{"driving", 0}});
    PopupFlow::load(R"([{"popup": "BlockNoView", "domainBlacklist": ["driving"]}])");
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;
    flow.start();
    flow.takeMessages();

    flow.request("blocknoview/fuel");

    QVERIFY(fuel->isActive());
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupStateBlocking::aPopupFollowsTheDomainOnlyWhileItIsActive()
{
    PopupFlow flow(messages());
    flow.popup("blockactive/fuel", "BlockActiveView");
    flow.target.setDomains({{"driving", 2}});
    PopupFlow::load(R"([{"popup": "BlockActiveView", "domainBlacklist": ["driving"],
                         "viewBlacklist": ["Map"]}])");
    flow.start();
    flow.target.setActiveDomain(2);
    flow.target.setActiveDomain(1);
    flow.request("blockactive/fuel");
    flow.request("blockactive/fuel_Dismiss");
    flow.take();

    flow.target.setActiveDomain(2);
    flow.target.setActiveView("Map");
    flow.target.setActiveView("Home");

    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupStateBlocking::aPopupFollowsTheDomainByTheSignalsValues_data()
{
    QTest::addColumn<int>("newDomain");
    QTest::addColumn<int>("oldDomain");
    QTest::addColumn<QStringList>("calls");

    QTest::newRow("into a blocking one")
        << 2 << 1
        << QStringList({"requestPopupHide BlockDomainView true", "unstackPopup BlockDomainView"});
    QTest::newRow("out of a blocking one")
        << 1 << 2
        << QStringList({"requestPopupShow BlockDomainView 1", "unstackPopup BlockDomainView"});
    QTest::newRow("between blocking ones") << 2 << 3 << QStringList();
    QTest::newRow("between others") << 1 << 4 << QStringList();
    QTest::newRow("the same") << 2 << 2 << QStringList();
}

void tst_PopupStateBlocking::aPopupFollowsTheDomainByTheSignalsValues()
{
    QFETCH(int, newDomain);
    QFETCH(int, oldDomain);
    QFETCH(QStringList, calls);
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("blockdomain/fuel", "BlockDomainView");
    flow.target.setDomains({{"driving", 2}, {"parking", 3}});
    PopupFlow::load(R"([{"popup": "BlockDomainView", "domainBlacklist": ["driving", "parking"]}])");

    popup->activeDomainChanged(newDomain, oldDomain);

    QCOMPARE(flow.take(), calls);
}

void tst_PopupStateBlocking::aPopupFollowsTheViewByTheSignalsValues_data()
{
    QTest::addColumn<QString>("newView");
    QTest::addColumn<QString>("oldView");
    QTest::addColumn<QStringList>("calls");

    QTest::newRow("into a blocking one")
        << "Map"
        << "Home"
        << QStringList({"requestPopupHide BlockViewView true", "unstackPopup BlockViewView"});
    QTest::newRow("out of a blocking one")
        << "Home"
        << "Map" << QStringList({"requestPopupShow BlockViewView 1", "unstackPopup BlockViewView"});
    QTest::newRow("between blocking ones") << "Map"
                                           << "Camera" << QStringList();
    QTest::newRow("between others") << "Home"
                                    << "Radio" << QStringList();
}

void tst_PopupStateBlocking::aPopupFollowsTheViewByTheSignalsValues()
{
    QFETCH(QString, newView);
    QFETCH(QString, oldView);
    QFETCH(QStringList, calls);
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("blockview/fuel", "BlockViewView");
    PopupFlow::load(R"([{"popup": "BlockViewView", "viewBlacklist": ["Map", "Camera"]}])");

    popup->activeViewChanged(newView, oldView);

    QCOMPARE(flow.take(), calls);
}

void tst_PopupStateBlocking::nothingIsStoredUnlessAskedFor()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("blocknostore/fuel", "FuelView");

    PopupState::popupBlocked(popup);
    PopupState::setStoreBlockedPopups(false);

    QCOMPARE(flow.take(), QStringList({"releaseBlockedPopups 0"}));
    QCOMPARE(popup->dismissTransition()->sourceState(), popup);
}

void tst_PopupStateBlocking::aRefusedPopupIsStoredWithTheTimeOfItsLastRefusal()
{
    PopupFlow flow(messages());
    const StoringBlocked storing;
    KeepingTarget target(flow.journal);
    PopupState *fuel = flow.popup("blocktime/fuel", "FuelView");
    PopupState *call = flow.popup("blocktime/call", "CallView");

    PopupState::popupBlocked(fuel);
    PopupState::popupBlocked(call);
    const QTime before = QTime::currentTime();
    PopupState::popupBlocked(fuel);
    PopupState::setStoreBlockedPopups(false);

    QCOMPARE(target.released.size(), 2);
    QVERIFY(target.released.value(call).isValid());
    QVERIFY(target.released.value(fuel).isValid());
    // A day is not over while the test runs, unless it ends just now.
    const int elapsed = before.msecsTo(target.released.value(fuel));
    QVERIFY2(elapsed >= 0 || elapsed < -80000000, qPrintable(QString::number(elapsed)));
}

void tst_PopupStateBlocking::aStoredPopupsDismissTransitionHangsOnTheRoot()
{
    PopupFlow flow(messages());
    const StoringBlocked storing;
    PopupState *popup = flow.popup("blockhang/fuel", "FuelView");

    PopupState::popupBlocked(popup);

    QCOMPARE(popup->dismissTransition()->sourceState(), flow.lower);
    QCOMPARE(popup->dismissTransition()->targetState(), nullptr);
}

void tst_PopupStateBlocking::aPopupIsAskedToLookAfterItselfAlsoWhileNothingIsStored_data()
{
    QTest::addColumn<bool>("handlesDomain");
    QTest::addColumn<bool>("handlesInterruption");
    QTest::addColumn<QStringList>("asked");

    QTest::newRow("neither") << false << false
                             << QStringList({"handleDomainBlocked", "handleInterruptionBlocked"});
    QTest::newRow("domain") << true << false << QStringList({"handleDomainBlocked"});
    QTest::newRow("interruption") << false << true
                                  << QStringList(
                                         {"handleDomainBlocked", "handleInterruptionBlocked"});
}

void tst_PopupStateBlocking::aPopupIsAskedToLookAfterItselfAlsoWhileNothingIsStored()
{
    QFETCH(bool, handlesDomain);
    QFETCH(bool, handlesInterruption);
    QFETCH(QStringList, asked);
    PopupFlow flow(messages());
    CarefulPopup popup("blockasked/fuel", flow.lower, flow.journal);
    popup.handlesDomain = handlesDomain;
    popup.handlesInterruption = handlesInterruption;

    PopupState::popupBlocked(&popup);

    QCOMPARE(flow.take(), asked);
}

void tst_PopupStateBlocking::aPopupThatLooksAfterItselfIsNotStored()
{
    PopupFlow flow(messages());
    const StoringBlocked storing;
    CarefulPopup popup("blockcareful/fuel", flow.lower, flow.journal);
    popup.handlesInterruption = true;
    PopupState::popupBlocked(&popup);
    flow.take();

    PopupState::setStoreBlockedPopups(false);

    QCOMPARE(flow.take(), QStringList({"releaseBlockedPopups 0"}));
    QCOMPARE(popup.dismissTransition()->sourceState(), &popup);
}

void tst_PopupStateBlocking::switchingStoringOffWithoutAViewLayerForgets()
{
    PopupFlow flow(messages());
    const StoringBlocked storing;
    PopupState::popupBlocked(flow.popup("blockforget/fuel", "FuelView"));
    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;

    PopupState::setStoreBlockedPopups(false);

    ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = &flow.target;
    PopupState::setStoreBlockedPopups(false);
    QCOMPARE(flow.take(), QStringList({"releaseBlockedPopups 0"}));
}

void tst_PopupStateBlocking::aStoredPopupThatIsGivenUpIsForgotten()
{
    PopupFlow flow(messages());
    const StoringBlocked storing;
    PopupState *fuel = flow.popup("blockgivenup/fuel", "FuelView");
    PopupState *call = flow.popup("blockgivenup/call", "CallView");
    PopupState::popupBlocked(fuel);
    PopupState::popupBlocked(call);
    fuel->deactivate();
    flow.take();

    PopupState::setStoreBlockedPopups(false);

    QCOMPARE(flow.take(), QStringList({"releaseBlockedPopups 1"}));
}

void tst_PopupStateBlocking::aStoredPopupThatIsDeletedIsForgotten()
{
    PopupFlow flow(messages());
    const StoringBlocked storing;
    PopupState *popup = flow.popup("blockdeleted/fuel", "FuelView");
    flow.start();
    PopupState::popupBlocked(popup);

    delete popup;
    PopupState::setStoreBlockedPopups(false);

    QCOMPARE(flow.take(), QStringList({"releaseBlockedPopups 0"}));
    flow.request("blockdeleted/fuel");
    flow.request("FuelView_Dismiss");
    QCOMPARE(flow.take(), QStringList());
}

void tst_PopupStateBlocking::whoIsHandedStoredPopupsMayDeleteThem()
{
    PopupFlow flow(messages());
    const StoringBlocked storing;
    PopupState::popupBlocked(flow.popup("blockhanded/fuel", "FuelView"));
    PopupState::popupBlocked(flow.popup("blockhanded/call", "CallView"));
    Journal journal;
    DeletingTarget target(journal);

    PopupState::setStoreBlockedPopups(false);

    QCOMPARE(target.heldAfterwards, 2);
    QCOMPARE(PopupState::stateForTarget("blockhanded/fuel"), nullptr);
}

QTEST_GUILESS_MAIN(tst_PopupStateBlocking)
#include "tst_popupstateblocking.moc"
