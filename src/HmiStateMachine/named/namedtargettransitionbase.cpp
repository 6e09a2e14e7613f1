#include <HmiStateMachine/named/namedtargettransitionbase.h>

#include <HmiStateMachine/internal/helpers.h>
#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/internal/viewlayer.h>
#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>
#include <HmiStateMachine/named/viewstatetarget.h>

#include <QEvent>

namespace HmiStateMachine {

namespace {

QList<NamedTargetTransitionBase *> &triggeringTransitions()
{
    // cppcheck-suppress unassignedVariable ; it is changed through the reference
    static QList<NamedTargetTransitionBase *> s_triggeringTransitions;
    return s_triggeringTransitions;
}

} // namespace

NamedTargetTransitionBase::~NamedTargetTransitionBase()
{
    wasTriggered();
    for (const QPointer<ParallelSiblingTransitionGroup> &group : qAsConst(m_siblingGroups)) {
        if (group) {
            group->retire(this);
        }
    }
}

bool NamedTargetTransitionBase::internalEventTest(QEvent *event)
{
    Q_UNUSED(event)
    return false;
}

void NamedTargetTransitionBase::setNamedTargetState(const QString &name)
{
    changeTarget(NamedState::stateForName(name));
}

QString NamedTargetTransitionBase::targetName() const
{
    return Helpers::stateName(qobject_cast<QState *>(getTarget()));
}

void NamedTargetTransitionBase::setIsVREventTransition(bool isVR, const QVariant &data)
{
    m_isVREvent = isVR;
    m_vrEventData = data;
}

bool NamedTargetTransitionBase::isVREventTransition() const
{
    return m_isVREvent;
}

QVariant NamedTargetTransitionBase::vrEventData() const
{
    return m_vrEventData;
}

void NamedTargetTransitionBase::aboutToBeTriggered()
{
    if (getTarget()) {
        triggeringTransitions().append(this);
    }
}

void NamedTargetTransitionBase::wasTriggered()
{
    triggeringTransitions().removeAll(this);
}

QList<NamedTargetTransitionBase *> NamedTargetTransitionBase::triggeringTransition()
{
    return triggeringTransitions();
}

bool NamedTargetTransitionBase::activeSiblingTest(QEvent *event)
{
    // Copied, because the siblings' guards are the application's code and may change the list.
    const auto groups = m_siblingGroups;
    for (const QPointer<ParallelSiblingTransitionGroup> &group : groups) {
        if (group && group->internalEventTest(this, event)) {
            return true;
        }
    }
    return false;
}

bool NamedTargetTransitionBase::arbitrate(QEvent *event)
{
    if (activeSiblingTest(event) || wouldFireForEver(event)) {
        return false;
    }
    aboutToBeTriggered();
    return true;
}

void NamedTargetTransitionBase::finishTransition()
{
    wasTriggered();
    if (!m_isVREvent) {
        return;
    }
    if (ViewStateTarget *target = viewLayer()) {
        target->setVRViewRequest(true, m_vrEventData);
    }
}

// Qt offers an event of type None before every other one and again after each step. A transition
// that accepts it and leads nowhere would be taken again and again, and the event loop never
// return.
bool NamedTargetTransitionBase::wouldFireForEver(const QEvent *event)
{
    if (getTarget()) {
        m_warnedOfMissingTarget = false;
        return false;
    }
    if (event->type() != QEvent::None) {
        return false;
    }
    if (!m_warnedOfMissingTarget) {
        m_warnedOfMissingTarget = true;
        HMI_WARNING_FROM(hmistatemachine(), "eventTest")
            << "Eventless transition without a target is not taken, source state:"
            << Helpers::stateName(getSourceState());
    }
    return true;
}

} // namespace HmiStateMachine
