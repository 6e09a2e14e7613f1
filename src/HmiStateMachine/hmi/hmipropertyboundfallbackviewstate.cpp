#include <HmiStateMachine/hmi/hmipropertyboundfallbackviewstate.h>

#include <QMetaMethod>
#include <QMetaProperty>

namespace HmiStateMachine {

HmiPropertyBoundFallbackViewState::HmiPropertyBoundFallbackViewState(
    const QString &name, const QString &fallbackState, QObject *object, const char *property,
    QList<QVariant> permittedValues, QState *parent, bool autoReevaluate)
    : HmiPropertyBoundFallbackViewState(name, name, fallbackState, object, property,
                                        permittedValues, parent, autoReevaluate)
{
}

HmiPropertyBoundFallbackViewState::HmiPropertyBoundFallbackViewState(
    const QString &targetView, const QString &name, const QString &fallbackState, QObject *object,
    const char *property, QList<QVariant> permittedValues, QState *parent, bool autoReevaluate)
    : HmiFallbackViewState(targetView, name, fallbackState, parent), m_object(object),
      m_property(property), m_permittedValues(permittedValues)
{
    if (!autoReevaluate || !object) {
        return;
    }
    const QMetaObject *meta = object->metaObject();
    const QMetaProperty metaProperty = meta->property(meta->indexOfProperty(m_property));
    if (metaProperty.hasNotifySignal()) {
        // Connected by meta-method, because the signal is known at run time only.
        const int slot = staticMetaObject.indexOfSlot("reevaluate()");
        connect(object, metaProperty.notifySignal(), this, staticMetaObject.method(slot));
    }
}

HmiPropertyBoundFallbackViewState::~HmiPropertyBoundFallbackViewState() = default;

bool HmiPropertyBoundFallbackViewState::permitted()
{
    return !m_object || m_permittedValues.contains(m_object->property(m_property.constData()));
}

} // namespace HmiStateMachine
