#include "rawkey.h"

#include <QStateMachine>
#include <QVariant>

namespace Raw {

KeyTransition::KeyTransition(const QObject *sender, const char *signal, int key, int status,
                             QState *source)
    : QSignalTransition(sender, signal, source), m_key(key), m_status(status)
{
}

bool KeyTransition::eventTest(QEvent *event)
{
    if (!QSignalTransition::eventTest(event)) {
        return false;
    }
    const auto arguments = static_cast<QStateMachine::SignalEvent *>(event)->arguments();
    if (arguments.at(0).toInt() != m_key || arguments.at(1).toInt() != m_status) {
        return false;
    }
    m_allowed = true;
    Q_EMIT asked(event);
    return m_allowed;
}

} // namespace Raw
