#include <HmiStateMachine/named/guardedsignaltransition.h>

namespace HmiStateMachine {

GuardedSignalTransition::GuardedSignalTransition(QState *sourceState)
    : HmiSignalTransition(sourceState)
{
}

GuardedSignalTransition::GuardedSignalTransition(QObject *sender, const char *signal,
                                                 QState *sourceState)
    : HmiSignalTransition(sender, signal, sourceState)
{
}

GuardedSignalTransition::~GuardedSignalTransition() = default;

bool GuardedSignalTransition::allowTransition() const
{
    return m_allowTransition;
}

bool GuardedSignalTransition::allowTransitionDefault() const
{
    return m_allowTransitionDefault;
}

bool GuardedSignalTransition::testTransition(QEvent *e)
{
    m_allowTransition = m_allowTransitionDefault;
    Q_EMIT transitionTest(e);
    if (!m_allowTransition) {
        Q_EMIT testFailed(e);
    }
    return m_allowTransition;
}

bool GuardedSignalTransition::internalEventTest(QEvent *event)
{
    return HmiSignalTransition::internalEventTest(event) && testTransition(event);
}

void GuardedSignalTransition::setAllowTransition(bool arg)
{
    if (arg == m_allowTransition) {
        return;
    }
    m_allowTransition = arg;
    Q_EMIT allowTransitionChanged(arg);
}

void GuardedSignalTransition::setAllowTransitionDefault(bool arg)
{
    if (arg == m_allowTransitionDefault) {
        return;
    }
    m_allowTransitionDefault = arg;
    Q_EMIT allowTransitionDefaultChanged(arg);
}

} // namespace HmiStateMachine
