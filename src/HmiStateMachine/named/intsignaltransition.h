#pragma once

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/hmistatemachine_export.h>

namespace HmiStateMachine {

/**
 * Fires on a signal whose first argument is an int that compares with a stored value.
 *
 * Only an int will do: an unsigned, long, enum or double argument never matches, even where it
 * would convert, and neither does a signal without arguments.
 */
class HMISTATEMACHINE_EXPORT IntSignalTransition : public HmiSignalTransition
{
    Q_OBJECT

public:
    /** The stored value stands on the left: Greater fires on arguments below it. */
    enum Operator : int {
        Equal = 0,
        NotEqual = 1,
        Greater = 2,
        GreaterOrEqual = 3,
        Less = 4,
        LessOrEqual = 5
    };

    /** Fires when the argument equals @p value. @p signal is written with SIGNAL(). */
    IntSignalTransition(QObject *sender, const char *signal, int value,
                        QState *sourceState = nullptr);
    IntSignalTransition(QObject *sender, const char *signal, int value,
                        IntSignalTransition::Operator op, QState *sourceState = nullptr);
    ~IntSignalTransition() override;

    /** Whether @p argument would fire; false for an operator that is none of the six. */
    bool match(int argument) const;

    bool internalEventTest(QEvent *event) override;

private:
    Q_DISABLE_COPY(IntSignalTransition)

    Operator m_operator;
    int m_value;
};

} // namespace HmiStateMachine
