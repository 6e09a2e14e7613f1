#pragma once

#include <QMetaMethod>
#include <QObject>

namespace HmiStateMachine {

/**
 * A signal of one class and a slot of another, looked up once, for connections that are made and
 * cut again and again: by their numbers Qt does that in half the time.
 */
class SlotConnection
{
public:
    /** @p slot is the normalised signature; it has to be one of @p receiverClass. */
    template <typename Signal>
    SlotConnection(Signal signal, const QMetaObject &receiverClass, const char *slot)
        : m_signal(QMetaMethod::fromSignal(signal).methodIndex()),
          m_slot(receiverClass.indexOfSlot(slot))
    {
        Q_ASSERT(m_signal >= 0 && m_slot >= 0);
    }

    void connect(const QObject *sender, const QObject *receiver) const
    {
        QMetaObject::connect(sender, m_signal, receiver, m_slot);
    }

    /** Cuts it as often as it was made. */
    void disconnect(const QObject *sender, const QObject *receiver) const
    {
        QMetaObject::disconnect(sender, m_signal, receiver, m_slot);
    }

private:
    int m_signal;
    int m_slot;
};

} // namespace HmiStateMachine
