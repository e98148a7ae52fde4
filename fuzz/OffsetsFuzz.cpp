/// @file
/// Offsets of a cubic.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include "ZarnMath/BezierOffsetInternal.h"

#include <algorithm>

namespace ZarnMath::Fuzzing {

namespace {

using Segment = CubicBezier::bezier2dT<point2d>;

constexpr std::size_t mostCusps = 12;

void CheckSegments(const Cubic& curve, double distance)
{
    const Segment whole{{curve.points[0], curve.points[1], curve.points[2], curve.points[3]}};
    std::vector<Segment> segments{whole};
    Appended<double> changes;
    Bounded("GetSegmentsToOffset", [&] { GetSegmentsToOffset(segments[0], segments, distance, &changes.Vector()); });
    Require(!segments.empty() && AreSame(segments[0].points, whole.points, 4), "the segments are appended");
    Require(segments.size() <= 1 + mostCusps + 1, "one more than there are cusps at most");
    Require(changes.IsAppended() && changes.Count() <= static_cast<int>(mostCusps), "one change a cusp at most");

    std::vector<Segment> same;
    GetSegmentsToOffset(whole, same, distance, nullptr);
    Require(same.size() + 1 == segments.size(), "the curve may be one of the segments, and nobody has to want changes");
    for (std::size_t i = 0; i < same.size(); ++i)
        Require(AreSame(same[i].points, segments[i + 1].points, 4), "to the bit");

    const bool isValid =
        Bounded("IsBezierValidForOffset", [&] { return IsBezierValidForOffset(curve.a, curve.b, curve.c, distance); });
    Require(IsBezierValidForOffset(curve.points, distance) == isValid, "both forms agree");
    if (distance == 0.0)
        Require(isValid && same.size() == 1, "the curve itself can be offset by nothing");
}

void CheckOffsetCurve(const Cubic& curve, double distance, double tolerance)
{
    Guarded<point2d, 4> offset;
    double splitParameter = guard<double>;
    const bool isNear = Bounded("FindBezierOffsetCurve", [&] {
        return FindBezierOffsetCurve(curve.points, offset.data(), distance, tolerance, splitParameter);
    });
    Require(offset.IsIntact() && splitParameter == 0.5, "four points, and a cut in the middle");
    Require(!isNear || tolerance > 0.0, "no error is below 0");
    if (AreOrdinary(curve.points, 4) && IsOrdinary(distance))
        Require(IsFinite(offset[0]) && IsFinite(offset[3]), "the ends of an ordinary offset are finite");
    Guarded<point2d, 4> inPlace;
    std::copy_n(curve.points, 4, inPlace.data());
    Require(FindBezierOffsetCurve(inPlace.data(), inPlace.data(), distance, tolerance, splitParameter) == isNear &&
                AreSame(&inPlace[0], &offset[0], 4),
            "the offset may take the place of the curve");
}

void CheckSamples(const Cubic& curve, double distance, Input& input)
{
    std::vector<double> parameters;
    std::vector<point2d> points;
    while (input.HasMore() && parameters.size() < 20) {
        const double t = input.Parameter();
        const std::size_t before = parameters.size();
        GetOffsetPoint(t, curve.a, curve.b, curve.c, curve.d, distance, parameters, points);
        Require(parameters.size() == points.size() && parameters.size() - before <= 1, "a parameter for each point");
        if (t != t || parameters.size() == before)
            return;
        Require(std::is_sorted(parameters.begin(), parameters.end()), "in ascending order");
    }
}

} // namespace

void FuzzOffsets(Input& input)
{
    const Cubic curve = input.Curve();
    const double distance = input.Double();
    const double tolerance = input.Double();
    CheckSegments(curve, distance);
    CheckOffsetCurve(curve, distance, tolerance);
    CheckSamples(curve, distance, input);
}

} // namespace ZarnMath::Fuzzing
