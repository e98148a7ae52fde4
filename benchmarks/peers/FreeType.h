/// @file
/// The corpus as outlines of FreeType, in 64ths of a unit.
#pragma once

#include "benchmarks/Corpus.h"

#include <ft2build.h>
#include FT_FREETYPE_H
#include FT_OUTLINE_H

#include <memory>
#include <vector>

namespace ZarnMath::Peers {

inline double FromFixed(FT_Pos value)
{
    return static_cast<double>(value) / 64.0;
}

inline FT_Pos ToFixed(double value)
{
    return std::lround(value * 64.0);
}

/// An open contour of one cubic. The outline points into the arrays, so that it must not be copied.
struct CubicOutline
{
    std::array<FT_Vector, 4> points;
    std::array<char, 4> tags{FT_CURVE_TAG_ON, FT_CURVE_TAG_CUBIC, FT_CURVE_TAG_CUBIC, FT_CURVE_TAG_ON};
    short end = 3;
    FT_Outline outline{};

    explicit CubicOutline(const Cubic& curve)
    {
        for (std::size_t i = 0; i < points.size(); ++i)
            points[i] = {ToFixed(curve[i].x), ToFixed(curve[i].y)};
        outline.n_contours = 1;
        outline.n_points = 4;
        outline.points = points.data();
        outline.tags = tags.data();
        outline.contours = &end;
    }

    CubicOutline(const CubicOutline&) = delete;
    CubicOutline& operator=(const CubicOutline&) = delete;
};

/// All curves of the corpus, at addresses that stay.
class Outlines
{
public:
    explicit Outlines(const std::vector<Cubic>& curves)
    {
        for (const Cubic& curve : curves)
            all.push_back(std::make_unique<CubicOutline>(curve));
    }

    CubicOutline& operator[](std::size_t i)
    {
        return *all[i];
    }

private:
    std::vector<std::unique_ptr<CubicOutline>> all;
};

} // namespace ZarnMath::Peers
