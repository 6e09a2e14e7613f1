#pragma once

#include "workload.h"

/** Transitions on active states, and transitions that are moved, on bare Qt. */
QVector<Workload> transitionProbes();
