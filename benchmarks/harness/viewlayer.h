#pragma once

#include "checksum.h"

#include <HmiStateMachine/named/viewstatetarget.h>

/**
 * The view layer of every engine: it reads what it is given, as a real one does, and keeps no more
 * of it than a checksum of all calls in their order.
 */
class ViewLayer : public HmiStateMachine::ViewStateTarget
{
    Q_OBJECT

public:
    quint64 checksum() const { return m_checksum.value(); }

    void activateView(const QString &viewId, const QVariant &instanceData) override;
    void deactivateView(const QString &viewId, const QVariant &instanceData) override;
    void preparePopup(const QString &popupId, bool reactivation) override;
    void requestPopupShow(const QString &popupId, int popupKind, const QVariant &data) override;
    void requestPopupHide(const QString &popupId, bool deactivated) override;
    void stackPopup(const QString &popupId, const QString &stackingPopupId) override;
    void unstackPopup(const QString &popupId) override;
    int domainFromName(const QString &domainName) override;
    int activeDomain() const override;
    HmiStateMachine::Identifier activeView() const override;
    void retryBlockedPopup(HmiStateMachine::PopupState *popup) override;
    void releaseBlockedPopups(
        const QMap<HmiStateMachine::PopupState *, QTime> &blockedPopups) override;
    void postFollowOnBackEvent(quint8 backDepth, const QString &backTargetId,
                               const QString &viewId) override;
    void setScreenPopupBehavior(bool enabled) override;
    void resetScreenPopupBehavior() override;
    void updatePopupData(const QString &popupId, const QVariant &data) override;

private:
    void add(int operation, const QString &id);
    void add(int operation, const QString &id, const QVariant &data);

    Checksum m_checksum;
};
