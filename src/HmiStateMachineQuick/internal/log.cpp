#include <HmiStateMachineQuick/internal/log.h>

namespace HmiStateMachine {

Q_LOGGING_CATEGORY(hmistatemachinequick, "hmistatemachine.quick")

} // namespace HmiStateMachine
