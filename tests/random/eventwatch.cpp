#include "eventwatch.h"

#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popuprootstate.h>

#include <algorithm>

using namespace HmiStateMachine;

namespace {

PopupState::InterruptionBehavior behaviorOf(const PopupState *front, PopupState *requested)
{
    if (!front) {
        return PopupState::Allow;
    }
    return front->hasOwnInterruptionBehavior()
        ? front->interruption(requested)
        : PopupInterruptionStore::instance()->getInterruptionBehavior(front->name(),
                                                                      requested->name());
}

bool isProhibitedByStacked(const QList<QString> &stacked, const PopupState *requested)
{
    return std::any_of(stacked.begin(), stacked.end(), [requested](const QString &id) {
        return PopupInterruptionStore::instance()->getInterruptionBehavior(id,
                                                                           requested->popupViewId())
            == PopupState::Prohibit;
    });
}

} // namespace

EventWatch::EventWatch(World &world, QState *state) : QAbstractTransition(state), m_world(world)
{
}

void EventWatch::settled()
{
    finish();
    if (!m_owed.isEmpty()) {
        m_world.complain("a popup of the other layer that is not to return is dismissed");
        m_owed.clear();
    }
}

void EventWatch::finish()
{
    if (m_expected) {
        check(*m_expected);
        m_expected.reset();
    }
}

bool EventWatch::eventTest(QEvent *event)
{
    finish();
    if (event->type() == PopupEvent::eventType()) {
        const auto *request = static_cast<PopupEvent *>(event);
        m_world.journal.clear();
        m_owed.removeOne(request->target());
        m_expected = foretell(*request);
    }
    return false;
}

void EventWatch::onTransition(QEvent *event)
{
    Q_UNUSED(event)
}

EventWatch::Expectation EventWatch::foretell(const PopupEvent &event) const
{
    Expectation expected;
    expected.before = m_world.snapshot();
    expected.popup = m_world.popup(event.target());
    if (expected.popup) {
        foretellRequest(expected, event.isReactivation());
    } else {
        foretellDismissal(expected, event.target());
    }
    return expected;
}

void EventWatch::foretellRequest(Expectation &expected, bool reactivation) const
{
    PopupState *popup = expected.popup;
    if (expected.before.current.contains(popup)) {
        expected.answer = Answer::Refreshed;
        return;
    }
    expected.front = m_world.entered().isEmpty() ? nullptr : m_world.entered().last();
    expected.behavior = behaviorOf(expected.front, popup);
    expected.domainBlocked = PopupInterruptionStore::instance()->isBlockedByDomain(
        popup->popupViewId(), m_world.screen.activeDomain());
    if (expected.behavior == PopupState::Prohibit || expected.domainBlocked) {
        expected.answer = reactivation ? Answer::Granted : Answer::Refused;
        expected.reactivation = reactivation;
        expected.behavior = PopupState::Allow; // a return that is refused does nothing to the front
    } else if (isProhibitedByStacked(expected.before.stacked, popup)) {
        expected.answer = Answer::Prevented;
        if (reactivation) {
            m_world.returnPrevented(popup);
        }
    } else {
        expected.answer = Answer::Granted;
        const bool givenUp = expected.front && !expected.before.waiting.contains(expected.front);
        if (givenUp && expected.behavior == PopupState::AllowStack) {
            m_world.stackedAfterGivenUp(expected.front);
        }
    }
}

void EventWatch::foretellDismissal(Expectation &expected, const QString &target) const
{
    if (target.isEmpty()) {
        return;
    }
    const QString suffix = PopupDismissTransition::dismissEventSigniture;
    const bool any = target == PopupDismissTransition::dismissEventWildCard;
    for (PopupState *popup : m_world.popups()) {
        const bool current = expected.before.current.contains(popup);
        const bool named =
            target == popup->dismissEventIdentifier() || target == popup->popupViewId() + suffix;
        if (named || (any && current)) {
            expected.dismissed.append(popup);
        }
    }
    // The state that stands for no popup takes its own dismissal, and is entered once more.
    for (const PopupRootState *root : m_world.roots()) {
        const bool named = target == root->noPopupState()->dismissEventIdentifier();
        expected.returnsAnew = expected.returnsAnew
            || (root->activePopupState() == root->noPopupState() && (named || any));
    }
}

