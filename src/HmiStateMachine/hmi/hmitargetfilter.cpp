#include <HmiStateMachine/hmi/hmitargetfilter.h>

namespace HmiStateMachine {

HmiTargetFilter::~HmiTargetFilter() = default;

}
