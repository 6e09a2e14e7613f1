#include "viewlayer.h"

#include "jsontext.h"
#include "transcript.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/statemachine.h>
#include <HmiStateMachine/popup/popupstate.h>
#include <HmiStateMachine/popup/popuptimeoutmonitor.h>

#include <QMap>
#include <QStringList>
#include <QTime>

using namespace HmiStateMachine;

namespace headunit {

namespace {

constexpr int timeStepMs = 200;

const QStringList &domains()
{
    static const QStringList list{"Home", "Media", "Phone", "Navigation", "Settings"};
    return list;
}

const QString monitorKey = QStringLiteral("timeoutMonitor");

// An object is nothing to be printed.
QVariant printable(const QVariant &popupData)
{
    QVariantMap map = popupData.toMap();
    map.remove(monitorKey);
    return map;
}

void request(const PopupState *popup)
{
    StateMachine::instance()->postEvent(new PopupEvent(popup->name(), QVariant()));
}

} // namespace

ViewLayer::ViewLayer(Transcript &transcript) : ViewStateTarget(nullptr), m_transcript(transcript)
{
    VIEW_STATE_TARGET_INSTANCE = this;
    connect(this, &ViewStateTarget::activeViewDataChanged, this, [this](const QVariant &data) {
        if (data.isValid()) {
            m_transcript.note("data of the active view: " + toJsonText(data));
        }
    });
}

ViewLayer::~ViewLayer()
{
    VIEW_STATE_TARGET_INSTANCE = nullptr;
}

void ViewLayer::activateView(const QString &viewId, const QVariant &instanceData)
{
    m_transcript.call("activate", viewId, instanceData);
    takeVoiceRequest();
    setActiveView(viewId);
}

void ViewLayer::deactivateView(const QString &viewId, const QVariant &instanceData)
{
    m_transcript.call("deactivate", viewId, instanceData);
}

void ViewLayer::preparePopup(const QString &popupId, bool reactivation)
{
    m_transcript.call("prepare", popupId, reactivation);
}

void ViewLayer::requestPopupShow(const QString &popupId, int popupKind, const QVariant &data)
{
    m_transcript.call("show", popupId + ' ' + QString::number(popupKind), printable(data));
    m_popups.show(popupId);
    Q_EMIT popupStatusChanged(popupId, true);
    showTimeLeft(data);
}

void ViewLayer::requestPopupHide(const QString &popupId, bool deactivated)
{
    m_transcript.call("hide", popupId, deactivated);
    if (m_popups.hide(popupId)) {
        Q_EMIT popupStatusChanged(popupId, false);
    }
    if (!deactivated) {
        return;
    }
    // A popup of the same layer was left when it was covered, and the flow shows it again itself.
    const QStringList covered = m_popups.takeCoveredBy(popupId);
    for (const QString &id : covered) {
        if (isPopupStateActive(id)) {
            unstackPopup(id);
        }
    }
}

void ViewLayer::stackPopup(const QString &popupId, const QString &stackingPopupId)
{
    m_transcript.call("stack", popupId + " behind " + stackingPopupId);
    m_popups.cover(popupId, stackingPopupId);
    ViewStateTarget::stackPopup(popupId, stackingPopupId);
}

// The library takes popups off the stack that are not on it, too, whenever it shows or hides one.
void ViewLayer::unstackPopup(const QString &popupId)
{
    if (stackedPopups().contains(popupId)) {
        m_transcript.call("unstack", popupId);
    }
    ViewStateTarget::unstackPopup(popupId);
}

int ViewLayer::domainFromName(const QString &domainName)
{
    return domains().indexOf(domainName);
}

int ViewLayer::activeDomain() const
{
    return m_activeDomain;
}

Identifier ViewLayer::activeView() const
{
    return m_activeView;
}

void ViewLayer::retryBlockedPopup(PopupState *popup)
{
    m_transcript.call("retry", popup->popupViewId());
    request(popup);
}

void ViewLayer::releaseBlockedPopups(const QMap<PopupState *, QTime> &blockedPopups)
{
    if (blockedPopups.isEmpty()) {
        return;
    }
    // Several may have been refused within a millisecond; the board knows which was first.
    QStringList released;
    const QStringList refused = m_popups.refused();
    for (const QString &id : refused) {
        PopupState *popup = PopupState::stateForTarget(id);
        if (blockedPopups.contains(popup)) {
            released.append(id);
            request(popup);
        }
    }
    m_transcript.call("release", released.join(", "));
}

void ViewLayer::postFollowOnBackEvent(quint8 backDepth, const QString &backTargetId,
                                      const QString &viewId)
{
    QVariantMap request{{"depth", backDepth}};
    if (!backTargetId.isEmpty()) {
        request.insert("target", backTargetId);
    }
    m_transcript.call("back step", viewId, request);
    // The request may name the state or the view that it shows: it is fulfilled when either is
    // reached. Towards what is no view at all there is nothing to go on to.
    const auto *wanted = HmiViewState::stateForTarget(backTargetId);
    const QString targetId = wanted ? backTargetId : QString();
    const QString currentId = wanted && wanted->targetView() == viewId ? backTargetId : viewId;
    if (auto *event = HmiBackEvent::followOnEvent(backDepth, targetId, currentId)) {
        StateMachine::instance()->postEvent(event);
    }
}

void ViewLayer::setScreenPopupBehavior(bool enabled)
{
    m_transcript.call("popups", enabled ? "on" : "off");
}

void ViewLayer::resetScreenPopupBehavior()
{
    m_transcript.call("popups", "as usual");
}

void ViewLayer::updatePopupData(const QString &popupId, const QVariant &data)
{
    m_transcript.call("update", popupId, printable(data));
    showTimeLeft(data);
}

QStringList ViewLayer::domainNames()
{
    return domains();
}

void ViewLayer::setActiveDomain(const QString &name)
{
    const int oldDomain = m_activeDomain;
    m_activeDomain = domainFromName(name);
    if (oldDomain != m_activeDomain) {
        Q_EMIT activeDomainChanged(m_activeDomain, oldDomain);
    }
}

QString ViewLayer::popupInFront() const
{
    return m_popups.front(stackedPopups());
}

void ViewLayer::noteRefusal(const QString &popupId)
{
    m_transcript.note("refused " + popupId);
    m_popups.refuse(popupId);
}

bool ViewLayer::wasRefused(const QString &popupId) const
{
    return m_popups.refused().contains(popupId);
}

void ViewLayer::showStatus(const QString &text)
{
    m_transcript.note(text);
}

void ViewLayer::takeVoiceRequest()
{
    if (!vrViewRequest()) {
        return;
    }
    m_transcript.note("voice request passed on: " + toJsonText(vrViewRequestData()));
    setVRViewRequest(false, QVariant());
}

void ViewLayer::setActiveView(const QString &viewId)
{
    const QString oldView = m_activeView;
    m_activeView = viewId;
    Q_EMIT viewAboutToBeActivated(oldView, viewId);
    setActiveDomain(viewId.section('/', 0, 0));
    Q_EMIT activeViewChanged(viewId, oldView);
    Q_EMIT viewActivated(oldView, viewId);
}

// Told in coarse steps: a transcript, which is the same each time, cannot show how a bar shrinks.
void ViewLayer::showTimeLeft(const QVariant &popupData)
{
    const auto *monitor = popupData.toMap().value(monitorKey).value<PopupTimeoutMonitor *>();
    if (monitor) {
        m_transcript.note(
            QString("%1 ms left")
                .arg(qRound(double(monitor->timeRemaining()) / timeStepMs) * timeStepMs));
    }
}

} // namespace headunit
