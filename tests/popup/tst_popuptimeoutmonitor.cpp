#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupstate.h>
#include <HmiStateMachine/popup/popuptimeoutmonitor.h>

#include <QPointer>
#include <QSignalSpy>
#include <QStateMachine>
#include <QTimer>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

// A popup that dismisses itself after eight seconds, with a monitor that ticks every second.
struct Flow
{
    Flow()
    {
        layer->setInitialHmiState(new HmiViewState("Home", layer));
        popup->setPopupViewId("FuelView");
        popup->setAutoDismissTimeoutInterval(8000);
        popup->setAutoDismissTimeoutActive(true);
    }

    void start() { startIn(machine, layer); }

    void post(const QString &request)
    {
        machine.postEvent(new PopupEvent(request, QVariant()));
        settle();
    }

    // Without the monitor's timer, the popup has one.
    QTimer *dismissTimer() const
    {
        return popup->findChild<QTimer *>(QString(), Qt::FindDirectChildrenOnly);
    }

    QVariant shownMonitor() const { return target.popupData("FuelView").value("timeoutMonitor"); }

    Journal journal;
    RecordingViewStateTarget target{journal};
    QStateMachine machine;
    HmiLayeredState *layer = new HmiLayeredState("Layer", &machine);
    PopupState *popup = new PopupState("car/fuel", layer, 1);
    PopupTimeoutMonitor *monitor = new PopupTimeoutMonitor(1000, popup);
    QPointer<QTimer> tick = monitor->findChild<QTimer *>();
};

} // namespace

class tst_PopupTimeoutMonitor : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void metaObject();
    void itBelongsToItsPopup();
    void theTickTimerRepeats();
    void theTickIntervalMayBeChanged();
    void theViewFindsTheMonitorInThePopupsData();
    void aLaterMonitorTakesThePlaceInThePopupsData();
    void enteringThePopupStartsTheTick();
    void withoutAutoDismissEnteringStopsTheTick();
    void everyTickTellsOfTheRemainingTime();
    void aRepeatedRequestRestartsTheTick();
    void aRepeatedRequestFollowsAutoDismiss();
    void monitoringFollowsAutoDismissWhenStarted();
    void leavingThePopupStopsTheTick_data();
    void leavingThePopupStopsTheTick();
    void aReturningPopupTicksAgain();
    void noTimeRemainsBeforeThePopupIsShown();
    void theRemainingTimeIsThatOfThePopup();
    void noTimeRemainsAfterTheTimeout();
    void noTimeRemainsWithoutAutoDismiss();
    void theViewReadsTheTimeAsAProperty();
    void aMonitorMayGoBeforeItsPopup();
    void aMonitorMayGoWhileItTicks();
    void aMonitorGoesWithItsPopup();
    void aMonitorThatOutlivesItsPopupStandsStill();
    void aPopupWithoutARootIsMonitored();
};

void tst_PopupTimeoutMonitor::metaObject()
{
    QCOMPARE(metaDescription(PopupTimeoutMonitor::staticMetaObject),
             QStringList({"signal timeRemainingChanged()", "slot startMonitoring()",
                          "property int timeRemaining read timeRemainingChanged()"}));
    QCOMPARE(PopupTimeoutMonitor::staticMetaObject.superClass(), &QObject::staticMetaObject);
}

void tst_PopupTimeoutMonitor::itBelongsToItsPopup()
{
    const Flow flow;

    QCOMPARE(flow.monitor->parent(), flow.popup);
}

void tst_PopupTimeoutMonitor::theTickTimerRepeats()
{
    const Flow flow;

    QCOMPARE(flow.monitor->findChildren<QTimer *>().size(), 1);
    QCOMPARE(flow.tick->interval(), 1000);
    QVERIFY(!flow.tick->isSingleShot());
    QVERIFY(!flow.tick->isActive());
}

