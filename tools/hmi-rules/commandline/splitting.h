#pragma once

#include "commandline/definitions.h"

#include <optional>
#include <string>
#include <vector>

namespace hmirules {

/** A parameter and the values that it was given; a flag's are "true". */
struct Given
{
    const Parameter *parameter;
    QByteArrayList values;
};

/** What stands on the command line, told apart and not judged. */
struct SplitArguments
{
    std::optional<QByteArray> word; ///< where the command stands
    const CommandDefinition *command = nullptr; ///< null when the word names none
    QByteArrayList outside; ///< what stands before the command and is none of the program's options
    QByteArrayList unknown; ///< what stands behind it and is none of its parameters
    QVector<Given> given; ///< in the order of the definitions
    QByteArray withoutValue; ///< the option at the end that lacks its value
};

SplitArguments split(const std::vector<std::string> &arguments);

} // namespace hmirules
