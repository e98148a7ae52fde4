/// @file
/// What the right answers are, found slowly and by other means than the library's.
#pragma once

#include "benchmarks/Corpus.h"

namespace ZarnMath::Peers {

struct Box
{
    double left;
    double bottom;
    double right;
    double top;
};

/// The distance of a point from a curve, ends included.
[[nodiscard]] double TrueDistance(const Cubic& curve, const point2d& q);

/// The length, by adaptive quadrature of GSL to an estimated error of 1e-10.
[[nodiscard]] double TrueLength(const Cubic& curve);

/// The extent of many samples.
[[nodiscard]] Box TrueBox(const Cubic& curve);

} // namespace ZarnMath::Peers
