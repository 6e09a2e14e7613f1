#pragma once

#include "commands.h"

namespace hmirules {

/**
 * Writes what came of a command. A file that exists is replaced as a whole or not at all. Returns
 * the exit code, which is exitUnusable when nothing could be written.
 */
int write(const Outcome &outcome, const QByteArray &path);

} // namespace hmirules
