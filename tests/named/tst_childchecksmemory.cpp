#include "librarytest.h"

#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/namedstate.h>

#include <QtTest>

#include <malloc.h>

using namespace HmiStateMachine;

namespace {

// States that go before the event loop has looked at their children.
void makeAndDestroyStates(int count)
{
    for (int i = 0; i < count; ++i) {
        NamedState state;
        new HmiTransition(QStringLiteral("go"), &state);
    }
}

size_t bytesInUse()
{
    const struct mallinfo2 info = mallinfo2();
    return info.uordblks + info.hblkhd; // large blocks are counted apart
}

} // namespace

/** What is noted to be looked at later must not grow with states that are gone by then. */
class tst_ChildChecksMemory : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void statesThatComeAndGoTakeNoMemory();
};

void tst_ChildChecksMemory::statesThatComeAndGoTakeNoMemory()
{
    constexpr int rounds = 20000;
    makeAndDestroyStates(10); // what is made once only
    const size_t before = bytesInUse();

    makeAndDestroyStates(rounds);

    const size_t after = bytesInUse();
    QVERIFY2(after < before + rounds, qPrintable(QString::number(after - before)));
}

QTEST_GUILESS_MAIN(tst_ChildChecksMemory)
#include "tst_childchecksmemory.moc"
