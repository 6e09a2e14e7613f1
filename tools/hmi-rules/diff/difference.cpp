#include "difference.h"

#include "rules/libraryfacts.h"
#include "rules/names.h"

namespace hmirules {

namespace {

// "phone/lost" for "phone/*" and "*/lost".
QStringList underTwoWildcards(const QStringList &names)
{
    QStringList modules;
    QStringList popups;
    for (const QString &name : names) {
        if (isWildcard(name)) {
            (name.startsWith('*') ? popups : modules).append(name);
        }
    }
    QStringList result;
    for (const QString &module : modules) {
        for (const QString &popup : popups) {
            if (result.size() > maximumPopulation) {
                return result; // too many to be listed already
            }
            result.append(module.chopped(1) + popup.mid(2));
        }
    }
    return result;
}

/** Collects what changes in where one popup is blocked. */
class BlockingComparison
{
public:
    BlockingComparison(const RuleBase &before, const RuleBase &after, Difference *difference)
        : m_before(before), m_after(after), m_difference(difference)
    {
    }

    void compare(const QString &viewId, Site::Kind kind)
    {
        QStringList names = listed(m_before, viewId, kind) + listed(m_after, viewId, kind);
        names.removeDuplicates();
        for (const QString &name : names) {
            const Blocking before = ask(m_before, viewId, name, kind);
            const Blocking after = ask(m_after, viewId, name, kind);
            if (before.isBlocked != after.isBlocked) {
                m_difference->blockings.push_back({viewId, kind, name, before, after});
            }
        }
    }

private:
    static Blocking ask(const RuleBase &base, const QString &viewId, const QString &where,
                        Site::Kind kind)
    {
        return kind == Site::DomainBlacklist ? base.blockingByDomain(viewId, where)
                                             : base.blockingByView(viewId, where);
    }

    static QStringList listed(const RuleBase &base, const QString &viewId, Site::Kind kind)
    {
        const int site = ask(base, viewId, QString(), kind).site;
        return site < 0 ? QStringList() : base.site(site).names;
    }

    const RuleBase &m_before;
    const RuleBase &m_after;
    Difference *m_difference;
};

} // namespace

QList<Individual> commonPopulation(const RuleBase &before, const RuleBase &after,
                                   const Inventory &inventory)
{
    QList<Individual> population = populationOf(before, inventory);
    if (inventory.hasPopups) {
        return population;
    }
    QStringList names = namesIn(before) + namesIn(after);
    names += underTwoWildcards(names);
    names.removeDuplicates();
    population.clear();
    for (const QString &name : names) {
        population.append(
            {name, name, isWildcard(name) ? Individual::Wildcard : Individual::Popup});
    }
    QString other = unnamedPopup(before);
    while (names.contains(other)) {
        other += ' ';
    }
    population.append({other, other, Individual::Other});
    return population;
}

Difference compare(const RuleBase &before, const RuleBase &after,
                   const QList<Individual> &population)
{
    Difference difference;
    BlockingComparison blocking(before, after, &difference);
    for (const Individual &front : population) {
        for (const Individual &requested : population) {
            if (before.behavior(front.name, requested.name)
                != after.behavior(front.name, requested.name)) {
                difference.decisions.push_back({front.name, requested.name,
                                                before.decision(front.name, requested.name),
                                                after.decision(front.name, requested.name)});
            }
        }
        blocking.compare(front.viewId, Site::DomainBlacklist);
        blocking.compare(front.viewId, Site::ViewBlacklist);
    }
    return difference;
}

} // namespace hmirules
