#include "scenariorunner.h"

#include "audience.h"
#include "transcript.h"
#include "viewlayer.h"

#include <HmiStateMachine/named/statemachine.h>

#include <QCoreApplication>

using namespace HmiStateMachine;

namespace headunit {

ScenarioRunner::ScenarioRunner(const Stage &stage, Audience *audience)
    : m_stage(stage), m_audience(audience)
{
}

// What start-up shows is not counted: scenarios count from their own first command.
std::optional<Fault> ScenarioRunner::start()
{
    m_stage.transcript->narration("The head unit starts.");
    StateMachine::instance()->start();
    const auto fault = settle();
    m_stage.transcript->resetCalls();
    return fault;
}

std::optional<LocatedFault> ScenarioRunner::run(const QVector<Command> &commands)
{
    for (const Command &command : commands) {
        if (const auto fault = runCommand(command)) {
            return LocatedFault{command.line, *fault};
        }
    }
    return std::nullopt;
}

std::optional<Fault> ScenarioRunner::runCommand(const Command &command)
{
    Transcript &transcript = *m_stage.transcript;
    if (command.kind == CommandKind::Narration) {
        return command.action(m_stage);
    }
    transcript.command(command.echo);
    if (m_audience) {
        m_audience->commandBegins(command);
    }
    auto fault = command.action(m_stage);
    const auto sceneFault = settle();
    m_stage.viewLayer->takeVoiceRequest(); // one that no view has taken
    if (isStep(command.kind) && transcript.linesOfCommand() == 0) {
        transcript.note("no call");
    }
    if (!fault && !sceneFault && m_audience) {
        fault = m_audience->commandEnds(command);
    }
    return fault ? fault : sceneFault;
}

// Carries out all that is posted, and what that posts in turn, without letting time pass.
std::optional<Fault> ScenarioRunner::settle()
{
    QCoreApplication::sendPostedEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    return m_audience ? m_audience->settle() : std::nullopt;
}

} // namespace headunit
