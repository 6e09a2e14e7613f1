#include <HmiStateMachineQuick/popuplistmodel.h>

namespace HmiStateMachine {

namespace {

QVariant valueOf(const PopupEntry &entry, int role)
{
    switch (role) {
    case PopupListModel::PopupIdRole:
        return entry.popupId;
    case PopupListModel::KindRole:
        return entry.kind;
    case PopupListModel::PopupDataRole:
        return entry.data;
    case PopupListModel::LayerRole:
        return entry.layer;
    case PopupListModel::RemainingTimeRole:
        return entry.remainingTime;
    case PopupListModel::TotalTimeRole:
        return entry.totalTime;
    case PopupListModel::CoveredRole:
        return entry.covered;
    default:
        return QVariant();
    }
}

// A popup's data may hold objects, which have no operator==; data counts as changed then.
QVector<int> changedRoles(const PopupEntry &before, const PopupEntry &after)
{
    QVector<int> roles;
    for (int role = PopupListModel::PopupIdRole; role <= PopupListModel::CoveredRole; ++role) {
        if (valueOf(before, role) != valueOf(after, role)) {
            roles.append(role);
        }
    }
    return roles;
}

} // namespace

PopupListModel::PopupListModel(QObject *parent) : QAbstractListModel(parent)
{
}

PopupListModel::~PopupListModel() = default;

int PopupListModel::count() const
{
    return m_entries.size();
}

int PopupListModel::rowCount(const QModelIndex &parent) const
{
    return parent.isValid() ? 0 : m_entries.size();
}

QVariant PopupListModel::data(const QModelIndex &index, int role) const
{
    if (!checkIndex(index, CheckIndexOption::IndexIsValid)) {
        return QVariant();
    }
    return valueOf(m_entries[index.row()], role);
}

QHash<int, QByteArray> PopupListModel::roleNames() const
{
    return {{PopupIdRole, "popupId"},
            {KindRole, "kind"},
            {PopupDataRole, "popupData"},
            {LayerRole, "layer"},
            {RemainingTimeRole, "remainingTime"},
            {TotalTimeRole, "totalTime"},
            {CoveredRole, "covered"}};
}

int PopupListModel::indexOf(const QString &popupId) const
{
    for (int row = 0; row < m_entries.size(); ++row) {
        if (m_entries[row].popupId == popupId) {
            return row;
        }
    }
    return -1;
}

QVariantMap PopupListModel::get(int row) const
{
    QVariantMap values;
    if (row < 0 || row >= m_entries.size()) {
        return values;
    }
    const auto names = roleNames();
    for (auto it = names.cbegin(); it != names.cend(); ++it) {
        values.insert(QString::fromLatin1(it.value()), valueOf(m_entries[row], it.key()));
    }
    return values;
}

PopupEntry PopupListModel::entry(int row) const
{
    return m_entries.value(row);
}

void PopupListModel::raise(const PopupEntry &entry)
{
    const int row = indexOf(entry.popupId);
    if (row >= 0 && row == m_entries.size() - 1) {
        update(entry);
        return;
    }
    remove(entry.popupId);
    beginInsertRows(QModelIndex(), m_entries.size(), m_entries.size());
    m_entries.append(entry);
    endInsertRows();
    Q_EMIT countChanged();
}

void PopupListModel::update(const PopupEntry &entry)
{
    const int row = indexOf(entry.popupId);
    if (row < 0) {
        return;
    }
    const QVector<int> roles = changedRoles(m_entries[row], entry);
    if (roles.isEmpty()) {
        return;
    }
    m_entries[row] = entry;
    Q_EMIT dataChanged(index(row), index(row), roles);
}

bool PopupListModel::remove(const QString &popupId)
{
    const int row = indexOf(popupId);
    if (row < 0) {
        return false;
    }
    beginRemoveRows(QModelIndex(), row, row);
    m_entries.remove(row);
    endRemoveRows();
    Q_EMIT countChanged();
    return true;
}

} // namespace HmiStateMachine
