#include "tests/FailingAllocations.h"

#include <cstdlib>

namespace ZarnMath {

namespace {

struct Counter
{
    bool isArmed = false;
    int untilFailure = 0;
    int live = 0;
};

thread_local Counter counter;

} // namespace

FailingAllocations::FailingAllocations(int failing) noexcept
{
    counter = {true, failing, 0};
}

FailingAllocations::~FailingAllocations()
{
    counter = {};
}

int FailingAllocations::Live() noexcept
{
    return counter.live;
}

} // namespace ZarnMath

void* operator new(std::size_t size)
{
    using ZarnMath::counter;
    if (counter.isArmed) {
        if (counter.untilFailure-- == 0)
            throw std::bad_alloc();
        ++counter.live;
    }
    if (void* const block = std::malloc(size > 0 ? size : 1))
        return block;
    throw std::bad_alloc();
}

void operator delete(void* block) noexcept
{
    if (block && ZarnMath::counter.isArmed)
        --ZarnMath::counter.live;
    std::free(block);
}

void operator delete(void* block, std::size_t /*size*/) noexcept
{
    operator delete(block);
}
