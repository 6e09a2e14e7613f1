#pragma once

#include "sides.h"
#include "workload.h"

#include <initializer_list>

/** How many memory layouts a flow without parallel regions is run under. */
constexpr int oneLayout = 1;

/** For one with parallel regions: enough for its growth to show through the scatter. */
constexpr int fewLayouts = 4;

/** A probe with a name in place of a size; its flow, a @p Probe, is made from @p arguments. */
template <typename Probe, typename... Arguments>
Workload probe(Engine engine, const QString &id, const QString &title, int layouts,
               Arguments... arguments)
{
    constexpr int timed = 20;
    // Even, since many a probe goes there and back; few where every layout is counted.
    const int counted = layouts == oneLayout ? 20 : 2;
    constexpr int warmUp = 4; // every state that is used is entered at least once
    return {id, title, timed, counted, warmUp, layouts, {side<Probe>(engine, arguments...)}};
}

/** One probe for each of @p sizes, which goes to the flow first and into the title as "%1". */
template <typename Probe, typename... Arguments>
QVector<Workload> probes(Engine engine, const QString &family, const QString &title, int layouts,
                         std::initializer_list<int> sizes, Arguments... arguments)
{
    QVector<Workload> result;
    for (int size : sizes) {
        result.append(probe<Probe>(engine, QStringLiteral("%1/%2").arg(family).arg(size),
                                   title.arg(size), layouts, size, arguments...));
    }
    return result;
}
