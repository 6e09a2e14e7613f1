#include <HmiStateMachine/named/guardedtransition.h>

#include <HmiStateMachine/internal/exclusivelayer.h>
#include <HmiStateMachine/internal/siblinggroups.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>

#include <QState>

namespace HmiStateMachine {

GuardedTransition::GuardedTransition(QState *sourceState)
    : QAbstractTransition(exclusiveLayerOf(sourceState))
{
}

GuardedTransition::~GuardedTransition() = default;

bool GuardedTransition::allowTransition() const
{
    return m_allowTransition;
}

bool GuardedTransition::allowTransitionDefault() const
{
    return m_allowTransitionDefault;
}

bool GuardedTransition::makeParallelExclusive(int priority)
{
    static QPointer<ParallelSiblingTransitionGroup> group;
    return ensureGroup(group)->addTransition(this, priority);
}

bool GuardedTransition::eventTest(QEvent *event)
{
    return internalEventTest(event) && arbitrate(event);
}

void GuardedTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
    finishTransition();
}

QState *GuardedTransition::getSourceState() const
{
    return sourceState();
}

void GuardedTransition::changeTarget(QState *target)
{
    setTargetState(target);
}

QAbstractState *GuardedTransition::getTarget() const
{
    return targetState();
}

bool GuardedTransition::internalEventTest(QEvent *event)
{
    m_allowTransition = m_allowTransitionDefault;
    Q_EMIT transitionTest(event);
    if (!m_allowTransition) {
        Q_EMIT testFailed(event);
    }
    return m_allowTransition;
}

void GuardedTransition::setAllowTransition(bool arg)
{
    if (arg == m_allowTransition) {
        return;
    }
    m_allowTransition = arg;
    Q_EMIT allowTransitionChanged(arg);
}

void GuardedTransition::setAllowTransitionDefault(bool arg)
{
    if (arg == m_allowTransitionDefault) {
        return;
    }
    m_allowTransitionDefault = arg;
    Q_EMIT allowTransitionDefaultChanged(arg);
}

} // namespace HmiStateMachine
