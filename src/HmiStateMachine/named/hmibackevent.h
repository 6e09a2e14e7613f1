#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/simpleevent.h>

#include <QString>

namespace HmiStateMachine {

/** A back press, of one or more steps, perhaps towards a named view. */
class HMISTATEMACHINE_EXPORT HmiBackEvent : public SimpleEvent<HmiBackEventType>
{
public:
    /**
     * @p depth is the number of back steps that remain; an event of depth 0 moves the flow, but the
     * view that it enters treats it as an ordinary entry. @p targetId may be empty.
     */
    HmiBackEvent(unsigned char depth, const QString &targetId);

    /** How many back steps remain, this one included. */
    unsigned char depth() const { return m_depth; }

    /** Where to go on to after the steps; empty for nowhere. */
    QString targetId() const { return m_targetId; }

    /**
     * The event to post after one step of a back request has been carried out, so that a request of
     * several steps proceeds one view at a time.
     *
     * With a @p depth above 1 it has one step less and no target: the target does not travel
     * through the steps between. Otherwise it goes on to @p targetId, unless that is empty or is
     * @p currentId, the view that has just been reached; then the result is null.
     * The caller owns the result until it posts it.
     */
    static HmiBackEvent *followOnEvent(unsigned char depth, const QString &targetId,
                                       const QString &currentId);

private:
    unsigned char m_depth;
    QString m_targetId;
};

} // namespace HmiStateMachine
