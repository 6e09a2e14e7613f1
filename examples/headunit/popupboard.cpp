#include "popupboard.h"

namespace headunit {

void PopupBoard::show(const QString &id)
{
    m_shown.removeAll(id);
    m_shown.append(id);
    m_refused.removeAll(id);
}

bool PopupBoard::hide(const QString &id)
{
    return m_shown.removeAll(id) > 0;
}

QString PopupBoard::front(const QStringList &stacked) const
{
    for (int i = m_shown.size() - 1; i >= 0; --i) {
        if (!stacked.contains(m_shown[i])) {
            return m_shown[i];
        }
    }
    return QString();
}

void PopupBoard::cover(const QString &id, const QString &coveringId)
{
    m_coveredBy.insert(id, coveringId);
}

QStringList PopupBoard::takeCoveredBy(const QString &coveringId)
{
    QStringList ids = m_coveredBy.keys(coveringId);
    ids.sort(); // a hash has no order of its own
    for (const QString &id : qAsConst(ids)) {
        m_coveredBy.remove(id);
    }
    return ids;
}

void PopupBoard::refuse(const QString &id)
{
    if (!m_refused.contains(id)) {
        m_refused.append(id);
    }
}

QStringList PopupBoard::refused() const
{
    return m_refused;
}

} // namespace headunit
