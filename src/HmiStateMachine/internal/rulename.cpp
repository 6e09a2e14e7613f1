#include <HmiStateMachine/internal/rulename.h>

#include <cstring>

namespace HmiStateMachine {

namespace {

constexpr QChar separator = QLatin1Char('/');
constexpr QChar any = QLatin1Char('*');
constexpr int wildcardSize = 2; // the asterisk with its slash

bool isAnyModule(QStringView name)
{
    return name.size() >= wildcardSize && name.at(0) == any && name.at(1) == separator;
}

bool isAnyPopup(QStringView name)
{
    return name.size() >= wildcardSize && name.at(name.size() - 1) == any
        && name.at(name.size() - 2) == separator;
}

// Multiplying carries differences up only, hence the fold after each step and the last product, of
// which the upper half counts.
constexpr quint64 hashFactor = 0x9e3779b97f4a7c15ULL; // the golden ratio of 64 bits

quint64 extended(quint64 hash, quint64 block)
{
    constexpr int fold = 29;
    hash = (hash ^ block) * hashFactor;
    return hash ^ hash >> fold;
}

constexpr int charactersInBlock = sizeof(quint64) / sizeof(QChar);

quint64 blockAt(const QChar *at)
{
    quint64 block = 0;
    std::memcpy(&block, at, sizeof block);
    return block;
}

// By four characters at a time: every question to the rules hashes two names. The last four may
// overlap with those before.
uint hashText(QStringView text)
{
    const QChar *at = text.data();
    const QChar *const end = at + text.size();
    auto hash = static_cast<quint64>(text.size());
    if (text.size() >= charactersInBlock) {
        for (; end - at > charactersInBlock; at += charactersInBlock) {
            hash = extended(hash, blockAt(at));
        }
        hash = extended(hash, blockAt(end - charactersInBlock));
    } else {
        for (; at != end; ++at) {
            hash = extended(hash, at->unicode());
        }
    }
    constexpr int upperHalf = 32;
    return static_cast<uint>((hash * hashFactor) >> upperHalf);
}

// A wildcard's hash is made of the part that it fixes, so that a name finds it by that part.
uint hashAnyModule(QStringView popup)
{
    return ~hashText(popup);
}

uint hashAnyPopup(QStringView module)
{
    // "*/*" has both forms, and may have one hash only.
    return module.size() == 1 && module.front() == any ? hashAnyModule(module)
                                                       : hashText(module) + 1;
}

uint hashName(QStringView name)
{
    if (isAnyModule(name)) {
        return hashAnyModule(name.mid(wildcardSize));
    }
    return isAnyPopup(name) ? hashAnyPopup(name.chopped(wildcardSize)) : hashText(name);
}

// Plain, because names are short: std::find() and Qt's search take their time to begin.
const QChar *findSeparator(const QChar *at, const QChar *end)
{
    while (at != end && *at != separator) {
        ++at;
    }
    return at;
}

bool equal(QStringView a, QStringView b)
{
    // The rest of a wildcard may be empty, and its data null then, which memcmp() may not be given.
    return a.size() == b.size()
        && (a.isEmpty()
            || std::memcmp(a.data(), b.data(), static_cast<std::size_t>(a.size()) * sizeof(QChar))
                == 0);
}

} // namespace

RuleName::RuleName(const QString &name)
    : m_name(name), m_exactHash(hashName(name)), m_hash(m_exactHash)
{
}

bool RuleName::isDivided()
{
    if (m_end < 0) {
        // Of a name with several slashes only the first two parts count.
        const QChar *const begin = m_name.constData();
        const QChar *const end = begin + m_name.size();
        const QChar *const first = findSeparator(begin, end);
        const QChar *const second = first == end ? end : findSeparator(first + 1, end);
        m_slash = first == end ? -1 : static_cast<int>(first - begin);
        m_end = static_cast<int>(second - begin);
    }
    return m_slash >= 0;
}

void RuleName::widenToAnyModule()
{
    m_scope = AnyModule;
    m_hash = hashAnyModule(popup());
}

void RuleName::widenToAnyPopup()
{
    m_scope = AnyPopup;
    m_hash = hashAnyPopup(module());
}

void RuleName::narrow()
{
    m_scope = Exact;
    m_hash = m_exactHash;
}

bool RuleName::isAnsweredBy(QStringView stored) const
{
    return m_scope == AnyModule
        ? isAnyModule(stored) && equal(stored.mid(wildcardSize), popup())
        : isAnyPopup(stored) && equal(stored.chopped(wildcardSize), module());
}

bool operator==(const RuleName &a, const RuleName &b)
{
    if (a.m_scope != RuleName::Exact) {
        return a.isAnsweredBy(b.m_name);
    }
    return b.m_scope == RuleName::Exact ? equal(a.m_name, b.m_name) : b.isAnsweredBy(a.m_name);
}

} // namespace HmiStateMachine
