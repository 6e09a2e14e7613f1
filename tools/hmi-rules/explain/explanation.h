#pragma once

#include "input/inventory.h"
#include "rules/sitetable.h"

namespace hmirules {

/** A key under which something was looked for. */
struct KeyTried
{
    QString key;
    std::vector<int> sites; ///< what stands under it
    bool isTaken = false; ///< the first of the keys under which there is something
};

/** What would have decided, were it not for something else. */
struct HiddenSite
{
    int site = -1;
    QString reason;
};

/** Why a popup in front answers to a request as it does. */
struct Explanation
{
    QString front;
    QString requested;
    Decision decision;
    std::vector<KeyTried> ruleKeys; ///< of the popup in front, with their rules
    std::vector<KeyTried> targetKeys; ///< of the requested popup, in the entry that is taken
    std::vector<KeyTried> defaultKeys; ///< of the popup in front
    std::vector<HiddenSite> hidden;
    int whileStacked = 0; ///< what the popup in front answers when it is stacked
};

/** Why a popup is blocked in a domain or by a view, or is not. */
struct BlockingExplanation
{
    QString popupViewId;
    QString where; ///< the domain or the view
    Site::Kind kind = Site::DomainBlacklist;
    Blocking blocking;
    std::vector<KeyTried> keys;
    std::vector<HiddenSite> hidden;
};

Explanation explain(const RuleBase &base, const Inventory &inventory, const QString &front,
                    const QString &requested);

BlockingExplanation explainBlocking(const RuleBase &base, const QString &popupViewId,
                                    const QString &where, Site::Kind kind);

} // namespace hmirules
