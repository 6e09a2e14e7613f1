#include "driving.h"
#include "interruptions.h"
#include "librarytest.h"
#include "metadescription.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/domainblockedpopupstate.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QSignalSpy>
#include <QStateMachine>
#include <QtTest>

#include <memory>

using namespace HmiStateMachine;

namespace {

constexpr int media = 1;
constexpr int navigation = 2;
constexpr int phone = 3;
constexpr int reversing = 4;

// "car/ad" may not be shown in three domains, and never instead of "car/alarm".
constexpr char rules[] = R"([
    {"popup": "AdView", "domainBlacklist": ["navigation", "phone", "reversing"]},
    {"popup": "NewsView", "domainBlacklist": ["navigation"]},
    {"popup": "car/alarm", "interruptions": [{"target": "car/ad", "behavior": "Prohibit"}]},
    {"popup": "AlarmView", "interruptions": [{"target": "AdView", "behavior": "Prohibit"}]}])";

// An advertisement that waits for its domain, beside ordinary popups.
struct Flow
{
    Flow()
    {
        target->setDomains(
            {{"navigation", navigation}, {"phone", phone}, {"reversing", reversing}});
        loaded = loadInterruptions(*PopupInterruptionStore::instance(), rules);
        layer->setInitialHmiState(new HmiViewState("Home", layer));
        ad->setPopupViewId("AdView");
        news->setPopupViewId("NewsView");
        alarm->setPopupViewId("AlarmView");
    }

    // The rules go with the store; the next function gets another one.
    ~Flow()
    {
        PopupState::setStoreBlockedPopups(false);
        delete PopupInterruptionStore::instance();
    }

    void startInDomain(int domain)
    {
        target->repostBlockedPopups(&machine);
        startIn(machine, layer);
        changeDomain(domain);
        journal.clear();
    }

    void changeDomain(int domain)
    {
        target->setActiveDomain(domain);
        settle();
    }

    void post(QEvent *event)
    {
        machine.postEvent(event);
        settle();
    }

    void request(const QString &name) { post(new PopupEvent(name, QVariant())); }

    QStringList take()
    {
        const QStringList lines = journal.lines();
        journal.clear();
        return lines;
    }

    Journal journal;
    std::unique_ptr<RecordingViewStateTarget> target{new RecordingViewStateTarget(journal)};
    bool loaded = false;
    QStateMachine machine;
    HmiLayeredState *layer = new HmiLayeredState("Layer", &machine);
    DomainBlockedPopupState *ad = new DomainBlockedPopupState("car/ad", layer, 7);
    PopupState *news = new PopupState("radio/news", layer, 8);
    PopupState *alarm = new PopupState("car/alarm", layer, 9);
};

const QStringList adIsRetried = {"retryBlockedPopup car/ad"};
const QStringList adIsRetriedAndShown = {"retryBlockedPopup car/ad", "preparePopup AdView false",
                                         "requestPopupShow AdView 7", "unstackPopup AdView"};

} // namespace

class tst_DomainBlockedPopupState : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void metaObject();
    void aRefusedRequestReturnsWithItsDomain();
    void domainsThatAllBlockChangeNothing();
    void aRetryIsMadeOnce();
    void aRetryIsLeftToTheApplication();
    void repeatedRefusalsAreRetriedOnce();
    void aRetriedPopupMayWaitAgain();
    void aShownPopupFollowsItsDomainWithoutARetry();
    void aRequestInAnOpenDomainDoesNotWait();
    void dismissalEndsTheWaiting_data();
    void dismissalEndsTheWaiting();
    void dismissingAnyPopupReachesTheOneInFrontAlone();
    void dismissingAnotherPopupGoesOnWaiting();
    void givingUpEndsTheWaiting();
    void aRefusalByARuleDoesNotWait();
    void aRefusalByAStackedPopupDoesNotWait();
    void aRefusalByRuleAndDomainWaits();
    void aRetryThatARuleRefusesDoesNotWait();
    void comingUpOtherwiseEndsTheWaiting();
    void aRequestForTheShownPopupEndsTheWaiting();
    void theWaitingMayBeEndedByHand();
    void aWaitingPopupIsNotStored();
    void aPopupRefusedByARuleIsStored();
    void whatItAnswersToARefusal();
    void withoutAViewLayerItDoesNotWait();
    void itsDestructionEndsTheWaiting();
    void theViewLayerMayGoBeforeIt();
    void everyConstructorConnectsIt_data();
    void everyConstructorConnectsIt();
    void aMissingRootIsAWarning_data();
    void aMissingRootIsAWarning();
};

