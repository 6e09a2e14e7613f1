#pragma once

#include <QSet>
#include <QString>

namespace HmiStateMachine {
class HmiLayeredState;
class PopupState;
} // namespace HmiStateMachine

/**
 * Makes the popup of that number, whose kind it is too, in @p layer.
 *
 * What sort of popup it is, and what it has beside its name, follows from the number. One that
 * waits for its domain takes itself out of @p awaitingDomain when it is given up.
 */
HmiStateMachine::PopupState *makePopup(int index, const QString &prefix,
                                       HmiStateMachine::HmiLayeredState *layer,
                                       QSet<HmiStateMachine::PopupState *> &awaitingDomain);

/** Whether the popup of that number has a reaction that neither leaves nor enters it. */
bool hasReaction(int index);
