#include <HmiStateMachine/named/guardedpropertychangetransition.h>

#include <HmiStateMachine/internal/helpers.h>
#include <HmiStateMachine/internal/logging.h>

#include <QMetaMethod>
#include <QMetaProperty>

namespace HmiStateMachine {

namespace {

void warnOfProperty(const char *text, const QByteArray &property, const QObject *sender,
                    QState *sourceState)
{
    HMI_WARNING_FROM(hmistatemachine(), "GuardedPropertyChangeTransition")
        << text << property << sender << Helpers::stateName(sourceState);
}

} // namespace

GuardedPropertyChangeTransition::GuardedPropertyChangeTransition(QObject *sender,
                                                                 const char *propertyName,
                                                                 const QList<QVariant> &fromValues,
                                                                 const QVariant &toValue,
                                                                 QState *sourceState)
    : GuardedPropertyTransition(sender, propertyName, sourceState), m_propertyName(propertyName),
      m_fromValues(fromValues), m_toValue(toValue)
{
    setAllowTransitionDefault(true);
    if (sender) {
        watchProperty(sourceState);
    }
}

GuardedPropertyChangeTransition::~GuardedPropertyChangeTransition() = default;

bool GuardedPropertyChangeTransition::valueTest(const QVariant &value) const
{
    return m_toValue.isValid() ? value == m_toValue : !m_fromValues.contains(value);
}

bool GuardedPropertyChangeTransition::internalEventTest(QEvent *event)
{
    if (!GuardedSignalTransition::internalEventTest(event) || !senderObject()) {
        return false;
    }
    const QVariant now = propertyValue();
    // The machine and propertyChanged() listen to the same signal. The machine comes first when it
    // was connected for an earlier transition already; otherwise the recorded current value is the
    // new one by now, and the one before it counts.
    const QVariant &from =
        now == m_valueHistory.second ? m_valueHistory.first : m_valueHistory.second;
    if (!m_fromValues.isEmpty() && !m_fromValues.contains(from)) {
        return false;
    }
    return valueTest(now);
}

void GuardedPropertyChangeTransition::propertyChanged()
{
    m_valueHistory = qMakePair(m_valueHistory.second, propertyValue());
}

void GuardedPropertyChangeTransition::watchProperty(QState *sourceState)
{
    QObject *sender = senderObject();
    m_valueHistory.second = propertyValue();
    const int index = sender->metaObject()->indexOfProperty(m_propertyName.constData());
    if (index < 0) {
        warnOfProperty("The sender object does not contain the following property:", m_propertyName,
                       sender, sourceState);
        return;
    }
    const QMetaProperty property = sender->metaObject()->property(index);
    if (!property.hasNotifySignal()) {
        warnOfProperty("The following property does not provide a notify signal:", m_propertyName,
                       sender, sourceState);
        return;
    }
    // Connected by meta-method, because the signal is known at run time only.
    const int slot = staticMetaObject.indexOfSlot("propertyChanged()");
    connect(sender, property.notifySignal(), this, staticMetaObject.method(slot));
}

QVariant GuardedPropertyChangeTransition::propertyValue() const
{
    return senderObject() ? senderObject()->property(m_propertyName.constData()) : QVariant();
}

} // namespace HmiStateMachine
