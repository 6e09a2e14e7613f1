#include "measuring.h"

#include "memorylayout.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

#include <valgrind/callgrind.h>

namespace {

const QString separator = QStringLiteral("|");

/** What one dump of callgrind says: which run it is of, and how many instructions it took. */
struct Dump
{
    QString label;
    double instructions = 0;
};

Dump readDump(const QString &fileName)
{
    QFile file(fileName);
    Dump dump;
    if (!file.open(QIODevice::ReadOnly)) {
        return dump;
    }
    const QByteArray trigger = "desc: Trigger: Client Request: ";
    const QByteArray totals = "totals: ";
    while (!file.atEnd()) {
        const QByteArray line = file.readLine().trimmed();
        if (line.startsWith(trigger)) {
            dump.label = QString::fromLatin1(line.mid(trigger.size()));
        } else if (line.startsWith(totals)) {
            dump.instructions = line.mid(totals.size()).toDouble();
        }
    }
    return dump;
}

// A label is id, engine and number of operations; of several layouts the cheapest counts.
void keepDump(const Dump &dump, Results *results)
{
    const QStringList parts = dump.label.split(separator);
    constexpr int partCount = 3;
    if (parts.size() != partCount) {
        return;
    }
    for (WorkloadResult &result : *results) {
        if (result.id != parts.at(0)) {
            continue;
        }
        for (auto it = result.sides.begin(); it != result.sides.end(); ++it) {
            const double instructions = dump.instructions / parts.at(2).toInt();
            if (engineName(it.key()) == parts.at(1)
                && (it->instructions == 0 || instructions < it->instructions)) {
                it->instructions = instructions;
            }
        }
    }
}

void countOnce(const Workload &workload, const Workload::Side &side, int layout)
{
    const MemoryLayout scattered(static_cast<unsigned>(layout));
    const auto flow = side.make();
    warmUp(*flow, workload);
    flow->before(workload.counted);
    CALLGRIND_START_INSTRUMENTATION;
    flow->run(workload.counted);
    CALLGRIND_STOP_INSTRUMENTATION;
    const QString label =
        QStringList{workload.id, engineName(side.engine), QString::number(workload.counted)}.join(
            separator);
    CALLGRIND_DUMP_STATS_AT(label.toLatin1().constData());
    flow->after();
}

bool runCallgrind(const QStringList &arguments, QString *error)
{
    QProcess valgrind;
    valgrind.setProcessChannelMode(QProcess::MergedChannels);
    valgrind.start(QStringLiteral("valgrind"), arguments);
    if (!valgrind.waitForStarted()) {
        *error = QStringLiteral("valgrind does not start: %1\nInstall it (Debian: apt-get install "
                                "valgrind) and run this again.")
                     .arg(valgrind.errorString());
        return false;
    }
    constexpr int noLimit = -1;
    valgrind.waitForFinished(noLimit);
    if (valgrind.exitStatus() != QProcess::NormalExit || valgrind.exitCode() != 0) {
        *error = QStringLiteral("valgrind failed:\n") + QString::fromLocal8Bit(valgrind.readAll());
        return false;
    }
    return true;
}

// In a process of its own: the heap that earlier workloads leave behind changes the count.
bool countOne(const QString &id, const Effort &effort, Results *results, QString *error)
{
    const QTemporaryDir dir;
    QStringList arguments{QStringLiteral("--tool=callgrind"),
                          QStringLiteral("--instr-atstart=no"),
                          QStringLiteral("--callgrind-out-file=")
                              + dir.filePath(QStringLiteral("out")),
                          QCoreApplication::applicationFilePath(),
                          QStringLiteral("--run-for-counting"),
                          QStringLiteral("--only"),
                          id};
    if (!effort.layouts) {
        arguments.append(QStringLiteral("--one-layout"));
    }
    if (!runCallgrind(arguments, error)) {
        return false;
    }
    const QDir dumps(dir.path());
    const QStringList names = dumps.entryList(QDir::Files);
    for (const QString &name : names) {
        keepDump(readDump(dumps.filePath(name)), results);
    }
    return true;
}

bool everySideIsCounted(const Results &results, QString *error)
{
    for (const WorkloadResult &result : results) {
        for (auto it = result.sides.cbegin(); it != result.sides.cend(); ++it) {
            if (it->instructions <= 0) {
                *error = QStringLiteral("%1: callgrind has counted nothing for %2")
                             .arg(result.id, engineName(it.key()));
                return false;
            }
        }
    }
    return true;
}

} // namespace

bool countInstructions(const QStringList &ids, const Effort &effort, Results *results,
                       QString *error)
{
    for (const QString &id : ids) {
        if (!countOne(id, effort, results, error)) {
            return false;
        }
    }
    return everySideIsCounted(*results, error);
}

void runForCounting(const QVector<Workload> &workloads, const Effort &effort)
{
    for (const Workload &workload : workloads) {
        const int layouts = effort.layouts ? workload.layouts : 1;
        for (int layout = 0; layout < layouts; ++layout) {
            for (const Workload::Side &side : workload.sides) {
                countOnce(workload, side, layout);
            }
        }
    }
}
