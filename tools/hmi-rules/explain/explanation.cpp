#include "explanation.h"

#include "rules/libraryfacts.h"
#include "rules/names.h"

#include <algorithm>

namespace hmirules {

namespace {

// Of what stands under a key more than once only that counts which takes the place of the others.
std::vector<int> counting(const std::vector<int> &sites, int winner)
{
    const bool has = std::find(sites.cbegin(), sites.cend(), winner) != sites.cend();
    return has ? std::vector<int>{winner} : std::vector<int>();
}

void markTaken(std::vector<KeyTried> *keys)
{
    const auto taken = std::find_if(keys->begin(), keys->end(),
                                    [](const KeyTried &key) { return !key.sites.empty(); });
    if (taken != keys->end()) {
        taken->isTaken = true;
    }
}

QString keyTaken(const std::vector<KeyTried> &keys)
{
    const auto taken =
        std::find_if(keys.cbegin(), keys.cend(), [](const KeyTried &key) { return key.isTaken; });
    return taken == keys.cend() ? QString() : taken->key;
}

/** Puts one explanation together, from the store's answers under each key by itself. */
class Explainer
{
public:
    Explainer(const RuleBase &base, const QString &front, const QString &requested)
        : m_base(base), m_table(base), m_unnamed(unnamedPopup(base))
    {
        m_result.front = front;
        m_result.requested = requested;
        m_result.decision = base.decision(front, requested);
    }

    Explanation explain()
    {
        for (const QString &key : keysOf(m_result.front)) {
            m_result.ruleKeys.push_back({key, m_table.sitesOf(key, Site::Rule), false});
            m_result.defaultKeys.push_back({key, defaultOf(key), false});
        }
        markTaken(&m_result.ruleKeys);
        markTaken(&m_result.defaultKeys);
        const QString entry = keyTaken(m_result.ruleKeys);
        if (!entry.isEmpty()) {
            for (const QString &key : keysOf(m_result.requested)) {
                m_result.targetKeys.push_back({key, ruleOf(entry, key), false});
            }
            markTaken(&m_result.targetKeys);
        }
        addHiddenRules(entry);
        addHiddenDefaults();
        return std::move(m_result);
    }

private:
    std::vector<int> defaultOf(const QString &key) const
    {
        return counting(m_table.sitesOf(key, Site::Default), m_base.decision(key, m_unnamed).site);
    }

    std::vector<int> ruleOf(const QString &key, const QString &target) const
    {
        return counting(m_table.rulesOf(key, target), m_base.decision(key, target).site);
    }

    void addHiddenRules(const QString &entry)
    {
        for (const QString &key : keysOf(m_result.front)) {
            const QString reason = key == entry
                ? QString("a more exact target decides")
                : "rules of \"" + key + "\" are not asked: \"" + entry + "\" has rules";
            for (const QString &target : keysOf(m_result.requested)) {
                hide(ruleOf(key, target), reason);
            }
        }
    }

    void addHiddenDefaults()
    {
        const bool byRule =
            m_result.decision.site >= 0 && m_base.site(m_result.decision.site).kind == Site::Rule;
        for (const KeyTried &key : m_result.defaultKeys) {
            hide(key.sites, byRule ? "a rule decides" : "a more exact entry has a default");
        }
    }

    void hide(const std::vector<int> &sites, const QString &reason)
    {
        for (const int site : sites) {
            if (site != m_result.decision.site) {
                m_result.hidden.push_back({site, reason});
            }
        }
    }

    const RuleBase &m_base;
    SiteTable m_table;
    QString m_unnamed;
    Explanation m_result;
};

} // namespace

Explanation explain(const RuleBase &base, const Inventory &inventory, const QString &front,
                    const QString &requested)
{
    Explanation explanation = Explainer(base, front, requested).explain();
    // Stacked popups are looked up by their popup view ids.
    explanation.whileStacked =
        base.behavior(inventory.viewIdOf(front), inventory.viewIdOf(requested));
    return explanation;
}

BlockingExplanation explainBlocking(const RuleBase &base, const QString &popupViewId,
                                    const QString &where, Site::Kind kind)
{
    const auto ask = [&base, &where, kind](const QString &id) {
        return kind == Site::DomainBlacklist ? base.blockingByDomain(id, where)
                                             : base.blockingByView(id, where);
    };
    const SiteTable table(base);
    BlockingExplanation result = {popupViewId, where, kind, ask(popupViewId), {}, {}};
    for (const QString &key : keysOf(popupViewId)) {
        result.keys.push_back({key, counting(table.sitesOf(key, kind), ask(key).site), false});
    }
    markTaken(&result.keys);
    for (const KeyTried &key : result.keys) {
        if (!key.isTaken && !key.sites.empty()) {
            result.hidden.push_back({key.sites.front(), "a more exact entry has a list"});
        }
    }
    return result;
}

} // namespace hmirules
