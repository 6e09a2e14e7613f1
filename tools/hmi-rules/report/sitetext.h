#pragma once

#include "rules/rulebase.h"

namespace hmirules {

/** What a behaviour does: "the request is refused". */
QString effectText(int behavior);

/** What decided, by target and entry. */
QString siteText(const Site &site);

/** The same for a decision; tells also that nothing did. */
QString reasonText(const RuleBase &base, const Decision &decision);

/** Where a site stands: "rules.json:6:13". */
QString sitePlace(const RuleBase &base, const Site &site);

QString fileName(const RuleBase &base, const Place &place);

} // namespace hmirules
