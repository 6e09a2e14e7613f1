#pragma once

#include "input/inventory.h"
#include "rulebase.h"

namespace hmirules {

/** A popup, or what stands for several, of which decisions are listed. */
struct Individual
{
    enum Kind {
        Popup,
        Wildcard, ///< each popup under it that is not listed by itself
        Other ///< each popup that is under no name of the files
    };

    QString name; ///< what the rules are asked for
    QString viewId; ///< what the blacklists are asked for
    Kind kind = Popup;
};

/** More popups than these are refused: for each pair there is a decision. */
constexpr int maximumPopulation = 3000;

/**
 * Whom decisions are listed for: the popups of the inventory, or without one those that the files
 * name, their wildcards, and one for all others.
 */
QList<Individual> populationOf(const RuleBase &base, const Inventory &inventory);

/**
 * Leaves those that are, or are under, one of these names or wildcards; all when there are none.
 * False with a fault when one of them leaves nobody.
 */
bool restrictTo(const QStringList &patterns, QList<Individual> *population, Fault *fault);

/** False with a fault when there are too many. */
bool isListable(const QList<Individual> &population, Fault *fault);

} // namespace hmirules
