#pragma once

#include <HmiStateMachineQuick/hmistatemachinequick_export.h>
#include <HmiStateMachineQuick/presenter.h>
#include <HmiStateMachineQuick/scenehost.h>

#include <QHash>
#include <QStringList>

#include <qqml.h>

namespace HmiStateMachine {

class HostAttached;
class PopupListModel;

/**
 * Shows the popups of a QuickViewStateTarget above each other, the one shown last on top.
 *
 * Of each layer one is to be seen: a popup that is covered fades out until nothing covers it any
 * more. The components are declared inside as PopupComponent, by popup view id or by kind, or found
 * by the source pattern. A popup is an Item, which is made as large as the host and places its
 * visible part itself; those of the properties "popupId", "popupKind", "popupData", "remainingTime"
 * and "totalTime" (milliseconds) that it declares are kept up to date.
 *
 * @code{.qml}
 * PopupHost {
 *     anchors.fill: parent
 *     PopupComponent { popupId: "FuelWarning"; source: "popups/Fuel.qml" }
 *     PopupComponent { kind: 4; WarningPopup { } }
 *     suppressedLayers: ViewTarget.popupsEnabled ? [] : ["Screens"]
 * }
 * @endcode
 */
class HMISTATEMACHINEQUICK_EXPORT PopupHost : public SceneHost, public PopupPresenter
{
    Q_OBJECT
    Q_PROPERTY(QStringList suppressedLayers READ suppressedLayers WRITE setSuppressedLayers NOTIFY
                   suppressedLayersChanged)
    Q_PROPERTY(QQuickItem *topItem READ topItem NOTIFY topItemChanged)

public:
    /** Made by QML. Its effect is Fade at first. */
    explicit PopupHost(QQuickItem *parent = nullptr);
    ~PopupHost() override;

    /** Called by QML for PopupHost.position; owned by @p object. */
    static HostAttached *qmlAttachedProperties(QObject *object);

    /**
     * The layers whose popups are not drawn for now. To the flow they are shown all the same, and
     * their time runs.
     */
    QStringList suppressedLayers() const;

    /** Counts at once; a layer is named by its layered state. */
    void setSuppressedLayers(const QStringList &layers);

    /** The popup in front that is neither covered nor suppressed; null when there is none. */
    QQuickItem *topItem() const;

    void presentPopup(const QString &popupId) override;
    void withdrawPopup(const QString &popupId) override;
    bool isBusy() const override;

Q_SIGNALS:
    void suppressedLayersChanged();
    void topItemChanged();

protected:
    /** Becomes the popup presenter, and presents the popups that are shown already. */
    void attach(QuickViewStateTarget *target) override;

    /** Withdraws as the popup presenter. */
    void detach(QuickViewStateTarget *target) override;

    void clear() override;
    HostedComponent *declaredComponent(const QString &id) const override;

private:
    Q_DISABLE_COPY(PopupHost)

    HostedItem *makeItem(const QString &popupId);
    QVariantMap dataOf(const QString &popupId) const;
    int rowOf(const QString &popupId) const;
    void appear(HostedItem *popup);
    void disappear(HostedItem *popup);
    void remove(HostedItem *popup);
    void updateRows(int first, int last);
    void updateOrder();
    void updateTop();
    void busyChanged();

    QHash<QString, HostedItem *> m_popups;
    QHash<QString, HostedItem *> m_leaving;
    QStringList m_suppressedLayers;
    QPointer<QQuickItem> m_top;
};

} // namespace HmiStateMachine

QML_DECLARE_TYPEINFO(HmiStateMachine::PopupHost, QML_HAS_ATTACHED_PROPERTIES)
