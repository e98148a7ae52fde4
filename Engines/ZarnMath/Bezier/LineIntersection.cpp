#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/RootFinder.h"

#include <algorithm>

namespace ZarnMath::CubicBezier {

namespace {

/// The coordinate of a point along a line, 0 at line[0] and 1 at line[1], read off the line's dominant axis. The
/// reciprocal of its extent is taken once, for all points.
class LineScale
{
public:
    explicit LineScale(const point2d* line) noexcept
    {
        const vector2d along = line[1] - line[0];
        axis = std::fabs(along.x) > std::fabs(along.y) ? &point2d::x : &point2d::y;
        origin = line[0].*axis;
        inverse = 1.0 / (line[1].*axis - origin);
    }

    double operator()(const point2d& p) const noexcept
    {
        return inverse * (p.*axis - origin);
    }

private:
    double point2d::*axis;
    double origin;
    double inverse;
};

} // namespace

int FindRootsOnLine(const PowerForm& f, const point2d* line, double* roots, bool includeEndpoints) noexcept
{
    const vector2d along = line[1] - line[0];
    if (along.x == 0.0 && along.y == 0.0)
        return 0;
    const double distance[4] = {Cross(f.a, along), Cross(f.b, along), Cross(f.c, along), Cross(f.d - line[0], along)};
    return RootFinder::FindRoots<3>(distance, roots, includeEndpoints);
}

bool FindBezierLineIntersection(const point2d* bezier, const point2d* line, std::vector<double>& bezierParameters,
                                std::vector<double>& lineParameters, bool includeEndpoints)
{
    bezierParameters.clear();
    lineParameters.clear();
    const PowerForm f = ToPowerForm(bezier);
    double roots[4];
    const int count = FindRootsOnLine(f, line, roots, includeEndpoints);
    if (count == 0)
        return false;
    const LineScale lineParameter(line);
    for (int i = 0; i < count; ++i) {
        bezierParameters.push_back(roots[i]);
        lineParameters.push_back(lineParameter(Evaluate(f, roots[i])));
    }
    return true;
}

bool FindBezierLineIntersection(const POINT* bezier, const POINT* line, std::vector<double>& bezierParameters,
                                std::vector<double>& lineParameters, bool includeEndpoints)
{
    const point2d ends[2] = {ToPoint2d(line[0]), ToPoint2d(line[1])};
    return FindBezierLineIntersection(ToDoubleCubic(bezier).points, ends, bezierParameters, lineParameters,
                                      includeEndpoints);
}

bool FindBezierIntersectionsAtX(const point2d* bezier, double x, std::vector<double>& parameters, bool includeEndpoints)
{
    const PowerForm f = ToPowerForm(bezier);
    const double distance[4] = {f.a.x, f.b.x, f.c.x, f.d.x - x};
    double roots[4];
    const int count = RootFinder::FindRoots<3>(distance, roots, includeEndpoints);
    parameters.insert(parameters.end(), roots, roots + count);
    return !parameters.empty();
}

bool DoesBezierIntersectLineSegment(const point2d* bezier, const point2d* line) noexcept
{
    const PowerForm f = ToPowerForm(bezier);
    double roots[4];
    const int count = FindRootsOnLine(f, line, roots, false);
    if (count == 0)
        return false;
    const LineScale lineParameter(line);
    return std::any_of(roots, roots + count, [&](double t) {
        const double u = lineParameter(Evaluate(f, t));
        return u >= 0.0 && u <= 1.0;
    });
}

bool DoesBezierIntersectLineSegment(const POINT* bezier, const POINT* line) noexcept
{
    const point2d ends[2] = {ToPoint2d(line[0]), ToPoint2d(line[1])};
    return DoesBezierIntersectLineSegment(ToDoubleCubic(bezier).points, ends);
}

} // namespace ZarnMath::CubicBezier
