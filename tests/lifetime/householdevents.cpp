#include "household.h"

#include "driving.h"

#include <HmiStateMachine/hmi/hmilayeredstate.h>
#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/hmievent.h>
#include <HmiStateMachine/named/hmifallbackevent.h>
#include <HmiStateMachine/named/hmiviewevent.h>
#include <HmiStateMachine/named/parallelsiblingtransitiongroup.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QAbstractTransition>
#include <QTimer>

using namespace HmiStateMachine;

void Household::requestView()
{
    m_machine->postEvent(new HmiViewEvent(anyName(), QVariant(m_count)));
}

void Household::pressBack()
{
    const QString target = m_random.oneIn(3) ? anyName() : QString();
    m_machine->postEvent(new HmiBackEvent(static_cast<unsigned char>(m_random.below(4)), target));
}

void Household::requestPopup()
{
    if (const PopupState *popup = any(m_popups)) {
        m_machine->postEvent(new PopupEvent(popup->name(), QVariant(m_count)));
    }
}

void Household::dismissPopup()
{
    const PopupState *popup = any(m_popups);
    const QString target = popup && !m_random.oneIn(4)
        ? popup->dismissEventIdentifier()
        : PopupDismissTransition::dismissEventWildCard;
    m_machine->postEvent(new PopupEvent(target, QVariant()));
}

void Household::raiseEvent()
{
    if (m_random.oneIn(4)) {
        m_machine->postEvent(new HmiFallbackEvent(anyName()));
    } else {
        m_machine->postEvent(new HmiEvent(QStringLiteral("go"), QVariant(m_count)));
    }
}

void Household::emitSignal()
{
    Emitter *sender = anySender();
    if (!sender) {
        return;
    }
    switch (m_random.below(4)) {
    case 0:
        return Q_EMIT sender->plain();
    case 1:
        return Q_EMIT sender->withInt(m_random.below(2));
    case 2:
        return Q_EMIT sender->key(1, m_random.below(3));
    default:
        return sender->setValue(m_random.below(3));
    }
}

void Household::runTimerOut()
{
    const auto timers = m_machine->findChildren<QTimer *>();
    if (!timers.isEmpty()) {
        fire(timers.at(m_random.below(timers.size())));
    }
}

void Household::changeSettings()
{
    switch (m_random.below(4)) {
    case 0:
        return PopupInterruptionStore::instance()->insertInterruptionBehavior(
            static_cast<PopupState::InterruptionBehavior>(m_random.below(4)),
            QStringLiteral("popup/*"), QStringLiteral("popup/*"));
    case 1:
        return PopupState::setStoreBlockedPopups(m_random.oneIn(2));
    case 2:
        return PopupState::setDriverRestrictionProperty(anySender(), "value", 1);
    default:
        if (m_target) {
            m_target->setActiveDomain(m_random.below(3));
        }
    }
}

// An active state must not go: the machine points at it.
void Household::endView()
{
    HmiViewState *view = any(m_views);
    settleAll();
    if (view && !view->isActive()) {
        delete view;
    }
}

void Household::endPopup()
{
    const QPointer<PopupState> popup = any(m_popups);
    settleAll();
    if (popup && popup->isActive() && popup->rootPopupState()) {
        popup->rootPopupState()->removePopupState(popup);
        settleAll();
    }
    if (popup && !popup->isActive()) {
        delete popup;
    }
}

void Household::endTransition()
{
    delete any(m_transitions);
}

void Household::endSender()
{
    delete any(m_senders);
}

void Household::endGroup()
{
    delete any(m_groups);
}

void Household::endFilters()
{
    m_filters.clear();
}

void Household::endMonitor()
{
    delete any(m_monitors);
}

void Household::replaceViewLayer()
{
    m_target.reset();
    if (m_random.oneIn(2)) {
        settleAll();
    }
    m_target = std::make_unique<RecordingViewStateTarget>(m_journal);
}

void Household::renameSomething()
{
    NamedState *named = m_random.oneIn(2) ? static_cast<NamedState *>(any(m_views)) : any(m_popups);
    if (named) {
        named->setName(newName(QStringLiteral("renamed")));
    }
}

void Household::startAnew()
{
    m_machine->stop();
    settleAll();
    m_machine->start();
}
