#pragma once

class QState;

namespace HmiStateMachine {

/** Where a child of @p state belongs: its exclusive layer when it has layers, else @p state itself.
 */
QState *exclusiveLayerOf(QState *state);

} // namespace HmiStateMachine
