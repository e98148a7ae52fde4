// Each statement draws once, or in braces: what an expression draws in which order is up to the compiler.
#include "tests/digest/SeededSource.h"

#include <algorithm>
#include <cmath>
#include <cstring>
#include <iterator>
#include <limits>

namespace ZarnMath::Digest {

namespace {

using Catalogue::Coefficients;
using Catalogue::CurveOf;

constexpr double infinity = std::numeric_limits<double>::infinity();
constexpr double largest = std::numeric_limits<double>::max();
constexpr double smallestNormal = std::numeric_limits<double>::min();
constexpr double smallest = std::numeric_limits<double>::denorm_min();
constexpr std::int32_t largestInteger = std::numeric_limits<std::int32_t>::max();
constexpr std::int32_t smallestInteger = std::numeric_limits<std::int32_t>::min();

constexpr double specialNumbers[] = {
    0.0,
    -0.0,
    1.0,
    -1.0,
    0.5,
    -0.5,
    0.49999999999999994,
    smallest,
    -smallest,
    smallestNormal,
    smallestNormal / 4.0,
    -smallestNormal,
    largest,
    -largest,
    infinity,
    -infinity,
    std::numeric_limits<double>::quiet_NaN(),
    1e154,
    1e-154,
    1e-162,
    2147483647.0,
    -2147483648.0,
    2147483647.5,
    -2147483648.5,
    2147483648.0,
    4294967296.0,
    9007199254740992.0,
    16777217.0,
};

// Tolerances, limits and lengths that some function compares with.
constexpr double boundaries[] = {
    DBL_EPSILON,
    1000.0 * DBL_EPSILON,
    1e-10,
    1e-9,
    1e-8,
    1e-6,
    1e-5,
    1e-4,
    0.01,
    0.02,
    0.05,
    0.1,
    0.25,
    0.333,
    0.5,
    0.75,
    1.0,
    1.00000001,
    1.4901161193847656e-8,
    2.0,
    4.0,
    30.0,
    150.0,
    160.0,
    650.0,
    700.0,
    900.0,
    22500.0,
    490000.0,
    536870911.0,
    536870912.0,
    1.5550883635269477,
    0.017453292519943295,
};

constexpr std::int32_t specialIntegers[] = {
    0,         1,          -1,          2,         -2,        largestInteger, smallestInteger,
    65536,     -65536,     16777216,    16777217,  536870911, 536870912,      -536870912,
    -16777217, 1073741824, -1073741825, 360000000, 46340,     46341,          largestInteger - 1,
};

constexpr double powersOfTen[] = {1e-9, 1e-6, 1e-5, 1e-4, 1e-3, 1e-2, 0.1, 1.0,
                                  10.0, 1e2,  1e3,  1e4,  1e5,  1e6,  1e7, 1e9};

// The 15 ways in which four control points can coincide, as the class of each.
constexpr int partitions[][4] = {
    {0, 0, 0, 0}, {0, 0, 0, 1}, {0, 0, 1, 0}, {0, 0, 1, 1}, {0, 0, 1, 2}, {0, 1, 0, 0}, {0, 1, 0, 1}, {0, 1, 0, 2},
    {0, 1, 1, 0}, {0, 1, 1, 1}, {0, 1, 1, 2}, {0, 1, 2, 0}, {0, 1, 2, 1}, {0, 1, 2, 2}, {0, 1, 2, 3},
};

// Curves in the frame from (0, 0) to (1, 0): straight ones with their handles inside, outside, and running back; an S, an
// arch, a loop, a cusp; a quarter of a circle; a symmetric arch with its foot in the middle; a closed one.
constexpr double templates[][4][2] = {
    {{0, 0}, {0.3333333333333333, 0}, {0.6666666666666666, 0}, {1, 0}},
    {{0, 0}, {0.25, 0}, {0.5, 0}, {1, 0}},
    {{0, 0}, {1.5, 0}, {-0.5, 0}, {1, 0}},
    {{0, 0}, {0.75, 0}, {0.25, 0}, {1, 0}},
    {{0, 0}, {0.5, 1}, {0.5, -1}, {1, 0}},
    {{0, 0}, {0.25, 0.75}, {0.75, 0.75}, {1, 0}},
    {{0, 0}, {2, 1}, {-1, 1}, {1, 0}},
    {{0, 0}, {1.5, 0.75}, {-0.25, 1.25}, {1, 0}},
    {{0, 0}, {1, 1}, {0, 1}, {1, 0}},
    {{1, 0}, {1, 0.5522847498307936}, {0.5522847498307936, 1}, {0, 1}},
    {{0, 0}, {0, 1}, {1, 1}, {1, 0}},
    {{0, 0}, {1, 2}, {-1, 2}, {0, 0}},
};

double FromBits(std::uint64_t bits)
{
    double value = 0.0;
    std::memcpy(&value, &bits, sizeof value);
    return value;
}

template <typename T>
point2d Middle(const T& a, const T& b)
{
    return {(a.x + b.x) * 0.5, (a.y + b.y) * 0.5};
}

} // namespace

void SeededSource::BeginCall()
{
    mood = static_cast<Mood>(Below(moods));
    if (mood == Mood::BinaryGrid)
        scale = std::ldexp(1.0, Between(-20, 20));
    else
        scale = powersOfTen[Below(std::size(powersOfTen))];
    quarters = Between(0, 3);
    isOblique = Flag();
    seen.clear();
    seenIntegers.clear();
}

// What there is to choose

std::uint64_t SeededSource::Below(std::uint64_t limit)
{
    return (engine() >> 11) % limit;
}

bool SeededSource::IsOneIn(std::uint64_t chances)
{
    return Below(chances) == 0;
}

bool SeededSource::Flag()
{
    return IsOneIn(2);
}

double SeededSource::Uniform(double low, double high)
{
    const double unit = static_cast<double>(engine() >> 11) * 0x1p-53;
    return low + (high - low) * unit;
}

int SeededSource::Between(int low, int high)
{
    const auto range = static_cast<std::uint64_t>(std::int64_t{high} - low + 1);
    return static_cast<int>(low + static_cast<std::int64_t>(Below(range)));
}

/// Small ones more often where the range is wide.
int SeededSource::Count(int low, int high)
{
    const std::int64_t range = std::int64_t{high} - low;
    constexpr std::int64_t wide = 64;
    if (range <= wide)
        return Between(low, high);
    const int any = Between(0, static_cast<int>(range));
    return low + (any >> Below(12));
}

// Numbers

/// Any finite one, each exponent as likely as any other, and now and then any pattern of bits.
double SeededSource::AnyDouble()
{
    const double value = FromBits(engine());
    return value - value == 0.0 || IsOneIn(16) ? value : 1.0;
}

/// A boundary, one of its neighbours, or a small multiple.
double SeededSource::NearBoundary()
{
    const double boundary = boundaries[Below(std::size(boundaries))];
    const double value = IsOneIn(4) ? boundary * Between(1, 8) : boundary;
    const int step = Between(-1, 1);
    const double moved = step == 0 ? value : std::nextafter(value, step * infinity);
    return Flag() ? moved : -moved;
}

double SeededSource::SpecialNumber()
{
    return specialNumbers[Below(std::size(specialNumbers))];
}

std::int32_t SeededSource::SpecialInteger()
{
    return specialIntegers[Below(std::size(specialIntegers))];
}

/// By the mood, without the values that make it a mood of its own.
double SeededSource::Plain()
{
    constexpr double drawing = 20000.0;
    switch (mood) {
    case Mood::Unit:
        return Uniform(-4.0, 4.0);
    case Mood::Grid:
        return Between(-8, 8);
    case Mood::BinaryGrid:
        return Between(-64, 64) * scale;
    case Mood::Scaled:
        return Uniform(-scale, scale);
    case Mood::AnyBits:
        return AnyDouble();
    case Mood::Drawing:
    case Mood::Boundary:
    case Mood::Special:
        break;
    }
    return IsOneIn(4) ? std::floor(Uniform(-drawing, drawing)) : Uniform(-drawing, drawing);
}

double SeededSource::Number()
{
    if (mood == Mood::Boundary && Flag())
        return NearBoundary();
    if (mood == Mood::Special && IsOneIn(4))
        return SpecialNumber();
    return Plain();
}

float SeededSource::Single()
{
    if (mood == Mood::AnyBits) {
        const auto bits = static_cast<std::uint32_t>(engine());
        float value = 0.0F;
        std::memcpy(&value, &bits, sizeof value);
        return value;
    }
    if (mood == Mood::Special && IsOneIn(4)) {
        constexpr float singles[] = {0.0F,
                                     -0.0F,
                                     1e-45F,
                                     -1e-40F,
                                     3.4e38F,
                                     -3.4e38F,
                                     16777216.0F,
                                     33554432.0F,
                                     std::numeric_limits<float>::infinity(),
                                     std::numeric_limits<float>::quiet_NaN()};
        return singles[Below(std::size(singles))];
    }
    return IsOneIn(4) ? static_cast<float>(Between(-64, 64)) * 0.125F : static_cast<float>(Uniform(-1000.0, 1000.0));
}

std::int32_t SeededSource::Integer()
{
    switch (mood) {
    case Mood::Unit:
    case Mood::Grid:
        return Between(-8, 8);
    case Mood::BinaryGrid:
        return Between(-64, 64) * 1024;
    case Mood::Scaled:
        return static_cast<std::int32_t>(static_cast<std::uint32_t>(engine())) >> Below(31);
    case Mood::AnyBits:
        return static_cast<std::int32_t>(static_cast<std::uint32_t>(engine()));
    case Mood::Special:
        if (IsOneIn(4))
            return SpecialInteger();
        break;
    case Mood::Boundary:
        if (IsOneIn(4))
            return RoundToInt(NearBoundary());
        break;
    case Mood::Drawing:
        break;
    }
    return Between(-20000, 20000);
}

/// In most calls in the range of the curve, at round places too.
double SeededSource::Parameter()
{
    if ((mood == Mood::Special || mood == Mood::Boundary) && IsOneIn(4))
        return Number();
    if (IsOneIn(4))
        return Between(0, 16) * 0.0625;
    return IsOneIn(8) ? Uniform(-2.0, 3.0) : Uniform(0.0, 1.0);
}

/// Multiples of an eighth of a turn and their neighbours, and anything within some turns.
double SeededSource::Angle(double turn)
{
    if (mood == Mood::AnyBits || (mood == Mood::Special && IsOneIn(4)))
        return Number();
    if (!IsOneIn(3))
        return Uniform(-2.5 * turn, 2.5 * turn);
    const double angle = Between(-20, 20) * (turn * 0.125);
    const int step = Between(-1, 1);
    return step == 0 ? angle : std::nextafter(angle, step * infinity);
}

std::int32_t SeededSource::IntegerAngle()
{
    constexpr std::int32_t eighth = 45000000;
    if (mood == Mood::AnyBits || (mood == Mood::Special && IsOneIn(4)))
        return Integer();
    if (!IsOneIn(3))
        return Between(-1000000000, 1000000000);
    const int multiple = Between(-40, 40);
    return eighth * multiple + Between(-1, 1);
}

double SeededSource::Tolerance()
{
    constexpr double usual[] = {0.0, DBL_EPSILON, 1e-9, 1e-6, 1e-4, 0.01, 0.1, 0.25, 1.0, 4.0, 100.0};
    if (mood == Mood::AnyBits || IsOneIn(4))
        return Number();
    return usual[Below(std::size(usual))];
}

double SeededSource::Distance()
{
    const double number = Number();
    return IsOneIn(4) ? number : number * 0.03125;
}

// Points and what is made of them

vector2d SeededSource::Turned(double x, double y)
{
    const vector2d oblique = isOblique ? vector2d{0.6 * x - 0.8 * y, 0.8 * x + 0.6 * y} : vector2d{x, y};
    vector2d turned = oblique;
    for (int i = 0; i < quarters; ++i)
        turned = Perpendicular(turned);
    return turned;
}

point2d SeededSource::FreshPoint()
{
    return {Number(), Number()};
}

/// On the curve that was drawn last, at a parameter with few digits.
point2d SeededSource::PointOnLastCurve()
{
    const point2d* curve = seen.data() + seen.size() - 4;
    const point2d left = Middle(curve[0], curve[1]);
    const point2d inner = Middle(curve[1], curve[2]);
    const point2d right = Middle(curve[2], curve[3]);
    return Middle(Middle(left, inner), Middle(inner, right));
}

/// One that this call has drawn before, one on its curve, or a new one.
point2d SeededSource::Point()
{
    const bool isCurveThere = seen.size() >= 4;
    const point2d p = !seen.empty() && IsOneIn(6)  ? seen[Below(seen.size())]
                      : isCurveThere && IsOneIn(6) ? PointOnLastCurve()
                                                   : FreshPoint();
    seen.push_back(p);
    return p;
}

POINT SeededSource::IntegerPoint()
{
    const POINT p =
        !seenIntegers.empty() && IsOneIn(6) ? seenIntegers[Below(seenIntegers.size())] : POINT{Integer(), Integer()};
    seenIntegers.push_back(p);
    return p;
}

vector2d SeededSource::Vector()
{
    if (IsOneIn(8))
        return Turned(Number(), 0.0);
    return IsOneIn(8) && seen.size() >= 2 ? seen[1] - seen[0] : vector2d{Number(), Number()};
}

RECT SeededSource::Rect()
{
    if (IsOneIn(16))
        return {largestInteger, smallestInteger, smallestInteger, largestInteger};
    const POINT p = IntegerPoint();
    const POINT q = IntegerPoint();
    if (IsOneIn(4))
        return {p.x, p.y, q.x, q.y};
    return {std::min(p.x, q.x), std::max(p.y, q.y), std::max(p.x, q.x), std::min(p.y, q.y)};
}

BoundsT<double> SeededSource::Bounds()
{
    if (IsOneIn(16))
        return {2147483647.0, -2147483648.0, -2147483648.0, 2147483647.0};
    const point2d p = Point();
    const point2d q = Point();
    if (IsOneIn(4))
        return {p.x, p.y, q.x, q.y};
    return {std::min(p.x, q.x), std::max(p.y, q.y), std::max(p.x, q.x), std::min(p.y, q.y)};
}

/// As it is, or off by about a tolerance.
double SeededSource::Perturbed(double value)
{
    return mood == Mood::Boundary && IsOneIn(4) ? value + NearBoundary() : value;
}

/// Of every class that the matrix can tell.
MATRIX SeededSource::Matrix()
{
    const double factor = IsOneIn(3) ? 1.0 : Uniform(-4.0, 4.0);
    const vector2d axis = Turned(factor, 0.0);
    const vector2d move = IsOneIn(3) ? vector2d{0.0, 0.0} : vector2d{Number(), Number()};
    const auto with = [&](double m11, double m12, double m21, double m22) {
        return MATRIX{Perturbed(m11), Perturbed(m12), move.x, Perturbed(m21), Perturbed(m22), move.y};
    };
    switch (Below(8)) {
    case 0: // a turn and a scale
        return with(axis.x, -axis.y, axis.y, axis.x);
    case 1: // and a mirror
        return with(axis.x, axis.y, axis.y, -axis.x);
    case 2: // scales
        return with(factor, 0.0, 0.0, Uniform(-4.0, 4.0));
    case 3: // a shear
        return with(1.0, factor, 0.0, 1.0);
    case 4: // singular
        return with(axis.x, axis.x * 2.0, axis.y, axis.y * 2.0);
    case 5: // well conditioned
        return {Uniform(-2.0, 2.0), Uniform(-2.0, 2.0), move.x, Uniform(-2.0, 2.0), Uniform(-2.0, 2.0), move.y};
    case 6: // a mirror at a line through a point
        return with(1.0, 0.0, 0.0, -1.0);
    default:
        return {Number(), Number(), Number(), Number(), Number(), Number()};
    }
}

MATRIX3D SeededSource::Matrix3()
{
    MATRIX3D matrix = Source::Matrix3();
    if (IsOneIn(4))
        return matrix;
    constexpr int one = 65536;
    const int axis = Between(0, 2);
    const vector2d turned = Turned(one, 0.0);
    for (int row = 0; row < 3; ++row)
        for (int column = 0; column < 3; ++column)
            matrix.m[row][column] = row == column ? one : 0;
    const int u = (axis + 1) % 3;
    const int v = (axis + 2) % 3;
    matrix.m[u][u] = matrix.m[v][v] = RoundToInt(turned.x);
    matrix.m[u][v] = -RoundToInt(turned.y);
    matrix.m[v][u] = RoundToInt(turned.y);
    return matrix;
}

/// Of unit length in most calls, and then at times near the one before, or opposite to it.
Quaternion SeededSource::Quaternion()
{
    if (IsOneIn(4))
        return {Number(), Number(), Number(), Number()};
    const double x = Uniform(-1.0, 1.0);
    const double y = Uniform(-1.0, 1.0);
    const double z = Uniform(-1.0, 1.0);
    const double w = Uniform(-1.0, 1.0);
    const double length = std::sqrt(((x * x + y * y) + z * z) + w * w);
    const ZarnMath::Quaternion fresh{x / length, y / length, z / length, w / length};
    const double nudge = Flag() ? 0.0 : Uniform(-1e-4, 1e-4);
    const ZarnMath::Quaternion& last = lastQuaternion;
    lastQuaternion = !IsOneIn(4) ? fresh
                     : Flag()    ? ZarnMath::Quaternion{last.x + nudge, last.y, last.z, last.w}
                                 : ZarnMath::Quaternion{-last.x, -last.y, -last.z, -last.w + nudge};
    return lastQuaternion;
}

// Curves

CurveOf<point2d> SeededSource::CoincidentCurve()
{
    const point2d distinct[] = {Point(), Point(), Point(), Point()};
    const auto& classes = partitions[Below(std::size(partitions))];
    return {distinct[classes[0]], distinct[classes[1]], distinct[classes[2]], distinct[classes[3]]};
}

/// A template at any place, in one of eight directions.
CurveOf<point2d> SeededSource::PlacedCurve()
{
    const auto& points = templates[Below(std::size(templates))];
    const point2d origin = FreshPoint();
    const double size = Number();
    CurveOf<point2d> curve;
    for (std::size_t i = 0; i < curve.size(); ++i)
        curve[i] = origin + Turned(points[i][0] * size, points[i][1] * size);
    return curve;
}

CurveOf<point2d> SeededSource::FreshCurve()
{
    if (IsOneIn(8))
        return CoincidentCurve();
    if (IsOneIn(3))
        return PlacedCurve();
    return {Point(), Point(), Point(), Point()};
}

CurveOf<point2d> SeededSource::Cubic()
{
    const CurveOf<point2d> curve = FreshCurve();
    seen.insert(seen.end(), curve.begin(), curve.end());
    return curve;
}

CurveOf<POINT> SeededSource::IntegerCubic()
{
    if (mood == Mood::AnyBits || IsOneIn(4))
        return Source::IntegerCubic();
    const CurveOf<point2d> curve = Cubic();
    CurveOf<POINT> rounded;
    for (std::size_t i = 0; i < rounded.size(); ++i)
        rounded[i] = ToPOINT(curve[i]);
    seenIntegers.insert(seenIntegers.end(), rounded.begin(), rounded.end());
    return rounded;
}

/// Of a curve, or any coefficients, of which the leading ones may vanish.
Coefficients SeededSource::PowerForm()
{
    if (!IsOneIn(6))
        return Catalogue::ToPowerForm(Cubic());
    Coefficients cubic{FreshPoint(), FreshPoint(), FreshPoint(), FreshPoint()};
    if (Flag())
        cubic.a = {0.0, 0.0};
    if (IsOneIn(4))
        cubic.b = {0.0, 0.0};
    return cubic;
}

/// Anywhere, on a line, on a curve, or with runs of equal ones.
std::vector<point2d> SeededSource::Points(int count)
{
    std::vector<point2d> points;
    const auto kind = Below(4);
    const point2d origin = FreshPoint();
    const vector2d step = Turned(Number(), 0.0) * 0.125;
    const CurveOf<point2d> curve = FreshCurve();
    for (int i = 0; i < count; ++i) {
        const double t = count > 1 ? static_cast<double>(i) / (count - 1) : 0.0;
        const auto along = [t](const point2d& a, const point2d& b) { return a + (b - a) * t; };
        const auto quadratic = [&](std::size_t k) {
            return along(along(curve[k], curve[k + 1]), along(curve[k + 1], curve[k + 2]));
        };
        points.push_back(kind == 0   ? FreshPoint()
                         : kind == 1 ? origin + step * i
                         : kind == 2 ? along(quadratic(0), quadratic(1))
                                     : Point());
    }
    return points;
}

std::vector<POINT> SeededSource::IntegerPoints(int count)
{
    const POINT step{Between(-9, 9), Between(-9, 9)};
    const bool isLine = IsOneIn(4);
    std::vector<POINT> points;
    for (int i = 0; i < count; ++i)
        points.push_back(isLine ? POINT{step.x * i, step.y * i} : IntegerPoint());
    return points;
}

} // namespace ZarnMath::Digest
