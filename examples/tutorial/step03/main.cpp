#include "printing.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>

#include <QLoggingCategory>

using namespace HmiStateMachine;

static void buildFlow()
{
    StateMachine *machine = StateMachine::instance();
    machine->setInitialState(new HmiViewState("Home", machine));
    auto *radio = new HmiViewState("Radio", machine);
    QObject::connect(radio, &HmiViewState::alreadyActive, radio,
                     [] { say("  the radio is there"); });
}

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QLoggingCategory::setFilterRules("*.debug=false");
    PrintingViewLayer viewLayer;
    buildFlow();
    StateMachine::instance()->start();
    QCoreApplication::sendPostedEvents();

    request("A station is asked for.", new HmiViewEvent("Radio", "Bay Jazz"));
    request("Another one is asked for.", new HmiViewEvent("Radio", "City News"));
    request("Home.", new HmiViewEvent("Home", QVariant()));
    request("The other one again.", new HmiViewEvent("Radio", "City News"));
    request("A view that is not there is asked for.", new HmiViewEvent("Rdaio", "Bay Jazz"));
}
