#pragma once

#include "workload.h"

/** A key press that one of many guarded key transitions takes. */
QVector<Workload> keyPressWorkloads();
