#pragma once

#include "commands.h"

#include <QStringList>
#include <QVector>

#include <optional>

namespace headunit {

/** A command of a scenario, ready to be run. */
struct Command
{
    int line;
    CommandKind kind;
    QString echo;
    Action action;
};

/**
 * Makes commands of lines; all of a scenario is understood before its first command runs. The flow
 * has to be built by now: names are checked here.
 */
std::optional<LocatedFault> parseScenario(const QStringList &lines, QVector<Command> *commands);

} // namespace headunit
