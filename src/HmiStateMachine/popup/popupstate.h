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
 * It belongs to its root, when it has one. On entry it becomes the popup in front and asks the view
 * layer to show its popup view, unless the active domain blocks it; while it is entered, a change
 * of the active domain or view hides it, or shows it again. On exit it is hidden, or put on the
 * popup stack. It is left by a dismiss event (see PopupDismissTransition), by its timeout, by a
 * driver restriction, or because another popup interrupts it; whether it may be interrupted, and
 * whether it comes back, the PopupInterruptionStore says.
 *
 * Belongs to the thread of the machine.
 *
 * @code
 * auto *fuel = new PopupState("car/fuel", layer, 4);    // 4: a kind that the view layer knows
 * fuel->setAutoDismissTimeoutActive(true);              // after five seconds on the screen
 * machine->postEvent(new PopupEvent("car/fuel", 42));
 * machine->postEvent(new PopupEvent(fuel->dismissEventIdentifier(), QVariant()));
 * @endcode
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

    /**
     * Also makes the dismiss identifier by the view anew. A popup that is shown is not told again.
     */
    void setPopupViewId(const QString &id);

    /** The target of the PopupEvent that dismisses this popup; empty when it cannot be. */
    QString dismissEventIdentifier() const;

    /**
     * Owned by the popup, although it hangs on the root while the popup waits; null when it has
     * been destroyed.
     */
    PopupDismissTransition *dismissTransition() const;

    /** Null while it has none. */
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

    /** Whether interruption() decides in place of the interruption store. Off at first. */
    bool hasOwnInterruptionBehavior() const;

    /** Lets interruption() decide, or the interruption store. */
    void setHasOwnInterruptionBehavior(bool own);

    /** Whether the popup follows the view layer's reports. Off at first. */
    bool reportsQmlPopupStatus() const;

    /**
     * Lets the popup follow the view layer's reports: popupShown(), popupHidden(),
     * popupAnimationStarted(). Counts at once for a popup that is active, else from its next entry
     * on.
     */
    void setReportsQmlPopupStatus(bool on);

    /**
     * Lets the popup dismiss itself. The time runs from when the view layer reports it shown, and
     * on while it is interrupted and will come back. Switching it off stops the time. Off at first.
     */
    void setAutoDismissTimeoutActive(bool on);

    /** Whether the popup dismisses itself. */
    bool autoDismissActive() const;

    /** In milliseconds; 5000 unless set. */
    void setAutoDismissTimeoutInterval(int ms);

    /** In milliseconds. */
    int autoDismissInterval() const;

    /** Starts the time anew when it runs. */
    void restartAutoDismissTimer();

    /** In milliseconds; 0 while no time runs. Qt's coarse timers may stray by a twentieth. */
    int autoDismissRemainingTime() const;

    /**
     * What the end of the time fires; null until auto-dismiss is switched on and there is a root,
     * and when it has been destroyed.
     */
    HmiSignalTransition *autoDismissTransition() const;

    /** Makes that transition once; nothing while auto-dismiss is off or there is no root. */
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

    /** Whether it is closed so; false also when the property was incomplete. */
    bool driverRestricted() const;

    /**
     * Adds to the map that the view layer is given, from the next time on that the popup is shown
     * or has new data.
     */
    void addInstanceData(const QString &key, const QVariant &value);

    /** A key that is not there is ignored. */
    void removeInstanceData(const QString &key);

    /** The popup of the process that was entered last and not left; null when there is none. */
    static PopupState *getActivePopupState();

    /** Whether @p popup is entered; false for null and for a no-popup state. */
    static bool isStateActive(PopupState *popup);

    /** Whether a popup with that popup view id is entered. */
    static bool isStateActive(const QString &popupViewId);

    /** The popup named @p target, or else the first with that popup view id; else null. */
    static PopupState *stateForTarget(const QString &target);

    /**
     * Keeps popups whose requests are refused, with the time of refusal; off at first. Switching it
     * off hands them to ViewStateTarget::releaseBlockedPopups().
     */
    static void setStoreBlockedPopups(bool store);

    /**
     * The request for @p p was refused: unless it looks after that itself, it is kept with the time
     * while setStoreBlockedPopups() is on. Null is ignored.
     */
    static void popupBlocked(PopupState *p);

    /**
     * Whether the popup looks after it itself: handleDomainBlocked() or else
     * handleInterruptionBlocked().
     */
    bool handleBlocked();

    /**
     * Is covered by @p over: a popup of another layer goes on the popup stack now, one of the same
     * layer when it is left. Null is ignored.
     */
    void stack(PopupState *over);

    /**
     * Lets reactions without a target work on while the popup waits behind others: they hang on the
     * root then.
     */
    void stackTransitions();

    /** Takes those reactions back. */
    void unstackTransitions();

    /** Points the dismiss transition at the no-popup state, or at nothing while not active. */
    void activateDismissTransition();

    /**
     * A request for the popup that is shown already brings new data, which
     * ViewStateTarget::updatePopupData() is given; null is ignored.
     */
    void updateEventData(QEvent *e);

    /** Begins or ends to listen to the view layer's reports; nothing without a view layer. */
    void setPopupStatusConnectionActive(bool on);

