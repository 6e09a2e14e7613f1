#pragma once

#include "journal.h"

#include <HmiStateMachine/named/viewstatetarget.h>

#include <QMap>
#include <QStateMachine>
#include <QVariantMap>

/**
 * A view layer that shows nothing: it writes every call to the journal and keeps the data. It
 * publishes itself as the instance of the process while it lives.
 *
 * Lines are the operation and its ids and flags: "activateView Radio", "requestPopupHide Call
 * true", "postFollowOnBackEvent 2 Home Radio". Data is kept apart, see viewData() and popupData().
 */
class RecordingViewStateTarget : public HmiStateMachine::ViewStateTarget
{
    Q_OBJECT

public:
    explicit RecordingViewStateTarget(Journal &journal);
    ~RecordingViewStateTarget() override;

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

    /** Answers follow-on requests as an application does, by posting the next event to @p machine.
     */
    void followBackRequests(QStateMachine *machine) { m_machine = machine; }

    /** Answers a retry as an application does, by posting the request again to @p machine. */
    void repostBlockedPopups(QStateMachine *machine) { m_retryMachine = machine; }

    /** Screen popup behaviour is told on every entry of a screen; off unless a test asks for it. */
    void recordPopupBehavior(bool on) { m_recordPopupBehavior = on; }

    /** The instance data handed over with the last call for a view, or the last popup data. */
    QVariantMap viewData(const QString &viewId) const { return m_viewData.value(viewId); }
    QVariantMap popupData(const QString &popupId) const { return m_popupData.value(popupId); }

    void setDomains(const QMap<QString, int> &domains) { m_domains = domains; }
    void setActiveDomain(int domain);
    void setActiveView(const QString &view);

private:
    Journal &m_journal;
    QStateMachine *m_machine = nullptr;
    QStateMachine *m_retryMachine = nullptr;
    bool m_recordPopupBehavior = false;
    QMap<QString, QVariantMap> m_viewData;
    QMap<QString, QVariantMap> m_popupData;
    QMap<QString, int> m_domains;
    int m_activeDomain = 0;
    QString m_activeView;
};
