#include <HmiStateMachine/popup/popupdismisstransition.h>

#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <QStateMachine>

namespace HmiStateMachine {

const QString PopupDismissTransition::dismissEventSigniture = QStringLiteral("_Dismiss");
const QString PopupDismissTransition::dismissEventWildCard = QStringLiteral("DismissAnyPopup");

namespace {

QString dismissIdentifier(const QString &name)
{
    return name.isEmpty() ? name : name + PopupDismissTransition::dismissEventSigniture;
}

} // namespace

PopupDismissTransition::PopupDismissTransition(PopupState *popup)
    : QAbstractTransition(popup), m_popup(popup)
{
    if (!popup) {
        return;
    }
    setDismissTarget(popup->name());
    setDismissView(popup->popupViewId());
    connect(popup, &NamedState::nameChanged, this, &PopupDismissTransition::sourceNameChanged);
}

PopupDismissTransition::~PopupDismissTransition() = default;

void PopupDismissTransition::setDismissTarget(const QString &s)
{
    m_dismissTarget = dismissIdentifier(s);
}

void PopupDismissTransition::setDismissView(const QString &s)
{
    m_dismissView = dismissIdentifier(s);
}

QString PopupDismissTransition::dismissTargetSigniture() const
{
    return m_dismissTarget;
}

bool PopupDismissTransition::isDismissable() const
{
    return !m_dismissTarget.isEmpty();
}

bool PopupDismissTransition::isDismissEvent(QEvent *e) const
{
    if (!e || e->type() != PopupEvent::eventType()) {
        return false;
    }
    const QString target = static_cast<PopupEvent *>(e)->target();
    return !target.isEmpty()
        && (target == m_dismissTarget || target == m_dismissView || target == dismissEventWildCard);
}

void PopupDismissTransition::sourceNameChanged(Identifier identifier)
{
    setDismissTarget(identifier);
}

void PopupDismissTransition::trigger()
{
    if (QStateMachine *stateMachine = machine()) {
        stateMachine->postEvent(new PopupEvent(m_dismissTarget, false, QVariant()));
    }
}

bool PopupDismissTransition::eventTest(QEvent *event)
{
    // First of all, and without a call: the transitions of all popups that were shown before hang
    // on their root, and Qt asks each of them three times for every event.
    if (event->type() != PopupEvent::eventType()) {
        return false;
    }
    if (!m_popup || !isDismissEvent(event)) {
        return false;
    }
    m_popup->deactivate();
    const PopupRootState *root = m_popup->rootPopupState();
    return root && root->isActivePopupState(m_popup);
}

void PopupDismissTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
}

} // namespace HmiStateMachine
