#pragma once

#include <QHash>
#include <QString>
#include <QStringView>

namespace HmiStateMachine {

/**
 * The name of a popup as the interruption rules see it: module, slash, popup. It can be looked up
 * as it is and as either of its wildcards, without another string being made.
 *
 * As the key of a table it always stands for the name itself, which may be a wildcard as written in
 * a rule.
 */
class RuleName
{
public:
    explicit RuleName(const QString &name);

    /** Whether there is a slash; without one a name has no wildcards. */
    bool isDivided();

    /** What stands before the first slash; for a divided name. */
    QStringView module() const { return {m_name.constData(), m_slash}; }

    /** What stands between the first slash and the second one or the end; for a divided name. */
    QStringView popup() const { return {m_name.constData() + m_slash + 1, m_end - m_slash - 1}; }

    /** From now on this is looked up as this popup of any module; for a divided name. */
    void widenToAnyModule();

    /** From now on this is looked up as any popup of this module; for a divided name. */
    void widenToAnyPopup();

    /** From now on this is looked up as it is again. */
    void narrow();

private:
    friend bool operator==(const RuleName &a, const RuleName &b);
    friend uint qHash(const RuleName &name, uint seed) noexcept;

    enum Scope { Exact, AnyModule, AnyPopup };

    // cppcheck-suppress unusedPrivateFunction ; the operator, a friend, uses it
    bool isAnsweredBy(QStringView stored) const;

    QString m_name;
    uint m_exactHash;
    uint m_hash; ///< in the present scope
    Scope m_scope = Exact;
    int m_slash = -1; ///< the first; found when it is asked for
    int m_end = -1; ///< of the popup's part; below 0 until the slash has been looked for
};

/** Whether one is what the other is looked up as; one at least is as it was written. */
bool operator==(const RuleName &a, const RuleName &b);

inline uint qHash(const RuleName &name, uint seed = 0) noexcept
{
    return name.m_hash ^ seed;
}

/** The entry of @p table for @p name: its own, or its popup's in any module, or its module's. */
template <typename Value>
typename QHash<RuleName, Value>::const_iterator findRule(const QHash<RuleName, Value> &table,
                                                         RuleName &name)
{
    auto found = table.constFind(name);
    if (found != table.constEnd() || table.isEmpty() || !name.isDivided()) {
        return found;
    }
    name.widenToAnyModule();
    found = table.constFind(name);
    if (found == table.constEnd()) {
        name.widenToAnyPopup();
        found = table.constFind(name);
    }
    name.narrow();
    return found;
}

} // namespace HmiStateMachine
