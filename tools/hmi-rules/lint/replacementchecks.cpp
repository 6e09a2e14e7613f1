#include "checks.h"

#include "rules/libraryfacts.h"
#include "rules/names.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QHash>

namespace hmirules {

namespace {

/** Finds what takes the place of something earlier, by asking who decides. */
class ReplacementCheck
{
public:
    explicit ReplacementCheck(Findings *findings)
        : m_findings(findings), m_base(findings->base()), m_unnamed(unnamedPopup(m_base))
    {
    }

    void run()
    {
        for (int i = 0; i < static_cast<int>(m_base.sites().size()); ++i) {
            const int winner = winnerOver(m_base.site(i));
            if (winner != i) {
                report(m_base.site(i), m_base.site(winner));
            }
        }
        for (const int number : m_findings->files()) {
            reportEntries(m_findings->file(number), number);
        }
    }

private:
    // The site that decides where this one would, were it alone.
    int winnerOver(const Site &site) const
    {
        switch (site.kind) {
        case Site::Rule:
            return m_base.decision(site.popup, site.target).site;
        case Site::Default:
            return m_base.decision(site.popup, m_unnamed).site;
        case Site::DomainBlacklist:
            return m_base.blockingByDomain(site.popup, site.names.first()).site;
        case Site::ViewBlacklist:
            break;
        }
        return m_base.blockingByView(site.popup, site.names.first()).site;
    }

    void report(const Site &lost, const Site &winner)
    {
        const std::vector<Related> related = {{lost.place, "this one is lost"}};
        if (lost.place.file != winner.place.file) {
            // What is loaded before is there to be replaced.
            if (lost.place.file >= m_findings->firstFile() && sayDifferent(lost, winner)) {
                m_findings->add("contradicting-files", winner.place,
                                describe(winner) + " takes the place of " + value(lost)
                                    + " in an earlier file",
                                related);
            }
        } else if (lost.entry == winner.entry) {
            m_findings->add("duplicate-rule", winner.place,
                            describe(winner) + " takes the place of " + value(lost), related);
        } else {
            m_lostTo[{winner.place.file, winner.entry}].push_back(
                {lost.place, describe(lost) + " is lost"});
        }
    }

    static bool sayDifferent(const Site &a, const Site &b)
    {
        return a.names != b.names
            || HmiStateMachine::behaviorFromString(a.text)
            != HmiStateMachine::behaviorFromString(b.text);
    }

    static QString value(const Site &site)
    {
        return site.names.isEmpty() ? site.text : '"' + site.names.join("\", \"") + '"';
    }

    static QString describe(const Site &site)
    {
        switch (site.kind) {
        case Site::Rule:
            return QString("%1 for the target \"%2\" of \"%3\"")
                .arg(site.text, site.target, site.popup);
        case Site::Default:
            return QString("the default %1 of \"%2\"").arg(site.text, site.popup);
        case Site::DomainBlacklist:
            return QString("the domainBlacklist %1 of \"%2\"").arg(value(site), site.popup);
        case Site::ViewBlacklist:
            break;
        }
        return QString("the viewBlacklist %1 of \"%2\"").arg(value(site), site.popup);
    }

    void reportEntries(const RuleFile &file, int number)
    {
        QHash<QString, Place> first;
        for (const NameUse &use : namesIn(file)) {
            if (use.role != NameUse::Entry) {
                continue;
            }
            if (!first.contains(use.name)) {
                first.insert(use.name, use.place);
                continue;
            }
            std::vector<Related> related = {{first.value(use.name), "the first entry"}};
            const std::vector<Related> lost = m_lostTo.value({number, use.entry});
            related.insert(related.end(), lost.begin(), lost.end());
            m_findings->add("duplicate-entry", use.place,
                            "another entry for \"" + use.name + '"'
                                + (lost.empty() ? ", which is joined with the first"
                                                : ", which takes the place of something earlier"),
                            related);
        }
    }

    Findings *m_findings;
    const RuleBase &m_base;
    QString m_unnamed;
    QHash<QPair<int, int>, std::vector<Related>> m_lostTo; ///< by file and entry
};

} // namespace

void checkReplacements(Findings *findings)
{
    ReplacementCheck(findings).run();
}

} // namespace hmirules
