#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

void AddBezierOffset(std::vector<Function>& list)
{
    using Point = const point2d&;
    using Curve = CubicBezier::bezier2dT<point2d>;
    Family family(list, "BezierOffset");
    family.Add<bool(Point, Point, Point, double)>("IsBezierValidForOffset", IsBezierValidForOffset, powerA, powerB,
                                                  powerC, distance);
    family.Add<bool(const point2d*, double)>("IsBezierValidForOffset", IsBezierValidForOffset, cubic<>, distance);
    family.Add<bool(const point2d*, point2d*, double, double, double&)>("FindBezierOffsetCurve", FindBezierOffsetCurve,
                                                                        cubic<>, writtenArray<point2d, 4>, distance,
                                                                        tolerance, written<double>);
    family.Set(NumberClass::Platform);
    family.AddWith<void(
        const Curve&, std::vector<Curve>&, double,
        std::vector<double>*)>("GetSegmentsToOffset", GetSegmentsToOffset, [](auto call, Source& in, Sink& out) {
        const CurveOf<point2d> points = in.Cubic();
        const double offset = in.Distance();
        const bool isAskedForChanges = in.Flag();
        std::vector<Curve> segments;
        std::vector<double> changes;
        call({{points[0], points[1], points[2], points[3]}}, segments, offset, isAskedForChanges ? &changes : nullptr);
        out.Put(segments);
        out.Put(changes);
    });
}

} // namespace ZarnMath::Catalogue
