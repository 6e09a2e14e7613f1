#pragma once

#include "measuring.h"

#include <QStringList>

/** What a run is for. */
enum class Task {
    Help,
    List,
    Measure, ///< time, allocations and instructions of the workloads, and a table of them
    Check, ///< only whether all engines show the same
    Smoke, ///< only whether the instructions have grown since an earlier run
    RunForCounting ///< the process under valgrind; see runForCounting()
};

/** What the arguments ask for. A file name is empty where none is given. */
struct CommandLine
{
    Task task = Task::Measure;
    QVector<Workload> workloads; ///< those chosen, in the order of the table
    Effort effort;
    bool count = true; ///< the instructions too
    QString jsonFile;
    QString textFile;
    QString markdownFile;
    QString beforeFile;
    QString smokeFile;
    QString help;
};

/** Reads @p arguments, the program's name first. False with a text for the user in @p error. */
bool readCommandLine(const QStringList &arguments, CommandLine *commandLine, QString *error);
