#pragma once

#include "scenarioparser.h"

namespace headunit {

/** Starts the machine and runs commands one after the other, each until nothing moves any more. */
class ScenarioRunner
{
public:
    explicit ScenarioRunner(const Stage &stage);

    void start();

    /** Stops at the first fault. */
    std::optional<LocatedFault> run(const QVector<Command> &commands);

private:
    std::optional<Fault> runCommand(const Command &command);
    void settle();

    Stage m_stage;
};

} // namespace headunit
