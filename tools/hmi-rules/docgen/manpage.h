#pragma once

#include "commandline/definitions.h"

namespace hmirules {

/** The program's page for section 1 of the manual. */
QByteArray manPage(const ProgramDefinition &program);

} // namespace hmirules
