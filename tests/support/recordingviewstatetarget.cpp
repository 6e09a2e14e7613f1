#include "recordingviewstatetarget.h"

#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupstate.h>

using namespace HmiStateMachine;

namespace {

QString text(bool value)
{
    return value ? QStringLiteral("true") : QStringLiteral("false");
}

} // namespace

RecordingViewStateTarget::RecordingViewStateTarget(Journal &journal)
    : ViewStateTarget(nullptr), m_journal(journal)
{
    VIEW_STATE_TARGET_INSTANCE = this;
}

RecordingViewStateTarget::~RecordingViewStateTarget()
{
    if (VIEW_STATE_TARGET_INSTANCE == this) {
        VIEW_STATE_TARGET_INSTANCE = nullptr;
    }
}

void RecordingViewStateTarget::activateView(const QString &viewId, const QVariant &instanceData)
{
    m_viewData.insert(viewId, instanceData.toMap());
    m_journal.add("activateView " + viewId);
}

void RecordingViewStateTarget::deactivateView(const QString &viewId, const QVariant &instanceData)
{
    m_viewData.insert(viewId, instanceData.toMap());
    m_journal.add("deactivateView " + viewId);
}

void RecordingViewStateTarget::preparePopup(const QString &popupId, bool reactivation)
{
    m_journal.add("preparePopup " + popupId + ' ' + text(reactivation));
}

void RecordingViewStateTarget::requestPopupShow(const QString &popupId, int popupKind,
                                                const QVariant &data)
{
    m_popupData.insert(popupId, data.toMap());
    m_journal.add("requestPopupShow " + popupId + ' ' + QString::number(popupKind));
}

void RecordingViewStateTarget::requestPopupHide(const QString &popupId, bool deactivated)
{
    m_journal.add("requestPopupHide " + popupId + ' ' + text(deactivated));
}

void RecordingViewStateTarget::stackPopup(const QString &popupId, const QString &stackingPopupId)
{
    ViewStateTarget::stackPopup(popupId, stackingPopupId);
    m_journal.add("stackPopup " + popupId + ' ' + stackingPopupId);
}

void RecordingViewStateTarget::unstackPopup(const QString &popupId)
{
    ViewStateTarget::unstackPopup(popupId);
    m_journal.add("unstackPopup " + popupId);
}

int RecordingViewStateTarget::domainFromName(const QString &domainName)
{
    return m_domains.value(domainName, -1);
}

int RecordingViewStateTarget::activeDomain() const
{
    return m_activeDomain;
}

Identifier RecordingViewStateTarget::activeView() const
{
    return m_activeView;
}

void RecordingViewStateTarget::retryBlockedPopup(PopupState *popup)
{
    m_journal.add("retryBlockedPopup " + popup->name());
    if (m_retryMachine) {
        m_retryMachine->postEvent(new PopupEvent(popup->name(), QVariant()));
    }
}

void RecordingViewStateTarget::releaseBlockedPopups(const QMap<PopupState *, QTime> &blockedPopups)
{
    m_journal.add("releaseBlockedPopups " + QString::number(blockedPopups.size()));
}

void RecordingViewStateTarget::postFollowOnBackEvent(quint8 backDepth, const QString &backTargetId,
                                                     const QString &viewId)
{
    m_journal.add("postFollowOnBackEvent " + QString::number(backDepth) + ' ' + backTargetId + ' '
                  + viewId);
    if (!m_machine) {
        return;
    }
    if (auto *event = HmiBackEvent::followOnEvent(backDepth, backTargetId, viewId)) {
        m_machine->postEvent(event);
    }
}

void RecordingViewStateTarget::setScreenPopupBehavior(bool enabled)
{
    if (m_recordPopupBehavior) {
        m_journal.add("setScreenPopupBehavior " + text(enabled));
    }
}

void RecordingViewStateTarget::resetScreenPopupBehavior()
{
    if (m_recordPopupBehavior) {
        m_journal.add("resetScreenPopupBehavior");
    }
}

void RecordingViewStateTarget::updatePopupData(const QString &popupId, const QVariant &data)
{
    m_popupData.insert(popupId, data.toMap());
    m_journal.add("updatePopupData " + popupId);
}

void RecordingViewStateTarget::setActiveDomain(int domain)
{
    const int oldDomain = m_activeDomain;
    m_activeDomain = domain;
    Q_EMIT activeDomainChanged(domain, oldDomain);
}

void RecordingViewStateTarget::setActiveView(const QString &view)
{
    const QString oldView = m_activeView;
    m_activeView = view;
    Q_EMIT activeViewChanged(view, oldView);
}
