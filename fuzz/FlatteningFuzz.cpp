/// @file
/// Cubics as polylines.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include "ZarnMath/BezierToLinesInternal.h"

#include <algorithm>

namespace ZarnMath::Fuzzing {

namespace {

/// The most segments that the adaptive flattening makes.
constexpr int mostLines = 2047;

/// The largest regular flattening that is tried.
constexpr int mostSteps = 300;

template <typename P>
void CheckSteps(const P* curve, int lines)
{
    Guarded<P, mostSteps + 1> out;
    Bounded(
        "BezierToLines", [&] { BezierToLines(curve, out.data(), lines); }, lines + 1);
    Require(out.IsUntouchedFrom(lines + 1), "one point more than segments");
    Require((lines == 0 || IsSame(out[0], curve[0])) && IsSame(out[lines], curve[3]), "the ends are exact");
}

template <typename P>
void CheckAdaptive(const P* curve, double tolerance, int maxLines)
{
    static Guarded<P, mostLines + 1> out;
    out = {};
    const int most = std::clamp(maxLines, 0, mostLines);
    const int n = Bounded(
        "AdaptiveBezierToLines", [&] { return AdaptiveBezierToLines(curve, out.data(), tolerance, maxLines); },
        most + 1);
    if (maxLines < 1) {
        Require(n == 0 && out.IsUntouched(), "no segments, and nothing stored");
        return;
    }
    Require(1 <= n && n <= most && (maxLines == 1 ? n == 1 : n % 2 == 0),
            "an even number of segments, within the limit");
    Require(out.IsUntouchedFrom(n + 1), "one point more than segments");
    Require(IsSame(out[0], curve[0]) && IsSame(out[n], curve[3]), "the ends are exact");

    int minDepth = guard<int>;
    int maxDepth = guard<int>;
    CalculateRecursionDepth(curve, tolerance, maxLines, minDepth, maxDepth);
    Require(-2 <= maxDepth && maxDepth <= 29 && minDepth <= std::max(maxDepth, 3), "depths within their limits");
}

void CheckBudget(int lines, int maxLines)
{
    Require(lines == maxLines || lines == maxLines / 2 || lines == maxLines / 4 || lines == maxLines / 8,
            "a share of the budget");
}

} // namespace

void FuzzFlattening(Input& input)
{
    const double tolerance = input.Flag() ? 0.0 : input.Double();
    const int maxLines = input.Flag() ? input.Int() : input.Byte() * 9;
    const int lines = input.Byte() % (mostSteps + 1);
    const Cubic curve = input.Curve();
    const IntegerCubic integers = input.IntegerCurve();
    CheckSteps(curve.points, lines);
    CheckSteps(integers.points, lines);
    CheckAdaptive(curve.points, tolerance, maxLines);
    CheckAdaptive(integers.points, tolerance, maxLines);
    CheckBudget(CalculateNumBezierLines(curve.points, maxLines), maxLines);
    CheckBudget(CalculateNumBezierLines(integers.points, maxLines), maxLines);
    const RECT box = input.Rect();
    CheckBudget(Bounded("CalculateNumBezierLines", [&] { return CalculateNumBezierLines(box, maxLines); }), maxLines);
}

} // namespace ZarnMath::Fuzzing
