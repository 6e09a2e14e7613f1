#include "lookups.h"

#include "checksum.h"
#include "flowshape.h"
#include "sides.h"

#include <HmiStateMachine/named/namedstate.h>
#include <HmiStateMachine/popup/popupinterruptionstore.h>

#include <QState>

namespace {

using HmiStateMachine::NamedState;
using HmiStateMachine::PopupInterruptionStore;
using HmiStateMachine::PopupState;

constexpr int entryCount = 1000;
constexpr int rulesPerEntry = 50;

enum class Wildcard { None, Popup, Module };

QString id(const QString &module, const QString &popup, int number, Wildcard wildcard)
{
    const QString any = QStringLiteral("*");
    return QStringLiteral("%1/%2").arg(
        wildcard == Wildcard::Popup ? any : QStringLiteral("%1%2").arg(module).arg(number),
        wildcard == Wildcard::Module ? any : QStringLiteral("%1%2").arg(popup).arg(number));
}

// Of the entries eight in ten are exact, the rest wildcards by popup and by module.
Wildcard entryWildcard(int entry)
{
    constexpr int inTen = 10;
    switch (entry % inTen) {
    case 8:
        return Wildcard::Popup;
    case 9:
        return Wildcard::Module;
    default:
        return Wildcard::None;
    }
}

// Of each entry's rules a third each is exact, by popup and by module.
Wildcard ruleWildcard(int rule)
{
    constexpr int thirds = 3;
    return static_cast<Wildcard>(rule % thirds);
}

QString entryId(int entry, Wildcard wildcard)
{
    return id(QStringLiteral("app"), QStringLiteral("popup"), entry, wildcard);
}

QString targetId(int rule, Wildcard wildcard)
{
    return id(QStringLiteral("phone"), QStringLiteral("call"), rule, wildcard);
}

struct Query
{
    QString popup;
    QString target;
};

// What is asked is never a wildcard itself: it is what some rule, exact or not, answers.
Query query(int entry, int rule)
{
    return {entryId(entry, Wildcard::None), targetId(rule, Wildcard::None)};
}

QVector<Query> exactQueries(int count)
{
    QVector<Query> result;
    for (int i = 0; i < count; ++i) {
        result.append(query(i * 10 % entryCount, i * 3 % rulesPerEntry / 3 * 3));
    }
    return result;
}

// A sixth each: exact entry with exact, popup and module rule; wildcard entry with exact and with
// wildcard rule; no rule at all.
QVector<Query> mixedQueries(int count)
{
    QVector<Query> result;
    for (int i = 0; i < count; ++i) {
        const int exactEntry = i * 10 % entryCount;
        const int wildcardEntry = exactEntry + 8 + i % 2;
        const int rule = i % 15 * 3;
        switch (i % 6) {
        case 0:
        case 1:
        case 2:
            result.append(query(exactEntry, rule + i % 6));
            break;
        case 3:
            result.append(query(wildcardEntry, rule));
            break;
        case 4:
            result.append(query(wildcardEntry, rule + 1 + i / 6 % 2));
            break;
        default:
            result.append({QStringLiteral("other/popup%1").arg(i), targetId(rule, Wildcard::None)});
        }
    }
    return result;
}

/** Asks the interruption store the same questions over and over. */
class Interruptions : public Flow
{
public:
    explicit Interruptions(const QVector<Query> &queries) : m_queries(queries)
    {
        for (int entry = 0; entry < entryCount; ++entry) {
            const QString popup = entryId(entry, entryWildcard(entry));
            for (int rule = 0; rule < rulesPerEntry; ++rule) {
                m_store.insertInterruptionBehavior(
                    static_cast<PopupState::InterruptionBehavior>((entry + rule) % 4), popup,
                    targetId(rule, ruleWildcard(rule)));
            }
        }
    }

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            const Query &query = m_queries.at(i % m_queries.size());
            m_checksum.add(m_store.getInterruptionBehavior(query.popup, query.target));
        }
    }

    quint64 checksum() const override { return m_checksum.value(); }

protected:
    PopupInterruptionStore m_store;
    QVector<Query> m_queries;
    Checksum m_checksum;
};

/** Asks whether a domain blocks a popup, without any list of blocked ones. */
class Blocking : public Interruptions
{
public:
    using Interruptions::Interruptions;

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            m_checksum.add(m_store.isBlockedByDomain(m_queries.at(i % m_queries.size()).popup, 1));
        }
    }
};

/** Looks up the names of registered states. */
class NameLookup : public Flow
{
public:
    explicit NameLookup(const QStringList &names)
    {
        for (const QString &name : names) {
            m_states.push_back(std::make_unique<NamedState>(name));
            // Not the registry's own string: whoever asks has a copy of their own.
            m_names.append(QString(name.constData(), name.size()));
        }
    }

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            m_next = nextIndex(m_next, m_names.size());
            m_checksum.add(NamedState::stateForName(m_names.at(m_next)) != nullptr);
        }
    }

    quint64 checksum() const override { return m_checksum.value(); }

private:
    std::vector<std::unique_ptr<NamedState>> m_states;
    QStringList m_names;
    int m_next = 0;
    Checksum m_checksum;
};

/** The floor: a table of pointers by name. */
class TableLookup : public Flow
{
public:
    explicit TableLookup(const QStringList &names)
    {
        for (const QString &name : names) {
            m_table.insert(name, this);
            m_names.append(QString(name.constData(), name.size()));
        }
    }

    void run(int operations) override
    {
        for (int i = 0; i < operations; ++i) {
            m_next = nextIndex(m_next, m_names.size());
            m_checksum.add(m_table.value(m_names.at(m_next)) != nullptr);
        }
    }

    quint64 checksum() const override { return m_checksum.value(); }

private:
    QHash<QString, const void *> m_table;
    QStringList m_names;
    int m_next = 0;
    Checksum m_checksum;
};

constexpr int timedLookups = 20000;
constexpr int countedLookups = 3000;

template <typename Work>
Workload lookup(const QString &id, const QString &title, const QVector<Query> &queries)
{
    return {id,
            title,
            timedLookups,
            countedLookups,
            countedLookups,
            1,
            {side<Work>(Engine::Library, queries)}};
}

Workload nameLookup()
{
    FlowShape shape;
    shape.views = 10000;
    const QStringList names = shape.viewNames();
    return {QStringLiteral("W7"),
            QStringLiteral("name lookup among 10000"),
            timedLookups,
            countedLookups,
            countedLookups,
            1,
            {side<NameLookup>(Engine::Library, names), side<TableLookup>(Engine::Floor, names)}};
}

} // namespace

QVector<Workload> lookupWorkloads()
{
    constexpr int queries = 600;
    return {lookup<Interruptions>(QStringLiteral("W6/mixed"),
                                  QStringLiteral("interruption lookup, 1000 entries of 50 rules"),
                                  mixedQueries(queries)),
            lookup<Interruptions>(QStringLiteral("W6/exact"),
                                  QStringLiteral("interruption lookup, exact rules only"),
                                  exactQueries(queries)),
            lookup<Blocking>(QStringLiteral("W6/blocking"),
                             QStringLiteral("domain blocking without any list"),
                             exactQueries(queries)),
            nameLookup()};
}
