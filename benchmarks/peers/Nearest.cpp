// The nearest point. Ours is a stationary point of the distance, so that the two ends are compared here, as a caller who
// wants the nearest of all points does. All return the parameter; the errors are those of the distance.

#include "ZarnMath/Bezier.h"
#include "benchmarks/peers/Lib2geom.h"
#include "benchmarks/peers/Questions.h"
#include "benchmarks/peers/Truth.h"

#include <cmath>

namespace ZarnMath::Peers {
namespace {

using Benchmarks::Corpus;

double DistanceAt(const Cubic& curve, double t, const point2d& q)
{
    const vector2d v = CubicBezier::Evaluate(CubicBezier::ToPowerForm(curve.data()), t) - q;
    return std::hypot(v.x, v.y);
}

double NearestParameter(const Cubic& curve, const point2d& q)
{
    const double toStart = LengthSquared(curve[0] - q);
    const double toEnd = LengthSquared(curve[3] - q);
    double best = toEnd < toStart ? 1.0 : 0.0;
    double t, distanceSquared;
    point2d point;
    if (CubicBezier::FindClosestPointOnBezier(curve.data(), q, t, point, distanceSquared) && t >= 0.0 && t <= 1.0 &&
        distanceSquared < std::min(toStart, toEnd))
        best = t;
    return best;
}

} // namespace

void AskForNearest(const Corpus& corpus)
{
    const auto& curves = corpus.real.curves;
    const auto& points = corpus.real.points;
    const auto measure = [&](auto answer) {
        std::vector<double> errors;
        for (std::size_t i = 0; i < curves.size(); ++i) {
            const double truth = TrueDistance(curves[i], points[i]);
            errors.push_back(std::fabs(DistanceAt(curves[i], answer(i), points[i]) - truth));
        }
        return Errors(errors);
    };
    Question question("nearest point", curves.size());
    const auto add = [&](const char* library, auto answer) { question.Add(library, "", answer, measure(answer)); };
    add("ZarnMath", [&](std::size_t i) { return NearestParameter(curves[i], points[i]); });

    const auto geomCurves = ToGeom(curves);
    const auto geomPoints = ToGeom(points);
    add("lib2geom", [&](std::size_t i) { return geomCurves[i].nearestTime(geomPoints[i]); });
    question.Ask();
}

} // namespace ZarnMath::Peers
