#pragma once

#include <QString>

#include <atomic>
#include <chrono>
#include <cstddef>
#include <vector>

namespace HmiStateMachine {
class NamedState;
}

/** Names that several threads ask for, and what they got. Counts the library's refusals. */
class Contest
{
public:
    static constexpr int names = 16;

    /** Lasts for HMI_THREADS_MS milliseconds from now on, or else for a second. */
    Contest();
    bool isOver() const;

    static QString name(int number);

    /**
     * Notes that @p state holds the name, or gives it up. A fault when another state was noted, or
     * this one was not.
     */
    void noteWon(int number, HmiStateMachine::NamedState *state);
    void noteGivenUp(int number, HmiStateMachine::NamedState *state);

    void noteLost() { add(m_losses); }
    void noteFault() { add(m_faults); }

    int wins() const { return m_wins; }
    int losses() const { return m_losses; }
    int faults() const { return m_faults; }

private:
    // Relaxed, all of them: they must not order what the library has to order.
    static void add(std::atomic<int> &counter) { counter.fetch_add(1, std::memory_order_relaxed); }

    const std::chrono::steady_clock::time_point m_end;
    std::vector<std::atomic<HmiStateMachine::NamedState *>> m_holders;
    std::atomic<int> m_wins{0};
    std::atomic<int> m_losses{0};
    std::atomic<int> m_faults{0};
};

/** Counts the library's warnings of collisions while it lives, from any thread; prints none. */
class CollisionCounter
{
public:
    CollisionCounter();
    ~CollisionCounter();

    static int collisions();

private:
    Q_DISABLE_COPY(CollisionCounter)

    QtMessageHandler m_previous;
};
