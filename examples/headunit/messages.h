#pragma once

namespace headunit {

/**
 * Leaves out the warning that the library writes for each popup that comes up: the transcript shows
 * it already. All other messages go where they went before.
 */
void hidePopupTraces();

} // namespace headunit
