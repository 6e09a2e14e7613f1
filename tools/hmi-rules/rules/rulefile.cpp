#include "rulefile.h"

#include "input/inputfile.h"
#include "input/jsonreader.h"

#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QJsonDocument>

#include <algorithm>

namespace hmirules {

namespace {

// What stands in the log of the target for this text; empty when it is parsed.
QString errorOnTarget(const QByteArray &content)
{
    QJsonParseError error;
    QJsonDocument::fromJson(content, &error);
    return error.error == QJsonParseError::NoError ? QString() : error.errorString();
}

/** Walks a file for what can decide. */
class SiteFinder
{
public:
    explicit SiteFinder(const RuleFile &file) : m_file(file) { }

    std::vector<Site> find()
    {
        for (const JsonNode &entry : m_file.root().items) {
            m_site.popup = entry.string("popup");
            if (!m_site.popup.isEmpty()) {
                findIn(entry, '/' + QString::number(m_site.entry));
            }
            ++m_site.entry;
        }
        return std::move(m_sites);
    }

private:
    void findIn(const JsonNode &entry, const QString &pointer)
    {
        int index = 0;
        for (const JsonNode &rule : entry.array("interruptions")) {
            addRule(rule, QString("%1/interruptions/%2").arg(pointer).arg(index++));
        }
        // Each default counts, also one that is no behaviour.
        if (const JsonNode *value = entry.value("default")) {
            add(Site::Default, *value, *value, pointer + "/default");
        }
        addBlacklist(Site::DomainBlacklist, entry, "domainBlacklist", pointer);
        addBlacklist(Site::ViewBlacklist, entry, "viewBlacklist", pointer);
    }

    void addRule(const JsonNode &rule, const QString &pointer)
    {
        const JsonNode *behavior = rule.value("behavior");
        m_site.target = rule.string("target");
        if (behavior && !m_site.target.isEmpty()
            && HmiStateMachine::behaviorFromString(behavior->text) >= 0) {
            add(Site::Rule, rule, *behavior, pointer);
        }
        m_site.target.clear();
    }

    void addBlacklist(Site::Kind kind, const JsonNode &entry, const char *key,
                      const QString &pointer)
    {
        const JsonNode *first = nullptr;
        int index = 0;
        for (const JsonNode &item : entry.array(key)) {
            const QString itemPointer = QString("%1/%2/%3").arg(pointer, key).arg(index++);
            if (item.type == JsonNode::String) {
                m_site.names.append(item.text);
                m_site.namePlaces.push_back(m_file.place(itemPointer, item));
                first = first ? first : &item;
            }
        }
        if (first) {
            add(kind, *entry.value(key), *first, pointer + '/' + key);
        }
        m_site.names.clear();
        m_site.namePlaces.clear();
    }

    void add(Site::Kind kind, const JsonNode &where, const JsonNode &value, const QString &pointer)
    {
        Site site = m_site;
        site.kind = kind;
        site.place = m_file.place(pointer, where);
        site.text = value.text;
        site.begin = value.begin;
        site.end = value.end;
        m_sites.push_back(std::move(site));
    }

    const RuleFile &m_file;
    Site m_site;
    std::vector<Site> m_sites;
};

} // namespace

bool RuleFile::read(const QByteArray &path, Fault *fault)
{
    QByteArray content;
    return readInput(path, &content, fault) && take(displayName(path), content, fault);
}

bool RuleFile::take(const QString &name, const QByteArray &content, Fault *fault)
{
    m_name = name;
    m_content = content;
    m_index = TextIndex(content);
    *fault = Fault();
    fault->file = name;
    const bool isJson = readJson(content, m_index, &m_root, fault);
    const QString onTarget = errorOnTarget(content);
    if (isJson && onTarget.isEmpty()) {
        return true;
    }
    if (isJson) {
        // A single value is JSON, but not for the library's reader.
        fault->at = m_index.positionOf(m_root.begin);
        fault->message = "expected an array of entries, found " + typeText(m_root.type);
        fault->remedy = R"(put the entries into an array: [ { "popup": ... }, ... ].)";
    }
    fault->remedy += onTarget.isEmpty()
        ? QString(" The target takes it, but editors and other tools do not.")
        : " The target loads nothing of the file and logs \"" + onTarget + "\".";
    return false;
}

Place RuleFile::place(const QString &pointer, int offset) const
{
    return {m_number, m_index.positionOf(offset), pointer};
}

std::vector<Site> RuleFile::sites() const
{
    std::vector<Site> sites = SiteFinder(*this).find();
    std::sort(sites.begin(), sites.end(),
              [](const Site &a, const Site &b) { return a.begin < b.begin; });
    return sites;
}

} // namespace hmirules
