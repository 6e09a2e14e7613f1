#include "rulemaker.h"

#include <algorithm>

namespace {

// What people and programs come to write where the name of a popup should be.
const QStringList &oddNames()
{
    static const QStringList names = {
        "",
        "/",
        "//",
        "*",
        "**",
        "*/*",
        "*/",
        "/*",
        "*//",
        "a*/call",
        "phone/call/",
        "phone/call/late",
        "*/call/late",
        "phone/*/late",
        "/call",
        " phone/call",
        "phone/call ",
        "PHONE/call",
        "(any other)",
        "digit ",
        "digit 0.0",
        "\"quoted\"/back\\slash",
        "a,b;c/d",
        "100%3/%1%2%4",
        "new\nline/ta\tb",
        "\x1b[31mred/call",
        "wei\u00df/\u4e2d",
        QString::fromUcs4(U"\U0001f697/call"),
        QString("nul") + QChar(0) + "/call",
        QString(QChar(QChar::ByteOrderMark)) + "phone/call",
        QString("phone/") + QChar(QChar::ByteOrderMark),
    };
    return names;
}

} // namespace

QByteArray RuleMaker::file(int maximumOfEntries)
{
    m_entries.clear();
    if (m_random.oneIn(20 * m_oddness)) {
        return space() + object({{literal("popup"), literal(name())}});
    }
    QVector<QByteArray> items;
    for (int count = m_random.below(maximumOfEntries + 1); count > 0; --count) {
        items.append(entry());
    }
    return (isOdd() ? "\xef\xbb\xbf" : "") + space() + array(items) + space();
}

QString RuleMaker::name()
{
    if (isOdd()) {
        return anyOf(oddNames());
    }
    const QString module = anyOf({"phone", "media", "car"});
    const QString popup = anyOf({"call", "lost", "volume"});
    switch (m_random.below(8)) {
    case 0:
        return "*/" + popup;
    case 1:
        return module + "/*";
    case 2:
        return anyOf({"clock", "menu"});
    default:
        return module + '/' + popup;
    }
}

QString RuleMaker::behavior()
{
    if (isOdd()) {
        return anyOf({"", "Allowed", "allow stack", " Allow", "-1", "Verbiete", "\x1b[2J"});
    }
    return anyOf({"Prohibit", "Allow", "AllowStack", "AllowNoReturn", "allow", "PROHIBIT"});
}

QByteArray RuleMaker::space()
{
    static const QList<QByteArray> spaces = {"", "", "", " ", "\n", "\r\n", "\t", "\n    "};
    return spaces.at(m_random.below(spaces.size()));
}

QByteArray RuleMaker::literal(const QString &text)
{
    QByteArray result = "\"";
    for (int i = 0; i < text.size(); ++i) {
        const QChar c = text.at(i);
        // In front the library takes it for no part of the text, unless it is escaped.
        m_isReplaced = m_isReplaced || (i == 0 && c == QChar(QChar::ByteOrderMark));
        const bool mustBeEscaped = c < ' ' || c == '"' || c == '\\';
        if (mustBeEscaped || m_random.oneIn(30)) {
            result += escaped(c);
        } else if (c.isHighSurrogate()) {
            result += text.mid(i++, 2).toUtf8();
        } else if (c.isLowSurrogate()) {
            result += escaped(c); // the first half was as well
        } else {
            result += QByteArray(QString(c).toUtf8());
        }
    }
    return result + '"';
}

QByteArray RuleMaker::escaped(QChar character)
{
    if (character == '"' || character == '\\' || character == '/') {
        return QByteArray("\\") + character.toLatin1();
    }
    if (character == '\n' && m_random.oneIn(2)) {
        return "\\n";
    }
    const QByteArray digits = QByteArray::number(character.unicode(), 16).rightJustified(4, '0');
    return "\\u" + (m_random.oneIn(2) ? digits.toUpper() : digits);
}

