#pragma once

#include "workload.h"

#include <QJsonObject>
#include <QMap>
#include <QVector>

/** What one engine costs in one workload, by the operation. */
struct SideResult
{
    double instructions = 0;
    double allocations = 0;
    double heapBytes = 0; ///< that are in use afterwards and were not before
    double nanoseconds = 0; ///< CPU time of the thread; differs from machine to machine
};

/** How often the library's CPU time one engine's is, over rounds that ran in turn. */
struct TimeRatio
{
    double median = 0;
    double low = 0; ///< a quarter of the rounds is below
    double high = 0; ///< a quarter of the rounds is above
};

struct WorkloadResult
{
    QString id;
    QString title;
    QMap<Engine, SideResult> sides;
    QMap<Engine, TimeRatio> timeRatios; ///< of the library to each other engine

    bool has(Engine engine) const { return sides.contains(engine); }

    /** Instructions of the library by those of @p engine. */
    double instructionRatio(Engine engine) const;
};

using Results = QVector<WorkloadResult>;

/** The row @p id; null when the run had none. */
const WorkloadResult *find(const Results &results, const QString &id);

QJsonObject toJson(const Results &results);

/** Reads what toJson() wrote; on failure the text tells what is wrong, and the result is empty. */
Results fromJson(const QByteArray &text, QString *error);
