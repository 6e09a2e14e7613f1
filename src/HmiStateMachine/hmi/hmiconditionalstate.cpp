#include <HmiStateMachine/hmi/hmiconditionalstate.h>

#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/internal/loggingfunctor.h>
#include <HmiStateMachine/named/guardedtransition.h>

namespace HmiStateMachine {

HmiConditionalState::HmiConditionalState(const QString &name, HmiState *parent)
    : HmiState(name, parent)
{
    createTransition();
}

HmiConditionalState::HmiConditionalState(const QString &name, QState *parent)
    : HmiState(name, parent)
{
    createTransition();
}

HmiConditionalState::~HmiConditionalState() = default;

void HmiConditionalState::setTargetState(QAbstractState *target)
{
    HMI_DEBUG(hmistatemachine())
        << "void HmiStateMachine::HmiConditionalState::setTargetState(QAbstractState*)" << target;
    m_transition->setTargetState(target);
}

void HmiConditionalState::setNamedTargetState(const Identifier &name)
{
    HMI_DEBUG(hmistatemachine()) << "void HmiStateMachine::HmiConditionalState::"
                                    "setNamedTargetState(const HmiStateMachine::Identifier&)"
                                 << name;
    m_transition->setNamedTargetState(name);
}

QString HmiConditionalState::targetStateName() const
{
    return m_transition->targetName();
}

void HmiConditionalState::createTransition()
{
    m_transition = new GuardedTransition(this);
    m_transition->setAllowTransitionDefault(true);
    connect(m_transition, &GuardedTransition::transitionTest,
            LoggingFunctor(QStringLiteral("HmiConditionalState::conditionTest")));
    connect(m_transition, &GuardedTransition::transitionTest, this,
            &HmiConditionalState::conditionTest);
}

} // namespace HmiStateMachine
