#include "scenariorunner.h"

#include "transcript.h"
#include "viewlayer.h"

#include <HmiStateMachine/named/statemachine.h>

#include <QCoreApplication>

using namespace HmiStateMachine;

namespace headunit {

ScenarioRunner::ScenarioRunner(const Stage &stage) : m_stage(stage)
{
}

// What start-up shows is not counted: scenarios count from their own first command.
void ScenarioRunner::start()
{
    m_stage.transcript->narration("The head unit starts.");
    StateMachine::instance()->start();
    settle();
    m_stage.transcript->resetCalls();
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
    const auto fault = command.action(m_stage);
    settle();
    m_stage.viewLayer->takeVoiceRequest(); // one that no view has taken
    if (command.kind == CommandKind::Step && transcript.linesOfCommand() == 0) {
        transcript.note("no call");
    }
    return fault;
}

// Carries out all that is posted, and what that posts in turn, without letting time pass.
void ScenarioRunner::settle()
{
    QCoreApplication::sendPostedEvents();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

} // namespace headunit
