#include "scene/flowpause.h"

#include <QAbstractEventDispatcher>
#include <QSignalSpy>
#include <QTest>
#include <QTimer>

#include <memory>

using namespace headunit;

namespace {

constexpr int minuteMs = 60000;
constexpr int strayMs = 5000; // more than a timer of a minute and a busy computer stray by

bool isAbout(int milliseconds, int expected)
{
    return qAbs(milliseconds - expected) < strayMs;
}

QTimer *makeTimer(QObject *owner, int milliseconds, bool singleShot)
{
    auto *timer = new QTimer(owner);
    timer->setSingleShot(singleShot);
    timer->setTimerType(Qt::PreciseTimer);
    timer->start(milliseconds);
    return timer;
}

// A held timer has no time that runs out.
bool isHeld(const QTimer *timer)
{
    return timer->isActive() && timer->remainingTime() < 0;
}

} // namespace

class tst_FlowPause : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void runningTimerKeepsAllThatItIs_data();
    void runningTimerKeepsAllThatItIs();
    void timersElsewhereRunOn();
    void timersFarBelowAnOwnerAreHeld();
    void stoppedTimerIsNotStarted();
    void timerStoppedMeanwhileStaysStopped();
    void timerStartedMeanwhileRuns();
    void timerStartedAnewMeanwhileHasItsWholeTime();
    void timerDestroyedMeanwhileIsForgotten();
    void destructorLetsTimersRunOn();
    void beginningOrEndingTwiceIsNoMatter();
    void pauseBegunAgainGivesWhatTheLastOneHeld();
    void pauseBegunAgainGivesARestartedTimerItsWholeTime();
    void pauseBegunAgainGivesANewTimerItsWholeTime();
    void pauseBegunAnewTakesWhatIsLeftByThen();
    void noTimePassesWhileTimersAreHeld();
    void repeatingTimerHasItsWholeIntervalAfterTheRestOfOne();
};

void tst_FlowPause::runningTimerKeepsAllThatItIs_data()
{
    QTest::addColumn<bool>("singleShot");
    QTest::addColumn<Qt::TimerType>("type");
    for (const auto type : {Qt::PreciseTimer, Qt::CoarseTimer, Qt::VeryCoarseTimer}) {
        QTest::addRow("single shot of type %d", type) << true << type;
        QTest::addRow("repeating of type %d", type) << false << type;
    }
}

void tst_FlowPause::runningTimerKeepsAllThatItIs()
{
    QFETCH(bool, singleShot);
    QFETCH(Qt::TimerType, type);
    QObject owner;
    QTimer *timer = makeTimer(&owner, minuteMs, singleShot);
    timer->setTimerType(type);
    timer->start();
    const int id = timer->timerId();
    FlowPause pause({&owner});

    pause.begin();
    QVERIFY(isHeld(timer));
    pause.end();

    QVERIFY(timer->isActive());
    QVERIFY(isAbout(timer->remainingTime(), minuteMs));
    QCOMPARE(timer->timerId(), id);
    QCOMPARE(timer->interval(), minuteMs);
    QCOMPARE(timer->isSingleShot(), singleShot);
    QCOMPARE(timer->timerType(), type);
}

void tst_FlowPause::timersElsewhereRunOn()
{
    QObject owner;
    QObject stranger;
    QTimer *timer = makeTimer(&stranger, minuteMs, true);
    FlowPause pause({&owner});

    pause.begin();

    QVERIFY(isAbout(timer->remainingTime(), minuteMs));
}

void tst_FlowPause::timersFarBelowAnOwnerAreHeld()
{
    QObject first;
    QObject second;
    QTimer *timer = makeTimer(new QObject(new QObject(&second)), minuteMs, true);
    FlowPause pause({&first, &second});

    pause.begin();

    QVERIFY(isHeld(timer));
}

void tst_FlowPause::stoppedTimerIsNotStarted()
{
    QObject owner;
    QTimer timer(&owner);
    timer.setInterval(minuteMs);
    FlowPause pause({&owner});

    pause.begin();
    pause.end();

    QVERIFY(!timer.isActive());
}

void tst_FlowPause::timerStoppedMeanwhileStaysStopped()
{
    QObject owner;
    QTimer *timer = makeTimer(&owner, minuteMs, true);
    FlowPause pause({&owner});

    pause.begin();
    timer->stop();
    pause.end();

    QVERIFY(!timer->isActive());
}

void tst_FlowPause::timerStartedMeanwhileRuns()
{
    QObject owner;
    FlowPause pause({&owner});

    pause.begin();
    QTimer *timer = makeTimer(&owner, minuteMs, true);
    pause.end();

    QVERIFY(isAbout(timer->remainingTime(), minuteMs));
}

void tst_FlowPause::timerStartedAnewMeanwhileHasItsWholeTime()
{
    QObject owner;
    QTimer *timer = makeTimer(&owner, minuteMs, true);
    FlowPause pause({&owner});

    pause.begin();
    timer->start(3 * minuteMs);
    pause.end();

    QCOMPARE(timer->interval(), 3 * minuteMs);
    QVERIFY(isAbout(timer->remainingTime(), 3 * minuteMs));
}

