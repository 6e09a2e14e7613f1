#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/guardedpropertytransition.h>

#include <QByteArray>
#include <QList>
#include <QPair>
#include <QVariant>

namespace HmiStateMachine {

/**
 * Fires on a change of a property from one of several values, to one value, or both.
 *
 * Unlike its base it allows by default. Values are compared by QVariant, which converts. The guard
 * is asked before the values are looked at.
 */
class HMISTATEMACHINE_EXPORT GuardedPropertyChangeTransition : public GuardedPropertyTransition
{
    Q_OBJECT

public:
    /**
     * An empty @p fromValues accepts any previous value; an invalid @p toValue accepts any new
     * value that is not among @p fromValues. A property that does not exist or has no notify signal
     * is a warning, and the transition never fires. Neither does one without a @p sender.
     */
    GuardedPropertyChangeTransition(QObject *sender, const char *propertyName,
                                    const QList<QVariant> &fromValues, const QVariant &toValue,
                                    QState *sourceState = nullptr);
    ~GuardedPropertyChangeTransition() override;

    /** Whether @p value will do as the new value. */
    bool valueTest(const QVariant &value) const;

    /** Signal and guard first, then the previous value, then the new one. */
    bool internalEventTest(QEvent *event) override;

private Q_SLOTS:
    void propertyChanged();

private:
    Q_DISABLE_COPY(GuardedPropertyChangeTransition)

    void watchProperty(QState *sourceState);
    QVariant propertyValue() const;

    QByteArray m_propertyName;
    QList<QVariant> m_fromValues;
    QVariant m_toValue;
    QPair<QVariant, QVariant> m_valueHistory; // previous, current
};

} // namespace HmiStateMachine
