#include "driving.h"
#include "librarytest.h"
#include "metadescription.h"
#include "recordingviewstatetarget.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QRegularExpression>
#include <QStateMachine>
#include <QtTest>

using namespace HmiStateMachine;

namespace {

const QString initialStateSet = "warning setInitialState: Please use setInitialHmiState instead";
const QString initialStateAsked = "warning initialState: Please use initialHmiState instead";
const QString popupRefused =
    "warning setInitialHmiState: Setting an initial PopupState is not supported using "
    "setInitialHmiState.\n Please consider making a popup request on state entry.";

/** The names of all registered states, sorted. */
QStringList registeredNames()
{
    QStringList names;
    const auto states = NamedState::namedStates();
    for (const NamedState *state : states) {
        names.append(state->name());
    }
    names.sort();
    return names;
}

/** The names of the active states, sorted. */
QStringList activeNames(const QStateMachine &machine)
{
    QStringList names;
    const auto states = machine.configuration();
    for (const QAbstractState *state : states) {
        const auto *named = qobject_cast<const NamedState *>(state);
        names.append(named ? named->name() : QString("not named"));
    }
    names.sort();
    return names;
}

} // namespace

class tst_HmiLayeredState : public LibraryTest
{
    Q_OBJECT

private Q_SLOTS:
    void itAddsNothingToTheMetaObject();
    void itBuildsTwoLayers();
    void theLayersAreOwnedThroughTheState();
    void onlyTheStateAndItsPopupLayerAreRegistered();
    void twoLayeredStatesDoNotCollide();
    void aCollisionOfTheNameReachesThePopupLayer();
    void aRenameLeavesThePopupLayerAlone();
    void aNamedChildLandsInTheExclusiveLayer();
    void aChildOfAnotherKindStaysWhereItIsMade();
    void popupsLandInThePopupLayer();
    void aNestedLayeredStateLandsInTheExclusiveLayer();
    void theInitialStateIsThatOfTheExclusiveLayer();
    void noInitialStateAtFirst();
    void aPopupIsRefusedAsInitialState();
    void aPopupAmongTheScreensIsRefusedAsInitialState();
    void aPopupIsRefusedThroughTheOtherSetterToo();
    void aStateFromElsewhereIsRefusedAsInitialState();
    void theInitialStateMayBeTakenBack();
    void settingTheInitialStateWarnsAndForwards();
    void askingForTheInitialStateWarnsAndForwards();
    void withWarningsOffTheCallsStillForward();
    void bothLayersAreEnteredInParallel();
    void aNestedLayeredStateRunsItsOwnLayers();
    void theMachineNeverAsksInTheDiscouragedWay();
    void aScreenChangeLeavesThePopupLayerAlone();
    void leavingTheStateLeavesBothLayers();
    void itIsEnteredAgainInItsInitialState();
    void aRequestFromOutsideEntersBothLayers();
};

void tst_HmiLayeredState::itAddsNothingToTheMetaObject()
{
    QCOMPARE(metaDescription(HmiLayeredState::staticMetaObject), QStringList());
    QCOMPARE(HmiLayeredState::staticMetaObject.superClass(), &HmiState::staticMetaObject);
    QCOMPARE(QByteArray(HmiLayeredState::staticMetaObject.className()),
             QByteArray("HmiStateMachine::HmiLayeredState"));
}

void tst_HmiLayeredState::itBuildsTwoLayers()
{
    const HmiLayeredState state("Layers");

    QCOMPARE(state.childMode(), QState::ParallelStates);
    QCOMPARE(state.findChildren<QState *>(QString(), Qt::FindDirectChildrenOnly).size(), 2);
    const HmiState *exclusive = state.exclusiveState();
    QCOMPARE(exclusive->name(), QString("Exclusive"));
    QCOMPARE(exclusive->childMode(), QState::ExclusiveStates);
    const auto *internal = qobject_cast<HmiState *>(exclusive->parentState());
    QVERIFY(internal);
    QCOMPARE(internal->name(), QString("Internal"));
    QCOMPARE(internal->parentState(), &state);
    QCOMPARE(internal->childMode(), QState::ExclusiveStates);
    QCOMPARE(internal->initialState(), exclusive);
    QCOMPARE(state.popupState()->name(), QString("Layers_PopupRootState"));
    QCOMPARE(state.popupState()->parentState(), &state);
}