void tst_DomainBlockedPopupState::metaObject()
{
    QCOMPARE(metaDescription(DomainBlockedPopupState::staticMetaObject),
             QStringList({"slot disconnectDomainMonitoring()",
                          "slot activeDomainChanged(int newDomain, int oldDomain)"}));
    QCOMPARE(DomainBlockedPopupState::staticMetaObject.superClass(), &PopupState::staticMetaObject);
}

void tst_DomainBlockedPopupState::aRefusedRequestReturnsWithItsDomain()
{
    Flow flow;
    QVERIFY(flow.loaded);
    QSignalSpy blocked(flow.ad, &PopupState::blocked);
    QVERIFY(blocked.isValid());
    flow.startInDomain(navigation);

    flow.request("car/ad");
    QCOMPARE(blocked.size(), 1);
    QVERIFY(!flow.ad->active());
    QCOMPARE(flow.take(), QStringList());
    flow.changeDomain(media);

    QVERIFY(flow.ad->active());
    QCOMPARE(blocked.size(), 1);
    QCOMPARE(flow.take(), adIsRetriedAndShown);
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::domainsThatAllBlockChangeNothing()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/ad");

    flow.changeDomain(phone);
    flow.changeDomain(reversing);
    flow.changeDomain(navigation);
    QCOMPARE(flow.take(), QStringList());
    flow.changeDomain(media);

    QCOMPARE(flow.take(), adIsRetriedAndShown);
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::aRetryIsMadeOnce()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.target->repostBlockedPopups(nullptr);
    flow.request("car/ad");

    flow.changeDomain(media);
    flow.changeDomain(phone);
    flow.changeDomain(media);

    QCOMPARE(flow.take(), adIsRetried);
}

void tst_DomainBlockedPopupState::aRetryIsLeftToTheApplication()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.target->repostBlockedPopups(nullptr);
    flow.request("car/ad");

    flow.changeDomain(media);

    QCOMPARE(flow.take(), adIsRetried);
    QVERIFY(!flow.ad->active());
}

void tst_DomainBlockedPopupState::repeatedRefusalsAreRetriedOnce()
{
    Flow flow;
    QSignalSpy blocked(flow.ad, &PopupState::blocked);
    QVERIFY(blocked.isValid());
    flow.startInDomain(navigation);

    flow.request("car/ad");
    flow.request("car/ad");
    flow.changeDomain(phone);
    flow.request("car/ad");
    QCOMPARE(blocked.size(), 3);
    flow.changeDomain(media);

    QCOMPARE(flow.take(), adIsRetriedAndShown);
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::aRetriedPopupMayWaitAgain()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.target->repostBlockedPopups(nullptr);
    flow.request("car/ad");
    flow.changeDomain(media);
    flow.changeDomain(phone);
    QCOMPARE(flow.take(), adIsRetried);

    flow.request("car/ad");
    flow.changeDomain(media);

    QCOMPARE(flow.take(), adIsRetried);
}

void tst_DomainBlockedPopupState::aShownPopupFollowsItsDomainWithoutARetry()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/ad");
    flow.changeDomain(media);
    flow.take();

    flow.changeDomain(phone);
    flow.changeDomain(media);

    QCOMPARE(flow.take(),
             QStringList({"requestPopupHide AdView false", "unstackPopup AdView",
                          "requestPopupShow AdView 7", "unstackPopup AdView"}));
    QCOMPARE(messages().take().size(), 2);
}

void tst_DomainBlockedPopupState::aRequestInAnOpenDomainDoesNotWait()
{
    Flow flow;
    flow.startInDomain(media);

    flow.request("car/ad");
    QCOMPARE(flow.take(),
             QStringList({"preparePopup AdView false", "requestPopupShow AdView 7",
                          "unstackPopup AdView"}));
    flow.request("car/ad_Dismiss");
    flow.take();
    flow.changeDomain(phone);
    flow.changeDomain(media);

    QCOMPARE(flow.take(), QStringList());
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::dismissalEndsTheWaiting_data()
{
    QTest::addColumn<QString>("identifier");

    QTest::newRow("by its name") << "car/ad_Dismiss";
    QTest::newRow("by its view") << "AdView_Dismiss";
}

void tst_DomainBlockedPopupState::dismissalEndsTheWaiting()
{
    QFETCH(QString, identifier);
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/ad");

    flow.request(identifier);
    QCOMPARE(flow.take(), QStringList({"requestPopupHide AdView true", "unstackPopup AdView"}));
    flow.changeDomain(media);

    QCOMPARE(flow.take(), QStringList());
    QVERIFY(!flow.ad->active());
}

void tst_DomainBlockedPopupState::dismissingAnyPopupReachesTheOneInFrontAlone()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/ad");

    // The child of the root that is active takes the event; the waiting popup's hangs on the root.
    flow.request("DismissAnyPopup");
    QCOMPARE(flow.take(), QStringList());
    flow.changeDomain(media);

    QCOMPARE(flow.take(), adIsRetriedAndShown);
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::dismissingAnotherPopupGoesOnWaiting()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/ad");

    flow.request("radio/news_Dismiss");
    flow.request("car/ad_Dismissed");
    flow.take();
    flow.changeDomain(media);

    QCOMPARE(flow.take(), adIsRetriedAndShown);
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::givingUpEndsTheWaiting()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/ad");

    flow.ad->deactivate();
    QCOMPARE(flow.take(), QStringList({"requestPopupHide AdView true", "unstackPopup AdView"}));
    flow.changeDomain(media);

    QCOMPARE(flow.take(), QStringList());
}

