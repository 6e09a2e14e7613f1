#pragma once

#include "lint/finding.h"
#include "paint.h"

namespace hmirules {

/** A place with the name of its file. */
struct NamedPlace
{
    QString file;
    TextPosition at;
    QString pointer;
    QString message; ///< of another place that a finding is about
};

struct ReportedFinding
{
    const FindingKind *kind = nullptr;
    NamedPlace place;
    QString message;
    QString remedy;
    std::vector<NamedPlace> related;
};

/** What came of checking some files. */
struct LintReport
{
    QStringList files;
    std::vector<ReportedFinding> findings;
    std::vector<Fault> unusable; ///< why files could not be checked

    void add(const RuleBase &base, const std::vector<Finding> &found);
    int count(Severity severity) const;
};

QString lintReportAsText(const LintReport &report, const Paint &paint);
QString lintReportAsJson(const LintReport &report);

/** SARIF 2.1.0, which editors and services of continuous integration read. */
QString lintReportAsSarif(const LintReport &report);

} // namespace hmirules