void tst_HmiLayeredState::theLayersAreOwnedThroughTheState()
{
    QPointer<HmiState> exclusive;
    QPointer<PopupRootState> popups;
    {
        const HmiLayeredState state("Layers");
        exclusive = state.exclusiveState();
        popups = state.popupState();
        QVERIFY(exclusive && popups);
    }

    QVERIFY(!exclusive);
    QVERIFY(!popups);
    QCOMPARE(registeredNames(), QStringList());
}

void tst_HmiLayeredState::onlyTheStateAndItsPopupLayerAreRegistered()
{
    const HmiLayeredState state("Layers");

    QCOMPARE(registeredNames(),
             QStringList({"Layers", "Layers_PopupRootState", "Layers_PopupRootState_NONEPOPUP"}));
    QCOMPARE(NamedState::stateForName("Layers_PopupRootState"), state.popupState());
    QVERIFY(!NamedState::stateForName("Internal"));
    QVERIFY(!NamedState::stateForName("Exclusive"));
}

void tst_HmiLayeredState::twoLayeredStatesDoNotCollide()
{
    QState parent;
    const auto *first = new HmiLayeredState("A", &parent);
    const auto *second = new HmiLayeredState("B", &parent);

    QCOMPARE(first->popupState()->name(), QString("A_PopupRootState"));
    QCOMPARE(second->popupState()->name(), QString("B_PopupRootState"));
    QVERIFY(first->exclusiveState() != second->exclusiveState());
    QCOMPARE(messages().take(), QStringList());
}

void tst_HmiLayeredState::aCollisionOfTheNameReachesThePopupLayer()
{
    HmiLayeredState first("Layers");

    const HmiLayeredState second("Layers");

    QCOMPARE(second.name(), QString());
    QCOMPARE(second.popupState()->name(), QString());
    QCOMPARE(second.exclusiveState()->name(), QString("Exclusive"));
    QCOMPARE(NamedState::stateForName("Layers"), &first);
    const QStringList names = {"Layers", "Layers_PopupRootState",
                               "Layers_PopupRootState_NONEPOPUP"};
    const QStringList warnings = messages().take();
    QCOMPARE(warnings.size(), 3);
    for (int i = 0; i < names.size(); ++i) {
        QVERIFY(warnings.at(i).contains("Name: \\\"" + names.at(i) + "\\\"\\n"));
    }
}

void tst_HmiLayeredState::aRenameLeavesThePopupLayerAlone()
{
    HmiLayeredState state("Layers");

    state.setName("Renamed");

    QCOMPARE(state.popupState()->name(), QString("Layers_PopupRootState"));
    QCOMPARE(NamedState::stateForName("Renamed"), &state);
}

void tst_HmiLayeredState::aNamedChildLandsInTheExclusiveLayer()
{
    HmiLayeredState state("Layers");

    const auto *screen = new HmiState("Screen", &state);
    const auto *view = new HmiViewState("View", &state);

    QCOMPARE(screen->parent(), state.exclusiveState());
    QCOMPARE(view->parent(), state.exclusiveState());
    QCOMPARE(view->parentState(), state.exclusiveState());
}

void tst_HmiLayeredState::aChildOfAnotherKindStaysWhereItIsMade()
{
    HmiLayeredState state("Layers");

    const auto *unnamed = new HmiState(&state);
    const auto *named = new NamedState("Named", &state);
    const auto *plain = new QState(&state);

    QCOMPARE(unnamed->parent(), &state);
    QCOMPARE(named->parent(), &state);
    QCOMPARE(plain->parent(), &state);
}