void tst_DomainBlockedPopupState::aRefusalByARuleDoesNotWait()
{
    Flow flow;
    QSignalSpy blocked(flow.ad, &PopupState::blocked);
    QVERIFY(blocked.isValid());
    flow.startInDomain(media);
    flow.request("car/alarm");
    flow.take();

    flow.request("car/ad");
    QCOMPARE(blocked.size(), 1);
    flow.changeDomain(navigation);
    flow.changeDomain(media);

    QCOMPARE(flow.take(), QStringList());
    QVERIFY(flow.alarm->active());
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::aRefusalByAStackedPopupDoesNotWait()
{
    Flow flow;
    QSignalSpy blocked(flow.ad, &PopupState::blocked);
    QVERIFY(blocked.isValid());
    flow.startInDomain(media);
    flow.target->stackPopup("AlarmView", "NewsView");
    flow.take();

    flow.request("car/ad");
    flow.changeDomain(navigation);
    flow.changeDomain(media);

    QCOMPARE(flow.take(), QStringList());
    QCOMPARE(blocked.size(), 0);
    QVERIFY(!flow.ad->active());
}

void tst_DomainBlockedPopupState::aRefusalByRuleAndDomainWaits()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/alarm");
    flow.take();

    flow.request("car/ad");
    flow.target->repostBlockedPopups(nullptr);
    flow.changeDomain(media);

    QCOMPARE(flow.take(), adIsRetried);
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::aRetryThatARuleRefusesDoesNotWait()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/ad");
    flow.request("car/alarm");
    flow.take();

    flow.changeDomain(media);
    QCOMPARE(flow.take(), adIsRetried);
    QVERIFY(!flow.ad->active());
    flow.changeDomain(phone);
    flow.changeDomain(media);

    QCOMPARE(flow.take(), QStringList());
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::comingUpOtherwiseEndsTheWaiting()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/ad");

    // A popup that returns is not refused; its domain keeps it hidden.
    flow.post(new PopupEvent("car/ad", true, QVariant()));
    QVERIFY(flow.ad->active());
    QCOMPARE(flow.take(), QStringList("preparePopup AdView true"));
    flow.changeDomain(media);

    QCOMPARE(flow.take(), QStringList({"requestPopupShow AdView 7", "unstackPopup AdView"}));
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::aRequestForTheShownPopupEndsTheWaiting()
{
    Flow flow;
    flow.startInDomain(media);
    flow.request("car/ad");
    flow.changeDomain(navigation);
    QVERIFY(flow.ad->handleDomainBlocked());
    flow.take();

    flow.request("car/ad");
    QCOMPARE(flow.take(), QStringList("updatePopupData AdView"));
    flow.changeDomain(media);

    QCOMPARE(flow.take(), QStringList({"requestPopupShow AdView 7", "unstackPopup AdView"}));
    QCOMPARE(messages().take().size(), 2);
}

void tst_DomainBlockedPopupState::theWaitingMayBeEndedByHand()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/ad");

    flow.ad->disconnectDomainMonitoring();
    flow.ad->disconnectDomainMonitoring();
    flow.changeDomain(media);

    QCOMPARE(flow.take(), QStringList());
}

void tst_DomainBlockedPopupState::aWaitingPopupIsNotStored()
{
    Flow flow;
    PopupState::setStoreBlockedPopups(true);
    flow.startInDomain(navigation);
    flow.request("car/ad");
    flow.request("radio/news");

    PopupState::setStoreBlockedPopups(false);

    QCOMPARE(flow.take(), QStringList("releaseBlockedPopups 1")); // the news alone
}

