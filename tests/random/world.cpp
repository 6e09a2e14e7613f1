#include "world.h"

#include "driving.h"
#include "eventwatch.h"
#include "popups.h"
#include "rules.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmistate.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/domainblockedpopupstate.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <QTimer>

using namespace HmiStateMachine;

World::World(quint32 seed, MessageRecorder &messages)
    : m_messages(messages), m_prefix(uniquePrefix())
{
    QMap<QString, int> domains;
    for (int domain = 0; domain < domainCount; ++domain) {
        domains.insert(domainName(domain), domain);
    }
    screen.setDomains(domains);
    PopupState::setDriverRestrictionProperty(&m_driver, "value", 1);
    buildLayers();
    buildPopups();
    storeRandomRules(seed, m_popups);
    machine.start();
    settle();
    journal.clear();
}

World::~World()
{
    machine.stop();
    settle();
    PopupState::setStoreBlockedPopups(false);
    PopupState::setDriverRestrictionProperty(nullptr, QByteArray(), QVariant());
    qDeleteAll(machine.findChildren<QAbstractState *>(QString(), Qt::FindDirectChildrenOnly));
    m_messages.take();
}

// The first region comes first when the machine looks for reactions to an event, so the watch sees
// each event before the layers do.
void World::buildLayers()
{
    auto *away = new HmiState(m_prefix + "Away", &machine);
    auto *both = new HmiState(m_prefix + "Both", &machine);
    both->setChildMode(QState::ParallelStates);
    machine.setInitialState(both);
    m_watch = new EventWatch(*this, new HmiState(m_prefix + "Watch", both));
    for (const char *name : {"Left", "Right"}) {
        auto *layer = new HmiLayeredState(m_prefix + name, both);
        layer->setInitialHmiState(new HmiState(m_prefix + name + "Home", layer));
        m_layers.append(layer);
        m_roots.append(layer->popupState());
    }
    (new HmiTransition("leave", both))->setTargetState(away);
    (new HmiTransition("return", away))->setTargetState(both);
}

void World::buildPopups()
{
    for (int i = 0; i < popupCount; ++i) {
        PopupState *popup = makePopup(i, m_prefix, m_layers.at(i % layerCount), m_awaitingDomain);
        m_popups.append(popup);
        m_byName.insert(popup->name(), popup);
        if (hasReaction(i)) {
            m_reactions.insert(popup, new HmiTransition("react", popup));
        }
        follow(popup);
    }
}

void World::follow(PopupState *popup)
{
    const QString id = popup->popupViewId();
    QObject::connect(popup, &QAbstractState::entered, &screen, [this, popup] {
        m_entered.append(popup);
        m_stalled.remove(popup->rootPopupState());
    });
    QObject::connect(popup, &QAbstractState::exited, &screen,
                     [this, popup] { m_entered.removeAll(popup); });
    QObject::connect(popup, &PopupState::aboutToBeActivated, &screen,
                     [this, popup] { m_awaitingDomain.remove(popup); });
    QObject::connect(popup, &PopupState::alreadyActivated, &screen, [this, popup, id] {
        journal.add("alreadyActivated " + id);
        m_awaitingDomain.remove(popup);
    });
    QObject::connect(popup, &PopupState::blocked, &screen, [this, popup, id] {
        journal.add("blocked " + id);
        if (qobject_cast<DomainBlockedPopupState *>(popup)
            && PopupInterruptionStore::instance()->isBlockedByDomain(popup)) {
            m_awaitingDomain.insert(popup);
        }
        if (m_storing) {
            m_refused.insert(popup);
        }
    });
}

void World::apply(const Step &step)
{
    m_complaints.clear();
    journal.clear();
    const QStringList names = targets(step);
    if (names.isEmpty()) {
        change(step);
    }
    for (const QString &name : names) {
        machine.postEvent(new PopupEvent(name, QStringLiteral("data")));
    }
    settle();
    m_watch->settled();
    rememberForgotten();
    checkHandedOver();
    checkMessages();
}

