#pragma once

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/hmistatemachine_export.h>

#include <QPointer>

class QTimer;

namespace HmiStateMachine {

/**
 * A signal transition that holds its signal back until its source has been active for a while.
 *
 * The delay runs from every entry of the source. Signals that arrive meanwhile make it fire once,
 * when the delay ends; later ones fire at once. Leaving the source drops what was held back, and a
 * signal that arrives while the source is not active is not remembered.
 */
class HMISTATEMACHINE_EXPORT HmiDelayedSignalTransition : public HmiSignalTransition
{
    Q_OBJECT

public:
    /**
     * @p signal is written with SIGNAL(), and @p sender is not owned; what Qt calls the sender and
     * the signal of the transition is itself and internalTrigger(). @p delay is in milliseconds; a
     * negative one counts as 0.
     */
    HmiDelayedSignalTransition(QObject *sender, const char *signal, int delay,
                               QState *sourceState = nullptr);
    ~HmiDelayedSignalTransition() override;

    /** Follows the entries and exits of @p state from now on. */
    void sourceStateChange(QState *state) override;

Q_SIGNALS:
    /** What the transition itself reacts to: the watched signal, once the delay allows it. */
    void internalTrigger();

private Q_SLOTS:
    void sourceEntered();
    void sourceExited();
    void signalReceived();
    void delayTriggered();

private:
    Q_DISABLE_COPY(HmiDelayedSignalTransition)

    void connectSource(QState *state);

    bool m_pending = false;
    bool m_sourceActive = false;
    QTimer *m_timer;
    QPointer<QState> m_sourceState;
};

} // namespace HmiStateMachine
