#include "viewlayer.h"

#include "jsontext.h"
#include "transcript.h"

#include <HmiStateMachine/popup/popupstate.h>
#include <HmiStateMachine/popup/popuptimeoutmonitor.h>

#include <QMap>
#include <QTime>

using namespace HmiStateMachine;

namespace headunit {

namespace {

constexpr int timeStepMs = 200;

const QString monitorKey = QStringLiteral("timeoutMonitor");

// An object is nothing to be printed.
QVariant printable(const QVariant &popupData)
{
    QVariantMap map = popupData.toMap();
    map.remove(monitorKey);
    return map;
}

} // namespace

ViewLayer::ViewLayer(Transcript &transcript) : m_transcript(transcript)
{
    setDomains(domainNames());
    connect(this, &ViewStateTarget::activeViewDataChanged, this, [this](const QVariant &data) {
        if (data.isValid()) {
            m_transcript.note("data of the active view: " + toJsonText(data));
        }
    });
}

ViewLayer::~ViewLayer() = default;

void ViewLayer::activateView(const QString &viewId, const QVariant &instanceData)
{
    m_transcript.call("activate", viewId, instanceData);
    takeVoiceRequest();
    QuickViewStateTarget::activateView(viewId, instanceData);
}

void ViewLayer::deactivateView(const QString &viewId, const QVariant &instanceData)
{
    m_transcript.call("deactivate", viewId, instanceData);
    QuickViewStateTarget::deactivateView(viewId, instanceData);
}

void ViewLayer::preparePopup(const QString &popupId, bool reactivation)
{
    m_transcript.call("prepare", popupId, reactivation);
    QuickViewStateTarget::preparePopup(popupId, reactivation);
}

void ViewLayer::requestPopupShow(const QString &popupId, int popupKind, const QVariant &data)
{
    m_transcript.call("show", popupId + ' ' + QString::number(popupKind), printable(data));
    m_refused.removeAll(popupId);
    QuickViewStateTarget::requestPopupShow(popupId, popupKind, data);
    showTimeLeft(data);
}

void ViewLayer::requestPopupHide(const QString &popupId, bool deactivated)
{
    m_transcript.call("hide", popupId, deactivated);
    QuickViewStateTarget::requestPopupHide(popupId, deactivated);
}

void ViewLayer::stackPopup(const QString &popupId, const QString &stackingPopupId)
{
    m_transcript.call("stack", popupId + " behind " + stackingPopupId);
    QuickViewStateTarget::stackPopup(popupId, stackingPopupId);
}

// The library takes popups off the stack that are not on it, too, whenever it shows or hides one.
void ViewLayer::unstackPopup(const QString &popupId)
{
    if (stackedPopups().contains(popupId)) {
        m_transcript.call("unstack", popupId);
    }
    QuickViewStateTarget::unstackPopup(popupId);
}

void ViewLayer::retryBlockedPopup(PopupState *popup)
{
    m_transcript.call("retry", popup->popupViewId());
    QuickViewStateTarget::retryBlockedPopup(popup);
}

// Several may have been refused within a millisecond; here it is known which was first.
void ViewLayer::releaseBlockedPopups(const QMap<PopupState *, QTime> &blockedPopups)
{
    if (blockedPopups.isEmpty()) {
        return;
    }
    QStringList released;
    for (const QString &id : qAsConst(m_refused)) {
        PopupState *popup = PopupState::stateForTarget(id);
        if (blockedPopups.contains(popup)) {
            released.append(id);
            QuickViewStateTarget::retryBlockedPopup(popup);
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
    QuickViewStateTarget::postFollowOnBackEvent(backDepth, backTargetId, viewId);
}

void ViewLayer::setScreenPopupBehavior(bool enabled)
{
    m_transcript.call("popups", enabled ? "on" : "off");
    QuickViewStateTarget::setScreenPopupBehavior(enabled);
}

void ViewLayer::resetScreenPopupBehavior()
{
    m_transcript.call("popups", "as usual");
    QuickViewStateTarget::resetScreenPopupBehavior();
}

void ViewLayer::updatePopupData(const QString &popupId, const QVariant &data)
{
    m_transcript.call("update", popupId, printable(data));
    QuickViewStateTarget::updatePopupData(popupId, data);
    showTimeLeft(data);
}

QStringList ViewLayer::domainNames()
{
    return {"Home", "Media", "Phone", "Navigation", "Settings"};
}

QString ViewLayer::popupInFront() const
{
    for (int row = shownPopups()->count() - 1; row >= 0; --row) {
        const auto popup = shownPopups()->entry(row);
        if (!popup.covered) {
            return popup.popupId;
        }
    }
    return QString();
}

void ViewLayer::noteRefusal(const QString &popupId)
{
    m_transcript.note("refused " + popupId);
    if (!m_refused.contains(popupId)) {
        m_refused.append(popupId);
    }
}

bool ViewLayer::wasRefused(const QString &popupId) const
{
    return m_refused.contains(popupId);
}

void ViewLayer::showStatus(const QString &text)
{
    m_transcript.note(text);
}

void ViewLayer::showHint(const QString &text)
{
    showStatus(text);
    Q_EMIT hintShown(text);
}

void ViewLayer::takeVoiceRequest()
{
    if (!vrViewRequest()) {
        return;
    }
    m_transcript.note("voice request passed on: " + toJsonText(vrViewRequestData()));
    setVRViewRequest(false, QVariant());
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
