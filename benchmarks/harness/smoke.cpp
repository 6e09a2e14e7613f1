#include "smoke.h"

#include <algorithm>

namespace {

constexpr double room = 1.10;

// One of each kind, large enough for a cost that grows with the flow to show.
const char *const smokeIds[] = {
    "W1/100",     "W1T/10000",  "W1P/64",        "W3/16",    "W3/512",   "W5/build",   "W5/start",
    "W5/destroy", "W5/default", "W5/inheriting", "W6/mixed", "W6/exact", "W6/blocking"};

bool isWatched(const Workload &workload)
{
    return std::any_of(std::begin(smokeIds), std::end(smokeIds),
                       [&workload](const char *id) { return workload.id == QLatin1String(id); });
}

struct Cost
{
    double figure = 0; ///< 0 when it is not known
    QString unit;
    int decimals = 0;
};

Cost costOf(const WorkloadResult &row)
{
    constexpr int ratioDecimals = 3;
    if (row.has(Engine::Raw)) {
        return {row.instructionRatio(Engine::Raw), QStringLiteral("times the bare machine"),
                ratioDecimals};
    }
    return {row.sides.value(Engine::Library).instructions, QStringLiteral("instructions"), 0};
}

QString text(const Cost &cost)
{
    return QString::number(cost.figure, 'f', cost.decimals);
}

} // namespace

QVector<Workload> smokeWorkloads(const QVector<Workload> &workloads)
{
    QVector<Workload> result;
    std::copy_if(workloads.begin(), workloads.end(), std::back_inserter(result), isWatched);
    return result;
}

QStringList slippedRows(const Results &now, const Results &before, const QString &fileName)
{
    QStringList faults;
    for (const WorkloadResult &row : now) {
        const WorkloadResult *earlier = find(before, row.id);
        const Cost allowed = earlier ? costOf(*earlier) : Cost();
        const Cost cost = costOf(row);
        if (allowed.figure <= 0 || allowed.unit != cost.unit) {
            faults.append(QStringLiteral("%1: %2 has no count of instructions to compare with.")
                              .arg(row.id, fileName));
        } else if (cost.figure > allowed.figure * room) {
            faults.append(
                QStringLiteral("%1 (%2): %3 %4, in %5 it is %6; a tenth more is allowed.")
                    .arg(row.id, row.title, text(cost), cost.unit, fileName, text(allowed)));
        }
    }
    return faults;
}
