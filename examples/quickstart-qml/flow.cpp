#include "flow.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupstate.h>

using namespace HmiStateMachine;

void buildFlow()
{
    auto *layers = new NamedState("Layers", QState::ParallelStates, StateMachine::instance());
    StateMachine::instance()->setInitialState(layers);

    auto *screens = new HmiLayeredState("Screens", layers);
    screens->setInitialHmiState(new HmiViewState("Home", screens));
    (new HmiViewState("Stations", screens))->setHandlesBackEvent(true);
    (new HmiViewState("Radio", screens))->setHandlesBackEvent(true);
    new PopupState("TurnOff", screens, 0);

    auto *volume = new PopupState("Volume", new HmiLayeredState("Overlays", layers), 0);
    volume->setAutoDismissTimeoutInterval(3000);
    volume->setAutoDismissTimeoutActive(true);
}
