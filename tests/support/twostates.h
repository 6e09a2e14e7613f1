#pragma once

#include "driving.h"

#include <HmiStateMachine/named/namedstate.h>

#include <QStateMachine>

/** A machine of two states, for a transition that leads from the one to the other. */
struct TwoStates
{
    QStateMachine machine;
    HmiStateMachine::NamedState *const source =
        new HmiStateMachine::NamedState(QStringLiteral("source"), &machine);
    HmiStateMachine::NamedState *const target =
        new HmiStateMachine::NamedState(QStringLiteral("target"), &machine);

    void start() { startIn(machine, source); }
};

/** A machine in one parallel state of two regions, for transitions that react to the same event. */
struct TwoRegions
{
    QStateMachine machine;
    HmiStateMachine::NamedState *const both =
        new HmiStateMachine::NamedState(QStringLiteral("both"), QState::ParallelStates, &machine);
    HmiStateMachine::NamedState *const left =
        new HmiStateMachine::NamedState(QStringLiteral("left"), both);
    HmiStateMachine::NamedState *const right =
        new HmiStateMachine::NamedState(QStringLiteral("right"), both);

    void start() { startIn(machine, both); }
};
