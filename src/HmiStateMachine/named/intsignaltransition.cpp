#include <HmiStateMachine/named/intsignaltransition.h>

#include <QStateMachine>

namespace HmiStateMachine {

IntSignalTransition::IntSignalTransition(QObject *sender, const char *signal, int value,
                                         QState *sourceState)
    : IntSignalTransition(sender, signal, value, Equal, sourceState)
{
}

IntSignalTransition::IntSignalTransition(QObject *sender, const char *signal, int value,
                                         IntSignalTransition::Operator op, QState *sourceState)
    : HmiSignalTransition(sender, signal, sourceState), m_operator(op), m_value(value)
{
}

IntSignalTransition::~IntSignalTransition() = default;

bool IntSignalTransition::match(int argument) const
{
    switch (m_operator) {
    case Equal:
        return m_value == argument;
    case NotEqual:
        return m_value != argument;
    case Greater:
        return m_value > argument;
    case GreaterOrEqual:
        return m_value >= argument;
    case Less:
        return m_value < argument;
    case LessOrEqual:
        return m_value <= argument;
    }
    return false;
}

bool IntSignalTransition::internalEventTest(QEvent *event)
{
    if (!HmiSignalTransition::internalEventTest(event)) {
        return false;
    }
    const QVariantList arguments = static_cast<QStateMachine::SignalEvent *>(event)->arguments();
    if (arguments.isEmpty() || arguments.first().type() != QVariant::Int) {
        return false;
    }
    return match(arguments.first().toInt());
}

} // namespace HmiStateMachine