void tst_HmiLayeredState::popupsLandInThePopupLayer()
{
    HmiLayeredState state("Layers");

    const auto *popup = new PopupState("layers/fuel", &state, 3);

    QCOMPARE(popup->parentState(), state.popupState());
    QCOMPARE(popup->rootPopupState(), state.popupState());
}

void tst_HmiLayeredState::aNestedLayeredStateLandsInTheExclusiveLayer()
{
    HmiLayeredState outer("Outer");

    auto *inner = new HmiLayeredState("Inner", &outer);
    const auto *screen = new HmiState("Screen", inner);

    QCOMPARE(inner->parentState(), outer.exclusiveState());
    QCOMPARE(screen->parentState(), inner->exclusiveState());
    QCOMPARE(inner->popupState()->parentState(), inner);
    QCOMPARE(inner->popupState()->name(), QString("Inner_PopupRootState"));
}

void tst_HmiLayeredState::theInitialStateIsThatOfTheExclusiveLayer()
{
    HmiLayeredState state("Layers");
    auto *first = new HmiState("First", &state);
    auto *second = new HmiState("Second", &state);

    state.setInitialHmiState(first);
    QCOMPARE(state.initialHmiState(), first);
    static_cast<HmiState &>(state).setInitialHmiState(second);

    QCOMPARE(state.initialHmiState(), second);
    QCOMPARE(state.exclusiveState()->initialState(), second);
    QVERIFY(!state.QState::initialState());
    QCOMPARE(messages().take(), QStringList());
}

void tst_HmiLayeredState::noInitialStateAtFirst()
{
    const HmiLayeredState state("Layers");

    QVERIFY(!state.initialHmiState());
}

void tst_HmiLayeredState::aPopupIsRefusedAsInitialState()
{
    HmiLayeredState state("Layers");
    auto *screen = new HmiState("Screen", &state);
    state.setInitialHmiState(screen);
    auto *popup = new PopupState("layers/refused", &state, 3);

    state.setInitialHmiState(popup);

    QCOMPARE(messages().take(), QStringList(popupRefused));
    QCOMPARE(state.initialHmiState(), screen);
    QCOMPARE(state.popupState()->initialState(), state.popupState()->noPopupState());
}

// There Qt itself would take it.
void tst_HmiLayeredState::aPopupAmongTheScreensIsRefusedAsInitialState()
{
    HmiLayeredState state("Layers");
    auto *screen = new HmiState("Screen", &state);
    state.setInitialHmiState(screen);
    auto *popup = new PopupState("layers/moved", 3);
    popup->setParent(state.exclusiveState());

    state.setInitialHmiState(popup);

    QCOMPARE(messages().take(), QStringList(popupRefused));
    QCOMPARE(state.initialHmiState(), screen);
}

void tst_HmiLayeredState::aPopupIsRefusedThroughTheOtherSetterToo()
{
    HmiLayeredState state("Layers");
    auto *popup = new PopupState("layers/forwarded", &state, 3);

    state.setInitialState(popup);

    QCOMPARE(messages().take(), QStringList({initialStateSet, popupRefused}));
    QVERIFY(!state.initialHmiState());
}

void tst_HmiLayeredState::aStateFromElsewhereIsRefusedAsInitialState()
{
    HmiLayeredState state("Layers");
    auto *screen = new HmiState("Screen", &state);
    auto *unnamed = new HmiState(&state);
    state.setInitialHmiState(screen);

    for (QState *other : {unnamed, state.exclusiveState()}) {
        QTest::ignoreMessage(QtWarningMsg,
                             QRegularExpression("^QState::setInitialState: state .* is not a child "
                                                "of this state"));
        state.setInitialHmiState(other);
    }

    QCOMPARE(state.initialHmiState(), screen);
}

