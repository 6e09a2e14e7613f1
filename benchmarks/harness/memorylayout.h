#pragma once

#include <vector>

/**
 * Scatters the free blocks of the heap, differently for each number, so that what is built while it
 * lives comes to lie at other addresses, in another order. Number 0 leaves the heap as it is.
 *
 * QStateMachine keeps states in sets ordered by their addresses: what a flow with parallel regions
 * costs depends on where its states happen to lie.
 */
class MemoryLayout
{
public:
    explicit MemoryLayout(unsigned number);
    ~MemoryLayout();

private:
    MemoryLayout(const MemoryLayout &) = delete;
    MemoryLayout &operator=(const MemoryLayout &) = delete;

    std::vector<void *> m_kept;
};
