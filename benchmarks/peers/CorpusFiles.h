/// @file
/// The corpus as files, for programs in other languages.
#pragma once

#include "benchmarks/Corpus.h"

#include <filesystem>

namespace ZarnMath::Peers {

/// Writes the corpus with the right answers, each file an array of doubles in the byte order of this machine:
///
/// | file                | an element                                                                              |
/// |---------------------|-----------------------------------------------------------------------------------------|
/// | curves, others      | x and y of four control points                                                          |
/// | points              | x and y                                                                                 |
/// | lines               | x and y of two ends                                                                     |
/// | nearest             | the distance of the point from the nearest point of the curve                           |
/// | lengths             | the length of the curve                                                                 |
/// | boxes               | left, bottom, right and top of the curve                                                |
/// | polynomials-N       | N + 1 Bernstein coefficients                                                            |
/// | roots-N             | how many roots there are in (0, 1), and the roots, filled up with NaN to N of them       |
void WriteCorpus(const Benchmarks::Corpus& corpus, const std::filesystem::path& folder);

} // namespace ZarnMath::Peers
