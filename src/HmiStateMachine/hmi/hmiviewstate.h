#pragma once

#include <HmiStateMachine/hmi/hmistate.h>
#include <HmiStateMachine/hmi/hmitargetfilter.h>
#include <HmiStateMachine/hmistatemachine_export.h>

#include <QMap>
#include <QPointer>
#include <QSharedPointer>
#include <QStack>
#include <QVariant>
#include <QVector>

namespace HmiStateMachine {

class HmiBackTransition;
class HmiViewTransition;

/**
 * One screen of the flow.
 *
 * Entering it asks the view layer to show its target view and hands over the instance data, a map
 * with the keys "eventData" (what came with the request), "entryReason" (1 when a back press led
 * here, else 0), "exitReason" (1 when the last exit was by a back press or a fallback, else 0) and
 * those that the application added.
 *
 * A view that handles back events finds its back target on every entry: the last known view,
 * filtered, when it was entered forwards; the top of its own back stack when it was entered back.
 * Leaving it forwards pushes the back target onto that stack.
 *
 * A view state with an empty target view is a dummy: it shows nothing and borrows the back target
 * of the view that was left last.
 *
 * @code
 * new HmiViewState("Home", machine);
 * auto *radio = new HmiViewState("Radio", machine);
 * radio->setHandlesBackEvent(true);                             // back leads to where we came from
 * machine->postEvent(new HmiViewEvent("Radio", QVariant()));    // from any view
 * machine->postEvent(new HmiBackEvent(1, QString()));
 * @endcode
 */
class HMISTATEMACHINE_EXPORT HmiViewState : public HmiState
{
    Q_OBJECT
    Q_PROPERTY(QVariant activationData READ activationData WRITE setActivationData NOTIFY
                   activationDataChanged)

public:
    /** The target view is @p name. */
    explicit HmiViewState(const QString &name, QState *parent = nullptr);

    /** An empty @p targetView makes a dummy. */
    HmiViewState(const QString &targetView, const QString &name, QState *parent = nullptr);
    ~HmiViewState() override;

    /**
     * A dummy view state that is never the last known view. With a @p timeout above 0, in
     * milliseconds, it emits dummyViewStateTimeout() that long after its entry, again and again
     * until it is left; with @p backToLastKnown it then requests the last known view too, from
     * StateMachine::instance(), and warns when that does not run. Without a timeout
     * @p backToLastKnown has no effect. Owned by @p parent, or by the caller when null.
     */
    static HmiViewState *createDummyViewState(const QString &name, QState *parent, int timeout,
                                              bool backToLastKnown);

    /** The view state entered last and not left yet; null when there is none. */
    static HmiViewState *activeViewState();

    /** The back-stack state id of the view that was left forwards last; empty at first. */
    static QString lastKnownViewState();

    /**
     * Replaces it, until a view that has back stack presence is left forwards. Needs no state of
     * that name.
     */
    static void setLastKnownViewState(const QString &id);

    /** The view state named @p target, or else the first that shows it; null when there is none. */
    static HmiViewState *stateForTarget(const QString &target);

    /**
     * Lets the view follow back presses to a target that it finds on entry. Takes the place of a
     * direct back transition, with which the back stack goes.
     */
    void setHandlesBackEvent(bool on);

    /** Off at first, and with a direct back transition. */
    bool handlesBackEvent() const;

    /**
     * Lets back presses lead to @p target always. Takes the place of other back handling; with a
     * null @p target there is none any more. directBackTransitionTargetChanged() is emitted always.
     */
    void createDirectBackTransition(QAbstractState *target);

    /** Null without a direct back transition. */
    QAbstractState *directBackTransitionTarget() const;

    /**
     * The name of the state that a back press leads to while handlesBackEvent() is on; empty while
     * there is none, and always with a direct back transition.
     */
    QString backTarget() const;

    /**
     * Under @p id this view is remembered as the last known view, and the state of that name is
     * watched: when it is entered by a back press and this view is its initial state, this entry
     * counts as back too. The state must exist by now to be watched. A view whose id is the last
     * known view keeps its back target, unless @p backTargetAcrossSameId.
     */
    void setBackStackStateId(const QString &id, bool backTargetAcrossSameId);

    /** The name of the state unless it was set. */
    QString backStackStateId() const;

    /** While the back target of @p state is not empty it is taken for this view too. Not owned. */
    void setBackTargetProviderState(HmiViewState *state);

    /**
     * Admits only such last known views as back targets that every filter accepts; for a refused
     * one its own back target is tried, and so on. Views that lead back to each other and are all
     * refused are walked for ever: see to it that a filter accepts one view of every such circle.
     */
    void addBackTargetFilter(QSharedPointer<HmiTargetFilter> filter);

    /** Whether every filter accepts @p target. */
    bool backTargetValidityTest(const QString &target) const;

    /** @p target or the first on its chain of back targets that the filters accept; else empty. */
    Identifier getValidBackTarget(const Identifier &target) const;

    /** Lets the next forward entry take its back target from the back stack, once. */
    void setTreatNextEntryAsBackTransition(bool on);

