// zarnmath_census [SEED [CASES]]: counts, over random cases, what the library's searches miss, and prints Markdown.
#include "tests/census/Census.h"

#include <cstdint>
#include <exception>
#include <iostream>
#include <string>

int main(int argc, char** argv)
{
    using namespace ZarnMath::Census;
    try {
        const std::uint64_t seed = argc > 1 ? std::stoull(argv[1]) : 20261120;
        const int cases = argc > 2 ? std::stoi(argv[2]) : 20000;
        std::cout << CountCurveCurve(seed, cases) << CountCurveLine(seed, cases) << CountSelfIntersection(seed, cases)
                  << CountClosestPoint(seed, cases);
    } catch (const std::exception& trouble) {
        std::cerr << "usage: zarnmath_census [SEED [CASES]]\n" << trouble.what() << '\n';
        return 2;
    }
    return 0;
}
