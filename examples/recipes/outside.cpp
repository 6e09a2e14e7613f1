// The machine and what is outside of it: other threads, and whoever wants to see what happens.

#include "printing.h"
#include "recipes.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>

#include <QLoggingCategory>
#include <QThread>

#include <memory>

using namespace HmiStateMachine;

void otherThreads()
{
    PrintingViewLayer viewLayer;
    StateMachine *machine = StateMachine::instance(); // made in the thread of the application
    auto *home = new HmiViewState("Home", machine);
    new HmiViewState("Radio", machine);
    startIn(home);

    const std::unique_ptr<QThread> tuner(QThread::create([machine] {
        QMetaObject::invokeMethod(
            machine, [machine] { machine->postEvent(new HmiViewEvent("Radio", "Bay Jazz")); },
            Qt::QueuedConnection);
    }));
    tuner->start();
    tuner->wait();
    say("The tuner's thread is done, and the machine has not moved.");
    QCoreApplication::sendPostedEvents(); // exec() does that in an application: the call ...
    QCoreApplication::sendPostedEvents(); // ... and what it has posted to the machine
}

void seeing()
{
    QLoggingCategory::setFilterRules("*.debug=false\nvosk.hmistatemachine.debug=true");
    NamedState::setLoggingEnabled(true);
    StateMachine *machine = StateMachine::instance();
    auto *home = new HmiViewState("Home", machine);
    new HmiViewState("Radio", machine);
    startIn(home);

    request("The radio.", new HmiViewEvent("Radio", QVariant()));
    request("Something unknown.", new HmiViewEvent("Rdaio", QVariant()));
    for (const QString id : {"Radio", "Rdaio"}) {
        say(HmiViewState::stateForTarget(id) ? id + " is there" : id + " is not there");
    }
    say("Active: " + HmiViewState::activeViewState()->name());
}
