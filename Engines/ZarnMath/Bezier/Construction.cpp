#include "ZarnMath/Bezier.h"

namespace ZarnMath::CubicBezier {

namespace {

/// The componentwise sum of two positions, as an ingredient of their midpoint.
vector2d Sum(const point2d& p, const point2d& q) noexcept
{
    return AsVector(p) + AsVector(q);
}

/// The control point of the quadratic that runs through a point at t = 0.5.
point2d InterpolatingControlPoint(const point2d& start, const point2d& through, const point2d& end) noexcept
{
    const vector2d half = AsVector(through) - Sum(start, end) * 0.25;
    return AsPoint(half + half);
}

/// The squared distance of p from the line through a point along e, whose squared length is g.
double SquaredDistanceFromLine(const point2d& p, const point2d& through, const vector2d& e, double g) noexcept
{
    const point2d foot = through + e * (Dot(p - through, e) / g);
    return LengthSquared(foot - p);
}

/// The control point on the bisector of the corner at `through`, as far outside of it as the geometric mean of the
/// distances of start and end from the line through it that is square to the bisector.
point2d BisectingControlPoint(const point2d& start, const point2d& through, const point2d& end) noexcept
{
    const vector2d u = through - start;
    const vector2d v = through - end;
    const vector2d n = Normalize(Normalize(u) + Normalize(v));
    const vector2d e = (through + Perpendicular(n)) - through;
    const double g = LengthSquared(e);
    double s1 = LengthSquared(u);
    double s2 = LengthSquared(v);
    if (g > 0.0) {
        s1 = SquaredDistanceFromLine(start, through, e, g);
        s2 = SquaredDistanceFromLine(end, through, e, g);
    }
    return through + n * std::sqrt(std::sqrt(s1) * std::sqrt(s2));
}

} // namespace

void From3Points(POINT* out, const point2d& start, const point2d& through, const point2d& end, bool simple) noexcept
{
    const bool interpolates = simple || IsNearEqual(through, start) || IsNearEqual(end, start);
    const point2d q =
        interpolates ? InterpolatingControlPoint(start, through, end) : BisectingControlPoint(start, through, end);
    out[0] = ToPOINT(start);
    out[1] = ToPOINT(start + (q - start) * 0.6666666666666666);
    out[2] = ToPOINT(q + (end - q) * 0.3333333333333333);
    out[3] = ToPOINT(end);
}

bool From3Points(POINT* out, const point2d& start, const vector2d& startTangent, const point2d& through,
                 const point2d& end, const vector2d& endTangent) noexcept
{
    const double det = Cross(startTangent, endTangent);
    if (IsNearZero(det))
        return false;
    // (P0 + 3*P1 + 3*P2 + P3)/8 = through, solved for startTangent*alpha + endTangent*beta.
    const vector2d offset = (AsVector(through) * 8.0 - Sum(start, end) * 4.0) / 3.0;
    const double alpha = Cross(offset, endTangent) / det;
    const double beta = Cross(startTangent, offset) / det;
    out[0] = ToPOINT(start);
    out[1] = ToPOINT(start + startTangent * alpha);
    out[2] = ToPOINT(end + endTangent * beta);
    out[3] = ToPOINT(end);
    return true;
}

} // namespace ZarnMath::CubicBezier
