#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/namedstate.h>

#include <QByteArray>
#include <QList>
#include <QMap>
#include <QPointer>
#include <QVariant>

class QAbstractTransition;
class QTimer;

namespace HmiStateMachine {

class GuardedPropertyChangeTransition;
class HmiLayeredState;
class HmiSignalTransition;
class PopupDismissTransition;
class PopupRootState;

/**
 * One popup, which lives in the popup layer of a PopupRootState and is requested by a PopupEvent of
 * its name.
 *
 * While it is entered it asks the view layer to show its popup view, unless the active domain or
 * view blocks it. It is left by a dismiss event (see PopupDismissTransition), by its timeout, by a
 * driver restriction, or because another popup interrupts it; whether it may be interrupted, and
 * whether it comes back, the PopupInterruptionStore says.
 *
 * Belongs to the thread of the machine.
 */
class HMISTATEMACHINE_EXPORT PopupState : public NamedState
{
    Q_OBJECT

public:
    /** What a request meets; -1 stands for a behaviour that was not given validly. */
    enum InterruptionBehavior : int {
        Prohibit = 0, ///< the request is refused
        Allow = 1, ///< the popup in front gives way, and returns later
        AllowStack = 2, ///< the popup in front is stacked behind the requested one
        AllowNoReturn = 3 ///< the popup in front is dismissed for good
    };

    /** A popup without a root; it can be added to one by PopupRootState::addPopupState(). */
    PopupState(const QString &name, int popupKind);

    /** A popup of @p root, which is its parent too; null is a warning. */
    PopupState(const QString &name, PopupRootState *root, int popupKind);

    /** A popup of the popup layer of @p layer; a layer without one, or null, is a warning. */
    PopupState(const QString &name, HmiLayeredState *layer, int popupKind);

    /** Leaves its root and all records; to delete an active popup, remove it from its root first.
     */
    ~PopupState() override;

    /** What ends the name of a state that stands for no popup, "_NONEPOPUP". */
    static QString noneStatePostfix();

    /** The id towards the view layer; the state's name unless it was set. */
    QString popupViewId() const;
    void setPopupViewId(const QString &id);

    /** The target of the PopupEvent that dismisses this popup; empty when it cannot be. */
    QString dismissEventIdentifier() const;
    PopupDismissTransition *dismissTransition() const;

    PopupRootState *rootPopupState() const;

    /** Moves the popup to another root, which becomes its parent. */
    void setRootState(PopupRootState *root);

    /** Whether this is the child of its root that was entered last. */
    bool isCurrentPopup() const;

    /** Whether @p state has the same parent; false for null. */
    bool isSibling(QAbstractState *state) const;

    /** True after it was stacked by a popup of its own layer, until it is left. */
    bool stackedBySibling() const;

    /** Leaves out the warning on entry of a popup that cannot be dismissed. */
    void turnOffNonDismissibleWarning();

    /** While set, interruption() decides in place of the interruption store. */
    bool hasOwnInterruptionBehavior() const;
    void setHasOwnInterruptionBehavior(bool own);

    /** Lets the popup follow the view layer's reports: popupShown(), popupHidden(). Off at first.
     */
    bool reportsQmlPopupStatus() const;
    void setReportsQmlPopupStatus(bool on);

    /**
     * Lets the popup dismiss itself. The time runs from when the view layer reports it shown, and
     * on while it is interrupted and will come back.
     */
    void setAutoDismissTimeoutActive(bool on);
    bool autoDismissActive() const;

    /** In milliseconds; 5000 unless set. */
    void setAutoDismissTimeoutInterval(int ms);
    int autoDismissInterval() const;

    /** Starts the time anew when it runs. */
    void restartAutoDismissTimer();

    /** In milliseconds; 0 while no time runs. Qt's coarse timers may stray by a twentieth. */
    int autoDismissRemainingTime() const;
    HmiSignalTransition *autoDismissTransition() const;
    void addAutoDismissTransition();

    /** Lets the firing of @p t give this popup up and close it; null is a warning. */
    void registerDismissingTransition(QAbstractTransition *t);

    /** Lets the activation of @p p give this popup up and close it; null is a warning. */
    void registerDismissingPopup(PopupState *p);

    /**
     * The property, for all popups of the process, that takes @p value while the driver must not be
     * distracted. The object is not owned.
     */
    static void setDriverRestrictionProperty(QObject *object, const QByteArray &property,
                                             const QVariant &value);

