#pragma once

#include <QString>

/** What the figures of a run depend on, for whoever compares two. */
QString compilerName();
QString qtVersion();
QString processorName();
