#pragma once

#include <QString>
#include <QVector>

/** What the process holds after so many events. */
struct MemorySample
{
    int events;
    double seconds;
    qint64 resident; ///< bytes, as the system counts them
    qint64 inUse; ///< bytes that were allocated and not freed
};

MemorySample takeMemorySample(int events, double seconds);

/**
 * Why @p samples, in their order, count as growth; empty when memory stayed flat. What comes up to
 * @p warmUp events is the flow filling its stores, and is not looked at.
 */
QString growth(const QVector<MemorySample> &samples, int warmUp);