Q_SIGNALS:
    /** The auto-dismiss time has run out. */
    void popupTimeOut();

    /**
     * A request was granted. Emitted while the request is tested, before any state is left or
     * entered.
     */
    void aboutToBeActivated();

    /** The popup was requested while it was the current one. */
    void alreadyActivated();

    /**
     * A request was refused; emitted after it was kept or looked after, if it was. A request that a
     * stacked popup prohibits is dropped without this.
     */
    void blocked();

    /** The driver must not be distracted; the popup is given up right after. */
    void exitingDueToDriverRestrictions();

    /**
     * The view layer has reported it hidden. Emitted while reports are followed: see
     * setReportsQmlPopupStatus(). Once its auto-dismiss has been switched on, a popup always
     * follows them.
     */
    void popupHidden();

    /** The view layer has reported it shown. Emitted when popupHidden() would be. */
    void popupShown();

    /** The view layer has reported that it begins to move. Emitted when popupHidden() would be. */
    void popupAnimationStarted(int type);

public Q_SLOTS:
    /**
     * Makes way for @p target for good: is given up when that is of the same root, else dismissed.
     */
    void deactivateSource(PopupState *target);

    /** Gives the popup up: it is hidden, and will not return. */
    void deactivate();

    /** Hides or shows the popup when its domain blacklist has one of the two and not the other. */
    void activeDomainChanged(int newDomain, int oldDomain);

    /** Hides or shows the popup when its view blacklist has one of the two and not the other. */
    void activeViewChanged(Identifier newView, Identifier oldView);

    /** Does nothing; auto-dismiss is connected to it for the sake of subclasses. */
    void stateEntry();

    /** Stops the auto-dismiss time, unless the popup will come back. */
    void stateExit();

    /** A report of the view layer; one about another popup view id is ignored. */
    void onViewStateTargetPopupStateChanged(Identifier popupId, bool shown);

    /** A report of the view layer; one about another popup view id is ignored. */
    void onPopupAnimationStarted(Identifier popupId, int type);

protected:
    /**
     * Becomes the popup in front, takes the data of the request, and is shown unless its domain
     * blocks it. A popup that cannot be dismissed is a warning.
     */
    void onEntry(QEvent *e) override;

    /** Is hidden or stacked, and leaves its dismiss transition with the root. */
    void onExit(QEvent *e) override;

public:
    /**
     * How this popup, being in front, answers a request for @p requested; asked while
     * hasOwnInterruptionBehavior(). Allow here.
     */
    virtual InterruptionBehavior interruption(PopupState *requested) const;

    /**
     * Announces the popup to the view layer and emits aboutToBeActivated(). @p reactivation is true
     * when it returns although a request for it would have been refused.
     */
    virtual void prepareForActivation(bool reactivation);

    /**
     * Asks the view layer to show the popup, takes it off the popup stack, and writes a warning on
     * purpose: every popup that comes up is to be found in the log. @p activated is true on entry,
     * false when the active domain or view has let go; it changes nothing here.
     */
    virtual void showPopup(bool activated);

    /**
     * Asks the view layer to hide the popup, or to stack it when one of its own layer covers it.
     * @p deactivated is false when the active domain or view blocks it; it changes nothing here.
     */
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
