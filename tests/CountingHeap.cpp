#include "tests/CountingHeap.h"

#include <cstdlib>

namespace {

constexpr std::size_t anySize = std::numeric_limits<std::size_t>::max();

struct Record
{
    bool isWatched = false;
    long untilFailure = ZarnMath::HeapWatch::never; ///< counted down; nothing fails from 0 on
    std::size_t largest = anySize;
    long allocations = 0;
    long releases = 0;
};

thread_local Record heap;

bool IsToFail(std::size_t size) noexcept
{
    return heap.isWatched && (size > heap.largest || (heap.untilFailure > 0 && --heap.untilFailure == 0));
}

void* Counted(void* block)
{
    if (block == nullptr)
        throw std::bad_alloc();
    if (heap.isWatched)
        ++heap.allocations;
    return block;
}

void Release(void* block) noexcept
{
    if (heap.isWatched && block != nullptr)
        ++heap.releases;
    std::free(block);
}

} // namespace

void* operator new(std::size_t size)
{
    return Counted(IsToFail(size) ? nullptr : std::malloc(size == 0 ? 1 : size));
}

void* operator new(std::size_t size, std::align_val_t alignment)
{
    const auto unit = static_cast<std::size_t>(alignment);
    return Counted(IsToFail(size) ? nullptr : std::aligned_alloc(unit, (size + unit - 1) / unit * unit));
}

void operator delete(void* block) noexcept
{
    Release(block);
}

void operator delete(void* block, std::size_t) noexcept
{
    Release(block);
}

void operator delete(void* block, std::align_val_t) noexcept
{
    Release(block);
}

void operator delete(void* block, std::size_t, std::align_val_t) noexcept
{
    Release(block);
}

namespace ZarnMath {

HeapWatch::HeapWatch(long failing, std::size_t largest) noexcept
{
    heap = {true, failing, largest, 0, 0};
}

HeapWatch::HeapWatch(long failing) noexcept : HeapWatch(failing, anySize) {}

HeapWatch HeapWatch::WithoutBlocksAbove(std::size_t largest) noexcept
{
    return {never, largest};
}

HeapWatch::~HeapWatch()
{
    heap = {};
}

long HeapWatch::Allocations() const noexcept
{
    return heap.allocations;
}

long HeapWatch::Live() const noexcept
{
    return heap.allocations - heap.releases;
}

} // namespace ZarnMath
