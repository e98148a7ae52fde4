#include "Command.h"
#include "Measure.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace curvelab {

namespace {

/// What is known of one closed contour.
struct Enclosed
{
    std::size_t contour;
    std::vector<Cubic> curves;
    double area;    ///< the library's, positive for a clockwise contour
    double polygon; ///< that of the fine polygon
};

double AreaUnder(const Cubic& curve)
{
    const PowerForm p = ToPowerForm(curve);
    return ZarnMath::CubicBezier::GetAreaUnderBezier(p.a, p.b, p.c, p.d);
}

std::vector<point2d> FinePolygon(const std::vector<Cubic>& curves)
{
    std::vector<point2d> polygon;
    for (const Cubic& curve : curves) {
        const std::vector<point2d> points = Sampled(curve, fineChords);
        polygon.insert(polygon.end(), points.begin(), points.end());
    }
    return polygon;
}

std::vector<Enclosed> Measure(const Job& job)
{
    std::vector<Enclosed> found;
    ForEachContour(job, "measuring", [&](const Contour& contour, std::size_t index) {
        if (!contour.closed)
            return;
        double area = 0.0;
        for (const Cubic& curve : contour.curves)
            area += AreaUnder(curve);
        found.push_back({index, contour.curves, area, AreaOf(FinePolygon(contour.curves))});
    });
    return found;
}

void Describe(const std::vector<Enclosed>& found, const Job& job, Report& report)
{
    std::vector<std::int64_t> contours;
    std::vector<double> areas, polygons;
    double sum = 0.0, polygonSum = 0.0, difference = 0.0;
    for (const Enclosed& each : found) {
        contours.push_back(static_cast<std::int64_t>(each.contour));
        areas.push_back(each.area);
        polygons.push_back(each.polygon);
        sum += each.area;
        polygonSum += each.polygon;
        difference = std::max(difference, std::fabs(each.area - each.polygon));
    }
    const auto count = [&](auto test) {
        return static_cast<std::int64_t>(std::count_if(areas.begin(), areas.end(), test));
    };
    report.Add("closedContours", "closed contours", static_cast<std::int64_t>(found.size()));
    report.Add("openContours", "open contours, left out",
               static_cast<std::int64_t>(job.drawing.contours.size() - found.size()));
    report.Add("clockwise", "clockwise", count([](double area) { return area > 0.0; }));
    report.Add("counterClockwise", "counter-clockwise", count([](double area) { return area < 0.0; }));
    report.Add("area", "sum of signed areas", sum);
    report.Add("polygonArea", "that of fine polygons", polygonSum);
    report.Add("largestDifference", "largest difference", difference);
    report.AddNumbers("contour", contours);
    report.AddNumbers("areaOfContour", areas);
    report.AddNumbers("polygonAreaOfContour", polygons);
}

/// An arrow head on a curve, as long as stated, pointing along it.
std::vector<point2d> ArrowHead(const Cubic& curve, double t, double size)
{
    const PowerForm p = ToPowerForm(curve);
    const ZarnMath::vector2d along =
        ZarnMath::Normalize(ZarnMath::CubicBezier::SafeBezierTangent(t, p.a, p.b, p.c, p.d));
    const ZarnMath::vector2d across = ZarnMath::Perpendicular(along);
    const point2d tip = Evaluate(p, t) + along * (0.5 * size);
    return {tip - along * size + across * (0.6 * size), tip, tip - along * size - across * (0.6 * size)};
}

/// Arrows along a contour, the first one half a gap from its start, and one at least.
void AddArrows(const Enclosed& each, double gap, double size, Layer& layer)
{
    std::vector<double> lengths;
    double total = 0.0;
    for (const Cubic& curve : each.curves)
        total += lengths.emplace_back(LengthOf(Sampled(curve, 16)));
    const double step = total / std::max(1.0, std::round(total / gap));
    double next = 0.5 * step;
    for (std::size_t i = 0; i < lengths.size(); ++i) {
        for (; next < lengths[i]; next += step)
            layer.AddPolyline(ArrowHead(each.curves[i], next / lengths[i], size));
        next -= lengths[i];
    }
}

void Show(const std::vector<Enclosed>& found, Picture& picture)
{
    const double pixel = 1.0 / picture.PixelsPerUnit();
    const Style clockwise{colour::blue, 2.5, "", 1.0};
    const Style counterClockwise{colour::orange, 2.5, "", 1.0};
    Layer& positive = picture.AddLayer(clockwise);
    Layer& negative = picture.AddLayer(counterClockwise);
    for (const Enclosed& each : found) {
        Layer& layer = each.area < 0.0 ? negative : positive;
        for (const Cubic& curve : each.curves)
            layer.AddCurve(curve);
        // Small contours have small arrows.
        const double across = std::sqrt(std::fabs(each.area) / std::numbers::pi);
        AddArrows(each, 90.0 * pixel, std::clamp(0.4 * across, 5.0 * pixel, 14.0 * pixel), layer);
    }
    picture.AddLegend(clockwise, Sample::Stroke, "clockwise, area counts as positive");
    picture.AddLegend(counterClockwise, Sample::Stroke, "counter-clockwise, as negative");
}

void Run(const Job& job, Report& report, Picture& picture)
{
    const std::vector<Enclosed> found = Measure(job);
    Describe(found, job, report);
    Show(found, picture);
}

Question Prepare(const Arguments&)
{
    return Run;
}

} // namespace

Command AreaCommand()
{
    return {"area",
            "Measures the signed area that each closed contour encloses",
            "The library gives the area between a curve and the x axis, exactly. Over the curves of a closed contour\n"
            "it adds up to the enclosed area, positive for a clockwise contour. Counters of letters run the other way\n"
            "round, so that the sum over them is what is painted, as long as contours do not overlap. A part that a\n"
            "contour runs around twice counts twice; in a figure of eight the two halves cancel. Compared with the\n"
            "polygon of 4096 chords to a curve. There is no integer overload: --integer asks about the rounded\n"
            "control points in double.",
            {},
            {{"area rose-window.svg -o area.svg", "Which way each contour runs, and what it encloses"}},
            Prepare};
}

} // namespace curvelab