    /** Closes the popup when that property takes that value; nothing while it is incomplete. */
    void setDriverRestricted(bool on);
    bool driverRestricted() const;

    void addInstanceData(const QString &key, const QVariant &value);
    void removeInstanceData(const QString &key);

    /** The popup of the process that was entered last and not left; null when there is none. */
    static PopupState *getActivePopupState();
    static bool isStateActive(PopupState *popup);
    static bool isStateActive(const QString &popupViewId);

    /** The popup named @p target, or else the first with that popup view id; else null. */
    static PopupState *stateForTarget(const QString &target);

    /**
     * Keeps popups whose requests are refused, with the time of refusal; off at first. Switching it
     * off hands them to ViewStateTarget::releaseBlockedPopups().
     */
    static void setStoreBlockedPopups(bool store);

    /** The request for @p p was refused. */
    static void popupBlocked(PopupState *p);
    bool handleBlocked();

    /** Is covered by @p over, which stacks it. */
    void stack(PopupState *over);

    /** Lets reactions without a target work on while the popup waits behind others. */
    void stackTransitions();
    void unstackTransitions();

    /** Points the dismiss transition at the no-popup state, or at nothing while not active. */
    void activateDismissTransition();

    /** A request for the popup that is shown already brings new data. */
    void updateEventData(QEvent *e);

    void setPopupStatusConnectionActive(bool on);

Q_SIGNALS:
    void popupTimeOut();
    void aboutToBeActivated();

    /** The popup was requested while it was the current one. */
    void alreadyActivated();

    /** A request was refused. */
    void blocked();
    void exitingDueToDriverRestrictions();
    void popupHidden();
    void popupShown();
    void popupAnimationStarted(int type);

public Q_SLOTS:
    /** Makes way for @p target for good. */
    void deactivateSource(PopupState *target);

    /** Gives the popup up: it is hidden, and will not return. */
    void deactivate();
    void activeDomainChanged(int newDomain, int oldDomain);
    void activeViewChanged(Identifier newView, Identifier oldView);

    /** Does nothing; auto-dismiss is connected to it for the sake of subclasses. */
    void stateEntry();
    void stateExit();
    void onViewStateTargetPopupStateChanged(Identifier popupId, bool shown);
    void onPopupAnimationStarted(Identifier popupId, int type);

protected:
    void onEntry(QEvent *e) override;
    void onExit(QEvent *e) override;

public:
    /** How this popup, being in front, answers a request for @p requested; Allow here. */
    virtual InterruptionBehavior interruption(PopupState *requested) const;

    /** Announces the popup to the view layer; @p reactivation when it returns. */
    virtual void prepareForActivation(bool reactivation);
    virtual void showPopup(bool activated);
    virtual void hidePopup(bool deactivated);

    /** Whether the popup looks after a request that its domain blocked itself; false here. */
    virtual bool handleDomainBlocked();

    /** Whether the popup looks after a request that another popup refused itself; false here. */
    virtual bool handleInterruptionBlocked();

    /** Called when the popup has been given up; does nothing here. */
    virtual void onDeactivated();

private:
    Q_DISABLE_COPY(PopupState)

    PopupState(const QString &name, PopupRootState *root, int popupKind, bool rootExpected);

    bool isNoPopupState() const;
    void storeEntryData(QEvent *e);
    void showUnlessBlocked();
    void warnOfMissingDismissal() const;

    QString m_popupViewId;
    QString m_stackingPopupId;
    QPointer<PopupRootState> m_root;
    QPointer<PopupDismissTransition> m_dismissTransition;
    bool m_nonDismissibleWarning = true;
    bool m_stackedBySibling = false;
    int m_popupKind;
    QTimer *m_autoDismissTimer = nullptr;
    int m_autoDismissInterval;
    bool m_autoDismissActive = false;
    bool m_hasOwnInterruptionBehavior = false;
    bool m_reportsQmlPopupStatus = false;
    bool m_popupStatusConnectionActive = false;
    HmiSignalTransition *m_autoDismissTransition = nullptr;
    GuardedPropertyChangeTransition *m_driverRestrictionTransition = nullptr;
    QMap<QString, QVariant> m_instanceData;
    QList<QPointer<QAbstractTransition>> m_stackedTransitions;
};

} // namespace HmiStateMachine
