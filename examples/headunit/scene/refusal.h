#pragma once

#include <QString>

namespace HmiStateMachine {
class PopupState;
} // namespace HmiStateMachine

namespace headunit {

/** Why a request for @p popup is refused just now, in words: "refused by phone/call". */
QString refusalOf(const HmiStateMachine::PopupState *popup);

} // namespace headunit
