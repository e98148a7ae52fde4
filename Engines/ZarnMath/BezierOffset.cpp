#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/BezierOffsetInternal.h"
#include "ZarnMath/FitBezier.h"
#include "ZarnMath/WMath.h"

#include <algorithm>
#include <initializer_list>

namespace ZarnMath {

namespace {

using CubicBezier::PowerForm;
using CubicBezier::ToPowerForm;
using Cubic = CubicBezier::bezier2dT<point2d>;

/// Samples nearer to each other than this, in the parameter, would say the same.
constexpr double leastSpacing = 0.005;
constexpr int gridSteps = 10;
constexpr int offsetPasses = 10;

/// The number of parameters that `FindCurvatureMinMax` finds at most.
constexpr int mostExtremes = 11;

/// Cusps at most this far apart, in the parameter, can be a pair that leaves no visible fold...
constexpr double pairSpacing = 0.05;
/// ...namely where the curve turns by less than this between them, in degrees.
constexpr double pairTurn = 2.0;

vector2d TangentAt(const PowerForm& f, double t) noexcept
{
    return CubicBezier::SafeBezierTangent(t, f.a, f.b, f.c, f.d);
}

/// Whether a curve of this radius folds when it is offset: it turns toward the offset, and tighter than the distance.
bool IsTooTight(double radius, double distance) noexcept
{
    return (distance > 0.0 && radius < distance && radius >= 0.0) ||
           (distance < 0.0 && radius > distance && radius < 0.0);
}

Cubic Stretch(const Cubic& curve, double start, double end) noexcept
{
    Cubic piece;
    CubicBezier::Subsection(start, end, curve.points, piece.points);
    return piece;
}

/// The turn is signed, so that any turn clockwise passes.
bool IsNegligiblePair(const PowerForm& f, double first, double second) noexcept
{
    return !(std::fabs(first - second) > pairSpacing) &&
           !(Degrees::GetFineAngle(TangentAt(f, first), TangentAt(f, second)) >= pairTurn);
}

void RemoveNegligiblePairs(const PowerForm& f, std::vector<double>& cusps)
{
    constexpr double removed = -1.0;
    for (std::size_t i = 0; i + 1 < cusps.size(); ++i) {
        if (IsNegligiblePair(f, cusps[i], cusps[i + 1])) {
            cusps[i] = cusps[i + 1] = removed;
            ++i;
        }
    }
    std::erase_if(cusps, [](double t) { return t < 0.0; });
}

/// Joins the pieces of a curve, one after the other, to stretches that are valid throughout.
class StretchCollector
{
public:
    StretchCollector(const Cubic& wholeCurve, double offsetDistance, std::vector<Cubic>& results,
                     std::vector<double>* changes)
        : curve(wholeCurve), distance(offsetDistance), segments(results), validityChanges(changes)
    {}

    /// Goes on with the piece that ends at t.
    void Advance(double t)
    {
        if (t <= pieceStart) {
            pieceStart = t;
            return;
        }
        const Cubic piece = Stretch(curve, pieceStart, t);
        const bool isValid = IsBezierValidForOffset(piece.points, distance);
        if (validityChanges != nullptr && isValid != wasValid && !isFirst)
            validityChanges->push_back(pieceStart);
        if (isValid)
            Keep(piece, t);
        else
            Drop(t);
        isFirst = false;
        wasValid = isValid;
        pieceStart = t;
    }

private:
    void Keep(const Cubic& piece, double t)
    {
        if (t >= 1.0)
            segments.push_back(runStart < pieceStart ? Stretch(curve, runStart, t) : piece);
    }

    void Drop(double t)
    {
        if (runStart < pieceStart)
            segments.push_back(Stretch(curve, runStart, pieceStart));
        runStart = t;
    }

    const Cubic curve; // a copy: the caller's may be one of the segments
    const double distance;
    std::vector<Cubic>& segments;
    std::vector<double>* const validityChanges;
    double runStart = 0.0;
    double pieceStart = 0.0;
    bool wasValid = false;
    bool isFirst = true;
};

/// The curvature, times the size of the curve, below which an extreme of it is as good as straight: a bend whose radius is
/// ten times the size.
constexpr double flatBend = 0.1;

/// The curvature from which on an extreme is worth a sample.
double LeastSampledCurvature(const PowerForm& f) noexcept
{
    double minX = 0.0;
    double minY = 0.0;
    double maxX = 0.0;
    double maxY = 0.0;
    CubicBezier::GetTightBounds(f.a, f.b, f.c, f.d, minX, minY, maxX, maxY);
    const double size = std::max(std::fabs(maxX - minX), std::fabs(maxY - minY));
    return size != 0.0 ? flatBend / size : 0.0;
}

/// Samples of the offset, sorted by parameter.
struct OffsetSamples
{
    std::vector<double> parameters;
    std::vector<point2d> points;

