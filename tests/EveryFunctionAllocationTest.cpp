// Memory that runs out in any exported function: the exception comes out and nothing is leaked.
#include "tests/CountingHeap.h"
#include "tests/catalogue/Catalogue.h"
#include "tests/catalogue/OrdinarySource.h"

#include <gtest/gtest.h>

namespace ZarnMath {
namespace {

using Catalogue::Function;

/// Lets go of every result. It allocates nothing, so that what is counted is the call and its arguments.
class Blackhole : public Catalogue::Sink
{
public:
    void Number(double) override {}

    void Single(float) override {}

    void Integer(std::int64_t) override {}

    void Flag(bool) override {}

    void Size(std::uint64_t) override {}

    void LengthError() override {}
};

long FailEveryAllocationOf(const Function& function, bool flags, unsigned firstCall)
{
    return FailEveryAllocation(
        [&] {
            Catalogue::OrdinarySource source(flags, firstCall);
            Blackhole results;
            (*function.call)(source, results);
        },
        [] {});
}

TEST(EveryFunctionAllocation, ThrowsAndLeaksNothing)
{
    long failures = 0;
    for (const Function& function : Catalogue::ListFunctions()) {
        SCOPED_TRACE(function.name);
        for (const bool flags : {false, true})
            for (const unsigned firstCall : {0U, 1U, 2U})
                failures += FailEveryAllocationOf(function, flags, firstCall);
    }
    EXPECT_GT(failures, 500);
}

} // namespace
} // namespace ZarnMath
