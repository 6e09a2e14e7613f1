#pragma once

#include "workload.h"

#include <QStringList>

/** The family of a workload: "W1" of "W1/100". */
QString family(const QString &id);

/**
 * Those of @p workloads that @p wanted names by id or by family; all when it is empty. False, with
 * a list of what there is in @p error, when it names something else.
 */
bool select(const QVector<Workload> &workloads, const QStringList &wanted,
            QVector<Workload> *selected, QString *error);

/** The ids of @p workloads, in their order. */
QStringList ids(const QVector<Workload> &workloads);
