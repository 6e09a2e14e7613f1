#include "screen.h"

#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <algorithm>

using namespace HmiStateMachine;

namespace {

// A set's own order differs from process to process.
QStringList sorted(const QSet<QString> &ids)
{
    QStringList result = ids.values();
    std::sort(result.begin(), result.end());
    return result;
}

} // namespace

Screen::Screen(Journal &journal, QStateMachine &machine)
    : RecordingViewStateTarget(journal), m_machine(machine)
{
}

void Screen::requestPopupShow(const QString &popupId, int popupKind, const QVariant &data)
{
    RecordingViewStateTarget::requestPopupShow(popupId, popupKind, data);
    m_shown.insert(popupId);
}

void Screen::requestPopupHide(const QString &popupId, bool deactivated)
{
    RecordingViewStateTarget::requestPopupHide(popupId, deactivated);
    m_shown.remove(popupId);
}

void Screen::stackPopup(const QString &popupId, const QString &stackingPopupId)
{
    RecordingViewStateTarget::stackPopup(popupId, stackingPopupId);
    m_shown.remove(popupId);
}

void Screen::retryBlockedPopup(PopupState *popup)
{
    m_retried.append(popup);
    m_machine.postEvent(new PopupEvent(popup->name(), QStringLiteral("retried")));
}

void Screen::releaseBlockedPopups(const QMap<PopupState *, QTime> &blockedPopups)
{
    m_released.append(blockedPopups.keys());
}

QList<PopupState *> Screen::takeRetried()
{
    return std::exchange(m_retried, {});
}

QList<PopupState *> Screen::takeReleased()
{
    return std::exchange(m_released, {});
}

void Screen::report()
{
    const QStringList hidden = sorted(m_reported - m_shown);
    const QStringList shown = sorted(m_shown - m_reported);
    m_reported = m_shown;
    for (const QString &id : hidden) {
        Q_EMIT popupStatusChanged(id, false);
    }
    for (const QString &id : shown) {
        Q_EMIT popupStatusChanged(id, true);
    }
}
