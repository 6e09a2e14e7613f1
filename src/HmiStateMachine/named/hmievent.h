#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/simpleevent.h>

#include <QString>
#include <QVariant>

namespace HmiStateMachine {

/** A named event of the application; HmiTransition reacts to it. */
class HMISTATEMACHINE_EXPORT HmiEvent : public SimpleEvent<HmiEventType>
{
public:
    /** @p data is invalid when the event carries none. */
    HmiEvent(const QString &name, const QVariant &data);

    /** What transitions compare with their own event name. */
    QString name() const { return m_name; }

    /** What the event carries; invalid for nothing. */
    QVariant data() const { return m_data; }

private:
    QString m_name;
    QVariant m_data;
};

} // namespace HmiStateMachine
