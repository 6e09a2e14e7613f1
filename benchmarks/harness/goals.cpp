#include "goals.h"

namespace {

constexpr int ratioDecimals = 3;

QString named(const char *format, const QString &id)
{
    return QString::fromLatin1(format).arg(id);
}

// Instructions were counted when there are any.
Figure instructions(const QString &id, Engine engine = Engine::Library)
{
    return [=](const Results &results) -> std::optional<double> {
        const WorkloadResult *row = find(results, id);
        if (!row || row->sides.value(engine).instructions <= 0) {
            return std::nullopt;
        }
        return row->sides.value(engine).instructions;
    };
}

Figure ofLibrary(const QString &id, double SideResult::*figure)
{
    return [=](const Results &results) -> std::optional<double> {
        const WorkloadResult *row = find(results, id);
        if (!row || !row->has(Engine::Library)) {
            return std::nullopt;
        }
        return row->sides.value(Engine::Library).*figure;
    };
}

Figure timeRatio(const QString &id)
{
    return [=](const Results &results) -> std::optional<double> {
        const WorkloadResult *row = find(results, id);
        if (!row || !row->timeRatios.contains(Engine::Raw)) {
            return std::nullopt;
        }
        return row->timeRatios.value(Engine::Raw).median;
    };
}

template <typename Operation>
Figure combined(const Figure &left, const Figure &right, Operation operation)
{
    return [=](const Results &results) -> std::optional<double> {
        const auto a = left(results);
        const auto b = right(results);
        if (!a || !b) {
            return std::nullopt;
        }
        return operation(*a, *b);
    };
}

Figure quotient(const Figure &above, const Figure &below)
{
    return combined(above, below, [](double a, double b) { return a / b; });
}

Goal atMost(double limit, const QString &what, const Figure &figure, const QString &why = QString())
{
    return {what, figure, Goal::Bound::AtMost, limit, ratioDecimals, why};
}

// For figures that are counts of something rather than ratios.
Goal countAtMost(double limit, const QString &what, const Figure &figure,
                 const QString &why = QString())
{
    constexpr int countDecimals = 1;
    return {what, figure, Goal::Bound::AtMost, limit, countDecimals, why};
}

Goal ratioToRaw(const QString &id, double limit, const QString &why = QString())
{
    return atMost(limit, named("%1: instructions to raw", id),
                  quotient(instructions(id), instructions(id, Engine::Raw)), why);
}

Goal ratioBetween(const QString &id, const QString &other, double limit, const QString &why)
{
    return atMost(limit, QStringLiteral("%1 to %2: instructions of the library").arg(id, other),
                  quotient(instructions(id), instructions(other)), why);
}

Goal allocations(const QString &id, double limit)
{
    return countAtMost(limit, named("%1: allocations", id),
                       ofLibrary(id, &SideResult::allocations));
}

Goal absolute(const QString &id, double limit)
{
    return countAtMost(limit, named("%1: instructions", id), instructions(id));
}

QVector<Goal> flatSwitchGoals()
{
    QVector<Goal> goals;
    for (int views : {10, 40, 100, 1000, 10000}) {
        const QString id = QStringLiteral("W1/%1").arg(views);
        goals << ratioToRaw(id, 1.06) << allocations(id, 37)
              << atMost(1.15, named("%1: CPU time to raw", id), timeRatio(id));
    }
    goals << ratioBetween(QStringLiteral("W1/10000"), QStringLiteral("W1/10"), 1.02,
                          QStringLiteral("a view switch does not depend on the size of the flow"));
    return goals;
}

QVector<Goal> layerGoals()
{
    return {ratioToRaw(QStringLiteral("W1L"), 1.06), ratioToRaw(QStringLiteral("W1I"), 1.04),
            ratioToRaw(QStringLiteral("W1N/2"), 1.12), ratioToRaw(QStringLiteral("W1N/3"), 1.12),
            ratioToRaw(QStringLiteral("W1N/4"), 1.12)};
}

QVector<Goal> screenGoals()
{
    const QString many = QStringLiteral("W1T/10000");
    return {
        ratioBetween(many, QStringLiteral("W1/10000"), 1.10,
                     QStringLiteral("a scan of the registry costs as much as 58 view switches")),
        ratioBetween(many, QStringLiteral("W1T/10"), 1.02,
                     QStringLiteral("as flat as the switch by name"))};
}

QVector<Goal> shownPopupGoals()
{
    constexpr int popups = 512;
    const QString id = QStringLiteral("W1P/%1").arg(popups);
    const auto perPopup = [](double with, double without) { return (with - without) / popups; };
    return {countAtMost(60, QStringLiteral("%1 beyond W1L: instructions by the popup").arg(id),
                        combined(instructions(id), instructions(QStringLiteral("W1L")), perPopup),
                        QStringLiteral("every popup that was shown follows each view switch")),
            ratioToRaw(id, 1.80)};
}

QVector<Goal> keyAndBackGoals()
{
    const QString back = QStringLiteral("W2");
    return {ratioToRaw(QStringLiteral("W1K/20"), 1.10), ratioToRaw(QStringLiteral("W1K/100"), 1.18),
            ratioToRaw(back, 1.07),
            countAtMost(0, QStringLiteral("W2: heap bytes kept after a round"),
                        ofLibrary(back, &SideResult::heapBytes),
                        QStringLiteral("back stacks that are left again leave nothing behind"))};
}

QVector<Goal> popupRoundGoals()
{
    const QString few = QStringLiteral("W3/16");
    return {ratioToRaw(few, 1.60), allocations(few, 280),
            ratioBetween(QStringLiteral("W3/512"), few, 3,
                         QStringLiteral("most popups of a layer take no part in a round"))};
}

// Without a copy of the signal's arguments a key press allocates what the bare one does.
Goal noMoreAllocationsThanRaw(const QString &id)
{
    const auto beyondRaw = [id](const Results &results) -> std::optional<double> {
        const WorkloadResult *row = find(results, id);
        if (!row || !row->has(Engine::Library) || !row->has(Engine::Raw)) {
            return std::nullopt;
        }
        return row->sides.value(Engine::Library).allocations
            - row->sides.value(Engine::Raw).allocations;
    };
    return countAtMost(0, named("%1: allocations beyond those of raw", id), beyondRaw,
                       QStringLiteral("no copy of an argument list that nobody asked for"));
}

QVector<Goal> keyPressGoals()
{
    const QString few = QStringLiteral("W4/10");
    const QString many = QStringLiteral("W4/100");
    return {ratioToRaw(few, 1.10), noMoreAllocationsThanRaw(few), ratioToRaw(many, 1.25),
            noMoreAllocationsThanRaw(many)};
}

QVector<Goal> lifecycleGoals()
{
    const QString build = QStringLiteral("W5/build");
    return {
        ratioToRaw(build, 1.30), allocations(build, 17),
        countAtMost(1250, named("%1: heap bytes", build), ofLibrary(build, &SideResult::heapBytes)),
        ratioToRaw(QStringLiteral("W5/start"), 1.12),
        ratioBetween(QStringLiteral("W5/inheriting"), QStringLiteral("W5/default"), 1.2,
                     QStringLiteral("a new state does not ask all of its siblings"))};
}

QVector<Goal> lookupGoals()
{
    const QString mixed = QStringLiteral("W6/mixed");
    const QString name = QStringLiteral("W7");
    return {absolute(mixed, 700),
            allocations(mixed, 0),
            absolute(QStringLiteral("W6/exact"), 500),
            absolute(QStringLiteral("W6/blocking"), 100),
            absolute(name, 260),
            allocations(name, 0)};
}

Goal aheadOfScxml(int views, double limit, const QString &why)
{
    const QString id = QStringLiteral("W1/%1").arg(views);
    return {named("%1: instructions of Qt SCXML to the library", id),
            quotient(instructions(id, Engine::Scxml), instructions(id)),
            Goal::Bound::AtLeast,
            limit,
            ratioDecimals,
            why};
}

QVector<Goal> scxmlGoals()
{
    return {aheadOfScxml(40, 1, QStringLiteral("Qt SCXML looks at every transition of the flow")),
            aheadOfScxml(100, 1.7, QString()), aheadOfScxml(1000, 11, QString())};
}

} // namespace

Verdict verdict(const Goal &goal, const Results &results)
{
    const auto figure = goal.figure(results);
    if (!figure) {
        return Verdict::NotRun;
    }
    const bool met =
        goal.bound == Goal::Bound::AtMost ? *figure <= goal.limit : *figure >= goal.limit;
    return met ? Verdict::Met : Verdict::Missed;
}

QVector<Goal> allGoals()
{
    return flatSwitchGoals() + layerGoals() + screenGoals() + shownPopupGoals() + keyAndBackGoals()
        + popupRoundGoals() + keyPressGoals() + lifecycleGoals() + lookupGoals() + scxmlGoals();
}
