#pragma once

#include "workload.h"

/** A popup is requested, interrupted by another, comes back and is dismissed. */
QVector<Workload> popupRoundWorkloads();
