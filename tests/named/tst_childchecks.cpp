#include "childprocess.h"
#include "driving.h"
#include "emitter.h"
#include "librarytest.h"

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/named/namedstate.h>

#include <QSignalTransition>
#include <QThread>
#include <QtTest>

#include <functional>
#include <memory>
#include <vector>

using namespace HmiStateMachine;

namespace {

using States = std::vector<std::unique_ptr<NamedState>>;

constexpr int stateCount = 5;

// States that all wait to have their children looked at, each with a proper transition.
States statesWithChildren(const Emitter &emitter)
{
    States states;
    for (int i = 0; i < stateCount; ++i) {
        states.push_back(std::make_unique<NamedState>());
        new HmiSignalTransition(&emitter, SIGNAL(plain()), states.back().get());
    }
    return states;
}

void runInAThread(const std::function<void()> &function)
{
    const std::unique_ptr<QThread> thread(QThread::create(function));
    thread->start();
    thread->wait();
}

// Ways in which a plain signal transition is among the children that are looked at together.

void addRawToOneOfMany(Emitter &emitter)
{
    const States states = statesWithChildren(emitter);
    new QSignalTransition(&emitter, SIGNAL(other()), states.at(3).get());
    settle();
}

void addRawToOneThatFollowsDestroyedOnes(Emitter &emitter)
{
    States states = statesWithChildren(emitter);
    new QSignalTransition(&emitter, SIGNAL(other()), states.at(3).get());
    states.erase(states.begin(), states.begin() + 2);
    settle();
}

void addRawAfterAllOthersWereLookedAt(Emitter &emitter)
{
    const States states = statesWithChildren(emitter);
    settle();
    new QSignalTransition(&emitter, SIGNAL(other()), states.at(0).get());
    settle();
}

void addRawAfterAllOthersWereDestroyed(Emitter &emitter)
{
    States states = statesWithChildren(emitter);
    states.clear();
    NamedState state;
    new QSignalTransition(&emitter, SIGNAL(other()), &state);
    settle();
}

void addRawAndMoveToAThread(Emitter &emitter)
{
    const States states = statesWithChildren(emitter);
    new QSignalTransition(&emitter, SIGNAL(other()), states.at(3).get());
    QThread thread;
    states.at(3)->moveToThread(&thread);
}

void addRawInAThreadWithAnEventLoop(Emitter &)
{
    runInAThread([] {
        Emitter emitter;
        const States states = statesWithChildren(emitter);
        new QSignalTransition(&emitter, SIGNAL(other()), states.at(3).get());
        settle();
    });
}

} // namespace

using Misuse = void (*)(Emitter &);
Q_DECLARE_METATYPE(Misuse)

class tst_ChildChecks : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aRawSignalTransitionIsFoundAmongManyStates_data();
    void aRawSignalTransitionIsFoundAmongManyStates();
    void properTransitionsOfManyStatesPass();
    void statesMayBeDestroyedBeforeTheyAreLookedAt();
    void statesMayMoveToAnotherThread();
    void statesMayMoveWhenTheyHaveBeenLookedAt();
    void statesMayOutliveTheirThread();
};

void tst_ChildChecks::aRawSignalTransitionIsFoundAmongManyStates_data()
{
    QTest::addColumn<Misuse>("misuse");

    QTest::newRow("one of many") << Misuse(addRawToOneOfMany);
    QTest::newRow("behind destroyed ones") << Misuse(addRawToOneThatFollowsDestroyedOnes);
    QTest::newRow("after all others") << Misuse(addRawAfterAllOthersWereLookedAt);
    QTest::newRow("all others are gone") << Misuse(addRawAfterAllOthersWereDestroyed);
    QTest::newRow("moved to a thread") << Misuse(addRawAndMoveToAThread);
    QTest::newRow("in a thread") << Misuse(addRawInAThreadWithAnEventLoop);
}

void tst_ChildChecks::aRawSignalTransitionIsFoundAmongManyStates()
{
    QFETCH(Misuse, misuse);
    if (isChildProcess()) {
        Emitter emitter;
        misuse(emitter);
        return;
    }

    const ChildResult child = runAsChild(QStringLiteral("%1:%2").arg(
        QLatin1String(QTest::currentTestFunction()), QLatin1String(QTest::currentDataTag())));

    QVERIFY2(child.crashed, qPrintable(child.output));
    QVERIFY2(child.output.contains("Raw QSignalTransition usage detected!"),
             qPrintable(child.output));
}

void tst_ChildChecks::properTransitionsOfManyStatesPass()
{
    Emitter emitter;
    const States states = statesWithChildren(emitter);

    settle();

    QCOMPARE(states.back()->transitions().size(), 1);
}

void tst_ChildChecks::statesMayBeDestroyedBeforeTheyAreLookedAt()
{
    Emitter emitter;
    States states = statesWithChildren(emitter);
    states.erase(states.begin() + 1, states.begin() + 4);
    const States later = statesWithChildren(emitter);

    settle();

    QCOMPARE(states.size() + later.size(), std::size_t(2 + stateCount));
}

void tst_ChildChecks::statesMayMoveToAnotherThread()
{
    Emitter emitter;
    States states = statesWithChildren(emitter);
    QThread thread;

    states.at(2)->moveToThread(&thread);
    states.erase(states.begin() + 2); // of a thread that does not run, so that any may destroy it
    settle();

    QCOMPARE(states.size(), std::size_t(stateCount - 1));
}

void tst_ChildChecks::statesMayMoveWhenTheyHaveBeenLookedAt()
{
    Emitter emitter;
    States states = statesWithChildren(emitter);
    settle();
    QThread thread;

    states.at(2)->moveToThread(&thread);

    QCOMPARE(states.at(2)->thread(), &thread);
}

void tst_ChildChecks::statesMayOutliveTheirThread()
{
    Emitter emitter;
    States states;
    runInAThread([&] {
        states = statesWithChildren(emitter);
        states.erase(states.begin() + 1);
    });
    const States ours = statesWithChildren(emitter);

    states.clear();
    settle();

    QCOMPARE(ours.size(), std::size_t(stateCount));
}

QTEST_GUILESS_MAIN(tst_ChildChecks)
#include "tst_childchecks.moc"
