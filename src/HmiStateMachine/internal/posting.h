#pragma once

class QEvent;

namespace HmiStateMachine {

/**
 * Posts @p event to StateMachine::instance(). While that does not run, because the flow runs in a
 * machine of the application's own, Qt would leave the event to nobody: it is dropped with a warning.
 */
void postToInstance(QEvent *event);

} // namespace HmiStateMachine
