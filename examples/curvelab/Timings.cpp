#include "Timings.h"

#include <algorithm>
#include <array>
#include <chrono>

namespace curvelab {

namespace {

namespace Bezier = ZarnMath::CubicBezier;

/// A curve, with what is worked out beforehand.
struct Item
{
    Cubic curve;
    PowerForm p;
    const Cubic* next; ///< the one that it is crossed with
};

/// What the questions share, so that no call waits for memory of its own.
struct Workplace
{
    point2d centre;
    double tolerance;
    std::array<point2d, 257> polyline;
    std::vector<double> first, second;
    std::vector<point2d> points;

    void Clear()
    {
        first.clear();
        second.clear();
        points.clear();
    }
};

struct Probe
{
    const char* text;
    const char* function;
    void (*ask)(const Item& s, Workplace& w);
};

// The library is shared: no compiler sees that an answer is not used.
const Probe probes[] = {
    {"cut in the middle", "Split",
     [](const Item& s, Workplace&) {
         Cubic left, right;
         Bezier::Split(s.curve.points, left.points, right.points);
     }},
    {"extremes of x and of y", "GetVerticalTangents, GetHorizontalTangents",
     [](const Item& s, Workplace& w) {
         Bezier::GetVerticalTangents(s.p.a, s.p.b, s.p.c, w.first);
         Bezier::GetHorizontalTangents(s.p.a, s.p.b, s.p.c, w.second);
     }},
    {"length", "Length",
     [](const Item& s, Workplace&) {
         static_cast<void>(Bezier::Length(s.curve.points, ZarnMath::LengthAccuracy::Order16));
     }},
    {"area below the curve", "GetAreaUnderBezier",
     [](const Item& s, Workplace&) { static_cast<void>(Bezier::GetAreaUnderBezier(s.p.a, s.p.b, s.p.c, s.p.d)); }},
    {"curvature in the middle", "SafeBezierCurvature",
     [](const Item& s, Workplace&) { static_cast<void>(Bezier::SafeBezierCurvature(0.5, s.p.a, s.p.b, s.p.c)); }},
    {"inflections", "BezierInflectionPoints",
     [](const Item& s, Workplace&) {
         std::array<double, 2> parameters{};
         Bezier::BezierInflectionPoints(s.p.a, s.p.b, s.p.c, parameters.data());
     }},
    {"extremes of speed", "FindCurvatureMinMax",
     [](const Item& s, Workplace&) {
         std::array<double, 11> parameters{};
         Bezier::FindCurvatureMinMax(s.p.a, s.p.b, s.p.c, parameters.data());
     }},
    {"polyline within a thousandth of the drawing", "AdaptiveBezierToLines",
     [](const Item& s, Workplace& w) {
         ZarnMath::AdaptiveBezierToLines(s.curve.points, w.polyline.data(), w.tolerance * w.tolerance, 256);
     }},
    {"foot nearest to the centre of the drawing", "FindClosestPointOnBezier",
     [](const Item& s, Workplace& w) {
         double t = 0.0, squared = 0.0;
         point2d foot;
         Bezier::FindClosestPointOnBezier(s.curve.points, w.centre, t, foot, squared);
     }},
    {"whether it crosses itself", "DoesBezierSelfIntersect",
     [](const Item& s, Workplace&) {
         double lateStart = 0.0, lateEnd = 0.0, earlyStart = 0.0, earlyEnd = 0.0;
         Bezier::DoesBezierSelfIntersect(s.curve.points, lateStart, lateEnd, earlyStart, earlyEnd, false);
     }},
    {"crossings with the next curve", "FindBezierIntersections",
     [](const Item& s, Workplace& w) {
         Bezier::FindBezierIntersections(s.curve.points, s.next->points, w.first, w.second, w.points);
     }},
};

/// All curves, each with the one after it; the last with the first.
std::vector<Item> Items(const Job& job)
{
    std::vector<Item> items;
    items.reserve(CountCurves(job.drawing)); // they point to each other
    for (const Contour& contour : job.drawing.contours)
        for (const Cubic& exact : contour.curves) {
            const Cubic curve = Asked(job, exact);
            items.push_back({curve, ToPowerForm(curve), nullptr});
        }
    for (std::size_t i = 0; i < items.size(); ++i)
        items[i].next = &items[(i + 1) % items.size()].curve;
    return items;
}

} // namespace

std::vector<Timing> TimeQuestions(const Job& job)
{
    const std::vector<Item> items = Items(job);
    const Bounds& box = job.drawing.bounds;
    Workplace place{{0.5 * box.right, 0.5 * box.top}, 1e-3 * std::max(box.right, box.top), {}, {}, {}, {}};
    std::vector<Timing> timings;
    for (const Probe& probe : probes) {
        const double start = SecondsNow();
        for (const Item& item : items) {
            place.Clear();
            probe.ask(item, place);
        }
        timings.push_back({probe.text, probe.function, static_cast<std::int64_t>(items.size()), SecondsNow() - start});
    }
    return timings;
}

double SecondsNow()
{
    return std::chrono::duration<double>(std::chrono::steady_clock::now().time_since_epoch()).count();
}

} // namespace curvelab
