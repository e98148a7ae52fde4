#include "tests/library/OutsideCaller.h"

#include "ZarnMath/ZarnMath.h"

#include <algorithm>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <initializer_list>
#include <vector>

namespace {

using namespace ZarnMath;

/// @name One operation, rounded once
/// What goes through a volatile variable is neither fused with what follows nor shared with what is compared to it.
/// @{
double Opaque(double v)
{
    volatile double stored = v;
    return stored;
}

double Product(double a, double b)
{
    return Opaque(Opaque(a) * Opaque(b));
}

double Sum(double a, double b)
{
    return Opaque(Opaque(a) + Opaque(b));
}

double Difference(double a, double b)
{
    return Opaque(Opaque(a) - Opaque(b));
}

/// @}

bool AreSame(double a, double b)
{
    return std::memcmp(&a, &b, sizeof a) == 0;
}

bool AreSame(const point2d& p, const point2d& q)
{
    return AreSame(p.x, q.x) && AreSame(p.y, q.y);
}

/// Numbers with all 53 bits in use (a linear congruential generator, Knuth's MMIX).
class Numbers
{
public:
    double Next()
    {
        state = state * 6364136223846793005u + 1442695040888963407u;
        return static_cast<double>(static_cast<std::int64_t>(state)) * 0x1p-63;
    }

    point2d NextPoint()
    {
        const double x = Next();
        return {x, Next()};
    }

private:
    std::uint64_t state = 1;
};

/// What was compared: each kind has to differ nowhere, and to have met inputs whose fused result is another one.
struct Report
{
    const char* name;
    int wrong = 0;
    int wouldDiffer = 0;

    void Compare(double actual, double expected, double fused)
    {
        wrong += AreSame(actual, expected) ? 0 : 1;
        wouldDiffer += AreSame(expected, fused) ? 0 : 1;
    }

    [[nodiscard]] bool Passes() const
    {
        std::printf("%s: %d results differ, %d would differ if fused\n", name, wrong, wouldDiffer);
        return wrong == 0 && wouldDiffer > 0;
    }
};

/// For results that are all reported, whichever of them is false.
bool AreAllTrue(std::initializer_list<bool> results)
{
    return std::all_of(results.begin(), results.end(), [](bool result) { return result; });
}

constexpr int repeats = 1000;

bool InlineProductsAreNotFused()
{
    Numbers numbers;
    Report dot{"Dot"}, cross{"Cross"}, squared{"LengthSquared"};
    for (int i = 0; i < repeats; ++i) {
        const point2d p = numbers.NextPoint();
        const vector2d q = AsVector(numbers.NextPoint());
        dot.Compare(Dot(p, q), Sum(Product(p.x, q.x), Product(p.y, q.y)), std::fma(p.x, q.x, Product(p.y, q.y)));
        cross.Compare(Cross(p, q), Difference(Product(p.x, q.y), Product(p.y, q.x)),
                      std::fma(p.x, q.y, -Product(p.y, q.x)));
        squared.Compare(LengthSquared(p), Sum(Product(p.x, p.x), Product(p.y, p.y)),
                        std::fma(p.x, p.x, Product(p.y, p.y)));
    }
    return AreAllTrue({dot.Passes(), cross.Passes(), squared.Passes()});
}

/// The caller's own arithmetic on the library's operators: a + (b - a)*t, written in the caller's code.
bool OperatorsAreNotFused()
{
    Numbers numbers;
    Report lerp{"p + (q - p)*t"};
    for (int i = 0; i < repeats; ++i) {
        const point2d p = numbers.NextPoint();
        const point2d q = numbers.NextPoint();
        const double t = numbers.Next();
        const point2d r = p + (q - p) * t;
        const double step = Difference(q.x, p.x);
        lerp.Compare(r.x, Sum(p.x, Product(step, t)), std::fma(step, t, p.x));
    }
    return lerp.Passes();
}

/// ((a*t + b)*t + c)*t + d, each step by f.
template <typename Step>
double Horner(double a, double b, double c, double d, double t, Step f)
{
    return f(f(f(a, t, b), t, c), t, d);
}

bool PolynomialsAreNotFused()
{
    Numbers numbers;
    Report own{"Horner's rule in the caller"};
    for (int i = 0; i < repeats; ++i) {
        const double a = numbers.Next(), b = numbers.Next(), c = numbers.Next(), d = numbers.Next();
        const double t = numbers.Next();
        const auto apart = [](double v, double s, double w) { return Sum(Product(v, s), w); };
        const auto fused = [](double v, double s, double w) { return std::fma(v, s, w); };
        own.Compare(((a * t + b) * t + c) * t + d, Horner(a, b, c, d, t, apart), Horner(a, b, c, d, t, fused));
    }
    return own.Passes();
}

/// The exported functions, called from here, against the caller's arithmetic.
bool FunctionsAreNotFused()
{
    Numbers numbers;
    Report split{"Split"}, uniform{"BezierToLines"};
    const auto apart = [](double v, double s, double w) { return Sum(Product(v, s), w); };
    const auto fused = [](double v, double s, double w) { return std::fma(v, s, w); };
    for (int i = 0; i < repeats; ++i) {
        const point2d curve[4] = {numbers.NextPoint(), numbers.NextPoint(), numbers.NextPoint(), numbers.NextPoint()};
        const double t = numbers.Next();
        point2d left[4], right[4], line[8];
        CubicBezier::Split(t, curve, left, right);
        const double step = Difference(curve[1].x, curve[0].x);
        split.Compare(left[1].x, Sum(curve[0].x, Product(step, t)), std::fma(step, t, curve[0].x));

        BezierToLines(curve, line, 7);
        const auto& [p0, p1, p2, p3] = curve;
        const double a = Difference(Difference(p3.x, Product(Difference(p2.x, p1.x), 3.0)), p0.x);
        const double b = Product(Sum(p0.x, Difference(p2.x, Sum(p1.x, p1.x))), 3.0);
        const double c = Product(Difference(p1.x, p0.x), 3.0);
        uniform.Compare(line[3].x, Horner(a, b, c, p0.x, 3.0 / 7.0, apart), Horner(a, b, c, p0.x, 3.0 / 7.0, fused));
    }
    return AreAllTrue({split.Passes(), uniform.Passes()});
}

/// Vectors cross the boundary both ways.
bool VectorsCrossTheBoundary()
{
    const point2d straight[4] = {{0, 0}, {100, 0}, {200, 0}, {300, 0}};
    std::vector<double> ts = {9.0}, squaredDistances;
    std::vector<point2d> points;
    const bool found = CubicBezier::FindClosestPointsOnBezier(straight, {75, 10}, ts, points, squaredDistances);
    return found && ts.size() == 2 && ts[1] == 0.25 && AreSame(points.at(0), point2d{75, 0}) &&
           squaredDistances.at(0) == 100.0;
}

} // namespace

bool GivesTheSameBits()
{
    return AreAllTrue({InlineProductsAreNotFused(), OperatorsAreNotFused(), PolynomialsAreNotFused(),
                       FunctionsAreNotFused(), VectorsCrossTheBoundary()});
}
