#include "building.h"
#include "popups.h"

#include <HmiStateMachine/named/guardedtransition.h>
#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/popupevent.h>
#include <HmiStateMachine/popup/popupdismisstransition.h>
#include <HmiStateMachine/popup/popuprootstate.h>
#include <HmiStateMachine/popup/popupstate.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

bool dismissesAny(QEvent *event)
{
    return event->type() == PopupEvent::eventType()
        && static_cast<PopupEvent *>(event)->target()
        == PopupDismissTransition::dismissEventWildCard;
}

// Neither its name nor that of its view dismisses it.
void giveNoDismissName(PopupState *fault)
{
    fault->dismissTransition()->setDismissTarget(QString());
    fault->dismissTransition()->setDismissView(QString());
    fault->turnOffNonDismissibleWarning();
}

// What dismisses any popup is swallowed: of a state's transitions the first one gets the event, and
// the dismiss transition comes after this one whenever the popup takes it back.
void swallowDismissalOfAny(PopupState *fault)
{
    fault->activateDismissTransition(); // to the layer, where it waits until the popup is entered
    auto *swallow = new GuardedTransition(fault);
    QObject::connect(
        swallow, &GuardedTransition::transitionTest, swallow,
        [swallow](QEvent *event) { swallow->setAllowTransition(dismissesAny(event)); });
}

void closeWhenRepaired(PopupState *fault)
{
    HmiTransition *repaired = onEvent("FaultRepaired", fault);
    repaired->setTargetState(fault->rootPopupState()->noPopupState());
    fault->registerDismissingTransition(repaired);
}

} // namespace

void keepFaultOpen()
{
    PopupState *fault = popup("car/fault");
    giveNoDismissName(fault);
    swallowDismissalOfAny(fault);
    closeWhenRepaired(fault);
}

} // namespace headunit
