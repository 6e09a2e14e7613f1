#include "commandline.h"

#include "measuring.h"

#include <QCommandLineParser>
#include <QJsonDocument>
#include <QSaveFile>

#include <cstdio>

int runCommandLine(const QStringList &arguments)
{
    QCommandLineParser parser;
    parser.addOptions({{"only", "", "ID"},
                       {"one-layout", ""},
                       {"run-for-counting", ""},
                       {"no-count", ""},
                       {"json", "", "FILE"},
                       {"rounds", "", "N", "15"}});
    parser.process(arguments);
    Effort effort;
    effort.layouts = !parser.isSet("one-layout");
    effort.rounds = parser.value("rounds").toInt();
    QVector<Workload> selected;
    QStringList ids;
    const auto only = parser.values("only");
    for (const auto &w : allWorkloads()) {
        bool take = only.isEmpty();
        for (auto &o : only)
            if (w.id == o || w.id.startsWith(o + "/"))
                take = true;
        if (take) {
            selected.append(w);
            ids.append(w.id);
        }
    }
    if (parser.isSet("run-for-counting")) {
        runForCounting(selected, effort);
        return 0;
    }
    Results results;
    QString error;
    for (const auto &w : selected) {
        WorkloadResult r;
        if (!measure(w, effort, &r, &error)) {
            fprintf(stderr, "%s\n", qPrintable(error));
            return 1;
        }
        results.append(r);
    }
    if (!parser.isSet("no-count") && !countInstructions(ids, effort, &results, &error)) {
        fprintf(stderr, "%s\n", qPrintable(error));
        return 1;
    }
    for (const auto &r : results) {
        for (auto it = r.sides.begin(); it != r.sides.end(); ++it)
            printf("%-14s %-8s %10.0f instr %8.1f allocs %8.1f bytes %9.0f ns   x%.3f  time x%.3f "
                   "(%.3f-%.3f)\n",
                   qPrintable(r.id), qPrintable(engineName(it.key())), it->instructions,
                   it->allocations, it->heapBytes, it->nanoseconds, r.instructionRatio(it.key()),
                   r.timeRatios.value(it.key()).median, r.timeRatios.value(it.key()).low,
                   r.timeRatios.value(it.key()).high);
    }
    if (parser.isSet("json")) {
        QSaveFile f(parser.value("json"));
        f.open(QIODevice::WriteOnly);
        f.write(QJsonDocument(toJson(results)).toJson());
        f.commit();
    }
    return 0;
}
