// Curvature, inflections, and tangents that are safe at a cusp.

#include "ZarnMath/Bezier.h"
#include "benchmarks/Measure.h"

namespace ZarnMath::Benchmarks {
namespace {

using benchmark::State;

void GetCurvatureAt(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto curvature = [](double t, const PowerForm& f) {
        double k;
        return CubicBezier::GetCurvatureAt(t, f.a, f.b, f.c, k);
    };
    MeasureWork(state, "defined", curvature, corpus.parameters, corpus.forms);
}

BENCHMARK(GetCurvatureAt);

void GetCurvatureRadiusAt(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto radius = [](double t, const PowerForm& f) {
        double r;
        return CubicBezier::GetCurvatureRadiusAt(t, f.a, f.b, f.c, r);
    };
    MeasureWork(state, "bent", radius, corpus.parameters, corpus.forms);
}

BENCHMARK(GetCurvatureRadiusAt);

void SafeBezierCurvature(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto curvature = [](double t, const PowerForm& f) {
        return CubicBezier::SafeBezierCurvature(t, f.a, f.b, f.c);
    };
    Measure(state, curvature, corpus.parameters, corpus.forms);
}

BENCHMARK(SafeBezierCurvature);

void BezierInflectionPoints(State& state)
{
    const auto find = [](const PowerForm& f) {
        double inflections[2];
        return CubicBezier::BezierInflectionPoints(f.a, f.b, f.c, inflections);
    };
    MeasureWork(state, "roots", find, SharedCorpus().forms);
}

BENCHMARK(BezierInflectionPoints);

void FindCurvatureMinMax(State& state)
{
    const auto find = [](const PowerForm& f) {
        double extremes[11];
        return CubicBezier::FindCurvatureMinMax(f.a, f.b, f.c, extremes);
    };
    MeasureWork(state, "roots", find, SharedCorpus().forms);
}

BENCHMARK(FindCurvatureMinMax);

void SafeBezierTangent(State& state)
{
    const Corpus& corpus = SharedCorpus();
    const auto tangent = [](double t, const PowerForm& f) {
        return CubicBezier::SafeBezierTangent(t, f.a, f.b, f.c, f.d);
    };
    Measure(state, tangent, corpus.parameters, corpus.forms);
}

BENCHMARK(SafeBezierTangent);

} // namespace
} // namespace ZarnMath::Benchmarks
