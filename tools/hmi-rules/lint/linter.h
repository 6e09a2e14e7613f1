#pragma once

#include "finding.h"

namespace hmirules {

/**
 * All that is to be said about the files from @p firstFile on, without the kinds to be ignored, in
 * the order of the files.
 */
std::vector<Finding> lint(const RuleBase &base, const Inventory &inventory, int firstFile,
                          const QStringList &ignoredIds);

} // namespace hmirules