void tst_FlowPause::timerDestroyedMeanwhileIsForgotten()
{
    QObject owner;
    QTimer *timer = makeTimer(&owner, minuteMs, true);
    FlowPause pause({&owner});

    pause.begin();
    delete timer;
    QTimer *other = makeTimer(&owner, 3 * minuteMs, true); // may be given the same id
    pause.end();

    QVERIFY(other->isActive());
    QVERIFY(isAbout(other->remainingTime(), 3 * minuteMs));
    other->stop();
    QVERIFY(QAbstractEventDispatcher::instance()->registeredTimers(other).isEmpty());
}

void tst_FlowPause::destructorLetsTimersRunOn()
{
    QObject owner;
    QTimer *timer = makeTimer(&owner, minuteMs, true);
    auto pause = std::make_unique<FlowPause>(QList<QObject *>{&owner});
    pause->begin();

    pause.reset();

    QVERIFY(isAbout(timer->remainingTime(), minuteMs));
}

void tst_FlowPause::beginningOrEndingTwiceIsNoMatter()
{
    QObject owner;
    QTimer *timer = makeTimer(&owner, minuteMs, true);
    FlowPause pause({&owner});

    pause.end();
    QVERIFY(isAbout(timer->remainingTime(), minuteMs));
    pause.begin();
    pause.begin();
    pause.beginAgain();
    QVERIFY(isHeld(timer));
    pause.end();
    pause.end();

    QVERIFY(isAbout(timer->remainingTime(), minuteMs));
}

// A command that took long costs the flow's timers nothing.
void tst_FlowPause::pauseBegunAgainGivesWhatTheLastOneHeld()
{
    QObject owner;
    QTimer *timer = makeTimer(&owner, 400, true);
    FlowPause pause({&owner});
    QTRY_VERIFY(timer->remainingTime() < 300);
    pause.begin();
    pause.end();
    const int rest = timer->remainingTime();
    QTRY_VERIFY(timer->remainingTime() < rest - 100);

    pause.beginAgain();
    QVERIFY(isHeld(timer));
    pause.end();

    QVERIFY(timer->remainingTime() > rest - 50);
    QVERIFY(timer->remainingTime() <= 300);
}

void tst_FlowPause::pauseBegunAgainGivesARestartedTimerItsWholeTime()
{
    QObject owner;
    QTimer *timer = makeTimer(&owner, 400, true);
    FlowPause pause({&owner});
    QTRY_VERIFY(timer->remainingTime() < 300);
    pause.begin();
    pause.end();
    timer->start();

    pause.beginAgain();
    pause.end();

    QVERIFY(timer->remainingTime() > 350);
}

void tst_FlowPause::pauseBegunAgainGivesANewTimerItsWholeTime()
{
    QObject owner;
    FlowPause pause({&owner});
    pause.begin();
    pause.end();
    QTimer *timer = makeTimer(&owner, minuteMs, true);

    pause.beginAgain();
    QVERIFY(isHeld(timer));
    pause.end();

    QVERIFY(isAbout(timer->remainingTime(), minuteMs));
}

void tst_FlowPause::pauseBegunAnewTakesWhatIsLeftByThen()
{
    QObject owner;
    QTimer *timer = makeTimer(&owner, 400, true);
    FlowPause pause({&owner});

    QTRY_VERIFY(timer->remainingTime() < 300);
    pause.begin();
    pause.end();
    QVERIFY(timer->remainingTime() <= 300);
    QTRY_VERIFY(timer->remainingTime() < 200);
    pause.begin();
    pause.end();

    QVERIFY(timer->remainingTime() <= 200);
}

void tst_FlowPause::noTimePassesWhileTimersAreHeld()
{
    QObject owner;
    QTimer *timer = makeTimer(&owner, 60, true);
    const QSignalSpy timeouts(timer, &QTimer::timeout);
    QTimer longer;
    longer.setSingleShot(true);
    FlowPause pause({&owner});

    for (int pauses = 0; pauses < 3; ++pauses) {
        pause.beginAgain();
        longer.start(90);
        QTRY_VERIFY(!longer.isActive());
        QCOMPARE(timeouts.size(), 0);
        pause.end();
        QVERIFY(timer->isActive());
    }

    QTRY_COMPARE(timeouts.size(), 1);
    QVERIFY(!timer->isActive());
}

void tst_FlowPause::repeatingTimerHasItsWholeIntervalAfterTheRestOfOne()
{
    QObject owner;
    QTimer *timer = makeTimer(&owner, 3000, false);
    const QSignalSpy timeouts(timer, &QTimer::timeout);
    FlowPause pause({&owner});

    QTRY_VERIFY(timer->remainingTime() < 2900);
    pause.begin();
    pause.end();
    for (int pauses = 0; pauses < 3; ++pauses) {
        pause.beginAgain();
        pause.end();
    }
    QVERIFY(timer->remainingTime() < 2900);
    QTRY_COMPARE_WITH_TIMEOUT(timeouts.size(), 1, 10000);

    QVERIFY(timer->remainingTime() > 2900);
    QCOMPARE(timer->interval(), 3000);
    QCOMPARE(owner.findChildren<QObject *>().size(), 1); // nothing is left behind
}

QTEST_GUILESS_MAIN(tst_FlowPause)

#include "tst_flowpause.moc"
