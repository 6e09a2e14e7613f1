#include "flow/flow.h"
#include "hardkeys.h"
#include "messages.h"
#include "rules.h"
#include "scenario/commands.h"
#include "scenario/scenariofile.h"
#include "scenario/scenarioparser.h"
#include "scenario/scenariorunner.h"
#include "scenario/vocabulary.h"
#include "transcript.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QLoggingCategory>

#include <cstdio>

using namespace headunit;

namespace {

enum ExitCode { Success = 0, ScenarioFailed = 1, UsageError = 2 };

const QCommandLineOption scenarioOption("scenario", "The scenario to run.", "FILE");
const QCommandLineOption rulesOption("rules", "The popups' rules, in place of the built-in ones.",
                                     "FILE", builtInRules());
const QCommandLineOption firstStartOption("first-start", "Start as out of the factory.");
const QCommandLineOption listOption("list", "List the views and exit.");
const QCommandLineOption verboseOption("verbose", "Show the library's debug messages.");
const QCommandLineOption helpOption({"h", "help"}, "Show this help and exit.");

void write(FILE *file, const QString &text)
{
    QTextStream stream(file);
    stream.setCodec("UTF-8");
    stream << text << '\n';
}

void describe(QCommandLineParser *parser)
{
    parser->setApplicationDescription("Drives the screen flow of a head unit through a scenario "
                                      "and tells what its view layer was told.\n\n"
                                      "A scenario is a text file, one command a line:\n"
                                      + commandHelp());
    parser->addOptions(
        {scenarioOption, rulesOption, firstStartOption, listOption, verboseOption, helpOption});
    parser->addPositionalArgument("FILE", "The scenario to run.", "[FILE]");
}

int usageError(const QString &text)
{
    write(stderr, text + "\n    remedy: headunit --help tells how to use it");
    return UsageError;
}

void setLogging(bool verbose)
{
    const QString debug = verbose ? "true" : "false";
    QLoggingCategory::setFilterRules(
        QString("vosk.hmistatemachine.debug=%1\nhmi.performance.debug=%1\nhmi.trace.debug=%1")
            .arg(debug));
    HmiStateMachine::NamedState::setLoggingEnabled(verbose);
    hidePopupTraces();
}

std::optional<LocatedFault> runScenario(const QString &path, const Stage &stage)
{
    QStringList lines;
    if (const auto fault = readScenarioFile(path, &lines)) {
        return fault;
    }
    QVector<Command> commands;
    if (const auto fault = parseScenario(lines, &commands)) {
        return fault;
    }
    ScenarioRunner runner(stage);
    runner.start();
    return runner.run(commands);
}

ExitCode report(const QString &file, const std::optional<LocatedFault> &fault,
                const Transcript &transcript)
{
    if (fault) {
        write(stderr, faultText(file, *fault));
        return ScenarioFailed;
    }
    if (transcript.failed()) {
        write(stderr,
              "expected to write the transcript, found an error of the output\n"
              "    remedy: look whether the disk is full");
        return ScenarioFailed;
    }
    return Success;
}

int drive(const QCommandLineParser &parser, const QStringList &files)
{
    Transcript transcript(stdout);
    ViewLayer viewLayer(transcript);
    const QString rules = parser.value(rulesOption);
    if (const auto fault = loadRules(rules)) {
        return report(rules, fault, transcript);
    }
    Vehicle vehicle;
    vehicle.setFirstStart(parser.isSet(firstStartOption));
    HardKeys keys;
    buildFlow({&vehicle, &keys, &viewLayer});
    if (parser.isSet(listOption)) {
        write(stdout, viewStateNames().join('\n'));
        return Success;
    }
    const auto fault = runScenario(files.first(), {&vehicle, &keys, &viewLayer, &transcript});
    HmiStateMachine::StateMachine::instance()->stop();
    QCoreApplication::sendPostedEvents();
    return report(files.first(), fault, transcript);
}

} // namespace

int main(int argc, char *argv[])
{
    QCoreApplication app(argc, argv);
    QCoreApplication::setApplicationName("headunit");
    QCommandLineParser parser;
    describe(&parser);
    if (!parser.parse(app.arguments())) {
        return usageError(parser.errorText());
    }
    if (parser.isSet(helpOption)) {
        write(stdout, parser.helpText());
        return Success;
    }
    const QStringList files = parser.values(scenarioOption) + parser.positionalArguments();
    const bool list = parser.isSet(listOption);
    if (list ? !files.isEmpty() : files.size() != 1) {
        return usageError(QString("expected %1 scenario file, found %2")
                              .arg(list ? "no" : "one")
                              .arg(files.size()));
    }
    setLogging(parser.isSet(verboseOption));
    return drive(parser, files);
}
