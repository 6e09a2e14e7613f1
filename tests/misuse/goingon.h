#pragma once

#include "twostates.h"

#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>

/** Lets the event "go" lead from the one state to the other. */
inline HmiStateMachine::HmiTransition *goOn(TwoStates &flow)
{
    auto *transition = new HmiStateMachine::HmiTransition(QStringLiteral("go"), flow.source);
    transition->setTargetState(flow.target);
    return transition;
}

inline void post(TwoStates &flow)
{
    flow.machine.postEvent(new HmiStateMachine::HmiEvent(QStringLiteral("go"), QVariant()));
    settle();
}
