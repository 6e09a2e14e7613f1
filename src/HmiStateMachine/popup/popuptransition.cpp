#include <HmiStateMachine/popup/popuptransition.h>

#include <HmiStateMachine/internal/logging.h>
#include <HmiStateMachine/internal/viewlayer.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/named/viewstatetarget.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <algorithm>

namespace HmiStateMachine {

namespace {

PopupState::InterruptionBehavior behaviorTowards(PopupState *requested, PopupState *front)
{
    if (!front) {
        return PopupState::Allow;
    }
    return front->hasOwnInterruptionBehavior()
        ? front->interruption(requested)
        : PopupInterruptionStore::instance()->getInterruptionBehavior(front, requested);
}

} // namespace

PopupTransition::PopupTransition() : QAbstractTransition(nullptr)
{
}

PopupTransition::~PopupTransition() = default;

void PopupTransition::addTarget(PopupState *popup)
{
    if (popup && !m_targets.contains(popup->name())) {
        m_targets.insert(popup->name(), popup);
    }
}

void PopupTransition::removeTarget(PopupState *popup)
{
    if (!popup) {
        return;
    }
    m_targets.remove(popup->name());
    // A popup that was renamed since is known under its former name.
    for (auto it = m_targets.begin(); it != m_targets.end();) {
        if (it.value() == popup) {
            it = m_targets.erase(it);
        } else {
            ++it;
        }
    }
    // Qt warns of every move of a transition whose target is gone.
    if (targetState() == popup) {
        setTargetState(nullptr);
    }
}

bool PopupTransition::blockedByStacked(PopupState *popup) const
{
    const ViewStateTarget *target = viewLayer();
    if (!target || !popup) {
        return false;
    }
    const auto *store = PopupInterruptionStore::instance();
    const QString requested = popup->popupViewId();
    const auto stacked = target->stackedPopups();
    return std::any_of(stacked.cbegin(), stacked.cend(), [&](const QString &id) {
        return store->getInterruptionBehavior(id, requested) == PopupState::Prohibit;
    });
}

bool PopupTransition::eventTest(QEvent *event)
{
    if (event->type() != PopupEvent::eventType()) {
        return false;
    }
    const auto *request = static_cast<PopupEvent *>(event);
    PopupState *popup = m_targets.value(request->target());
    if (!popup) {
        return false;
    }
    if (popup->isCurrentPopup()) {
        popup->updateEventData(event);
        Q_EMIT popup->alreadyActivated();
        HMI_DEBUG(hmistatemachine()) << "Popup" << popup->popupViewId() << "is already active";
        return false;
    }
    PopupState *front = PopupState::getActivePopupState();
    const auto behavior = behaviorTowards(popup, front);
    if (behavior == PopupState::Prohibit
        || PopupInterruptionStore::instance()->isBlockedByDomain(popup)) {
        return request->isReactivation() ? grant(popup, true) : refuse(popup, front);
    }
    if (blockedByStacked(popup)) {
        return false;
    }
    if (front && behavior == PopupState::AllowStack) {
        front->stack(popup);
    } else if (front && behavior == PopupState::AllowNoReturn) {
        front->deactivateSource(popup);
    }
    return grant(popup, false);
}

void PopupTransition::onTransition(QEvent *event)
{
    Q_UNUSED(event)
}

bool PopupTransition::grant(PopupState *popup, bool reactivation)
{
    setTargetState(popup);
    popup->prepareForActivation(reactivation);
    return true;
}

bool PopupTransition::refuse(PopupState *popup, const PopupState *front)
{
    PopupState::popupBlocked(popup);
    Q_EMIT popup->blocked();
    HMI_DEBUG_FROM(hmistatemachine(), "eventTest")
        << "Popup" << popup->popupViewId() << "blocked by"
        << (front ? front->popupViewId() : QStringLiteral("Null popup"));
    return false;
}

} // namespace HmiStateMachine
