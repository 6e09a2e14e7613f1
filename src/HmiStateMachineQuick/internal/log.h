#pragma once

#include <QLoggingCategory>

namespace HmiStateMachine {

/** What concerns the scene: "hmistatemachine.quick". */
Q_DECLARE_LOGGING_CATEGORY(hmistatemachinequick)

} // namespace HmiStateMachine
