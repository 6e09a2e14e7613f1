#pragma once

#include "commands.h"

namespace headunit {

constexpr const char *expectUsage =
    "expect view ID | back VIEW | back none | entered STATE | left STATE | calls NUMBER | "
    "popup NAME | popup none | stacked NAME... | stacked none | blocked NAME";

/** What a scenario can expect. A check looks and changes nothing but the count of calls. */
Action parseExpect(Arguments &arguments);

} // namespace headunit
