#include "driving.h"
#include "librarytest.h"
#include "popupflow.h"

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QAbstractEventDispatcher>
#include <QTimer>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

/** A popup of the lower layer that dismisses itself after five seconds. */
struct TimedPopup : PopupFlow
{
    TimedPopup(MessageRecorder &messages, const QString &module)
        : PopupFlow(messages), name(module + "/fuel"), fuel(popup(name, "FuelView"))
    {
        fuel->setAutoDismissTimeoutActive(true);
    }

    QTimer *timer() const { return fuel->findChild<QTimer *>(); }

    /** Requests the popup and reports it shown. */
    void show()
    {
        start();
        request(name);
        Q_EMIT target.popupStatusChanged("FuelView", true);
        take();
    }

    const QString name;
    PopupState *const fuel;
};

/** Has the present run of @p timer take a minute, which a new start would take back. */
void prolong(QTimer *timer)
{
    QAbstractEventDispatcher *dispatcher = QAbstractEventDispatcher::instance();
    dispatcher->unregisterTimer(timer->timerId());
    dispatcher->registerTimer(timer->timerId(), 60000, Qt::CoarseTimer, timer);
}

bool isProlonged(const QTimer *timer)
{
    return timer->isActive() && timer->remainingTime() > 50000;
}

} // namespace

class tst_PopupStateAutoDismiss : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void thereIsNoTimerUntilItIsSwitchedOn();
    void theTimerIsASingleShotOfTheInterval();
    void theTransitionLeadsToNoPopup();
    void aPopupWithoutARootHasATimerButNoTransition();
    void theTransitionIsAddedWithTheRoot();
    void theTimeoutOfAMovedPopupClosesItInItsNewLayer();
    void switchingOffAndOnReusesTimerAndTransition();
    void switchingOnTwiceConnectsOnce();
    void switchingOffStopsTheTimer();
    void theTimerStartsWhenThePopupIsReportedShown();
    void aReportOfAnotherPopupStartsNothing();
    void aSecondReportDoesNotStartTheTimeAnew();
    void aReportWhileSwitchedOffStartsNothing();
    void theTimeoutClosesThePopup();
    void theTimerStopsWhenThePopupIsDismissed();
    void theTimerRunsOnWhileThePopupWaits();
    void theTimerRunsOnWhenThePopupReturns();
    void aNewIntervalIsForTheTimerThatIsThere();
    void anIntervalIsRememberedForTheTimerToCome();
    void theSameIntervalLeavesTheTimeRunning();
    void restartingTouchesARunningTimerOnly();
    void theRemainingTimeIsThatOfTheTimer();
    void aRequestForTheCurrentPopupLeavesTheTimeRunning();
};

void tst_PopupStateAutoDismiss::thereIsNoTimerUntilItIsSwitchedOn()
{
    PopupFlow flow(messages());
    PopupState *popup = flow.popup("autonone/fuel", "FuelView");

    popup->setAutoDismissTimeoutActive(false);
    popup->restartAutoDismissTimer();

    QVERIFY(!popup->findChild<QTimer *>());
    QCOMPARE(popup->autoDismissTransition(), nullptr);
    QCOMPARE(popup->autoDismissRemainingTime(), 0);
}

void tst_PopupStateAutoDismiss::theTimerIsASingleShotOfTheInterval()
{
    const TimedPopup flow(messages(), "autotimer");

    QVERIFY(flow.fuel->autoDismissActive());
    QVERIFY(flow.timer()->isSingleShot());
    QVERIFY(!flow.timer()->isActive());
    QCOMPARE(flow.timer()->interval(), 5000);
}

void tst_PopupStateAutoDismiss::theTransitionLeadsToNoPopup()
{
    const TimedPopup flow(messages(), "autolead");

    const HmiSignalTransition *transition = flow.fuel->autoDismissTransition();
    QCOMPARE(transition->sourceState(), flow.fuel);
    QCOMPARE(transition->targetState(), flow.lower->noPopupState());
    QCOMPARE(transition->senderObject(), flow.timer());
    QCOMPARE(transition->signal(), QByteArray("2timeout()"));
}

void tst_PopupStateAutoDismiss::aPopupWithoutARootHasATimerButNoTransition()
{
    PopupState popup("autolone/fuel", 1);

    popup.setAutoDismissTimeoutActive(true);

    QVERIFY(popup.findChild<QTimer *>());
    QCOMPARE(popup.autoDismissTransition(), nullptr);
}

