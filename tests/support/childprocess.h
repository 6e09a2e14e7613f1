#pragma once

#include <QProcess>
#include <QString>

/** How a test function fared in a process of its own. */
struct ChildResult
{
    bool crashed;
    int exitCode;
    QString output; ///< standard output and standard error
};

/** Runs one function of the running test program as a child process; isChildProcess() is true
 * there. */
ChildResult runAsChild(const QString &function);
bool isChildProcess();
