#include "checks.h"
#include "guess.h"

#include "rules/libraryfacts.h"
#include "rules/names.h"
#include "rules/sitetable.h"

#include <algorithm>

namespace hmirules {

namespace {

/** All that popups are looked up under, and which they are. */
class Population
{
public:
    explicit Population(const QStringList &popups) : m_popups(popups)
    {
        for (const QString &popup : popups) {
            for (const QString &key : keysOf(popup)) {
                m_byKey[key].append(popup);
                if (isWildcard(key)) {
                    m_wildcards.append(key);
                }
            }
        }
        m_wildcards.removeDuplicates();
    }

    const QStringList &popups() const { return m_popups; }
    const QStringList &wildcards() const { return m_wildcards; }
    bool hasAny(const QString &pattern) const { return m_byKey.contains(pattern); }
    QStringList matching(const QString &pattern) const { return m_byKey.value(pattern); }

private:
    QStringList m_popups;
    QStringList m_wildcards; ///< under which there are popups
    QHash<QString, QStringList> m_byKey;
};

/** Compares the popups of the files with those of the inventory. */
class PopupCheck
{
public:
    explicit PopupCheck(Findings *findings)
        : m_findings(findings), m_base(findings->base()), m_table(m_base),
          m_names(findings->inventory().popupNames()),
          m_viewIds(findings->inventory().popupViewIds())
    {
    }

    void run()
    {
        for (const int number : m_findings->files()) {
            for (const NameUse &use : namesIn(m_findings->file(number))) {
                checkName(use);
            }
        }
        for (int number = 0; number < static_cast<int>(m_base.sites().size()); ++number) {
            checkReach(number);
        }
        for (const QString &popup : m_names.popups()) {
            checkMentioned(popup);
        }
    }

private:
    void checkName(const NameUse &use)
    {
        const bool isName = m_names.hasAny(use.name);
        const bool isViewId = m_viewIds.hasAny(use.name);
        if (!isName && !isViewId) {
            reportUnknown(use);
        } else if (!isName && decidesBehavior(use)) {
            reportViewId(use);
        } else if (use.role == NameUse::Entry) {
            reportMissed(use);
        }
    }

    bool decidesBehavior(const NameUse &use) const
    {
        return use.role == NameUse::Target || !m_table.sitesOf(use.name, Site::Rule).empty()
            || !m_table.sitesOf(use.name, Site::Default).empty();
    }

    bool hasList(const QString &key, Site::Kind kind) const
    {
        return !m_table.sitesOf(key, kind).empty();
    }

    // Whether a blacklist of an entry is meant for a popup that is looked up elsewhere. Under its
    // popup view id it may have a list in place of a wildcard's.
    bool isMissed(const QString &viewId, const QString &pattern, Site::Kind kind) const
    {
        const QStringList keys = keysOf(viewId);
        const bool hasOther = isWildcard(pattern)
            && std::any_of(keys.cbegin(), keys.cend(),
                           [this, kind](const QString &key) { return hasList(key, kind); });
        return hasList(pattern, kind) && !matches(pattern, viewId) && !hasOther;
    }

    void reportMissed(const NameUse &use)
    {
        QStringList missed;
        for (const QString &name : m_names.matching(use.name)) {
            const QString viewId = m_findings->inventory().viewIdOf(name);
            if (isMissed(viewId, use.name, Site::DomainBlacklist)
                || isMissed(viewId, use.name, Site::ViewBlacklist)) {
                missed.append(QString(R"("%1" (popup view id "%2"))").arg(name, viewId));
            }
        }
        if (!missed.isEmpty()) {
            m_findings->add("name-for-view-id", use.place,
                            QString(R"(the blacklist of "%1" does not block %2)")
                                .arg(use.name, missed.join(", ")));
        }
    }

    void reportUnknown(const NameUse &use)
    {
        if (isWildcard(use.name)) {
            m_findings->add("never-matches", use.place,
                            "no popup of the inventory is under \"" + use.name + '"'
                                + didYouMean(use.name, m_names.wildcards()),
                            {}, "Correct the wildcard, or the inventory.");
        } else if (!use.name.contains('*')) { // otherwise that has been told
            m_findings->add("unknown-popup", use.place,
                            "no popup \"" + use.name + "\" is in the inventory"
                                + didYouMean(use.name, m_names.popups() + m_viewIds.popups()));
        }
    }

