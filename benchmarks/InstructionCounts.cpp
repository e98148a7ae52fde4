// Instructions of representative calls, counted by callgrind: the same number at every run of one binary, whatever else
// the machine does. Each call goes over the same curves of every class, once to warm up and once to be counted; the
// count is dumped under its name. `./dev instructions` runs this program and compares.

#include "ZarnMath/ZarnMath.h"
#include "benchmarks/Corpus.h"

#include <algorithm>
#include <functional>
#include <valgrind/callgrind.h>

namespace ZarnMath::Benchmarks {
namespace {

/// The first twenty curves of each class.
constexpr std::size_t sample = 20 * curveClasses;

/// What the calls write to. Vectors keep their storage from the warm-up on, so that no allocation is counted.
struct Results
{
    double t;
    double s;
    double distance;
    double numbers[16];
    point2d point;
    vector2d direction;
    Side side;
    point2d curve[4];
    point2d other[4];
    POINT integers[65];
    point2d reals[65];
    std::vector<double> ts;
    std::vector<double> ss;
    std::vector<double> distances;
    std::vector<point2d> points;
    MATRIX matrix;
    RECT rect;
    BoundsT<double> box;
    AFF_TRANSFORM parts;

    void Clear()
    {
        ts.clear();
        ss.clear();
        distances.clear();
        points.clear();
    }
};

/// Points along a curve, which is what the fits are asked about.
constexpr int pointsOfAFit = 20;

/// All that the calls read, made before anything is counted.
struct Inputs
{
    const Corpus& corpus = SharedCorpus();
    std::vector<std::vector<point2d>> fits;
    std::vector<MATRIX> matrices;
    VectorField field;