void tst_PopupStateAutoDismiss::theTransitionIsAddedWithTheRoot()
{
    PopupRootState root("AutoRoot");
    auto *popup = new PopupState("autoroot/fuel", 1);
    popup->setAutoDismissTimeoutActive(true);

    root.addPopupState(popup);

    QVERIFY(popup->autoDismissTransition());
    QCOMPARE(popup->autoDismissTransition()->targetState(), root.noPopupState());
}

void tst_PopupStateAutoDismiss::theTimeoutOfAMovedPopupClosesItInItsNewLayer()
{
    TimedPopup flow(messages(), "automoved");
    const PopupState *other = flow.popup("automoved/other", "OtherView");
    flow.upper->addPopupState(flow.fuel);
    flow.show();
    flow.request("automoved/other");
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);

    QVERIFY(fire(flow.timer()));
    settle();

    QVERIFY(!flow.fuel->isActive());
    QVERIFY(other->isActive());
    QCOMPARE(flow.upper->activePopupState(), flow.upper->noPopupState());
}

void tst_PopupStateAutoDismiss::switchingOffAndOnReusesTimerAndTransition()
{
    TimedPopup flow(messages(), "autoreuse");
    flow.record(flow.fuel);
    const QTimer *timer = flow.timer();
    const HmiSignalTransition *transition = flow.fuel->autoDismissTransition();

    flow.fuel->setAutoDismissTimeoutActive(false);
    flow.fuel->setAutoDismissTimeoutActive(true);

    QCOMPARE(flow.fuel->findChildren<QTimer *>().size(), 1);
    QCOMPARE(flow.timer(), timer);
    QCOMPARE(flow.fuel->autoDismissTransition(), transition);
    flow.show();
    QVERIFY(fire(flow.timer()));
    QCOMPARE(flow.take().count("FuelView popupTimeOut"), 1);
}

void tst_PopupStateAutoDismiss::switchingOnTwiceConnectsOnce()
{
    TimedPopup flow(messages(), "autotwice");
    flow.fuel->setAutoDismissTimeoutActive(true);
    flow.record(flow.fuel);
    flow.show();

    QVERIFY(fire(flow.timer()));

    QCOMPARE(flow.take().count("FuelView popupTimeOut"), 1);
}

void tst_PopupStateAutoDismiss::switchingOffStopsTheTimer()
{
    TimedPopup flow(messages(), "autooff");
    flow.show();
    QVERIFY(flow.timer()->isActive());

    flow.fuel->setAutoDismissTimeoutActive(false);

    QVERIFY(!flow.timer()->isActive());
    QVERIFY(!flow.fuel->autoDismissActive());
    QVERIFY(flow.fuel->isActive());
}

void tst_PopupStateAutoDismiss::theTimerStartsWhenThePopupIsReportedShown()
{
    TimedPopup flow(messages(), "autoshown");
    flow.record(flow.fuel);
    flow.start();
    flow.request("autoshown/fuel");
    flow.take();
    QVERIFY(!flow.timer()->isActive());

    Q_EMIT flow.target.popupStatusChanged("FuelView", true);

    QVERIFY(flow.timer()->isActive());
    QCOMPARE(flow.take(), QStringList({"FuelView popupShown"}));
}

void tst_PopupStateAutoDismiss::aReportOfAnotherPopupStartsNothing()
{
    TimedPopup flow(messages(), "autoanother");
    flow.start();
    flow.request("autoanother/fuel");

    Q_EMIT flow.target.popupStatusChanged("CallView", true);
    Q_EMIT flow.target.popupStatusChanged("autoanother/fuel", true);
    Q_EMIT flow.target.popupStatusChanged("FuelView", false);

    QVERIFY(!flow.timer()->isActive());
}

void tst_PopupStateAutoDismiss::aSecondReportDoesNotStartTheTimeAnew()
{
    TimedPopup flow(messages(), "autosecond");
    flow.show();
    prolong(flow.timer());

    Q_EMIT flow.target.popupStatusChanged("FuelView", true);

    QVERIFY(isProlonged(flow.timer()));
}

void tst_PopupStateAutoDismiss::aReportWhileSwitchedOffStartsNothing()
{
    TimedPopup flow(messages(), "autosilent");
    flow.record(flow.fuel);
    flow.fuel->setAutoDismissTimeoutActive(false);

    flow.show();
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);

    // The reports are followed all the same, for there is a timer.
    QCOMPARE(flow.take(), QStringList({"FuelView popupShown"}));
    QVERIFY(!flow.timer()->isActive());
}

