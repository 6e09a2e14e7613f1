#pragma once

#include "finding.h"

namespace hmirules {

/** What the library warned about when it loaded the files. */
void checkWarnings(Findings *findings);

/** Keys, and the types of their values, that the library passes over in silence. */
void checkShape(Findings *findings);

/** What a later key, rule, entry or file takes the place of. */
void checkReplacements(Findings *findings);

/** Entries and lists that hide those of wildcards. */
void checkShadows(Findings *findings);

/** Popups under two wildcards of which one goes before the other. */
void checkOverlaps(Findings *findings);

/** Names that can match nothing, whatever popups there are. */
void checkNames(Findings *findings);

/** Decisions that hold a popup back, or let two take turns without an end. */
void checkDecisions(Findings *findings);

/** What is not as the inventory has it. */
void checkInventory(Findings *findings);

} // namespace hmirules
