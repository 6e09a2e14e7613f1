#pragma once

#include "recordingviewstatetarget.h"

#include <QSet>

/** A view layer that knows what it was told to show, and reports it when asked to. */
class Screen : public RecordingViewStateTarget
{
    Q_OBJECT

public:
    Screen(Journal &journal, QStateMachine &machine);

    void requestPopupShow(const QString &popupId, int popupKind, const QVariant &data) override;
    void requestPopupHide(const QString &popupId, bool deactivated) override;
    void stackPopup(const QString &popupId, const QString &stackingPopupId) override;

    /** Requests the popup again, as an application does. */
    void retryBlockedPopup(HmiStateMachine::PopupState *popup) override;
    void releaseBlockedPopups(
        const QMap<HmiStateMachine::PopupState *, QTime> &blockedPopups) override;

    /** The view ids that it was told to show, and since then neither to hide nor to stack. */
    const QSet<QString> &shown() const { return m_shown; }

    /** Those handed over since it was asked last. */
    QList<HmiStateMachine::PopupState *> takeRetried();
    QList<HmiStateMachine::PopupState *> takeReleased();

    /** Emits popupStatusChanged() for what was shown and hidden since the last report. */
    void report();

private:
    QStateMachine &m_machine;
    QSet<QString> m_shown;
    QSet<QString> m_reported;
    QList<HmiStateMachine::PopupState *> m_retried;
    QList<HmiStateMachine::PopupState *> m_released;
};
