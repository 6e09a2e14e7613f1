#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>

#include <QString>

class QState;

namespace HmiStateMachine {

/** What several classes need and none owns. */
class HMISTATEMACHINE_EXPORT Helpers
{
public:
    /** The name of a NamedState; empty for any other state and for null. */
    static QString stateName(QState *state);
};

} // namespace HmiStateMachine
