/// @file
/// Cutting cubics, and making them of points.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include <algorithm>

namespace ZarnMath::Fuzzing {

namespace {

using namespace CubicBezier;

template <typename P>
void CheckCuts(const P* curve, double t)
{
    Guarded<P, 4> left;
    Guarded<P, 4> right;
    Bounded("Split", [&] { Split(t, curve, left.data(), right.data()); });
    Require(left.IsIntact() && right.IsIntact(), "four points each");
    Require(IsSame(left[0], curve[0]) && IsSame(right[3], curve[3]), "the ends are copied");
    Require(IsSame(left[3], right[0]), "both pieces have the same point");

    Guarded<P, 7> run;
    Split(t, curve, run.data());
    Require(run.IsIntact() && AreSame(&run[0], &left[0], 4) && AreSame(&run[3], &right[0], 4),
            "one run of seven points holds the same pieces");

    Guarded<P, 4> piece;
    LeftOf(t, curve, piece.data());
    Require(piece.IsIntact() && AreSame(&piece[0], &left[0], 4), "LeftOf is the left piece");
    std::copy_n(curve, 4, piece.data());
    RightOf(t, piece.data(), piece.data());
    Require(piece.IsIntact() && AreSame(&piece[0], &right[0], 4), "RightOf is the right piece, in place too");
}

template <typename P>
void CheckHalves(const P* curve)
{
    Guarded<P, 4> left;
    Guarded<P, 4> right;
    Split(curve, left.data(), right.data());
    Require(left.IsIntact() && right.IsIntact(), "four points each");
    Require(IsSame(left[0], curve[0]) && IsSame(right[3], curve[3]) && IsSame(left[3], right[0]),
            "the halves share a point and the ends of the curve");
    std::copy_n(curve, 4, left.data());
    Guarded<P, 4> other;
    Split(left.data(), left.data(), other.data());
    Require(AreSame(&other[0], &right[0], 4), "the left half may take the place of the curve");
}

template <typename P>
void CheckThreePieces(const P* curve, double t0, double t1)
{
    Guarded<P, 10> run;
    Bounded("Split(t0, t1)", [&] { Split(t0, t1, curve, run.data()); });
    Require(run.IsIntact(), "ten points");
    Guarded<P, 4> middle;
    Subsection(t0, t1, curve, middle.data());
    Require(middle.IsIntact() && AreSame(&middle[0], &run[3], 3), "the middle piece is the subsection");
    Guarded<P, 4> last;
    RightOf(t1, curve, last.data());
    Require(AreSame(&last[0], &run[6], 4), "the last piece is what lies right of t1");
}

void CheckConstruction(const point2d* p, const vector2d& startTangent, const vector2d& endTangent, bool simple)
{
    Guarded<POINT, 4> curve;
    Bounded("From3Points", [&] { From3Points(curve.data(), p[0], p[1], p[2], simple); });
    Require(curve.IsIntact() && curve[0] == ToPOINT(p[0]) && curve[3] == ToPOINT(p[2]), "it begins and ends as asked");
    Guarded<POINT, 4> dragged;
    const bool made = Bounded("From3Points with tangents",
                              [&] { return From3Points(dragged.data(), p[0], startTangent, p[1], p[2], endTangent); });
    Require(made ? dragged.IsIntact() : dragged.IsUntouched(), "on failure nothing is written");
    Require(made == !IsNearZero(Cross(startTangent, endTangent)), "it fails for parallel tangents alone");
}

} // namespace

void FuzzCutting(Input& input)
{
    const double t0 = input.Parameter();
    const double t1 = input.Parameter();
    const Cubic curve = input.Curve();
    const IntegerCubic integers = input.IntegerCurve();
    CheckCuts(curve.points, t0);
    CheckCuts(integers.points, t0);
    CheckHalves(curve.points);
    CheckHalves(integers.points);
    CheckThreePieces(curve.points, t0, t1);
    CheckThreePieces(integers.points, t0, t1);
    const vector2d startTangent = input.Vector();
    CheckConstruction(curve.points, startTangent, input.Vector(), input.Flag());
}

} // namespace ZarnMath::Fuzzing
