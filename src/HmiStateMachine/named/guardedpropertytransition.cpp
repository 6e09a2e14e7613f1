#include <HmiStateMachine/named/guardedpropertytransition.h>

#include <QMetaMethod>
#include <QMetaProperty>

namespace HmiStateMachine {

QByteArray extractNotifySignal(QObject *object, const char *propertyName)
{
    if (!object || !propertyName) {
        return QByteArray();
    }
    const QMetaObject *meta = object->metaObject();
    const int index = meta->indexOfProperty(propertyName);
    if (index < 0) {
        return QByteArray();
    }
    // Empty for a property without a notify signal, whose notifySignal() is an invalid method.
    return meta->property(index).notifySignal().methodSignature();
}

GuardedPropertyTransition::GuardedPropertyTransition(QState *sourceState)
    : GuardedSignalTransition(sourceState)
{
}

GuardedPropertyTransition::GuardedPropertyTransition(QObject *sender, const char *propertyName,
                                                     QState *sourceState)
    : GuardedSignalTransition(sourceState)
{
    setSenderObject(sender);
    setSignal(extractNotifySignal(sender, propertyName));
}

GuardedPropertyTransition::~GuardedPropertyTransition() = default;

bool GuardedPropertyTransition::eventTest(QEvent *event)
{
    return HmiSignalTransition::eventTest(event);
}

} // namespace HmiStateMachine
