#include "sitetable.h"

namespace hmirules {

SiteTable::SiteTable(const RuleBase &base) : m_base(base)
{
    int number = 0;
    for (const Site &site : base.sites()) {
        m_sites[site.popup].push_back(number++);
    }
}

std::vector<int> SiteTable::sitesOf(const QString &key, Site::Kind kind) const
{
    std::vector<int> result;
    for (const int number : m_sites.value(key)) {
        if (m_base.site(number).kind == kind) {
            result.push_back(number);
        }
    }
    return result;
}

std::vector<int> SiteTable::rulesOf(const QString &key, const QString &target) const
{
    std::vector<int> result;
    for (const int number : sitesOf(key, Site::Rule)) {
        if (m_base.site(number).target == target) {
            result.push_back(number);
        }
    }
    return result;
}

} // namespace hmirules
