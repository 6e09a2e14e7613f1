#include "flowshape.h"

namespace {

QStringList numbered(const QString &prefix, int count)
{
    QStringList result;
    result.reserve(count);
    for (int i = 0; i < count; ++i) {
        result.append(QStringLiteral("%1%2").arg(prefix).arg(i, 5, 10, QLatin1Char('0')));
    }
    return result;
}

} // namespace

QStringList FlowShape::viewNames() const
{
    return numbered(QStringLiteral("View"), views);
}

QStringList FlowShape::screens() const
{
    return byScreen ? numbered(QStringLiteral("Screen"), views) : viewNames();
}

QStringList FlowShape::popupNames() const
{
    return numbered(QStringLiteral("Popup"), popups);
}
