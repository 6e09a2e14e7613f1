#include "household.h"

#include <HmiStateMachine/hmi/hmidelayedsignaltransition.h>
#include <HmiStateMachine/hmi/hmifallbackviewstate.h>
#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmitargetfilter.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/guardedpropertychangetransition.h>
#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/intsignaltransition.h>
#include <HmiStateMachine/named/keysignaltransition.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>
#include <HmiStateMachine/named/simpleeventtransition.h>
#include <HmiStateMachine/popup/domainblockedpopupstate.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popuptimeoutmonitor.h>

using namespace HmiStateMachine;

namespace {

/** Leaves a way out of every circle of back targets, which a blacklist would not. */
class RefusesNowAndThen : public HmiTargetFilter
{
public:
    bool isValid(const QString &) const override { return ++m_asked % 3 == 0; }

private:
    mutable int m_asked = 0;
};

} // namespace

void Household::addView()
{
    HmiLayeredState *layer = any(m_layers);
    if (!layer) {
        return;
    }
    HmiViewState *view = makeView(newName(QStringLiteral("view")), layer);
    if (m_random.oneIn(4)) {
        view->createDirectBackTransition(any(m_views));
    }
    if (m_random.oneIn(4)) {
        view->setBackTargetProviderState(any(m_views));
    }
    if (m_random.oneIn(4)) {
        view->setBackStackStateId(anyName(), m_random.oneIn(2));
    }
    view->setReportsQmlViewStatus(m_random.oneIn(2));
    m_views.append(view);
}

HmiViewState *Household::makeView(const QString &name, HmiLayeredState *layer)
{
    switch (m_random.below(5)) {
    case 0:
        return HmiViewState::createDummyViewState(name, layer, 50, true);
    case 1:
        return new HmiFallbackViewState(name, anyName(), layer);
    default:
        auto *view = new HmiViewState(name, layer);
        view->setHandlesBackEvent(!m_random.oneIn(4));
        return view;
    }
}

void Household::addPopup()
{
    HmiLayeredState *layer = any(m_layers);
    if (!layer) {
        return;
    }
    const QString name = newName(QStringLiteral("popup"));
    PopupState *popup = m_random.oneIn(4) ? new DomainBlockedPopupState(name, layer, 1)
                                          : new PopupState(name, layer, 1);
    popup->setPopupViewId(m_random.oneIn(2) ? name : name + QStringLiteral("View"));
    popup->setAutoDismissTimeoutActive(m_random.oneIn(2));
    popup->setReportsQmlPopupStatus(m_random.oneIn(2));
    popup->setDriverRestricted(m_random.oneIn(3));
    if (m_random.oneIn(3)) {
        m_monitors.append(new PopupTimeoutMonitor(20, popup));
    }
    letOthersDismiss(popup);
    m_popups.append(popup);
}

void Household::letOthersDismiss(PopupState *popup)
{
    PopupState *other = any(m_popups);
    if (other && m_random.oneIn(4)) {
        popup->registerDismissingPopup(other);
    }
    if (m_random.oneIn(4)) {
        m_transitions.append(new HmiTransition(QStringLiteral("go"), popup));
        popup->registerDismissingTransition(m_transitions.last());
    }
}

void Household::addTransition()
{
    QState *source = anySource();
    if (!source) {
        return;
    }
    QAbstractTransition *transition = makeTransition(source);
    if (!m_random.oneIn(4)) {
        transition->setTargetState(any(m_views));
    }
    if (auto *guarded = dynamic_cast<NamedTargetTransitionBase *>(transition)) {
        guarded->setIsVREventTransition(m_random.oneIn(5), QVariant(m_count));
    }
    m_transitions.append(transition);
}

QAbstractTransition *Household::makeTransition(QState *source)
{
    Emitter *sender = anySender();
    switch (m_random.below(8)) {
    case 0:
        return new HmiTransition(QStringLiteral("go"), source);
    case 1:
        return new SimpleEventTransition(HmiEvent::eventType(), source);
    case 2:
        return new HmiSignalTransition(sender, SIGNAL(plain()), source);
    case 3:
        return new IntSignalTransition(sender, SIGNAL(withInt(int)), 1, source);
    case 4: {
        auto *key = new KeySignalTransition(sender, SIGNAL(key(int, int)), 1, -1, source);
        key->makeGloballyAvailable();
        return key;
    }
    case 5:
        return new GuardedPropertyChangeTransition(sender, "value", {}, QVariant(), source);
    case 6:
        return new HmiDelayedSignalTransition(sender, SIGNAL(plain()), 30, source);
    default:
        return new GuardedTransition(source);
    }
}

void Household::addFilter()
{
    if (HmiViewState *view = any(m_views)) {
        m_filters.append(QSharedPointer<RefusesNowAndThen>::create());
        view->addBackTargetFilter(m_filters.last());
    }
}

void Household::addMonitor()
{
    HmiViewState *watched = any(m_views);
    HmiViewState *watching = any(m_views);
    if (watched) {
        watched->registerMonitoringState(watching);
    }
    if (PopupState *popup = any(m_popups)) {
        m_monitors.append(new PopupTimeoutMonitor(20, popup));
    }
}

void Household::addToGroup()
{
    auto *base = dynamic_cast<NamedTargetTransitionBase *>(any(m_transitions));
    if (m_groups.size() < 3) {
        m_groups.append(new ParallelSiblingTransitionGroup(nullptr));
    }
    if (auto *group = any(m_groups)) {
        group->addTransition(base, m_random.below(10));
    }
}

QString Household::anyName()
{
    const auto *view = any(m_views);
    return view && !m_random.oneIn(10) ? QString(view->name()) : QStringLiteral("nowhere");
}

Emitter *Household::anySender()
{
    if (m_random.oneIn(10)) {
        m_senders.append(new Emitter);
    }
    return any(m_senders);
}

QState *Household::anySource()
{
    if (m_random.oneIn(6)) {
        return any(m_layers);
    }
    return m_random.oneIn(3) ? static_cast<QState *>(any(m_popups)) : any(m_views);
}
