#pragma once

#include <HmiStateMachineQuick/hmistatemachinequick_export.h>
#include <HmiStateMachineQuick/hostedcomponent.h>

#include <QString>

namespace HmiStateMachine {

/**
 * Names the component of one view inside a ScreenHost, in place of the host's source pattern.
 *
 * @code{.qml}
 * ScreenHost {
 *     ViewComponent { viewId: "Home"; HomeScreen { } }
 *     ViewComponent { viewId: "Radio"; source: "screens/Tuner.qml" }
 * }
 * @endcode
 */
class HMISTATEMACHINEQUICK_EXPORT ViewComponent : public HostedComponent
{
    Q_OBJECT
    Q_PROPERTY(QString viewId MEMBER m_viewId NOTIFY viewIdChanged)

public:
    /** Made by QML, as a child of a ScreenHost. */
    explicit ViewComponent(QObject *parent = nullptr);
    ~ViewComponent() override;

    /** The target view for which the component is. */
    QString viewId() const;

Q_SIGNALS:
    void viewIdChanged();

private:
    Q_DISABLE_COPY(ViewComponent)

    QString m_viewId;
};

} // namespace HmiStateMachine
