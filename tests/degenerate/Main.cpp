// Writes docs/degenerate-answers.md, or compares it with what the library answers.
//
//     zarnmath_degenerate write FILE
//     zarnmath_degenerate compare FILE
#include "tests/degenerate/FunctionPage.h"

#include <cstdio>
#include <fstream>
#include <iterator>
#include <sstream>
#include <string_view>

namespace ZarnMath::Degenerate {
namespace {

constexpr const char* introduction = R"(# Answers to degenerate input

What every exported function of cubics answers where control points coincide, and where one of its numbers is not a number,
infinite, zero, the smallest or the largest there is. Nothing here crashes, hangs or is undefined; most of it is what the
arithmetic gives, and all of it stays as it is. The tables are written by a program that calls the functions, and a test
compares them with the library: `./dev test` fails where one answer changes. Where that is meant,
`build/dev/tests/degenerate/zarnmath_degenerate write docs/degenerate-answers.md` writes them anew.

How to read an answer: the returned value comes first, then every output in the order of the parameters. A number has four
digits, and a point is two of them; `~0` is a zero but for rounding. `-` is an output, or an element of an array, that the
call left alone; a vector is `[n]` and its n elements, of which a `-` at the front was there before the call. `x3` behind a
result stands for three of it in a row, and `...` for the rest of a long list. All arguments of type `bool` are true. The
answers to special values say how many of the numbers are finite, and how many are not.

The curves are (10, 20), (110, 320), (230, -70), (310, 150) and others like it. *Coincident* tells which of its control points
fall together, by moving the later ones onto the first. *In* tells which number the value replaces, one at a time: a
coordinate of a control point `P0` to `P3` (of a second curve `Q0` to `Q3`), a coefficient of the power form `a` to `d`, the
parameter `t`, a distance, a tolerance, or a coordinate of a point. *Least integer* and *greatest integer* are -2147483648
and 2147483647; an integer in an answer is `least`, `greatest` or another one. *Both at once* counts the calls with every
value in every place of a curve whose points coincide in each way, with all `bool` true and false, and the different answers
to them; the last number is a checksum of these.
)";

bool IsOnCubics(const Catalogue::Function& function)
{
    return function.family.starts_with("Bezier");
}

std::string WritePage()
{
    std::string page = introduction;
    std::string family;
    for (const Catalogue::Function& function : Catalogue::ListFunctions()) {
        if (!IsOnCubics(function)) {
            static_cast<void>(CrossAll(function)); // it has to come back
            continue;
        }
        if (function.family != family) {
            family = function.family;
            page += "\n## " + family + ".h\n";
        }
        page += SectionOn(function);
    }
    return page;
}

std::string Read(const char* file)
{
    std::ifstream in(file, std::ios::binary);
    return {std::istreambuf_iterator<char>(in), {}};
}

/// Prints the lines that differ, up to a few.
int Compare(const std::string& recorded, const std::string& current)
{
    std::istringstream before(recorded);
    std::istringstream after(current);
    int differences = 0;
    std::string line;
    std::string currentLine;
    for (int number = 1; differences < 10; ++number) {
        const bool hasLine = static_cast<bool>(std::getline(before, line));
        const bool hasCurrentLine = static_cast<bool>(std::getline(after, currentLine));
        if (!hasLine && !hasCurrentLine)
            break;
        if (hasLine != hasCurrentLine || line != currentLine) {
            ++differences;
            std::printf("line %d\n  recorded %s\n  answered %s\n", number, hasLine ? line.c_str() : "nothing",
                        hasCurrentLine ? currentLine.c_str() : "nothing");
        }
    }
    return differences == 0 ? 0 : 1;
}

int Run(std::string_view task, const char* file)
{
    const std::string page = WritePage();
    if (task == "compare")
        return Compare(Read(file), page);
    std::ofstream out(file, std::ios::binary);
    out << page;
    return out.flush() ? 0 : 1;
}

} // namespace
} // namespace ZarnMath::Degenerate

int main(int argc, char** argv)
{
    if (argc != 3) {
        std::fputs("usage: zarnmath_degenerate write|compare FILE\n", stderr);
        return 2;
    }
    return ZarnMath::Degenerate::Run(argv[1], argv[2]);
}
