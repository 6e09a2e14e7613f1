#pragma once

#include "explanation.h"
#include "report/paint.h"

namespace hmirules {

QString explanationAsText(const RuleBase &base, const Explanation &explanation,
                          const std::vector<BlockingExplanation> &blocking, const Paint &paint);

QString explanationAsJson(const RuleBase &base, const Explanation &explanation,
                          const std::vector<BlockingExplanation> &blocking);

} // namespace hmirules
