#include "program.h"

#include "commandline.h"
#include "files.h"
#include "report.h"
#include "selection.h"
#include "smoke.h"

#include <QJsonDocument>

#include <cstdio>

namespace {

enum ExitCode { Success = 0, Failure = 1, WrongUse = 2 };

void print(const QString &text)
{
    std::fputs(text.toUtf8().constData(), stdout);
}

void say(const QString &text)
{
    std::fprintf(stderr, "hmi-benchmark: %s\n", text.toUtf8().constData());
}

int fail(ExitCode code, const QString &error)
{
    say(error);
    return code;
}

int list(const QVector<Workload> &workloads)
{
    constexpr int idWidth = 14;
    for (const Workload &workload : workloads) {
        print(workload.id.leftJustified(idWidth) + workload.title + QLatin1Char('\n'));
    }
    return Success;
}

bool measureAll(const QVector<Workload> &workloads, const Effort &effort, Results *results,
                QString *error)
{
    for (const Workload &workload : workloads) {
        say(QStringLiteral("%1, %2 of %3")
                .arg(workload.id)
                .arg(results->size() + 1)
                .arg(workloads.size()));
        WorkloadResult result;
        if (!measure(workload, effort, &result, error)) {
            return false;
        }
        results->append(result);
    }
    return true;
}

int check(const QVector<Workload> &workloads)
{
    Effort effort;
    effort.rounds = 1;
    effort.layouts = false;
    for (Workload workload : workloads) {
        constexpr int aFew = 20;
        workload.timed = aFew;
        workload.counted = aFew;
        workload.warmUp = aFew;
        WorkloadResult result;
        QString error;
        if (!measure(workload, effort, &result, &error)) {
            return fail(Failure, error);
        }
    }
    print(QStringLiteral("All engines show the same in %1 workloads.\n").arg(workloads.size()));
    return Success;
}

// Rows without figures, for a count of instructions alone.
Results emptyRows(const QVector<Workload> &workloads)
{
    Results results;
    for (const Workload &workload : workloads) {
        WorkloadResult row;
        row.id = workload.id;
        row.title = workload.title;
        for (const Workload::Side &side : workload.sides) {
            row.sides.insert(side.engine, SideResult());
        }
        results.append(row);
    }
    return results;
}

int smoke(const CommandLine &commandLine)
{
    const QVector<Workload> workloads = smokeWorkloads(commandLine.workloads);
    if (workloads.isEmpty()) {
        return fail(WrongUse,
                    QStringLiteral("--smoke watches none of the chosen workloads. It watches: %1")
                        .arg(ids(smokeWorkloads(allWorkloads())).join(QLatin1Char(' '))));
    }
    Results before;
    QString error;
    if (!readResults(commandLine.smokeFile, &before, &error)) {
        return fail(WrongUse, error);
    }
    Results now = emptyRows(workloads);
    if (!countInstructions(ids(workloads), commandLine.effort, &now, &error)) {
        return fail(Failure, error);
    }
    const QStringList faults = slippedRows(now, before, commandLine.smokeFile);
    if (!faults.isEmpty()) {
        return fail(Failure,
                    faults.join(QLatin1Char('\n'))
                        + QStringLiteral("\nFind what has slipped. If it is meant, run "
                                         "'scripts/benchmark --docs' and commit what it writes."));
    }
    print(QStringLiteral("No growth in %1.\n").arg(ids(workloads).join(QStringLiteral(", "))));
    return Success;
}

// Before the run: a name mistyped must not cost the minutes of a run.
bool openFiles(const CommandLine &commandLine, Results *before, QString *error)
{
    for (const QString &name :
         {commandLine.jsonFile, commandLine.textFile, commandLine.markdownFile}) {
        if (!name.isEmpty() && !isWritable(name, error)) {
            return false;
        }
    }
    return commandLine.beforeFile.isEmpty() || readResults(commandLine.beforeFile, before, error);
}

bool writeFiles(const CommandLine &commandLine, const Results &now, const Results &before,
                QString *error)
{
    const QVector<QPair<QString, QByteArray>> files{
        {commandLine.jsonFile, QJsonDocument(toJson(now)).toJson()},
        {commandLine.textFile, asText(now, before).toUtf8()},
        {commandLine.markdownFile, asMarkdown(now, before).toUtf8()}};
    for (const auto &file : files) {
        if (!file.first.isEmpty() && !writeFile(file.first, file.second, error)) {
            return false;
        }
    }
    return true;
}

int measureAndReport(const CommandLine &commandLine)
{
    Results before;
    Results now;
    QString error;
    if (!openFiles(commandLine, &before, &error)) {
        return fail(WrongUse, error);
    }
    if (!measureAll(commandLine.workloads, commandLine.effort, &now, &error)) {
        return fail(Failure, error);
    }
    if (commandLine.count) {
        say(QStringLiteral("counting instructions under valgrind"));
        if (!countInstructions(ids(commandLine.workloads), commandLine.effort, &now, &error)) {
            return fail(Failure, error);
        }
    }
    print(asText(now, before));
    return writeFiles(commandLine, now, before, &error) ? Success : fail(WrongUse, error);
}

} // namespace

int runProgram(const QStringList &arguments)
{
    CommandLine commandLine;
    QString error;
    if (!readCommandLine(arguments, &commandLine, &error)) {
        return fail(WrongUse, error + QStringLiteral("\nSee --help."));
    }
    switch (commandLine.task) {
    case Task::Help:
        print(commandLine.help);
        return Success;
    case Task::List:
        return list(commandLine.workloads);
    case Task::Measure:
        return measureAndReport(commandLine);
    case Task::Check:
        return check(commandLine.workloads);
    case Task::Smoke:
        return smoke(commandLine);
    case Task::RunForCounting:
        runForCounting(commandLine.workloads, commandLine.effort);
        return Success;
    }
    return Failure;
}
