#include "fault.h"

namespace hmirules {

QString toText(const Fault &fault)
{
    const QString place =
        fault.file.isEmpty() ? QString("hmi-rules") : placeText(fault.file, fault.at);
    QString text = place + ": error: " + fault.message + '\n';
    if (!fault.remedy.isEmpty()) {
        text += "    Remedy: " + fault.remedy + '\n';
    }
    return text;
}

QString placeText(const QString &file, const TextPosition &at)
{
    return at.line == 0 ? file : QString("%1:%2:%3").arg(file).arg(at.line).arg(at.column);
}

} // namespace hmirules
