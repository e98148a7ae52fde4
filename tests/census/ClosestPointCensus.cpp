#include "tests/census/BruteForce.h"
#include "tests/census/Cases.h"
#include "tests/census/Census.h"

#include "ZarnMath/Bezier.h"
#include "ZarnMath/Bezier/PowerForm.h"

namespace ZarnMath::Census {

namespace {

using namespace CubicBezier;

enum Row : std::size_t
{
    Queries,
    Reported,
    AtAnEndNothing,
    AtAnEndFarther,
    OnACutNothing,
    OnACutFarther,
    PointCurve,
    OtherNothing,
    OtherFarther
};

bool IsPoint(const Cubic& c)
{
    return c[0] == c[1] && c[1] == c[2] && c[2] == c[3];
}

void CountQuery(const Cubic& curve, const point2d& q, double extent, Placement placement, Tally& tally)
{
    tally.Count(Queries, placement);
    if (IsPoint(curve)) {
        tally.Count(PointCurve, placement);
        return;
    }
    const double nearest = FindNearest(curve, q);
    const double least = std::sqrt(LengthSquared(Evaluate(ToPowerForm(curve.data()), nearest) - q));
    double t = 0.0;
    point2d point{};
    double squared = 0.0;
    const bool isFound = FindClosestPointOnBezier(curve.data(), q, t, point, squared);
    if (isFound && std::sqrt(squared) <= least + 1e-6 * extent)
        tally.Count(Reported, placement);
    else if (nearest == 0.0 || nearest == 1.0)
        tally.Count(isFound ? AtAnEndFarther : AtAnEndNothing, placement);
    else if (IsOnACut(nearest))
        tally.Count(isFound ? OnACutFarther : OnACutNothing, placement);
    else
        tally.Count(isFound ? OtherFarther : OtherNothing, placement);
}

} // namespace

Tally CountClosestPoint(std::uint64_t seed, int cases)
{
    Tally tally("The nearest point of a curve", {
                                                    "queries",
                                                    "nearest point reported",
                                                    "missed: it is an end, nothing reported",
                                                    "missed: it is an end, a farther point reported",
                                                    "missed: the foot is on a cut, nothing reported",
                                                    "missed: the foot is on a cut, a farther point reported",
                                                    "missed: the curve is a point",
                                                    "missed: otherwise, nothing reported",
                                                    "missed: otherwise, a farther point reported",
                                                });
    for (const Placement placement : placements) {
        CaseSource source(seed, placement);
        for (int i = 0; i < cases / 2; ++i) {
            source.Next();
            const Cubic curve = source.Curve();
            CountQuery(curve, source.Point(), source.Extent(), placement, tally);
        }
    }
    return tally;
}

} // namespace ZarnMath::Census
