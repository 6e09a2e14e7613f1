#include "allocations.h"

#include <cerrno>
#include <cstddef>

#include <malloc.h>

// The C library's own, under the names that it keeps for programs with a malloc() of their own.
extern "C" {
void *__libc_malloc(std::size_t size);
void *__libc_calloc(std::size_t count, std::size_t size);
void *__libc_realloc(void *block, std::size_t size);
void *__libc_memalign(std::size_t alignment, std::size_t size);
void __libc_free(void *block);
}

namespace {

bool counting = false;
Allocations total;

void *allocated(void *block)
{
    if (counting && block) {
        ++total.count;
        total.bytes += static_cast<qint64>(malloc_usable_size(block));
    }
    return block;
}

void released(void *block)
{
    if (counting && block) {
        total.bytes -= static_cast<qint64>(malloc_usable_size(block));
    }
}

} // namespace

extern "C" {

void *malloc(std::size_t size)
{
    return allocated(__libc_malloc(size));
}

void *calloc(std::size_t count, std::size_t size)
{
    return allocated(__libc_calloc(count, size));
}

void *realloc(void *block, std::size_t size)
{
    released(block);
    return allocated(__libc_realloc(block, size));
}

void *memalign(std::size_t alignment, std::size_t size)
{
    return allocated(__libc_memalign(alignment, size));
}

void *aligned_alloc(std::size_t alignment, std::size_t size)
{
    return memalign(alignment, size);
}

int posix_memalign(void **block, std::size_t alignment, std::size_t size)
{
    *block = memalign(alignment, size);
    return *block ? 0 : ENOMEM;
}

void free(void *block)
{
    released(block);
    __libc_free(block);
}

} // extern "C"

AllocationCount::AllocationCount()
{
    total = Allocations();
    counting = true;
}

AllocationCount::~AllocationCount()
{
    counting = false;
}

Allocations AllocationCount::soFar() const
{
    return total;
}
