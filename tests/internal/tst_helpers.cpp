#include "librarytest.h"

#include <HmiStateMachine/hmi/hmistate.h>
#include <HmiStateMachine/internal/helpers.h>
#include <HmiStateMachine/named/namedstate.h>

#include <QtTest>

using namespace HmiStateMachine;

class tst_Helpers : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void aNamedStateHasItsName();
    void aStateDerivedFromANamedOneHasItsName();
    void aNameOutOfTheRegistryCountsToo();
    void theNameIsThePresentOne();
    void aStateThatLostItsNameHasNone();
    void aPlainStateHasNoNameWhateverItsObjectName();
    void noStateHasNoName();
};

void tst_Helpers::aNamedStateHasItsName()
{
    NamedState state("Radio");

    QCOMPARE(Helpers::stateName(&state), QString("Radio"));
}

void tst_Helpers::aStateDerivedFromANamedOneHasItsName()
{
    HmiState state("Map");

    QCOMPARE(Helpers::stateName(&state), QString("Map"));
}

void tst_Helpers::aNameOutOfTheRegistryCountsToo()
{
    NamedState state;
    state.setNameNonHashing("Shared");

    QCOMPARE(Helpers::stateName(&state), QString("Shared"));
}

void tst_Helpers::theNameIsThePresentOne()
{
    NamedState state("Before");
    state.setName("After");

    QCOMPARE(Helpers::stateName(&state), QString("After"));
}

void tst_Helpers::aStateThatLostItsNameHasNone()
{
    messages().disableWarnings();
    NamedState first("Contested");
    NamedState second("Contested");

    QCOMPARE(Helpers::stateName(&first), QString("Contested"));
    QCOMPARE(Helpers::stateName(&second), QString());
}

void tst_Helpers::aPlainStateHasNoNameWhateverItsObjectName()
{
    QState state;
    state.setObjectName("Radio");

    QCOMPARE(Helpers::stateName(&state), QString());
}

void tst_Helpers::noStateHasNoName()
{
    QCOMPARE(Helpers::stateName(nullptr), QString());
}

QTEST_GUILESS_MAIN(tst_Helpers)
#include "tst_helpers.moc"
