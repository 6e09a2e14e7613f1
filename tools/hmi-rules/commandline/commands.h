#pragma once

#include "commandline/definitions.h"

namespace hmirules {

CommandDefinition lintCommand();
CommandDefinition explainCommand();
CommandDefinition matrixCommand();
CommandDefinition diffCommand();
CommandDefinition schemaCommand();
CommandDefinition findingsCommand();

} // namespace hmirules
