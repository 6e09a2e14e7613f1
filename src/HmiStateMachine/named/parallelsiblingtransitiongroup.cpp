#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>

#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/named/namedtargettransitionbase.h>

#include <QState>

namespace HmiStateMachine {

namespace {

void logPriorityChange(const NamedTargetTransitionBase *transition, int current, int proposed)
{
    HMI_DEBUG_FROM(hmistatemachine(), "addTransition")
        << "Altering a registered siblings priority is prohibited.";
    HMI_DEBUG_FROM(hmistatemachine(), "addTransition")
        << "Sibling:" << static_cast<const void *>(transition);
    HMI_DEBUG_FROM(hmistatemachine(), "addTransition") << "Current priority:" << current;
    HMI_DEBUG_FROM(hmistatemachine(), "addTransition") << "Proposed priority:" << proposed;
}

} // namespace

ParallelSiblingTransitionGroup::ParallelSiblingTransitionGroup(QObject *parent) : QObject(parent)
{
}

ParallelSiblingTransitionGroup::~ParallelSiblingTransitionGroup() = default;

bool ParallelSiblingTransitionGroup::addTransition(NamedTargetTransitionBase *transition,
                                                   int priority)
{
    if (!transition) {
        return false;
    }
    const auto registered = m_priorities.constFind(transition);
    if (registered != m_priorities.constEnd()) {
        if (registered.value() == priority) {
            return true;
        }
        logPriorityChange(transition, registered.value(), priority);
        return false;
    }
    if (m_takenPriorities.contains(priority)) {
        return false;
    }
    if (QAbstractState *source = transition->getSourceState()) {
        m_priorities.insert(transition, priority);
        m_takenPriorities.insert(priority);
        trackSource(transition, source);
    }
    // Without a source state too, so that the transition knows of the group all the same.
    transition->m_siblingGroups.append(this);
    return true;
}

bool ParallelSiblingTransitionGroup::internalEventTest(NamedTargetTransitionBase *transition,
                                                       QEvent *event) const
{
    const int priority = m_priorities.value(transition, 0);
    // Copied, because the siblings' guards are the application's code and may end up in a slot
    // here, or destroy the group.
    const auto siblings = m_activeSiblings;
    const QPointer<const ParallelSiblingTransitionGroup> self(this);
    for (NamedTargetTransitionBase *sibling : siblings) {
        // cppcheck-suppress knownConditionTrueFalse ; a sibling's guard may have destroyed it
        if (!self) {
            return false;
        }
        if (sibling == transition) {
            continue;
        }
        // Looked up anew for each, so that a sibling that a guard destroyed is passed over.
        const auto registered = m_priorities.constFind(sibling);
        if (registered != m_priorities.constEnd() && registered.value() > priority
            && sibling->internalEventTest(event)) {
            return true;
        }
    }
    return false;
}

void ParallelSiblingTransitionGroup::siblingActivated(NamedTargetTransitionBase *transition)
{
    m_activeSiblings.append(transition);
}

void ParallelSiblingTransitionGroup::siblingDeactivated(NamedTargetTransitionBase *transition)
{
    m_activeSiblings.removeAll(transition);
}

void ParallelSiblingTransitionGroup::trackSource(NamedTargetTransitionBase *transition,
                                                 QAbstractState *source)
{
    m_connections.insert(transition,
                         connect(source, &QAbstractState::entered,
                                 SiblingActivatedFunctor(this, transition, source)));
    m_connections.insert(transition,
                         connect(source, &QAbstractState::exited,
                                 SiblingDeactivatedFunctor(this, transition, source)));
}

// The transition is being destroyed: from here on nothing may reach it, and a later transition at
// the same address is another one.
void ParallelSiblingTransitionGroup::retire(NamedTargetTransitionBase *transition)
{
    const auto connections = m_connections.values(transition);
    for (const QMetaObject::Connection &connection : connections) {
        disconnect(connection);
    }
    m_connections.remove(transition);
    m_activeSiblings.removeAll(transition);
    m_priorities.remove(transition); // its priority stays taken
}

SiblingFunctorBase::SiblingFunctorBase(ParallelSiblingTransitionGroup *group,
                                       NamedTargetTransitionBase *transition,
                                       QAbstractState *sourceState)
    : m_group(group), m_transition(transition), m_sourceState(sourceState)
{
}

bool SiblingFunctorBase::sanityTest() const
{
    return m_group && m_sourceState && m_transition->getSourceState() == m_sourceState;
}

void SiblingActivatedFunctor::operator()() const
{
    if (sanityTest()) {
        m_group->siblingActivated(m_transition);
    }
}

void SiblingDeactivatedFunctor::operator()() const
{
    if (sanityTest()) {
        m_group->siblingDeactivated(m_transition);
    }
}

} // namespace HmiStateMachine
