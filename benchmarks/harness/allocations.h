#pragma once

#include <QtGlobal>

/** What the heap has done since some point in time; see AllocationCount. */
struct Allocations
{
    qint64 count = 0; ///< blocks that were allocated
    qint64 bytes = 0; ///< bytes that came to be in use and still are, as the heap rounds them up
};

/**
 * Counts every allocation of the process while it lives, by whatever library: this program brings
 * its own malloc() and hands all calls on to the C library's. One at a time, in one thread.
 */
class AllocationCount
{
public:
    AllocationCount();
    ~AllocationCount();

    Allocations soFar() const;

private:
    Q_DISABLE_COPY(AllocationCount)
};
