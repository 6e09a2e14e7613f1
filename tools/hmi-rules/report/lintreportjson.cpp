#include "json.h"
#include "lintreport.h"

#include "version.h"

#include <QUrl>

namespace hmirules {

namespace {

// --- plain JSON

OrderedJson placeAsJson(const NamedPlace &place)
{
    OrderedJson json = {{"file", toJson(place.file)}};
    if (place.at.line > 0) {
        json["line"] = place.at.line;
        json["column"] = place.at.column;
        json["pointer"] = toJson(place.pointer);
    }
    return json;
}

OrderedJson findingAsJson(const ReportedFinding &finding)
{
    OrderedJson json = {{"id", toJson(finding.kind->id)},
                        {"severity", toJson(severityText(finding.kind->severity))}};
    json.update(placeAsJson(finding.place));
    json["message"] = toJson(finding.message);
    json["effect"] = toJson(finding.kind->effect);
    json["remedy"] = toJson(finding.remedy);
    json["related"] = OrderedJson::array();
    for (const NamedPlace &place : finding.related) {
        OrderedJson related = placeAsJson(place);
        related["message"] = toJson(place.message);
        json["related"].push_back(related);
    }
    return json;
}

OrderedJson faultAsJson(const Fault &fault)
{
    OrderedJson json = placeAsJson({fault.file, fault.at, QString(), QString()});
    json["message"] = toJson(fault.message);
    json["remedy"] = toJson(fault.remedy);
    return json;
}

// --- SARIF

OrderedJson sarifText(const QString &text)
{
    return {{"text", toJson(text)}};
}

QString sarifLevel(Severity severity)
{
    return severityText(severity); // by chance the same words
}

OrderedJson sarifLocation(const NamedPlace &place)
{
    const QByteArray uri = place.file.startsWith('/') ? QUrl::fromLocalFile(place.file).toEncoded()
                                                      : QUrl::toPercentEncoding(place.file, "/");
    OrderedJson physical = {{"artifactLocation", {{"uri", uri.toStdString()}}}};
    if (place.at.line > 0) {
        physical["region"] = {{"startLine", place.at.line}, {"startColumn", place.at.column}};
    }
    OrderedJson location = {{"physicalLocation", physical}};
    if (!place.pointer.isEmpty()) {
        location["logicalLocations"] = OrderedJson::array(
            {{{"fullyQualifiedName", toJson(place.pointer)}, {"kind", "value"}}});
    }
    if (!place.message.isEmpty()) {
        location["message"] = sarifText(place.message);
    }
    return location;
}

OrderedJson sarifRules()
{
    OrderedJson rules = OrderedJson::array();
    for (const FindingKind &kind : findingKinds()) {
        rules.push_back({{"id", toJson(kind.id)},
                         {"shortDescription", sarifText(kind.title + '.')},
                         {"fullDescription", sarifText(kind.effect)},
                         {"help", sarifText(kind.remedy)},
                         {"defaultConfiguration", {{"level", toJson(sarifLevel(kind.severity))}}}});
    }
    return rules;
}

OrderedJson sarifResult(const ReportedFinding &finding)
{
    const auto index = finding.kind - findingKinds().data();
    OrderedJson result = {{"ruleId", toJson(finding.kind->id)},
                          {"ruleIndex", index},
                          {"level", toJson(sarifLevel(finding.kind->severity))},
                          {"message", sarifText(finding.message + ". " + finding.remedy)},
                          {"locations", OrderedJson::array({sarifLocation(finding.place)})}};
    int id = 0;
    for (const NamedPlace &place : finding.related) {
        OrderedJson location = {{"id", id++}};
        location.update(sarifLocation(place));
        result["relatedLocations"].push_back(location);
    }
    return result;
}

OrderedJson sarifInvocation(const LintReport &report)
{
    OrderedJson invocation = {{"executionSuccessful", report.unusable.empty()},
                              {"toolExecutionNotifications", OrderedJson::array()}};
    for (const Fault &fault : report.unusable) {
        invocation["toolExecutionNotifications"].push_back(
            {{"level", "error"},
             {"message", sarifText(fault.message + ". " + fault.remedy)},
             {"locations",
              OrderedJson::array({sarifLocation({fault.file, fault.at, QString(), QString()})})}});
    }
    return invocation;
}

} // namespace

QString lintReportAsJson(const LintReport &report)
{
    OrderedJson json = {{"tool", "hmi-rules"}, {"version", toolVersion}};
    json["files"] = OrderedJson::array();
    for (const QString &file : report.files) {
        json["files"].push_back(toJson(file));
    }
    json["findings"] = OrderedJson::array();
    for (const ReportedFinding &finding : report.findings) {
        json["findings"].push_back(findingAsJson(finding));
    }
    json["unusable"] = OrderedJson::array();
    for (const Fault &fault : report.unusable) {
        json["unusable"].push_back(faultAsJson(fault));
    }
    return dump(json);
}

QString lintReportAsSarif(const LintReport &report)
{
    OrderedJson results = OrderedJson::array();
    for (const ReportedFinding &finding : report.findings) {
        results.push_back(sarifResult(finding));
    }
    const OrderedJson driver = {
        {"name", "hmi-rules"}, {"version", toolVersion}, {"rules", sarifRules()}};
    const OrderedJson run = {{"tool", {{"driver", driver}}},
                             {"columnKind", "unicodeCodePoints"},
                             {"invocations", OrderedJson::array({sarifInvocation(report)})},
                             {"results", results}};
    return dump({{"$schema", "https://json.schemastore.org/sarif-2.1.0.json"},
                 {"version", "2.1.0"},
                 {"runs", OrderedJson::array({run})}});
}

} // namespace hmirules
