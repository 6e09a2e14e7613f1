#pragma once

#include "results.h"

#include <QStringList>

/** The few rows whose instructions are watched, those among @p workloads, in their order. */
QVector<Workload> smokeWorkloads(const QVector<Workload> &workloads);

/**
 * What is wrong with @p now, a text for the user each: rows whose instructions have grown by more
 * than a tenth since @p before, and rows that @p before, read from @p fileName, does not have.
 * Compared is the ratio to the bare machine, which depends least on compiler and Qt version, and
 * where there is none the library's own instructions.
 */
QStringList slippedRows(const Results &now, const Results &before, const QString &fileName);
