#include "viewlayer.h"

#include "jsontext.h"
#include "transcript.h"

#include <HmiStateMachine/hmi/hmiviewstate.h>
#include <HmiStateMachine/named/hmibackevent.h>
#include <HmiStateMachine/named/statemachine.h>

#include <QMap>
#include <QStringList>
#include <QTime>

using namespace HmiStateMachine;

namespace headunit {

namespace {

const QStringList &domains()
{
    static const QStringList list{"Home", "Media", "Phone", "Navigation", "Settings"};
    return list;
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
    m_transcript.call("show", popupId + ' ' + QString::number(popupKind), data);
}

void ViewLayer::requestPopupHide(const QString &popupId, bool deactivated)
{
    m_transcript.call("hide", popupId, deactivated);
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
    Q_UNUSED(popup)
    m_transcript.call("retry", "a blocked popup");
}

void ViewLayer::releaseBlockedPopups(const QMap<PopupState *, QTime> &blockedPopups)
{
    m_transcript.call("release", QString::number(blockedPopups.size()) + " blocked popups");
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
    m_transcript.call("update", popupId, data);
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
    const int oldDomain = m_activeDomain;
    m_activeView = viewId;
    m_activeDomain = domainFromName(viewId.section('/', 0, 0));
    Q_EMIT viewAboutToBeActivated(oldView, viewId);
    if (oldDomain != m_activeDomain) {
        Q_EMIT activeDomainChanged(m_activeDomain, oldDomain);
    }
    Q_EMIT activeViewChanged(viewId, oldView);
    Q_EMIT viewActivated(oldView, viewId);
}

} // namespace headunit
