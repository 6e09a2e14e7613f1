#include "flow/flow.h"
#include "hardkeys.h"
#include "randomevents.h"
#include "residentmemory.h"
#include "rules.h"
#include "transcript.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QElapsedTimer>
#include <QLoggingCategory>

#include <cstdio>

using namespace headunit;

namespace {

enum ExitCode { Flat = 0, Grown = 1, UsageError = 2 };

constexpr int warmUp = 100000;
constexpr int sampleEvery = 50000;
constexpr int maximumEvents = 1000000000;

struct Task
{
    int events;
    quint32 seed;
    int spill;
};

const QCommandLineOption eventsOption("events", "How many events; 200000 at least.", "N",
                                      "10000000");
const QCommandLineOption seedOption("seed", "Which events: the same for the same seed.", "N", "1");
const QCommandLineOption spillOption(
    "spill", "Lose so many bytes with each event, to see that growth is found.", "BYTES", "0");

// What the library warns of is counted, and not written: there is a warning for each popup.
int messageCount = 0;

void countMessage(QtMsgType, const QMessageLogContext &, const QString &)
{
    ++messageCount;
}

int number(const QCommandLineParser &parser, const QCommandLineOption &option, int minimum)
{
    bool isNumber = false;
    const int value = parser.value(option).toInt(&isNumber);
    if (!isNumber || value < minimum || value > maximumEvents) {
        std::fprintf(stderr, "expected a whole number from %d to %d for --%s, found \"%s\"\n",
                     minimum, maximumEvents, qPrintable(option.names().first()),
                     qPrintable(parser.value(option)));
        std::exit(UsageError);
    }
    return value;
}

Task readTask()
{
    QCommandLineParser parser;
    parser.setApplicationDescription(
        "Takes the head unit's flow, without a scene, through events drawn by lot, and fails when "
        "the resident memory grows after the first 100000.");
    parser.addOptions({eventsOption, seedOption, spillOption});
    parser.addHelpOption();
    if (!parser.parse(QCoreApplication::arguments()) || !parser.positionalArguments().isEmpty()) {
        const QString fault = parser.errorText().isEmpty()
            ? "unexpected argument: " + parser.positionalArguments().value(0)
            : parser.errorText();
        std::fprintf(stderr, "%s\n", qPrintable(fault));
        std::exit(UsageError);
    }
    if (parser.isSet(QStringLiteral("help"))) {
        parser.showHelp(Flat);
    }
    return {number(parser, eventsOption, 2 * warmUp),
            static_cast<quint32>(number(parser, seedOption, 0)), number(parser, spillOption, 0)};
}

// 1, 2, 5, 10, 20, 50, ... times a hundred thousand.
bool isWorthALine(int events)
{
    while (events % 10 == 0) {
        events /= 10;
    }
    return events == 1 || events == 2 || events == 5;
}

void print(const MemorySample &sample)
{
    std::printf("%10d  %8.1f  %14lld  %12lld\n", sample.events, sample.seconds,
                static_cast<long long>(sample.resident / 1024),
                static_cast<long long>(sample.inUse / 1024));
    std::fflush(stdout);
}

QVector<MemorySample> drive(const Task &task, const Stage &stage)
{
    RandomEvents events(task.seed, stage);
    QVector<MemorySample> samples;
    samples.reserve(task.events / sampleEvery + 1);
    QElapsedTimer clock;
    clock.start();
    std::printf("    events   seconds  resident (KiB)  in use (KiB)\n");
    for (int i = 1; i <= task.events; ++i) {
        events.next();
        for (int lost = 0; lost < task.spill; lost += int(sizeof(int))) {
            new int(i); // cppcheck-suppress leakReturnValNotUsed; what is asked for
        }
        if (i % sampleEvery != 0 && i != task.events) {
            continue;
        }
        samples.append(takeMemorySample(i, clock.elapsed() / 1000.0));
        if (isWorthALine(i) || i == task.events) {
            print(samples.last());
        }
    }
    return samples;
}

int soak(const Task &task)
{
    FILE *nowhere = std::fopen("/dev/null", "w");
    Transcript transcript(nowhere);
    ViewLayer viewLayer(transcript);
    if (loadRules(builtInRules())) {
        return UsageError;
    }
    Vehicle vehicle;
    HardKeys keys;
    buildFlow({&vehicle, &keys, &viewLayer, scenarioTiming});
    HmiStateMachine::StateMachine::instance()->start();
    QCoreApplication::sendPostedEvents();

    const QString fault = growth(drive(task, {&vehicle, &keys, &viewLayer, &transcript}), warmUp);

    HmiStateMachine::StateMachine::instance()->stop();
    QCoreApplication::sendPostedEvents();
    std::fclose(nowhere);
    std::printf("%d calls of the view layer, %d messages of the library\n", transcript.calls(),
                messageCount);
    if (fault.isEmpty()) {
        std::printf("flat\n");
        return Flat;
    }
    std::printf("grown: %s\n", qPrintable(fault));
    return Grown;
}

} // namespace

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    const Task task = readTask();
    QLoggingCategory::setFilterRules(QStringLiteral("*.debug=false"));
    HmiStateMachine::NamedState::setLoggingEnabled(false);
    qInstallMessageHandler(countMessage);
    return soak(task);
}
