#pragma once

/** How much the library tells of what it does. */
enum class LoggingLevel {
    Warnings, ///< as on the target
    Asked, ///< every entry and exit asked for, but debug output off
    Debug, ///< debug output on
    Entries ///< both
};

void setLoggingLevel(LoggingLevel level);
