#include "refusal.h"

#include <HmiStateMachine/named/viewstatetarget.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>
#include <HmiStateMachine/popup/popupstate.h>

using namespace HmiStateMachine;

namespace headunit {

namespace {

bool prohibits(const PopupState *front, const PopupState *popup)
{
    const auto behavior = front->hasOwnInterruptionBehavior()
        ? front->interruption(const_cast<PopupState *>(popup))
        : PopupInterruptionStore::instance()->getInterruptionBehavior(front, popup);
    return behavior == PopupState::Prohibit;
}

} // namespace

QString refusalOf(const PopupState *popup)
{
    const PopupState *front = PopupState::getActivePopupState();
    if (front && prohibits(front, popup)) {
        return "refused by " + front->name();
    }
    if (PopupInterruptionStore::instance()->isBlockedByDomain(popup)) {
        return "refused: not in this domain";
    }
    return "refused";
}

} // namespace headunit
