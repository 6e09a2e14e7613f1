#include "measuring.h"

#include "allocations.h"
#include "memorylayout.h"

#include <algorithm>
#include <ctime>
#include <vector>

namespace {

double threadTime()
{
    timespec time;
    clock_gettime(CLOCK_THREAD_CPUTIME_ID, &time);
    constexpr double nanosecondsInSecond = 1e9;
    return static_cast<double>(time.tv_sec) * nanosecondsInSecond
        + static_cast<double>(time.tv_nsec);
}

double quantile(std::vector<double> values, double part)
{
    const auto nth = values.begin() + static_cast<long>(part * (values.size() - 1));
    std::nth_element(values.begin(), nth, values.end());
    return *nth;
}

/** One engine in one memory layout. */
struct Contestant
{
    Engine engine;
    std::unique_ptr<Flow> flow;
    std::vector<double> times; ///< nanoseconds an operation, round by round
};

double timeRound(Flow &flow, int operations)
{
    flow.before(operations);
    const double start = threadTime();
    flow.run(operations);
    const double time = threadTime() - start;
    flow.after();
    return time / operations;
}

Allocations countAllocations(Flow &flow, int operations)
{
    flow.before(operations);
    Allocations result;
    {
        const AllocationCount count;
        flow.run(operations);
        result = count.soFar();
    }
    flow.after();
    return result;
}

std::vector<Contestant> contestants(const Workload &workload, int layout)
{
    std::vector<Contestant> result;
    for (const Workload::Side &side : workload.sides) {
        const MemoryLayout scattered(static_cast<unsigned>(layout));
        result.push_back({side.engine, side.make(), {}});
        warmUp(*result.back().flow, workload);
    }
    return result;
}

void runRounds(std::vector<Contestant> &contestants, int rounds, int operations)
{
    for (int round = 0; round < rounds; ++round) {
        for (Contestant &contestant : contestants) {
            contestant.times.push_back(timeRound(*contestant.flow, operations));
        }
        // The engine that came first comes last in the next round.
        std::rotate(contestants.begin(), contestants.begin() + 1, contestants.end());
    }
}

bool agree(const std::vector<Contestant> &contestants, const QString &id, QString *error)
{
    for (const Contestant &contestant : contestants) {
        if (contestant.flow->checksum() != contestants.front().flow->checksum()) {
            *error =
                QStringLiteral("%1: %2 and %3 have not shown the same")
                    .arg(id, engineName(contestants.front().engine), engineName(contestant.engine));
            return false;
        }
    }
    return true;
}

TimeRatio ratio(const std::vector<double> &library, const std::vector<double> &other)
{
    std::vector<double> ratios(library.size());
    std::transform(library.begin(), library.end(), other.begin(), ratios.begin(),
                   [](double a, double b) { return a / b; });
    return {quantile(ratios, 0.5), quantile(ratios, 0.25), quantile(ratios, 0.75)};
}

// Of several layouts the one in which an engine is cheapest counts.
void keepTimes(const std::vector<Contestant> &contestants, QMap<Engine, std::vector<double>> *best)
{
    for (const Contestant &contestant : contestants) {
        auto &times = (*best)[contestant.engine];
        if (times.empty() || quantile(contestant.times, 0.5) < quantile(times, 0.5)) {
            times = contestant.times;
        }
    }
}

void keepAllocations(std::vector<Contestant> &contestants, const Workload &workload,
                     WorkloadResult *result)
{
    for (Contestant &contestant : contestants) {
        const Allocations allocations = countAllocations(*contestant.flow, workload.counted);
        const double count = static_cast<double>(allocations.count) / workload.counted;
        const bool isFirst = !result->has(contestant.engine);
        SideResult &side = result->sides[contestant.engine];
        if (isFirst || count < side.allocations) {
            side.allocations = count;
            side.heapBytes = static_cast<double>(allocations.bytes) / workload.counted;
        }
    }
}

} // namespace

void warmUp(Flow &flow, const Workload &workload)
{
    flow.before(workload.warmUp);
    flow.run(workload.warmUp);
    flow.after();
}

bool measure(const Workload &workload, const Effort &effort, WorkloadResult *result, QString *error)
{
    result->id = workload.id;
    result->title = workload.title;
    QMap<Engine, std::vector<double>> times;
    const int layouts = effort.layouts ? workload.layouts : 1;
    for (int layout = 0; layout < layouts; ++layout) {
        std::vector<Contestant> all = contestants(workload, layout);
        runRounds(all, effort.rounds, workload.timed);
        if (!agree(all, workload.id, error)) {
            return false;
        }
        keepTimes(all, &times);
        keepAllocations(all, workload, result);
    }
    for (auto it = times.cbegin(); it != times.cend(); ++it) {
        result->sides[it.key()].nanoseconds = quantile(it.value(), 0.5);
        if (it.key() != Engine::Library && times.contains(Engine::Library)) {
            result->timeRatios[it.key()] = ratio(times.value(Engine::Library), it.value());
        }
    }
    return true;
}
