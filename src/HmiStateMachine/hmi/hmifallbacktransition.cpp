#include <HmiStateMachine/hmi/hmifallbacktransition.h>

#include <HmiStateMachine/named/hmifallbackevent.h>

#include <QState>

namespace HmiStateMachine {

HmiFallbackTransition::HmiFallbackTransition(QState *source) : QAbstractTransition(source)
{
}

HmiFallbackTransition::~HmiFallbackTransition() = default;

bool HmiFallbackTransition::eventTest(QEvent *event)
{
    if (event->type() != HmiFallbackEvent::eventType()) {
        return false;
    }
    aboutToBeTriggered();
    const QString targetId = static_cast<HmiFallbackEvent *>(event)->targetId();
    if (!targetId.isEmpty()) {
        setNamedTargetState(targetId);
    }
    return true;
}

void HmiFallbackTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
    wasTriggered();
}

QState *HmiFallbackTransition::getSourceState() const
{
    return sourceState();
}

void HmiFallbackTransition::changeTarget(QState *target)
{
    setTargetState(target);
}

QAbstractState *HmiFallbackTransition::getTarget() const
{
    return targetState();
}

} // namespace HmiStateMachine
