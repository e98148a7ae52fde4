#include "tests/ScarceHeap.h"

#include <cstdlib>
#include <limits>
#include <new>

namespace {

/// What the allocations of this thread are held to, and how many there were.
thread_local std::size_t largestAllocation = std::numeric_limits<std::size_t>::max();
thread_local std::size_t allocations = 0;

} // namespace

void* operator new(std::size_t size)
{
    ++allocations;
    void* memory = size <= largestAllocation ? std::malloc(size) : nullptr;
    if (memory == nullptr)
        throw std::bad_alloc();
    return memory;
}

void operator delete(void* memory) noexcept
{
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept
{
    std::free(memory);
}

namespace ZarnMath {

Scarcity::Scarcity(std::size_t largestSize) noexcept
{
    largestAllocation = largestSize;
}

Scarcity::~Scarcity()
{
    largestAllocation = std::numeric_limits<std::size_t>::max();
}

std::size_t CountAllocations() noexcept
{
    return allocations;
}

} // namespace ZarnMath
