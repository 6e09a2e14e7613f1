#pragma once

#include "workload.h"

/** What it costs to build, start and destroy a flow, by the view state. */
QVector<Workload> lifecycleWorkloads();
