#include "hardkeys.h"
#include "printing.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QLoggingCategory>

using namespace HmiStateMachine;

static bool s_driving = false; // a signal of the vehicle, in earnest

static void buildFlow(HardKeys *keys)
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
    PopupInterruptionStore::instance()->loadInterruptionBehaviors(RULES_FILE);

    auto *homeKey = new KeySignalTransition(keys, SIGNAL(changed(int, int)), HardKeys::Home,
                                            HardKeys::Pressed, screens);
    QObject::connect(homeKey, &KeySignalTransition::keyTransitionTriggered, machine,
                     [machine] { machine->postEvent(new HmiViewEvent("Home", QVariant())); });
    auto *louderKey = new KeySignalTransition(keys, SIGNAL(changed(int, int)), HardKeys::Louder,
                                              HardKeys::Pressed, screens);
    QObject::connect(louderKey, &KeySignalTransition::keyTransitionTriggered, machine,
                     [machine] { machine->postEvent(new PopupEvent("audio/volume", 12)); });

    auto *toVideo = new HmiTransition("video", screens);
    toVideo->setTargetState(new HmiViewState("Video", screens));
    QObject::connect(toVideo, &GuardedTransition::transitionTest, toVideo,
                     [toVideo] { toVideo->setAllowTransition(!s_driving); });
    QObject::connect(toVideo, &GuardedTransition::testFailed, toVideo,
                     [] { say("  not while driving"); });
}

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QLoggingCategory::setFilterRules("*.debug=false");
    PrintingViewLayer viewLayer;
    HardKeys keys;
    buildFlow(&keys);
    StateMachine::instance()->start();
    QCoreApplication::sendPostedEvents();

    s_driving = true;
    request("A film, on the way.", new HmiEvent("video", QVariant()));
    s_driving = false;
    request("A film, in the car park.", new HmiEvent("video", QVariant()));
    request("Home.", new HmiViewEvent("Home", QVariant()));
    s_driving = true;
    request("The view of the film, on the way.", new HmiViewEvent("Video", QVariant()));
}
