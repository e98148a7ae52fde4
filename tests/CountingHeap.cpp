#include "tests/CountingHeap.h"

#include <cstdlib>
#include <new>

namespace {

struct
{
    bool isWatched = false;
    long untilFailure = 0; ///< counted down; nothing fails from 0 on
    long allocations = 0;
    long releases = 0;
} heap;

bool IsToFail() noexcept
{
    return heap.isWatched && heap.untilFailure > 0 && --heap.untilFailure == 0;
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
    return Counted(IsToFail() ? nullptr : std::malloc(size == 0 ? 1 : size));
}

void* operator new(std::size_t size, std::align_val_t alignment)
{
    const auto unit = static_cast<std::size_t>(alignment);
    return Counted(IsToFail() ? nullptr : std::aligned_alloc(unit, (size + unit - 1) / unit * unit));
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

HeapWatch::HeapWatch(long failing) noexcept
{
    heap = {true, failing, 0, 0};
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