void tst_DomainBlockedPopupState::aPopupRefusedByARuleIsStored()
{
    Flow flow;
    PopupState::setStoreBlockedPopups(true);
    flow.startInDomain(media);
    flow.request("car/alarm");
    flow.request("car/ad");
    flow.take();

    PopupState::setStoreBlockedPopups(false);

    QCOMPARE(flow.take(), QStringList("releaseBlockedPopups 1"));
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::whatItAnswersToARefusal()
{
    Flow flow;
    flow.startInDomain(media);

    QVERIFY(!flow.ad->handleDomainBlocked());
    QVERIFY(!flow.ad->handleBlocked());

    flow.changeDomain(navigation);
    QVERIFY(flow.ad->handleDomainBlocked());
    QVERIFY(flow.ad->handleBlocked());
    QVERIFY(!flow.ad->handleInterruptionBlocked());
    QVERIFY(!flow.news->handleDomainBlocked());
}

void tst_DomainBlockedPopupState::withoutAViewLayerItDoesNotWait()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.target.reset();

    QVERIFY(!flow.ad->handleDomainBlocked());
    flow.ad->activeDomainChanged(media, navigation);
    flow.ad->disconnectDomainMonitoring();
    flow.request("car/ad");

    QVERIFY(flow.ad->active());
    QCOMPARE(flow.take(), QStringList());
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::itsDestructionEndsTheWaiting()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/ad");

    delete flow.ad;
    flow.changeDomain(media);
    flow.request("car/ad_Dismiss");
    flow.request("car/ad");

    QCOMPARE(flow.take(), QStringList());
}

void tst_DomainBlockedPopupState::theViewLayerMayGoBeforeIt()
{
    Flow flow;
    flow.startInDomain(navigation);
    flow.request("car/ad");

    flow.target.reset();
    flow.request("car/ad_Dismiss");
    QVERIFY(!flow.ad->active());
    flow.request("car/ad");

    QVERIFY(flow.ad->active());
    QCOMPARE(messages().take().size(), 1);
}

void tst_DomainBlockedPopupState::everyConstructorConnectsIt_data()
{
    QTest::addColumn<int>("constructor");
    QTest::addColumn<bool>("activated");

    for (const bool activated : {false, true}) {
        const char *signal = activated ? "activated" : "requested again";
        QTest::addRow("alone, %s", signal) << 0 << activated;
        QTest::addRow("in a root, %s", signal) << 1 << activated;
        QTest::addRow("in a layer, %s", signal) << 2 << activated;
    }
}

void tst_DomainBlockedPopupState::everyConstructorConnectsIt()
{
    QFETCH(int, constructor);
    QFETCH(bool, activated);
    Flow flow;
    const std::unique_ptr<DomainBlockedPopupState> popup(
        constructor == 0 ? new DomainBlockedPopupState("shop/offer", 1)
            : constructor == 1
            ? new DomainBlockedPopupState("shop/offer", flow.layer->popupState(), 1)
            : new DomainBlockedPopupState("shop/offer", flow.layer, 1));
    popup->setPopupViewId("AdView");
    flow.changeDomain(navigation);
    QCOMPARE(popup->rootPopupState(), constructor == 0 ? nullptr : flow.layer->popupState());
    QVERIFY(popup->handleDomainBlocked());

    if (activated) {
        Q_EMIT popup->aboutToBeActivated();
    } else {
        Q_EMIT popup->alreadyActivated();
    }
    flow.changeDomain(media);

    QCOMPARE(flow.take(), QStringList());
}

void tst_DomainBlockedPopupState::aMissingRootIsAWarning_data()
{
    QTest::addColumn<bool>("ofLayer");

    QTest::newRow("no root") << false;
    QTest::newRow("no layer") << true;
}

void tst_DomainBlockedPopupState::aMissingRootIsAWarning()
{
    QFETCH(bool, ofLayer);
    Flow flow;
    flow.changeDomain(navigation);

    const std::unique_ptr<DomainBlockedPopupState> popup(
        ofLayer ? new DomainBlockedPopupState("AdView", static_cast<HmiLayeredState *>(nullptr), 1)
                : new DomainBlockedPopupState("AdView", static_cast<PopupRootState *>(nullptr), 1));

    QCOMPARE(messages().take(),
             QStringList("warning PopupState: PopupState: Invalid popup root state instance."));
    QVERIFY(!popup->rootPopupState());
    QVERIFY(popup->handleDomainBlocked());
    flow.changeDomain(media);
    QCOMPARE(flow.take(), QStringList("retryBlockedPopup AdView"));
}

QTEST_GUILESS_MAIN(tst_DomainBlockedPopupState)
#include "tst_domainblockedpopupstate.moc"