    Inputs()
    {
        field.Initialize(200, 200, 0, 0);
        for (std::size_t i = 0; i < sample; ++i) {
            std::vector<point2d> fit;
            for (int k = 0; k < pointsOfAFit; ++k)
                fit.push_back(Evaluate(corpus.forms[i], k / (pointsOfAFit - 1.0)));
            fits.push_back(fit);
            const double turn = corpus.parameters[i];
            matrices.push_back({1.0 + turn, 0.3 - turn, corpus.distances[i], turn - 0.6, 1.5 * turn + 0.2, 7.0});
            field.SetVector(static_cast<int>(i), static_cast<int>(i * 37 % sample), {1.0F, 2.0F});
        }
    }
};

/// One call, on the i-th input.
struct Call
{
    const char* name;
    std::function<void(const Inputs&, std::size_t, Results&)> run;
};

const std::vector<Call>& Calls()
{
    using namespace CubicBezier;
    const auto form = [](const Inputs& in, std::size_t i) -> const PowerForm& { return in.corpus.forms[i]; };
    const auto curve = [](const Inputs& in, std::size_t i) { return in.corpus.real.curves[i].data(); };
    const auto other = [](const Inputs& in, std::size_t i) { return in.corpus.real.others[i].data(); };
    const auto integer = [](const Inputs& in, std::size_t i) { return in.corpus.integer.curves[i].data(); };
    static const std::vector<Call> calls = {
        {"Split", [=](auto& in, auto i, auto& r) { Split(in.corpus.parameters[i], curve(in, i), r.curve, r.other); }},
        {"Subsection",
         [=](auto& in, auto i, auto& r) {
             Subsection(in.corpus.parameters[i], in.corpus.laterParameters[i], curve(in, i), r.curve);
         }},
        {"From3Points",
         [=](auto& in, auto i, auto& r) {
             From3Points(r.integers, curve(in, i)[0], curve(in, i)[1], curve(in, i)[3], false);
         }},
        {"SafeBezierCurvature",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             r.t = SafeBezierCurvature(in.corpus.parameters[i], a, b, c);
         }},
        {"SafeBezierTangent",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             r.direction = SafeBezierTangent(in.corpus.parameters[i], a, b, c, d);
         }},
        {"BezierInflectionPoints",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             BezierInflectionPoints(a, b, c, r.numbers);
         }},
        {"FindCurvatureMinMax",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             FindCurvatureMinMax(a, b, c, r.numbers);
         }},
        {"Length",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             r.t = Length(a, b, c, LengthAccuracy::Order8);
         }},
        {"LengthTo", [=](auto& in, auto i, auto& r) { r.t = LengthTo(in.corpus.parameters[i], curve(in, i)); }},
        {"GetCurveRelativeLengthParameter",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             r.t = GetCurveRelativeLengthParameter(in.corpus.parameters[i], a, b, c, 0.01, LengthAccuracy::Order8);
         }},
        {"FindClosestPointOnBezier",
         [=](auto& in, auto i, auto& r) {
             FindClosestPointOnBezier(curve(in, i), in.corpus.real.points[i], r.t, r.point, r.distance);
         }},
        {"FindClosestPointOnBezier of integers",
         [=](auto& in, auto i, auto& r) {
             r.t = FindClosestPointOnBezier(integer(in, i), in.corpus.integer.points[i]);
         }},
        {"FindClosestPointsOnBezier",
         [=](auto& in, auto i, auto& r) {
             FindClosestPointsOnBezier(curve(in, i), in.corpus.real.points[i], r.ts, r.points, r.distances);
         }},
        {"GetSide",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             r.side = GetSide(a, b, c, d, in.corpus.real.points[i]);
         }},
        {"Invert",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             Invert(a, b, c, d, in.corpus.real.pointsOnCurves[i], r.ts);
         }},
        {"FindTangentsToPoint",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             FindTangentsToPoint(a, b, c, d, in.corpus.real.points[i], r.numbers);
         }},
        {"FindBezierIntersections",
         [=](auto& in, auto i, auto& r) { FindBezierIntersections(curve(in, i), other(in, i), r.ts, r.ss, r.points); }},
        {"DoBeziersIntersect",
         [=](auto& in, auto i, auto& r) { r.t = DoBeziersIntersect(curve(in, i), other(in, i)); }},
        {"FindBezierLineIntersection",
         [=](auto& in, auto i, auto& r) {
             FindBezierLineIntersection(curve(in, i), in.corpus.real.lines[i].data(), r.ts, r.ss, true);
         }},
        {"FindBezierIntersectionsAtX",
         [=](auto& in, auto i, auto& r) {
             FindBezierIntersectionsAtX(curve(in, i), in.corpus.real.pointsOnCurves[i].x, r.ts, false);
         }},
        {"DoesBezierIntersectLineSegment",
         [=](auto& in, auto i, auto& r) {
             r.t = DoesBezierIntersectLineSegment(curve(in, i), in.corpus.real.lines[i].data());
         }},
        {"FindBezierSelfIntersection",
         [=](auto& in, auto i, auto& r) { FindBezierSelfIntersection(curve(in, i), r.t, r.s, r.point); }},
        {"DoesFatlineIntersectBezier",
         [=](auto& in, auto i, auto& r) {
             const auto& [start, end] = in.corpus.real.lines[i];
             r.t = DoesFatlineIntersectBezier(curve(in, i), start, end, 5.0);
         }},
        {"GetVerticalTangents",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             GetVerticalTangents(a, b, c, r.ts);
         }},
        {"GetAreaUnderBezier",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             r.t = GetAreaUnderBezier(a, b, c, d);
         }},
        {"MapToBezier",
         [=](auto& in, auto i, auto& r) {
             r.point = MapToBezier(curve(in, i), in.corpus.parameters[i], in.corpus.distances[i], 1.0);
         }},
        {"FindOffsetCusps",
         [=](auto& in, auto i, auto& r) {
             const auto& [a, b, c, d] = form(in, i);
             FindOffsetCusps(a, b, c, in.corpus.distances[i], r.ts);
         }},
        {"FindBezierOffsetCurve",
         [=](auto& in, auto i, auto& r) {
             FindBezierOffsetCurve(curve(in, i), r.curve, in.corpus.distances[i], 0.01, r.t);
         }},
        {"CalculateNumBezierLines",
         [=](auto& in, auto i, auto& r) { r.t = CalculateNumBezierLines(curve(in, i), 64); }},
        {"BezierToLines", [=](auto& in, auto i, auto& r) { BezierToLines(curve(in, i), r.reals, 32); }},
        {"AdaptiveBezierToLines",
         [=](auto& in, auto i, auto& r) { r.t = AdaptiveBezierToLines(integer(in, i), r.integers, 0.25, 64); }},
        {"Calculate_u", [=](auto& in, auto i, auto& r) { Calculate_u(in.fits[i].data(), pointsOfAFit, r.ts); }},
        {"LeastSquares",
         [=](auto& in, auto i, auto& r) { r.t = LeastSquares(in.fits[i].data(), pointsOfAFit, r.curve, 4); }},
        {"GetLeastSquaresLines",
         [=](auto& in, auto i, auto& r) {
             GetLeastSquaresLines(in.fits[i].data(), pointsOfAFit, r.point, r.direction);
         }},
        {"UnionPointsWithRect",
         [=](auto& in, auto i, auto& r) {
             r.rect = GetEmptyRect();
             UnionPointsWithRect(r.rect, in.corpus.integer.points.data() + i, 50);
         }},
        {"GetTransformedPointsBBox",
         [=](auto& in, auto i, auto& r) { r.box = GetTransformedPointsBBox(curve(in, i), 4, in.matrices[i]); }},
        {"GetTransformedCircleBBox",
         [=](auto& in, auto i, auto& r) {
             r.box = GetTransformedCircleBBox(in.matrices[i], 3.0, in.corpus.real.points[i]);
         }},
        {"MATRIX::Invert",
         [=](auto& in, auto i, auto& r) {
             r.matrix = in.matrices[i];
             r.matrix.Invert(DBL_EPSILON);
         }},
        {"MATRIX::TransformPoints of integers",
         [=](auto& in, auto i, auto& r) {
             std::copy_n(in.corpus.integer.points.data() + i, 64, r.integers);
             in.matrices[i].TransformPoints(r.integers, 64);
         }},
        {"MATRIX::TransformPoints of doubles",
         [=](auto& in, auto i, auto& r) {
             std::copy_n(in.corpus.real.points.data() + i, 64, r.reals);
             in.matrices[i].TransformPoints(r.reals, 64);
         }},
        {"DecomposeAffineTransform",
         [=](auto& in, auto i, auto& r) { DecomposeAffineTransform(r.parts, in.matrices[i]); }},
        {"VectorField::Get",
         [=](auto& in, auto i, auto& r) {
             const auto place = static_cast<float>(i);
             r.t = in.field.Get({place + 0.25F, static_cast<float>(i * 37 % sample) - 0.5F}).x;
         }},
    };
    return calls;
}

void Run(const Call& call, const Inputs& inputs, Results& results)
{
    for (std::size_t i = 0; i < sample; ++i) {
        results.Clear();
        call.run(inputs, i, results);
    }
}

} // namespace
} // namespace ZarnMath::Benchmarks

int main()
{
    using namespace ZarnMath::Benchmarks;
    const Inputs inputs;
    Results results{};
    for (const Call& call : Calls())
        Run(call, inputs, results);
    CALLGRIND_START_INSTRUMENTATION;
    for (const Call& call : Calls()) {
        CALLGRIND_ZERO_STATS;
        Run(call, inputs, results);
        CALLGRIND_DUMP_STATS_AT(call.name);
    }
    CALLGRIND_STOP_INSTRUMENTATION;
    return 0;
}
