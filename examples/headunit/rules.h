#pragma once

#include "scenario/fault.h"

#include <optional>

namespace headunit {

/** The rules that are built in. */
QString builtInRules();

/**
 * Loads the popups' rules. The library warns of every fault within the file and loads the rest; a
 * file without any rules is a fault here, because nothing would be refused any more.
 */
std::optional<LocatedFault> loadRules(const QString &path);

} // namespace headunit
