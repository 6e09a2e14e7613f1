#include "changes.h"

#include <QMap>
#include <QRegularExpression>

#include <algorithm>

namespace {

struct Class
{
    QString superclass;
    QStringList entries;
};

using Classes = QMap<QString, Class>;

Classes parse(const QString &dump)
{
    Classes result;
    QString current;
    for (const QString &line : dump.split('\n', Qt::SkipEmptyParts)) {
        if (line.startsWith("class ")) {
            const int end = line.lastIndexOf(": ");
            current = line.mid(6, end - 6);
            result[current].superclass = line.mid(end + 2);
        } else {
            result[current].entries.append(line.trimmed());
        }
    }
    return result;
}

/** By which an entry is the same one in another form: "name()" of a method, "info X", "enum X". */
QString identity(const QString &entry)
{
    static const QRegularExpression method("(\\w+)\\(");
    static const QRegularExpression other("^(property|info|enum|value) ([\\w:]*\\w)");
    const QRegularExpressionMatch match = other.match(entry);
    return match.hasMatch() ? match.captured(0) : method.match(entry).captured(1) + "()";
}

class Comparison
{
public:
    void compare(const Classes &before, const Classes &after);
    InterfaceChanges result() const { return m_result; }

private:
    void compare(const Class &before, const Class &after);
    QStringList takeChanged(QStringList &removed, QStringList &added);
    void compareOrder(const QStringList &before, const QStringList &after);
    void report(VersionStep step, const QString &what);

    InterfaceChanges m_result;
    QString m_class;
};

void Comparison::report(VersionStep step, const QString &what)
{
    m_result.step = std::max(m_result.step, step);
    m_result.lines.append(m_class + ": " + what);
}

void Comparison::compare(const Classes &before, const Classes &after)
{
    for (auto it = before.begin(); it != before.end(); ++it) {
        m_class = it.key();
        if (after.contains(it.key())) {
            compare(it.value(), after.value(it.key()));
        } else {
            report(VersionStep::Major, "removed (major): the class");
        }
    }
    for (auto it = after.begin(); it != after.end(); ++it) {
        if (!before.contains(it.key())) {
            m_class = it.key();
            report(VersionStep::Minor, "added (minor): the class");
        }
    }
}

QStringList without(const QStringList &list, QStringList others)
{
    QStringList result;
    for (const QString &item : list) {
        if (!others.removeOne(item)) { // an entry may stand twice
            result.append(item);
        }
    }
    return result;
}

void Comparison::compare(const Class &before, const Class &after)
{
    if (before.superclass != after.superclass) {
        report(VersionStep::Major,
               QString("changed (major): superclass %1 -> %2")
                   .arg(before.superclass, after.superclass));
    }
    QStringList removed = without(before.entries, after.entries);
    QStringList added = without(after.entries, before.entries);
    compareOrder(without(before.entries, removed), without(after.entries, added));
    for (const QString &change : takeChanged(removed, added)) {
        report(VersionStep::Major, "changed (major): " + change);
    }
    for (const QString &entry : qAsConst(removed)) {
        report(VersionStep::Major, "removed (major): " + entry);
    }
    for (const QString &entry : qAsConst(added)) {
        report(VersionStep::Minor, "added (minor): " + entry);
    }
}

/** Takes out of both lists what is only another form of the same entry. */
QStringList Comparison::takeChanged(QStringList &removed, QStringList &added)
{
    QStringList result;
    const QStringList candidates = removed;
    for (const QString &old : candidates) {
        const auto found = std::find_if(added.begin(), added.end(), [&old](const QString &entry) {
            return identity(entry) == identity(old);
        });
        if (found != added.end()) {
            result.append(old + " -> " + *found);
            removed.removeOne(old);
            added.erase(found);
        }
    }
    return result;
}

void Comparison::compareOrder(const QStringList &before, const QStringList &after)
{
    for (int i = 0; i < before.size(); ++i) {
        if (before.at(i) != after.at(i)) {
            report(VersionStep::Major,
                   QString("reordered (major): %1 now comes before %2")
                       .arg(after.at(i), before.at(i)));
            return;
        }
    }
}

} // namespace

InterfaceChanges interfaceChanges(const QString &before, const QString &after)
{
    Comparison comparison;
    comparison.compare(parse(before), parse(after));
    return comparison.result();
}
