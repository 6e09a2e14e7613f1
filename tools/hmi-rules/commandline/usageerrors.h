#pragma once

#include "commandline/splitting.h"

namespace hmirules {

/** What is wrong with the command or its parameters, the first of all faults; empty for nothing. */
QByteArray usageError(const SplitArguments &split, const std::vector<std::string> &arguments);

} // namespace hmirules
