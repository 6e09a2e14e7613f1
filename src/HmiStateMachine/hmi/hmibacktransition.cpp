#include <HmiStateMachine/hmi/hmibacktransition.h>

#include <HmiStateMachine/named/hmibackevent.h>

#include <QState>

namespace HmiStateMachine {

HmiBackTransition::HmiBackTransition(QState *source) : QAbstractTransition(source)
{
}

HmiBackTransition::~HmiBackTransition() = default;

bool HmiBackTransition::eventTest(QEvent *event)
{
    if (event->type() != HmiBackEvent::eventType()) {
        return false;
    }
    aboutToBeTriggered();
    return true;
}

void HmiBackTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
    wasTriggered();
}

QState *HmiBackTransition::getSourceState() const
{
    return sourceState();
}

void HmiBackTransition::changeTarget(QState *target)
{
    setTargetState(target);
}

QAbstractState *HmiBackTransition::getTarget() const
{
    return targetState();
}

} // namespace HmiStateMachine
