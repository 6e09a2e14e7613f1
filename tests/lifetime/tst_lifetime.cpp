#include "driving.h"
#include "household.h"
#include "librarytest.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QDateTime>
#include <QtTest>

#include <cstdio>

using namespace HmiStateMachine;

/** Trees that are taken apart in an order drawn by lot, while they run and afterwards. */
class tst_Lifetime : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void nothingIsLeftOfAHousehold_data();
    void nothingIsLeftOfAHousehold();
    void aHouseholdIsAlive();
};

namespace {

constexpr int defaultSeeds = 400;
constexpr int defaultSteps = 100;
constexpr int longLife = 5000;

int numberOfSeeds()
{
    bool set = false;
    const int seeds = qEnvironmentVariableIntValue("HMI_LIFETIME_SEEDS", &set);
    return set ? seeds : defaultSeeds;
}

bool serves(StateMachine *machine)
{
    auto *here = new NamedState(QStringLiteral("here"), machine);
    auto *there = new NamedState(QStringLiteral("there"), machine);
    (new HmiTransition(QStringLiteral("on"), here))->setTargetState(there);
    startIn(*machine, here);
    machine->postEvent(new HmiEvent(QStringLiteral("on"), QVariant()));
    settle();
    const bool arrived = there->isActive() && !here->isActive();
    park(*machine);
    delete here;
    delete there;
    return arrived;
}

QString leftOver()
{
    if (!NamedState::namedStates().isEmpty()) {
        return QStringLiteral("a registered state");
    }
    if (!NamedTargetTransitionBase::triggeringTransition().isEmpty()) {
        return QStringLiteral("a firing transition");
    }
    if (HmiViewState::activeViewState()) {
        return QStringLiteral("an active view");
    }
    if (PopupState::getActivePopupState()) {
        return QStringLiteral("an active popup");
    }
    return serves(StateMachine::instance()) ? QString() : QStringLiteral("a machine out of order");
}

QString live(quint32 seed, int steps)
{
    Household household(seed, seed % 3 == 0);
    for (int i = 0; i < steps; ++i) {
        household.step();
    }
    household.takeDown();
    return leftOver();
}

} // namespace

void tst_Lifetime::nothingIsLeftOfAHousehold_data()
{
    QTest::addColumn<quint32>("first");
    QTest::addColumn<int>("count");

    const QByteArray chosen = qgetenv("HMI_RANDOM_SEED");
    if (!chosen.isEmpty()) {
        QTest::newRow("seed " + chosen) << chosen.toUInt() << 1;
        return;
    }
    const auto now = static_cast<quint32>(QDateTime::currentSecsSinceEpoch());
    QTest::newRow("the same seeds each time") << 1u << numberOfSeeds() / 2;
    QTest::addRow("seeds of the clock from %u", now) << now << numberOfSeeds() / 2;
}

// The seed is told before it is tried, in case the process does not live to tell it afterwards.
void tst_Lifetime::nothingIsLeftOfAHousehold()
{
    QFETCH(quint32, first);
    QFETCH(int, count);

    for (quint32 seed = first; seed < first + quint32(count); ++seed) {
        std::fprintf(stderr, "HMI_RANDOM_SEED=%u\r", seed);
        const QString left = live(seed, numberOfSteps(defaultSteps));
        messages().take();
        QVERIFY2(
            left.isEmpty(),
            qPrintable(QStringLiteral("%1 is left with HMI_RANDOM_SEED=%2").arg(left).arg(seed)));
    }
}

// What never happens is not tested by its end.
void tst_Lifetime::aHouseholdIsAlive()
{
    Household household(1, false);
    for (int i = 0; i < longLife; ++i) {
        household.step();
    }
    messages().take();

    for (const char *operation :
         {"activateView", "deactivateView", "requestPopupShow", "requestPopupHide", "stackPopup",
          "updatePopupData", "retryBlockedPopup", "releaseBlockedPopups",
          "postFollowOnBackEvent"}) {
        QVERIFY2(household.calls().value(operation) > 0, operation);
    }
}

QTEST_GUILESS_MAIN(tst_Lifetime)
#include "tst_lifetime.moc"
