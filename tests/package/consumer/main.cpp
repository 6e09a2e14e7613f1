#include <HmiStateMachine/hmistatemachine_version.h>
#include <HmiStateMachine/HmiViewEvent>
#include <HmiStateMachine/HmiViewState>
#include <HmiStateMachine/StateMachine>

#include <QCoreApplication>
#include <QMetaType>

#include <cstdio>

#if HMISTATEMACHINE_VERSION < HMISTATEMACHINE_VERSION_CHECK(0, 1, 0)
#error "The version is not one to be compared"
#endif

using namespace HmiStateMachine;

int main(int argc, char **argv)
{
    QCoreApplication app(argc, argv);
    StateMachine *machine = StateMachine::instance();
    auto *home = new HmiViewState(QStringLiteral("Home"), machine);
    auto *radio = new HmiViewState(QStringLiteral("Radio"), machine);
    machine->setInitialState(home);
    machine->start();
    QCoreApplication::sendPostedEvents();

    machine->postEvent(new HmiViewEvent(QStringLiteral("Radio"), QVariant()));
    QCoreApplication::sendPostedEvents();

    // The type is registered while the library is loaded, in a static one too.
    if (!radio->isActive() || QMetaType::type("Identifier") == QMetaType::UnknownType) {
        return 1;
    }
    std::puts(HMISTATEMACHINE_VERSION_STRING ": the radio is shown");
    return 0;
}
