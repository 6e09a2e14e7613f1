#include "report.h"

#include "environment.h"
#include "goals.h"
#include "table.h"

#include <QFile>

namespace {

constexpr int ratioDecimals = 3;
const QString nothing = QStringLiteral("–");

QString number(double value, int decimals)
{
    const QString text = QString::number(value, 'f', decimals);
    return text.toDouble() == 0 ? QString::number(0.0, 'f', decimals) : text; // no "-0"
}

QString instructions(const WorkloadResult &row, Engine engine)
{
    const double value = row.sides.value(engine).instructions;
    return value > 0 ? number(value, 0) : nothing;
}

QString instructionRatio(const WorkloadResult &row, Engine engine)
{
    const double value = row.instructionRatio(engine);
    return value > 0 ? number(value, ratioDecimals) : nothing;
}

QString timeRatio(const WorkloadResult &row)
{
    if (!row.timeRatios.contains(Engine::Raw)) {
        return nothing;
    }
    const TimeRatio ratio = row.timeRatios.value(Engine::Raw);
    return QStringLiteral("%1 (%2–%3)")
        .arg(number(ratio.median, ratioDecimals), number(ratio.low, ratioDecimals),
             number(ratio.high, ratioDecimals));
}

QString heap(const WorkloadResult &row, Engine engine, double SideResult::*figure)
{
    return row.has(engine) ? number(row.sides.value(engine).*figure, 1) : nothing;
}

/** A column of the table of workloads. */
struct Column
{
    QString title;
    bool changes; ///< with the library: worth the figure before
    std::function<QString(const WorkloadResult &row)> cell;
};

Column ratioColumn(const QString &title, Engine engine)
{
    return {title, true,
            [engine](const WorkloadResult &row) { return instructionRatio(row, engine); }};
}

Column heapColumn(const QString &title, Engine engine, double SideResult::*figure)
{
    return {title, engine == Engine::Library,
            [=](const WorkloadResult &row) { return heap(row, engine, figure); }};
}

QVector<Column> workloadColumns()
{
    return {{QStringLiteral("instructions"), true,
             [](const WorkloadResult &row) { return instructions(row, Engine::Library); }},
            {QStringLiteral("raw"), false,
             [](const WorkloadResult &row) { return instructions(row, Engine::Raw); }},
            ratioColumn(QStringLiteral("to raw"), Engine::Raw),
            {QStringLiteral("CPU time to raw (quartiles)"), true, timeRatio},
            ratioColumn(QStringLiteral("to Qt SCXML"), Engine::Scxml),
            ratioColumn(QStringLiteral("to the floor"), Engine::Floor),
            heapColumn(QStringLiteral("allocations"), Engine::Library, &SideResult::allocations),
            heapColumn(QStringLiteral("raw"), Engine::Raw, &SideResult::allocations),
            heapColumn(QStringLiteral("heap bytes"), Engine::Library, &SideResult::heapBytes),
            heapColumn(QStringLiteral("raw"), Engine::Raw, &SideResult::heapBytes)};
}

// "before → now", where there is something to tell.
QString sideBySide(const QString &before, const QString &now)
{
    return before == nothing && now == nothing ? nothing
                                               : QStringLiteral("%1 → %2").arg(before, now);
}

Table workloadTable(const Results &now, const Results &before)
{
    const QVector<Column> columns = workloadColumns();
    Table table;
    table.columns = {{QStringLiteral("id"), false}, {QStringLiteral("workload"), false}};
    for (const Column &column : columns) {
        table.columns.append({column.title, true});
    }
    for (const WorkloadResult &row : now) {
        const WorkloadResult *earlier = find(before, row.id);
        QStringList cells{row.id, row.title};
        for (const Column &column : columns) {
            const QString cell = column.cell(row);
            cells.append(column.changes && !before.isEmpty()
                             ? sideBySide(earlier ? column.cell(*earlier) : nothing, cell)
                             : cell);
        }
        table.rows.append(cells);
    }
    return table;
}

QString verdictName(Verdict verdict)
{
    switch (verdict) {
    case Verdict::Met:
        return QStringLiteral("met");
    case Verdict::Missed:
        return QStringLiteral("missed");
    case Verdict::NotRun:
        return QStringLiteral("not run");
    }
    return QString();
}

QString figureText(const Goal &goal, const Results &results)
{
    const auto figure = goal.figure(results);
    return figure ? number(*figure, goal.decimals) : nothing;
}

QString limitText(const Goal &goal)
{
    return QStringLiteral("%1 %2").arg(goal.bound == Goal::Bound::AtMost ? QStringLiteral("≤")
                                                                         : QStringLiteral("≥"),
                                       QString::number(goal.limit));
}

Table goalTable(const Results &now, const Results &before)
{
    Table table;
    table.columns = {{QStringLiteral("figure"), false},  {QStringLiteral("goal"), true},
                     {QStringLiteral("before"), true},   {QStringLiteral("now"), true},
                     {QStringLiteral("verdict"), false}, {QStringLiteral("why"), false}};
    if (before.isEmpty()) {
        table.columns.remove(2);
    }
    const QVector<Goal> goals = allGoals();
    for (const Goal &goal : goals) {
        QStringList cells{goal.what, limitText(goal)};
        if (!before.isEmpty()) {
            cells.append(figureText(goal, before));
        }
        cells << figureText(goal, now) << verdictName(verdict(goal, now)) << goal.why;
        table.rows.append(cells);
    }
    return table;
}

QString documentFrame()
{
    QFile file(QStringLiteral(":/benchmarks/benchmarks.md.in"));
    file.open(QIODevice::ReadOnly);
    return QString::fromUtf8(file.readAll());
}

} // namespace

QString asText(const Results &now, const Results &before)
{
    return asText(workloadTable(now, before)) + QLatin1Char('\n') + asText(goalTable(now, before));
}

QString asMarkdown(const Results &now, const Results &before)
{
    return documentFrame()
        .replace(QStringLiteral("@COMPILER@"), compilerName())
        .replace(QStringLiteral("@QT@"), qtVersion())
        .replace(QStringLiteral("@CPU@"), processorName())
        .replace(QStringLiteral("@GOALS@"), asMarkdown(goalTable(now, before)).trimmed())
        .replace(QStringLiteral("@WORKLOADS@"), asMarkdown(workloadTable(now, before)).trimmed());
}
