#pragma once

#include <QSignalTransition>

namespace Raw {

/** Takes one key in one status from a signal that carries both, if its guard allows. */
class KeyTransition : public QSignalTransition
{
    Q_OBJECT

public:
    KeyTransition(const QObject *sender, const char *signal, int key, int status, QState *source);

    void setAllowed(bool allowed) { m_allowed = allowed; }

Q_SIGNALS:
    /** The guard: whoever is connected may call setAllowed(). */
    void asked(QEvent *event);

protected:
    bool eventTest(QEvent *event) override;

private:
    int m_key;
    int m_status;
    bool m_allowed = true;
};

} // namespace Raw
