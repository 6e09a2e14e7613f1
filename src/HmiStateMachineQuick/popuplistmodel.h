#pragma once

#include <HmiStateMachineQuick/hmistatemachinequick_export.h>

#include <QAbstractListModel>
#include <QString>
#include <QVariant>
#include <QVector>

namespace HmiStateMachine {

/** One popup as the view layer sees it. */
struct HMISTATEMACHINEQUICK_EXPORT PopupEntry
{
    QString popupId; ///< the popup view id
    int kind = -1; ///< as the application gave it to the popup state; -1 when unknown
    QVariant data; ///< the instance data, a map
    QString layer; ///< the name of the layered state to which the popup belongs
    int remainingTime = 0; ///< until it dismisses itself, in milliseconds; 0 while no time runs
    int totalTime = 0; ///< its auto-dismiss time in milliseconds; 0 when it has none
    bool covered = false; ///< waits on the popup stack behind another one
};

/**
 * A list of popups for QML, the lowest first. Written by QuickViewStateTarget alone.
 *
 * Roles: "popupId", "kind", "popupData", "layer", "remainingTime", "totalTime" (both in
 * milliseconds, 0 when there is none) and "covered". A delegate that is an Item has a property
 * "layer" of its own: there it is model.layer.
 */
class HMISTATEMACHINEQUICK_EXPORT PopupListModel : public QAbstractListModel
{
    Q_OBJECT
    Q_PROPERTY(int count READ count NOTIFY countChanged)

public:
    /** What a row is asked for; by these names in QML. */
    enum Role {

        PopupIdRole = Qt::UserRole + 1, ///< "popupId", a text
        KindRole, ///< "kind", an integer
        PopupDataRole, ///< "popupData", a map
        LayerRole, ///< "layer", a text
        RemainingTimeRole, ///< "remainingTime", in milliseconds
        TotalTimeRole, ///< "totalTime", in milliseconds
        CoveredRole ///< "covered", a bool
    };
    Q_ENUM(Role)

    /** An empty list. */
    explicit PopupListModel(QObject *parent = nullptr);
    ~PopupListModel() override;

    /** How many popups there are. */
    int count() const;

    /** How many popups there are; 0 below a row. */
    int rowCount(const QModelIndex &parent = QModelIndex()) const override;

    /** Invalid for a row that is not there, and for any other role. */
    QVariant data(const QModelIndex &index, int role) const override;

    /** The names that stand beside the roles above. */
    QHash<int, QByteArray> roleNames() const override;

    /** The row of that popup; -1 when it is not in the list. */
    Q_INVOKABLE int indexOf(const QString &popupId) const;

    /** The roles of a row by name; empty for a row that is not there. */
    Q_INVOKABLE QVariantMap get(int row) const;

    /** A default entry with no id for a row that is not there. */
    PopupEntry entry(int row) const;

    /** Puts @p entry on top; one of the same id goes. */
    void raise(const PopupEntry &entry);

    /** Stores @p entry in place of the one of the same id; nothing without one. */
    void update(const PopupEntry &entry);

    /** False when it was not there. */
    bool remove(const QString &popupId);

Q_SIGNALS:
    void countChanged();

private:
    Q_DISABLE_COPY(PopupListModel)

    QVector<PopupEntry> m_entries;
};

} // namespace HmiStateMachine
