#include "linter.h"

#include "checks.h"

#include <algorithm>

namespace hmirules {

std::vector<Finding> lint(const RuleBase &base, const Inventory &inventory, int firstFile,
                          const QStringList &ignoredIds)
{
    Findings findings(base, inventory, firstFile);
    for (const auto check : {checkWarnings, checkShape, checkReplacements, checkNames, checkShadows,
                             checkOverlaps, checkDecisions, checkInventory}) {
        check(&findings);
    }
    std::vector<Finding> result = findings.takeSorted();
    result.erase(std::remove_if(result.begin(), result.end(),
                                [&ignoredIds](const Finding &finding) {
                                    return ignoredIds.contains(finding.kind->id);
                                }),
                 result.end());
    return result;
}

} // namespace hmirules
