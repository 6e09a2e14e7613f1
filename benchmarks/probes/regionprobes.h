#pragma once

#include "workload.h"

/** Parallel regions, on bare Qt. */
QVector<Workload> regionProbes();