    /** Without presence the view is never the last known view. On at first. */
    void setHasBackStackPresence(bool on);

    /** On at first. */
    bool hasBackStackPresence() const;

    /** While blocked, the view takes no requests for other views. */
    void setIndirectViewTransitionsBlocked(bool blocked);

    /** Off at first. */
    bool indirectViewTransitionsBlocked() const;

    /** Empty for a dummy. */
    QString targetView() const;

    /** 1 when the last entry was by a back press, else 0. */
    int entryReason() const;

    /** Pushes a name onto the back stack and emits backStackPush(); an empty one does nothing. */
    void pushBackStack(const QString &id);

    /** Takes the top off the back stack, empty when it has none; emits backStackPop() always. */
    QString popBackStack();

    /**
     * Adds to the map that the view layer is given, from the next entry or exit on. The three keys
     * of the library's own are overwritten then.
     */
    void addInstanceData(const QString &key, const QVariant &value);

    /** A key that is not there is ignored. */
    void removeInstanceData(const QString &key);

    /** What setActivationData() was given last; invalid at first. */
    QVariant activationData() const;

    /** Lets the view follow the view layer's reports; see viewActivated(). Off at first. */
    void setReportsQmlViewStatus(bool on);

    /** Off at first. */
    bool reportsQmlViewStatus() const;

Q_SIGNALS:
    /** Emitted by each popBackStack(), also when there was nothing to take. */
    void backStackPop();

    /** @p id is on top of the back stack now. */
    void backStackPush(Identifier id);

    /**
     * Emitted by setHandlesBackEvent() on a real change; not by createDirectBackTransition(),
     * although that ends back handling.
     */
    void handlesBackEventChanged(bool handlesBackEvent);

    /** Emitted by each createDirectBackTransition(); null when there is none any more. */
    void directBackTransitionTargetChanged(QAbstractState *backTarget);

    /** The view layer has reported that it shows this view; needs setReportsQmlViewStatus(). */
    void viewActivated();

    /** The view layer shows another view although this one is active; its reports are left then. */
    void viewDeactivated();

    /**
     * The view layer has reported that this view begins to move; needs setReportsQmlViewStatus().
     */
    void viewAnimationStarted(int type);

    /** Only on a real change, after the value is stored. */
    void activationDataChanged(QVariant data);

    /** The time that createDummyViewState() was given has run out. */
    void dummyViewStateTimeout();

    /** This view was requested while it was active. */
    void alreadyActive();

public Q_SLOTS:
    /** A change is also told to the view layer while the view is active. */
    void setActivationData(QVariant data);

private Q_SLOTS:
    void onViewStateTargetViewChange(HmiStateMachine::Identifier oldViewId,
                                     HmiStateMachine::Identifier newViewId);
    void onViewAnimationStarted(HmiStateMachine::Identifier viewId, int type);
    void backToLastKnownView();

protected:
    /** Finds the back target, stores the instance data and ends with onActivated(). */
    void onEntry(QEvent *event) override;

    /** Remembers the view and its back target, and tells the view layer that it is left. */
    void onExit(QEvent *event) override;

public:
    /** Remembers whether the state named by backStackStateId() was entered by a back press. */
    void monitoredStateEntered(QEvent *event) override;

protected:
    /** Hands the view to the view layer; called at the end of the entry. */
    virtual void onActivated();

private:
    Q_DISABLE_COPY(HmiViewState)

    bool hasOwnBackTransition() const;
    void updateDummyBackTransition(const HmiViewState &left);
    void updateBackTarget(bool backEntry);
    void updateForwardBackTarget();
    void removeBackTransition(HmiBackTransition *&transition);
    void unregisterBackStackMonitor();
    void requestFollowOnBackEvent();
    void setViewStatusConnectionActive(bool on);

    bool isBackEntry(QEvent *event);
    bool backEventTest(QEvent *event);
    bool backChainEventTest(QEvent *event);

    QString m_targetView;
    QString m_backStackStateId;
    bool m_backTargetAcrossSameId = false;
    HmiBackTransition *m_backTransition = nullptr;
    HmiBackTransition *m_dummyBackTransition = nullptr;
    QMap<QString, QVariant> m_instanceData;
    QStack<QString> m_backStack;
    bool m_backChain = false;
    quint8 m_backDepth = 0;
    QString m_backTargetId;
    bool m_hasBackStackPresence = true;
    bool m_reportsQmlViewStatus = false;
    bool m_viewStatusConnectionActive = false;
    bool m_treatNextEntryAsBackTransition = false;
    HmiViewTransition *m_indirectViewTransition;
    HmiBackTransition *m_directBackTransition = nullptr;
    HmiBackTransition *m_dummyDirectBackTransition = nullptr;
    QVector<QSharedPointer<HmiTargetFilter>> m_backTargetFilters;
    QPointer<HmiViewState> m_backTargetProviderState;
    QVariant m_activationData;
    int m_entryReason = 0;
};

} // namespace HmiStateMachine
