#pragma once

#include "results.h"
#include "workload.h"

#include <QString>
#include <QVector>

/** How thorough a run is. */
struct Effort
{
    int rounds = 15; ///< timed, engine by engine in turn
    bool layouts = true; ///< all memory layouts of a workload; only the first otherwise
};

/**
 * Times @p workload and counts its allocations. False, with a text for the user in @p error, when
 * its engines have not shown or answered the same.
 */
bool measure(const Workload &workload, const Effort &effort, WorkloadResult *result,
             QString *error);

/**
 * Counts the instructions of @p ids, each in a process of this program under valgrind's callgrind,
 * and adds them to @p results. False with a text in @p error when that cannot be done.
 */
bool countInstructions(const QStringList &ids, const Effort &effort, Results *results,
                       QString *error);

/** That process's side of it: runs every workload and marks what is to be counted. */
void runForCounting(const QVector<Workload> &workloads, const Effort &effort);