    OffsetSamples(const PowerForm& f, double distance)
    {
        double extremes[mostExtremes];
        const int count = CubicBezier::FindCurvatureMinMax(f.a, f.b, f.c, extremes);
        const auto capacity = static_cast<std::size_t>(count) + gridSteps + 1;
        parameters.reserve(capacity);
        points.reserve(capacity);
        if (count > 0)
            AddExtremes(f, distance, extremes, count);
        for (int i = 0; i <= gridSteps; ++i)
            Add(i / static_cast<double>(gridSteps), f, distance);
    }

private:
    void Add(double t, const PowerForm& f, double distance)
    {
        GetOffsetPoint(t, f.a, f.b, f.c, f.d, distance, parameters, points);
    }

    void AddExtremes(const PowerForm& f, double distance, const double* extremes, int count)
    {
        const double threshold = LeastSampledCurvature(f);
        for (int i = 0; i < count; ++i) {
            double curvature = 0.0;
            if (!CubicBezier::GetCurvatureAt(extremes[i], f.a, f.b, f.c, curvature) ||
                std::fabs(curvature) >= threshold)
                Add(extremes[i], f, distance);
        }
    }
};

} // namespace

bool IsBezierValidForOffset(const point2d& a, const point2d& b, const point2d& c, double distance) noexcept
{
    for (const double t : {0.5, 0.25, 0.75}) {
        double radius = 0.0;
        if (!CubicBezier::GetCurvatureRadiusAt(t, a, b, c, radius) || !IsTooTight(radius, distance))
            return true;
    }
    return false;
}

bool IsBezierValidForOffset(const point2d* bezier, double distance) noexcept
{
    const PowerForm f = ToPowerForm(bezier);
    return IsBezierValidForOffset(f.a, f.b, f.c, distance);
}

void GetSegmentsToOffset(const Cubic& bezier, std::vector<Cubic>& segments, double distance,
                         std::vector<double>* validityChanges)
{
    const PowerForm f = ToPowerForm(bezier.points);
    std::vector<double> ends;
    CubicBezier::FindOffsetCusps(f.a, f.b, f.c, distance, ends);
    RemoveNegligiblePairs(f, ends);
    if (ends.empty()) {
        if (IsBezierValidForOffset(f.a, f.b, f.c, distance))
            segments.push_back(bezier);
        return;
    }
    if (ends.back() < 1.0)
        ends.push_back(1.0);
    StretchCollector stretches(bezier, distance, segments, validityChanges);
    for (const double t : ends)
        stretches.Advance(t);
}

void GetOffsetPoint(double t, const point2d& a, const point2d& b, const point2d& c, const point2d& d, double distance,
                    std::vector<double>& parameters, std::vector<point2d>& points)
{
    const bool isEnd = t == 1.0 || t == 0.0;
    std::ptrdiff_t place = 0;
    for (const double p : parameters) {
        if (!isEnd && std::fabs(p - t) < leastSpacing)
            return;
        if (p > t)
            break;
        ++place;
    }
    parameters.insert(parameters.begin() + place, t);
    const vector2d n = Normalize(CubicBezier::SafeBezierTangent(t, a, b, c, d));
    points.insert(points.begin() + place, CubicBezier::Evaluate(a, b, c, d, t) + Perpendicular(n) * distance);
}

bool FindBezierOffsetUsingLeastSquares(const point2d& a, const point2d& b, const point2d& c, const point2d& d,
                                       point2d* offsetBezier, double /*ignored*/, const point2d* points,
                                       unsigned long count, double& error, double& splitParameter)
{
    const PowerForm f{a, b, c, d};
    const vector2d start = Normalize(TangentAt(f, 0.0));
    const vector2d end = Normalize(TangentAt(f, 1.0));
    error = LeastSquares(points, static_cast<int>(count), start, end, offsetBezier, offsetPasses);
    splitParameter = 0.5;
    return true;
}

bool FindBezierOffsetCurve(const point2d* bezier, point2d* offsetBezier, double distance, double tolerance,
                           double& splitParameter)
{
    const PowerForm f = ToPowerForm(bezier);
    const OffsetSamples samples(f, distance);
    double error = std::numeric_limits<double>::max();
    splitParameter = -1.0; // while nothing is fitted
    FindBezierOffsetUsingLeastSquares(f.a, f.b, f.c, f.d, offsetBezier, tolerance, samples.points.data(),
                                      samples.points.size(), error, splitParameter);
    return error < tolerance;
}

} // namespace ZarnMath
