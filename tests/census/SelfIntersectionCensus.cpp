#include "tests/census/Cases.h"
#include "tests/census/Census.h"

#include "ZarnMath/Bezier.h"
#include "ZarnMath/Bezier/PowerForm.h"

#include <algorithm>
#include <optional>

namespace ZarnMath::Census {

namespace {

using namespace CubicBezier;

enum Row : std::size_t
{
    Curves,
    Loops,
    Detected,
    UndetectedClosed,
    Undetected,
    Found,
    FirstNotFound
};

/// Upper bounds of the loops' sizes; the last row holds the rest.
constexpr double sizes[] = {64.0, 128.0, 256.0, 512.0, 1024.0};

struct Loop
{
    double early;
    double late;
    double size;
};

/// The loop in closed form, with its size as the larger side of its box.
std::optional<Loop> FindLoop(const Cubic& curve)
{
    const PowerForm f = ToPowerForm(curve.data());
    const double ab = Cross(f.a, f.b);
    if (!(std::fabs(ab) > 1e-10 * std::sqrt(LengthSquared(f.a) * LengthSquared(f.b))))
        return std::nullopt;
    const double sum = -Cross(f.a, f.c) / ab;
    const double product = sum * sum - Cross(f.b, f.c) / ab;
    const double discriminant = sum * sum - 4.0 * product;
    if (!(discriminant > 1e-9))
        return std::nullopt;
    Loop loop{(sum - std::sqrt(discriminant)) * 0.5, (sum + std::sqrt(discriminant)) * 0.5, 0.0};
    if (!(loop.early > -1e-9 && loop.late < 1.0 + 1e-9))
        return std::nullopt;
    const point2d from = Evaluate(f, loop.early);
    for (int i = 0; i <= 64; ++i) {
        const vector2d away = Evaluate(f, loop.early + (loop.late - loop.early) * i / 64.0) - from;
        loop.size = std::max({loop.size, std::fabs(away.x), std::fabs(away.y)});
    }
    return loop;
}

void CountCurve(const Cubic& curve, Placement placement, Tally& tally)
{
    tally.Count(Curves, placement);
    const auto loop = FindLoop(curve);
    if (!loop)
        return;
    tally.Count(Loops, placement);
    double unused[4];
    const bool isDetected = DoesBezierSelfIntersect(curve.data(), unused[0], unused[1], unused[2], unused[3], true);
    const bool isClosed = curve[0] == curve[3];
    tally.Count(isDetected ? Detected : isClosed ? UndetectedClosed : Undetected, placement);
    double first = 0.0;
    double second = 0.0;
    point2d point{};
    if (FindBezierSelfIntersection(curve.data(), first, second, point)) {
        tally.Count(Found, placement);
    } else if (isDetected) {
        const auto size = std::upper_bound(std::begin(sizes), std::end(sizes), loop->size);
        tally.Count(FirstNotFound + static_cast<std::size_t>(size - std::begin(sizes)), placement);
    }
}

} // namespace

Tally CountSelfIntersection(std::uint64_t seed, int cases)
{
    Tally tally("A curve and itself", {
                                          "curves",
                                          "loops",
                                          "detected",
                                          "missed: not detected, ends that coincide",
                                          "missed: not detected, otherwise",
                                          "found",
                                          "missed: detected and not found, loop below 64 units",
                                          "... 64 to 128 units",
                                          "... 128 to 256 units",
                                          "... 256 to 512 units",
                                          "... 512 to 1024 units",
                                          "... above 1024 units",
                                      });
    for (const Placement placement : placements) {
        CaseSource source(seed, placement);
        for (int i = 0; i < cases / 2; ++i) {
            source.Next();
            CountCurve(source.Curve(), placement, tally);
        }
    }
    return tally;
}

} // namespace ZarnMath::Census
