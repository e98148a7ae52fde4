#include "Command.h"
#include "Numbers.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace curvelab {

namespace {

/// The largest budget that the library's walk takes.
constexpr std::int64_t largestBudget = 2047;

struct Settings
{
    double tolerance;
    int maxLines;
};

std::vector<point2d> Flatten(const Cubic& curve, const Settings& settings)
{
    std::vector<point2d> points(static_cast<std::size_t>(settings.maxLines) + 1);
    const int lines = ZarnMath::AdaptiveBezierToLines(curve.points, points.data(),
                                                      settings.tolerance * settings.tolerance, settings.maxLines);
    points.resize(static_cast<std::size_t>(lines) + 1);
    return points;
}

std::vector<point2d> Flatten(const IntegerCubic& curve, const Settings& settings)
{
    std::vector<POINT> points(static_cast<std::size_t>(settings.maxLines) + 1);
    const int lines = ZarnMath::AdaptiveBezierToLines(curve.data(), points.data(),
                                                      settings.tolerance * settings.tolerance, settings.maxLines);
    std::vector<point2d> exact;
    for (std::size_t i = 0; i <= static_cast<std::size_t>(lines); ++i)
        exact.push_back({static_cast<double>(points[i].x), static_cast<double>(points[i].y)});
    return exact;
}

double SquaredDistanceToSegment(const point2d& q, const point2d& from, const point2d& to)
{
    const ZarnMath::vector2d along = to - from;
    const double length = ZarnMath::LengthSquared(along);
    const double u = length > 0.0 ? std::clamp(ZarnMath::Dot(q - from, along) / length, 0.0, 1.0) : 0.0;
    return ZarnMath::LengthSquared(q - (from + along * u));
}

/// The square of the distance to a box, 0 within it.
double SquaredDistanceToBox(const point2d& q, const Bounds& box)
{
    const double x = std::max({box.left - q.x, 0.0, q.x - box.right});
    const double y = std::max({box.bottom - q.y, 0.0, q.y - box.top});
    return x * x + y * y;
}

/// A polyline that is asked for its distance many times. Runs of segments have boxes, so that most of a long polyline is
/// passed over.
class Measured
{
public:
    explicit Measured(const std::vector<point2d>& polyline) : points_(polyline)
    {
        for (std::size_t first = 0; first + 1 < points_.size(); first += run) {
            boxes_.push_back(NoBounds());
            for (std::size_t i = first; i <= std::min(first + run, points_.size() - 1); ++i)
                Include(boxes_.back(), points_[i]);
        }
    }

    [[nodiscard]] double Distance(const point2d& q)
    {
        // Samples follow each other: the run that was nearest is a good first guess.
        double nearest = SquaredDistanceToRun(q, guess_);
        for (std::size_t i = 0; i < boxes_.size(); ++i)
            if (i != guess_ && SquaredDistanceToBox(q, boxes_[i]) < nearest)
                if (const double squared = SquaredDistanceToRun(q, i); squared < nearest) {
                    nearest = squared;
                    guess_ = i;
                }
        return std::sqrt(nearest);
    }

private:
    static constexpr std::size_t run = 16;

    [[nodiscard]] double SquaredDistanceToRun(const point2d& q, std::size_t number) const
    {
        const std::size_t first = number * run;
        double nearest = ZarnMath::LengthSquared(q - points_[first]);
        for (std::size_t i = first; i < std::min(first + run, points_.size() - 1); ++i)
            nearest = std::min(nearest, SquaredDistanceToSegment(q, points_[i], points_[i + 1]));
        return nearest;
    }

