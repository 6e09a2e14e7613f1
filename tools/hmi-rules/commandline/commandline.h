#pragma once

#include "commandline/options.h"

#include <optional>
#include <string>
#include <vector>

namespace hmirules {

/** Either what is to be done, or all that the program has to say. */
struct Parsed
{
    std::optional<Options> options;
    QByteArray text; ///< whole lines; without options, for the standard output when the exit code
                     ///< is 0, else for the standard error
    int exitCode = 0; ///< 2 when the command line is wrong
};

/** Writes nothing and does not exit. @p arguments come without the program's name. */
Parsed parse(const std::vector<std::string> &arguments);

} // namespace hmirules
