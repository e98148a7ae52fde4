// Where two cubics cross, and where a cubic crosses a segment. The error is the gap between the two points at the
// parameters that a library reports.

#include "ZarnMath/Bezier.h"
#include "benchmarks/peers/Lib2geom.h"
#include "benchmarks/peers/Questions.h"
#include "tests/census/BruteForce.h"

#include <cmath>

namespace ZarnMath::Peers {
namespace {

using Benchmarks::Corpus;
using Benchmarks::Line;

struct Crossing
{
    double first;
    double second;
};

point2d At(const Cubic& curve, double t)
{
    return CubicBezier::Evaluate(CubicBezier::ToPowerForm(curve.data()), t);
}

point2d At(const Line& line, double t)
{
    return line[0] + (line[1] - line[0]) * t;
}

/// @param crossings crossings(i) as a range of `Crossing`
template <typename Other, typename Find>
Measures Compare(const std::vector<Cubic>& curves, const std::vector<Other>& others, Find crossings)
{
    std::vector<double> gaps;
    for (std::size_t i = 0; i < curves.size(); ++i)
        for (const Crossing& crossing : crossings(i)) {
            const vector2d gap = At(curves[i], crossing.first) - At(others[i], crossing.second);
            gaps.push_back(std::hypot(gap.x, gap.y));
        }
    Measures measures = {{"found", static_cast<double>(gaps.size())}};
    const Measures errors = Errors(gaps);
    measures.insert(measures.end(), errors.begin(), errors.end());
    return measures;
}

std::vector<Crossing> FromGeom(const std::vector<Geom::CurveIntersection>& found)
{
    std::vector<Crossing> crossings;
    for (const auto& crossing : found)
        crossings.push_back({crossing.first, crossing.second});
    return crossings;
}

} // namespace

void AskForCrossings(const Corpus& corpus)
{
    const auto& curves = corpus.real.curves;
    const auto& others = corpus.real.others;
    Question question("crossings of two curves", curves.size());

    std::vector<double> first;
    std::vector<double> second;
    std::vector<point2d> points;
    const auto find = [&](std::size_t i) {
        first.clear();
        second.clear();
        points.clear();
        CubicBezier::FindBezierIntersections(curves[i].data(), others[i].data(), first, second, points);
        return points.size();
    };
    question.Add("ZarnMath", "", find, Compare(curves, others, [&](std::size_t i) {
                     find(i);
                     std::vector<Crossing> crossings;
                     for (std::size_t k = 0; k < first.size(); ++k)
                         crossings.push_back({first[k], second[k]});
                     return crossings;
                 }));

    const auto geomCurves = ToGeom(curves);
    const auto geomOthers = ToGeom(others);
    const auto findByGeom = [&](std::size_t i) { return geomCurves[i].intersect(geomOthers[i]); };
    question.Add("lib2geom", "", findByGeom,
                 Compare(curves, others, [&](std::size_t i) { return FromGeom(findByGeom(i)); }));
    question.Ask();
}

void AskForCrossingsWithLine(const Corpus& corpus)
{
    const auto& curves = corpus.real.curves;
    const auto& lines = corpus.real.lines;
    Question question("crossings with a segment", curves.size());

    std::vector<double> onCurve;
    std::vector<double> onLine;
    const auto find = [&](std::size_t i) {
        return CubicBezier::FindBezierLineIntersection(curves[i].data(), lines[i].data(), onCurve, onLine, false);
    };
    // Ours goes on to the whole line; those beyond the segment are left to the caller.
    question.Add("ZarnMath", "", find, Compare(curves, lines, [&](std::size_t i) {
                     find(i);
                     std::vector<Crossing> crossings;
                     for (std::size_t k = 0; k < onCurve.size(); ++k)
                         if (onLine[k] >= 0.0 && onLine[k] <= 1.0)
                             crossings.push_back({onCurve[k], onLine[k]});
                     return crossings;
                 }));

    const auto geomCurves = ToGeom(curves);
    std::vector<Geom::LineSegment> segments;
    for (const Line& line : lines)
        segments.emplace_back(ToGeom(line[0]), ToGeom(line[1]));
    const auto findByGeom = [&](std::size_t i) { return geomCurves[i].intersect(segments[i]); };
    question.Add("lib2geom", "", findByGeom,
                 Compare(curves, lines, [&](std::size_t i) { return FromGeom(findByGeom(i)); }));
    question.Ask();
}

} // namespace ZarnMath::Peers
