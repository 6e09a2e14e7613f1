#include <HmiStateMachine/internal/posting.h>

#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QEvent>

namespace HmiStateMachine {

void postToInstance(QEvent *event)
{
    StateMachine *machine = StateMachine::instance();
    if (machine->isRunning()) {
        machine->postEvent(event);
        return;
    }
    HMI_WARNING(hmistatemachine())
        << "StateMachine::instance() is not running, dropped an event of type"
        << static_cast<int>(event->type());
    delete event;
}

} // namespace HmiStateMachine
