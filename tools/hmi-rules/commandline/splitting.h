#pragma once

#include "commandline/definitions.h"

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
    const CommandDefinition *command = nullptr; ///< null when none is given
    QVector<Given> given; ///< the program's options, then the command's, in the order defined
    QByteArrayList outside; ///< what stands before a command and is none of the program's options
    QByteArrayList unknown; ///< what no parameter of the command takes
    QByteArray withoutValue; ///< the option at the end that lacks its value
};

SplitArguments split(const std::vector<std::string> &arguments);

} // namespace hmirules
