#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QCoreApplication>
#include <QDebug>

using namespace HmiStateMachine;

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    NamedState::setLoggingEnabled(true);

    StateMachine *machine = StateMachine::instance();
    machine->setInitialState(new NamedState("Home", machine));
    machine->start();
    QCoreApplication::sendPostedEvents();

    qInfo() << "Home is active:" << NamedState::stateForName("Home")->isActive();
    qInfo() << "There is a Radio:" << (NamedState::stateForName("Radio") != nullptr);
}
