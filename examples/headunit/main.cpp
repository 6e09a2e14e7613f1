#include "flow/flow.h"
#include "hardkeys.h"
#include "inventory.h"
#include "messages.h"
#include "options.h"
#include "rules.h"
#include "scenario/commands.h"
#include "scenario/scenariofile.h"
#include "scenario/scenarioparser.h"
#include "scenario/scenariorunner.h"
#include "scenario/vocabulary.h"
#include "scene/inspector.h"
#include "scene/scene.h"
#include "scene/services.h"
#include "scene/spectator.h"
#include "transcript.h"
#include "vehicle.h"
#include "viewlayer.h"

#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachineQuick/requests.h>

#include <QGuiApplication>
#include <QLoggingCategory>

#include <algorithm>
#include <cstdio>

using namespace headunit;

namespace {

enum ExitCode { Success = 0, ScenarioFailed = 1, UsageError = 2 };

void write(FILE *file, const QString &text)
{
    QTextStream stream(file);
    stream.setCodec("UTF-8");
    stream << text << '\n';
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

std::optional<LocatedFault> readScenario(const QString &path, QVector<Command> *commands)
{
    QStringList lines;
    if (const auto fault = readScenarioFile(path, &lines)) {
        return fault;
    }
    return parseScenario(lines, commands);
}

std::optional<LocatedFault> runScenario(const QVector<Command> &commands, const Stage &stage,
                                        Audience *audience)
{
    ScenarioRunner runner(stage, audience);
    if (const auto fault = runner.start()) {
        return LocatedFault{0, *fault};
    }
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

// The pictures are told of on the side: the transcript is the same with a scene and without one.
void tellPicture(const QString &step, const QString &file)
{
    write(stderr, "picture of \"" + step + "\": " + file);
}

std::optional<LocatedFault> showScenario(const QVector<Command> &commands, const Stage &stage,
                                         const Options &options)
{
    Inspector inspector(stage.viewLayer);
    Scene scene(stage.vehicle, stage.viewLayer, &inspector, Scene::OwnTime);
    if (const auto fault = scene.open(options.panels)) {
        return LocatedFault{0, *fault};
    }
    Spectator spectator(&scene, &inspector, stage.viewLayer,
                        {options.screenshots, options.paceMs, tellPicture});
    return runScenario(commands, stage, &spectator);
}

ExitCode driveScenario(const Options &options, const Stage &stage)
{
    QVector<Command> commands;
    auto fault = readScenario(options.scenario, &commands);
    if (!fault) {
        fault = options.headless ? runScenario(commands, stage, nullptr)
                                 : showScenario(commands, stage, options);
    }
    return report(options.scenario, fault, *stage.transcript);
}

// The car is a person's: it goes on until the window is closed.
ExitCode driveByHand(const Options &options, const Stage &stage)
{
    Inspector inspector(stage.viewLayer);
    Services services(stage.vehicle);
    Scene scene(stage.vehicle, stage.viewLayer, &inspector, Scene::RunningTime);
    HmiStateMachine::StateMachine::instance()->start();
    services.start();
    if (const auto fault = scene.open(options.panels)) {
        return report("the scene", LocatedFault{0, *fault}, *stage.transcript);
    }
    QCoreApplication::exec();
    return report("the output", std::nullopt, *stage.transcript);
}

int drive(const Options &options)
{
    Transcript transcript(stdout);
    ViewLayer viewLayer(transcript);
    if (const auto fault = loadRules(options.rules)) {
        return report(options.rules, fault, transcript);
    }
    Vehicle vehicle;
    vehicle.setFirstStart(options.firstStart);
    HardKeys keys;
    connectKeys(viewLayer.requests(), &keys);
    buildFlow(
        {&vehicle, &keys, &viewLayer, options.scenario.isEmpty() ? personTiming : scenarioTiming});
    if (options.list) {
        write(stdout, viewStateNames().join('\n'));
        return Success;
    }
    if (options.inventory) {
        write(stdout, inventory());
        return Success;
    }
    const Stage stage{&vehicle, &keys, &viewLayer, &transcript};
    const ExitCode code =
        options.scenario.isEmpty() ? driveByHand(options, stage) : driveScenario(options, stage);
    HmiStateMachine::StateMachine::instance()->stop();
    QCoreApplication::sendPostedEvents();
    return code;
}

bool hasDisplay()
{
    const char *const variables[] = {"DISPLAY", "WAYLAND_DISPLAY", "QT_QPA_PLATFORM"};
    return std::any_of(std::begin(variables), std::end(variables),
                       [](const char *name) { return !qEnvironmentVariableIsEmpty(name); });
}

// Read before there is an application object, which needs a display for a scene.
bool isHeadless(int argc, char *argv[])
{
    const auto skipsScene = [](const char *argument) {
        const QLatin1String text(argument);
        return text == QLatin1String("--headless") || text == QLatin1String("--list")
            || text == QLatin1String("--inventory") || text == QLatin1String("--help")
            || text == QLatin1String("-h");
    };
    return std::any_of(argv + 1, argv + argc, skipsScene);
}

int run(bool headless)
{
    QCoreApplication::setApplicationName("headunit");
    Options options;
    const QString fault = parseOptions(QCoreApplication::arguments(), &options);
    if (!fault.isEmpty()) {
        return usageError(fault);
    }
    if (options.help) {
        write(stdout, helpText());
        return Success;
    }
    if (!headless && !hasDisplay()) {
        return usageError("expected a display, found none; --headless needs none");
    }
    setLogging(options.verbose);
    return drive(options);
}

} // namespace

int main(int argc, char *argv[])
{
    const bool headless = isHeadless(argc, argv) || !hasDisplay();
    if (headless) {
        QCoreApplication app(argc, argv);
        return run(isHeadless(argc, argv));
    }
    // Frames are drawn when the scenario says so, on this thread.
    qputenv("QSG_RENDER_LOOP", "basic");
    QGuiApplication app(argc, argv);
    return run(false);
}
