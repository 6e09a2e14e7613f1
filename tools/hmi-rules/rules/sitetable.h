#pragma once

#include "rulebase.h"

#include <QHash>
#include <QSet>

namespace hmirules {

/** What can decide under each key. */
class SiteTable
{
public:
    explicit SiteTable(const RuleBase &base);

    /** The numbers of the sites whose entry is for exactly this key, in their order. */
    std::vector<int> sitesOf(const QString &key, Site::Kind kind) const;

    /** Whether anything can decide under this key. */
    bool hasEntry(const QString &key) const { return m_sites.contains(key); }

    /** The same of rules with exactly this target. */
    std::vector<int> rulesOf(const QString &key, const QString &target) const;

private:
    const RuleBase &m_base;
    QHash<QString, std::vector<int>> m_sites;
};

} // namespace hmirules
