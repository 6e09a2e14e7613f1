#pragma once

namespace HmiStateMachine {

class ViewStateTarget;

/**
 * ViewStateTarget::instance(), or null when that has been destroyed: the flow goes on without a
 * view layer then, though the application forgot to withdraw the pointer.
 */
ViewStateTarget *viewLayer();

} // namespace HmiStateMachine
