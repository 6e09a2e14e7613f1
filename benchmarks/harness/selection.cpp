#include "selection.h"

#include <algorithm>

namespace {

bool isNamed(const Workload &workload, const QString &name)
{
    return workload.id == name || family(workload.id) == name;
}

// A family a line.
QString overview(const QVector<Workload> &workloads)
{
    QString text;
    QString current;
    for (const Workload &workload : workloads) {
        if (family(workload.id) != current) {
            current = family(workload.id);
            text += QStringLiteral("\n ");
        }
        text += QLatin1Char(' ') + workload.id;
    }
    return text;
}

} // namespace

QString family(const QString &id)
{
    return id.section(QLatin1Char('/'), 0, 0);
}

bool select(const QVector<Workload> &workloads, const QStringList &wanted,
            QVector<Workload> *selected, QString *error)
{
    for (const QString &name : wanted) {
        if (std::none_of(workloads.begin(), workloads.end(),
                         [&name](const Workload &workload) { return isNamed(workload, name); })) {
            *error = QStringLiteral("--only %1: there is no such workload. Give one of these, or "
                                    "what stands before the slash for all of a line:%2")
                         .arg(name, overview(workloads));
            return false;
        }
    }
    std::copy_if(workloads.begin(), workloads.end(), std::back_inserter(*selected),
                 [&wanted](const Workload &workload) {
                     return wanted.isEmpty()
                         || std::any_of(wanted.begin(), wanted.end(), [&](const QString &name) {
                                return isNamed(workload, name);
                            });
                 });
    return true;
}

QStringList ids(const QVector<Workload> &workloads)
{
    QStringList result;
    for (const Workload &workload : workloads) {
        result.append(workload.id);
    }
    return result;
}
