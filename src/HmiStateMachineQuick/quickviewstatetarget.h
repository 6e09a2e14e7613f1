#pragma once

#include <HmiStateMachineQuick/hmistatemachinequick_export.h>
#include <HmiStateMachineQuick/popuplistmodel.h>

#include <HmiStateMachine/named/viewstatetarget.h>

#include <QHash>
#include <QPointer>
#include <QStringList>
#include <QUrl>
#include <QVariantMap>

class QTimer;

namespace HmiStateMachine {

class HmiViewState;
class PopupPresenter;
class Requests;
class ViewPresenter;

/** What went wrong when a component was loaded. */
struct HMISTATEMACHINEQUICK_EXPORT LoadError
{
    QString id; ///< the view or the popup that was to be shown
    QUrl file; ///< empty when there is no component at all
    int line = -1; ///< in that file; -1 when unknown
    QString text; ///< what the engine says
};

/**
 * The view layer for Qt Quick: it keeps what QML binds to, has its screens and popups shown by a
 * ScreenHost and a PopupHost, and reports to the flow what the scene really does.
 *
 * Make one before the machine starts and keep it as long as the machine runs; it publishes itself
 * in VIEW_STATE_TARGET_INSTANCE and withdraws when it is destroyed. In QML it is the singleton
 * ViewTarget of the module "HmiStateMachine 1.0", which it also makes known to the process, so that
 * an application needs no import path.
 *
 * While no host is there, every view and popup is reported as shown at once: a flow runs and is
 * tested without a scene.
 *
 * @code
 * QuickViewStateTarget viewLayer;
 * viewLayer.setDomains({"Home", "Media"});
 * buildFlow(StateMachine::instance());
 * QQmlApplicationEngine engine(QUrl("qrc:/Main.qml"));   // has a ScreenHost and a PopupHost
 * StateMachine::instance()->start();
 * @endcode
 *
 * What is reported, and when:
 *  - viewAboutToBeActivated() and activeViewChanged() at once, when the flow enters a view;
 *  - viewAnimationStarted() when the screen's component is ready and begins to move in;
 *  - viewActivated() when that animation has ended. A view that the flow leaves before, or whose
 *    component does not load, is never reported activated;
 *  - popupAnimationStarted() and popupStatusChanged(true) when the popup's component is ready and
 *    begins to appear, because its time runs from when the user can see it;
 * popupStatusChanged(false) when it has disappeared.
 *
 * Belongs to the thread of the machine, which has to be that of the QML engine.
 */
class HMISTATEMACHINEQUICK_EXPORT QuickViewStateTarget : public ViewStateTarget
{
    Q_OBJECT
    Q_PROPERTY(QStringList domains READ domains WRITE setDomains NOTIFY domainsChanged)
    Q_PROPERTY(QString activeDomainName READ activeDomainName NOTIFY activeDomainNameChanged)
    Q_PROPERTY(QVariantMap viewData READ viewData NOTIFY viewDataChanged)
    Q_PROPERTY(QVariant activationData READ activationData NOTIFY activationDataChanged)
    Q_PROPERTY(QString backTarget READ backTarget NOTIFY backTargetChanged)
    Q_PROPERTY(bool backPossible READ isBackPossible NOTIFY backTargetChanged)
    Q_PROPERTY(bool popupsEnabled READ popupsEnabled NOTIFY popupsEnabledChanged)
    Q_PROPERTY(bool transitioning READ isTransitioning NOTIFY transitioningChanged)
    Q_PROPERTY(HmiStateMachine::PopupListModel *shownPopups READ shownPopups CONSTANT)
    Q_PROPERTY(HmiStateMachine::PopupListModel *stackedPopups READ stackedPopupList CONSTANT)
    Q_PROPERTY(HmiStateMachine::Requests *requests READ requests CONSTANT)

public:
    /** What viewAnimationStarted() carries. */
    enum ViewAnimation {
        ForwardAnimation = 1, ///< a request led to the view
        BackAnimation = 2 ///< a back press led to the view
    };
    Q_ENUM(ViewAnimation)

    /** What popupAnimationStarted() carries. */
    enum PopupAnimation {
        AppearAnimation = 1, ///< the popup begins to appear
        DisappearAnimation = 2 ///< the popup begins to disappear
    };
    Q_ENUM(PopupAnimation)

    /** Publishes itself in place of whoever was published. */
    explicit QuickViewStateTarget(QObject *parent = nullptr);
    ~QuickViewStateTarget() override;

    /** The published instance, when it is one of this class; else null. */
    static QuickViewStateTarget *published();

    /** The names of the domains; a domain's number is its index here. Set before rules are loaded.
     */
    QStringList domains() const;

    /** The number of the active domain is looked up anew. */
    void setDomains(const QStringList &names);

    /** Empty before the first view. */
    QString activeDomainName() const;

    /** The instance data with which the active view was activated. */
    QVariantMap viewData() const;

    /** What the flow told the active view by HmiViewState::setActivationData(). */
    QVariant activationData() const;

    /**
     * The name of the state to which back leads from the active view; empty when it leads nowhere,
     * or to a state without a name.
     */
    QString backTarget() const;

    /** Whether back leads anywhere, also to a state without a name. */
    bool isBackPossible() const;

    /** False while a screen is active that has switched popups off. */
    bool popupsEnabled() const;

    /** Whether a host is loading or moving something. */
    bool isTransitioning() const;

