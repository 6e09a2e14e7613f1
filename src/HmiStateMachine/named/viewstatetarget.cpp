#include <HmiStateMachine/named/viewstatetarget.h>

#include <HmiStateMachine/internal/metatypes.h>
#include <HmiStateMachine/internal/viewlayer.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QVector>

namespace HmiStateMachine {

// Here too: a static library is linked without the states when only this class is used.
Q_CONSTRUCTOR_FUNCTION(registerMetaTypes)

ViewStateTarget *ViewStateTarget::VIEW_STATE_TARGET_INSTANCE = nullptr;

namespace {

// Those that exist, as a rule one. The published pointer is the application's own and may outlive
// what it points to.
QVector<ViewStateTarget *> &existingTargets()
{
    static QVector<ViewStateTarget *> targets; // cppcheck-suppress unassignedVariable; others do
    return targets;
}

} // namespace

ViewStateTarget *viewLayer()
{
    ViewStateTarget *published = ViewStateTarget::instance();
    return existingTargets().contains(published) ? published : nullptr;
}

ViewStateTarget::ViewStateTarget(QObject *parent) : QObject(parent)
{
    existingTargets().append(this);
}

ViewStateTarget::~ViewStateTarget()
{
    existingTargets().removeOne(this);
}

ViewStateTarget *ViewStateTarget::instance()
{
    return VIEW_STATE_TARGET_INSTANCE;
}

void ViewStateTarget::stackPopup(const QString &popupId, const QString &stackingPopupId)
{
    Q_UNUSED(stackingPopupId)
    if (!m_stackedPopups.contains(popupId)) {
        m_stackedPopups.append(popupId);
    }
}

void ViewStateTarget::unstackPopup(const QString &popupId)
{
    m_stackedPopups.removeAll(popupId);
}

QList<QString> ViewStateTarget::stackedPopups() const
{
    return m_stackedPopups;
}

bool ViewStateTarget::isPopupStateActive(const QString &popupId)
{
    return PopupState::isStateActive(popupId);
}

void ViewStateTarget::setVRViewRequest(bool request, const QVariant &data)
{
    m_vrViewRequest = request;
    m_vrViewRequestData = data;
}

bool ViewStateTarget::vrViewRequest() const
{
    return m_vrViewRequest;
}

QVariant ViewStateTarget::vrViewRequestData() const
{
    return m_vrViewRequestData;
}

} // namespace HmiStateMachine
