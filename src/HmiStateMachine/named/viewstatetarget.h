#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/named/identifier.h>

#include <QList>
#include <QMap>
#include <QObject>
#include <QTime>
#include <QVariant>

namespace HmiStateMachine {

class PopupState;

/**
 * The one object through which the library talks to the view layer.
 *
 * The application derives from it, makes one instance, stores it in VIEW_STATE_TARGET_INSTANCE
 * before the machine starts and keeps it as long as the machine runs. The library calls the virtual
 * operations as states are entered and left, and listens to the signals that the application emits
 * as its view layer reports changes. Without an instance the machine runs all the same, and shows
 * nothing.
 *
 * Belongs to the thread of the machine.
 */
class HMISTATEMACHINE_EXPORT ViewStateTarget : public QObject
{
    Q_OBJECT
    Q_PROPERTY(int activeDomain READ activeDomain NOTIFY activeDomainChanged)
    Q_PROPERTY(Identifier activeView READ activeView NOTIFY activeViewChanged)

public:
    /** Publishes nothing: that is up to the application. */
    explicit ViewStateTarget(QObject *parent = nullptr);
    ~ViewStateTarget() override;

    /**
     * Set by the application, null until then and never assigned by the library: an application
     * that deletes its instance sets this to null. Until it does, the library calls nobody.
     */
    static ViewStateTarget *VIEW_STATE_TARGET_INSTANCE;

    /** What the application has set; may be null. */
    static ViewStateTarget *instance();

    /**
     * Shows a view; called at the end of its entry. @p instanceData is a map with the keys
     * "eventData" and "entryReason", from the second entry on "exitReason", and what
     * HmiViewState::addInstanceData() has added.
     */
    virtual void activateView(const QString &viewId, const QVariant &instanceData) = 0;

    /** Tells that a view is being left; the map has "exitReason" in any case. */
    virtual void deactivateView(const QString &viewId, const QVariant &instanceData) = 0;

    /**
     * Announces a popup before it is shown. @p reactivation is true when it returns although a
     * request for it would have been refused.
     */
    virtual void preparePopup(const QString &popupId, bool reactivation) = 0;

    /**
     * Shows a popup, on its entry or because its domain or view does not block it any more.
     * @p popupKind is the number that the application gave to the popup state, @p data its instance
     * data, a map: "eventData", when a request brought some, and what PopupState::addInstanceData()
     * has added.
     */
    virtual void requestPopupShow(const QString &popupId, int popupKind, const QVariant &data) = 0;

    /**
     * Hides a popup, perhaps one that is hidden already. @p deactivated is true when it will not
     * come back. A popup layer that is left or reset names the popups that were to return by their
     * states, not by their popup view ids.
     */
    virtual void requestPopupHide(const QString &popupId, bool deactivated) = 0;

    /**
     * Puts a popup on the popup stack unless it is there already. The second argument names the
     * popup that covers it and is for the use of overriding classes.
     */
    virtual void stackPopup(const QString &popupId, const QString &stackingPopupId);

    /**
     * Takes a popup off the popup stack; nothing when it is not there, as for most popups that are
     * shown or hidden.
     */
    virtual void unstackPopup(const QString &popupId);

    /**
     * The application's number for a domain that the popup interruption file names, to be compared
     * with activeDomain().
     */
    virtual int domainFromName(const QString &domainName) = 0;

    /** The number of the domain whose blacklists count. */
    virtual int activeDomain() const = 0;

    /** The view whose blacklists count. */
    virtual Identifier activeView() const = 0;

    /** Requests again a popup that its domain had blocked. */
    virtual void retryBlockedPopup(PopupState *popup) = 0;

    /**
     * Hands over the popups whose requests were refused, each with the time of refusal; called when
     * PopupState::setStoreBlockedPopups() is switched off. They are not kept any longer.
     */
    virtual void releaseBlockedPopups(const QMap<PopupState *, QTime> &blockedPopups) = 0;

    /**
     * One back step has led to @p viewId: post what HmiBackEvent::followOnEvent() makes of the
     * three arguments, if anything.
     */
    virtual void postFollowOnBackEvent(quint8 backDepth, const QString &backTargetId,
                                       const QString &viewId) = 0;

    /** A screen was entered on which popups are on (true) or off. */
    virtual void setScreenPopupBehavior(bool enabled) = 0;

    /** A screen was entered that leaves popups as they are by default. */
    virtual void resetScreenPopupBehavior() = 0;

    /** The popup that is shown was requested again; @p data is its new instance data. */
    virtual void updatePopupData(const QString &popupId, const QVariant &data) = 0;

    /** The popups on the popup stack, oldest first. */
    QList<QString> stackedPopups() const;

    /** Whether a popup with that popup view id is entered. */
    bool isPopupStateActive(const QString &popupId);

    /** Marks that a view was requested by voice, with the request's data; stays until changed. */
    void setVRViewRequest(bool request, const QVariant &data);

    /** Off at first. */
    bool vrViewRequest() const;

    /** Invalid at first. */
    QVariant vrViewRequestData() const;

Q_SIGNALS:
    /**
     * To be emitted by the application when activeDomain() is another one by now. Popups that are
     * entered hide or show themselves by it, and those that wait for a domain come to
     * retryBlockedPopup().
     */
    void activeDomainChanged(int newDomain, int oldDomain);

    /**
     * To be emitted by the application when activeView() is another one by now. Popups that are
     * entered hide or show themselves by it.
     */
    void activeViewChanged(Identifier newViewId, Identifier oldViewId);

    /** To be emitted by the application before a view is shown. The library does not listen. */
    void viewAboutToBeActivated(Identifier oldViewId, Identifier newViewId);

    /**
     * To be emitted by the application when the view is shown. The active view state passes it on,
     * if it has been told to: see HmiViewState::setReportsQmlViewStatus().
     */
    void viewActivated(Identifier oldViewId, Identifier newViewId);

    /**
     * To be emitted by the application when a popup has been shown or hidden; @p popupId is its
     * popup view id. A popup's auto-dismiss time begins with it.
     */
    void popupStatusChanged(Identifier popupId, bool shown);

    /**
     * To be emitted by the application when a view begins to move; what @p type means is up to it.
     */
    void viewAnimationStarted(Identifier viewId, int type);

    /**
     * To be emitted by the application when a popup begins to move. @p viewId is its popup view id;
     * what @p type means is up to the application.
     */
    void popupAnimationStarted(Identifier viewId, int type);

    /**
     * Emitted by the library, with the activation data of the active view: on its entry and on each
     * change. A dummy view tells only data that is valid on its entry.
     */
    void activeViewDataChanged(QVariant data);

private:
    Q_DISABLE_COPY(ViewStateTarget)

    bool m_vrViewRequest = false;
    QVariant m_vrViewRequestData;
    QList<QString> m_stackedPopups;
};

} // namespace HmiStateMachine
