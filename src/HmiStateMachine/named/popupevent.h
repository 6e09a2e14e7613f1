#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/simpleevent.h>

#include <QString>
#include <QVariant>

namespace HmiStateMachine {

/** A request to show or to dismiss a popup. */
class HMISTATEMACHINE_EXPORT PopupEvent : public SimpleEvent<PopupEventType>
{
public:
    /** An ordinary request: isReactivation() is false. */
    PopupEvent(const QString &target, const QVariant &data);

    /** @p reactivation marks the return of a popup that had been interrupted. */
    PopupEvent(const QString &target, bool reactivation, const QVariant &data);

    /** The name of the popup, or a dismiss identifier. */
    QString target() const { return m_target; }

    /**
     * Whether an interrupted popup returns, which neither the popup in front nor the domain
     * refuses.
     */
    bool isReactivation() const { return m_reactivation; }

    /** What the request carries; invalid for nothing. */
    QVariant data() const { return m_data; }

private:
    QString m_target;
    bool m_reactivation;
    QVariant m_data;
};

} // namespace HmiStateMachine