QByteArray RuleMaker::oddValue()
{
    static const QList<QByteArray> values = {"null",    "true",
                                             "0",       "-1.5e+3",
                                             "\"\"",    "\"Prohibit\"",
                                             "[]",      "[[1]]",
                                             "[\"a\"]", "{ \"popup\": \"a\" }",
                                             "{}",      "[null, \"b\", 2]"};
    return values.at(m_random.below(values.size()));
}

QByteArray RuleMaker::oddOr(const QByteArray &value)
{
    if (!isOdd()) {
        return value;
    }
    m_isReplaced = true;
    return oddValue();
}

QByteArray RuleMaker::array(const QVector<QByteArray> &items)
{
    QByteArray result = "[" + space();
    for (const QByteArray &item : items) {
        result += (result.trimmed() == "[" ? "" : "," + space()) + item + space();
    }
    return result + ']';
}

QByteArray RuleMaker::object(QVector<Member> members)
{
    if (isOdd()) {
        members.append({literal(anyOf({"comment", "Popup", "", "a/b~c", "\x1b[1m"})), oddValue()});
    }
    if (isOdd() && !members.isEmpty()) {
        const QByteArray again = members.at(m_random.below(members.size())).first;
        members.append({again, m_random.oneIn(2) ? oddValue() : literal(name())});
    }
    for (int i = members.size() - 1; i > 0; --i) {
        std::swap(members[i], members[m_random.below(i + 1)]);
    }
    QByteArray result = "{";
    for (const Member &member : members) {
        result += (result == "{" ? "" : ",") + space() + member.first + space() + ':' + space()
            + member.second + space();
    }
    return result + '}';
}

QByteArray RuleMaker::entry()
{
    if (isOdd()) {
        return oddValue();
    }
    m_isReplaced = false;
    WrittenEntry written;
    written.popup = name();
    QVector<Member> members = {{literal("popup"), oddOr(literal(written.popup))}};
    if (!m_random.oneIn(4)) {
        members.append({literal("interruptions"), oddOr(rules(&written))});
    }
    if (m_random.oneIn(2)) {
        written.defaultBehavior = behavior();
        members.append({literal("default"), oddOr(literal(written.defaultBehavior))});
    }
    if (m_random.oneIn(3)) {
        members.append({literal("domainBlacklist"), oddOr(blacklist("d", &written.domains))});
    }
    if (m_random.oneIn(3)) {
        members.append({literal("viewBlacklist"), oddOr(blacklist("v", &written.views))});
    }
    if (!m_isReplaced) {
        m_entries.append(written);
    }
    return object(members);
}

QByteArray RuleMaker::rules(WrittenEntry *written)
{
    QVector<QByteArray> items;
    for (int count = isOdd() ? 0 : 1 + m_random.below(4); count > 0; --count) {
        const QString target = name();
        const QString says = behavior();
        written->rules.append({target, says});
        items.append(oddOr(object({{literal("target"), oddOr(literal(target))},
                                   {literal("behavior"), oddOr(literal(says))}})));
    }
    return array(items);
}

QByteArray RuleMaker::blacklist(const QString &prefix, QStringList *written)
{
    QVector<QByteArray> items;
    for (int count = isOdd() ? 0 : 1 + m_random.below(3); count > 0; --count) {
        written->append(isOdd() ? anyOf(oddNames()) : prefix + QString::number(m_random.below(5)));
        items.append(oddOr(literal(written->last())));
    }
    return array(items);
}

QList<QByteArray> randomFiles(Random *random, int maximumOfFiles)
{
    static const int oddnesses[] = {4, 12, 60, 1000};
    RuleMaker maker(random, oddnesses[random->below(4)]);
    QList<QByteArray> contents;
    for (int count = 1 + random->below(maximumOfFiles); count > 0; --count) {
        contents.append(maker.file(7));
    }
    return contents;
}

QByteArray reproduction(quint32 seed, int run, const QString &wrong,
                        const QList<QByteArray> &contents)
{
    return QString("HMI_RANDOM_SEED=%1 HMI_RANDOM_STEPS=%2: wrong for %3 of\n%4")
        .arg(seed)
        .arg(run)
        .arg(wrong, QString(contents.join("\n---\n")))
        .toUtf8();
}
