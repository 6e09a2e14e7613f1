#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>

#include <QList>
#include <QPointer>
#include <QString>
#include <QVariant>
#include <QVector>

class QAbstractState;
class QEvent;
class QState;

namespace HmiStateMachine {

class ParallelSiblingTransitionGroup;

/**
 * What every transition of the library carries beside its Qt base: a target that is named by a
 * string, membership in sibling groups, a record of the transitions that are just firing, and the
 * mark of a voice request.
 *
 * Belongs to the thread of the machine.
 */
class HMISTATEMACHINE_EXPORT NamedTargetTransitionBase
{
public:
    NamedTargetTransitionBase() = default;

    /** Leaves the list of firing transitions and all sibling groups. */
    virtual ~NamedTargetTransitionBase();

    /** The state on which the transition hangs; null when there is none. */
    virtual QState *getSourceState() const = 0;

    /** Makes @p target the target; null leaves none. */
    virtual void changeTarget(QState *target) = 0;

    /** Null when there is none. */
    virtual QAbstractState *getTarget() const = 0;

    /**
     * The transition's own test of @p event, guard included, without the sibling groups. Asked by
     * groups on behalf of other members too, so it may run several times for one event.
     * False here.
     */
    virtual bool internalEventTest(QEvent *event);

    /**
     * Makes the state registered under @p name the target. The name is looked up now; when it is
     * empty or unknown the transition is left without a target.
     */
    void setNamedTargetState(const QString &name);

    /** The target's present name; empty without a target, or when it is no NamedState. */
    QString targetName() const;

    /**
     * Marks the transition as caused by a voice request, with the request's data. When it fires
     * this is handed to ViewStateTarget::setVRViewRequest(), except by view, back and fallback
     * transitions.
     */
    void setIsVREventTransition(bool isVR, const QVariant &data);

    /** Off at first. */
    bool isVREventTransition() const;

    /** What came with that mark; invalid at first. */
    QVariant vrEventData() const;

    /** Lists the transition as about to fire. A transition without a target is never listed. */
    void aboutToBeTriggered();

    /** Takes the transition off that list. */
    void wasTriggered();

    /**
     * The transitions that passed their event test and have not fired yet. During the source's
     * onExit() the one that carries the machine away is among them; others that Qt tested and did
     * not take may be too, until they fire or are destroyed.
     */
    static QList<NamedTargetTransitionBase *> triggeringTransition();

    /** True when a sibling of higher priority takes @p event in place of this transition. */
    bool activeSiblingTest(QEvent *event);

protected:
    /**
     * What follows when the own test has passed. False when a sibling takes the event, or when an
     * eventless transition has no target, with one warning; otherwise the transition is listed as
     * about to fire.
     */
    bool arbitrate(QEvent *event);

    /** The common end of a firing: off the list, then the voice request is passed on. */
    void finishTransition();

    /**
     * What block() has stored; off at first. For the classes that can be blocked; kept here, where
     * it takes no room of its own.
     */
    bool isBlocked() const { return m_blocked; }

    /** Stores what isBlocked() returns, and does nothing else. */
    void block(bool blocked) { m_blocked = blocked; }

private:
    Q_DISABLE_COPY(NamedTargetTransitionBase)

    friend class ParallelSiblingTransitionGroup;

    bool wouldFireForEver(const QEvent *event);

    QVector<QPointer<ParallelSiblingTransitionGroup>> m_siblingGroups;
    bool m_isVREvent = false;
    bool m_warnedOfMissingTarget = false;
    bool m_blocked = false;
    QVariant m_vrEventData;
};

} // namespace HmiStateMachine
