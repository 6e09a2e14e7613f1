#pragma once

#include <QAbstractListModel>
#include <QString>
#include <QVector>

namespace headunit {

/** The last requests and what came of each, newest first. */
class RequestLog : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(int count READ count NOTIFY countChanged)

public:
    enum Role { NumberRole = Qt::UserRole + 1, TimeRole, RequestRole, OutcomeRole, AcceptedRole };

    explicit RequestLog(QObject *parent = nullptr);
    ~RequestLog() override;

    int count() const;
    int rowCount(const QModelIndex &parent = QModelIndex()) const override;
    QVariant data(const QModelIndex &index, int role) const override;
    QHash<int, QByteArray> roleNames() const override;

    /** Drops the oldest one when there are twenty. */
    void add(const QString &request);

    /** What came of the newest one. @p accepted is false when the flow refused it. */
    void setOutcome(const QString &outcome, bool accepted);

Q_SIGNALS:
    void countChanged();

private:
    Q_DISABLE_COPY(RequestLog)

    struct Entry
    {
        int number = 0;
        QString time;
        QString request;
        QString outcome;
        bool accepted = true;
    };

    QVector<Entry> m_entries;
    int m_number = 0;
};

} // namespace headunit
