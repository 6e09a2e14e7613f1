#pragma once

#include "fault.h"

#include <QList>

#include <functional>
#include <optional>

namespace headunit {

class Arguments;
class HardKeys;
class Transcript;
class Vehicle;
class ViewLayer;

/** What commands act on and look at. */
struct Stage
{
    Vehicle *vehicle;
    HardKeys *keys;
    ViewLayer *viewLayer;
    Transcript *transcript;
};

using Action = std::function<std::optional<Fault>(Stage &)>;

enum class CommandKind {
    Narration, ///< only tells something
    Step, ///< makes something happen, what came of it is shown below
    Wait, ///< a step in which time passes
    Check ///< looks whether all is as expected
};

/** Whether it makes something happen. */
bool isStep(CommandKind kind);

/** A command of the scenario language. To add one, write a parse function and list it. */
struct CommandDefinition
{
    const char *name;
    const char *usage;
    const char *help;
    CommandKind kind;
    Action (*parse)(Arguments &);
};

const QList<CommandDefinition> &commandDefinitions();

/** All commands with their usage, a line each. */
QString commandHelp();

} // namespace headunit
