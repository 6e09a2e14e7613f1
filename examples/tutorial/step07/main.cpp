#include "printing.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
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
    volume->setAutoDismissTimeoutInterval(3000);
    volume->setAutoDismissTimeoutActive(true);
    new PopupState("phone/call", screens, 0);
}

static void callAndVolume()
{
    request("A call comes in.", new PopupEvent("phone/call", "Office"));
    request("Louder.", new PopupEvent("audio/volume", 12));
    request("The volume is dismissed.", new PopupEvent("audio/volume_Dismiss", QVariant()));
    request("The call is taken.", new PopupEvent("phone/call_Dismiss", QVariant()));
}

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QLoggingCategory::setFilterRules("*.debug=false");
    PrintingViewLayer viewLayer;
    buildFlow();
    StateMachine::instance()->start();
    QCoreApplication::sendPostedEvents();

    say("--- Without rules");
    callAndVolume();

    say("--- With rules");
    PopupInterruptionStore::instance()->loadInterruptionBehaviors(RULES_FILE);
    callAndVolume();

    say("--- The other way round");
    request("Louder.", new PopupEvent("audio/volume", 13));
    request("A call comes in.", new PopupEvent("phone/call", "Garage"));
    request("The call is taken.", new PopupEvent("phone/call_Dismiss", QVariant()));
}
