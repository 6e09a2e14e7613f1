#pragma once

#include <HmiStateMachineQuick/hmistatemachinequick_export.h>

#include <QObject>
#include <QPointer>
#include <QQmlComponent>
#include <QUrl>

namespace HmiStateMachine {

/** What ViewComponent and PopupComponent share: a component, written in place or in a file. */
class HMISTATEMACHINEQUICK_EXPORT HostedComponent : public QObject
{
    Q_OBJECT
    Q_PROPERTY(QUrl source MEMBER m_source NOTIFY sourceChanged)
    Q_PROPERTY(QQmlComponent *delegate READ delegate WRITE setDelegate NOTIFY delegateChanged)
    Q_CLASSINFO("DefaultProperty", "delegate")

public:
    /** Made by QML, as a child of a host. */
    explicit HostedComponent(QObject *parent = nullptr);
    ~HostedComponent() override;

    /** The file of the component; not looked at while there is a delegate. */
    QUrl source() const;

    /** Not owned; null when there is none. */
    QQmlComponent *delegate() const;

    /** Null leaves the choice to the source. */
    void setDelegate(QQmlComponent *component);

Q_SIGNALS:
    void sourceChanged();
    void delegateChanged();

private:
    Q_DISABLE_COPY(HostedComponent)

    QUrl m_source;
    QPointer<QQmlComponent> m_delegate;
};

} // namespace HmiStateMachine
