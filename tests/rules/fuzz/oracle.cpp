#include "oracle.h"

#include "diff/difference.h"
#include "explain/explanationtext.h"
#include "lint/linter.h"
#include "matrix/matrixtext.h"
#include "report/lintreport.h"
#include "rules/libraryfacts.h"
#include "rules/names.h"

#include <QJsonDocument>
#include <QJsonParseError>

#include <algorithm>
#include <cstdio>
#include <cstdlib>

using namespace HmiStateMachine;
using namespace hmirules;

namespace {

constexpr int namesAsked = 8; // each pair of them: more cost time for other inputs

QStringList namesToAsk(const RuleBase &base)
{
    return QStringList({"unknown/unknown"}) + namesIn(base).mid(0, namesAsked);
}

bool isJson(const QString &text)
{
    QJsonParseError error;
    QJsonDocument::fromJson(text.toUtf8(), &error);
    return error.error == QJsonParseError::NoError;
}

bool isForTerminals(const QString &text)
{
    return std::all_of(text.cbegin(), text.cend(),
                       [](QChar c) { return c == '\n' || c.category() != QChar::Other_Control; });
}

void checkDecision(const RuleBase &base, const Decision &decision, const QString &front,
                   const QString &requested)
{
    if (decision.site < 0) {
        require(decision.behavior == PopupState::Allow, "without a site it is Allow");
        return;
    }
    const Site &site = base.site(decision.site);
    require(behaviorFromString(site.text) == decision.behavior, "the site says the behaviour");
    require(matches(site.popup, front), "the site is for the popup in front");
    require(site.kind == Site::Default || matches(site.target, requested),
            "the site is for the requested popup");
}

void checkExplanations(const RuleBase &base, const QStringList &names)
{
    for (const QString &name : names) {
        const Explanation explanation = explain(base, Inventory(), names.first(), name);
        const std::vector<BlockingExplanation> blocking = {
            explainBlocking(base, name, name, Site::DomainBlacklist),
            explainBlocking(base, name, name, Site::ViewBlacklist)};
        require(isForTerminals(explanationAsText(base, explanation, blocking, Paint(false))),
                "an explanation is for terminals");
        require(isJson(explanationAsJson(base, explanation, blocking)), "an explanation is JSON");
    }
}

void checkFindings(const RuleBase &base)
{
    LintReport report;
    report.add(base, lint(base, Inventory(), 0, {}));
    require(isForTerminals(lintReportAsText(report, Paint(false))), "findings are for terminals");
    require(isJson(lintReportAsJson(report)), "findings are JSON");
    require(isJson(lintReportAsSarif(report)), "findings are SARIF");
}

} // namespace

void require(bool holds, const char *what)
{
    if (!holds) {
        std::fprintf(stderr, "does not hold: %s\n", what);
        std::abort();
    }
}

void checkAnswers(const RuleBase &base, const PopupInterruptionStore &store)
{
    const QStringList names = namesToAsk(base);
    for (const QString &front : names) {
        for (const QString &requested : names) {
            const Decision decision = base.decision(front, requested);
            require(decision.behavior == store.getInterruptionBehavior(front, requested),
                    "the answer is the store's");
            checkDecision(base, decision, front, requested);
            const Blocking blocking = base.blockingByView(front, requested);
            require(blocking.isBlocked == store.isBlockedByView(front, requested),
                    "blocked as the store has it");
            require(
                !blocking.isBlocked
                    || (blocking.site >= 0 && base.site(blocking.site).names.contains(requested)),
                "the list that blocks has the view");
        }
    }
}

void checkReports(const RuleBase &base)
{
    const QStringList names = namesToAsk(base);
    checkFindings(base);
    checkExplanations(base, names);
    const auto population = populationOf(base, Inventory()).mid(0, namesAsked);
    const Matrix matrix = makeMatrix(base, population);
    require(isForTerminals(matrixAsText(base, matrix, Paint(false))),
            "the matrix is for terminals");
    require(!matrixAsCsv(base, matrix).isEmpty() && !blockingAsCsv(base, matrix).isEmpty(),
            "the matrix has lines");
    require(!matrixAsHtml(base, matrix).isEmpty(), "the matrix is a page");
    const Difference difference = compare(base, base, population);
    require(difference.decisions.empty() && difference.blockings.empty(),
            "nothing differs from itself");
}
