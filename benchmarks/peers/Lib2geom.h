/// @file
/// The corpus in the types of lib2geom, made before the clock runs.
#pragma once

#include "benchmarks/Corpus.h"

#include <2geom/bezier-curve.h>

namespace ZarnMath::Peers {

inline Geom::Point ToGeom(const point2d& p)
{
    return {p.x, p.y};
}

inline std::vector<Geom::CubicBezier> ToGeom(const std::vector<Cubic>& curves)
{
    std::vector<Geom::CubicBezier> converted;
    for (const Cubic& p : curves)
        converted.emplace_back(ToGeom(p[0]), ToGeom(p[1]), ToGeom(p[2]), ToGeom(p[3]));
    return converted;
}

inline std::vector<Geom::Point> ToGeom(const std::vector<point2d>& points)
{
    std::vector<Geom::Point> converted;
    for (const point2d& p : points)
        converted.push_back(ToGeom(p));
    return converted;
}

} // namespace ZarnMath::Peers
