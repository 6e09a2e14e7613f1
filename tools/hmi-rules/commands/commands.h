#pragma once

#include "commandline/options.h"

#include <QByteArray>

namespace hmirules {

constexpr int exitFine = 0;
constexpr int exitFound = 1; ///< findings that count as failure, or changes
constexpr int exitUnusable = 2; ///< of the command line too

/** What a command came to. */
struct Outcome
{
    int exitCode = exitFine;
    QByteArray output; ///< for the standard output or the file that the options name
    QByteArray errors; ///< for the standard error
    bool hasOutput = false; ///< otherwise no file is touched
};

Outcome runLint(const Options &options);
Outcome runExplain(const Options &options);
Outcome runMatrix(const Options &options);
Outcome runDiff(const Options &options);
Outcome runSchema(const Options &options);
Outcome runFindings(const Options &options);

/** Whichever command the options name. */
Outcome run(const Options &options);

} // namespace hmirules
