#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

using Direction = const vector2d&;

constexpr int mostPoints = 12;
constexpr int mostPasses = 4;

/// Parameters of points in order, as a caller brings them: in steps of equal size, or any.
std::vector<double> DrawParameters(Source& in, int count)
{
    std::vector<double> u;
    const bool isEven = in.Flag();
    for (int i = 0; i < count; ++i)
        u.push_back(isEven ? static_cast<double>(i) / (count - 1) : in.Parameter());
    return u;
}

void AddFixedEnds(Family& family)
{
    family.AddWith<double(const point2d*, double*, int, Direction, Direction, point2d*, int, double*, double)>(
        "LeastSquares", LeastSquares, [](auto call, Source& in, Sink& out) {
            const int count = in.Count(0, mostPoints);
            const std::vector<point2d> points = in.Points(count);
            std::vector<double> u = DrawParameters(in, count);
            const vector2d start = in.Vector();
            const vector2d end = in.Vector();
            const int passes = in.Count(1, mostPasses);
            const bool isAskedForWorst = in.Flag();
            const double threshold = in.Tolerance();
            CurveOf<point2d> curve = in.Cubic();
            double worst = unwrittenNumber;
            out.Put(call(points.data(), u.data(), count, start, end, curve.data(), passes,
                         isAskedForWorst ? &worst : nullptr, threshold));
            out.Put(u);
            out.Put(curve);
            out.Put(worst);
        });
    family.Add<double(const point2d*, int, Direction, Direction, point2d*, int)>(
        "LeastSquares", LeastSquares, points<point2d, 0, mostPoints>, countOfPoints<>, vector, vector,
        writtenArray<point2d, 4>, count<1, mostPasses>);
}

void AddFreeEnds(Family& family)
{
    family.AddWith<double(const point2d*, double*, int, point2d*, int, double*)>(
        "LeastSquares", LeastSquares, [](auto call, Source& in, Sink& out) {
            const int count = in.Count(0, mostPoints);
            const std::vector<point2d> points = in.Points(count);
            std::vector<double> u = DrawParameters(in, count);
            const int passes = in.Count(0, mostPasses);
            const bool isAskedForWorst = in.Flag();
            CurveOf<point2d> curve = in.Cubic();
            double worst = unwrittenNumber;
            out.Put(call(points.data(), u.data(), count, curve.data(), passes, isAskedForWorst ? &worst : nullptr));
            out.Put(u);
            out.Put(curve);
            out.Put(worst);
        });
    family.Add<double(const point2d*, int, point2d*, int)>("LeastSquares", LeastSquares, points<point2d, 0, mostPoints>,
                                                           countOfPoints<>, writtenArray<point2d, 4>,
                                                           count<0, mostPasses>);
}

void AddJoint(Family& family)
{
    family.AddWith<double(const point2d*, double*, int, int, Direction, Direction, point2d*, point2d*, int)>(
        "LeastSquares", LeastSquares, [](auto call, Source& in, Sink& out) {
            const int count = in.Count(2, mostPoints);
            const int split = in.Count(1, count - 1);
            const std::vector<point2d> points = in.Points(count);
            std::vector<double> u = DrawParameters(in, count);
            const vector2d start = in.Vector();
            const vector2d end = in.Vector();
            const int passes = in.Count(0, mostPasses);
            CurveOf<point2d> first = in.Cubic();
            CurveOf<point2d> second = in.Cubic();
            out.Put(call(points.data(), u.data(), count, split, start, end, first.data(), second.data(), passes));
            out.Put(u);
            out.Put(first);
            out.Put(second);
        });
    family.AddWith<double(const point2d*, int, int, Direction, Direction, point2d*, point2d*, int)>(
        "LeastSquares", LeastSquares, [](auto call, Source& in, Sink& out) {
            const int count = in.Count(2, mostPoints);
            const int split = in.Count(1, count - 1);
            const std::vector<point2d> points = in.Points(count);
            const vector2d start = in.Vector();
            const vector2d end = in.Vector();
            const int passes = in.Count(0, mostPasses);
            CurveOf<point2d> first = in.Cubic();
            CurveOf<point2d> second = in.Cubic();
            out.Put(call(points.data(), count, split, start, end, first.data(), second.data(), passes));
            out.Put(first);
            out.Put(second);
        });
}

} // namespace

void AddFitBezier(std::vector<Function>& list)
{
    Family family(list, "FitBezier");
    family.Add<void(const point2d*, int, std::vector<double>&)>(
        "Calculate_u", Calculate_u, points<point2d, -1, mostPoints>, countOfPoints<>, appended<double>);
    AddFixedEnds(family);
    AddFreeEnds(family);
    AddJoint(family);
    family.Add<bool(const point2d*, unsigned long, std::vector<double>&)>(
        "LeastSquares", LeastSquares, points<point2d, 0, mostPoints>, countOfPoints<unsigned long>, appended<double>);
}

} // namespace ZarnMath::Catalogue
