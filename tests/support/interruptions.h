#pragma once

#include <QByteArray>

namespace HmiStateMachine {
class PopupInterruptionStore;
}

/** Loads @p json into @p store from a file of its own. False when that file cannot be written. */
bool loadInterruptions(HmiStateMachine::PopupInterruptionStore &store, const QByteArray &json);
