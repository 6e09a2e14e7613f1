#include "fault.h"

namespace headunit {

namespace {

constexpr int maximumQuoted = 60;

} // namespace

QString faultText(const QString &file, const LocatedFault &located)
{
    QString text = file;
    if (located.line > 0) {
        text += ':' + QString::number(located.line);
    }
    text += ": expected " + located.fault.expected + ", found " + located.fault.found;
    if (!located.fault.remedy.isEmpty()) {
        text += "\n    remedy: " + located.fault.remedy;
    }
    return text;
}

QString quoted(const QString &text)
{
    return '"' + (text.size() > maximumQuoted ? text.left(maximumQuoted) + "..." : text) + '"';
}

} // namespace headunit
