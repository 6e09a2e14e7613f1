#pragma once

#include "difference.h"
#include "report/paint.h"

namespace hmirules {

/** Empty when nothing changes. */
QString differenceAsText(const RuleBase &before, const RuleBase &after,
                         const Difference &difference, const Paint &paint);

QString differenceAsJson(const RuleBase &before, const RuleBase &after,
                         const Difference &difference);

} // namespace hmirules
