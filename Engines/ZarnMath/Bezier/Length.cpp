#include "ZarnMath/Bezier/Pair.h"
#include "ZarnMath/Bezier/Polynomial.h"
#include "ZarnMath/Bezier/PowerForm.h"
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/RootFinder.h"

#include <algorithm>

namespace ZarnMath::CubicBezier {

namespace {

/// The speed |P'(t)|, the root of a quartic.
class Speed
{
public:
    Speed(const point2d& a, const point2d& b, const point2d& c) noexcept
        : squared{{
              Dot(a, a) * 9.0,
              Dot(a, b) * 12.0,
              Dot(b, b) * 4.0 + Dot(a, c) * 6.0,
              Dot(b, c) * 4.0,
              Dot(c, c),
          }}
    {}

    [[nodiscard]] double At(double t) const noexcept
    {
        return std::sqrt(RootFinder::Value<4>(squared.c, t));
    }

    [[nodiscard]] Pair At(Pair t) const noexcept
    {
        return SquareRoots(RootFinder::Value<4>(squared.c, t));
    }

private:
    Polynomial<4> squared;
};

/// A rule of Gauss-Legendre quadrature.
class Quadrature
{
public:
    explicit Quadrature(int requestedOrder) noexcept : order(NormalizeQuadratureOrder(requestedOrder))
    {
        GetGaussianQuadratureWeightsAndAbscissae(order, weights, abscissae);
    }

    /// The integral from t0 to t1. The samples are taken in pairs, and summed in their order.
    [[nodiscard]] double Integrate(const Speed& speed, double t0, double t1) const noexcept
    {
        const double m = (t0 + t1) * 0.5;
        const double h = (t1 - t0) * 0.5;
        double sum = 0.0;
        int i = 0;
        for (; i + 2 <= order; i += 2) {
            const Pair terms = LoadPair(weights + i) * speed.At(m + h * LoadPair(abscissae + i));
            sum = sum + terms[0] + terms[1];
        }
        if (i < order)
            sum = sum + weights[i] * speed.At(m + h * abscissae[i]);
        return h * sum;
    }

private:
    int order;
    const double* weights = nullptr;
    const double* abscissae = nullptr;
};

/// What `LengthTo` and `LengthFrom` measure with.
constexpr LengthAccuracy pieceAccuracy = LengthAccuracy::Order10;

/// After so many passes the search for a parameter gives up.
constexpr int mostPasses = 200;
/// The least share of its bracket that a pass moves by, from either end: it keeps the search from sticking to an end.
constexpr double leastRatio = 1e-04;
constexpr double greatestRatio = 0.9999;

/// An end of the bracket.
struct Station
{
    double t;
    double length; ///< from 0 to t
};

} // namespace

double Length(const point2d& a, const point2d& b, const point2d& c, int order, double t0, double t1) noexcept
{
    return Quadrature(order).Integrate(Speed(a, b, c), t0, t1);
}

double Length(const point2d& a, const point2d& b, const point2d& c, LengthAccuracy accuracy) noexcept
{
    return Length(a, b, c, static_cast<int>(accuracy), 0.0, 1.0);
}

template <typename P>
double Length(const P* curve, LengthAccuracy accuracy) noexcept
{
    const PowerForm f = ToPowerForm(curve);
    return Length(f.a, f.b, f.c, accuracy);
}

template double Length<point2d>(const point2d*, LengthAccuracy) noexcept;

double LengthTo(double t, const point2d* curve) noexcept
{
    if (t == 0.0)
        return 0.0;
    point2d piece[4];
    LeftOf(t, curve, piece);
    return Length(piece, pieceAccuracy);
}

double LengthTo(double t, const POINT* curve) noexcept
{
    return LengthTo(t, ToDoubleCubic(curve).points);
}

double LengthFrom(double t, const point2d* curve) noexcept
{
    if (t == 1.0)
        return 0.0;
    point2d piece[4];
    RightOf(t, curve, piece);
    return Length(piece, pieceAccuracy);
}

double LengthFrom(double t, const POINT* curve) noexcept
{
    return LengthFrom(t, ToDoubleCubic(curve).points);
}

double GetCurveRelativeLengthParameter(double fraction, point2d a, point2d b, point2d c, double tolerance,
                                       LengthAccuracy accuracy) noexcept
{
    if (fraction <= 0.0)
        return 0.0;
    if (fraction >= 1.0)
        return 1.0;
    const Speed speed(a, b, c);
    const Quadrature rule(static_cast<int>(accuracy));
    const double total = rule.Integrate(speed, 0.0, 1.0);
    const double target = total * fraction;
    Station lo{0.0, 0.0};
    Station hi{1.0, total};
    double ratio = 0.5;
    for (int pass = 1;; ++pass) {
        const double t = lo.t + (hi.t - lo.t) * ratio;
        const double length = rule.Integrate(speed, 0.0, t);
        (length > target ? hi : lo) = {t, length};
        if (IsNearEqual(target, lo.length))
            return lo.t;
        if (IsNearEqual(target, hi.length))
            return hi.t;
        ratio = std::clamp((target - lo.length) / (hi.length - lo.length), leastRatio, greatestRatio);
        if (pass == mostPasses || !(std::fabs(length - target) > tolerance))
            return t;
    }
}

} // namespace ZarnMath::CubicBezier
