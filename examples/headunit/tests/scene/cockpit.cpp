#include "cockpit.h"

#include "flow/flow.h"
#include "messages.h"
#include "scenario/scenariofile.h"

#include <HmiStateMachine/named/statemachine.h>

#include <QCoreApplication>
#include <QLoggingCategory>

using HmiStateMachine::StateMachine;

namespace headunit {

Cockpit::Cockpit(const Timing &timing, Scene::Time time)
    : m_nowhere(std::fopen("/dev/null", "w")), transcript(m_nowhere.get()), viewLayer(transcript)
{
    QLoggingCategory::setFilterRules("*.debug=false");
    hidePopupTraces();
    connectKeys(viewLayer.requests(), &keys);
    buildFlow({&vehicle, &keys, &viewLayer, timing});
    inspector = std::make_unique<Inspector>(&viewLayer);
    scene = std::make_unique<Scene>(&vehicle, &viewLayer, inspector.get(), time);
}

Cockpit::~Cockpit()
{
    scene.reset();
    StateMachine::instance()->stop();
    QCoreApplication::sendPostedEvents();
}

Stage Cockpit::stage()
{
    return {&vehicle, &keys, &viewLayer, &transcript};
}

QVector<Command> Cockpit::readScenario(const QString &path)
{
    QStringList lines;
    QVector<Command> commands;
    auto fault = readScenarioFile(path, &lines);
    if (!fault) {
        fault = parseScenario(lines, &commands);
    }
    if (fault) {
        qCritical("%s", qPrintable(faultText(path, *fault)));
        return {};
    }
    return commands;
}

} // namespace headunit
