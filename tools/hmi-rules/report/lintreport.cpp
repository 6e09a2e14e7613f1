#include "lintreport.h"

#include "visible.h"

#include <algorithm>

namespace hmirules {

namespace {

NamedPlace named(const RuleBase &base, const Place &place, const QString &message = QString())
{
    const RuleFile &file = base.files()[static_cast<std::size_t>(place.file)];
    return {file.name(), place.at, place.pointer, message};
}

QString plural(int count, const QString &what)
{
    return QString("%1 %2%3").arg(count).arg(what, count == 1 ? "" : "s");
}

QString findingAsText(const ReportedFinding &finding, const Paint &paint)
{
    const Severity severity = finding.kind->severity;
    QString text = QString("%1: %2: %3 [%4]\n")
                       .arg(paint.bold(placeText(finding.place.file, finding.place.at)),
                            paint.severity(severity, severityText(severity)),
                            visible(finding.message), finding.kind->id);
    if (!finding.place.pointer.isEmpty()) {
        text += paint.faint("    at " + visible(finding.place.pointer)) + '\n';
    }
    for (const NamedPlace &place : finding.related) {
        text +=
            QString("    %1: %2\n").arg(placeText(place.file, place.at), visible(place.message));
    }
    return text + "    Remedy: " + visible(finding.remedy) + '\n';
}

} // namespace

void LintReport::add(const RuleBase &base, const std::vector<Finding> &found)
{
    for (const Finding &finding : found) {
        ReportedFinding reported = {
            finding.kind, named(base, finding.place), finding.message, finding.remedy, {}};
        for (const Related &related : finding.related) {
            reported.related.push_back(named(base, related.place, related.message));
        }
        findings.push_back(std::move(reported));
    }
}

int LintReport::count(Severity severity) const
{
    return static_cast<int>(std::count_if(
        findings.cbegin(), findings.cend(),
        [severity](const ReportedFinding &finding) { return finding.kind->severity == severity; }));
}

QString lintReportAsText(const LintReport &report, const Paint &paint)
{
    QString text;
    for (const ReportedFinding &finding : report.findings) {
        text += findingAsText(finding, paint);
    }
    if (report.findings.empty()) {
        return text; // as a compiler has it
    }
    return text
        + QString("%1, %2 and %3 in %4\n")
              .arg(plural(report.count(Severity::Error), "error"),
                   plural(report.count(Severity::Warning), "warning"),
                   plural(report.count(Severity::Note), "note"),
                   plural(report.files.size(), "file"));
}

} // namespace hmirules
