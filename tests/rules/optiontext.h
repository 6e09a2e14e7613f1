#pragma once

#include "commandline/options.h"

/** The members that differ from their defaults, as "member=value", a blank between; lists with ",".
 */
QString optionText(const hmirules::Options &options);
