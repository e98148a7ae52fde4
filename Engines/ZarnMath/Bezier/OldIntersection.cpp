#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/Bounds.h"

#include <algorithm>

namespace ZarnMath::CubicBezier::BezierOld {

namespace {

/// The number of halvings after which a stretch is taken for its chord.
constexpr int leafDepth = 8;

/// A stretch that is smaller than this in both directions is given up.
constexpr double smallestSize = 1.00000001;

/// A piece of a curve: its control points, the parameters of its ends on the whole curve, and the box of the points.
struct Stretch
{
    point2d points[4];
    double start;
    double end;
    BoundsT<double> box;
};

/// The caller's arrays, of which count elements are filled.
struct Crossings
{
    double* parameters;
    double* xs;
    double* ys;
    int& count;
};

Stretch ToStretch(const point2d* p, double start, double end) noexcept
{
    return {{p[0], p[1], p[2], p[3]}, start, end, GetPointsBBox(p, 4)};
}

bool IsSmall(const BoundsT<double>& box) noexcept
{
    return std::fabs(box.left - box.right) < smallestSize && std::fabs(box.bottom - box.top) < smallestSize;
}

/// Boxes that touch overlap.
bool Overlap(const BoundsT<double>& a, const BoundsT<double>& b) noexcept
{
    const double lowX = std::max(a.left, b.left);
    const double highX = std::min(a.right, b.right);
    const double lowY = std::max(a.bottom, b.bottom);
    const double highY = std::min(a.top, b.top);
    return !(lowX > highX || lowY > highY);
}

void Halve(const Stretch& whole, Stretch (&halves)[2]) noexcept
{
    point2d left[4];
    point2d right[4];
    Split(whole.points, left, right);
    const double middle = (whole.start + whole.end) * 0.5;
    halves[0] = ToStretch(left, whole.start, middle);
    halves[1] = ToStretch(right, middle, whole.end);
}

/// The crossing of the two chords, moved onto the first curve.
void CrossChords(const Stretch& first, const Stretch& second, Crossings& found) noexcept
{
    const point2d* p = first.points;
    const vector2d along = p[3] - p[0];
    const vector2d otherAlong = second.points[3] - second.points[0];
    const double determinant = Cross(along, otherAlong);
    if (determinant == 0.0)
        return;
    const vector2d between = p[0] - second.points[0];
    const double v = Cross(along, between) / determinant;
    if (!(0.0 <= v && v <= 1.0))
        return;
    const double u = Cross(otherAlong, between) / determinant;
    if (!(0.0 <= u && u <= 1.0))
        return;
    const point2d onChord = p[0] + along * u;
    const bool isFlat = std::fabs(along.x) > std::fabs(along.y);
    const double advance = isFlat ? onChord.x - p[0].x : onChord.y - p[0].y;
    const double length = isFlat ? along.x : along.y;
    const point2d onCurve = Evaluate(ToPowerForm(p), u);
    found.parameters[found.count] = (first.end - first.start) * advance / length + first.start;
    found.xs[found.count] = onCurve.x;
    found.ys[found.count] = onCurve.y;
    ++found.count;
}

/// Visits the pairs of halves whose boxes overlap, depth first. The boxes of the two stretches overlap.
void Search(const Stretch& first, const Stretch& second, Crossings& found, int depth) noexcept
{
    if (found.count == maxIntersections)
        return;
    if (depth >= leafDepth) {
        CrossChords(first, second, found);
        return;
    }
    if (IsSmall(first.box) || IsSmall(second.box))
        return;
    Stretch firstHalves[2];
    Stretch secondHalves[2];
    Halve(first, firstHalves);
    Halve(second, secondHalves);
    for (const Stretch& firstHalf : firstHalves)
        for (const Stretch& secondHalf : secondHalves)
            if (Overlap(firstHalf.box, secondHalf.box))
                Search(firstHalf, secondHalf, found, depth + 1);
}

} // namespace

int BezierIntersectionEx(const point2d* first, double firstStart, double firstEnd, const point2d* second,
                         double secondStart, double secondEnd, double* parameters, double* xs, double* ys, int& count,
                         int depth) noexcept
{
    const Stretch one = ToStretch(first, firstStart, firstEnd);
    const Stretch other = ToStretch(second, secondStart, secondEnd);
    Crossings found{parameters, xs, ys, count};
    if (depth >= leafDepth || Overlap(one.box, other.box))
        Search(one, other, found, depth);
    return count;
}

} // namespace ZarnMath::CubicBezier::BezierOld
