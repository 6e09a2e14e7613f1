#include "printing.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupstate.h>

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

    auto *volume = new PopupState("audio/volume", screens, 0);
    volume->setAutoDismissTimeoutInterval(300);
    volume->setAutoDismissTimeoutActive(true);
}

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QLoggingCategory::setFilterRules("*.debug=false");
    PrintingViewLayer viewLayer;
    buildFlow();
    StateMachine::instance()->start();
    QCoreApplication::sendPostedEvents();

    request("Louder.", new PopupEvent("audio/volume", 12));
    request("Louder.", new PopupEvent("audio/volume", 13));
    request("The radio.", new HmiViewEvent("Radio", "Bay Jazz"));
    request("Away with the popup.", new PopupEvent("audio/volume_Dismiss", QVariant()));

    request("Louder.", new PopupEvent("audio/volume", 14));
    say("Nobody does anything.");
    auto *volume = PopupState::stateForTarget("audio/volume");
    QObject::connect(volume, &QState::exited, &app, &QCoreApplication::quit);
    return app.exec();
}
