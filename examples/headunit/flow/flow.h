#pragma once

#include "building.h"

namespace headunit {

/**
 * Builds the whole flow under StateMachine::instance():
 *
 * @code
 * HeadUnit            parallel: all regions run at the same time
 *   Screens           layered: one view at a time, grouped by domain, and popups over them
 *     Home Media Phone Navigation Settings
 *   Alerts            layered: popups that concern driving, over all others
 *   Guidance          route guidance, whatever is on the screen
 *   Audio             what is heard
 *   Keys              the keys beside the screen
 * @endcode
 */
void buildFlow(const Surroundings &surroundings);

} // namespace headunit
