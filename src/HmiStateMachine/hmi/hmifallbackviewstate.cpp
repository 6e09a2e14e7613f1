#include <HmiStateMachine/hmi/hmifallbackviewstate.h>

#include <HmiStateMachine/hmi/hmifallbacktransition.h>
#include <HmiStateMachine/internal/owntransition.h>
#include <HmiStateMachine/named/hmifallbackevent.h>
#include <HmiStateMachine/named/statemachine.h>

namespace HmiStateMachine {

HmiFallbackViewState::HmiFallbackViewState(const QString &name, const QString &fallbackState,
                                           QState *parent)
    : HmiFallbackViewState(name, name, fallbackState, parent)
{
}

HmiFallbackViewState::HmiFallbackViewState(const QString &targetView, const QString &name,
                                           const QString &fallbackState, QState *parent)
    : HmiViewState(targetView, name, parent),
      m_fallbackTransition(ownTransition<HmiFallbackTransition>(this))
{
    m_fallbackTransition->setNamedTargetState(fallbackState);
}

HmiFallbackViewState::~HmiFallbackViewState() = default;

void HmiFallbackViewState::postFallbackEvent()
{
    StateMachine::instance()->postEvent(new HmiFallbackEvent(fallbackTarget()));
}

void HmiFallbackViewState::reevaluate()
{
    if (isActive() && !permitted()) {
        postFallbackEvent();
    }
}

void HmiFallbackViewState::onActivated()
{
    if (permitted()) {
        HmiViewState::onActivated();
    } else {
        postFallbackEvent();
    }
}

bool HmiFallbackViewState::permitted()
{
    return true;
}

QString HmiFallbackViewState::fallbackTarget()
{
    return QString();
}

} // namespace HmiStateMachine
