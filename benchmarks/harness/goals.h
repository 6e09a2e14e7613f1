#pragma once

#include "results.h"

#include <functional>
#include <optional>

/** A figure of a run; none when the run has not measured what it is computed from. */
using Figure = std::function<std::optional<double>(const Results &results)>;

/** What the library should cost at most, or, against another engine, gain at least. */
struct Goal
{
    enum class Bound { AtMost, AtLeast };

    QString what;
    Figure figure;
    Bound bound;
    double limit;
    int decimals; ///< in reports
    QString why; ///< may be empty
};

enum class Verdict { NotRun, Met, Missed };

/** Whether the run of @p results meets @p goal. */
Verdict verdict(const Goal &goal, const Results &results);

/** Every goal, in the order of the workloads. */
QVector<Goal> allGoals();
