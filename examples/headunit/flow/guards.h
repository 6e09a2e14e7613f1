#pragma once

#include <functional>

namespace HmiStateMachine {
class GuardedTransition;
class HmiTransition;
class NamedState;
} // namespace HmiStateMachine

namespace headunit {

class Vehicle;

/**
 * Lets @p transition, which allows by default, pass only while @p condition holds. Several guards
 * may be set: a refusal is final.
 */
void allowOnlyWhile(std::function<bool()> condition,
                    HmiStateMachine::GuardedTransition *transition);

/** A request from any screen for a view that is active already would leave it and enter it anew. */
void refuseWhileActive(HmiStateMachine::NamedState *target,
                       HmiStateMachine::HmiTransition *transition);

/** In reverse the camera stays on the screen. */
void refuseInReverse(const Vehicle *vehicle, HmiStateMachine::HmiTransition *transition);

} // namespace headunit
