#pragma once

#include "scenarioparser.h"

namespace headunit {

class Audience;

/** Starts the machine and runs commands one after the other, each until nothing moves any more. */
class ScenarioRunner
{
public:
    /** @p audience may be null, and outlives this. */
    explicit ScenarioRunner(const Stage &stage, Audience *audience = nullptr);

    std::optional<Fault> start();

    /** Stops at the first fault. */
    std::optional<LocatedFault> run(const QVector<Command> &commands);

private:
    std::optional<Fault> runCommand(const Command &command);
    std::optional<Fault> settle();

    Stage m_stage;
    Audience *m_audience;
};

} // namespace headunit
