#include "tests/census/BruteForce.h"
#include "tests/census/Cases.h"
#include "tests/census/Census.h"

#include "ZarnMath/Bezier.h"
#include "ZarnMath/Bezier/PowerForm.h"

#include <algorithm>

namespace ZarnMath::Census {

namespace {

using namespace CubicBezier;

enum Row : std::size_t
{
    Pairs,
    AlongTheLine,
    Contacts,
    Reported,
    AtTheStart,
    AtTheEnd,
    OnACut,
    Other,
    Beyond
};

void CountPair(const Cubic& curve, const point2d (&line)[2], double extent, Placement placement, Tally& tally)
{
    const PowerForm f = ToPowerForm(curve.data());
    const vector2d along = line[1] - line[0];
    const double length = std::sqrt(LengthSquared(along));
    const auto distance = [&](double t) { return Cross(Evaluate(f, t) - line[0], along) / length; };
    tally.Count(Pairs, placement);
    if (!(length > 0.0) ||
        std::max({std::fabs(distance(0.0)), std::fabs(distance(0.3)), std::fabs(distance(0.7))}) < 1e-9 * extent) {
        tally.Count(AlongTheLine, placement);
        return;
    }
    std::vector<double> left;
    std::vector<double> lineParameters;
    FindBezierLineIntersection(curve.data(), line, left, lineParameters, true);
    for (const double t : FindZeros(distance, 1e-12 * extent)) {
        tally.Count(Contacts, placement);
        const auto found = std::find_if(left.begin(), left.end(), [=](double r) { return std::fabs(r - t) < 1e-5; });
        if (found != left.end()) {
            tally.Count(Reported, placement);
            left.erase(found);
        } else if (t == 0.0) {
            tally.Count(AtTheStart, placement);
        } else if (t == 1.0) {
            tally.Count(AtTheEnd, placement);
        } else {
            tally.Count(IsOnACut(t) ? OnACut : Other, placement);
        }
    }
    tally.Count(Beyond, placement, static_cast<int>(left.size()));
}

} // namespace

Tally CountCurveLine(std::uint64_t seed, int cases)
{
    Tally tally("A curve and a line, ends included",
                {
                    "pairs",
                    "curves along the line, not counted below",
                    "crossings",
                    "reported",
                    "missed: at the start of the curve",
                    "missed: at the end of the curve",
                    "missed: the root is on a cut",
                    "missed: otherwise",
                    "reported beyond the crossings: touches, and roots listed twice",
                });
    for (const Placement placement : placements) {
        CaseSource source(seed, placement);
        for (int i = 0; i < cases / 2; ++i) {
            source.Next();
            const Cubic curve = source.Curve();
            const point2d from = source.Point();
            const point2d line[2] = {from, source.Point()};
            CountPair(curve, line, source.Extent(), placement, tally);
        }
    }
    return tally;
}

} // namespace ZarnMath::Census
