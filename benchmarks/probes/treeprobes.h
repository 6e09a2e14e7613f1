#pragma once

#include "workload.h"

/** Nesting and the number of children, on bare Qt. */
QVector<Workload> treeProbes();
