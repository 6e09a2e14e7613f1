#include "contest.h"
#include "contestant.h"
#include "librarytest.h"

#include <HmiStateMachine/named/namedstate.h>

#include <QtTest>

#include <thread>

using namespace HmiStateMachine;

class tst_RegistryThreads : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void eachNameHasOneHolderWhateverTheThreadsDo();
};

void tst_RegistryThreads::eachNameHasOneHolderWhateverTheThreadsDo()
{
    const CollisionCounter counter;
    Contest contest;

    // Not QThread, whose end the thread sanitizer cannot see.
    std::vector<std::thread> threads;
    for (int number = 0; number < 8; ++number) {
        threads.emplace_back([&contest, number] { Contestant(contest, number).run(); });
    }
    for (std::thread &thread : threads) {
        thread.join();
    }

    QCOMPARE(contest.faults(), 0);
    QCOMPARE(NamedState::namedStates().size(), 0);
    QCOMPARE(CollisionCounter::collisions(), contest.losses());
    QVERIFY2(contest.wins() > 1000, qPrintable(QString::number(contest.wins())));
    QVERIFY2(contest.losses() > 100, qPrintable(QString::number(contest.losses())));
}

QTEST_GUILESS_MAIN(tst_RegistryThreads)
#include "tst_registrythreads.moc"
