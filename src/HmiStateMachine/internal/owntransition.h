#pragma once

class QState;

namespace HmiStateMachine {

/**
 * A transition that leads away from @p source and belongs to it.
 *
 * It is handed over as a whole: a child that is made with its parent announces itself while it is a
 * mere QObject, and the state would have to look at it again later, see NamedState::event().
 */
template <typename Transition> Transition *ownTransition(QState *source)
{
    auto *transition = new Transition;
    transition->setParent(source);
    return transition;
}

} // namespace HmiStateMachine
