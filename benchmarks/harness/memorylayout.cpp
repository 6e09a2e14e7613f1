#include "memorylayout.h"

#include <algorithm>
#include <cstdlib>
#include <random>

namespace {

// As many and as large as the objects of a flow, so that these are put into the gaps.
constexpr int blockCount = 4000;
constexpr std::size_t smallest = 16;
constexpr std::size_t largest = 320;

} // namespace

MemoryLayout::MemoryLayout(unsigned number)
{
    if (number == 0) {
        return;
    }
    std::mt19937 random(number);
    std::uniform_int_distribution<std::size_t> size(smallest, largest);
    std::vector<void *> blocks(blockCount);
    std::generate(blocks.begin(), blocks.end(), [&] { return std::malloc(size(random)); });
    std::shuffle(blocks.begin(), blocks.end(), random);
    const auto half = blocks.begin() + blockCount / 2;
    std::for_each(blocks.begin(), half, [](void *block) { std::free(block); });
    // cppcheck-suppress danglingLifetime ; the pointers are copied, not where they stood
    m_kept.assign(half, blocks.end());
}

MemoryLayout::~MemoryLayout()
{
    std::for_each(m_kept.begin(), m_kept.end(), [](void *block) { std::free(block); });
}
