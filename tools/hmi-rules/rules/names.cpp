#include "names.h"

#include "libraryfacts.h"

#include <QSet>

#include <algorithm>

namespace hmirules {

namespace {

void addTargets(const RuleFile &file, const JsonNode &entry, int index, std::vector<NameUse> *uses)
{
    int rule = 0;
    for (const JsonNode &node : entry.array("interruptions")) {
        const QString target = node.string("target");
        if (!target.isEmpty()) {
            const QString pointer = QString("/%1/interruptions/%2/target").arg(index).arg(rule);
            uses->push_back(
                {target, NameUse::Target, file.place(pointer, *node.value("target")), index});
        }
        ++rule;
    }
}

} // namespace

std::vector<NameUse> namesIn(const RuleFile &file)
{
    std::vector<NameUse> uses;
    int index = 0;
    for (const JsonNode &entry : file.root().items) {
        const QString popup = entry.string("popup");
        if (!popup.isEmpty()) {
            uses.push_back({popup, NameUse::Entry, placeOfEntry(file, index), index});
            addTargets(file, entry, index, &uses);
        }
        ++index;
    }
    return uses;
}

Place placeOfEntry(const RuleFile &file, int entry)
{
    const JsonNode &node = file.root().items[static_cast<std::size_t>(entry)];
    const JsonNode *popup = node.value("popup");
    return popup ? file.place(QString("/%1/popup").arg(entry), *popup)
                 : file.place(QString("/%1").arg(entry), node);
}

QStringList namesIn(const RuleBase &base)
{
    QSet<QString> names;
    for (const RuleFile &file : base.files()) {
        for (const NameUse &use : namesIn(file)) {
            names.insert(use.name);
        }
    }
    QStringList sorted = names.values();
    std::sort(sorted.begin(), sorted.end(), [](const QString &a, const QString &b) {
        const bool aIsWildcard = isWildcard(a);
        return aIsWildcard == isWildcard(b) ? a < b : !aIsWildcard;
    });
    return sorted;
}

QString unnamedPopup(const RuleBase &base)
{
    QString name = "(any other)";
    const QStringList names = namesIn(base);
    while (names.contains(name)) {
        name += ' ';
    }
    return name;
}

} // namespace hmirules
