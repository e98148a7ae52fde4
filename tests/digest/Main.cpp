// Runs every exported function over inputs of all kinds and writes the bytes of the results. digests.py makes one digest a
// function of them.
//
//   zarnmath_digest CALLS    runs each function so many times
//   zarnmath_digest list     lists the functions: name, header and class, separated by tabs
//
// What is written, for each function: its name on a line of its own; blocks, each of which is its length on a line and
// then so many bytes; the length 0; and on a line the number of calls of the C library's mathematical functions.
#include "tests/catalogue/Catalogue.h"
#include "tests/digest/ByteSink.h"
#include "tests/digest/CountedMathematics.h"
#include "tests/digest/SeededSource.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace ZarnMath::Digest {

namespace {

#ifdef __EMSCRIPTEN__
// There the standard output is a console that takes text alone. The file behind it, if it is one, takes any byte.
std::FILE* const output = std::fopen("/dev/stdout", "wb");
#else
std::FILE* const output = stdout;
#endif

constexpr std::size_t blockSize = std::size_t{1} << 20;

/// The hash of Fowler, Noll and Vo: every function has a seed of its own, whatever stands before it in the list.
std::uint64_t SeedOf(const std::string& name)
{
    std::uint64_t hash = 0xCBF29CE484222325;
    for (const char c : name) {
        hash ^= static_cast<unsigned char>(c);
        hash *= 0x100000001B3;
    }
    return hash;
}

void WriteBlock(std::string& bytes)
{
    if (bytes.empty())
        return;
    std::fprintf(output, "%lu\n", static_cast<unsigned long>(bytes.size()));
    std::fwrite(bytes.data(), 1, bytes.size(), output);
    bytes.clear();
}

void Run(const Catalogue::Function& function, long calls)
{
    std::fprintf(output, "%s\n", function.name.c_str());
    SeededSource in(SeedOf(function.name));
    ByteSink out;
    std::uint64_t counted = 0;
    for (long i = 0; i < calls; ++i) {
        in.BeginCall();
        const std::uint64_t before = CallsOfMathematics();
        (*function.call)(in, out);
        counted += CallsOfMathematics() - before;
        if (out.bytes.size() >= blockSize)
            WriteBlock(out.bytes);
    }
    WriteBlock(out.bytes);
    std::fprintf(output, "0\n%lu\n", static_cast<unsigned long>(counted));
}

void List(const Catalogue::Function& function)
{
    const bool isPlatform = function.numberClass == Catalogue::NumberClass::Platform;
    std::fprintf(output, "%s\t%s\t%s\n", function.name.c_str(), function.family.c_str(),
                 isPlatform ? "platform" : "arithmetic");
}

int Main(const char* task)
{
    const long calls = std::strtol(task, nullptr, 10);
    const bool isList = std::strcmp(task, "list") == 0;
    if (!isList && calls <= 0)
        return EXIT_FAILURE;
    for (const Catalogue::Function& function : Catalogue::ListFunctions()) {
        if (isList)
            List(function);
        else
            Run(function, calls);
    }
    return std::fflush(output) == 0 ? EXIT_SUCCESS : EXIT_FAILURE;
}

} // namespace

} // namespace ZarnMath::Digest

int main(int argc, char** argv)
{
    if (argc == 2)
        return ZarnMath::Digest::Main(argv[1]);
    std::fprintf(stderr, "usage: zarnmath_digest CALLS|list\n");
    return EXIT_FAILURE;
}