// The targets of the popup events that the step posts.
QStringList World::targets(const Step &step) const
{
    const PopupState *first = m_popups.value(step.first);
    const PopupState *second = m_popups.value(step.second);
    const QString suffix = PopupDismissTransition::dismissEventSigniture;
    switch (step.action) {
    case Action::Request:
        return {first->name()};
    case Action::RequestTwo:
        return {first->name(), second->name()};
    case Action::DismissAndRequest:
        return {first->name() + suffix, second->name()};
    case Action::Dismiss:
        return {first->name() + suffix};
    case Action::DismissView:
        return {first->popupViewId() + suffix};
    case Action::DismissCurrent:
        return {m_roots.at(step.first)->activePopupState()->name() + suffix};
    case Action::DismissAny:
        return {PopupDismissTransition::dismissEventWildCard};
    case Action::RequestUnknown:
        return {"nobody"};
    default:
        return {};
    }
}

// What a step does that posts no popup events itself.
void World::change(const Step &step)
{
    switch (step.action) {
    case Action::Domain:
        return changeDomain(step.first);
    case Action::View:
        return changeView(viewName(step.first));
    case Action::Report:
        return screen.report();
    case Action::Timeout:
        return timeOutFrom(step.first);
    case Action::DriverRestriction:
        return restrictDriver(step.first);
    case Action::React:
        return machine.postEvent(new HmiEvent("react", QVariant()));
    case Action::Reset:
        return reset(m_roots.at(step.first));
    case Action::Clear:
        return clear(m_roots.at(step.first));
    case Action::StoreBlocked:
        return storeBlocked(step.first == 1);
    case Action::LeaveAndReturn:
        return leaveAndReturn();
    default:
        return;
    }
}

Snapshot World::snapshot() const
{
    Snapshot result;
    result.waiting.reserve(popupCount);
    for (const PopupRootState *root : m_roots) {
        result.current.append(root->activePopupState());
    }
    for (PopupState *popup : m_popups) {
        if (!popup->rootPopupState()->wasDeactivated(popup)) {
            result.waiting.append(popup);
        }
    }
    result.front = PopupState::getActivePopupState();
    result.stacked = screen.stackedPopups();
    result.shown = screen.shown();
    return result;
}

int World::indexOf(const PopupState *popup) const
{
    return popup->property("index").toInt();
}

void World::returnPrevented(PopupState *popup)
{
    m_forgotten.insert(popup);
    m_stalled.insert(popup->rootPopupState());
}

void World::changeDomain(int domain)
{
    const auto *store = PopupInterruptionStore::instance();
    const int old = screen.activeDomain();
    screen.setActiveDomain(domain);
    for (PopupState *popup : qAsConst(m_entered)) {
        const QString id = popup->popupViewId();
        checkSuppression(id, store->isBlockedByDomain(id, old),
                         store->isBlockedByDomain(id, domain));
    }
    checkRetried();
}

void World::changeView(const QString &view)
{
    const auto *store = PopupInterruptionStore::instance();
    const QString old = screen.activeView();
    screen.setActiveView(view);
    for (PopupState *popup : qAsConst(m_entered)) {
        const QString id = popup->popupViewId();
        checkSuppression(id, store->isBlockedByView(id, old), store->isBlockedByView(id, view));
    }
}

void World::checkSuppression(const QString &viewId, bool before, bool now)
{
    if (before != now && screen.shown().contains(viewId) == now) {
        complain("a popup is hidden where it becomes blocked, and shown where it no longer is");
    }
}

void World::timeOutFrom(int index)
{
    for (int i = 0; i < popupCount; ++i) {
        PopupState *popup = m_popups.at((index + i) % popupCount);
        if (fire(popup->findChild<QTimer *>(QString(), Qt::FindDirectChildrenOnly))) {
            settle();
            expectGone(popup);
            return;
        }
    }
}

