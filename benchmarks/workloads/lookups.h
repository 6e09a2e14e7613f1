#pragma once

#include "workload.h"

/** Interruption rules and names, looked up in large tables. */
QVector<Workload> lookupWorkloads();
