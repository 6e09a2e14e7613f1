#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QCoreApplication>
#include <QMetaType>

#include <cstdio>

using namespace HmiStateMachine;

int main(int argc, char **argv)
{
    QCoreApplication app(argc, argv);
    StateMachine *machine = StateMachine::instance();
    auto *home = new HmiViewState("Home", machine);
    auto *radio = new HmiViewState("Radio", machine);
    machine->setInitialState(home);
    machine->start();
    QCoreApplication::sendPostedEvents();

    machine->postEvent(new HmiViewEvent("Radio", QVariant()));
    QCoreApplication::sendPostedEvents();

    // The type is registered while the library is loaded, in a static one too.
    if (!radio->isActive() || QMetaType::type("Identifier") == QMetaType::UnknownType) {
        return 1;
    }
    std::puts("the radio is shown");
    return 0;
}
