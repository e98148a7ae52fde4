#include "Command.h"
#include "Measure.h"
#include "Numbers.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace curvelab {

namespace {

/// A place where the tangent of a curve runs through the point asked for.
struct Touch
{
    std::size_t curve;
    double t;
    point2d point;
};

/// What was found over the whole drawing.
struct Answer
{
    std::vector<Touch> touches;
    std::int64_t curvesWithTangent = 0;
    double worst = 0.0; ///< how far a tangent line passes by the point
};

std::vector<double> TangentsFrom(const PowerForm& p, const point2d& q)
{
    std::array<double, 5> parameters{};
    const int count = ZarnMath::CubicBezier::FindTangentsToPoint(p.a, p.b, p.c, p.d, q, parameters.data());
    return {parameters.begin(), parameters.begin() + count};
}

/// The distance of a point from the tangent line at t; that of the curve's point where there is no direction.
double DistanceFromTangent(const PowerForm& p, double t, const point2d& q)
{
    const ZarnMath::vector2d direction = DerivativeAt(p, t);
    const ZarnMath::vector2d toQuery = q - Evaluate(p, t);
    const double speed = std::sqrt(ZarnMath::LengthSquared(direction));
    return speed > 0.0 ? std::fabs(ZarnMath::Cross(direction, toQuery)) / speed
                       : std::sqrt(ZarnMath::LengthSquared(toQuery));
}

Answer Find(const point2d& q, const Job& job)
{
    Answer answer;
    ForEachCurve(job, "looking for tangents", [&](const Cubic& exact, std::size_t index) {
        const PowerForm p = ToPowerForm(Asked(job, exact));
        const std::vector<double> parameters = TangentsFrom(p, q);
        answer.curvesWithTangent += parameters.empty() ? 0 : 1;
        for (const double t : parameters) {
            answer.touches.push_back({index, t, Evaluate(p, t)});
            answer.worst = std::max(answer.worst, DistanceFromTangent(p, t, q));
        }
    });
    return answer;
}

void Describe(const point2d& q, const Answer& answer, Report& report)
{
    std::vector<std::int64_t> curves;
    std::vector<double> parameters;
    std::vector<point2d> points;
    for (const Touch& touch : answer.touches) {
        curves.push_back(static_cast<std::int64_t>(touch.curve));
        parameters.push_back(touch.t);
        points.push_back(touch.point);
    }
    report.Add("to", "asked for", q);
    report.Add("tangents", "tangents", static_cast<std::int64_t>(points.size()));
    report.Add("curvesWithTangent", "curves with a tangent", answer.curvesWithTangent);
    report.Add("largestMiss", "tangents pass by at most", answer.worst);
    report.AddNumbers("points", points);
    report.AddNumbers("curve", curves);
    report.AddNumbers("t", parameters);
}

void Show(const point2d& q, const Answer& answer, Picture& picture)
{
    picture.MakeRoomFor(q);
    const std::size_t count = answer.touches.size();
    const bool isCrowded = count > 24;
    const Style line{colour::blue, isCrowded ? 1.0 : 1.75, "", isCrowded ? 0.5 : 0.85};
    const Style touch{colour::orange, isCrowded ? 6.5 : 9.0, "", 1.0};
    const Style query{colour::ink, 11.0, "", 1.0};

    // The line goes on for a little beyond the place, so that it is seen to touch.
    const double beyond = 30.0 / picture.PixelsPerUnit();
    Layer& lines = picture.AddLayer(line);
    Layer& halos = picture.AddLayer({colour::paper, touch.width + 3.0, "", 1.0});
    Layer& touches = picture.AddLayer(touch);
    for (const Touch& each : answer.touches) {
        lines.AddPolyline({q, each.point + ZarnMath::Normalize(each.point - q) * beyond});
        halos.AddDot(each.point);
        touches.AddDot(each.point);
    }
    picture.AddLayer({colour::paper, query.width + 4.0, "", 1.0}).AddDot(q);
    picture.AddLayer(query).AddDot(q);
    picture.AddLegend(query, Sample::Dot, "asked for");
    picture.AddLegend(line, Sample::Stroke, "tangents");
    picture.AddLegend(touch, Sample::Dot, "where they touch");
}

void Run(const point2d& asked, const Job& job, Report& report, Picture& picture)
{
    const Answer answer = Find(asked, job);
    Describe(asked, answer, report);
    Show(asked, answer, picture);
}

Question Prepare(const Arguments& arguments)
{
    const point2d to = ReadPoint("--to", arguments.at("--to"));
    return [to](const Job& job, Report& report, Picture& picture) { Run(to, job, report, picture); };
}

} // namespace

Command TangentsCommand()
{
    return {
        "tangents",
        "Draws the tangents of the drawing that run through a point",
        "Each curve is asked for the parameters, ends included, at which its tangent line runs through the point.\n"
        "Where the touching place is the joint of two curves, each of them may report it. A straight curve has no\n"
        "tangent through a point beside it, and every one through a point on its line, which counts as none. How\n"
        "far a tangent passes by the point is measured without the library. There is no integer overload:\n"
        "--integer asks about the rounded control points in double.",
        {{"--to", "X,Y", "The point, in drawing units; it may lie outside the drawing", ""}},
        {{"tangents nautilus.svg --to 90000,-4000 -o tangents.svg", "All tangents through a point below the drawing"}},
        Prepare};
}

} // namespace curvelab