void tst_PopupStateAutoDismiss::theTimeoutClosesThePopup()
{
    TimedPopup flow(messages(), "autoclose");
    QSignalSpy timeouts(flow.fuel, &PopupState::popupTimeOut);
    QVERIFY(timeouts.isValid());
    flow.show();

    QVERIFY(fire(flow.timer()));
    settle();

    QCOMPARE(timeouts.size(), 1);
    QVERIFY(!flow.fuel->isActive());
    QVERIFY(!flow.timer()->isActive());
    QCOMPARE(flow.fuel->autoDismissRemainingTime(), 0);
}

void tst_PopupStateAutoDismiss::theTimerStopsWhenThePopupIsDismissed()
{
    TimedPopup flow(messages(), "autodismissed");
    flow.show();

    flow.request("FuelView_Dismiss");

    QVERIFY(!flow.timer()->isActive());
}

void tst_PopupStateAutoDismiss::theTimerRunsOnWhileThePopupWaits()
{
    TimedPopup flow(messages(), "autowaits");
    flow.popup("autowaits/call", "CallView");
    flow.show();
    prolong(flow.timer());

    flow.request("autowaits/call");

    QVERIFY(!flow.fuel->isActive());
    QVERIFY(isProlonged(flow.timer()));
}

void tst_PopupStateAutoDismiss::theTimerRunsOnWhenThePopupReturns()
{
    TimedPopup flow(messages(), "autoreturns");
    flow.popup("autoreturns/call", "CallView");
    PopupFlow::rule("autoreturns/fuel", PopupState::AllowStack, "autoreturns/call");
    flow.show();
    prolong(flow.timer());
    flow.request("autoreturns/call");

    flow.request("autoreturns/call_Dismiss");
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);

    QVERIFY(flow.fuel->isActive());
    QVERIFY(isProlonged(flow.timer()));
}

void tst_PopupStateAutoDismiss::aNewIntervalIsForTheTimerThatIsThere()
{
    const TimedPopup flow(messages(), "autointerval");

    flow.fuel->setAutoDismissTimeoutInterval(700);

    QCOMPARE(flow.fuel->autoDismissInterval(), 700);
    QCOMPARE(flow.timer()->interval(), 700);
    QVERIFY(!flow.timer()->isActive());
}

void tst_PopupStateAutoDismiss::anIntervalIsRememberedForTheTimerToCome()
{
    PopupState popup("autolater/fuel", 1);

    popup.setAutoDismissTimeoutInterval(700);
    QVERIFY(!popup.findChild<QTimer *>());
    popup.setAutoDismissTimeoutActive(true);

    QCOMPARE(popup.findChild<QTimer *>()->interval(), 700);
}

void tst_PopupStateAutoDismiss::theSameIntervalLeavesTheTimeRunning()
{
    TimedPopup flow(messages(), "autosame");
    flow.show();
    prolong(flow.timer());

    flow.fuel->setAutoDismissTimeoutInterval(5000);
    QVERIFY(isProlonged(flow.timer()));

    flow.fuel->setAutoDismissTimeoutInterval(700);
    QVERIFY(flow.timer()->isActive());
    QCOMPARE(flow.timer()->interval(), 700);
}

void tst_PopupStateAutoDismiss::restartingTouchesARunningTimerOnly()
{
    TimedPopup flow(messages(), "autorestart");
    flow.fuel->restartAutoDismissTimer();
    QVERIFY(!flow.timer()->isActive());
    flow.show();
    prolong(flow.timer());

    flow.fuel->restartAutoDismissTimer();

    QVERIFY(flow.timer()->isActive());
    QVERIFY(!isProlonged(flow.timer()));
}

void tst_PopupStateAutoDismiss::theRemainingTimeIsThatOfTheTimer()
{
    TimedPopup flow(messages(), "autoremaining");
    QCOMPARE(flow.fuel->autoDismissRemainingTime(), 0);

    flow.show();

    QVERIFY(flow.fuel->autoDismissRemainingTime() > 4000);
    QVERIFY(flow.fuel->autoDismissRemainingTime() <= 5250);
}

void tst_PopupStateAutoDismiss::aRequestForTheCurrentPopupLeavesTheTimeRunning()
{
    TimedPopup flow(messages(), "autocurrent");
    flow.show();
    prolong(flow.timer());

    flow.request("autocurrent/fuel");

    QVERIFY(isProlonged(flow.timer()));
}

QTEST_GUILESS_MAIN(tst_PopupStateAutoDismiss)
#include "tst_popupstateautodismiss.moc"
