#include "fault.h"

#include "report/visible.h"

namespace hmirules {

QString toText(const Fault &fault)
{
    const QString place =
        fault.file.isEmpty() ? QString("hmi-rules") : placeText(fault.file, fault.at);
    QString text = place + ": error: " + visible(fault.message) + '\n';
    if (!fault.remedy.isEmpty()) {
        text += "    Remedy: " + visible(fault.remedy) + '\n';
    }
    return text;
}

QString placeText(const QString &file, const TextPosition &at)
{
    return visible(file)
        + (at.line == 0 ? QString() : QString(":%1:%2").arg(at.line).arg(at.column));
}

} // namespace hmirules
