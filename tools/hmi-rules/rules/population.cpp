#include "population.h"

#include "libraryfacts.h"
#include "names.h"

#include "lint/guess.h"
#include "report/visible.h"

#include <QSet>

namespace hmirules {

namespace {

// Under which of the patterns somebody is.
QStringList wantedKeys(const QStringList &patterns, const Individual &individual)
{
    QStringList wanted;
    for (const QString &key : keysOf(individual.name)) {
        if (patterns.contains(key)) {
            wanted.append(key);
        }
    }
    return wanted;
}

} // namespace

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

bool restrictTo(const QStringList &patterns, QList<Individual> *population, Fault *fault)
{
    if (patterns.isEmpty()) {
        return true;
    }
    QStringList names;
    QSet<QString> used;
    QList<Individual> restricted;
    for (const Individual &individual : *population) {
        names.append(individual.name);
        const QStringList wanted = wantedKeys(patterns, individual);
        if (!wanted.isEmpty()) {
            restricted.append(individual);
            used += QSet<QString>(wanted.cbegin(), wanted.cend());
        }
    }
    for (const QString &pattern : patterns) {
        if (!used.contains(pattern)) {
            *fault = Fault();
            fault->message = QString("no popup is under \"%1\"").arg(visible(pattern))
                + didYouMean(pattern, names);
            fault->remedy = "name a popup that is in the file or the inventory, or a wildcard.";
            return false;
        }
    }
    *population = restricted;
    return true;
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