void tst_PopupTimeoutMonitor::theTickIntervalMayBeChanged()
{
    Flow flow;
    flow.start();

    flow.monitor->setTimerTick(250);

    QCOMPARE(flow.tick->interval(), 250);
    QVERIFY(!flow.tick->isActive());

    flow.post("car/fuel");
    flow.monitor->setTimerTick(500);

    QCOMPARE(flow.tick->interval(), 500);
    QVERIFY(flow.tick->isActive());
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::theViewFindsTheMonitorInThePopupsData()
{
    Flow flow;
    flow.start();

    flow.post("car/fuel");

    QCOMPARE(flow.shownMonitor().value<PopupTimeoutMonitor *>(), flow.monitor);
    QCOMPARE(flow.shownMonitor().value<QObject *>(), flow.monitor);
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::aLaterMonitorTakesThePlaceInThePopupsData()
{
    Flow flow;
    flow.start();

    auto *later = new PopupTimeoutMonitor(200, flow.popup);
    flow.post("car/fuel");

    QCOMPARE(flow.shownMonitor().value<PopupTimeoutMonitor *>(), later);
    QVERIFY(flow.tick->isActive());
    QVERIFY(later->findChild<QTimer *>()->isActive());
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::enteringThePopupStartsTheTick()
{
    Flow flow;
    flow.start();
    QVERIFY(!flow.tick->isActive());

    flow.post("car/fuel");

    QVERIFY(flow.popup->active());
    QVERIFY(flow.tick->isActive());
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::withoutAutoDismissEnteringStopsTheTick()
{
    Flow flow;
    flow.start();
    flow.monitor->startMonitoring();
    QVERIFY(flow.tick->isActive());
    flow.popup->setAutoDismissTimeoutActive(false);

    flow.post("car/fuel");

    QVERIFY(flow.popup->active());
    QVERIFY(!flow.tick->isActive());
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::everyTickTellsOfTheRemainingTime()
{
    Flow flow;
    QSignalSpy changed(flow.monitor, &PopupTimeoutMonitor::timeRemainingChanged);
    QVERIFY(changed.isValid());
    flow.start();
    flow.post("car/fuel");
    QCOMPARE(changed.size(), 0);

    QVERIFY(fire(flow.tick));
    QVERIFY(fire(flow.tick));
    QVERIFY(fire(flow.tick));

    QCOMPARE(changed.size(), 3);
    QVERIFY(flow.tick->isActive());
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::aRepeatedRequestRestartsTheTick()
{
    Flow flow;
    flow.monitor->setTimerTick(60000);
    flow.tick->setTimerType(Qt::PreciseTimer);
    flow.start();
    flow.post("car/fuel");
    // A restarted timer differs from a running one in nothing but its remaining time.
    QTRY_VERIFY_WITH_TIMEOUT(flow.tick->remainingTime() < 59700, 5000);

    flow.post("car/fuel");

    QVERIFY(flow.tick->remainingTime() > 59700);
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::aRepeatedRequestFollowsAutoDismiss()
{
    Flow flow;
    flow.start();
    flow.post("car/fuel");

    flow.popup->setAutoDismissTimeoutActive(false);
    QVERIFY(flow.tick->isActive());
    flow.post("car/fuel");
    QVERIFY(!flow.tick->isActive());

    flow.popup->setAutoDismissTimeoutActive(true);
    QVERIFY(!flow.tick->isActive());
    flow.post("car/fuel");
    QVERIFY(flow.tick->isActive());
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::monitoringFollowsAutoDismissWhenStarted()
{
    const Flow flow;

    flow.monitor->startMonitoring();
    QVERIFY(flow.tick->isActive());

    flow.popup->setAutoDismissTimeoutActive(false);
    QVERIFY(flow.tick->isActive());

    flow.monitor->startMonitoring();
    QVERIFY(!flow.tick->isActive());
}

void tst_PopupTimeoutMonitor::leavingThePopupStopsTheTick_data()
{
    QTest::addColumn<QString>("request");

    QTest::newRow("dismissed") << "car/fuel_Dismiss";
    QTest::newRow("all dismissed") << "DismissAnyPopup";
    QTest::newRow("interrupted") << "phone/call";
}

void tst_PopupTimeoutMonitor::leavingThePopupStopsTheTick()
{
    QFETCH(QString, request);
    Flow flow;
    new PopupState("phone/call", flow.layer, 1);
    flow.start();
    flow.post("car/fuel");
    QVERIFY(flow.tick->isActive());

    flow.post(request);

    QVERIFY(!flow.popup->active());
    QVERIFY(!flow.tick->isActive());
    messages().take();
}

void tst_PopupTimeoutMonitor::aReturningPopupTicksAgain()
{
    Flow flow;
    new PopupState("phone/call", flow.layer, 1);
    flow.start();
    flow.post("car/fuel");
    flow.post("phone/call");
    QVERIFY(!flow.tick->isActive());

    flow.post("phone/call_Dismiss");

    QVERIFY(flow.popup->active());
    QVERIFY(flow.tick->isActive());
    QCOMPARE(messages().take().size(), 3);
}

void tst_PopupTimeoutMonitor::noTimeRemainsBeforeThePopupIsShown()
{
    Flow flow;
    QCOMPARE(flow.monitor->timeRemaining(), 0);
    flow.start();

    flow.post("car/fuel");

    QVERIFY(flow.tick->isActive());
    QCOMPARE(flow.monitor->timeRemaining(), 0);
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::theRemainingTimeIsThatOfThePopup()
{
    Flow flow;
    flow.start();
    flow.post("car/fuel");

    Q_EMIT flow.target.popupStatusChanged("FuelView", true);

    const int remaining = flow.monitor->timeRemaining();
    QVERIFY2(remaining > 0 && remaining <= 8400, qPrintable(QString::number(remaining)));
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::noTimeRemainsAfterTheTimeout()
{
    Flow flow;
    flow.start();
    flow.post("car/fuel");
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);
    QVERIFY(flow.monitor->timeRemaining() > 0);

    QVERIFY(fire(flow.dismissTimer()));
    QCOMPARE(flow.monitor->timeRemaining(), 0);
    settle();

    QVERIFY(!flow.popup->active());
    QVERIFY(!flow.tick->isActive());
    QCOMPARE(flow.monitor->timeRemaining(), 0);
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::noTimeRemainsWithoutAutoDismiss()
{
    Flow flow;
    flow.start();
    flow.post("car/fuel");
    Q_EMIT flow.target.popupStatusChanged("FuelView", true);
    QVERIFY(flow.monitor->timeRemaining() > 0);

    flow.popup->setAutoDismissTimeoutActive(false);

    QCOMPARE(flow.monitor->timeRemaining(), 0);
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::theViewReadsTheTimeAsAProperty()
{
    Flow flow;
    QCOMPARE(flow.monitor->property("timeRemaining"), QVariant(0));
    flow.start();
    flow.post("car/fuel");

    Q_EMIT flow.target.popupStatusChanged("FuelView", true);

    QVERIFY(flow.monitor->property("timeRemaining").toInt() > 0);
    QVERIFY(!flow.monitor->setProperty("timeRemaining", 5));
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::aMonitorMayGoBeforeItsPopup()
{
    Flow flow;
    flow.start();

    delete flow.monitor;
    flow.post("car/fuel");

    QVERIFY(flow.popup->active());
    QVERIFY(!flow.shownMonitor().isValid());
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::aMonitorMayGoWhileItTicks()
{
    Flow flow;
    flow.start();
    flow.post("car/fuel");
    QVERIFY(flow.shownMonitor().isValid());

    delete flow.monitor;
    QVERIFY(!flow.tick);
    flow.post("car/fuel");
    QVERIFY(!flow.shownMonitor().isValid());
    flow.post("car/fuel_Dismiss");

    QVERIFY(!flow.popup->active());
    QCOMPARE(messages().take().size(), 1);
}

void tst_PopupTimeoutMonitor::aMonitorGoesWithItsPopup()
{
    QState parent;
    auto *popup = new PopupState("car/fuel", 1);
    popup->setParent(&parent);
    popup->setAutoDismissTimeoutActive(true);
    const QPointer<PopupTimeoutMonitor> monitor = new PopupTimeoutMonitor(1000, popup);
    monitor->startMonitoring();
    const QPointer<QTimer> tick = monitor->findChild<QTimer *>();
    QVERIFY(tick->isActive());

    delete popup;

    QVERIFY(!monitor);
    QVERIFY(!tick);
}

void tst_PopupTimeoutMonitor::aMonitorThatOutlivesItsPopupStandsStill()
{
    auto *popup = new PopupState("car/fuel", 1);
    popup->setAutoDismissTimeoutActive(true);
    PopupTimeoutMonitor monitor(1000, popup);
    monitor.setParent(nullptr);
    monitor.startMonitoring();
    const auto *tick = monitor.findChild<QTimer *>();
    QVERIFY(tick->isActive());

    delete popup;
    monitor.startMonitoring();

    QCOMPARE(monitor.timeRemaining(), 0);
    QVERIFY(!tick->isActive());
}

void tst_PopupTimeoutMonitor::aPopupWithoutARootIsMonitored()
{
    QStateMachine machine;
    auto *popup = new PopupState("car/fuel", 1);
    popup->setParent(&machine);
    popup->setAutoDismissTimeoutActive(true);
    const PopupTimeoutMonitor *monitor = new PopupTimeoutMonitor(1000, popup);

    startIn(machine, popup);

    QVERIFY(monitor->findChild<QTimer *>()->isActive());
    QCOMPARE(monitor->timeRemaining(), 0);
    QCOMPARE(messages().take().size(), 1);
}

QTEST_GUILESS_MAIN(tst_PopupTimeoutMonitor)
#include "tst_popuptimeoutmonitor.moc"