void EventWatch::check(const Expectation &expected)
{
    const QStringList lines = m_world.journal.lines();
    if (!expected.popup) {
        checkDismissed(expected);
        return;
    }
    if (expected.answer == Answer::Granted) {
        checkGranted(expected, lines);
        return;
    }
    const QString id = expected.popup->popupViewId();
    QStringList wanted;
    if (expected.answer == Answer::Refreshed) {
        wanted = QStringList{"updatePopupData " + id, "alreadyActivated " + id};
    } else if (expected.answer == Answer::Refused) {
        wanted = QStringList{"blocked " + id};
    }
    if (lines != wanted) {
        m_world.complain("a request that is not granted leaves no trace, but did: "
                         + lines.join(", "));
    }
    if (!(m_world.snapshot() == expected.before)) {
        m_world.complain("a request that is not granted changes nothing");
    }
}

void EventWatch::checkGranted(const Expectation &expected, const QStringList &lines)
{
    PopupState *popup = expected.popup;
    const QString id = popup->popupViewId();
    const QString prepared = "preparePopup " + id + (expected.reactivation ? " true" : " false");
    const QString shown = "requestPopupShow " + id + ' ' + QString::number(m_world.indexOf(popup));
    if (!popup->isCurrentPopup()) {
        m_world.complain("a request that the rules allow enters the popup");
    }
    if (lines.count(prepared) != 1 || lines.count(shown) != (expected.domainBlocked ? 0 : 1)) {
        m_world.complain("a popup is prepared once, and shown once unless its domain blocks it");
    }
    if (expected.front) {
        checkInterrupted(expected,
                         lines.contains("stackPopup " + expected.front->popupViewId() + ' ' + id));
    }
}

// The popup that was in front when the request was granted.
void EventWatch::checkInterrupted(const Expectation &expected, bool stacked)
{
    PopupState *front = expected.front;
    const bool sibling = front->rootPopupState() == expected.popup->rootPopupState();
    const bool returns = expected.before.waiting.contains(front);
    if (stacked != (expected.behavior == PopupState::AllowStack)) {
        m_world.complain("the popup in front is stacked exactly where the rules say so");
    }
    if (!sibling && !m_world.entered().contains(front)) {
        m_world.complain("a popup of the other layer stays while a request is granted");
    }
    if (!sibling && expected.behavior == PopupState::AllowNoReturn
        && front->dismissTransition()->isDismissable()) {
        m_owed.append(front->dismissEventIdentifier());
    }
    const bool willReturn = !front->rootPopupState()->wasDeactivated(front);
    const bool givenUp = sibling && expected.behavior == PopupState::AllowNoReturn;
    if (willReturn != (returns && !givenUp)) {
        m_world.complain("an interrupted popup returns unless the rules give it up");
    }
}

void EventWatch::checkDismissed(const Expectation &expected)
{
    for (PopupState *popup : expected.dismissed) {
        PopupRootState *root = popup->rootPopupState();
        const bool wasCurrent = expected.before.current.contains(popup);
        const bool leaves = wasCurrent && popup->dismissTransition()->isDismissable();
        if (leaves && root->activePopupState() != root->noPopupState()) {
            m_world.complain("a popup in front that is dismissed is left");
        }
        if (!root->wasDeactivated(popup)) {
            m_world.complain("a popup that is dismissed does not return");
        }
        if (m_world.screen.shown().contains(popup->popupViewId())) {
            m_world.complain("a popup that is dismissed is not shown");
        }
    }
    if (expected.dismissed.isEmpty() && !expected.returnsAnew
        && !(m_world.snapshot() == expected.before)) {
        m_world.complain("an event that names no popup changes nothing");
    }
}
