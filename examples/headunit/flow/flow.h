#pragma once

#include "building.h"

namespace headunit {

/**
 * Builds the whole flow under StateMachine::instance():
 *
 * @code
 * HeadUnit            parallel: all regions run at the same time
 *   Screens           one view at a time, grouped by domain
 *     Home Media Phone Navigation Settings
 *   Guidance          route guidance, whatever is on the screen
 *   Audio             what is heard
 *   Keys              the keys beside the screen
 * @endcode
 */
void buildFlow(const Surroundings &surroundings);

} // namespace headunit
