#pragma once

#include <HmiStateMachineQuick/hmistatemachinequick_export.h>
#include <HmiStateMachineQuick/hostedcomponent.h>

#include <QString>

namespace HmiStateMachine {

/**
 * Names a component for popups inside a PopupHost: for the one popup with that popup view id, or
 * for all of a kind that have none of their own.
 *
 * @code{.qml}
 * PopupHost {
 *     PopupComponent { popupId: "FuelWarning"; source: "popups/Fuel.qml" }
 *     PopupComponent { kind: 4; WarningPopup { } }
 * }
 * @endcode
 */
class HMISTATEMACHINEQUICK_EXPORT PopupComponent : public HostedComponent
{
    Q_OBJECT
    Q_PROPERTY(QString popupId MEMBER m_popupId NOTIFY popupIdChanged)
    Q_PROPERTY(int kind MEMBER m_kind NOTIFY kindChanged)

public:
    /** Made by QML, as a child of a PopupHost. */
    explicit PopupComponent(QObject *parent = nullptr);
    ~PopupComponent() override;

    /** Empty for a component that serves a kind. */
    QString popupId() const;

    /** Not looked at while there is a popupId; -1, no kind, at first. */
    int kind() const;

Q_SIGNALS:
    void popupIdChanged();
    void kindChanged();

private:
    Q_DISABLE_COPY(PopupComponent)

    QString m_popupId;
    int m_kind = -1;
};

} // namespace HmiStateMachine
