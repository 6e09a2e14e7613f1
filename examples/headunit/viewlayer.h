#pragma once

#include "popupboard.h"

#include <HmiStateMachine/named/viewstatetarget.h>

namespace headunit {

class Transcript;

/**
 * The view layer of the demo: it writes every call into the transcript and reports each view as
 * shown at once, where a real one would take its time for loading and animation.
 *
 * A domain is the part of a view id before the slash. A popup covers those that it has stacked;
 * when it goes, those of another layer are uncovered here, because the flow never left them.
 */
class ViewLayer : public HmiStateMachine::ViewStateTarget
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

    static QStringList domainNames();

    /** Another part of the display takes over without a change of view. */
    void setActiveDomain(const QString &name);

    /** The popup that the user sees in front; empty when there is none. */
    QString popupInFront() const;

    /** A request for the popup with that view id was refused. */
    void noteRefusal(const QString &popupId);
    bool wasRefused(const QString &popupId) const;

    /** Something that is heard or shown beside the view: the audio source, a hint. */
    void showStatus(const QString &text);

    /** Tells of a voice request that a transition has passed on, and forgets it. */
    void takeVoiceRequest();

private:
    Q_DISABLE_COPY(ViewLayer)

    void setActiveView(const QString &viewId);
    void showTimeLeft(const QVariant &popupData);

    Transcript &m_transcript;
    PopupBoard m_popups;
    QString m_activeView;
    int m_activeDomain = -1;
};

} // namespace headunit
