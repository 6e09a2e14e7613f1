#pragma once

#include <HmiStateMachineQuick/hmistatemachinequick_export.h>

#include <QObject>

namespace HmiStateMachine {

/**
 * What a host attaches to the items that it shows: ScreenHost.position and PopupHost.position.
 *
 * 0 where the item is in its place. A screen comes from 1, ahead, or -1, behind, and leaves to the
 * other side; a popup comes from 1 and goes there. With the effect NoEffect an item moves itself by
 * binding to it.
 */
class HMISTATEMACHINEQUICK_EXPORT HostAttached : public QObject
{
    Q_OBJECT
    Q_PROPERTY(qreal position READ position NOTIFY positionChanged)

public:
    /** Made by QML, once for each item; the item owns it. */
    explicit HostAttached(QObject *parent = nullptr);
    ~HostAttached() override;

    /** 0 at first. */
    qreal position() const;

    /** Called by the host. */
    void setPosition(qreal position);

Q_SIGNALS:
    void positionChanged();

private:
    Q_DISABLE_COPY(HostAttached)

    qreal m_position = 0;
};

} // namespace HmiStateMachine
