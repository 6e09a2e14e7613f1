#include <HmiStateMachine/popup/domainblockedpopupstate.h>

#include <HmiStateMachine/internal/viewlayer.h>
#include <HmiStateMachine/named/viewstatetarget.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>

namespace HmiStateMachine {

DomainBlockedPopupState::DomainBlockedPopupState(const QString &name, int popupKind)
    : PopupState(name, popupKind)
{
    makeConnections();
}

DomainBlockedPopupState::DomainBlockedPopupState(const QString &name, PopupRootState *root,
                                                 int popupKind)
    : PopupState(name, root, popupKind)
{
    makeConnections();
}

DomainBlockedPopupState::DomainBlockedPopupState(const QString &name, HmiLayeredState *layer,
                                                 int popupKind)
    : PopupState(name, layer, popupKind)
{
    makeConnections();
}

DomainBlockedPopupState::~DomainBlockedPopupState() = default;

void DomainBlockedPopupState::makeConnections()
{
    connect(this, &PopupState::aboutToBeActivated, this,
            &DomainBlockedPopupState::disconnectDomainMonitoring);
    connect(this, &PopupState::alreadyActivated, this,
            &DomainBlockedPopupState::disconnectDomainMonitoring);
}

bool DomainBlockedPopupState::handleDomainBlocked()
{
    ViewStateTarget *target = viewLayer();
    if (!target
        || !PopupInterruptionStore::instance()->isBlockedByDomain(this, target->activeDomain())) {
        return false;
    }
    // Once, however often the request is refused.
    connect(target, &ViewStateTarget::activeDomainChanged, this,
            &DomainBlockedPopupState::activeDomainChanged, Qt::UniqueConnection);
    activateDismissTransition();
    return true;
}

void DomainBlockedPopupState::onDeactivated()
{
    disconnectDomainMonitoring();
}

void DomainBlockedPopupState::disconnectDomainMonitoring()
{
    if (ViewStateTarget *target = viewLayer()) {
        disconnect(target, &ViewStateTarget::activeDomainChanged, this,
                   &DomainBlockedPopupState::activeDomainChanged);
    }
}

void DomainBlockedPopupState::activeDomainChanged(int newDomain, int oldDomain)
{
    Q_UNUSED(oldDomain)
    ViewStateTarget *target = viewLayer();
    if (!target || PopupInterruptionStore::instance()->isBlockedByDomain(this, newDomain)) {
        return;
    }
    disconnectDomainMonitoring();
    target->retryBlockedPopup(this);
}

} // namespace HmiStateMachine
