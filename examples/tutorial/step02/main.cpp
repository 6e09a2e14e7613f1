#include "printing.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>

#include <QLoggingCategory>

using namespace HmiStateMachine;

static void buildFlow()
{
    StateMachine *machine = StateMachine::instance();
    machine->setInitialState(new HmiViewState("Home", machine));
    new HmiViewState("Radio", machine);
}

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QLoggingCategory::setFilterRules("*.debug=false");
    PrintingViewLayer viewLayer;
    buildFlow();

    say("The machine starts.");
    StateMachine::instance()->start();
    QCoreApplication::sendPostedEvents();

    request("The user asks for the radio.", new HmiViewEvent("Radio", QVariant()));
    request("And for the home screen.", new HmiViewEvent("Home", QVariant()));
}
