#include <HmiStateMachine/named/hmitransition.h>

#include <HmiStateMachine/internal/siblinggroups.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>

namespace HmiStateMachine {

HmiTransition::HmiTransition(QState *sourceState) : HmiTransition(QString(), sourceState)
{
}

HmiTransition::HmiTransition(const QString &eventName, QState *sourceState)
    : GuardedTransition(sourceState), m_eventName(eventName)
{
    setAllowTransitionDefault(true);
}

HmiTransition::~HmiTransition() = default;

void HmiTransition::setEventDataFilter(const QVariant &filter)
{
    m_eventDataFilter = filter;
}

bool HmiTransition::dataTest(const QVariant &data) const
{
    if (!m_eventDataFilter.isValid()) {
        return true;
    }
    // Types first: QVariant would convert before it compares.
    return data.type() == m_eventDataFilter.type() && data == m_eventDataFilter;
}

QVariant HmiTransition::transitionData() const
{
    return m_transitionData;
}

bool HmiTransition::makeParallelExclusive(int priority)
{
    static SiblingGroups siblingGroups;
    return ensureGroup(siblingGroups[m_eventName])->addTransition(this, priority);
}

bool HmiTransition::eventTest(QEvent *event)
{
    return GuardedTransition::eventTest(event);
}

bool HmiTransition::internalEventTest(QEvent *event)
{
    if (event->type() != HmiEvent::eventType()) {
        return false;
    }
    const auto *hmiEvent = static_cast<HmiEvent *>(event);
    if (hmiEvent->name() != m_eventName || !dataTest(hmiEvent->data())) {
        return false;
    }
    m_transitionData = hmiEvent->data();
    return GuardedTransition::internalEventTest(event);
}

} // namespace HmiStateMachine
