#pragma once

#include "workload.h"

/** What the library adds to a flow. */
QVector<Workload> libraryProbes();
