// Counts how often each function of the library is entered, for the program whose sources are all compiled with
// -finstrument-functions, which counts what is inlined too. The counts of a call, on the mean over the corpus, go into the
// benchmark's counters under the address of the function; table.py knows the names, and which of them are a step of work.

#include "benchmarks/Measure.h"

#include <unordered_map>

extern "C" {
extern const char __executable_start; // where the linker puts the program
[[gnu::no_instrument_function]] void __cyg_profile_func_enter(void* function, void* caller);
[[gnu::no_instrument_function]] void __cyg_profile_func_exit(void* function, void* caller);
}

namespace {

bool isCounting = false;
std::unordered_map<const void*, std::int64_t> entries;

} // namespace

void __cyg_profile_func_enter(void* function, void* /*caller*/)
{
    if (!isCounting)
        return;
    isCounting = false; // not what the table does
    ++entries[function];
    isCounting = true;
}

void __cyg_profile_func_exit(void* /*function*/, void* /*caller*/) {}

namespace ZarnMath::Benchmarks {

void CountSteps(benchmark::State& state, std::size_t calls, const std::function<void()>& run)
{
    entries.clear();
    isCounting = true;
    run();
    isCounting = false;
    for (const auto& [function, count] : entries) {
        std::string address = std::to_string(static_cast<const char*>(function) - &__executable_start);
        address.insert(address.begin(), '@');
        state.counters[address] = static_cast<double>(count) / static_cast<double>(calls);
    }
}

} // namespace ZarnMath::Benchmarks
