#pragma once

#include <QString>

#include <memory>
#include <vector>

#include "../random/seeds.h"

namespace HmiStateMachine {
class NamedState;
}

class Contest;

/** One thread's states, which it makes, renames, looks up and destroys at random. */
class Contestant
{
public:
    Contestant(Contest &contest, int number);

    /** Takes steps until the contest is over, and then destroys its states. */
    void run();

private:
    struct Entry
    {
        std::unique_ptr<HmiStateMachine::NamedState> state;
        int contested; // the number of the contested name that it holds, or noName
    };

    void make();
    void rename(Entry &entry);
    void destroy(std::size_t place);
    void take(Entry &entry, int number);
    void giveUp(Entry &entry);
    void checkLookUps();
    void checkList();

    QString ownName();
    bool isRegistered(const Entry &entry) const;

    Contest &m_contest;
    const int m_number;
    int m_ownNames = 0;
    Random m_random;
    std::vector<Entry> m_entries;
};
