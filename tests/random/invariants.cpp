#include "invariants.h"

#include "world.h"

#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>

#include <algorithm>

using namespace HmiStateMachine;

namespace {

/** The machine as it has settled, looked up once for all rules. */
struct Settled
{
    explicit Settled(const World &settledWorld)
        : world(settledWorld), snapshot(world.snapshot()), states(world.machine.configuration())
    {
    }

    bool isActive(PopupState *popup) const { return states.contains(popup); }

    const World &world;
    const Snapshot snapshot;
    const QSet<QAbstractState *> states;
};

QString brokenLayerRule(const Settled &settled, PopupRootState *root)
{
    const auto isChild = [root](const QAbstractState *state) {
        return state->parentState() == root;
    };
    const auto isOfLayer = [root](const PopupState *popup) {
        return popup->rootPopupState() == root;
    };
    const auto &waiting = settled.snapshot.waiting;
    if (std::count_if(settled.states.begin(), settled.states.end(), isChild) != 1) {
        return QStringLiteral("exactly one child of each popup root is active");
    }
    if (!settled.isActive(root->activePopupState())) {
        return QStringLiteral("the child that a popup root calls active is");
    }
    if (PopupState::isStateActive(root->noPopupState())) {
        return QStringLiteral("no state that stands for no popup is in the active popup stack");
    }
    if (root->activePopupState() == root->noPopupState() && !settled.world.isStalled(root)
        && std::any_of(waiting.begin(), waiting.end(), isOfLayer)) {
        return QStringLiteral("nothing waits behind no popup");
    }
    return QString();
}

QString brokenPopupRule(const Settled &settled, PopupState *popup, const QString &id)
{
    const bool active = settled.isActive(popup);
    if (PopupState::isStateActive(popup) != active || PopupState::isStateActive(id) != active
        || popup->isActive() != active) {
        return QStringLiteral("the active popup stack holds the popups that are active");
    }
    if (!active && settled.snapshot.shown.contains(id)) {
        return QStringLiteral("a popup that is shown is active");
    }
    const QAbstractTransition *reaction = settled.world.reaction(popup);
    const bool lent = reaction && reaction->sourceState() != popup;
    if (lent && (active || reaction->sourceState() != popup->rootPopupState())) {
        return QStringLiteral("an active popup has its own reactions");
    }
    if (lent && !settled.snapshot.stacked.contains(id)) {
        return QStringLiteral("the layer has the reactions of stacked popups alone");
    }
    const PopupDismissTransition *dismissal = popup->dismissTransition();
    if (!active) {
        return dismissal->targetState()
            ? QStringLiteral("the dismissal of a popup that is not active leads nowhere")
            : QString();
    }
    if (!dismissal->isDismissable()) {
        return QString();
    }
    if (!settled.snapshot.waiting.contains(popup)) {
        return QStringLiteral("a popup that is given up is left, if it can be");
    }
    return dismissal->sourceState() == popup
            && dismissal->targetState() == popup->rootPopupState()->noPopupState()
        ? QString()
        : QStringLiteral("an active popup can be dismissed");
}

QString brokenStackRule(const Settled &settled, PopupState *popup, const QString &id)
{
    const int stacked = settled.snapshot.stacked.count(id);
    if (stacked > 1) {
        return QStringLiteral("a popup is stacked once");
    }
    if (stacked && settled.snapshot.shown.contains(id)) {
        return QStringLiteral("a stacked popup that is shown again is no longer stacked");
    }
    if (stacked && !settled.isActive(popup) && !settled.snapshot.waiting.contains(popup)
        && !settled.world.isForgotten(popup)) {
        return QStringLiteral("a stacked popup is shown again or given up");
    }
    return QString();
}

QString brokenRuleOf(const Settled &settled, PopupState *popup)
{
    const QString id = popup->popupViewId();
    QString broken = brokenPopupRule(settled, popup, id);
    if (broken.isEmpty()) {
        broken = brokenStackRule(settled, popup, id);
    }
    return broken.isEmpty()
        ? broken
        : broken + " (popup " + QString::number(settled.world.indexOf(popup)) + ')';
}

} // namespace

QString brokenRule(const World &world)
{
    if (!world.complaints().isEmpty()) {
        return world.complaints().first();
    }
    if (!world.machine.isRunning() || world.machine.error() != QStateMachine::NoError) {
        return QStringLiteral("the machine runs");
    }
    const Settled settled(world);
    for (PopupRootState *root : world.roots()) {
        const QString broken = brokenLayerRule(settled, root);
        if (!broken.isEmpty()) {
            return broken;
        }
    }
    for (PopupState *popup : world.popups()) {
        const QString broken = brokenRuleOf(settled, popup);
        if (!broken.isEmpty()) {
            return broken;
        }
    }
    const PopupState *front = world.entered().isEmpty() ? nullptr : world.entered().last();
    return PopupState::getActivePopupState() == front
        ? QString()
        : QStringLiteral("the popup in front is the one that was entered last");
}