    /** The popups that the flow wants shown, the lowest first; those that are covered, too. */
    PopupListModel *shownPopups() const;

    /** The popups on the popup stack, oldest first, as stackedPopups() has them. */
    PopupListModel *stackedPopupList() const;

    /** Owned by this object. */
    Requests *requests() const;

    /**
     * The one who shows views from now on; null for nobody. It is not told of a view that is active
     * already. Not owned, has to withdraw before it dies.
     */
    void setViewPresenter(ViewPresenter *presenter);

    /** Null while nobody shows views. */
    ViewPresenter *viewPresenter() const;

    /**
     * The one who shows popups from now on; null for nobody. It is not told of popups that are
     * shown already. Not owned, has to withdraw before it dies.
     */
    void setPopupPresenter(PopupPresenter *presenter);

    /** Null while nobody shows popups. */
    PopupPresenter *popupPresenter() const;

    /**
     * A presenter begins to move the view in: emits viewAnimationStarted(), unless the view is not
     * the active one any more or has been reported shown.
     */
    void reportViewAnimationStarted(const QString &viewId, ViewAnimation type);

    /**
     * A presenter shows the view: emits viewActivated(), once for each activation of the view, and
     * not for a view that is not the active one any more.
     */
    void reportViewShown(const QString &viewId);

    /** A presenter begins to move the popup: emits popupAnimationStarted(). */
    void reportPopupAnimationStarted(const QString &popupId, PopupAnimation type);

    /** A presenter shows the popup: emits popupStatusChanged(). */
    void reportPopupShown(const QString &popupId);

    /** A presenter has hidden the popup: emits popupStatusChanged(). */
    void reportPopupHidden(const QString &popupId);

    /** A presenter cannot show what @p error names: writes a warning and emits loadFailed(). */
    void reportLoadError(const LoadError &error);

    /** A presenter has become busy or idle. */
    void reportBusyChanged();

    /** Makes the module "HmiStateMachine 1.0" known to the process; further calls do nothing. */
    static void registerQmlModule();

public:
    void activateView(const QString &viewId, const QVariant &instanceData) override;
    void deactivateView(const QString &viewId, const QVariant &instanceData) override;

    /** Does nothing: components are made when they are shown. */
    void preparePopup(const QString &popupId, bool reactivation) override;

    void requestPopupShow(const QString &popupId, int popupKind, const QVariant &data) override;
    void requestPopupHide(const QString &popupId, bool deactivated) override;
    void stackPopup(const QString &popupId, const QString &stackingPopupId) override;
    void unstackPopup(const QString &popupId) override;

    /** The index in domains(); -1 for a name that is not among them. */
    int domainFromName(const QString &domainName) override;

    int activeDomain() const override;
    Identifier activeView() const override;

    /** Requests @p popup from StateMachine::instance(). */
    void retryBlockedPopup(PopupState *popup) override;

    /**
     * Requests them from StateMachine::instance(), the one that was refused first before all
     * others.
     */
    void releaseBlockedPopups(const QMap<PopupState *, QTime> &blockedPopups) override;

    /** Posts to StateMachine::instance(). A target that is no view is not gone on to. */
    void postFollowOnBackEvent(quint8 backDepth, const QString &backTargetId,
                               const QString &viewId) override;

    /** Becomes popupsEnabled(). */
    void setScreenPopupBehavior(bool enabled) override;

    /** Switches popupsEnabled() on. */
    void resetScreenPopupBehavior() override;

    void updatePopupData(const QString &popupId, const QVariant &data) override;

    /** The domain of a view: what stands before the first slash of its id. */
    virtual QString domainOfView(const QString &viewId) const;

public Q_SLOTS:
    /**
     * Another domain takes over without a change of view; one that is not among domains() has the
     * number -1.
     */
    void setActiveDomain(const QString &name);

Q_SIGNALS:
    void domainsChanged();
    void activeDomainNameChanged();
    void viewDataChanged();
    void activationDataChanged();
    void backTargetChanged();
    void popupsEnabledChanged();
    void transitioningChanged();

    /** A component cannot be shown; the flow stays where it is. @p line is -1 when unknown. */
    void loadFailed(const QString &id, const QUrl &file, int line, const QString &text);

private:
    Q_DISABLE_COPY(QuickViewStateTarget)

    void setViewData(const QVariantMap &data);
    void setActivationData(const QVariant &data);
    void setPopupsEnabled(bool enabled);
    void followViewState();
    void updateBackTarget();
    void uncover(const QString &coveringId);
    void updateStack();
    void updateRemainingTimes();
    PopupEntry describe(const QString &popupId, int kind, const QVariant &data) const;

    QStringList m_domains;
    QString m_domainName;
    int m_domain = -1;
    QString m_activeView;
    QString m_viewBefore;
    bool m_viewShown = true;
    QVariantMap m_viewData;
    QVariant m_activationData;
    QString m_backTarget;
    bool m_backPossible = false;
    QPointer<HmiViewState> m_viewState;
    bool m_popupsEnabled = true;
    bool m_transitioning = false;
    PopupListModel *m_shownPopups;
    PopupListModel *m_stackedPopups;
    QHash<QString, QString> m_coveredBy;
    QTimer *m_tickTimer;
    Requests *m_requests;
    ViewPresenter *m_viewPresenter = nullptr;
    PopupPresenter *m_popupPresenter = nullptr;
};

} // namespace HmiStateMachine
