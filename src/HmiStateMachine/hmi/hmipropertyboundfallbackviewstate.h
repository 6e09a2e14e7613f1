#pragma once

#include <HmiStateMachine/hmi/hmifallbackviewstate.h>
#include <HmiStateMachine/hmistatemachine_export.h>

#include <QByteArray>
#include <QList>
#include <QPointer>
#include <QVariant>

namespace HmiStateMachine {

/**
 * A fallback view that is permitted while a property has one of several values; always, once the
 * object is gone. Values are compared by QVariant, which converts.
 */
class HMISTATEMACHINE_EXPORT HmiPropertyBoundFallbackViewState : public HmiFallbackViewState
{
    Q_OBJECT

public:
    /**
     * With @p autoReevaluate the view asks again whenever the property notifies of a change; a
     * property without a notify signal, or none of that name, is left alone silently. @p object is
     * not owned.
     */
    HmiPropertyBoundFallbackViewState(const QString &name, const QString &fallbackState,
                                      QObject *object, const char *property,
                                      QList<QVariant> permittedValues, QState *parent,
                                      bool autoReevaluate);

    /** With a target view that is not called like the state. */
    HmiPropertyBoundFallbackViewState(const QString &targetView, const QString &name,
                                      const QString &fallbackState, QObject *object,
                                      const char *property, QList<QVariant> permittedValues,
                                      QState *parent, bool autoReevaluate);
    ~HmiPropertyBoundFallbackViewState() override;

    /** Whether the property has one of the permitted values; true without an object. */
    bool permitted() override;

private:
    Q_DISABLE_COPY(HmiPropertyBoundFallbackViewState)

    QPointer<QObject> m_object;
    QByteArray m_property;
    QList<QVariant> m_permittedValues;
};

} // namespace HmiStateMachine
