#include "Command.h"
#include "Measure.h"

#include <algorithm>

namespace curvelab {

namespace {

/// The points where a coordinate is extreme inside a curve.
struct Extremes
{
    std::vector<point2d> ofX;
    std::vector<point2d> ofY;
};

std::vector<point2d> PointsAt(const PowerForm& p, const std::vector<double>& parameters)
{
    std::vector<point2d> points;
    for (const double t : parameters)
        points.push_back(Evaluate(p, t));
    return points;
}

Extremes ExtremesOf(const PowerForm& p)
{
    std::vector<double> vertical, horizontal;
    ZarnMath::CubicBezier::GetVerticalTangents(p.a, p.b, p.c, vertical);
    ZarnMath::CubicBezier::GetHorizontalTangents(p.a, p.b, p.c, horizontal);
    return {PointsAt(p, vertical), PointsAt(p, horizontal)};
}

void IncludeBox(Bounds& box, const Bounds& other)
{
    Include(box, point2d{other.left, other.bottom});
    Include(box, point2d{other.right, other.top});
}

/// The box of the ends and the extremes.
Bounds TightBox(const Cubic& curve, const Extremes& extremes)
{
    Bounds box = NoBounds();
    Include(box, curve[0]);
    Include(box, curve[3]);
    for (const std::vector<point2d>& points : {extremes.ofX, extremes.ofY})
        for (const point2d& p : points)
            Include(box, p);
    return box;
}

/// How far a point lies outside a box, 0 within it.
double Excess(const Bounds& box, const point2d& p)
{
    return std::max({0.0, box.left - p.x, p.x - box.right, box.bottom - p.y, p.y - box.top});
}

/// What is known after all curves.
struct Totals
{
    Bounds drawing = NoBounds();
    Bounds polygon = NoBounds(); ///< of all control points
    std::vector<Bounds> contours;
    std::vector<Bounds> curves;
    Extremes extremes;
    double excess = 0.0; ///< how far a sample lies outside its curve's box
};

void Take(const Cubic& curve, Totals& totals)
{
    const Extremes extremes = ExtremesOf(ToPowerForm(curve));
    const Bounds box = TightBox(curve, extremes);
    for (const point2d& p : Sampled(curve, 512))
        totals.excess = std::max(totals.excess, Excess(box, p));
    for (const point2d& p : curve.points)
        Include(totals.polygon, p);
    IncludeBox(totals.contours.back(), box);
    totals.curves.push_back(box);
    totals.extremes.ofX.insert(totals.extremes.ofX.end(), extremes.ofX.begin(), extremes.ofX.end());
    totals.extremes.ofY.insert(totals.extremes.ofY.end(), extremes.ofY.begin(), extremes.ofY.end());
}

Totals Measure(const Job& job)
{
    Totals totals;
    ForEachContour(job, "measuring", [&](const Contour& contour, std::size_t) {
        totals.contours.push_back(NoBounds());
        for (const Cubic& curve : contour.curves)
            Take(curve, totals);
        IncludeBox(totals.drawing, totals.contours.back());
    });
    return totals;
}

/// The lower left and the upper right corner of each box.
void AddBoxes(const std::string& of, const std::vector<Bounds>& boxes, Report& report)
{
    std::vector<point2d> low, high;
    for (const Bounds& box : boxes) {
        low.push_back({box.left, box.bottom});
        high.push_back({box.right, box.top});
    }
    report.AddNumbers("lowerLeft" + of, low);
    report.AddNumbers("upperRight" + of, high);
}

void Describe(const Totals& totals, Report& report)
{
    const Bounds& box = totals.drawing;
    const Bounds& loose = totals.polygon;
    report.Add("lowerLeft", "lower left corner", point2d{box.left, box.bottom});
    report.Add("upperRight", "upper right corner", point2d{box.right, box.top});
    report.Add("width", "width", box.right - box.left);
    report.Add("height", "height", box.top - box.bottom);
    report.Add("controlWidth", "width of control points", loose.right - loose.left);
    report.Add("controlHeight", "height of control points", loose.top - loose.bottom);
    report.Add("extremesOfX", "extremes of x", static_cast<std::int64_t>(totals.extremes.ofX.size()));
    report.Add("extremesOfY", "extremes of y", static_cast<std::int64_t>(totals.extremes.ofY.size()));
    report.Add("largestExcess", "samples outside by", totals.excess);
    AddBoxes("OfContour", totals.contours, report);
    AddBoxes("OfCurve", totals.curves, report);
    report.AddNumbers("pointsOfExtremeX", totals.extremes.ofX);
    report.AddNumbers("pointsOfExtremeY", totals.extremes.ofY);
}

void AddBoxes(const std::vector<Bounds>& boxes, Layer& layer)
{
    for (const Bounds& box : boxes)
        layer.AddPolyline(Outline(box));
}

void AddDots(const std::vector<point2d>& points, Layer& halos, Layer& dots)
{
    for (const point2d& p : points) {
        halos.AddDot(p);
        dots.AddDot(p);
    }
}

void Show(const Totals& totals, Picture& picture)
{
    double around = 0.0;
    for (const Bounds& box : totals.curves)
        around += 2.0 * (box.right - box.left + box.top - box.bottom);
    const double dot = picture.DotWidth(totals.curves.size(), 0.5 * around, 8.0);
    // Lines would fill boxes of a few pixels, those of small letters for one.
    const double side = 0.25 * around * picture.PixelsPerUnit() / static_cast<double>(totals.curves.size());
    const double line = std::clamp(0.08 * side, 0.4, 1.0);
    const Style curve{colour::blue, line, "", 0.55};
    const Style contour{colour::green, 1.75 * line, "", 1.0};
    const Style drawing{colour::ink, 2.5, "9 6", 1.0};
    const Style ofX{colour::orange, dot, "", 1.0};
    const Style ofY{colour::blue, dot, "", 1.0};
    AddBoxes(totals.curves, picture.AddLayer(curve));
    AddBoxes(totals.contours, picture.AddLayer(contour));
    picture.AddLayer(drawing).AddPolyline(Outline(totals.drawing));
    Layer& halos = picture.AddLayer({colour::paper, 1.4 * dot, "", 1.0});
    AddDots(totals.extremes.ofX, halos, picture.AddLayer(ofX));
    AddDots(totals.extremes.ofY, halos, picture.AddLayer(ofY));
    picture.AddLegend(curve, Sample::Stroke, "box of a curve");
    picture.AddLegend(contour, Sample::Stroke, "of a contour");
    picture.AddLegend(drawing, Sample::Stroke, "of the drawing");
    picture.AddLegend(ofX, Sample::Dot, "x is extreme");
    picture.AddLegend(ofY, Sample::Dot, "y is extreme");
}

void Run(const Job& job, Report& report, Picture& picture)
{
    const Totals totals = Measure(job);
    Describe(totals, report);
    Show(totals, picture);
}

Question Prepare(const Arguments&)
{
    return Run;
}

} // namespace

Command BoundsCommand()
{
    return {"bounds",
            "Finds the tight box of each curve, each contour and the drawing",
            "A box is that of the ends of its curves and of the points where a coordinate is extreme, which the\n"
            "library finds as the places of vertical and horizontal tangents inside a curve. The box of the control\n"
            "points is larger as a rule, and never smaller. Checked with 512 samples of each curve, which may lie\n"
            "outside by rounding only. There is no integer overload: --integer asks about the rounded control points\n"
            "in double.",
            {},
            {{"bounds knots.svg -o boxes.svg", "The tight boxes, and where a coordinate is extreme"}},
            Prepare};
}

} // namespace curvelab