    void reportViewId(const NameUse &use)
    {
        QStringList names;
        for (const Inventory::Popup &popup : m_findings->inventory().popups) {
            if (matches(use.name, popup.viewId)) {
                names.append(popup.name);
            }
        }
        m_findings->add("view-id-for-name", use.place,
                        QString("\"%1\" is the popup view id of \"%2\"; rules go by the name")
                            .arg(use.name, names.join("\", \"")));
    }

    // A rule that something takes the place of is reported as such.
    void checkReach(int number)
    {
        const Site &rule = m_base.site(number);
        if (rule.kind != Site::Rule || m_base.decision(rule.popup, rule.target).site != number) {
            return;
        }
        const bool hasPairs = (m_names.hasAny(rule.popup) && m_names.hasAny(rule.target))
            || (m_viewIds.hasAny(rule.popup) && m_viewIds.hasAny(rule.target));
        if (hasPairs && !decidesIn(m_names, number) && !decidesIn(m_viewIds, number)) {
            m_findings->add("unreachable-rule", rule.place,
                            QString("the rule of \"%1\" for \"%2\" decides for no two popups of "
                                    "the inventory")
                                .arg(rule.popup, rule.target),
                            deciding(rule));
        }
    }

    bool decidesIn(const Population &population, int number) const
    {
        const Site &rule = m_base.site(number);
        const QStringList requested = population.matching(rule.target);
        const QStringList fronts = population.matching(rule.popup);
        return std::any_of(fronts.cbegin(), fronts.cend(), [&](const QString &front) {
            return std::any_of(requested.cbegin(), requested.cend(), [&](const QString &popup) {
                return m_base.decision(front, popup).site == number;
            });
        });
    }

    // What decides in its place, each with the first pair for which it does.
    std::vector<Related> deciding(const Site &rule) const
    {
        std::vector<Related> related;
        QSet<int> told = {-1};
        const QStringList fronts = m_names.matching(rule.popup);
        const QStringList requested = m_names.matching(rule.target);
        for (const QString &front : fronts) {
            for (const QString &popup : requested) {
                const int site = m_base.decision(front, popup).site;
                if (!told.contains(site)) {
                    related.push_back(
                        {m_base.site(site).place,
                         QString(R"(this one decides for "%1" in front and "%2" requested)")
                             .arg(front, popup)});
                }
                told.insert(site);
            }
        }
        return related;
    }

    void checkMentioned(const QString &popup)
    {
        QStringList keys = keysOf(popup) + keysOf(m_findings->inventory().viewIdOf(popup));
        const bool mentioned = std::any_of(keys.cbegin(), keys.cend(), [this](const QString &key) {
            return m_table.hasEntry(key);
        });
        if (!mentioned) {
            const int file = static_cast<int>(m_base.files().size()) - 1;
            m_findings->add("popup-without-rule", {file, {}, {}},
                            "no entry is about the popup \"" + popup + '"');
        }
    }

    Findings *m_findings;
    const RuleBase &m_base;
    SiteTable m_table;
    Population m_names;
    Population m_viewIds;
};

// Domains or views of all lists that are not among those that there are.
void checkBlacklists(Site::Kind kind, const QStringList &known, const char *id, const QString &what,
                     Findings *findings)
{
    const QSet<QString> names(known.cbegin(), known.cend());
    for (const Site &site : findings->base().sites()) {
        if (site.kind != kind) {
            continue;
        }
        for (int i = 0; i < site.names.size(); ++i) {
            const QString &name = site.names.at(i);
            if (!names.contains(name)) {
                findings->add(id, site.namePlaces[static_cast<std::size_t>(i)],
                              QString("no %1 \"%2\" is in the inventory").arg(what, name)
                                  + didYouMean(name, known));
            }
        }
    }
}

} // namespace

void checkInventory(Findings *findings)
{
    const Inventory &inventory = findings->inventory();
    if (inventory.hasPopups) {
        PopupCheck(findings).run();
    }
    if (inventory.hasDomains) {
        checkBlacklists(Site::DomainBlacklist, inventory.domains, "unknown-domain", "domain",
                        findings);
    }
    if (inventory.hasViews) {
        checkBlacklists(Site::ViewBlacklist, inventory.views, "unknown-view", "view", findings);
    }
}

} // namespace hmirules
