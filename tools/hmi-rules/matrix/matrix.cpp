#include "matrix.h"

#include <QHash>

namespace hmirules {

namespace {

/** Numbers decisions in the order of their first occurrence. */
class ReasonIndex
{
public:
    explicit ReasonIndex(std::vector<Decision> *reasons) : m_reasons(reasons) { }

    int of(const Decision &decision)
    {
        const QPair<int, int> key(decision.behavior, decision.site);
        const auto known = m_numbers.constFind(key);
        if (known != m_numbers.constEnd()) {
            return *known;
        }
        m_reasons->push_back(decision);
        return *m_numbers.insert(key, static_cast<int>(m_reasons->size()) - 1);
    }

private:
    std::vector<Decision> *m_reasons;
    QHash<QPair<int, int>, int> m_numbers;
};

BlockedIn blockedIn(const RuleBase &base, const QString &viewId, Site::Kind kind)
{
    const auto ask = [&](const QString &name) {
        return kind == Site::DomainBlacklist ? base.blockingByDomain(viewId, name)
                                             : base.blockingByView(viewId, name);
    };
    BlockedIn result;
    result.site = ask(QString()).site;
    if (result.site >= 0) {
        for (const QString &name : base.site(result.site).names) {
            if (ask(name).isBlocked && !result.names.contains(name)) {
                result.names.append(name);
            }
        }
    }
    return result;
}

} // namespace

Matrix makeMatrix(const RuleBase &base, const QList<Individual> &population)
{
    Matrix matrix;
    matrix.popups = population;
    ReasonIndex index(&matrix.reasons);
    for (const Individual &front : population) {
        std::vector<int> row;
        row.reserve(static_cast<std::size_t>(population.size()));
        for (const Individual &requested : population) {
            row.push_back(index.of(base.decision(front.name, requested.name)));
        }
        matrix.cells.push_back(std::move(row));
        matrix.domains.push_back(blockedIn(base, front.viewId, Site::DomainBlacklist));
        matrix.views.push_back(blockedIn(base, front.viewId, Site::ViewBlacklist));
    }
    return matrix;
}

} // namespace hmirules
