#include "differencetext.h"

#include "report/json.h"
#include "report/sitetext.h"
#include "report/visible.h"
#include "rules/libraryfacts.h"

namespace hmirules {

namespace {

QString why(const RuleBase &base, int site, const QString &nothing)
{
    return site < 0 ? nothing : sitePlace(base, base.site(site)) + ": " + siteText(base.site(site));
}

QString painted(int behavior, const Paint &paint)
{
    return paint.behavior(behavior, behaviorText(behavior));
}

OrderedJson whyAsJson(const RuleBase &base, int number)
{
    if (number < 0) {
        return nullptr;
    }
    const Site &site = base.site(number);
    return {{"text", toJson(siteText(site))},
            {"file", toJson(fileName(base, site.place))},
            {"line", site.place.at.line},
            {"column", site.place.at.column},
            {"pointer", toJson(site.place.pointer)}};
}

OrderedJson decisionAsJson(const RuleBase &base, const Decision &decision)
{
    return {{"behavior", toJson(behaviorText(decision.behavior))},
            {"decidedBy", whyAsJson(base, decision.site)}};
}

OrderedJson blockingAsJson(const RuleBase &base, const Blocking &blocking)
{
    return {{"blocked", blocking.isBlocked}, {"decidedBy", whyAsJson(base, blocking.site)}};
}

} // namespace

QString differenceAsText(const RuleBase &before, const RuleBase &after,
                         const Difference &difference, const Paint &paint)
{
    const QString noRule = "no rule and no default";
    QString text;
    QString front;
    for (const ChangedDecision &change : difference.decisions) {
        if (change.front != front) {
            front = change.front;
            text += paint.bold('"' + visible(front) + "\" in front") + '\n';
        }
        text += QString("    \"%1\" requested: %2 -> %3\n")
                    .arg(visible(change.requested), painted(change.before.behavior, paint),
                         painted(change.after.behavior, paint));
        text += "        was " + why(before, change.before.site, noRule) + '\n';
        text += "        is " + why(after, change.after.site, noRule) + '\n';
    }
    for (const ChangedBlocking &change : difference.blockings) {
        text += QString("\"%1\" %2 %3 \"%4\"\n")
                    .arg(visible(change.popupViewId),
                         change.after.isBlocked ? "is now blocked" : "is no longer blocked",
                         change.kind == Site::DomainBlacklist ? "in the domain" : "by the view",
                         visible(change.where));
        text += "        was " + why(before, change.before.site, "no list") + '\n';
        text += "        is " + why(after, change.after.site, "no list") + '\n';
    }
    return text;
}

QString differenceAsJson(const RuleBase &before, const RuleBase &after,
                         const Difference &difference)
{
    OrderedJson json = {{"decisions", OrderedJson::array()}, {"blocking", OrderedJson::array()}};
    for (const ChangedDecision &change : difference.decisions) {
        json["decisions"].push_back({{"front", toJson(change.front)},
                                     {"requested", toJson(change.requested)},
                                     {"before", decisionAsJson(before, change.before)},
                                     {"after", decisionAsJson(after, change.after)}});
    }
    for (const ChangedBlocking &change : difference.blockings) {
        const bool byDomain = change.kind == Site::DomainBlacklist;
        json["blocking"].push_back({{"popupViewId", toJson(change.popupViewId)},
                                    {byDomain ? "domain" : "view", toJson(change.where)},
                                    {"before", blockingAsJson(before, change.before)},
                                    {"after", blockingAsJson(after, change.after)}});
    }
    return dump(json);
}

} // namespace hmirules
