#pragma once

#include <QString>
#include <QStringList>

/** What a run of hmi-rules came to. */
struct ToolRun
{
    QString output;
    QString errors;
    int exitCode = 0;

    /** Output, errors, and a last line "exit 0"; lines, for a comparison that tells which differs.
     */
    QStringList lines() const;
};

/** Runs hmi-rules with these arguments in this process. */
ToolRun runTool(const QStringList &arguments);

/** The bytes of a file as UTF-8; fails the test when it cannot be read. */
QString contentOf(const QString &path);

/** The lines of a file of arguments, one a line; none when there is no such file. */
QStringList argumentsIn(const QString &path);
