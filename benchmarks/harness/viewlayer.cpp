#include "viewlayer.h"

namespace {

/** What tells one call of the view layer from another in the checksum. */
enum Operation {
    ActivateView = 1,
    DeactivateView,
    PreparePopup,
    ShowPopup,
    HidePopup,
    StackPopup,
    UnstackPopup,
    RetryPopup,
    ReleasePopups,
    FollowOnBack,
    PopupBehavior,
    ResetPopupBehavior,
    PopupData
};

} // namespace

void ViewLayer::activateView(const QString &viewId, const QVariant &instanceData)
{
    add(ActivateView, viewId, instanceData);
}

void ViewLayer::deactivateView(const QString &viewId, const QVariant &instanceData)
{
    add(DeactivateView, viewId, instanceData);
}

void ViewLayer::preparePopup(const QString &popupId, bool reactivation)
{
    add(PreparePopup, popupId);
    m_checksum.add(reactivation);
}

void ViewLayer::requestPopupShow(const QString &popupId, int popupKind, const QVariant &data)
{
    add(ShowPopup, popupId, data);
    m_checksum.add(popupKind);
}

void ViewLayer::requestPopupHide(const QString &popupId, bool deactivated)
{
    add(HidePopup, popupId);
    m_checksum.add(deactivated);
}

void ViewLayer::stackPopup(const QString &popupId, const QString &stackingPopupId)
{
    ViewStateTarget::stackPopup(popupId, stackingPopupId);
    add(StackPopup, popupId);
}

void ViewLayer::unstackPopup(const QString &popupId)
{
    ViewStateTarget::unstackPopup(popupId);
    add(UnstackPopup, popupId);
}

int ViewLayer::domainFromName(const QString &domainName)
{
    return domainName.size();
}

int ViewLayer::activeDomain() const
{
    return 0;
}

HmiStateMachine::Identifier ViewLayer::activeView() const
{
    return HmiStateMachine::Identifier();
}

void ViewLayer::retryBlockedPopup(HmiStateMachine::PopupState *popup)
{
    Q_UNUSED(popup)
    m_checksum.add(RetryPopup);
}

void ViewLayer::releaseBlockedPopups(
    const QMap<HmiStateMachine::PopupState *, QTime> &blockedPopups)
{
    m_checksum.add(ReleasePopups);
    m_checksum.add(blockedPopups.size());
}

void ViewLayer::postFollowOnBackEvent(quint8 backDepth, const QString &backTargetId,
                                      const QString &viewId)
{
    add(FollowOnBack, viewId);
    m_checksum.add(backDepth);
    m_checksum.add(backTargetId);
}

void ViewLayer::setScreenPopupBehavior(bool enabled)
{
    m_checksum.add(PopupBehavior);
    m_checksum.add(enabled);
}

void ViewLayer::resetScreenPopupBehavior()
{
    m_checksum.add(ResetPopupBehavior);
}

void ViewLayer::updatePopupData(const QString &popupId, const QVariant &data)
{
    add(PopupData, popupId, data);
}

void ViewLayer::add(int operation, const QString &id)
{
    m_checksum.add(operation);
    m_checksum.add(id);
}

void ViewLayer::add(int operation, const QString &id, const QVariant &data)
{
    add(operation, id);
    Q_ASSERT(data.userType() == QMetaType::QVariantMap);
    // Read in place: a copy would be work of the measuring, not of the measured.
    const auto &map = *static_cast<const QVariantMap *>(data.constData());
    for (auto it = map.constBegin(); it != map.constEnd(); ++it) {
        m_checksum.add(it.key().size());
        m_checksum.add(it.value().toInt());
    }
}
