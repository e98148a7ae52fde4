/// @file
/// Curvature, tangents and length of a cubic.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include <algorithm>

namespace ZarnMath::Fuzzing {

namespace {

using namespace CubicBezier;

void CheckCurvature(const Cubic& curve, double t)
{
    Result<double> curvature;
    const bool hasCurvature =
        Bounded("GetCurvatureAt", [&] { return GetCurvatureAt(t, curve.a, curve.b, curve.c, curvature.value); });
    Require(hasCurvature || curvature.IsUntouched(), "without a curvature nothing is written");
    const double safe = SafeBezierCurvature(t, curve.a, curve.b, curve.c);
    if (hasCurvature)
        Require(IsSame(safe, curvature.value), "the safe curvature is the curvature where there is one");

    Result<double> radius;
    const bool hasRadius = Bounded("GetCurvatureRadiusAt",
                                   [&] { return GetCurvatureRadiusAt(t, curve.a, curve.b, curve.c, radius.value); });
    Require(!radius.IsUntouched(), "the radius is written in any case");
    if (!hasRadius)
        Require(std::fabs(radius.value) == std::numeric_limits<double>::max(), "a straight curve has no finite radius");

    const vector2d tangent =
        Bounded("SafeBezierTangent", [&] { return SafeBezierTangent(t, curve.a, curve.b, curve.c, curve.d); });
    if (AreOrdinary(curve.points, 4) && IsInUnit(t))
        Require(IsFinite(tangent) && !(tangent == vector2d{0.0, 0.0}), "an ordinary curve has a direction everywhere");
}

void CheckExtremes(const Cubic& curve)
{
    Guarded<double, 2> inflections;
    const int inflectionCount = Bounded("BezierInflectionPoints", [&] {
        return BezierInflectionPoints(curve.a, curve.b, curve.c, inflections.data());
    });
    Require(inflectionCount == 2 ? inflections.IsIntact() : inflectionCount == 0 && inflections.IsUntouched(),
            "two values, or none");

    Guarded<double, 11> extremes;
    const int count =
        Bounded("FindCurvatureMinMax", [&] { return FindCurvatureMinMax(curve.a, curve.b, curve.c, extremes.data()); });
    Require(0 <= count && count <= 11, "at most eleven extremes");
    Require(extremes.IsUntouchedFrom(count > 0 ? count : 1), "no more is written than the count says");
}

void CheckLength(const Cubic& curve, int order, double t0, double t1)
{
    const double length = Bounded("Length", [&] { return Length(curve.a, curve.b, curve.c, order, t0, t1); });
    const auto accuracy = static_cast<LengthAccuracy>(order);
    const double whole = Length(curve.a, curve.b, curve.c, accuracy);
    Require(IsSame(whole, Length(curve.a, curve.b, curve.c, order, 0.0, 1.0)), "the whole length is that from 0 to 1");
    Require(IsSame(whole, Length(curve.points, accuracy)), "control points give what the power form gives");
    Require(!(whole < 0.0), "no length is negative");
    if (t0 <= t1)
        Require(!(length < 0.0), "nor is that of a stretch in ascending order");
    Require(LengthTo(0.0, curve.points) == 0.0 && LengthFrom(1.0, curve.points) == 0.0, "a stretch of nothing is 0");
    (void)Bounded("LengthTo", [&] { return LengthTo(t0, curve.points); });
    (void)Bounded("LengthFrom", [&] { return LengthFrom(t1, curve.points); });

    const int served = NormalizeQuadratureOrder(order);
    Require((2 <= served && served <= 8) || served == 10 || served == 16, "one of the orders that there are");
    Require(NormalizeQuadratureOrder(served) == served, "it serves itself");
    const double* weights = nullptr;
    const double* abscissae = nullptr;
    GetGaussianQuadratureWeightsAndAbscissae(order, weights, abscissae);
    Require(std::is_sorted(abscissae, abscissae + served), "the nodes ascend");
    Require(std::all_of(weights, weights + served, [](double w) { return w > 0.0; }), "the weights are positive");
}

void CheckRelativeLength(const Cubic& curve, double fraction, double tolerance, int order)
{
    const auto accuracy = static_cast<LengthAccuracy>(order);
    const double t = Bounded("GetCurveRelativeLengthParameter", [&] {
        return GetCurveRelativeLengthParameter(fraction, curve.a, curve.b, curve.c, tolerance, accuracy);
    });
    if (fraction <= 0.0)
        Require(t == 0.0, "nothing of the length is at the start");
    else if (fraction >= 1.0)
        Require(t == 1.0, "all of the length is at the end");
    else if (AreOrdinary(curve.points, 4) && IsFinite(fraction) &&
             IsFinite(Length(curve.a, curve.b, curve.c, accuracy)))
        Require(IsInUnit(t) || t != t, "a parameter of the curve"); // NaN where the speed all but vanishes on the way
}

} // namespace

void FuzzCurvature(Input& input)
{
    const double t0 = input.Parameter();
    const double t1 = input.Parameter();
    const int order = input.Flag() ? input.Choice(20) - 1 : input.Int();
    const Cubic curve = input.Curve();
    CheckCurvature(curve, t0);
    CheckExtremes(curve);
    CheckLength(curve, order, t0, t1);
    CheckRelativeLength(curve, t0, input.Flag() ? 0.0 : input.Double(), order);
    const IntegerCubic integers = input.IntegerCurve();
    Require(LengthTo(0.0, integers.points) == 0.0 && LengthFrom(1.0, integers.points) == 0.0,
            "a stretch of nothing is 0");
    (void)LengthTo(t0, integers.points);
    (void)LengthFrom(t1, integers.points);
}

} // namespace ZarnMath::Fuzzing
