#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/guardedsignaltransition.h>

#include <QByteArray>

namespace HmiStateMachine {

/**
 * The signature of the notify signal of a property, without the leading code of SIGNAL(); empty for
 * a null @p object or name, a property that does not exist or one without a notify signal.
 */
HMISTATEMACHINE_EXPORT QByteArray extractNotifySignal(QObject *object, const char *propertyName);

/** A guarded transition on the notify signal of a property. */
class HMISTATEMACHINE_EXPORT GuardedPropertyTransition : public GuardedSignalTransition
{
    Q_OBJECT

public:
    /** A transition without a sender, which fires once it has been given one. */
    explicit GuardedPropertyTransition(QState *sourceState = nullptr);

    /** Never fires when extractNotifySignal() finds nothing to listen to. */
    GuardedPropertyTransition(QObject *sender, const char *propertyName,
                              QState *sourceState = nullptr);
    ~GuardedPropertyTransition() override;

protected:
    /** As HmiSignalTransition does. */
    bool eventTest(QEvent *event) override;

private:
    Q_DISABLE_COPY(GuardedPropertyTransition)
};

} // namespace HmiStateMachine
