#include "checks.h"
#include "guess.h"

#include "rules/libraryfacts.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QSet>

namespace hmirules {

namespace {

const QStringList entryKeys = {"popup", "interruptions", "default", "domainBlacklist",
                               "viewBlacklist"};
const QStringList ruleKeys = {"target", "behavior"};

// A key as part of a JSON pointer.
QString escaped(QString key)
{
    return key.replace('~', "~0").replace('/', "~1");
}

/** Checks one file. */
class ShapeCheck
{
public:
    ShapeCheck(const RuleFile &file, Findings *findings) : m_file(file), m_findings(findings) { }

    void run()
    {
        const JsonNode &root = m_file.root();
        if (root.type != JsonNode::Array) {
            m_findings->add("not-an-array", m_file.place(QString(), root),
                            "expected an array of entries, found " + typeText(root.type));
            return;
        }
        int index = 0;
        for (const JsonNode &entry : root.items) {
            checkEntry(entry, QString("/%1").arg(index++));
        }
    }

private:
    void checkEntry(const JsonNode &entry, const QString &pointer)
    {
        checkKeys(entry, entryKeys, pointer);
        if (entry.string("popup").isEmpty()) {
            return; // the library passes over the rest
        }
        checkRules(entry, pointer);
        checkDefault(entry, pointer);
        const bool hasDomains = checkBlacklist(entry, "domainBlacklist", pointer);
        const bool hasViews = checkBlacklist(entry, "viewBlacklist", pointer);
        if (!entry.value("interruptions") && !entry.value("default") && !hasDomains && !hasViews) {
            m_findings->add("empty-entry", m_file.place(pointer, entry),
                            "the entry for \"" + entry.string("popup") + "\" says nothing");
        }
    }

    void checkKeys(const JsonNode &object, const QStringList &known, const QString &pointer)
    {
        QHash<QString, int> begins;
        for (const JsonMember &member : object.members) {
            const Place place = m_file.place(pointer + '/' + escaped(member.key), member.begin);
            if (!known.contains(member.key)) {
                m_findings->add("unknown-key", place,
                                "unknown key \"" + member.key + '"'
                                    + didYouMean(member.key, known));
            } else if (begins.contains(member.key)) {
                m_findings->add(
                    "duplicate-key", place, "the key \"" + member.key + "\" again",
                    {{m_file.place(place.pointer, begins.value(member.key)), "this one is lost"}});
            }
            begins.insert(member.key, member.begin);
        }
    }

    void checkRules(const JsonNode &entry, const QString &pointer)
    {
        const JsonNode *rules = entry.value("interruptions");
        if (!rules) {
            return;
        }
        const QString rulesPointer = pointer + "/interruptions";
        if (rules->type != JsonNode::Array) {
            m_findings->add("invalid-interruptions", m_file.place(rulesPointer, *rules),
                            "expected an array of rules, found " + typeText(rules->type));
        } else if (rules->items.empty()) {
            m_findings->add("empty-interruptions", m_file.place(rulesPointer, *rules),
                            "an empty list of rules of \"" + entry.string("popup") + '"');
        }
        int index = 0;
        for (const JsonNode &rule : rules->items) {
            checkKeys(rule, ruleKeys, QString("%1/%2").arg(rulesPointer).arg(index++));
        }
    }

    void checkDefault(const JsonNode &entry, const QString &pointer)
    {
        const JsonNode *value = entry.value("default");
        if (!value || HmiStateMachine::behaviorFromString(value->text) >= 0) {
            return;
        }
        const QString found =
            value->type == JsonNode::String ? '"' + value->text + '"' : typeText(value->type);
        m_findings->add(
            "invalid-default", m_file.place(pointer + "/default", *value),
            "expected a behaviour, found " + found
                + didYouMean(value->text, {"Prohibit", "Allow", "AllowStack", "AllowNoReturn"}));
    }

    // Returns whether there is anything to say about the list, be it an effect or a fault.
    bool checkBlacklist(const JsonNode &entry, const char *key, const QString &pointer)
    {
        const JsonNode *list = entry.value(key);
        if (!list) {
            return false;
        }
        const QString listPointer = pointer + '/' + key;
        if (list->type != JsonNode::Array) {
            m_findings->add("invalid-blacklist", m_file.place(listPointer, *list),
                            "expected an array of texts, found " + typeText(list->type));
        } else if (list->items.empty()) {
            m_findings->add("empty-blacklist", m_file.place(listPointer, *list),
                            QString("the %1 of \"%2\" is empty").arg(key, entry.string("popup")));
        }
        int index = 0;
        for (const JsonNode &item : list->items) {
            if (item.type != JsonNode::String) {
                m_findings->add("invalid-blacklist",
                                m_file.place(QString("%1/%2").arg(listPointer).arg(index), item),
                                "expected a text in the blacklist, found " + typeText(item.type));
            }
            ++index;
        }
        return true;
    }

    const RuleFile &m_file;
    Findings *m_findings;
};

} // namespace

void checkShape(Findings *findings)
{
    for (const int number : findings->files()) {
        ShapeCheck(findings->file(number), findings).run();
    }
}

} // namespace hmirules
