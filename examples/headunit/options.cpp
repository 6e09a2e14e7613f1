#include "options.h"

#include "rules.h"
#include "scenario/commands.h"
#include "scenario/fault.h"

#include <QCommandLineParser>
#include <QDir>

namespace headunit {

namespace {

constexpr int maximumPaceMs = 60000;

const QCommandLineOption scenarioOption("scenario", "The scenario to run.", "FILE");
const QCommandLineOption headlessOption("headless", "Run the scenario without a scene.");
const QCommandLineOption screenshotsOption(
    "screenshots", "Save a picture of each step of the scenario in this folder.", "DIR");
const QCommandLineOption paceOption("pace", "How long each step of the scenario can be looked at.",
                                    "MILLISECONDS", "0");
const QCommandLineOption panelsOption("panels", "Open the panels for developers.");
const QCommandLineOption rulesOption("rules", "The popups' rules, in place of the built-in ones.",
                                     "FILE", builtInRules());
const QCommandLineOption firstStartOption("first-start", "Start as out of the factory.");
const QCommandLineOption listOption("list", "List the views and exit.");
const QCommandLineOption inventoryOption(
    "inventory", "Print the popups, domains and views for hmi-rules and exit.");
const QCommandLineOption verboseOption("verbose", "Show the library's debug messages.");
const QCommandLineOption helpOption({"h", "help"}, "Show this help and exit.");

void describe(QCommandLineParser *parser)
{
    parser->setApplicationDescription(
        "A head unit. Without a scenario it is for you to drive: F1 shows the keys. With one it "
        "goes through its steps and tells what its view layer was told.\n\n"
        "A scenario is a text file, one command a line:\n"
        + commandHelp());
    parser->addOptions({scenarioOption, headlessOption, screenshotsOption, paceOption, panelsOption,
                        rulesOption, firstStartOption, listOption, inventoryOption, verboseOption,
                        helpOption});
    parser->addPositionalArgument("FILE", "The scenario to run.", "[FILE]");
}

// What is wrong with the combination of options; empty when nothing is.
QString contradiction(const QCommandLineParser &parser, const QStringList &files)
{
    if (parser.isSet(listOption) && parser.isSet(inventoryOption)) {
        return "expected --list or --inventory, found both";
    }
    const bool list = parser.isSet(listOption) || parser.isSet(inventoryOption);
    const bool headless = parser.isSet(headlessOption);
    const int wanted = list ? 0 : 1;
    if (files.size() > wanted || (headless && files.size() < wanted)) {
        return QString("expected %1 scenario file, found %2")
            .arg(list ? "no" : "one")
            .arg(files.size());
    }
    if (headless && parser.isSet(screenshotsOption)) {
        return "expected a scene for --screenshots, found --headless";
    }
    if (files.isEmpty() && parser.isSet(screenshotsOption)) {
        return "expected a scenario file with --screenshots, found none";
    }
    return QString();
}

// The same for the values of options.
QString wrongValue(const QCommandLineParser &parser)
{
    bool isNumber = false;
    const int pace = parser.value(paceOption).toInt(&isNumber);
    if (!isNumber || pace < 0 || pace > maximumPaceMs) {
        return QString("expected a whole number from 0 to %1 for --pace, found %2")
            .arg(maximumPaceMs)
            .arg(quoted(parser.value(paceOption)));
    }
    const QString folder = parser.value(screenshotsOption);
    if (parser.isSet(screenshotsOption) && !QDir().mkpath(folder)) {
        return "expected a folder that can be made for --screenshots, found " + quoted(folder);
    }
    return QString();
}

} // namespace

QString parseOptions(const QStringList &arguments, Options *options)
{
    QCommandLineParser parser;
    describe(&parser);
    if (!parser.parse(arguments)) {
        return parser.errorText();
    }
    options->help = parser.isSet(helpOption);
    if (options->help) {
        return QString();
    }
    const QStringList files = parser.values(scenarioOption) + parser.positionalArguments();
    for (const QString &fault : {contradiction(parser, files), wrongValue(parser)}) {
        if (!fault.isEmpty()) {
            return fault;
        }
    }
    options->scenario = files.value(0);
    options->headless = parser.isSet(headlessOption);
    options->screenshots = parser.value(screenshotsOption);
    options->paceMs = parser.value(paceOption).toInt();
    options->panels = parser.isSet(panelsOption);
    options->rules = parser.value(rulesOption);
    options->firstStart = parser.isSet(firstStartOption);
    options->list = parser.isSet(listOption);
    options->inventory = parser.isSet(inventoryOption);
    options->verbose = parser.isSet(verboseOption);
    return QString();
}

QString helpText()
{
    QCommandLineParser parser;
    describe(&parser);
    return parser.helpText();
}

} // namespace headunit
