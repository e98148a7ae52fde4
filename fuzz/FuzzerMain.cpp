/// @file
/// One target as the fuzzer calls it.

#include "fuzz/Targets.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* bytes, std::size_t size);

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* bytes, std::size_t size)
{
    ZarnMath::Fuzzing::Input input(bytes, size);
    ZarnMath::Fuzzing::ZARNMATH_FUZZ_TARGET(input);
    return 0;
}
