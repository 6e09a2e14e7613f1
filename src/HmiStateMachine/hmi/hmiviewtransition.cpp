#include <HmiStateMachine/hmi/hmiviewtransition.h>

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmiviewevent.h>

namespace HmiStateMachine {

HmiViewTransition::HmiViewTransition(QState *source) : QAbstractTransition(source)
{
}

HmiViewTransition::~HmiViewTransition() = default;

void HmiViewTransition::setBlocked(bool blocked)
{
    block(blocked);
}

bool HmiViewTransition::blocked() const
{
    return isBlocked();
}

bool HmiViewTransition::eventTest(QEvent *event)
{
    if (isBlocked() || event->type() != HmiViewEvent::eventType()) {
        return false;
    }
    const QString viewId = static_cast<HmiViewEvent *>(event)->viewId();
    setNamedTargetState(viewId);
    if (!targetState()) {
        setTargetState(HmiViewState::stateForTarget(viewId));
    }
    if (targetState() != sourceState()) {
        // Also without a target: a request for an unknown view ends here and moves nothing.
        aboutToBeTriggered();
        return true;
    }
    if (auto *view = qobject_cast<HmiViewState *>(targetState())) {
        Q_EMIT view->alreadyActive();
    }
    return false;
}

void HmiViewTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
    wasTriggered();
}

QState *HmiViewTransition::getSourceState() const
{
    return sourceState();
}

void HmiViewTransition::changeTarget(QState *target)
{
    setTargetState(target);
}

QAbstractState *HmiViewTransition::getTarget() const
{
    return targetState();
}

} // namespace HmiStateMachine
