/// @file
/// The input of the benchmarks: curves of every class that a drawing holds, with all that is asked about them.
#pragma once

#include "ZarnMath/Bezier/PowerForm.h"
#include "tests/Random.h"

#include <array>
#include <vector>

namespace ZarnMath::Benchmarks {

using CubicBezier::PowerForm;

/// What a curve of the corpus looks like.
enum class CurveClass
{
    Generic,      ///< four random points in a square of 1000 units
    S,            ///< with an inflection between two opposite bends
    Loop,         ///< crossing itself
    Cusp,         ///< with a point where the speed vanishes
    NearStraight, ///< control points within about a unit of a line
    LongThin,     ///< a generic curve pressed to a hundredth of its height, and turned
    Arc,          ///< a quarter of a circle, in any rotation
    Tiny,         ///< of any shape, within a few units
    Grid,         ///< control points on a coarse integer grid, some of them coincident or aligned
    Glyph,        ///< from the outlines of a font, whose em is the square's side
};

inline constexpr std::size_t curveClasses = 10;

/// Elements of each class.
inline constexpr std::size_t curvesPerClass = 250;

inline constexpr std::size_t corpusSize = curveClasses * curvesPerClass;

template <typename P>
using LineOf = std::array<P, 2>;
using Line = LineOf<point2d>;

/// What there is in both kinds of coordinates. Elements of one index belong together.
template <typename P>
struct Drawing
{
    std::vector<CubicOf<P>> curves;
    std::vector<CubicOf<P>> others; ///< of each class in turn for each class, moved to cross the curve
    std::vector<P> points;          ///< anywhere in the square of the curves
    std::vector<P> pointsOnCurves;  ///< within 0.05 units of the curve
    std::vector<LineOf<P>> lines;   ///< segments that cross the curve
};

/// A corpus of `corpusSize` curves. The classes take turns, so that no branch of the code under test gets used to one.
struct Corpus
{
    Drawing<point2d> real;
    Drawing<POINT> integer; ///< the same drawing, rounded
    std::vector<PowerForm> forms;
    std::vector<double> parameters;      ///< in (0, 1)
    std::vector<double> laterParameters; ///< between the parameter and 1
    std::vector<double> distances;       ///< up to 100 units, of either sign

    explicit Corpus(std::uint64_t seed);

    template <typename P>
    [[nodiscard]] const Drawing<P>& In() const
    {
        if constexpr (std::is_same_v<P, POINT>)
            return integer;
        else
            return real;
    }
};

/// The one corpus that all benchmarks of a program share.
[[nodiscard]] const Corpus& SharedCorpus();

} // namespace ZarnMath::Benchmarks
