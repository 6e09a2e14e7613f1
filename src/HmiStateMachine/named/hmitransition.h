#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/guardedtransition.h>

#include <QString>
#include <QVariant>

namespace HmiStateMachine {

/**
 * Fires on HmiEvents of one name, and perhaps of one value of data.
 *
 * Unlike its base it allows by default. Type, name and data are compared before the guard is asked.
 */
class HMISTATEMACHINE_EXPORT HmiTransition : public GuardedTransition
{
    Q_OBJECT

public:
    /** Reacts to events without a name. */
    explicit HmiTransition(QState *sourceState = nullptr);

    /** Reacts to events named @p eventName, in the same case. */
    explicit HmiTransition(const QString &eventName, QState *sourceState = nullptr);
    ~HmiTransition() override;

    /** An invalid @p filter, as at first, accepts any data. */
    void setEventDataFilter(const QVariant &filter);

    /** True when @p data is of the filter's very type and equal to it, or when there is no filter.
     */
    bool dataTest(const QVariant &data) const;

    /**
     * The data of the last event that matched name and filter, whether or not the guard let it
     * pass; invalid until then.
     */
    QVariant transitionData() const;

    /**
     * Joins the group of all HmiTransitions for the same event name. False when the priority is
     * taken, or when this transition has another one already.
     */
    bool makeParallelExclusive(int priority);

protected:
    /** As GuardedTransition does. */
    bool eventTest(QEvent *event) override;

public:
    /** Type, name, data, guard; the data is stored before the guard is asked. */
    bool internalEventTest(QEvent *event) override;

private:
    Q_DISABLE_COPY(HmiTransition)

    QString m_eventName;
    QVariant m_eventDataFilter;
    QVariant m_transitionData;
};

} // namespace HmiStateMachine
