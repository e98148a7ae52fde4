#include "Command.h"
#include "Failure.h"
#include "Measure.h"
#include "Numbers.h"

#include <algorithm>
#include <cmath>
#include <cstdio>

namespace curvelab {

namespace {

constexpr ZarnMath::LengthAccuracy accuracy = ZarnMath::LengthAccuracy::Order16;
constexpr double mostMarks = 100000.0;

/// A curve with its length by the library. Where the speed all but vanishes its square can round below zero, and the
/// quadrature ends in NaN.
struct Piece
{
    Cubic curve;
    double length;

    [[nodiscard]] bool HasLength() const
    {
        return length > 0.0;
    }
};

/// A contour as a chain of pieces.
struct Road
{
    std::vector<Piece> pieces;
    bool closed;
    double length = 0.0;   ///< of the pieces that have one
    double polyline = 0.0; ///< measured when it is walked
};

/// A point at a multiple of the spacing.
struct Mark
{
    std::size_t contour;
    Cubic curve;
    double t;
    std::int64_t number;
    double along; ///< where it is on the fine polyline of its contour
};

Road Survey(const Contour& contour)
{
    Road road{{}, contour.closed};
    for (const Cubic& curve : contour.curves) {
        const Piece& piece =
            road.pieces.emplace_back(Piece{curve, ZarnMath::CubicBezier::Length(curve.points, accuracy)});
        road.length += piece.HasLength() ? piece.length : 0.0;
    }
    return road;
}

/// A curve's fine polyline.
class Tape
{
public:
    explicit Tape(const Cubic& curve)
    {
        const std::vector<point2d> points = Sampled(curve, fineChords);
        along_.reserve(points.size());
        for (std::size_t i = 1; i < points.size(); ++i)
            along_.push_back(along_.back() + Distance(points[i - 1], points[i]));
    }

    /// The length from the start to a parameter.
    [[nodiscard]] double To(double t) const
    {
        const double place = t * fineChords;
        const auto vertex = std::min(static_cast<std::size_t>(place), along_.size() - 2);
        const double rest = place - static_cast<double>(vertex);
        return along_[vertex] + rest * (along_[vertex + 1] - along_[vertex]);
    }

