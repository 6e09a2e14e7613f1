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
        Equal = 0, ///< value == argument
        NotEqual = 1, ///< value != argument
        Greater = 2, ///< value > argument
        GreaterOrEqual = 3, ///< value >= argument
        Less = 4, ///< value < argument
        LessOrEqual = 5 ///< value <= argument
    };

    /** Fires when the argument equals @p value. @p signal is written with SIGNAL(). */
    IntSignalTransition(QObject *sender, const char *signal, int value,
                        QState *sourceState = nullptr);

    /** Fires when @p value, @p op and the argument, read in this order, hold. */
    IntSignalTransition(QObject *sender, const char *signal, int value,
                        IntSignalTransition::Operator op, QState *sourceState = nullptr);
    ~IntSignalTransition() override;

    /** Whether @p argument would fire; false for an operator that is none of the six. */
    bool match(int argument) const;

    /** Sender and signal first, then the first argument. */
    bool internalEventTest(QEvent *event) override;

private:
    Q_DISABLE_COPY(IntSignalTransition)

    Operator m_operator;
    int m_value;
};

} // namespace HmiStateMachine
