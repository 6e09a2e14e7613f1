#include "contestant.h"

#include "contest.h"

#include <HmiStateMachine/named/namedstate.h>

#include <algorithm>

using namespace HmiStateMachine;

namespace {

constexpr int noName = -1;
constexpr std::size_t mostStates = 12;

} // namespace

Contestant::Contestant(Contest &contest, int number)
    : m_contest(contest), m_number(number), m_random(static_cast<quint32>(number))
{
}

void Contestant::run()
{
    while (!m_contest.isOver()) {
        if (m_entries.empty() || (m_entries.size() < mostStates && m_random.oneIn(3))) {
            make();
        }
        const int place = m_random.below(static_cast<int>(m_entries.size()));
        rename(m_entries[static_cast<std::size_t>(place)]);
        checkLookUps();
        if (m_random.oneIn(4)) {
            destroy(static_cast<std::size_t>(place));
        }
        if (m_random.oneIn(16)) {
            checkList();
        }
    }
    while (!m_entries.empty()) {
        destroy(0);
    }
}

void Contestant::make()
{
    m_entries.push_back({std::make_unique<NamedState>(ownName()), noName});
    Entry &made = m_entries.back();
    if (m_random.oneIn(4)) {
        // Its children are looked at when the event loop of the thread runs, or never.
        new NamedState(ownName(), made.state.get());
    }
    if (!isRegistered(made)) {
        m_contest.noteFault();
    }
}

void Contestant::rename(Entry &entry)
{
    giveUp(entry);
    if (m_random.oneIn(8)) {
        entry.state->setName(QString());
    } else if (m_random.oneIn(4)) {
        entry.state->setName(ownName());
        if (!isRegistered(entry)) {
            m_contest.noteFault();
        }
    } else {
        take(entry, m_random.below(Contest::names));
    }
}

void Contestant::destroy(std::size_t place)
{
    giveUp(m_entries[place]);
    m_entries.erase(m_entries.begin() + static_cast<std::ptrdiff_t>(place));
}

void Contestant::take(Entry &entry, int number)
{
    entry.state->setName(Contest::name(number));
    if (entry.state->name().isEmpty()) {
        m_contest.noteLost();
    } else {
        entry.contested = number;
        m_contest.noteWon(number, entry.state.get());
    }
}

void Contestant::giveUp(Entry &entry)
{
    // Noted before the name is free, since another thread may have it at once then.
    if (entry.contested != noName) {
        m_contest.noteGivenUp(entry.contested, entry.state.get());
        entry.contested = noName;
        entry.state->setName(QString());
    }
}

void Contestant::checkLookUps()
{
    const bool all = std::all_of(m_entries.cbegin(), m_entries.cend(), [this](const Entry &entry) {
        return entry.state->name().isEmpty() || isRegistered(entry);
    });
    // A state of another thread may go at any time, and is compared as an address alone.
    const int number = m_random.below(Contest::names);
    const NamedState *found = NamedState::stateForName(Contest::name(number));
    const bool mine = std::any_of(m_entries.cbegin(), m_entries.cend(), [=](const Entry &entry) {
        return entry.contested == number && entry.state.get() == found;
    });
    const bool known = std::any_of(m_entries.cbegin(), m_entries.cend(),
                                   [=](const Entry &entry) { return entry.state.get() == found; });
    if (!all || mine != known) {
        m_contest.noteFault();
    }
}

void Contestant::checkList()
{
    const QList<NamedState *> listed = NamedState::namedStates();
    for (const Entry &entry : m_entries) {
        const int expected = entry.state->name().isEmpty() ? 0 : 1;
        if (listed.count(entry.state.get()) != expected) {
            m_contest.noteFault();
        }
    }
}

QString Contestant::ownName()
{
    return QStringLiteral("Own %1 of thread %2").arg(++m_ownNames).arg(m_number);
}

bool Contestant::isRegistered(const Entry &entry) const
{
    return NamedState::stateForName(entry.state->name()) == entry.state.get();
}