    const std::vector<point2d>& points_;
    std::vector<Bounds> boxes_;
    std::size_t guess_ = 0;
};

struct Deviation
{
    double distance = 0.0;
    point2d at{};
    std::size_t curve = 0;
};

/// The count of samples that gives each segment 32 on average, and the shortest one 8. The walk halves the parameter
/// range; n segments are n/2 leaves, the deepest of which can lie n/2 - 1 levels down, but not below what the budget of
/// lines allows.
int SamplesFor(int segments, int maxLines)
{
    const int finest = segments < 22 ? std::min(1 << (segments / 2), maxLines) : maxLines;
    return std::max(32 * segments, 8 * finest);
}

/// How far a curve strays from its polyline.
Deviation Measure(const Cubic& curve, const std::vector<point2d>& polyline, int maxLines)
{
    const PowerForm p = ToPowerForm(curve);
    const int samples = SamplesFor(static_cast<int>(polyline.size()) - 1, maxLines);
    Measured measured(polyline);
    Deviation worst;
    for (int i = 0; i <= samples; ++i) {
        const point2d q = Evaluate(p, static_cast<double>(i) / samples);
        if (const double distance = measured.Distance(q); distance > worst.distance)
            worst = {distance, q, 0};
    }
    return worst;
}

/// What is known after all curves.
struct Totals
{
    std::vector<std::int64_t> segments; ///< of each curve
    std::vector<double> deviations;     ///< of each curve
    Deviation worst;
    std::vector<std::vector<point2d>> polylines;
};

void Describe(const Totals& totals, const Settings& settings, Report& report)
{
    std::int64_t sum = 0;
    for (const std::int64_t segments : totals.segments)
        sum += segments;
    const auto [fewest, most] = std::minmax_element(totals.segments.begin(), totals.segments.end());
    report.Add("tolerance", "tolerance", settings.tolerance);
    report.AddNumbers("maxLines", std::int64_t{settings.maxLines});
    report.Add("curves", "curves", static_cast<std::int64_t>(totals.segments.size()));
    report.Add("segments", "segments", sum);
    report.Add("meanSegments", "segments per curve",
               static_cast<double>(sum) / static_cast<double>(totals.segments.size()));
    report.Add("fewestSegments", "fewest in a curve", *fewest);
    report.Add("mostSegments", "most in a curve", *most);
    report.Add("largestDeviation", "largest true deviation", totals.worst.distance);
    report.AddNumbers("largestDeviationAt", totals.worst.at);
    report.AddNumbers("largestDeviationCurve", static_cast<std::int64_t>(totals.worst.curve));
    report.AddNumbers("segmentsOfCurve", totals.segments);
    report.AddNumbers("deviationOfCurve", totals.deviations);
}

/// Shows the worst place so large that the deviation is a tenth of the lens.
void ShowWorst(const Deviation& worst, Picture& picture)
{
    constexpr double share = 0.1;
    const double radius = std::min(worst.distance / (2.0 * share), picture.LensRadius(2.0));
    const double magnification = picture.LensRadius(1.0) / radius;
    // Stronger than this, the rounding of the coordinates themselves would be in the picture.
    if (worst.distance == 0.0 || magnification > 1e7)
        return;
    picture.SetLens({worst.at, radius, "the largest deviation, " + FormatNumber(magnification, 3) + " times larger"});
}

double LengthOf(const std::vector<std::vector<point2d>>& polylines)
{
    double length = 0.0;
    for (const std::vector<point2d>& p : polylines)
        for (std::size_t i = 1; i < p.size(); ++i)
            length += std::sqrt(ZarnMath::LengthSquared(p[i] - p[i - 1]));
    return length;
}

void Show(const Totals& totals, Picture& picture)
{
    std::size_t count = 0;
    for (const std::vector<point2d>& polyline : totals.polylines)
        count += polyline.size();
    const double dot = picture.DotWidth(count, LengthOf(totals.polylines), 5.5);
    const Style line{colour::blue, 0.4 * dot, "", 1.0};
    const Style vertex{colour::orange, dot, "", 1.0};
    Layer& lines = picture.AddLayer(line);
    Layer& vertices = picture.AddLayer(vertex);
    for (const std::vector<point2d>& polyline : totals.polylines) {
        lines.AddPolyline(polyline);
        for (const point2d& p : polyline)
            vertices.AddDot(p);
    }
    picture.AddLegend(line, Sample::Stroke, "polylines");
    picture.AddLegend(vertex, Sample::Dot, "vertices");
    ShowWorst(totals.worst, picture);
}

void Run(const Settings& settings, const Job& job, Report& report, Picture& picture)
{
    Totals totals;
    ForEachCurve(job, "flattening", [&](const Cubic& exact, std::size_t index) {
        const IntegerCubic whole = Rounded(exact);
        const Cubic curve = job.integer ? ToDouble(whole) : exact;
        std::vector<point2d> polyline = job.integer ? Flatten(whole, settings) : Flatten(curve, settings);
        const Deviation deviation = Measure(curve, polyline, settings.maxLines);
        totals.segments.push_back(static_cast<std::int64_t>(polyline.size()) - 1);
        totals.deviations.push_back(deviation.distance);
        if (deviation.distance > totals.worst.distance)
            totals.worst = {deviation.distance, deviation.at, index};
        totals.polylines.push_back(std::move(polyline));
    });
    Describe(totals, settings, report);
    Show(totals, picture);
}

Question Prepare(const Arguments& arguments)
{
    const Settings settings{ReadNonNegative("--tolerance", arguments.at("--tolerance")),
                            static_cast<int>(ReadWhole("--max-lines", arguments.at("--max-lines"), 1, largestBudget))};
    return [settings](const Job& job, Report& report, Picture& picture) { Run(settings, job, report, picture); };
}

} // namespace

Command FlattenCommand()
{
    return {
        "flatten",
        "Turns every curve into a polyline and measures how far it strays",
        "The tolerance is a distance in drawing units. The library compares SQUARED distances, so curvelab passes it\n"
        "T*T. It tests the middle of each stretch against the chord and then makes that middle a vertex, so that the\n"
        "true deviation is smaller as a rule. It can be larger where the budget of --max-lines ends the subdivision,\n"
        "and on an S whose middle happens to lie on its chord. The true deviation is measured without the library's\n"
        "help, at dense samples of each curve against its polyline.",
        {{"--tolerance", "T", "Allowed distance from the chord, in drawing units; 0 spends the whole budget", ""},
         {"--max-lines", "N", "Most segments for one curve, 1 to 2047", "256"}},
        {{"flatten nautilus.svg --tolerance 150 -o polylines.svg", "Polylines within 150 units of the curves"},
         {"flatten nautilus.svg --tolerance 2 --units 2000 --integer",
          "The same on a coarse grid, with vertices in whole units"}},
        Prepare};
}

} // namespace curvelab
