#pragma once

#include "commandline/options.h"

namespace hmirules {

/** What of the options cannot be had together; empty for nothing. */
QByteArray contradiction(const Options &options);

} // namespace hmirules
