/// @file
/// What the benchmarks of point arrays transform, and by which matrix.
#pragma once

#include "ZarnMath/WMath.h"

#include <vector>

namespace ZarnMath::Benchmarks {

inline constexpr point2d turnCentre{512.25, -300.5};

/// A turn about a point, so that coordinates stay where they are however often it is applied.
[[nodiscard]] inline MATRIX TurnMatrix()
{
    return ConstructRotateAroundMatrix(0.3, turnCentre);
}

template <typename P>
std::vector<P> MakePoints(std::size_t count)
{
    using Coordinate = decltype(P::x);
    std::vector<P> points(count);
    for (std::size_t i = 0; i < count; ++i)
        points[i] = {static_cast<Coordinate>(i * 37 % 20011) - 10000, static_cast<Coordinate>(i * 91 % 30011) - 15000};
    return points;
}

} // namespace ZarnMath::Benchmarks
