#pragma once

#include "workload.h"

/** Transitions of which one takes an event in place of its siblings. */
QVector<Workload> siblingProbes();
