#pragma once

#include "workload.h"

/** From an event posted to the new view activated, in flows of many shapes. */
QVector<Workload> viewSwitchWorkloads();
