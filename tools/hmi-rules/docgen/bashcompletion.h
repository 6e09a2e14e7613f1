#pragma once

#include "commandline/definitions.h"

#include <QStringList>

namespace hmirules {

/** A script that completes the program's command line in bash; it needs nothing but bash. */
QByteArray bashCompletion(const ProgramDefinition &program, const QByteArray &scriptTemplate,
                          const QStringList &findingIds);

/** One word of a shell's command line. */
QByteArray shellQuoted(const QByteArray &word);

} // namespace hmirules
