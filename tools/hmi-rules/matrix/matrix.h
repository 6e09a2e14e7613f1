#pragma once

#include "rules/population.h"

namespace hmirules {

/** Where a popup is blocked, and by which list. */
struct BlockedIn
{
    QStringList names; ///< domains or views
    int site = -1;
};

/** What each popup in front answers to each request, and why. */
struct Matrix
{
    QList<Individual> popups; ///< rows and columns
    std::vector<Decision> reasons; ///< those that occur
    std::vector<std::vector<int>> cells; ///< for each row and column the index of its reason
    std::vector<BlockedIn> domains; ///< for each popup
    std::vector<BlockedIn> views;
};

Matrix makeMatrix(const RuleBase &base, const QList<Individual> &population);

} // namespace hmirules