    [[nodiscard]] double Length() const
    {
        return along_.back();
    }

private:
    std::vector<double> along_{0.0};
};

double ParameterAt(const Piece& piece, double length, double tolerance)
{
    const PowerForm p = ToPowerForm(piece.curve);
    return ZarnMath::CubicBezier::GetCurveRelativeLengthParameter(length / piece.length, p.a, p.b, p.c, tolerance,
                                                                  accuracy);
}

/// Sets marks along a contour, from its start on; on a closed one the start is not marked again. Measures its polyline on
/// the way.
void Walk(Road& road, std::size_t contour, double spacing, std::vector<Mark>& marks)
{
    // A last step that misses the end by rounding reaches it.
    const double slack = 1e-9 * road.length;
    const double end = road.closed ? road.length - slack : road.length + slack;
    double before = 0.0;
    std::int64_t number = 0;
    for (const Piece& piece : road.pieces) {
        const Tape tape(piece.curve);
        const bool isLast = &piece == &road.pieces.back();
        const double after = isLast ? end : std::min(end, before + piece.length);
        for (; piece.HasLength() && static_cast<double>(number) * spacing <= after; ++number) {
            const double t = ParameterAt(piece, static_cast<double>(number) * spacing - before, 1e-6 * spacing);
            marks.push_back({contour, piece.curve, t, number, road.polyline + tape.To(t)});
        }
        before += piece.HasLength() ? piece.length : 0.0;
        road.polyline += tape.Length();
    }
}

void RequireBounded(const std::vector<Road>& roads, double spacing)
{
    double count = 0.0;
    for (const Road& road : roads)
        count += std::floor(road.length / spacing) + 1.0;
    if (count > mostMarks)
        throw Failure("--spacing: " + FormatNumber(spacing) + " is too small for this drawing, it takes " +
                      FormatNumber(count) + " points where 100000 is the limit");
}

/// How much the distances of neighbouring marks, along the polyline, differ from the spacing.
double LargestUnevenness(const std::vector<Mark>& marks, double spacing)
{
    double worst = 0.0;
    for (std::size_t i = 1; i < marks.size(); ++i)
        if (marks[i].contour == marks[i - 1].contour)
            worst = std::max(worst, std::fabs(marks[i].along - marks[i - 1].along - spacing));
    return worst;
}

point2d PointOf(const Mark& mark)
{
    return Evaluate(ToPowerForm(mark.curve), mark.t);
}

void Describe(double spacing, const std::vector<Road>& roads, const std::vector<Mark>& marks, Report& report)
{
    std::vector<double> lengths, polylines;
    std::int64_t unmeasured = 0;
    double length = 0.0, polyline = 0.0, difference = 0.0;
    for (const Road& road : roads) {
        lengths.push_back(road.length);
        polylines.push_back(road.polyline);
        length += road.length;
        polyline += road.polyline;
        difference = std::max(difference, std::fabs(road.length - road.polyline));
        unmeasured += std::count_if(road.pieces.begin(), road.pieces.end(),
                                    [](const Piece& piece) { return std::isnan(piece.length); });
    }
    std::vector<point2d> points;
    for (const Mark& mark : marks)
        points.push_back(PointOf(mark));
    report.Add("length", "total length", length);
    report.Add("polylineLength", "that of fine polylines", polyline);
    report.Add("largestDifference", "largest of a contour", difference);
    report.Add("spacing", "spacing", spacing);
    report.Add("points", "points", static_cast<std::int64_t>(points.size()));
    report.Add("largestUnevenness", "spacing is off by at most", LargestUnevenness(marks, spacing));
    if (unmeasured > 0)
        report.Add("unmeasuredCurves", "curves without a length", unmeasured);
    report.AddNumbers("lengthOfContour", lengths);
    report.AddNumbers("polylineLengthOfContour", polylines);
    report.AddNumbers("marks", points);
}

/// A line across the curve.
void AddTick(const Mark& mark, double half, Layer& layer)
{
    using ZarnMath::CubicBezier::MapToBezier;
    layer.AddPolyline(
        {MapToBezier(mark.curve.points, mark.t, -half, 1.0), MapToBezier(mark.curve.points, mark.t, half, 1.0)});
}

/// Every how many marks a tick is drawn: a power of ten that keeps them apart on the page.
std::int64_t TickInterval(double pixels)
{
    std::int64_t interval = 1;
    while (static_cast<double>(interval) * pixels < 5.0 && interval < 1000000)
        interval *= 10;
    return interval;
}

std::string TickText(std::int64_t interval)
{
    return interval == 1 ? "every point" : "every " + std::to_string(interval) + "th point";
}

void Show(double spacing, const std::vector<Mark>& marks, Picture& picture)
{
    const double pixel = 1.0 / picture.PixelsPerUnit();
    const std::int64_t interval = TickInterval(spacing / pixel);
    const Style tick{colour::blue, 1.5, "", 1.0};
    const Style tenth{colour::orange, 2.5, "", 1.0};
    const Style start{colour::ink, 9.0, "", 1.0};
    Layer& ticks = picture.AddLayer(tick);
    Layer& tenths = picture.AddLayer(tenth);
    Layer& halos = picture.AddLayer({colour::paper, start.width + 3.0, "", 1.0});
    Layer& starts = picture.AddLayer(start);
    for (const Mark& mark : marks) {
        if (mark.number == 0) {
            halos.AddDot(PointOf(mark));
            starts.AddDot(PointOf(mark));
        } else if (mark.number % (10 * interval) == 0)
            AddTick(mark, 7.0 * pixel, tenths);
        else if (mark.number % interval == 0)
            AddTick(mark, 3.5 * pixel, ticks);
    }
    picture.AddLegend(start, Sample::Dot, "start of a contour");
    picture.AddLegend(tick, Sample::Stroke, TickText(interval));
    picture.AddLegend(tenth, Sample::Stroke, TickText(10 * interval));
}

void Run(double spacing, const Job& job, Report& report, Picture& picture)
{
    std::vector<Road> roads;
    ForEachContour(job, "measuring", [&](const Contour& contour, std::size_t) { roads.push_back(Survey(contour)); });
    RequireBounded(roads, spacing);

    std::vector<Mark> marks;
    job.progress.Begin("setting points", CountCurves(job.drawing));
    for (std::size_t i = 0; i < roads.size(); ++i) {
        Walk(roads[i], i, spacing, marks);
        for (std::size_t j = 0; j < roads[i].pieces.size(); ++j)
            job.progress.Step();
    }
    Describe(spacing, roads, marks, report);
    Show(spacing, marks, picture);
}

Question Prepare(const Arguments& arguments)
{
    const double spacing = ReadNonNegative("--spacing", arguments.at("--spacing"));
    if (spacing == 0.0)
        throw Failure("--spacing: has to be above 0");
    return [spacing](const Job& job, Report& report, Picture& picture) { Run(spacing, job, report, picture); };
}

} // namespace

Command LengthCommand()
{
    return {"length",
            "Measures every contour and sets points along it at equal lengths",
            "The library takes the length of a curve with 16 samples of its speed, and finds the parameter at a\n"
            "fraction of that length within a millionth of the spacing. The points go on from curve to curve, from\n"
            "the start of each contour; on a closed one the last step is what is left. Lengths and steps are measured\n"
            "again along 4096 chords to a curve, without the library's help: the quadrature has no control of its\n"
            "error, and a sharp turn between its samples shows there. At most 100000 points. There is no integer\n"
            "overload for the parameters: --integer asks about the rounded control points in double.",
            {{"--spacing", "D", "Length from point to point along a contour, in drawing units", ""}},
            {{"length rose-window.svg --spacing 1000 -o rulers.svg", "Marks at equal lengths along each contour"}},
            Prepare};
}

} // namespace curvelab
