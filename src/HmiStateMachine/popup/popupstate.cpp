#include <HmiStateMachine/popup/popupstate.h>

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/internal/slotconnection.h>
#include <HmiStateMachine/internal/targetindex.h>
#include <HmiStateMachine/internal/viewlayer.h>
#include <HmiStateMachine/named/guardedpropertychangetransition.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/viewstatetarget.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QTime>
#include <QTimer>

#include <algorithm>

namespace HmiStateMachine {

namespace {

constexpr int defaultAutoDismissMs = 5000;
constexpr int noDomain = -1;

/** What all popups of the process share. */
struct PopupRecords
{
    QList<PopupState *> activePopupStack;
    QMap<PopupState *, QTime> blockedPopupStack;
    bool storeBlockedPopups = false;
    QPointer<QObject> drObject;
    QByteArray drProperty;
    QVariant drValue;
};

PopupRecords &records()
{
    static PopupRecords instance;
    return instance;
}

const SlotConnection &domainConnection()
{
    static const SlotConnection connection(&ViewStateTarget::activeDomainChanged,
                                           PopupState::staticMetaObject,
                                           "activeDomainChanged(int,int)");
    return connection;
}

const SlotConnection &viewConnection()
{
    static const SlotConnection connection(&ViewStateTarget::activeViewChanged,
                                           PopupState::staticMetaObject,
                                           "activeViewChanged(Identifier,Identifier)");
    return connection;
}

PopupRootState *rootOf(HmiLayeredState *layer)
{
    return layer ? layer->popupState() : nullptr;
}

QVariant entryData(QEvent *e)
{
    return e->type() == PopupEvent::eventType() ? static_cast<PopupEvent *>(e)->data() : QVariant();
}

} // namespace

PopupState::PopupState(const QString &name, int popupKind)
    : PopupState(name, nullptr, popupKind, false)
{
}

PopupState::PopupState(const QString &name, PopupRootState *root, int popupKind)
    : PopupState(name, root, popupKind, true)
{
}

PopupState::PopupState(const QString &name, HmiLayeredState *layer, int popupKind)
    : PopupState(name, rootOf(layer), popupKind, true)
{
}

PopupState::PopupState(const QString &name, PopupRootState *root, int popupKind, bool rootExpected)
    : NamedState(name, root), m_popupViewId(name), m_root(root),
      m_dismissTransition(new PopupDismissTransition(this)), m_popupKind(popupKind),
      m_autoDismissInterval(defaultAutoDismissMs)
{
    TargetIndex<PopupState>::invalidate();
    if (root) {
        root->addPopupState(this);
    } else if (rootExpected) {
        HMI_WARNING(hmistatemachine()) << "PopupState: Invalid popup root state instance.";
    }
}

PopupState::~PopupState()
{
    PopupRecords &r = records();
    r.activePopupStack.removeAll(this);
    r.blockedPopupStack.remove(this);
    if (m_root) {
        m_root->forgetDestroyed(this);
    }
    // These hang on the root while the popup waits behind others.
    delete m_dismissTransition;
    for (const QPointer<QAbstractTransition> &transition : qAsConst(m_stackedTransitions)) {
        delete transition;
    }
}

QString PopupState::noneStatePostfix()
{
    return QStringLiteral("_NONEPOPUP");
}

QString PopupState::popupViewId() const
{
    return m_popupViewId;
}

void PopupState::setPopupViewId(const QString &id)
{
    m_popupViewId = id;
    TargetIndex<PopupState>::invalidate();
    if (m_dismissTransition) {
        m_dismissTransition->setDismissView(id);
    }
}

QString PopupState::dismissEventIdentifier() const
{
    return m_dismissTransition ? m_dismissTransition->dismissTargetSigniture() : QString();
}

PopupDismissTransition *PopupState::dismissTransition() const
{
    return m_dismissTransition;
}

PopupRootState *PopupState::rootPopupState() const
{
    return m_root;
}

void PopupState::setRootState(PopupRootState *root)
{
    if (root == m_root) {
        return;
    }
    setParent(root);
    if (m_root) {
        m_root->removePopupState(this);
        // It hangs on the root while the popup is not active, and goes along.
        if (m_dismissTransition && m_dismissTransition->parent() == m_root) {
            m_dismissTransition->setParent(root ? static_cast<QState *>(root) : this);
        }
    }
    m_root = root;
    if (m_autoDismissTransition) {
        m_autoDismissTransition->setTargetState(root ? root->noPopupState() : nullptr);
    }
    addAutoDismissTransition();
}

bool PopupState::isCurrentPopup() const
{
    return m_root && m_root->isActivePopupState(this);
}

bool PopupState::isSibling(QAbstractState *state) const
{
    return state && state->parentState() == parentState();
}

bool PopupState::stackedBySibling() const
{
    return m_stackedBySibling;
}

void PopupState::turnOffNonDismissibleWarning()
{
    m_nonDismissibleWarning = false;
}

bool PopupState::hasOwnInterruptionBehavior() const
{
    return m_hasOwnInterruptionBehavior;
}

void PopupState::setHasOwnInterruptionBehavior(bool own)
{
    m_hasOwnInterruptionBehavior = own;
}

bool PopupState::reportsQmlPopupStatus() const
{
    return m_reportsQmlPopupStatus;
}

void PopupState::setReportsQmlPopupStatus(bool on)
{
    if (on == m_reportsQmlPopupStatus) {
        return;
    }
    m_reportsQmlPopupStatus = on;
    if (isActive() || !on) {
        setPopupStatusConnectionActive(on);
    }
}

void PopupState::setAutoDismissTimeoutActive(bool on)
{
    if (on == m_autoDismissActive) {
        return;
    }
    m_autoDismissActive = on;
    if (on) {
        if (!m_autoDismissTimer) {
            m_autoDismissTimer = new QTimer(this);
            m_autoDismissTimer->setSingleShot(true);
            m_autoDismissTimer->setInterval(m_autoDismissInterval);
            addAutoDismissTransition();
        }
        connect(this, &QAbstractState::entered, this, &PopupState::stateEntry);
        connect(this, &PopupState::alreadyActivated, this, &PopupState::stateEntry);
        connect(this, &QAbstractState::exited, this, &PopupState::stateExit);
        // By name, so that a subclass may have a signal popupTimeOut() of its own.
        // clazy:excludeall=old-style-connect
        connect(m_autoDismissTimer, SIGNAL(timeout()), this, SIGNAL(popupTimeOut()));
    } else {
        disconnect(this, &QAbstractState::entered, this, &PopupState::stateEntry);
        disconnect(this, &PopupState::alreadyActivated, this, &PopupState::stateEntry);
        disconnect(this, &QAbstractState::exited, this, &PopupState::stateExit);
        disconnect(m_autoDismissTimer, SIGNAL(timeout()), this, SIGNAL(popupTimeOut()));
        m_autoDismissTimer->stop();
    }
}

bool PopupState::autoDismissActive() const
{
    return m_autoDismissActive;
}

void PopupState::setAutoDismissTimeoutInterval(int ms)
{
    if (ms == m_autoDismissInterval) {
        return;
    }
    m_autoDismissInterval = ms;
    if (m_autoDismissTimer) {
        m_autoDismissTimer->setInterval(ms);
    }
}

int PopupState::autoDismissInterval() const
{
    return m_autoDismissInterval;
}

void PopupState::restartAutoDismissTimer()
{
    if (m_autoDismissTimer && m_autoDismissTimer->isActive()) {
        m_autoDismissTimer->start();
    }
}

int PopupState::autoDismissRemainingTime() const
{
    // Less than 0 when the interval is.
    return m_autoDismissTimer && m_autoDismissTimer->isActive()
        ? qMax(0, m_autoDismissTimer->remainingTime())
        : 0;
}

HmiSignalTransition *PopupState::autoDismissTransition() const
{
    return m_autoDismissTransition;
}

void PopupState::addAutoDismissTransition()
{
    if (!m_autoDismissActive || m_autoDismissTransition || !m_root) {
        return;
    }
    m_autoDismissTransition = new HmiSignalTransition(m_autoDismissTimer, SIGNAL(timeout()), this);
    m_autoDismissTransition->setTargetState(m_root->noPopupState());
    connect(m_autoDismissTimer, &QTimer::timeout, this, &PopupState::deactivate,
            Qt::UniqueConnection);
    // It is handed out, and may be destroyed by whoever asked for it.
    connect(m_autoDismissTransition, &QObject::destroyed, this,
            [this] { m_autoDismissTransition = nullptr; });
}

void PopupState::registerDismissingTransition(QAbstractTransition *t)
{
    if (!t) {
        HMI_WARNING(hmistatemachine()) << "Dismissing transition registration failed:\n"
                                       << "Null transition provided";
        return;
    }
    connect(t, &QAbstractTransition::triggered, this, &PopupState::deactivate);
    if (m_dismissTransition && !isSibling(t->targetState())) {
        connect(t, &QAbstractTransition::triggered, m_dismissTransition,
                &PopupDismissTransition::trigger);
    }
}

void PopupState::registerDismissingPopup(PopupState *p)
{
    if (!p) {
        HMI_WARNING(hmistatemachine()) << "Dismissing popup registration failed:\n"
                                       << "Null popup provided.";
        return;
    }
    connect(p, &PopupState::aboutToBeActivated, this, &PopupState::deactivate);
    if (m_dismissTransition && p->parentState() != parentState()) {
        connect(p, &PopupState::aboutToBeActivated, m_dismissTransition,
                &PopupDismissTransition::trigger);
    }
}

void PopupState::setDriverRestrictionProperty(QObject *object, const QByteArray &property,
                                              const QVariant &value)
{
    PopupRecords &r = records();
    r.drObject = object;
    r.drProperty = property;
    r.drValue = value;
}

void PopupState::setDriverRestricted(bool on)
{
    if (on == driverRestricted()) {
        return;
    }
    if (!on) {
        removeTransition(m_driverRestrictionTransition);
        m_driverRestrictionTransition->deleteLater(); // it may be the one that is just firing
        m_driverRestrictionTransition = nullptr;
        return;
    }
    const PopupRecords &r = records();
    if (!r.drObject || r.drProperty.isEmpty() || !r.drValue.isValid()) {
        return;
    }
    m_driverRestrictionTransition = new GuardedPropertyChangeTransition(
        r.drObject, r.drProperty.constData(), QList<QVariant>(), r.drValue, this);
    connect(m_driverRestrictionTransition, &QAbstractTransition::triggered, this,
            &PopupState::exitingDueToDriverRestrictions);
    registerDismissingTransition(m_driverRestrictionTransition);
}

bool PopupState::driverRestricted() const
{
    return m_driverRestrictionTransition != nullptr;
}

void PopupState::addInstanceData(const QString &key, const QVariant &value)
{
    m_instanceData.insert(key, value);
}

void PopupState::removeInstanceData(const QString &key)
{
    m_instanceData.remove(key);
}

PopupState *PopupState::getActivePopupState()
{
    const auto &stack = records().activePopupStack;
    return stack.isEmpty() ? nullptr : stack.last();
}

bool PopupState::isStateActive(PopupState *popup)
{
    return records().activePopupStack.contains(popup);
}

bool PopupState::isStateActive(const QString &popupViewId)
{
    const auto &stack = records().activePopupStack;
    return std::any_of(stack.cbegin(), stack.cend(), [&popupViewId](const PopupState *popup) {
        return popup->m_popupViewId == popupViewId;
    });
}

PopupState *PopupState::stateForTarget(const QString &target)
{
    if (auto *popup = qobject_cast<PopupState *>(stateForName(target))) {
        return popup;
    }
    static TargetIndex<PopupState> byViewId(&PopupState::popupViewId);
    return byViewId.find(target);
}

void PopupState::setStoreBlockedPopups(bool store)
{
    PopupRecords &r = records();
    r.storeBlockedPopups = store;
    if (store) {
        return;
    }
    if (ViewStateTarget *target = viewLayer()) {
        // Copied, because the application's answer may dismiss or delete popups; a map, as the view
        // layer takes it.
        const auto released = r.blockedPopupStack; // clazy:exclude=qmap-with-pointer-key
        target->releaseBlockedPopups(released);
    }
    r.blockedPopupStack.clear();
}

void PopupState::popupBlocked(PopupState *p)
{
    // Asked also while nothing is stored: a popup may look after itself.
    if (!p || p->handleBlocked() || !records().storeBlockedPopups) {
        return;
    }
    records().blockedPopupStack.insert(p, QTime::currentTime());
    p->activateDismissTransition();
}

bool PopupState::handleBlocked()
{
    return handleDomainBlocked() || handleInterruptionBlocked();
}

void PopupState::stack(PopupState *over)
{
    if (!over) {
        return;
    }
    m_stackedBySibling = over->m_root == m_root;
    m_stackingPopupId = over->m_popupViewId;
    // A popup of the same layer is about to be left, and stacks itself then; one of another layer
    // stays entered.
    ViewStateTarget *target = viewLayer();
    if (!m_stackedBySibling && target) {
        target->stackPopup(m_popupViewId, m_stackingPopupId);
    }
}

void PopupState::stackTransitions()
{
    if (!m_root) {
        return;
    }
    const auto outgoing = transitions();
    for (QAbstractTransition *transition : outgoing) {
        if (!transition->targetState() && transition != m_dismissTransition
            && transition != m_autoDismissTransition
            && transition != m_driverRestrictionTransition) {
            m_root->addTransition(transition);
            m_stackedTransitions.append(transition);
        }
    }
}

void PopupState::unstackTransitions()
{
    const auto stacked = m_stackedTransitions;
    m_stackedTransitions.clear();
    for (const QPointer<QAbstractTransition> &transition : stacked) {
        if (transition) {
            addTransition(transition);
        }
    }
}

void PopupState::activateDismissTransition()
{
    if (!m_root || !m_dismissTransition) {
        return;
    }
    // Handed over as a child: the machine keeps no record of such a transition, so that there is
    // nothing for addTransition() to do besides.
    if (isActive()) {
        m_dismissTransition->setTargetState(m_root->noPopupState());
        m_dismissTransition->setParent(this);
    } else {
        m_dismissTransition->setTargetState(nullptr);
        m_dismissTransition->setParent(m_root);
    }
}

void PopupState::updateEventData(QEvent *e)
{
    if (!e) {
        return;
    }
    m_instanceData.insert(QStringLiteral("eventData"), entryData(e));
    if (ViewStateTarget *target = viewLayer()) {
        target->updatePopupData(m_popupViewId, QVariant(m_instanceData));
    }
}

void PopupState::setPopupStatusConnectionActive(bool on)
{
    ViewStateTarget *target = viewLayer();
    if (on == m_popupStatusConnectionActive || !target) {
        return;
    }
    if (on) {
        connect(target, &ViewStateTarget::popupAnimationStarted, this,
                &PopupState::onPopupAnimationStarted);
        connect(target, &ViewStateTarget::popupStatusChanged, this,
                &PopupState::onViewStateTargetPopupStateChanged);
    } else {
        disconnect(target, &ViewStateTarget::popupAnimationStarted, this,
                   &PopupState::onPopupAnimationStarted);
        disconnect(target, &ViewStateTarget::popupStatusChanged, this,
                   &PopupState::onViewStateTargetPopupStateChanged);
    }
    m_popupStatusConnectionActive = on;
}

void PopupState::deactivateSource(PopupState *target)
{
    if (target && target->m_root == m_root) {
        deactivate();
    } else if (m_dismissTransition) {
        m_dismissTransition->trigger();
    }
}

void PopupState::deactivate()
{
    if (m_root) {
        m_root->deactivatePopupState(this);
    }
    PopupRecords &r = records();
    if (r.storeBlockedPopups) {
        r.blockedPopupStack.remove(this);
    }
    m_stackedBySibling = false;
    hidePopup(true);
    onDeactivated();
}

void PopupState::activeDomainChanged(int newDomain, int oldDomain)
{
    const auto *store = PopupInterruptionStore::instance();
    const bool blocked = store->isBlockedByDomain(this, newDomain);
    if (blocked == store->isBlockedByDomain(this, oldDomain)) {
        return;
    }
    if (blocked) {
        hidePopup(false);
    } else {
        showPopup(false);
    }
}

void PopupState::activeViewChanged(Identifier newView, Identifier oldView)
{
    const auto *store = PopupInterruptionStore::instance();
    const bool blocked = store->isBlockedByView(this, newView);
    if (blocked == store->isBlockedByView(this, oldView)) {
        return;
    }
    if (blocked) {
        hidePopup(false);
    } else {
        showPopup(false);
    }
}

void PopupState::stateEntry()
{
}

void PopupState::stateExit()
{
    // A popup that is to come back keeps its time running.
    if (m_autoDismissTimer && m_root && m_root->wasDeactivated(this)) {
        m_autoDismissTimer->stop();
    }
}

void PopupState::onViewStateTargetPopupStateChanged(Identifier popupId, bool shown)
{
    if (popupId != m_popupViewId) {
        return;
    }
    if (shown) {
        if (m_autoDismissTimer && m_autoDismissActive && !m_autoDismissTimer->isActive()) {
            m_autoDismissTimer->start();
        }
        Q_EMIT popupShown();
        return;
    }
    Q_EMIT popupHidden();
    if (!isActive()) {
        setPopupStatusConnectionActive(false);
    }
}

void PopupState::onPopupAnimationStarted(Identifier popupId, int type)
{
    if (popupId == m_popupViewId) {
        Q_EMIT popupAnimationStarted(type);
    }
}

void PopupState::onEntry(QEvent *e)
{
    NamedState::onEntry(e);
    if (!isNoPopupState()) {
        records().activePopupStack.append(this);
    }
    if (m_root) {
        m_root->setActivePopupState(this);
    }
    const bool dismissable = m_dismissTransition && m_dismissTransition->isDismissable();
    if (m_nonDismissibleWarning && !dismissable) {
        warnOfMissingDismissal();
    } else {
        activateDismissTransition();
    }
    storeEntryData(e);
    showUnlessBlocked();
    if (ViewStateTarget *target = viewLayer()) {
        domainConnection().connect(target, this);
        viewConnection().connect(target, this);
    }
    unstackTransitions();
}

void PopupState::onExit(QEvent *e)
{
    NamedState::onExit(e);
    if (!isNoPopupState()) {
        records().activePopupStack.removeAll(this);
    }
    hidePopup(true);
    activateDismissTransition();
    if (ViewStateTarget *target = viewLayer()) {
        domainConnection().disconnect(target, this);
        viewConnection().disconnect(target, this);
    }
}

PopupState::InterruptionBehavior PopupState::interruption(PopupState *requested) const
{
    Q_UNUSED(requested)
    return Allow;
}

void PopupState::prepareForActivation(bool reactivation)
{
    if (ViewStateTarget *target = viewLayer()) {
        target->preparePopup(m_popupViewId, reactivation);
    }
    Q_EMIT aboutToBeActivated();
}

void PopupState::showPopup(bool activated)
{
    Q_UNUSED(activated)
    m_stackedBySibling = false;
    setPopupStatusConnectionActive(m_reportsQmlPopupStatus || m_autoDismissTimer);
    if (isNoPopupState()) {
        return;
    }
    if (ViewStateTarget *target = viewLayer()) {
        target->requestPopupShow(m_popupViewId, m_popupKind, QVariant(m_instanceData));
        target->unstackPopup(m_popupViewId);
    }
    unstackTransitions();
    // A warning on purpose: every popup that comes up is to be found in the log of a head unit.
    HMI_WARNING(hmistatemachine()) << "virtual void HmiStateMachine::PopupState::showPopup(bool)"
                                   << " target name " << m_popupViewId;
}

void PopupState::hidePopup(bool deactivated)
{
    Q_UNUSED(deactivated)
    if (isNoPopupState()) {
        return;
    }
    if (ViewStateTarget *target = viewLayer()) {
        if (m_stackedBySibling) {
            target->stackPopup(m_popupViewId, m_stackingPopupId);
            stackTransitions();
        } else {
            target->requestPopupHide(m_popupViewId, !m_root || m_root->wasDeactivated(this));
            target->unstackPopup(m_popupViewId);
            unstackTransitions();
        }
    }
    m_stackedBySibling = false;
}

bool PopupState::handleDomainBlocked()
{
    return false;
}

bool PopupState::handleInterruptionBlocked()
{
    return false;
}

void PopupState::onDeactivated()
{
}

bool PopupState::isNoPopupState() const
{
    return name().endsWith(noneStatePostfix());
}

void PopupState::storeEntryData(QEvent *e)
{
    const QVariant data = entryData(e);
    if (data.isValid()) {
        m_instanceData.insert(QStringLiteral("eventData"), data);
    }
}

void PopupState::showUnlessBlocked()
{
    if (!PopupInterruptionStore::instance()->isBlockedByDomain(this)) {
        showPopup(true);
        return;
    }
    const ViewStateTarget *target = viewLayer();
    HMI_DEBUG_FROM(hmistatemachine(), "onEntry")
        << "Popup:" << m_popupViewId
        << "blocked by domain:" << (target ? target->activeDomain() : noDomain);
}

void PopupState::warnOfMissingDismissal() const
{
    HMI_WARNING_FROM(hmistatemachine(), "onEntry")
        << "You are entering a non dismissible popup state!! \n"
        << "State name: " << name() << "\n"
        << "Dismiss event identifier; " << dismissEventIdentifier() << "\n"
        << "Dismiss wildcard: " << PopupDismissTransition::dismissEventWildCard;
}

} // namespace HmiStateMachine
