#include <HmiStateMachine/hmi/hmiviewstate.h>

#include <HmiStateMachine/hmi/hmibacktransition.h>
#include <HmiStateMachine/hmi/hmiviewtransition.h>
#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/internal/owntransition.h>
#include <HmiStateMachine/internal/targetindex.h>
#include <HmiStateMachine/internal/viewlayer.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmifallbackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/named/viewstatetarget.h>

#include <QTimer>

#include <algorithm>

namespace HmiStateMachine {

namespace {

constexpr int ordinaryReason = 0;
constexpr int backReason = 1;

/** What all view states of the process share. */
struct ViewRecords
{
    HmiViewState *activeViewState = nullptr;
    HmiViewState *lastDeactivatedViewState = nullptr;
    QString lastKnownView;
};

ViewRecords &records()
{
    static ViewRecords instance;
    return instance;
}

QString eventDataKey()
{
    return QStringLiteral("eventData");
}

bool fallbackEventTest(const QEvent *event)
{
    return event->type() == HmiFallbackEvent::eventType();
}

QVariant getEntryData(const QEvent *event)
{
    return event->type() == HmiViewEvent::eventType()
        ? static_cast<const HmiViewEvent *>(event)->data()
        : QVariant();
}

} // namespace

HmiViewState::HmiViewState(const QString &name, QState *parent) : HmiViewState(name, name, parent)
{
}

HmiViewState::HmiViewState(const QString &targetView, const QString &name, QState *parent)
    : HmiState(name, parent), m_targetView(targetView), m_backStackStateId(name),
      m_indirectViewTransition(ownTransition<HmiViewTransition>(this))
{
    TargetIndex<HmiViewState>::invalidate();
}

HmiViewState::~HmiViewState()
{
    unregisterBackStackMonitor();
    ViewRecords &r = records();
    if (r.lastDeactivatedViewState == this) {
        r.lastDeactivatedViewState = nullptr;
    }
    if (r.activeViewState == this) {
        r.activeViewState = nullptr;
    }
}

HmiViewState *HmiViewState::createDummyViewState(const QString &name, QState *parent, int timeout,
                                                 bool backToLastKnown)
{
    auto *state = new HmiViewState(QString(), name, parent);
    state->setHasBackStackPresence(false);
    if (timeout <= 0) {
        return state;
    }
    auto *timer = new QTimer(state);
    timer->setInterval(timeout);
    connect(state, &QAbstractState::entered, timer, QOverload<>::of(&QTimer::start));
    connect(state, &QAbstractState::exited, timer, &QTimer::stop);
    connect(timer, &QTimer::timeout, state, &HmiViewState::dummyViewStateTimeout);
    if (backToLastKnown) {
        connect(timer, &QTimer::timeout, state, &HmiViewState::backToLastKnownView);
    }
    return state;
}

HmiViewState *HmiViewState::activeViewState()
{
    return records().activeViewState;
}

QString HmiViewState::lastKnownViewState()
{
    return records().lastKnownView;
}

void HmiViewState::setLastKnownViewState(const QString &id)
{
    records().lastKnownView = id;
}

HmiViewState *HmiViewState::stateForTarget(const QString &target)
{
    if (auto *view = qobject_cast<HmiViewState *>(stateForName(target))) {
        return view;
    }
    if (target.isEmpty()) {
        return nullptr;
    }
    static TargetIndex<HmiViewState> byTargetView(&HmiViewState::targetView);
    return byTargetView.find(target);
}

void HmiViewState::setHandlesBackEvent(bool on)
{
    if (on && m_directBackTransition) {
        removeBackTransition(m_directBackTransition);
        m_backStack.clear();
    }
    if (on == handlesBackEvent()) {
        return;
    }
    if (on) {
        m_backTransition = ownTransition<HmiBackTransition>(this);
    } else {
        removeBackTransition(m_backTransition);
    }
    Q_EMIT handlesBackEventChanged(on);
}

bool HmiViewState::handlesBackEvent() const
{
    return m_backTransition != nullptr;
}

void HmiViewState::createDirectBackTransition(QAbstractState *target)
{
    if (m_directBackTransition) {
        removeBackTransition(m_directBackTransition);
        m_backStack.clear();
    }
    removeBackTransition(m_backTransition);
    if (target) {
        m_directBackTransition = ownTransition<HmiBackTransition>(this);
        m_directBackTransition->setTargetState(target);
    }
    Q_EMIT directBackTransitionTargetChanged(target);
}

QAbstractState *HmiViewState::directBackTransitionTarget() const
{
    return m_directBackTransition ? m_directBackTransition->targetState() : nullptr;
}

QString HmiViewState::backTarget() const
{
    return m_backTransition ? m_backTransition->targetName() : QString();
}

void HmiViewState::setBackStackStateId(const QString &id, bool backTargetAcrossSameId)
{
    unregisterBackStackMonitor();
    m_backStackStateId = id;
    m_backTargetAcrossSameId = backTargetAcrossSameId;
    if (NamedState *state = stateForName(id)) {
        state->registerMonitoringState(this);
    }
}

QString HmiViewState::backStackStateId() const
{
    return m_backStackStateId;
}

void HmiViewState::setBackTargetProviderState(HmiViewState *state)
{
    m_backTargetProviderState = state;
}

void HmiViewState::addBackTargetFilter(QSharedPointer<HmiTargetFilter> filter)
{
    if (filter) {
        m_backTargetFilters.append(filter);
    }
}

bool HmiViewState::backTargetValidityTest(const QString &target) const
{
    return std::all_of(m_backTargetFilters.cbegin(), m_backTargetFilters.cend(),
                       [&target](const QSharedPointer<HmiTargetFilter> &filter) {
                           return filter->isValid(target);
                       });
}

Identifier HmiViewState::getValidBackTarget(const Identifier &target) const
{
    // Written out: compilers render the signature differently.
    static const char signature[] = "HmiStateMachine::Identifier HmiStateMachine::HmiViewState::"
                                    "getValidBackTarget(const HmiStateMachine::Identifier&) const";
    if (backTargetValidityTest(target)) {
        return target;
    }
    const HmiViewState *state = stateForTarget(target);
    if (!state) {
        HMI_DEBUG(hmistatemachine()) << signature << "Invalid back target type detected" << target;
        return Identifier();
    }
    if (state->backTarget().isEmpty()) {
        HMI_DEBUG(hmistatemachine()) << signature << "Back stack end reached";
        return Identifier();
    }
    // No guard against views that lead back to each other and are all refused: the application's
    // filters have to leave a way out.
    return getValidBackTarget(state->backTarget());
}

void HmiViewState::setTreatNextEntryAsBackTransition(bool on)
{
    m_treatNextEntryAsBackTransition = on;
}

void HmiViewState::setHasBackStackPresence(bool on)
{
    m_hasBackStackPresence = on;
}

bool HmiViewState::hasBackStackPresence() const
{
    return m_hasBackStackPresence;
}

void HmiViewState::setIndirectViewTransitionsBlocked(bool blocked)
{
    m_indirectViewTransition->setBlocked(blocked);
}

bool HmiViewState::indirectViewTransitionsBlocked() const
{
    return m_indirectViewTransition->blocked();
}

QString HmiViewState::targetView() const
{
    return m_targetView;
}

int HmiViewState::entryReason() const
{
    return m_entryReason;
}

void HmiViewState::pushBackStack(const QString &id)
{
    if (id.isEmpty()) {
        return;
    }
    m_backStack.push(id);
    Q_EMIT backStackPush(id);
}

QString HmiViewState::popBackStack()
{
    QString id = m_backStack.isEmpty() ? QString() : m_backStack.pop();
    Q_EMIT backStackPop();
    return id;
}

void HmiViewState::addInstanceData(const QString &key, const QVariant &value)
{
    m_instanceData.insert(key, value);
}

void HmiViewState::removeInstanceData(const QString &key)
{
    m_instanceData.remove(key);
}

QVariant HmiViewState::activationData() const
{
    return m_activationData;
}

void HmiViewState::setReportsQmlViewStatus(bool on)
{
    if (on == m_reportsQmlViewStatus) {
        return;
    }
    m_reportsQmlViewStatus = on;
    if (isActive() || !on) {
        setViewStatusConnectionActive(on);
    }
}

bool HmiViewState::reportsQmlViewStatus() const
{
    return m_reportsQmlViewStatus;
}

void HmiViewState::setActivationData(QVariant data)
{
    if (data == m_activationData) {
        return;
    }
    m_activationData = data;
    Q_EMIT activationDataChanged(data);
    ViewStateTarget *target = viewLayer();
    if (isActive() && target) {
        Q_EMIT target->activeViewDataChanged(data);
    }
}

void HmiViewState::onViewStateTargetViewChange(HmiStateMachine::Identifier oldViewId,
                                               HmiStateMachine::Identifier newViewId)
{
    Q_UNUSED(oldViewId)
    if (!isActive()) {
        return;
    }
    if (m_targetView == newViewId) {
        Q_EMIT viewActivated();
        return;
    }
    Q_EMIT viewDeactivated();
    setViewStatusConnectionActive(false);
}

void HmiViewState::onViewAnimationStarted(HmiStateMachine::Identifier viewId, int type)
{
    if (viewId == m_targetView) {
        Q_EMIT viewAnimationStarted(type);
    }
}

void HmiViewState::backToLastKnownView()
{
    if (!isActive() || !m_targetView.isEmpty()) {
        return;
    }
    const QString id = lastKnownViewState();
    const auto *view = qobject_cast<HmiViewState *>(stateForName(id));
    const QVariant data = view ? view->m_instanceData.value(eventDataKey()) : QVariant();
    StateMachine::instance()->postEvent(new HmiViewEvent(id, data));
}

void HmiViewState::onEntry(QEvent *event)
{
    HmiState::onEntry(event);
    m_entryReason = ordinaryReason;
    ViewRecords &r = records();
    if (m_targetView.isEmpty() && r.lastDeactivatedViewState && !hasOwnBackTransition()) {
        updateDummyBackTransition(*r.lastDeactivatedViewState);
    }
    const bool backEntry = isBackEntry(event);
    if (hasOwnBackTransition()) {
        updateBackTarget(backEntry);
    }
    m_entryReason = backEntry ? backReason : ordinaryReason;
    r.activeViewState = this;
    m_instanceData.insert(eventDataKey(), getEntryData(event));
    m_instanceData.insert(QStringLiteral("entryReason"), m_entryReason);
    onActivated();
}

void HmiViewState::onExit(QEvent *event)
{
    HmiState::onExit(event);
    ViewRecords &r = records();
    int exitReason = backReason;
    if (!backEventTest(event) && !fallbackEventTest(event)) {
        exitReason = ordinaryReason;
        if (m_backTransition
            && (!m_backTargetProviderState || m_backTargetProviderState->backTarget().isEmpty())) {
            pushBackStack(m_backTransition->targetName());
        }
        if (m_hasBackStackPresence) {
            r.lastKnownView = m_backStackStateId;
        }
    }
    m_instanceData.insert(QStringLiteral("exitReason"), exitReason);
    ViewStateTarget *target = viewLayer();
    if (target && !m_targetView.isEmpty()) {
        target->deactivateView(m_targetView, QVariant(m_instanceData));
    }
    if (r.activeViewState == this) {
        r.activeViewState = nullptr;
    }
    if (!m_targetView.isEmpty()) {
        r.lastDeactivatedViewState = this;
    }
}

void HmiViewState::monitoredStateEntered(QEvent *event)
{
    m_backChain = backEventTest(event);
}

void HmiViewState::onActivated()
{
    static const char signature[] = "virtual void HmiStateMachine::HmiViewState::onActivated()";
    ViewStateTarget *target = viewLayer();
    const bool isDummy = m_targetView.isEmpty();
    if (isDummy) {
        HMI_DEBUG(hmistatemachine()) << signature << "Dummy view state activated";
    } else if (target) {
        setViewStatusConnectionActive(m_reportsQmlViewStatus);
        HMI_DEBUG(hmistatemachine()) << signature << "target name" << m_targetView;
        target->activateView(m_targetView, QVariant(m_instanceData));
    }
    if (target && (!isDummy || m_activationData.isValid())) {
        Q_EMIT target->activeViewDataChanged(m_activationData);
    }
}

bool HmiViewState::hasOwnBackTransition() const
{
    return m_backTransition || m_directBackTransition;
}

// A dummy leads back to where the view that was left last would have led.
void HmiViewState::updateDummyBackTransition(const HmiViewState &left)
{
    if (left.m_backTransition) {
        if (!m_dummyBackTransition) {
            m_dummyBackTransition = ownTransition<HmiBackTransition>(this);
        }
        m_dummyBackTransition->setTargetState(left.m_backTransition->targetState());
        HMI_DEBUG_FROM(hmistatemachine(), "onEntry")
            << name() << "Setting dummy back state:" << m_dummyBackTransition->targetName();
        removeBackTransition(m_dummyDirectBackTransition);
    } else if (left.m_directBackTransition) {
        if (!m_dummyDirectBackTransition) {
            m_dummyDirectBackTransition = ownTransition<HmiBackTransition>(this);
        }
        m_dummyDirectBackTransition->setTargetState(left.m_directBackTransition->targetState());
        HMI_DEBUG_FROM(hmistatemachine(), "onEntry")
            << name()
            << "Setting dummy direct back state:" << m_dummyDirectBackTransition->targetName();
        removeBackTransition(m_dummyBackTransition);
    } else {
        removeBackTransition(m_dummyBackTransition);
        removeBackTransition(m_dummyDirectBackTransition);
    }
}

void HmiViewState::updateBackTarget(bool backEntry)
{
    if (backEntry) {
        if (m_backTransition) {
            m_backTransition->setNamedTargetState(popBackStack());
            if (m_backTransition->targetName().isEmpty() && !m_backTargetId.isEmpty()) {
                m_backTransition->setNamedTargetState(m_backTargetId);
            }
        }
        requestFollowOnBackEvent();
    } else if (m_backTransition && !lastKnownViewState().isEmpty()
               && (lastKnownViewState() != m_backStackStateId || m_backTargetAcrossSameId)) {
        updateForwardBackTarget();
    }
    if (m_backTransition) {
        HMI_DEBUG_FROM(hmistatemachine(), "onEntry")
            << name() << "Setting back state:" << m_backTransition->targetName();
    } else if (m_directBackTransition) {
        HMI_DEBUG_FROM(hmistatemachine(), "onEntry")
            << name() << "Setting direct back state:" << m_directBackTransition->targetName();
    }
}

void HmiViewState::updateForwardBackTarget()
{
    const QString lastKnown = lastKnownViewState();
    QString target;
    if (m_backTargetProviderState && !m_backTargetProviderState->backTarget().isEmpty()) {
        target = m_backTargetProviderState->backTarget();
    } else if (m_treatNextEntryAsBackTransition) {
        m_treatNextEntryAsBackTransition = false;
        target = popBackStack();
        if (target.isEmpty()) {
            target = lastKnown;
        }
    } else {
        target = getValidBackTarget(lastKnown);
        if (target.isEmpty()) {
            target = popBackStack();
        }
    }
    m_backTransition->setNamedTargetState(target);
}

void HmiViewState::removeBackTransition(HmiBackTransition *&transition)
{
    if (!transition) {
        return;
    }
    removeTransition(transition);
    transition->deleteLater(); // it may be the one that is just firing
    transition = nullptr;
}

void HmiViewState::unregisterBackStackMonitor()
{
    if (m_backStackStateId == name()) {
        return;
    }
    if (NamedState *state = stateForName(m_backStackStateId)) {
        state->unregisterMonitoringState(this);
    }
}

void HmiViewState::requestFollowOnBackEvent()
{
    if (ViewStateTarget *target = viewLayer()) {
        target->postFollowOnBackEvent(m_backDepth, m_backTargetId, m_targetView);
    }
}

void HmiViewState::setViewStatusConnectionActive(bool on)
{
    ViewStateTarget *target = viewLayer();
    if (on == m_viewStatusConnectionActive || !target) {
        return;
    }
    if (on) {
        connect(target, &ViewStateTarget::viewActivated, this,
                &HmiViewState::onViewStateTargetViewChange);
        connect(target, &ViewStateTarget::viewAnimationStarted, this,
                &HmiViewState::onViewAnimationStarted);
    } else {
        disconnect(target, &ViewStateTarget::viewActivated, this,
                   &HmiViewState::onViewStateTargetViewChange);
        disconnect(target, &ViewStateTarget::viewAnimationStarted, this,
                   &HmiViewState::onViewAnimationStarted);
    }
    m_viewStatusConnectionActive = on;
}

// The chain test comes first: when it holds, depth and target are those of the monitored entry.
bool HmiViewState::isBackEntry(QEvent *event)
{
    return backChainEventTest(event) || backEventTest(event);
}

// Depth 0 leads back, too, but counts as an ordinary entry.
bool HmiViewState::backEventTest(QEvent *event)
{
    m_backDepth = 0;
    m_backTargetId.clear();
    if (event->type() == HmiBackEvent::eventType()) {
        const auto *backEvent = static_cast<HmiBackEvent *>(event);
        m_backDepth = backEvent->depth();
        m_backTargetId = backEvent->targetId();
    }
    return m_backDepth != 0;
}

bool HmiViewState::backChainEventTest(QEvent *event)
{
    const bool chain = m_backChain && event->type() == QEvent::None;
    m_backChain = false;
    return chain;
}

} // namespace HmiStateMachine
