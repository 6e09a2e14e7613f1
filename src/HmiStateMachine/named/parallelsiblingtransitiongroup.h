#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>

#include <QAbstractState>
#include <QHash>
#include <QList>
#include <QObject>
#include <QPointer>
#include <QSet>

class QEvent;

namespace HmiStateMachine {

class NamedTargetTransitionBase;

/**
 * Arbitrates among transitions in parallel regions that react to the same event.
 *
 * Every member has a priority of its own. A member refuses an event while a member of strictly
 * higher priority, whose source state is active, would accept it; the larger number wins. That a
 * source state is active is learnt from its next entry on.
 *
 * Transitions join through their makeParallelExclusive(). There is no way to leave but to be
 * destroyed, and the priority of a destroyed transition stays taken. Belongs to the thread of the
 * machine.
 */
class HMISTATEMACHINE_EXPORT ParallelSiblingTransitionGroup : public QObject
{
    Q_OBJECT

public:
    /**
     * An empty group. Those that the transitions join by themselves are made by the library, as
     * children of the application object.
     */
    explicit ParallelSiblingTransitionGroup(QObject *parent = nullptr);
    ~ParallelSiblingTransitionGroup() override;

    /**
     * Registers @p transition. True also when it is registered with the same @p priority already;
     * false when another member has or had that priority, or when the transition has another one,
     * which is logged at debug level. A transition without a source state is accepted, but never
     * counts as active and has priority 0.
     */
    bool addTransition(NamedTargetTransitionBase *transition, int priority);

    /** True when an active member of higher priority takes @p event, so @p transition must not. */
    bool internalEventTest(NamedTargetTransitionBase *transition, QEvent *event) const;

public Q_SLOTS:
    /** The source state of @p transition has been entered. */
    void siblingActivated(NamedTargetTransitionBase *transition);

    /** The source state of @p transition has been left. */
    void siblingDeactivated(NamedTargetTransitionBase *transition);

private:
    Q_DISABLE_COPY(ParallelSiblingTransitionGroup)

    friend class NamedTargetTransitionBase;

    void trackSource(NamedTargetTransitionBase *transition, QAbstractState *source);
    void retire(NamedTargetTransitionBase *transition);

    QHash<NamedTargetTransitionBase *, int> m_priorities;
    QList<NamedTargetTransitionBase *> m_activeSiblings;
    QMultiHash<NamedTargetTransitionBase *, QMetaObject::Connection> m_connections;
    QSet<int> m_takenPriorities; // also those of transitions that are gone
};

/** Ties a member of a group to the entries and exits of its source state. */
class HMISTATEMACHINE_EXPORT SiblingFunctorBase
{
public:
    /** Owns none of the three, and is not called for a @p transition that is gone. */
    SiblingFunctorBase(ParallelSiblingTransitionGroup *group, NamedTargetTransitionBase *transition,
                       QAbstractState *sourceState);

    /** False once the group or the state is gone, or the transition has moved to another state. */
    bool sanityTest() const;

protected:
    /** The group that is told. */
    QPointer<ParallelSiblingTransitionGroup> m_group;

    /** The member of the group. */
    NamedTargetTransitionBase *m_transition;

    /** The state whose entries and exits count. */
    QPointer<QAbstractState> m_sourceState;
};

/** Called when the source state of a member has been entered. */
class HMISTATEMACHINE_EXPORT SiblingActivatedFunctor : public SiblingFunctorBase
{
public:
    using SiblingFunctorBase::SiblingFunctorBase;

    /** Calls siblingActivated() of the group, after sanityTest(). */
    void operator()() const;
};

/** Called when the source state of a member has been left. */
class HMISTATEMACHINE_EXPORT SiblingDeactivatedFunctor : public SiblingFunctorBase
{
public:
    using SiblingFunctorBase::SiblingFunctorBase;

    /** Calls siblingDeactivated() of the group, after sanityTest(). */
    void operator()() const;
};

} // namespace HmiStateMachine
