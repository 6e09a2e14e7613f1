#include "driving.h"
#include "librarytest.h"

#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/namedstate.h>

#include <QEventLoop>
#include <QStateMachine>
#include <QtTest>

#include <thread>
#include <vector>

#if defined(__SANITIZE_THREAD__)
#include <sanitizer/tsan_interface.h>
#endif

using namespace HmiStateMachine;

namespace {

constexpr int posters = 4;
constexpr int eventsEach = 5000;

// The machine's queue hands the event over under a mutex inside Qt, which the thread sanitizer does
// not see.
void handOver(QEvent *event)
{
#if defined(__SANITIZE_THREAD__)
    __tsan_release(event);
#else
    Q_UNUSED(event)
#endif
}

void receive(QEvent *event)
{
#if defined(__SANITIZE_THREAD__)
    __tsan_acquire(event);
#else
    Q_UNUSED(event)
#endif
}

class ReceivingMachine : public QStateMachine
{
    Q_OBJECT

protected:
    void beginSelectTransitions(QEvent *event) override { receive(event); }
};

// Takes what its poster sent, and notes what is not the next in its row.
struct Row
{
    Row(int poster, NamedState *state) : transition(new HmiTransition(name(poster), state))
    {
        QObject::connect(transition, &QAbstractTransition::triggered, transition, [this] {
            inOrder = inOrder && transition->transitionData() == QVariant(received);
            ++received;
        });
    }

    static QString name(int poster) { return QStringLiteral("From thread %1").arg(poster); }

    HmiTransition *transition;
    int received = 0;
    bool inOrder = true;
};

void post(QStateMachine &machine, int poster)
{
    for (int number = 0; number < eventsEach; ++number) {
        auto *event = new HmiEvent(Row::name(poster), number);
        handOver(event);
        machine.postEvent(event);
    }
}

} // namespace

class tst_PostingThreads : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void everyEventOfEveryThreadArrivesInItsOrder();
};

void tst_PostingThreads::everyEventOfEveryThreadArrivesInItsOrder()
{
    ReceivingMachine machine;
    NamedState state("Receiver", &machine);
    std::vector<std::unique_ptr<Row>> rows;
    for (int poster = 0; poster < posters; ++poster) {
        rows.emplace_back(new Row(poster, &state));
    }
    startIn(machine, &state);

    QEventLoop loop;
    std::atomic<int> left{posters};
    std::vector<std::thread> threads;
    for (int poster = 0; poster < posters; ++poster) {
        threads.emplace_back([&, poster] {
            post(machine, poster);
            if (--left == 0) {
                QMetaObject::invokeMethod(&loop, &QEventLoop::quit, Qt::QueuedConnection);
            }
        });
    }
    loop.exec();
    for (std::thread &thread : threads) {
        thread.join();
    }
    // An event that comes just when the machine falls idle waits for the next one.
    machine.postEvent(new HmiEvent("Last", QVariant()));
    settle();

    for (const auto &row : rows) {
        QCOMPARE(row->received, eventsEach);
        QVERIFY(row->inOrder);
    }
    park(machine);
}

QTEST_GUILESS_MAIN(tst_PostingThreads)
#include "tst_postingthreads.moc"
