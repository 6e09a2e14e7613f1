#pragma once

#include <QHash>
#include <QStringList>

namespace headunit {

/** What a view layer has to remember of popups, all by popup view id. */
class PopupBoard
{
public:
    void show(const QString &id);

    /** Whether it was shown. */
    bool hide(const QString &id);

    /** The popup shown last that is not among @p stacked; empty when there is none. */
    QString front(const QStringList &stacked) const;

    void cover(const QString &id, const QString &coveringId);

    /** The popups that @p coveringId covered, which it does no more. */
    QStringList takeCoveredBy(const QString &coveringId);

    void refuse(const QString &id);

    /** In the order of their first refusal, without those that were shown since. */
    QStringList refused() const;

private:
    QStringList m_shown;
    QStringList m_refused;
    QHash<QString, QString> m_coveredBy;
};

} // namespace headunit
