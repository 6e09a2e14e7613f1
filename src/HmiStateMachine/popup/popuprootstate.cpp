#include <HmiStateMachine/popup/popuprootstate.h>

#include <HmiStateMachine/hmi/hmisignaltransition.h>
#include <HmiStateMachine/internal/viewlayer.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/viewstatetarget.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popupstate.h>
#include <HmiStateMachine/popup/popuptransition.h>

#include <QStateMachine>

namespace HmiStateMachine {

namespace {

constexpr int noPopupKind = 1;

}

PopupRootState::PopupRootState(QState *parent) : NamedState(parent)
{
    build(QString());
}

PopupRootState::PopupRootState(const QString &name, QState *parent) : NamedState(name, parent)
{
    build(name);
}

PopupRootState::~PopupRootState() = default;

PopupState *PopupRootState::noPopupState() const
{
    return m_noPopupState;
}

PopupState *PopupRootState::activePopupState() const
{
    return m_activePopupState;
}

bool PopupRootState::isActivePopupState(const PopupState *popup) const
{
    return popup && popup == m_activePopupState;
}

void PopupRootState::addPopupState(PopupState *popup)
{
    if (!popup) {
        return;
    }
    m_popupTransition->addTarget(popup);
    popup->setRootState(this);
    if (!m_popups.contains(popup)) {
        m_popups.append(popup);
    }
}

void PopupRootState::removePopupState(PopupState *popup)
{
    if (!popup) {
        return;
    }
    if (isActivePopupState(popup)) {
        Q_EMIT reset();
    }
    m_popupTransition->removeTarget(popup);
    m_popups.removeAll(popup);
    popup->unstackTransitions();
}

void PopupRootState::setActivePopupState(PopupState *popup)
{
    if (!popup) {
        return;
    }
    // As a child, which is all that addTransition() would do for a transition without a signal.
    m_popupTransition->setParent(popup);
    if (popup == m_noPopupState) {
        requestReturn();
    } else {
        m_returnStack.append(popup->name());
    }
    m_activePopupState = popup;
    attachResetTransition();
}

void PopupRootState::deactivatePopupState(PopupState *popup)
{
    if (popup) {
        m_returnStack.removeAll(popup->name());
    }
}

bool PopupRootState::wasDeactivated(PopupState *popup) const
{
    return !popup || !m_returnStack.contains(popup->name());
}

void PopupRootState::handleReset()
{
    if (ViewStateTarget *target = viewLayer()) {
        // Copied, because the view layer may answer with calls that change the list.
        const auto names = m_returnStack;
        for (const QString &name : names) {
            target->unstackPopup(name);
            target->requestPopupHide(name, true);
        }
        if (m_activePopupState && m_activePopupState != m_noPopupState) {
            target->requestPopupHide(m_activePopupState->popupViewId(), true);
        }
    }
    m_returnStack.clear();
    const auto popups = m_popups;
    for (PopupState *popup : popups) {
        popup->unstackTransitions();
    }
}

void PopupRootState::clearPopups()
{
    m_returnStack.clear();
    PopupDismissTransition *dismissal =
        m_activePopupState ? m_activePopupState->dismissTransition() : nullptr;
    if (dismissal && m_activePopupState != m_noPopupState) {
        dismissal->trigger();
    }
}

void PopupRootState::onExit(QEvent *event)
{
    NamedState::onExit(event);
    handleReset();
}

void PopupRootState::build(const QString &name)
{
    m_popupTransition = new PopupTransition;
    m_noPopupState = new PopupState(name + PopupState::noneStatePostfix(), this, noPopupKind);
    m_noPopupState->turnOffNonDismissibleWarning();
    setInitialState(m_noPopupState);
    m_popupTransition->setParent(m_noPopupState);
    m_noPopupState->addTransition(m_popupTransition);
    m_resetTransition = new HmiSignalTransition(this, SIGNAL(reset()), this);
    connect(m_resetTransition, &QAbstractTransition::triggered, this, &PopupRootState::handleReset);
    m_resetTransition->setTargetState(m_noPopupState);
    m_resetTransition->setBlocked(true);
}

// The popup that was interrupted last comes back, once the one in front of it is gone.
void PopupRootState::requestReturn()
{
    QStateMachine *stateMachine = machine();
    if (m_returnStack.isEmpty() || !stateMachine) {
        return;
    }
    stateMachine->postEvent(new PopupEvent(m_returnStack.takeLast(), true, QVariant()));
}

// On the popup in front it leads away from that popup; with none in front it does nothing.
void PopupRootState::attachResetTransition()
{
    const bool noPopup = m_activePopupState == m_noPopupState;
    if (noPopup) {
        addTransition(m_resetTransition);
    } else {
        m_activePopupState->addTransition(m_resetTransition);
    }
    m_resetTransition->setBlocked(noPopup);
}

// The layer's own transitions may hang on the popup that is being destroyed; they outlive it.
void PopupRootState::forgetDestroyed(PopupState *popup)
{
    m_popupTransition->removeTarget(popup);
    m_popups.removeAll(popup);
    m_returnStack.removeAll(popup->name()); // nobody would come back, and those below it not either
    if (m_activePopupState == popup) {
        m_activePopupState = nullptr;
    }
    if (m_noPopupState == popup) {
        m_noPopupState = nullptr;
    }
    if (m_popupTransition->parent() == popup) {
        m_popupTransition->setParent(m_noPopupState ? static_cast<QState *>(m_noPopupState) : this);
    }
    if (m_resetTransition->parent() == popup) {
        m_resetTransition->setParent(this);
        m_resetTransition->setBlocked(true);
    }
}

} // namespace HmiStateMachine
