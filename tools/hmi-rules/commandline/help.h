#pragma once

#include "commandline/definitions.h"

namespace hmirules {

QByteArray programHelp();
QByteArray commandHelp(const CommandDefinition &command);

/** "[OPTION...] FILE": what follows the command's name. */
QByteArray usageOf(const CommandDefinition &command);

/** "-o, --output FILE", as options stand in help and man page. */
QByteArray headingOf(const Parameter &parameter);

} // namespace hmirules
