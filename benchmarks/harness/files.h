#pragma once

#include "results.h"

/** Reads the figures of an earlier run. False with a text for the user in @p error. */
bool readResults(const QString &fileName, Results *results, QString *error);

/** Whether writeFile() could write to @p fileName now; nothing is left behind. */
bool isWritable(const QString &fileName, QString *error);

/** Writes a file whole or not at all. False with a text for the user in @p error. */
bool writeFile(const QString &fileName, const QByteArray &content, QString *error);
