#include <HmiStateMachine/hmi/hmidelayedsignaltransition.h>

#include <QState>
#include <QTimer>

namespace HmiStateMachine {

HmiDelayedSignalTransition::HmiDelayedSignalTransition(QObject *sender, const char *signal,
                                                       int delay, QState *sourceState)
    : HmiSignalTransition(sourceState), m_timer(new QTimer(this))
{
    // The transition reacts to its own signal, never to the watched one. Set here, because there is
    // no object to point at before the base stands.
    setSenderObject(this);
    setSignal(SIGNAL(internalTrigger()));
    connectSource(this->sourceState());
    connect(sender, signal, this, SLOT(signalReceived()));
    connect(m_timer, &QTimer::timeout, this, &HmiDelayedSignalTransition::delayTriggered);
    m_timer->setInterval(qMax(0, delay));
    m_timer->setSingleShot(true);
}

HmiDelayedSignalTransition::~HmiDelayedSignalTransition() = default;

void HmiDelayedSignalTransition::sourceStateChange(QState *state)
{
    if (m_sourceState) {
        disconnect(m_sourceState, nullptr, this, nullptr);
    }
    connectSource(state);
}

void HmiDelayedSignalTransition::sourceEntered()
{
    m_sourceActive = true;
    m_pending = false;
    m_timer->start();
}

void HmiDelayedSignalTransition::sourceExited()
{
    m_sourceActive = false;
    m_timer->stop();
}

void HmiDelayedSignalTransition::signalReceived()
{
    if (!m_sourceActive) {
        return;
    }
    if (m_timer->isActive()) {
        m_pending = true;
        return;
    }
    Q_EMIT internalTrigger();
}

void HmiDelayedSignalTransition::delayTriggered()
{
    if (m_pending) {
        Q_EMIT internalTrigger();
    }
}

void HmiDelayedSignalTransition::connectSource(QState *state)
{
    m_sourceState = state;
    if (!state) {
        return;
    }
    connect(state, &QAbstractState::entered, this, &HmiDelayedSignalTransition::sourceEntered);
    connect(state, &QAbstractState::exited, this, &HmiDelayedSignalTransition::sourceExited);
}

} // namespace HmiStateMachine
