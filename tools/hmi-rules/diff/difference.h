#pragma once

#include "rules/population.h"

namespace hmirules {

/** A pair of popups that behaves differently. */
struct ChangedDecision
{
    QString front;
    QString requested;
    Decision before;
    Decision after;
};

/** A domain or view in which a popup is blocked now and was not, or the other way round. */
struct ChangedBlocking
{
    QString popupViewId;
    Site::Kind kind = Site::DomainBlacklist;
    QString where;
    Blocking before;
    Blocking after;
};

struct Difference
{
    std::vector<ChangedDecision> decisions; ///< by popups in front, then requested ones
    std::vector<ChangedBlocking> blockings;
};

/**
 * Whom both can decide for: as populationOf(), with the names of both, and the popups that are
 * under two wildcards at once. For these it matters which of the two has rules.
 */
QList<Individual> commonPopulation(const RuleBase &before, const RuleBase &after,
                                   const Inventory &inventory);

Difference compare(const RuleBase &before, const RuleBase &after,
                   const QList<Individual> &population);

} // namespace hmirules
