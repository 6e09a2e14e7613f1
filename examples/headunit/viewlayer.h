#pragma once

#include <HmiStateMachineQuick/quickviewstatetarget.h>

namespace headunit {

class Transcript;

/**
 * The view layer of the head unit: that of Qt Quick, which also writes every call into the
 * transcript. Without a scene it reports each view and popup as shown at once.
 */
class ViewLayer : public HmiStateMachine::QuickViewStateTarget
{
    Q_OBJECT

public:
    explicit ViewLayer(Transcript &transcript);
    ~ViewLayer() override;

    void activateView(const QString &viewId, const QVariant &instanceData) override;
    void deactivateView(const QString &viewId, const QVariant &instanceData) override;
    void preparePopup(const QString &popupId, bool reactivation) override;
    void requestPopupShow(const QString &popupId, int popupKind, const QVariant &data) override;
    void requestPopupHide(const QString &popupId, bool deactivated) override;
    void stackPopup(const QString &popupId, const QString &stackingPopupId) override;
    void unstackPopup(const QString &popupId) override;
    void retryBlockedPopup(HmiStateMachine::PopupState *popup) override;
    void releaseBlockedPopups(
        const QMap<HmiStateMachine::PopupState *, QTime> &blockedPopups) override;
    void postFollowOnBackEvent(quint8 backDepth, const QString &backTargetId,
                               const QString &viewId) override;
    void setScreenPopupBehavior(bool enabled) override;
    void resetScreenPopupBehavior() override;
    void updatePopupData(const QString &popupId, const QVariant &data) override;

    static QStringList domainNames();

    /** The popup that the user sees in front; empty when there is none. */
    QString popupInFront() const;

    /** A request for the popup with that view id was refused. */
    void noteRefusal(const QString &popupId);
    bool wasRefused(const QString &popupId) const;

    /** Something that is heard or shown beside the view: the audio source, say. */
    void showStatus(const QString &text);

    /** Tells the driver why something was not done. */
    void showHint(const QString &text);

    /** Tells of a voice request that a transition has passed on, and forgets it. */
    void takeVoiceRequest();

Q_SIGNALS:
    void hintShown(const QString &text);

private:
    Q_DISABLE_COPY(ViewLayer)

    void showTimeLeft(const QVariant &popupData);

    Transcript &m_transcript;
    QStringList m_refused;
};

} // namespace headunit
