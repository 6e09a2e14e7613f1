#include "printing.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>

#include <QLoggingCategory>

using namespace HmiStateMachine;

static void buildFlow()
{
    StateMachine *machine = StateMachine::instance();
    auto *home = new HmiViewState("Home", machine);
    machine->setInitialState(home);
    (new HmiViewState("Radio", machine))->setHandlesBackEvent(true);
    (new HmiViewState("Stations", machine))->setHandlesBackEvent(true);
    (new HmiViewState("Settings", machine))->createDirectBackTransition(home);
}

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QLoggingCategory::setFilterRules("*.debug=false");
    PrintingViewLayer viewLayer;
    buildFlow();
    StateMachine::instance()->start();
    QCoreApplication::sendPostedEvents();

    request("The radio.", new HmiViewEvent("Radio", "Bay Jazz"));
    request("Its stations.", new HmiViewEvent("Stations", QVariant()));
    request("Back.", new HmiBackEvent(1, QString()));
    request("The stations again.", new HmiViewEvent("Stations", QVariant()));
    request("Back, two steps.", new HmiBackEvent(2, QString()));
    request("Back from the home screen.", new HmiBackEvent(1, QString()));
    request("The stations.", new HmiViewEvent("Stations", QVariant()));
    request("From there the settings.", new HmiViewEvent("Settings", QVariant()));
    request("Back.", new HmiBackEvent(1, QString()));
}
