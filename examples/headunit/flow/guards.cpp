#include "guards.h"

#include "vehicle.h"

#include <HmiStateMachine/named/hmitransition.h>
#include <HmiStateMachine/named/namedstate.h>

using namespace HmiStateMachine;

namespace headunit {

void allowOnlyWhile(std::function<bool()> condition, GuardedTransition *transition)
{
    QObject::connect(transition, &GuardedTransition::transitionTest, transition,
                     [condition, transition] {
                         if (!condition()) {
                             transition->setAllowTransition(false);
                         }
                     });
}

void refuseWhileActive(NamedState *target, HmiTransition *transition)
{
    allowOnlyWhile([target] { return !target->isActive(); }, transition);
}

void refuseInReverse(const Vehicle *vehicle, HmiTransition *transition)
{
    allowOnlyWhile([vehicle] { return !vehicle->isReversing(); }, transition);
}

} // namespace headunit
