#include <HmiStateMachineQuick/quickviewstatetarget.h>

#include <HmiStateMachineQuick/internal/log.h>
#include <HmiStateMachineQuick/presenter.h>
#include <HmiStateMachineQuick/requests.h>

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QTime>
#include <QTimer>

#include <algorithm>

namespace HmiStateMachine {

namespace {

constexpr int tickMs = 100; // a bar of ten centimetres that empties in five seconds moves 2 mm
constexpr int dayMs = 24 * 60 * 60 * 1000;

void request(const PopupState *popup)
{
    if (popup) {
        StateMachine::instance()->postEvent(new PopupEvent(popup->name(), QVariant()));
    }
}

// The layered state that holds the popups' root; a root may also stand alone.
QString layerOf(const PopupState *popup)
{
    const PopupRootState *root = popup->rootPopupState();
    const QObject *owner = root ? root->parent() : nullptr;
    const auto *layer = qobject_cast<const NamedState *>(owner);
    return layer ? layer->name() : QString();
}

// A popup that is being entered is the one entered last; otherwise its id has to do.
PopupState *stateOf(const QString &popupId)
{
    PopupState *active = PopupState::getActivePopupState();
    return active && active->popupViewId() == popupId ? active
                                                      : PopupState::stateForTarget(popupId);
}

// A back press takes the one or the other way, never both.
QString backTargetOf(const HmiViewState *view)
{
    const auto *direct = qobject_cast<const NamedState *>(view->directBackTransitionTarget());
    return direct ? QString(direct->name()) : view->backTarget();
}

// From a dummy without back handling of its own, back leads to where it led from the view before.
bool borrowsBackTarget(const HmiViewState *view)
{
    return view->targetView().isEmpty() && !view->handlesBackEvent()
        && !view->directBackTransitionTarget();
}

// A layer that is reset speaks of its popups by the names of their states.
QString viewIdOf(const QString &popup, const PopupListModel *shown)
{
    if (shown->indexOf(popup) >= 0) {
        return popup;
    }
    const PopupState *state = PopupState::stateForTarget(popup);
    return state ? state->popupViewId() : popup;
}

int ageMs(QTime time, QTime now)
{
    return (now.msecsSinceStartOfDay() - time.msecsSinceStartOfDay() + dayMs) % dayMs;
}

} // namespace

QuickViewStateTarget::QuickViewStateTarget(QObject *parent)
    : ViewStateTarget(parent), m_shownPopups(new PopupListModel(this)),
      m_stackedPopups(new PopupListModel(this)), m_tickTimer(new QTimer(this)),
      m_requests(new Requests(this))
{
    registerQmlModule();
    VIEW_STATE_TARGET_INSTANCE = this;
    m_tickTimer->setInterval(tickMs);
    connect(m_tickTimer, &QTimer::timeout, this, &QuickViewStateTarget::updateRemainingTimes);
    connect(this, &ViewStateTarget::activeViewDataChanged, this,
            &QuickViewStateTarget::setActivationData);
}

QuickViewStateTarget::~QuickViewStateTarget()
{
    if (VIEW_STATE_TARGET_INSTANCE == this) {
        VIEW_STATE_TARGET_INSTANCE = nullptr;
    }
}

QuickViewStateTarget *QuickViewStateTarget::published()
{
    return qobject_cast<QuickViewStateTarget *>(ViewStateTarget::instance());
}

QStringList QuickViewStateTarget::domains() const
{
    return m_domains;
}

void QuickViewStateTarget::setDomains(const QStringList &names)
{
    if (names == m_domains) {
        return;
    }
    m_domains = names;
    Q_EMIT domainsChanged();
    setActiveDomain(m_domainName);
}

QString QuickViewStateTarget::activeDomainName() const
{
    return m_domainName;
}

QVariantMap QuickViewStateTarget::viewData() const
{
    return m_viewData;
}

QVariant QuickViewStateTarget::activationData() const
{
    return m_activationData;
}

QString QuickViewStateTarget::backTarget() const
{
    return m_backTarget;
}

bool QuickViewStateTarget::isBackPossible() const
{
    return m_backPossible;
}

bool QuickViewStateTarget::popupsEnabled() const
{
    return m_popupsEnabled;
}

bool QuickViewStateTarget::isTransitioning() const
{
    return m_transitioning;
}

PopupListModel *QuickViewStateTarget::shownPopups() const
{
    return m_shownPopups;
}

PopupListModel *QuickViewStateTarget::stackedPopupList() const
{
    return m_stackedPopups;
}

Requests *QuickViewStateTarget::requests() const
{
    return m_requests;
}

void QuickViewStateTarget::setViewPresenter(ViewPresenter *presenter)
{
    m_viewPresenter = presenter;
    reportBusyChanged();
}

ViewPresenter *QuickViewStateTarget::viewPresenter() const
{
    return m_viewPresenter;
}

void QuickViewStateTarget::setPopupPresenter(PopupPresenter *presenter)
{
    m_popupPresenter = presenter;
    reportBusyChanged();
}

PopupPresenter *QuickViewStateTarget::popupPresenter() const
{
    return m_popupPresenter;
}

void QuickViewStateTarget::reportViewAnimationStarted(const QString &viewId, ViewAnimation type)
{
    if (viewId == m_activeView && !m_viewShown) {
        Q_EMIT viewAnimationStarted(viewId, type);
    }
}

void QuickViewStateTarget::reportViewShown(const QString &viewId)
{
    if (viewId == m_activeView && !m_viewShown) {
        m_viewShown = true;
        Q_EMIT viewActivated(m_viewBefore, viewId);
    }
}

void QuickViewStateTarget::reportPopupAnimationStarted(const QString &popupId, PopupAnimation type)
{
    Q_EMIT popupAnimationStarted(popupId, type);
}

// The popup starts its auto-dismiss time when it hears this.
void QuickViewStateTarget::reportPopupShown(const QString &popupId)
{
    Q_EMIT popupStatusChanged(popupId, true);
    updateRemainingTimes();
}

void QuickViewStateTarget::reportPopupHidden(const QString &popupId)
{
    Q_EMIT popupStatusChanged(popupId, false);
}

void QuickViewStateTarget::reportLoadError(const LoadError &error)
{
    const QString place = error.line < 0
        ? error.file.toString()
        : error.file.toString() + QLatin1Char(':') + QString::number(error.line);
    qCWarning(hmistatemachinequick, "\"%s\" cannot be shown: %s%s%s", qUtf8Printable(error.id),
              qUtf8Printable(place), place.isEmpty() ? "" : ": ", qUtf8Printable(error.text));
    Q_EMIT loadFailed(error.id, error.file, error.line, error.text);
}

void QuickViewStateTarget::reportBusyChanged()
{
    const bool busy = (m_viewPresenter && m_viewPresenter->isBusy())
        || (m_popupPresenter && m_popupPresenter->isBusy());
    if (busy != m_transitioning) {
        m_transitioning = busy;
        Q_EMIT transitioningChanged();
    }
}

void QuickViewStateTarget::activateView(const QString &viewId, const QVariant &instanceData)
{
    const QVariantMap data = instanceData.toMap();
    m_viewBefore = m_activeView;
    m_activeView = viewId;
    m_viewShown = false;
    Q_EMIT viewAboutToBeActivated(m_viewBefore, viewId);
    setActiveDomain(domainOfView(viewId));
    setViewData(data);
    followViewState();
    setActivationData(m_viewState ? m_viewState->activationData() : QVariant());
    if (viewId != m_viewBefore) {
        Q_EMIT activeViewChanged(viewId, m_viewBefore);
    }
    if (m_viewPresenter) {
        m_viewPresenter->presentView(viewId,
                                     data.value(QStringLiteral("entryReason")).toInt() != 0);
    } else {
        reportViewShown(viewId);
    }
}

// The screen stays until another one takes its place. A dummy view does not announce itself, so
// where back leads from it can only be seen after its entry.
void QuickViewStateTarget::deactivateView(const QString &, const QVariant &)
{
    QMetaObject::invokeMethod(this, &QuickViewStateTarget::followViewState, Qt::QueuedConnection);
}

// Components are made when they are shown.
void QuickViewStateTarget::preparePopup(const QString &, bool)
{
}

void QuickViewStateTarget::requestPopupShow(const QString &popupId, int popupKind,
                                            const QVariant &data)
{
    m_shownPopups->raise(describe(popupId, popupKind, data));
    if (m_popupPresenter) {
        m_popupPresenter->presentPopup(popupId);
    } else {
        reportPopupShown(popupId);
    }
}

void QuickViewStateTarget::requestPopupHide(const QString &popup, bool deactivated)
{
    const QString popupId = viewIdOf(popup, m_shownPopups);
    // The library says so more than once.
    if (m_shownPopups->remove(popupId)) {
        if (m_popupPresenter) {
            m_popupPresenter->withdrawPopup(popupId);
        } else {
            reportPopupHidden(popupId);
        }
    }
    if (deactivated) {
        uncover(popupId);
    }
    updateRemainingTimes();
}

void QuickViewStateTarget::stackPopup(const QString &popupId, const QString &stackingPopupId)
{
    m_coveredBy.insert(popupId, stackingPopupId);
    ViewStateTarget::stackPopup(popupId, stackingPopupId);
    updateStack();
}

void QuickViewStateTarget::unstackPopup(const QString &popup)
{
    const QString popupId = viewIdOf(popup, m_shownPopups);
    if (!ViewStateTarget::stackedPopups().contains(popupId)) {
        return; // the library does so whenever it shows or hides a popup
    }
    ViewStateTarget::unstackPopup(popupId);
    updateStack();
}

int QuickViewStateTarget::domainFromName(const QString &domainName)
{
    return m_domains.indexOf(domainName);
}

int QuickViewStateTarget::activeDomain() const
{
    return m_domain;
}

Identifier QuickViewStateTarget::activeView() const
{
    return m_activeView;
}

void QuickViewStateTarget::retryBlockedPopup(PopupState *popup)
{
    request(popup);
}

// The one that was refused first is requested first; within a millisecond the name decides.
void QuickViewStateTarget::releaseBlockedPopups(const QMap<PopupState *, QTime> &blockedPopups)
{
    const QTime now = QTime::currentTime();
    QList<PopupState *> popups = blockedPopups.keys();
    popups.removeAll(nullptr);
    std::sort(popups.begin(), popups.end(), [&](PopupState *left, PopupState *right) {
        const int leftAge = ageMs(blockedPopups[left], now);
        const int rightAge = ageMs(blockedPopups[right], now);
        return leftAge == rightAge ? left->name() < right->name() : leftAge > rightAge;
    });
    for (const PopupState *popup : qAsConst(popups)) {
        request(popup);
    }
}

// The request may name the state or the view that it shows: it is fulfilled when either is reached.
// Towards what is no view at all there is nothing to go on to.
void QuickViewStateTarget::postFollowOnBackEvent(quint8 backDepth, const QString &backTargetId,
                                                 const QString &viewId)
{
    const HmiViewState *wanted = HmiViewState::stateForTarget(backTargetId);
    const QString targetId = wanted ? backTargetId : QString();
    const QString currentId = wanted && wanted->targetView() == viewId ? backTargetId : viewId;
    if (auto *event = HmiBackEvent::followOnEvent(backDepth, targetId, currentId)) {
        StateMachine::instance()->postEvent(event);
    }
}

void QuickViewStateTarget::setScreenPopupBehavior(bool enabled)
{
    setPopupsEnabled(enabled);
}

void QuickViewStateTarget::resetScreenPopupBehavior()
{
    setPopupsEnabled(true);
}

void QuickViewStateTarget::updatePopupData(const QString &popupId, const QVariant &data)
{
    for (PopupListModel *model : {m_shownPopups, m_stackedPopups}) {
        PopupEntry entry = model->entry(model->indexOf(popupId));
        entry.data = data;
        model->update(entry);
    }
    updateRemainingTimes();
}

QString QuickViewStateTarget::domainOfView(const QString &viewId) const
{
    return viewId.section(QLatin1Char('/'), 0, 0);
}

void QuickViewStateTarget::setActiveDomain(const QString &name)
{
    const int oldDomain = m_domain;
    m_domain = m_domains.indexOf(name);
    if (name != m_domainName) {
        m_domainName = name;
        Q_EMIT activeDomainNameChanged();
    }
    if (m_domain != oldDomain) {
        Q_EMIT activeDomainChanged(m_domain, oldDomain);
    }
}

void QuickViewStateTarget::setViewData(const QVariantMap &data)
{
    if (data != m_viewData) {
        m_viewData = data;
        Q_EMIT viewDataChanged();
    }
}

void QuickViewStateTarget::setActivationData(const QVariant &data)
{
    if (data != m_activationData) {
        m_activationData = data;
        Q_EMIT activationDataChanged();
    }
}

void QuickViewStateTarget::setPopupsEnabled(bool enabled)
{
    if (enabled != m_popupsEnabled) {
        m_popupsEnabled = enabled;
        Q_EMIT popupsEnabledChanged();
    }
}

void QuickViewStateTarget::followViewState()
{
    HmiViewState *view = HmiViewState::activeViewState();
    if (view != m_viewState) {
        if (m_viewState) {
            m_viewState->disconnect(this);
        }
        m_viewState = view;
        if (view) {
            connect(view, &HmiViewState::handlesBackEventChanged, this,
                    &QuickViewStateTarget::updateBackTarget);
            connect(view, &HmiViewState::directBackTransitionTargetChanged, this,
                    &QuickViewStateTarget::updateBackTarget);
        }
    }
    updateBackTarget();
}

void QuickViewStateTarget::updateBackTarget()
{
    if (m_viewState && borrowsBackTarget(m_viewState)) {
        return;
    }
    const QString target = m_viewState ? backTargetOf(m_viewState) : QString();
    // A direct target may be a state without a name.
    const bool possible =
        !target.isEmpty() || (m_viewState && m_viewState->directBackTransitionTarget());
    if (target != m_backTarget || possible != m_backPossible) {
        m_backTarget = target;
        m_backPossible = possible;
        Q_EMIT backTargetChanged();
    }
}

// A popup of the same layer was left when it was covered, and the flow shows it again itself. One
// of another layer stayed entered, and nobody else knows that nothing covers it any more.
void QuickViewStateTarget::uncover(const QString &coveringId)
{
    QStringList covered = m_coveredBy.keys(coveringId);
    covered.sort(); // a hash has no order of its own
    for (const QString &id : qAsConst(covered)) {
        m_coveredBy.remove(id);
        if (isPopupStateActive(id)) {
            unstackPopup(id);
        }
    }
}

void QuickViewStateTarget::updateStack()
{
    const QStringList stacked = ViewStateTarget::stackedPopups();
    for (int row = m_stackedPopups->count() - 1; row >= 0; --row) {
        const QString id = m_stackedPopups->entry(row).popupId;
        if (!stacked.contains(id)) {
            m_stackedPopups->remove(id);
        }
    }
    for (const QString &id : stacked) {
        if (m_stackedPopups->indexOf(id) < 0) {
            const PopupEntry shown = m_shownPopups->entry(m_shownPopups->indexOf(id));
            PopupEntry entry = describe(id, shown.kind, shown.data);
            entry.covered = true;
            m_stackedPopups->raise(entry);
        }
    }
    for (int row = 0; row < m_shownPopups->count(); ++row) {
        PopupEntry entry = m_shownPopups->entry(row);
        entry.covered = stacked.contains(entry.popupId);
        m_shownPopups->update(entry);
    }
}

// Ticks only while a time runs.
void QuickViewStateTarget::updateRemainingTimes()
{
    bool running = false;
    for (PopupListModel *model : {m_shownPopups, m_stackedPopups}) {
        for (int row = 0; row < model->count(); ++row) {
            PopupEntry entry = model->entry(row);
            const PopupState *popup = PopupState::stateForTarget(entry.popupId);
            entry.remainingTime = popup ? popup->autoDismissRemainingTime() : 0;
            running = running || entry.remainingTime > 0;
            model->update(entry);
        }
    }
    if (running != m_tickTimer->isActive()) {
        running ? m_tickTimer->start() : m_tickTimer->stop();
    }
}

PopupEntry QuickViewStateTarget::describe(const QString &popupId, int kind,
                                          const QVariant &data) const
{
    PopupEntry entry;
    entry.popupId = popupId;
    entry.kind = kind;
    entry.data = data;
    if (const PopupState *popup = stateOf(popupId)) {
        entry.layer = layerOf(popup);
        entry.totalTime = popup->autoDismissActive() ? popup->autoDismissInterval() : 0;
        entry.remainingTime = popup->autoDismissRemainingTime();
    }
    return entry;
}

} // namespace HmiStateMachine