void tst_HmiLayeredState::theInitialStateMayBeTakenBack()
{
    HmiLayeredState state("Layers");
    state.setInitialHmiState(new HmiState("Screen", &state));

    state.setInitialHmiState(nullptr);

    QVERIFY(!state.initialHmiState());
    QCOMPARE(messages().take(), QStringList());
}

void tst_HmiLayeredState::settingTheInitialStateWarnsAndForwards()
{
    HmiLayeredState state("Layers");
    auto *screen = new HmiState("Screen", &state);

    state.setInitialState(screen);
    QCOMPARE(messages().take(), QStringList(initialStateSet));
    QCOMPARE(state.initialHmiState(), screen);

    static_cast<NamedState &>(state).setInitialState(nullptr);
    QCOMPARE(messages().take(), QStringList(initialStateSet));
    QVERIFY(!state.initialHmiState());
}

void tst_HmiLayeredState::askingForTheInitialStateWarnsAndForwards()
{
    HmiLayeredState state("Layers");
    auto *screen = new HmiState("Screen", &state);
    state.setInitialHmiState(screen);

    QCOMPARE(state.initialState(), screen);
    QCOMPARE(static_cast<NamedState &>(state).initialState(), screen);

    const auto taken = messages().takeMessages();
    QCOMPARE(taken.size(), 2);
    for (const Message &message : taken) {
        QCOMPARE(message.toString(), initialStateAsked);
        QCOMPARE(message.category, QString("vosk.hmistatemachine"));
        QVERIFY(message.file.endsWith("hmilayeredstate.cpp"));
    }
}

void tst_HmiLayeredState::withWarningsOffTheCallsStillForward()
{
    HmiLayeredState state("Layers");
    auto *screen = new HmiState("Screen", &state);
    messages().disableWarnings();

    state.setInitialState(screen);
    state.setInitialHmiState(new PopupState("layers/quiet", &state, 3));

    QCOMPARE(state.initialState(), screen);
}

void tst_HmiLayeredState::bothLayersAreEnteredInParallel()
{
    QStateMachine machine;
    auto *state = new HmiLayeredState("Layers", &machine);
    state->setInitialHmiState(new HmiState("Screen", state));
    NamedState::setLoggingEnabled(true);
    messages().enableDebug();

    startIn(machine, state);

    const QString entering = "debug onEntry: Entering state: \"Unnamed->Layers";
    const QString popups = "->Layers_PopupRootState";
    QCOMPARE(messages().take(),
             QStringList({entering + '"', entering + "->Internal\"",
                          entering + "->Internal->Exclusive\"",
                          entering + "->Internal->Exclusive->Screen\"", entering + popups + '"',
                          entering + popups + popups + "_NONEPOPUP\""}));
}

void tst_HmiLayeredState::aNestedLayeredStateRunsItsOwnLayers()
{
    QStateMachine machine;
    auto *outer = new HmiLayeredState("Outer", &machine);
    auto *inner = new HmiLayeredState("Inner", outer);
    outer->setInitialHmiState(inner);
    inner->setInitialHmiState(new HmiState("Screen", inner));

    startIn(machine, outer);

    QCOMPARE(activeNames(machine),
             QStringList({"Exclusive", "Exclusive", "Inner", "Inner_PopupRootState",
                          "Inner_PopupRootState_NONEPOPUP", "Internal", "Internal", "Outer",
                          "Outer_PopupRootState", "Outer_PopupRootState_NONEPOPUP", "Screen"}));
}

void tst_HmiLayeredState::theMachineNeverAsksInTheDiscouragedWay()
{
    QStateMachine machine;
    auto *state = new HmiLayeredState("Layers", &machine);
    auto *screen = new HmiState("Screen", state);
    state->setInitialHmiState(screen);
    auto *elsewhere = new HmiState("Elsewhere", &machine);
    (new HmiTransition("go", screen))->setTargetState(elsewhere);
    (new HmiTransition("return", elsewhere))->setTargetState(state);
    startIn(machine, state);

    machine.postEvent(new HmiEvent("go", QVariant()));
    machine.postEvent(new HmiEvent("return", QVariant()));
    settle();

    QVERIFY(screen->isActive());
    QCOMPARE(messages().take(), QStringList());
}

