#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/simpleevent.h>

#include <QString>
#include <QVariant>

namespace HmiStateMachine {

/** A request to show a view, named by its state or by its target view. */
class HMISTATEMACHINE_EXPORT HmiViewEvent : public SimpleEvent<HmiViewEventType>
{
public:
    /** @p data reaches the entered view as "eventData"; invalid when there is none. */
    HmiViewEvent(const QString &viewId, const QVariant &data);

    /** The name of a state, or else the target view of one. */
    QString viewId() const { return m_viewId; }

    /** What the request carries; invalid for nothing. */
    QVariant data() const { return m_data; }

private:
    QString m_viewId;
    QVariant m_data;
};

} // namespace HmiStateMachine
