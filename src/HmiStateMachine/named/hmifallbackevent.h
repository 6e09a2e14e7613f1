#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/simpleevent.h>

#include <QString>

namespace HmiStateMachine {

/** Leads away from a view that may not be shown. */
class HMISTATEMACHINE_EXPORT HmiFallbackEvent : public SimpleEvent<HmiFallbackEventType>
{
public:
    /** An empty @p targetId leaves the choice to the view that is left. */
    explicit HmiFallbackEvent(const QString &targetId);

    /** The name of the state to go to; may be empty. */
    QString targetId() const { return m_targetId; }

private:
    QString m_targetId;
};

} // namespace HmiStateMachine
