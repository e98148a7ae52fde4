// The same bits as anywhere else, in the version of the language that was asked for.
#include "tests/library/OutsideCaller.h"

#include <cstdio>

#if STANDARD > 20
static_assert(__cplusplus > 202002L, "C++23 was asked for");
#else
static_assert(__cplusplus == 202002L, "C++20 was asked for");
#endif

int main()
{
    const bool same = GivesTheSameBits();
    std::puts(same ? "The same bits." : "The bits differ.");
    return same ? 0 : 1;
}
