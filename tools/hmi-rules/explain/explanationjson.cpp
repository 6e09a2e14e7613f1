#include "explanationtext.h"

#include "report/json.h"
#include "report/sitetext.h"
#include "rules/libraryfacts.h"

namespace hmirules {

namespace {

OrderedJson siteAsJson(const RuleBase &base, int number)
{
    if (number < 0) {
        return nullptr;
    }
    const Site &site = base.site(number);
    OrderedJson json = {{"text", toJson(siteText(site))}};
    if (site.names.isEmpty()) {
        json["behavior"] = toJson(site.text);
    } else {
        for (const QString &name : site.names) {
            json["names"].push_back(toJson(name));
        }
    }
    json["file"] = toJson(fileName(base, site.place));
    json["line"] = site.place.at.line;
    json["column"] = site.place.at.column;
    json["pointer"] = toJson(site.place.pointer);
    return json;
}

OrderedJson keysAsJson(const RuleBase &base, const std::vector<KeyTried> &keys)
{
    OrderedJson json = OrderedJson::array();
    for (const KeyTried &key : keys) {
        OrderedJson sites = OrderedJson::array();
        for (const int site : key.sites) {
            sites.push_back(siteAsJson(base, site));
        }
        json.push_back({{"key", toJson(key.key)}, {"taken", key.isTaken}, {"found", sites}});
    }
    return json;
}

OrderedJson hiddenAsJson(const RuleBase &base, const std::vector<HiddenSite> &hidden)
{
    OrderedJson json = OrderedJson::array();
    for (const HiddenSite &site : hidden) {
        json.push_back({{"hidden", siteAsJson(base, site.site)}, {"reason", toJson(site.reason)}});
    }
    return json;
}

OrderedJson blockingAsJson(const RuleBase &base, const BlockingExplanation &blocking)
{
    return {{"popupViewId", toJson(blocking.popupViewId)},
            {blocking.kind == Site::DomainBlacklist ? "domain" : "view", toJson(blocking.where)},
            {"blocked", blocking.blocking.isBlocked},
            {"decidedBy", siteAsJson(base, blocking.blocking.site)},
            {"lists", keysAsJson(base, blocking.keys)},
            {"hidden", hiddenAsJson(base, blocking.hidden)}};
}

} // namespace

QString explanationAsJson(const RuleBase &base, const Explanation &explanation,
                          const std::vector<BlockingExplanation> &blocking)
{
    OrderedJson json = {{"front", toJson(explanation.front)},
                        {"requested", toJson(explanation.requested)},
                        {"behavior", toJson(behaviorText(explanation.decision.behavior))},
                        {"reason", toJson(reasonText(base, explanation.decision))},
                        {"decidedBy", siteAsJson(base, explanation.decision.site)},
                        {"entries", keysAsJson(base, explanation.ruleKeys)},
                        {"targets", keysAsJson(base, explanation.targetKeys)},
                        {"defaults", keysAsJson(base, explanation.defaultKeys)},
                        {"hidden", hiddenAsJson(base, explanation.hidden)},
                        {"whileStacked", toJson(behaviorText(explanation.whileStacked))}};
    json["blocking"] = OrderedJson::array();
    for (const BlockingExplanation &part : blocking) {
        json["blocking"].push_back(blockingAsJson(base, part));
    }
    return dump(json);
}

} // namespace hmirules
