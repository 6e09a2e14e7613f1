#pragma once

#include "workload.h"

/**
 * What the shape of a flow costs: each probe is one shape in several sizes, so that the growth
 * shows. They are measured like the other workloads but compared with one another.
 */
QVector<Workload> probeWorkloads();
