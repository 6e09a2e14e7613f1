#include "checks.h"

#include "rules/libraryfacts.h"
#include "rules/names.h"
#include "rules/sitetable.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <algorithm>

namespace hmirules {

namespace {

constexpr int keysUnderTwoWildcards = 3; // the name, any module, any popup

/** Finds popups that are under two wildcards which say different things. */
class OverlapCheck
{
public:
    explicit OverlapCheck(Findings *findings)
        : m_findings(findings), m_base(findings->base()), m_table(m_base),
          m_unnamed(unnamedPopup(m_base))
    {
        int number = 0;
        for (const Site &site : m_base.sites()) {
            m_byTarget[site.target].push_back(number++);
        }
    }

    void run()
    {
        QStringList names = namesIn(m_base) + m_findings->inventory().popupNames();
        names.removeDuplicates();
        for (const QString &name : names) {
            const QStringList keys = keysOf(name);
            if (!name.contains('*') && keys.size() == keysUnderTwoWildcards) {
                checkTargets(name, keys.at(1), keys.at(2));
                checkDefaults(name, keys.at(1), keys.at(2));
            }
        }
    }

private:
    void checkTargets(const QString &name, const QString &anyModule, const QString &anyPopup)
    {
        for (const int number : m_byTarget.value(anyModule)) {
            const QString &entry = m_base.site(number).popup;
            if (m_base.decision(entry, name).site == number) {
                compare(name, number, m_base.decision(entry, anyPopup),
                        m_table.rulesOf(entry, anyPopup));
            }
        }
    }

    void checkDefaults(const QString &name, const QString &anyModule, const QString &anyPopup)
    {
        const int number = m_base.decision(name, m_unnamed).site;
        if (number >= 0 && m_base.site(number).popup == anyModule) {
            compare(name, number, m_base.decision(anyPopup, m_unnamed),
                    m_table.sitesOf(anyPopup, Site::Default));
        }
    }

    void compare(const QString &name, int winner, const Decision &other,
                 const std::vector<int> &candidates)
    {
        const Site &site = m_base.site(winner);
        const bool isOther =
            std::find(candidates.cbegin(), candidates.cend(), other.site) != candidates.cend();
        const QPair<int, int> pair(winner, other.site);
        if (!isOther || other.behavior == HmiStateMachine::behaviorFromString(site.text)
            || m_reported.contains(pair)) {
            return;
        }
        m_reported.insert(pair);
        const Site &loser = m_base.site(other.site);
        const bool isRule = site.kind == Site::Rule;
        m_findings->add(
            "overlapping-wildcards", loser.place,
            QString(R"("%1" is also under "%2", which goes before "%3")")
                .arg(name, isRule ? site.target : site.popup, isRule ? loser.target : loser.popup),
            {{site.place, site.text + " decides"}});
    }

    Findings *m_findings;
    const RuleBase &m_base;
    SiteTable m_table;
    QString m_unnamed;
    QHash<QString, std::vector<int>> m_byTarget;
    QSet<QPair<int, int>> m_reported;
};

} // namespace

void checkOverlaps(Findings *findings)
{
    OverlapCheck(findings).run();
}

} // namespace hmirules
