#include "population.h"

#include "libraryfacts.h"
#include "names.h"

#include <algorithm>

namespace hmirules {

QList<Individual> populationOf(const RuleBase &base, const Inventory &inventory)
{
    QList<Individual> population;
    if (inventory.hasPopups) {
        for (const QString &name : inventory.popupNames()) {
            population.append({name, inventory.viewIdOf(name), Individual::Popup});
        }
        return population;
    }
    for (const QString &name : namesIn(base)) {
        population.append(
            {name, name, isWildcard(name) ? Individual::Wildcard : Individual::Popup});
    }
    const QString other = unnamedPopup(base);
    population.append({other, other, Individual::Other});
    return population;
}

QList<Individual> restrictedTo(const QStringList &patterns, const QList<Individual> &population)
{
    QList<Individual> restricted;
    for (const Individual &individual : population) {
        const QStringList keys = keysOf(individual.name);
        if (std::any_of(patterns.cbegin(), patterns.cend(),
                        [&keys](const QString &pattern) { return keys.contains(pattern); })) {
            restricted.append(individual);
        }
    }
    return patterns.isEmpty() ? population : restricted;
}

bool isListable(const QList<Individual> &population, Fault *fault)
{
    if (population.size() <= maximumPopulation) {
        return true;
    }
    *fault = Fault();
    fault->message = QString("%1 popups are too many to list each pair of them; %2 can be")
                         .arg(population.size())
                         .arg(maximumPopulation);
    fault->remedy = "choose some with --popups or --inventory.";
    return false;
}

} // namespace hmirules
