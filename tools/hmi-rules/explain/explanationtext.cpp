#include "explanationtext.h"

#include "report/sitetext.h"
#include "report/visible.h"
#include "rules/libraryfacts.h"

#include <HmiStateMachine/popup/popupstate.h>

#include <algorithm>

using HmiStateMachine::PopupState;

namespace hmirules {

namespace {

constexpr char whenInFront[] = "Not asked while it is in front: it is given the new data. Asked "
                               "when it is stacked, see below.";

/** Writes the parts of an explanation one below the other. */
class TextWriter
{
public:
    TextWriter(const RuleBase &base, const Paint &paint) : m_base(base), m_paint(paint) { }

    QString take() { return std::move(m_text); }

    void writeDecision(const Explanation &explanation)
    {
        const int behavior = explanation.decision.behavior;
        line(QString(R"("%1" is in front, "%2" is requested: %3)")
                 .arg(visible(explanation.front), visible(explanation.requested),
                      m_paint.behavior(behavior, m_paint.bold(behaviorText(behavior)))));
        line("    "
             + (explanation.front == explanation.requested ? QString(whenInFront)
                                                           : effectText(behavior) + '.'));
        line("Decided by: " + reasonText(m_base, explanation.decision));
        writePlace(explanation.decision.site);
    }

    void writeKeys(const QString &title, const std::vector<KeyTried> &keys, const QString &nothing)
    {
        line(QString());
        line(m_paint.bold(title));
        int width = 0;
        for (const KeyTried &key : keys) {
            width = std::max(width, visible(key.key).size());
        }
        for (const KeyTried &key : keys) {
            const QString what = key.sites.empty() ? nothing : summary(key.sites);
            line(QString("  ") + (key.isTaken ? '*' : ' ') + ' '
                 + visible(key.key).leftJustified(width) + "  " + what);
        }
    }

    void writeHidden(const std::vector<HiddenSite> &hidden)
    {
        if (hidden.empty()) {
            return;
        }
        line(QString());
        line(m_paint.bold("Hidden"));
        for (const HiddenSite &site : hidden) {
            line(QString("    %1: %2").arg(describe(site.site), site.reason));
        }
    }

    void writeStacked(const Explanation &explanation)
    {
        line(QString());
        line(QString(R"(While "%1" is stacked, it %2 "%3"%4)")
                 .arg(visible(explanation.front),
                      explanation.whileStacked == PopupState::Prohibit ? "refuses" : "lets through",
                      visible(explanation.requested),
                      explanation.whileStacked == PopupState::Prohibit ? ", and nothing is logged."
                                                                       : "."));
    }

    void writeBlocking(const BlockingExplanation &blocking)
    {
        const bool byDomain = blocking.kind == Site::DomainBlacklist;
        line(QString());
        line(QString(R"("%1" is %2 %3 "%4")")
                 .arg(visible(blocking.popupViewId),
                      m_paint.bold(blocking.blocking.isBlocked ? "blocked" : "not blocked"),
                      byDomain ? "in the domain" : "by the view", visible(blocking.where)));
        if (blocking.blocking.isBlocked) {
            line(byDomain
                     ? "    A request is refused there, and a shown popup is hidden while the "
                       "domain is active."
                     : "    A shown popup is hidden when the view becomes active; requests are not "
                       "affected.");
        }
        line("Decided by: "
             + (blocking.blocking.site < 0 ? QString("no list")
                                           : siteText(m_base.site(blocking.blocking.site))));
        writePlace(blocking.blocking.site);
        writeKeys("Lists tried, the first that there is counts alone", blocking.keys, "no list");
        writeHidden(blocking.hidden);
    }

private:
    void line(const QString &text) { m_text += text + '\n'; }

    void writePlace(int site)
    {
        if (site >= 0) {
            line("    " + sitePlace(m_base, m_base.site(site)) + ", at "
                 + m_base.site(site).place.pointer);
        }
    }

    static QString says(const Site &site)
    {
        return visible(site.names.isEmpty() ? site.text : site.names.join(", "));
    }

    QString summary(const std::vector<int> &sites) const
    {
        const Site &first = m_base.site(sites.front());
        const QString place = sitePlace(m_base, first);
        if (sites.size() > 1) {
            return QString("%1 rules, the first at %2").arg(sites.size()).arg(place);
        }
        return says(first) + " at " + place;
    }

    QString describe(int number) const
    {
        const Site &site = m_base.site(number);
        return QString("%1 by the %2 at %3")
            .arg(says(site), siteText(site), sitePlace(m_base, site));
    }

    const RuleBase &m_base;
    const Paint &m_paint;
    QString m_text;
};

} // namespace

QString explanationAsText(const RuleBase &base, const Explanation &explanation,
                          const std::vector<BlockingExplanation> &blocking, const Paint &paint)
{
    TextWriter writer(base, paint);
    writer.writeDecision(explanation);
    writer.writeKeys("Entries tried for the popup in front, the first with rules is searched alone",
                     explanation.ruleKeys, "no rules");
    if (!explanation.targetKeys.empty()) {
        writer.writeKeys("Targets tried in that entry, the first that there is decides",
                         explanation.targetKeys, "no rule");
    }
    writer.writeKeys("Defaults tried, where no rule decides", explanation.defaultKeys,
                     "no default");
    writer.writeHidden(explanation.hidden);
    writer.writeStacked(explanation);
    for (const BlockingExplanation &part : blocking) {
        writer.writeBlocking(part);
    }
    return writer.take();
}

} // namespace hmirules
