#pragma once

#include "catalogue.h"

namespace hmirules {

/** What each finding means; of one kind alone, or of all for null. */
QString findingsAsText(const FindingKind *kind);
QString findingsAsMarkdown(const FindingKind *kind);

} // namespace hmirules
