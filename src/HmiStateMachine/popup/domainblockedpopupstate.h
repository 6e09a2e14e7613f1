#pragma once

#include <HmiStateMachine/hmistatemachine_export.h>
#include <HmiStateMachine/popup/popupstate.h>

namespace HmiStateMachine {

/**
 * A popup whose request waits while the active domain blocks it.
 *
 * When a domain becomes active that does not block it, it hands itself to
 * ViewStateTarget::retryBlockedPopup(), which requests it again. It stops waiting when it comes up
 * or is dismissed.
 */
class HMISTATEMACHINE_EXPORT DomainBlockedPopupState : public PopupState
{
    Q_OBJECT

public:
    /** As the constructor of PopupState with these parameters. */
    DomainBlockedPopupState(const QString &name, int popupKind);

    /** As the constructor of PopupState with these parameters. */
    DomainBlockedPopupState(const QString &name, PopupRootState *root, int popupKind);

    /** As the constructor of PopupState with these parameters. */
    DomainBlockedPopupState(const QString &name, HmiLayeredState *layer, int popupKind);
    ~DomainBlockedPopupState() override;

    /** Stops the waiting once the popup comes up; called by every constructor. */
    void makeConnections();

    /**
     * Begins to wait when the active domain is the reason; false when it is not, or without a view
     * layer.
     */
    bool handleDomainBlocked() override;

    /** Ends the waiting. */
    void onDeactivated() override;

public Q_SLOTS:
    /** Ends the waiting. */
    void disconnectDomainMonitoring();

    /** Hides the slot of the base, which goes on following the domain while the popup is shown. */
    void activeDomainChanged(int newDomain, int oldDomain);

private:
    Q_DISABLE_COPY(DomainBlockedPopupState)
};

} // namespace HmiStateMachine