void tst_HmiLayeredState::aScreenChangeLeavesThePopupLayerAlone()
{
    Journal journal;
    RecordingViewStateTarget target(journal);
    QStateMachine machine;
    auto *state = new HmiLayeredState("Layers", &machine);
    auto *home = new HmiViewState("Home", state);
    auto *radio = new HmiViewState("Radio", state);
    state->setInitialHmiState(home);
    (new HmiTransition("go", home))->setTargetState(radio);
    auto *popup = new PopupState("layers/stays", state, 3);
    startIn(machine, state);
    machine.postEvent(new PopupEvent("layers/stays", QVariant()));
    settle();
    QCOMPARE(messages().take().size(), 1);
    journal.clear();

    machine.postEvent(new HmiEvent("go", QVariant()));
    settle();

    QVERIFY(popup->isActive());
    QVERIFY(radio->isActive());
    QCOMPARE(journal.lines(), QStringList({"deactivateView Home", "activateView Radio"}));
}

void tst_HmiLayeredState::leavingTheStateLeavesBothLayers()
{
    QStateMachine machine;
    auto *state = new HmiLayeredState("Layers", &machine);
    auto *screen = new HmiState("Screen", state);
    state->setInitialHmiState(screen);
    auto *elsewhere = new HmiState("Elsewhere", &machine);
    (new HmiTransition("go", state))->setTargetState(elsewhere);
    startIn(machine, state);
    QVERIFY(state->popupState()->isActive());

    machine.postEvent(new HmiEvent("go", QVariant()));
    settle();

    QCOMPARE(activeNames(machine), QStringList("Elsewhere"));
    QVERIFY(!state->isActive());
    QVERIFY(!state->exclusiveState()->isActive());
    QVERIFY(!state->popupState()->isActive());
}

void tst_HmiLayeredState::itIsEnteredAgainInItsInitialState()
{
    QStateMachine machine;
    auto *state = new HmiLayeredState("Layers", &machine);
    auto *first = new HmiState("First", state);
    auto *second = new HmiState("Second", state);
    state->setInitialHmiState(first);
    auto *elsewhere = new HmiState("Elsewhere", &machine);
    (new HmiTransition("next", first))->setTargetState(second);
    (new HmiTransition("go", state))->setTargetState(elsewhere);
    (new HmiTransition("return", elsewhere))->setTargetState(state);
    startIn(machine, state);

    for (const QString name : {"next", "go", "return"}) {
        machine.postEvent(new HmiEvent(name, QVariant()));
    }
    settle();

    QVERIFY(first->isActive());
    QVERIFY(state->popupState()->noPopupState()->isActive());
}

void tst_HmiLayeredState::aRequestFromOutsideEntersBothLayers()
{
    QStateMachine machine;
    auto *state = new HmiLayeredState("Layers", &machine);
    state->setInitialHmiState(new HmiState("First", state));
    auto *second = new HmiState("Second", state);
    auto *elsewhere = new HmiState("Elsewhere", &machine);
    (new HmiTransition("go", elsewhere))->setTargetState(second);
    startIn(machine, elsewhere);

    machine.postEvent(new HmiEvent("go", QVariant()));
    settle();

    QCOMPARE(activeNames(machine),
             QStringList({"Exclusive", "Internal", "Layers", "Layers_PopupRootState",
                          "Layers_PopupRootState_NONEPOPUP", "Second"}));
}

QTEST_GUILESS_MAIN(tst_HmiLayeredState)
#include "tst_hmilayeredstate.moc"
