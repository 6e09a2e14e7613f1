#include <HmiStateMachine/named/simpleeventtransition.h>

#include <HmiStateMachine/internal/exclusivelayer.h>
#include <HmiStateMachine/internal/siblinggroups.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>

#include <QState>

namespace HmiStateMachine {

SimpleEventTransition::SimpleEventTransition(QEvent::Type type, QState *sourceState)
    : SimpleEventTransition(QList<QEvent::Type>{type}, sourceState)
{
}

SimpleEventTransition::SimpleEventTransition(const QList<QEvent::Type> &types, QState *sourceState)
    : QAbstractTransition(exclusiveLayerOf(sourceState)), m_eventTypes(types)
{
}

SimpleEventTransition::~SimpleEventTransition() = default;

void SimpleEventTransition::setEventType(QEvent::Type type)
{
    if (m_eventTypes.isEmpty()) {
        m_eventTypes.append(type);
    } else {
        m_eventTypes.replace(0, type);
    }
}

QEvent::Type SimpleEventTransition::eventType() const
{
    return m_eventTypes.value(0, QEvent::None);
}

void SimpleEventTransition::setEventTypes(const QList<QEvent::Type> &types)
{
    m_eventTypes = types;
}

QList<QEvent::Type> SimpleEventTransition::eventTypes() const
{
    return m_eventTypes;
}

bool SimpleEventTransition::makeParallelExclusive(int priority)
{
    static SiblingGroups siblingGroups;
    QString key;
    for (QEvent::Type type : qAsConst(m_eventTypes)) {
        key += QStringLiteral("::%1").arg(static_cast<int>(type));
    }
    return ensureGroup(siblingGroups[key])->addTransition(this, priority);
}

bool SimpleEventTransition::eventTest(QEvent *event)
{
    return internalEventTest(event) && arbitrate(event);
}

void SimpleEventTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
    finishTransition();
}

QState *SimpleEventTransition::getSourceState() const
{
    return sourceState();
}

void SimpleEventTransition::changeTarget(QState *target)
{
    setTargetState(target);
}

QAbstractState *SimpleEventTransition::getTarget() const
{
    return targetState();
}

bool SimpleEventTransition::internalEventTest(QEvent *event)
{
    return m_eventTypes.contains(event->type());
}

} // namespace HmiStateMachine
