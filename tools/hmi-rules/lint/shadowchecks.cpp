#include "checks.h"

#include "rules/libraryfacts.h"
#include "rules/names.h"
#include "rules/sitetable.h"

namespace hmirules {

namespace {

/** Finds rules and lists that a popup does not get because it has others. */
class ShadowCheck
{
public:
    explicit ShadowCheck(Findings *findings)
        : m_findings(findings), m_base(findings->base()), m_table(m_base)
    {
    }

    void run()
    {
        for (const QString &name : popups()) {
            checkRules(name);
            checkBlacklist(name, Site::DomainBlacklist);
            checkBlacklist(name, Site::ViewBlacklist);
        }
    }

private:
    QStringList popups() const
    {
        QStringList names = namesIn(m_base) + m_findings->inventory().popupNames();
        names.removeDuplicates();
        return names;
    }

    // Which of its keys decides for a popup, and which others would.
    QStringList keysWith(const QString &popup, Site::Kind kind) const
    {
        QStringList keys;
        for (const QString &key : keysOf(popup)) {
            if (!m_table.sitesOf(key, kind).empty()) {
                keys.append(key);
            }
        }
        return keys;
    }

    void checkRules(const QString &popup)
    {
        const QStringList keys = keysWith(popup, Site::Rule);
        for (const QString &hidden : keys.mid(1)) {
            std::vector<Related> related;
            for (const int number : m_table.sitesOf(hidden, Site::Rule)) {
                addIfLost(popup, number, &related);
            }
            if (!related.empty() && isNew(keys.first(), hidden, Site::Rule)) {
                report("shadowed-wildcard", popup, keys.first(), hidden, Site::Rule, related);
            }
        }
    }

    // A rule is lost when the popup's own entry has none in its place and decides otherwise.
    void addIfLost(const QString &popup, int number, std::vector<Related> *related) const
    {
        const Site &rule = m_base.site(number);
        const Decision meant = m_base.decision(rule.popup, rule.target);
        const Decision made = m_base.decision(popup, rule.target);
        const bool isRestated = made.site >= 0 && m_base.site(made.site).kind == Site::Rule;
        if (meant.site != number || isRestated || made.behavior == meant.behavior) {
            return;
        }
        related->push_back({rule.place,
                            QString("%1 for the target \"%2\" is hidden; \"%3\" answers %4")
                                .arg(rule.text, rule.target, popup, behaviorText(made.behavior))});
    }

    void checkBlacklist(const QString &popup, Site::Kind kind)
    {
        const QStringList keys = keysWith(popup, kind);
        for (const QString &hidden : keys.mid(1)) {
            const Site &list = m_base.site(m_table.sitesOf(hidden, kind).back());
            QStringList lifted;
            for (const QString &name : list.names) {
                const Blocking blocking = kind == Site::DomainBlacklist
                    ? m_base.blockingByDomain(popup, name)
                    : m_base.blockingByView(popup, name);
                if (!blocking.isBlocked) {
                    lifted.append('"' + name + '"');
                }
            }
            if (!lifted.isEmpty() && isNew(keys.first(), hidden, kind)) {
                report("shadowed-blacklist", popup, keys.first(), hidden, kind,
                       {{list.place,
                         QString("\"%1\" is not blocked in %2").arg(popup, lifted.join(", "))}});
            }
        }
    }

    void report(const char *id, const QString &popup, const QString &hiding, const QString &hidden,
                Site::Kind kind, const std::vector<Related> &related)
    {
        const Site &site = m_base.site(m_table.sitesOf(hiding, kind).front());
        const QString what = kind == Site::Rule ? "rules of" : "the blacklist of";
        m_findings->add(id, placeOfEntry(m_findings->file(site.place.file), site.entry),
                        QString("the entry for \"%1\" hides %2 \"%3\"").arg(hiding, what, hidden)
                            + (popup == hiding ? QString() : " for \"" + popup + '"'),
                        related);
    }

    // Many popups may be under the same two wildcards; one of them is told as the example.
    bool isNew(const QString &hiding, const QString &hidden, Site::Kind kind)
    {
        const QStringList pair = {hiding, hidden, QString::number(kind)};
        const bool known = m_reported.contains(pair);
        m_reported.insert(pair);
        return !known;
    }

    Findings *m_findings;
    const RuleBase &m_base;
    SiteTable m_table;
    QSet<QStringList> m_reported;
};

} // namespace

void checkShadows(Findings *findings)
{
    ShadowCheck(findings).run();
}

} // namespace hmirules
