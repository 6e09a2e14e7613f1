#include "requestlog.h"

#include <QTime>

namespace headunit {

namespace {

constexpr int maximumEntries = 20;

} // namespace

RequestLog::RequestLog(QObject *parent) : QAbstractListModel(parent)
{
}

RequestLog::~RequestLog() = default;

int RequestLog::count() const
{
    return m_entries.size();
}

int RequestLog::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_entries.size();
}

QVariant RequestLog::data(const QModelIndex &index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid)) {
        return QVariant();
    }
    const Entry &entry = m_entries[index.row()];
    switch (role) {
    case NumberRole:
        return entry.number;
    case TimeRole:
        return entry.time;
    case RequestRole:
        return entry.request;
    case OutcomeRole:
        return entry.outcome;
    case AcceptedRole:
        return entry.accepted;
    default:
        return QVariant();
    }
}

QHash<int, QByteArray> RequestLog::roleNames() const
{
    return {{NumberRole, "number"},
            {TimeRole, "time"},
            {RequestRole, "request"},
            {OutcomeRole, "outcome"},
            {AcceptedRole, "accepted"}};
}

void RequestLog::add(const QString &request)
{
    beginInsertRows(QModelIndex(), 0, 0);
    m_entries.prepend(
        {++m_number, QTime::currentTime().toString("HH:mm:ss"), request, QString(), true});
    endInsertRows();
    if (m_entries.size() > maximumEntries) {
        beginRemoveRows(QModelIndex(), maximumEntries, maximumEntries);
        m_entries.removeLast();
        endRemoveRows();
    }
    Q_EMIT countChanged();
}

void RequestLog::setOutcome(const QString &outcome, bool accepted)
{
    if (m_entries.isEmpty()) {
        return;
    }
    m_entries.first().outcome = outcome;
    m_entries.first().accepted = accepted;
    Q_EMIT dataChanged(index(0), index(0), {OutcomeRole, AcceptedRole});
}

} // namespace headunit
