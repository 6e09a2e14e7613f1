#pragma once

#include <HmiStateMachine/hmi/hmistate.h>
#include <HmiStateMachine/hmistatemachine_export.h>

namespace HmiStateMachine {

class GuardedTransition;

/**
 * A decision in the flow: it passes on to its target as soon as it is entered, unless a receiver of
 * conditionTest() forbids it.
 *
 * A receiver forbids by setAllowTransition(false) on the state's GuardedTransition, which it finds
 * with findChild(). Each test is written to the log. Without a target the state is not left, with
 * one warning. A receiver may also choose the target.
 *
 * @code
 * auto *decision = new HmiConditionalState("MapOrDisclaimer", machine);
 * QObject::connect(decision, &HmiConditionalState::conditionTest, decision, [decision, accepted] {
 *     decision->setNamedTargetState(accepted() ? "Map" : "Disclaimer");
 * });
 * @endcode
 */
class HMISTATEMACHINE_EXPORT HmiConditionalState : public HmiState
{
    Q_OBJECT

public:
    /** A decision inside @p parent, or in its exclusive layer when it has layers. */
    HmiConditionalState(const QString &name, HmiState *parent);

    /** The same with any state as the parent, or with none. */
    explicit HmiConditionalState(const QString &name, QState *parent = nullptr);
    ~HmiConditionalState() override;

    /** Where it passes on to; null leaves no target. Not owned. */
    void setTargetState(QAbstractState *target);

    /** The name is looked up now; when it is empty or unknown there is no target. */
    void setNamedTargetState(const Identifier &name);

    /** Empty without a target, or when that is no NamedState. */
    QString targetStateName() const;

Q_SIGNALS:
    /** The transition is being tested with @p event. */
    void conditionTest(QEvent *event);

private:
    Q_DISABLE_COPY(HmiConditionalState)

    void createTransition();

    GuardedTransition *m_transition = nullptr;
};

} // namespace HmiStateMachine
