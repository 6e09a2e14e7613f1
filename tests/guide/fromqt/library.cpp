// The same on the library; the view layer is that of the tutorial.

#include "printing.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>

#include <QLoggingCategory>

using namespace HmiStateMachine;

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QLoggingCategory::setFilterRules("*.debug=false");
    PrintingViewLayer viewLayer;
    StateMachine *machine = StateMachine::instance();
    machine->setInitialState(new HmiViewState("Home", machine));
    (new HmiViewState("Radio", machine))->setHandlesBackEvent(true);
    (new HmiViewState("Stations", machine))->setHandlesBackEvent(true);
    machine->start();
    QCoreApplication::sendPostedEvents();

    request("The radio.", new HmiViewEvent("Radio", "Bay Jazz"));
    request("Its stations.", new HmiViewEvent("Stations", QVariant()));
    request("Back.", new HmiBackEvent(1, QString()));
    request("Back.", new HmiBackEvent(1, QString()));
    request("Back.", new HmiBackEvent(1, QString()));
}
