#include "commandline.h"

#include "selection.h"

#include <QCommandLineParser>

namespace {

constexpr int mostRounds = 1000;

const auto description =
    "Measures the library against a hand-written QStateMachine, Qt SCXML and the floor without a\n"
    "machine: CPU time in turn, instructions under valgrind, allocations. Prints a table of all\n"
    "workloads and one of the goals. An engine that does not show the same fails the run.";

const auto examples =
    "\n"
    "Examples:\n"
    "  hmi-benchmark --only W1 --only W3/16 --rounds 5 --no-count   a quick look at the time\n"
    "  hmi-benchmark --json now.json --before earlier.json          both figures side by side\n"
    "  hmi-benchmark --smoke benchmarks/results/current.json --only W3\n"
    "\n"
    "Exit code: 0 when all went well, goals met or not; 1 when engines differ, valgrind fails or\n"
    "instructions have grown; 2 for a wrong command line or a file that cannot be used.\n";

/** The options; each is named once. */
struct Options
{
    QCommandLineOption help{{"h", "help"}, "Prints this help."};
    QCommandLineOption list{"list", "Lists the workloads."};
    QCommandLineOption only{"only", "Takes this workload (W1/100) or family (W1); may be repeated.",
                            "ID"};
    QCommandLineOption rounds{"rounds",
                              QStringLiteral("Timed rounds, 1 to %1; %2 if not given.")
                                  .arg(mostRounds)
                                  .arg(Effort().rounds),
                              "N"};
    QCommandLineOption oneLayout{"one-layout", "Runs every workload in one memory layout only."};
    QCommandLineOption noCount{"no-count", "Counts no instructions: valgrind is not needed."};
    QCommandLineOption json{"json", "Writes all figures to FILE.", "FILE"};
    QCommandLineOption text{"text", "Writes the tables to FILE as well.", "FILE"};
    QCommandLineOption markdown{"markdown", "Writes the tables to FILE as Markdown.", "FILE"};
    QCommandLineOption before{"before",
                              "Puts the figures of an earlier --json beside the new ones.", "FILE"};
    QCommandLineOption smoke{
        "smoke", "Only counts instructions and fails where they have grown since FILE, a --json.",
        "FILE"};
    QCommandLineOption check{"check", "Only compares what the engines show, in a few seconds."};
    QCommandLineOption runForCounting{"run-for-counting"};

    Options() { runForCounting.setFlags(QCommandLineOption::HiddenFromHelp); }
};

void addOptions(const Options &options, QCommandLineParser *parser)
{
    parser->setApplicationDescription(description);
    parser->addOptions({options.help, options.list, options.only, options.rounds, options.oneLayout,
                        options.noCount, options.json, options.text, options.markdown,
                        options.before, options.smoke, options.check, options.runForCounting});
}

// What is asked for beside a whole run, at most one; what only a whole run can give goes with none.
bool readTask(const QCommandLineParser &parser, const Options &options, Task *task, QString *error)
{
    const QVector<QPair<QCommandLineOption, Task>> others{
        {options.list, Task::List},
        {options.check, Task::Check},
        {options.smoke, Task::Smoke},
        {options.runForCounting, Task::RunForCounting}};
    QStringList given;
    for (const auto &other : others) {
        if (parser.isSet(other.first)) {
            given.append(other.first.names().first());
            *task = other.second;
        }
    }
    const QCommandLineOption wholeRun[] = {options.rounds, options.noCount,  options.json,
                                           options.text,   options.markdown, options.before};
    for (const QCommandLineOption &option : wholeRun) {
        if (!given.isEmpty() && parser.isSet(option)) {
            given.append(option.names().first());
        }
    }
    if (given.size() > 1) {
        *error = QStringLiteral("--%1 and --%2 do not go together; leave one of them out.")
                     .arg(given.at(0), given.at(1));
        return false;
    }
    return true;
}

bool readRounds(const QString &text, int *rounds, QString *error)
{
    bool isNumber = false;
    *rounds = text.toInt(&isNumber);
    if (!isNumber || *rounds < 1 || *rounds > mostRounds) {
        *error =
            QStringLiteral("--rounds %1: give a number from 1 to %2.").arg(text).arg(mostRounds);
        return false;
    }
    return true;
}

bool parse(const QStringList &arguments, QCommandLineParser *parser, QString *error)
{
    if (!parser->parse(arguments)) {
        *error = parser->errorText();
        return false;
    }
    if (!parser->positionalArguments().isEmpty()) {
        *error = QStringLiteral("Unexpected argument '%1'; every argument is an option.")
                     .arg(parser->positionalArguments().first());
        return false;
    }
    return true;
}

} // namespace

bool readCommandLine(const QStringList &arguments, CommandLine *commandLine, QString *error)
{
    const Options options;
    QCommandLineParser parser;
    addOptions(options, &parser);
    if (!parse(arguments, &parser, error)) {
        return false;
    }
    commandLine->help = parser.helpText() + examples;
    if (parser.isSet(options.help)) {
        commandLine->task = Task::Help;
        return true;
    }
    commandLine->effort.layouts = !parser.isSet(options.oneLayout);
    commandLine->count = !parser.isSet(options.noCount);
    commandLine->jsonFile = parser.value(options.json);
    commandLine->textFile = parser.value(options.text);
    commandLine->markdownFile = parser.value(options.markdown);
    commandLine->beforeFile = parser.value(options.before);
    commandLine->smokeFile = parser.value(options.smoke);
    if (parser.isSet(options.rounds)
        && !readRounds(parser.value(options.rounds), &commandLine->effort.rounds, error)) {
        return false;
    }
    return readTask(parser, options, &commandLine->task, error)
        && select(allWorkloads(), parser.values(options.only), &commandLine->workloads, error);
}
