#include "printing.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>

#include <QLoggingCategory>

using namespace HmiStateMachine;

static void buildFlow()
{
    StateMachine *machine = StateMachine::instance();
    auto *screens = new HmiLayeredState("Screens", machine);
    machine->setInitialState(screens);
    auto *home = new HmiViewState("Home", screens);
    screens->setInitialHmiState(home);
    (new HmiViewState("Radio", screens))->setHandlesBackEvent(true);
    (new HmiViewState("Stations", screens))->setHandlesBackEvent(true);
    (new HmiViewState("Settings", screens))->createDirectBackTransition(home);
}

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QLoggingCategory::setFilterRules("*.debug=false\nvosk.hmistatemachine.debug=true");
    NamedState::setLoggingEnabled(true);
    PrintingViewLayer viewLayer;
    buildFlow();
    StateMachine::instance()->start();
    QCoreApplication::sendPostedEvents();

    request("The radio.", new HmiViewEvent("Radio", "Bay Jazz"));
}
