#include "checks.h"

#include "rules/libraryfacts.h"
#include "rules/names.h"
#include "rules/sitetable.h"

#include <HmiStateMachine/popup/popupstate.h>

#include <algorithm>

using HmiStateMachine::PopupState;

namespace hmirules {

namespace {

bool isRule(const RuleBase &base, const Decision &decision)
{
    return decision.site >= 0 && base.site(decision.site).kind == Site::Rule;
}

// Whether the rule that answers the other way round lets the first popup return as well. What a
// default allows is not meant for this pair, so that two rules must say it.
void checkMutual(const RuleBase &base, int number, QSet<QPair<int, int>> *reported,
                 Findings *findings)
{
    const Site &rule = base.site(number);
    const Decision there = base.decision(rule.popup, rule.target);
    const Decision back = base.decision(rule.target, rule.popup);
    const bool isSelf = rule.popup == rule.target && !isWildcard(rule.popup);
    if (there.site != number || there.behavior != PopupState::Allow || isSelf || !isRule(base, back)
        || back.behavior != PopupState::Allow) {
        return;
    }
    const QPair<int, int> pair(std::min(number, back.site), std::max(number, back.site));
    if (reported->contains(pair)) {
        return;
    }
    reported->insert(pair);
    const Site &later = base.site(pair.second);
    std::vector<Related> related;
    if (pair.first != pair.second) {
        related.push_back({base.site(pair.first).place, "the rule for the other direction"});
    }
    findings->add(
        "mutual-allow", later.place,
        rule.popup == rule.target
            ? QString(R"(any two popups of "%1" interrupt each other)").arg(rule.popup)
            : QString(R"("%1" and "%2" interrupt each other)").arg(later.popup, later.target),
        related);
}

/** Finds popups that may be stacked and then stand in their own way. */
class ReturnCheck
{
public:
    explicit ReturnCheck(Findings *findings)
        : m_findings(findings), m_base(findings->base()), m_table(m_base),
          m_unnamed(unnamedPopup(m_base))
    {
    }

    void run()
    {
        const Inventory &inventory = m_findings->inventory();
        const QStringList names = inventory.hasPopups ? inventory.popupNames() : namesIn(m_base);
        for (const QString &name : names) {
            const QString viewId = inventory.viewIdOf(name);
            const Decision toItself = m_base.decision(viewId, viewId);
            const Decision stacking = findStacking(name);
            if (toItself.behavior == PopupState::Prohibit && stacking.site >= 0
                && !m_reported.contains(toItself.site)) {
                m_reported.insert(toItself.site);
                const Site &site = m_base.site(toItself.site);
                m_findings->add("refuses-own-return", site.place, message(name, viewId),
                                {{m_base.site(stacking.site).place, "AllowStack stacks it"}},
                                remedy(viewId, site));
            }
        }
    }

private:
    static QString message(const QString &name, const QString &viewId)
    {
        return name == viewId
            ? QString(R"("%1" can be stacked, and then prohibits its own return)").arg(name)
            : QString(R"("%1" can be stacked, and then prohibits its own return as "%2")")
                  .arg(name, viewId);
    }

    QString remedy(const QString &viewId, const Site &site) const
    {
        QString text = QString(R"({ "target": "%1", "behavior": "Allow" })").arg(viewId);
        if (site.popup != viewId) {
            text = QString(R"(Give "%1" an entry with the rule %2, and repeat there the rules of )"
                           R"("%3" that it needs.)")
                       .arg(viewId, text, site.popup);
        } else if (site.target == viewId) {
            text = R"(Write "Allow" in this rule.)";
        } else {
            text = QString(R"(Add the rule %1 to the entry "%2".)").arg(text, site.popup);
        }
        return m_findings->inventory().hasPopups ? text
                                                 : text
                + " No need to where its popup view id is not its name: tell that in an "
                  "inventory.";
    }

    // A decision by which a popup in front is stacked; without a site when there is none.
    Decision findStacking(const QString &popup) const
    {
        QStringList targets = {m_unnamed};
        for (const QString &key : keysOf(popup)) {
            for (const int number : m_table.sitesOf(key, Site::Rule)) {
                targets.append(m_base.site(number).target);
            }
        }
        for (const QString &target : targets) {
            const Decision decision = m_base.decision(popup, target);
            if (decision.behavior == PopupState::AllowStack && target != popup) {
                return decision;
            }
        }
        return Decision();
    }

    Findings *m_findings;
    const RuleBase &m_base;
    SiteTable m_table;
    QString m_unnamed;
    QSet<int> m_reported;
};

} // namespace

void checkDecisions(Findings *findings)
{
    const RuleBase &base = findings->base();
    QSet<QPair<int, int>> reported;
    for (int number = 0; number < static_cast<int>(base.sites().size()); ++number) {
        if (base.site(number).kind == Site::Rule) {
            checkMutual(base, number, &reported, findings);
        }
    }
    ReturnCheck(findings).run();
}

} // namespace hmirules
