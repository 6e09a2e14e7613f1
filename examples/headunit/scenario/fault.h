#pragma once

#include <QString>

namespace headunit {

/** Why a scenario cannot go on. */
struct Fault
{
    QString expected;
    QString found;
    QString remedy; ///< may be empty
};

/** A fault and where it stands; line 0 is the file as a whole. */
struct LocatedFault
{
    int line;
    Fault fault;
};

/** "file:line: expected this, found that", and the remedy on a line of its own. */
QString faultText(const QString &file, const LocatedFault &located);

/** In double quotes, shortened when it is long. */
QString quoted(const QString &text);

} // namespace headunit
