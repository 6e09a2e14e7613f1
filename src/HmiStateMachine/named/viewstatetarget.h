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
    explicit ViewStateTarget(QObject *parent = nullptr);
    ~ViewStateTarget() override;

    /**
     * Set by the application, null until then and never assigned by the library: an application
     * that deletes its instance sets this to null first.
     */
    static ViewStateTarget *VIEW_STATE_TARGET_INSTANCE;

    /** What the application has set; may be null. */
    static ViewStateTarget *instance();

    /** Shows a view. @p instanceData is a map with the keys "eventData", "entryReason" and others.
     */
    virtual void activateView(const QString &viewId, const QVariant &instanceData) = 0;

    /** Tells that a view has been left; the map has "exitReason" besides. */
    virtual void deactivateView(const QString &viewId, const QVariant &instanceData) = 0;

    /** Announces a popup before it is shown; @p reactivation when it had been interrupted. */
    virtual void preparePopup(const QString &popupId, bool reactivation) = 0;
    virtual void requestPopupShow(const QString &popupId, int popupKind, const QVariant &data) = 0;

    /** @p deactivated is true when the popup will not come back. */
    virtual void requestPopupHide(const QString &popupId, bool deactivated) = 0;

    /**
     * Puts a popup on the popup stack unless it is there already. The second argument names the
     * popup that covers it and is for the use of overriding classes.
     */
    virtual void stackPopup(const QString &popupId, const QString &stackingPopupId);
    virtual void unstackPopup(const QString &popupId);

    /** The application's number for a domain that the popup interruption file names. */
    virtual int domainFromName(const QString &domainName) = 0;
    virtual int activeDomain() const = 0;
    virtual Identifier activeView() const = 0;

    /** Requests again a popup that its domain had blocked. */
    virtual void retryBlockedPopup(PopupState *popup) = 0;

    /** Hands over the popups whose requests were refused, each with the time of refusal. */
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
    virtual void updatePopupData(const QString &popupId, const QVariant &data) = 0;

    /** The popups on the popup stack, oldest first. */
    QList<QString> stackedPopups() const;

    /** Whether a popup with that popup view id is entered. */
    bool isPopupStateActive(const QString &popupId);

    /** Marks that a view was requested by voice, with the request's data; stays until changed. */
    void setVRViewRequest(bool request, const QVariant &data);
    bool vrViewRequest() const;
    QVariant vrViewRequestData() const;

Q_SIGNALS:
    void activeDomainChanged(int newDomain, int oldDomain);
    void activeViewChanged(Identifier newViewId, Identifier oldViewId);
    void viewAboutToBeActivated(Identifier oldViewId, Identifier newViewId);
    void viewActivated(Identifier oldViewId, Identifier newViewId);
    void popupStatusChanged(Identifier popupId, bool shown);
    void viewAnimationStarted(Identifier viewId, int type);

    /** @p viewId is the id of the popup. */
    void popupAnimationStarted(Identifier viewId, int type);

    /** Emitted by the library, with the activation data of the active view. */
    void activeViewDataChanged(QVariant data);

private:
    Q_DISABLE_COPY(ViewStateTarget)

    bool m_vrViewRequest = false;
    QVariant m_vrViewRequestData;
    QList<QString> m_stackedPopups;
};

} // namespace HmiStateMachine
