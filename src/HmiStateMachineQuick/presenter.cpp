#include <HmiStateMachineQuick/presenter.h>

namespace HmiStateMachine {

ViewPresenter::~ViewPresenter() = default;

PopupPresenter::~PopupPresenter() = default;

} // namespace HmiStateMachine
