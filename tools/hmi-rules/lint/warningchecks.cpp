#include "checks.h"
#include "guess.h"

#include "rules/libraryfacts.h"

#include <QRegularExpression>

namespace hmirules {

namespace {

const QStringList behaviors = {"Prohibit", "Allow", "AllowStack", "AllowNoReturn"};

// What stands where a text should: for "expected a behaviour, found ...".
QString found(const JsonNode *node)
{
    if (!node) {
        return "nothing";
    }
    return node->type == JsonNode::String ? '"' + node->text + '"' : typeText(node->type);
}

void addEntry(const RuleFile &file, int index, Findings *findings)
{
    const JsonNode &entry = file.root().items[static_cast<std::size_t>(index)];
    const QString pointer = QString("/%1").arg(index);
    if (entry.type != JsonNode::Object) {
        findings->add("invalid-entry", file.place(pointer, entry),
                      "expected an entry, found " + found(&entry));
        return;
    }
    const JsonNode *popup = entry.value("popup");
    findings->add("missing-popup",
                  popup ? file.place(pointer + "/popup", *popup) : file.place(pointer, entry),
                  "expected the name of a popup, found " + found(popup));
}

void addRule(const RuleFile &file, int index, int ruleIndex, const char *key, const char *id,
             Findings *findings)
{
    const JsonNode &entry = file.root().items[static_cast<std::size_t>(index)];
    const JsonNode &rule = entry.array("interruptions")[static_cast<std::size_t>(ruleIndex)];
    const QString pointer = QString("/%1/interruptions/%2").arg(index).arg(ruleIndex);
    const JsonNode *value = rule.value(key);
    if (rule.type != JsonNode::Object) {
        findings->add(id, file.place(pointer, rule), "expected a rule, found " + found(&rule), {},
                      R"(Write an object: { "target": "car/fuel", "behavior": "Prohibit" }.)");
        return;
    }
    const QString guess = value ? didYouMean(value->text, behaviors) : QString();
    findings->add(
        id, value ? file.place(pointer + '/' + key, *value) : file.place(pointer, rule),
        QString("expected %1, found %2")
                .arg(qstrcmp(key, "target") == 0 ? "the name of a requested popup" : "a behaviour",
                     found(value))
            + (qstrcmp(key, "behavior") == 0 ? guess : QString()));
}

void addWarning(const RuleFile &file, const QString &text, const Place &document,
                Findings *findings)
{
    static const QRegularExpression form(
        "^Popup interruption invalid (source|target|behavior) at index: (\\d+)(?: (\\d+))?\\s*$");
    const QRegularExpressionMatch match = form.match(text);
    const int entry = match.captured(2).toInt();
    const int rule = match.captured(3).toInt();
    if (match.captured(1) == "source") {
        addEntry(file, entry, findings);
    } else if (match.captured(1) == "target") {
        addRule(file, entry, rule, "target", "invalid-target", findings);
    } else if (match.captured(1) == "behavior") {
        addRule(file, entry, rule, "behavior", "invalid-behavior", findings);
    } else {
        findings->add("library-warning", document, "the library warns: " + text);
    }
}

} // namespace

void checkWarnings(Findings *findings)
{
    for (const int number : findings->files()) {
        const RuleFile &file = findings->file(number);
        for (const QString &text : findings->base().warnings().at(number)) {
            addWarning(file, text, {number, {}, {}}, findings);
        }
    }
}

} // namespace hmirules