void World::restrictDriver(int value)
{
    const bool restricts = value == 1 && m_driver.value() != 1;
    const auto before = m_entered;
    m_driver.setValue(value);
    settle();
    for (PopupState *popup : before) {
        if (restricts && popup->driverRestricted() && popup->dismissTransition()->isDismissable()) {
            expectGone(popup);
        }
    }
}

void World::expectGone(PopupState *popup)
{
    if (m_entered.contains(popup) || !popup->rootPopupState()->wasDeactivated(popup)) {
        complain("a popup that times out or distracts the driver is left, and does not return");
    }
}

void World::leaveAndReturn()
{
    for (PopupRootState *root : qAsConst(m_roots)) {
        forgetStacked(root, true);
    }
    machine.postEvent(new HmiEvent("leave", QVariant()));
    machine.postEvent(new HmiEvent("return", QVariant()));
    settle();
    for (PopupRootState *root : qAsConst(m_roots)) {
        expectEmpty(root);
    }
}

// A reset takes names back, which for some popups are not what the view layer knows them by.
void World::reset(PopupRootState *root)
{
    const bool shows = root->activePopupState() != root->noPopupState();
    if (shows) {
        forgetStacked(root, true);
    }
    Q_EMIT root->reset();
    settle();
    if (shows) {
        expectEmpty(root);
    }
}

void World::clear(PopupRootState *root)
{
    PopupState *current = root->activePopupState();
    forgetStacked(root, false);
    root->clearPopups();
    settle();
    if (current->dismissTransition()->isDismissable()) {
        expectEmpty(root);
    }
}

void World::forgetStacked(PopupRootState *root, bool ownViewIdsOnly)
{
    const auto stacked = screen.stackedPopups();
    for (PopupState *popup : qAsConst(m_popups)) {
        if (popup->rootPopupState() == root && stacked.contains(popup->popupViewId())
            && (!ownViewIdsOnly || popup->popupViewId() != popup->name())) {
            m_forgotten.insert(popup);
        }
    }
}

// A popup that was shown again since, or waits again, is like any other.
void World::rememberForgotten()
{
    const auto stacked = screen.stackedPopups();
    const auto forgotten = m_forgotten;
    for (PopupState *popup : forgotten) {
        if (!stacked.contains(popup->popupViewId())
            || !popup->rootPopupState()->wasDeactivated(popup)) {
            m_forgotten.remove(popup);
        }
    }
}

void World::expectEmpty(PopupRootState *root)
{
    if (root->activePopupState() != root->noPopupState()) {
        complain("a layer that was reset or cleared shows no popup");
    }
    for (PopupState *popup : qAsConst(m_popups)) {
        if (popup->rootPopupState() == root && !root->wasDeactivated(popup)) {
            complain("no popup of a layer that was reset or cleared returns");
        }
    }
}

void World::storeBlocked(bool store)
{
    m_storing = store;
    PopupState::setStoreBlockedPopups(store);
}

void World::checkHandedOver()
{
    const auto released = screen.takeReleased();
    for (PopupState *popup : released) {
        if (!m_refused.contains(popup)) {
            complain("a popup that is released as refused was refused while that was stored");
        }
    }
    if (!m_storing) {
        m_refused.clear();
    }
}

// Those that wait for their domain, and only they, are requested again, each once.
void World::checkRetried()
{
    QSet<PopupState *> expected;
    for (PopupState *popup : qAsConst(m_awaitingDomain)) {
        if (!PopupInterruptionStore::instance()->isBlockedByDomain(popup)) {
            expected.insert(popup);
        }
    }
    const auto retried = screen.takeRetried();
    if (retried.size() != expected.size()
        || QSet<PopupState *>(retried.begin(), retried.end()) != expected) {
        complain("a popup that its domain blocked is retried once, when it no longer does");
    }
    m_awaitingDomain -= expected;
}

void World::checkMessages()
{
    const auto written = m_messages.takeMessages();
    for (const Message &message : written) {
        if (message.function != "showPopup"
            && !message.text.startsWith("You are entering a non dismissible popup state!!")) {
            complain("nothing is written but what is shown and cannot be dismissed: "
                     + message.text);
        }
    }
}
