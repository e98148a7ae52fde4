#include "Command.h"
#include "Failure.h"
#include "Measure.h"
#include "Numbers.h"

#include <algorithm>
#include <cmath>
#include <random>
#include <span>

namespace curvelab {

namespace {

using ZarnMath::vector2d;

constexpr int passes = 16;

/// More points than that would take a minute.
constexpr double mostPoints = 100000.0;

struct Settings
{
    double tolerance;
    double spacing;
    double noise;
    std::uint64_t seed;
    double corner;
    std::size_t reach;
};

/// The points of a contour. A corner is a point at which two runs end, each with a direction of its own.
struct PointChain
{
    std::vector<point2d> points;
    std::vector<bool> isCorner;
    bool closed;
};

/// Points that are to be one smooth curve. In a loop the last one is the first one again, and the curve runs through.
struct Run
{
    std::vector<point2d> points;
    bool isLoop;
};

/// A cubic, and the points that it stands for.
struct Fitted
{
    Cubic curve;
    std::span<const point2d> points;
};

struct Deviation
{
    double distance = 0.0;
    std::size_t index = 0;
    point2d at{};
};

/// What is known after all contours.
struct Totals
{
    std::vector<Run> runs;
    std::vector<Fitted> cubics; ///< of points of the runs
    std::int64_t points = 0;
    std::int64_t corners = 0;
    Deviation worst;
};

/// Moves points at random, the same way for the same seed on every machine.
class Noise
{
public:
    Noise(double amplitude, std::uint64_t seed) : amplitude_(amplitude), engine_(seed) {}

    [[nodiscard]] point2d Disturb(const point2d& p)
    {
        const double x = Draw();
        return {p.x + x, p.y + Draw()};
    }

private:
    double Draw()
    {
        constexpr double full = 18446744073709551616.0; // 2^64
        return amplitude_ * (2.0 * static_cast<double>(engine_()) / full - 1.0);
    }

    double amplitude_;
    std::mt19937_64 engine_;
};

/// Points at equal lengths along a curve, its end left to the next one.
void AddPoints(const Cubic& curve, double spacing, std::vector<point2d>& points)
{
    const PowerForm p = ToPowerForm(curve);
    const double length = LengthOf(Sampled(curve, 256));
    const double steps = spacing > 0.0 ? std::max(1.0, std::round(length / spacing)) : 1.0;
    points.push_back(curve[0]);
    for (double i = 1.0; i < steps; ++i)
        points.push_back(Evaluate(p, ZarnMath::CubicBezier::GetCurveRelativeLengthParameter(
                                         i / steps, p.a, p.b, p.c, 1e-3 * spacing, ZarnMath::LengthAccuracy::Order16)));
}

PointChain ToPoints(const Contour& contour, const Settings& settings, Noise& noise)
{
    PointChain chain{{}, {}, contour.closed};
    const std::vector<Cubic>& curves = contour.curves;
    for (std::size_t i = 0; i < curves.size(); ++i) {
        const bool isEnd = i == 0 && !contour.closed;
        const Cubic& before = curves[i > 0 ? i - 1 : curves.size() - 1];
        chain.isCorner.push_back(isEnd || TurnBetween(before, curves[i]) > settings.corner);
        AddPoints(curves[i], settings.spacing, chain.points);
        chain.isCorner.resize(chain.points.size(), false);
    }
    if (!contour.closed) {
        chain.points.push_back(curves.back()[3]);
        chain.isCorner.push_back(true);
    }
    if (settings.noise > 0.0)
        for (point2d& p : chain.points)
            p = noise.Disturb(p);
    return chain;
}

/// Cuts a chain at its corners.
void AddRuns(const PointChain& chain, std::vector<Run>& runs)
{
    const std::size_t n = chain.points.size();
    const auto corner = std::find(chain.isCorner.begin(), chain.isCorner.end(), true);
    const bool isLoop = corner == chain.isCorner.end();
    const auto start = isLoop ? 0 : static_cast<std::size_t>(corner - chain.isCorner.begin());
    Run run{{chain.points[start]}, isLoop};
    const std::size_t steps = chain.closed ? n : n - 1;
    for (std::size_t i = 1; i <= steps; ++i) {
        const std::size_t at = (start + i) % n;
        run.points.push_back(chain.points[at]);
        if (chain.isCorner[at] || i == steps) {
            runs.push_back(run);
            run.points = {chain.points[at]};
        }
    }
}

/// The direction of a row of points at one of them, by a parabola through each coordinate: least squares over the length
/// along the row.
vector2d DirectionAt(std::span<const point2d> row, std::size_t at)
{
    std::vector<point2d> xs;
    std::vector<point2d> ys;
    double along = 0.0;
    for (std::size_t i = 0; i < row.size(); ++i) {
        along += i > 0 ? Distance(row[i - 1], row[i]) : 0.0;
        xs.push_back({along, row[i].x});
        ys.push_back({along, row[i].y});
    }
    const double origin = xs[at].x;
    for (std::size_t i = 0; i < row.size(); ++i)
        xs[i].x = ys[i].x = (xs[i].x - origin) / along;
    std::vector<double> x;
    std::vector<double> y;
    vector2d direction = row.back() - row.front();
    if (ZarnMath::LeastSquares(xs.data(), xs.size(), x) && ZarnMath::LeastSquares(ys.data(), ys.size(), y))
        direction = {x[1], y[1]};
    return ZarnMath::Normalize(direction);
}

/// The direction within a run, by the points that are within reach.
vector2d DirectionInside(std::span<const point2d> points, std::size_t at, std::size_t reach)
{
    const std::size_t first = at > reach ? at - reach : 0;
    const std::size_t last = std::min(at + reach, points.size() - 1);
    return DirectionAt(points.subspan(first, last - first + 1), at - first);
}

/// The direction in which a loop leaves its start and comes back.
vector2d DirectionOfLoop(const std::vector<point2d>& points, std::size_t reach)
{
    const std::size_t n = points.size() - 1; // the last one is the first one
    const std::size_t side = std::min(reach, n / 2);
    std::vector<point2d> row;
    for (std::size_t i = n - side; i <= n + side; ++i)
        row.push_back(points[i % n]);
    return DirectionAt(row, side);
}

/// The point that is farthest from a cubic.
Deviation Measure(const Cubic& curve, std::span<const point2d> points)
{
    const Track track(curve, 0.0);
    Deviation worst;
    for (std::size_t i = 1; i + 1 < points.size(); ++i)
        if (const double distance = track.Distance(points[i]); distance > worst.distance)
            worst = {distance, i, points[i]};
    return worst;
}

/// Fits one cubic and, if it is not near enough, cuts the points at the worst one and fits each side, with the direction
/// there for both.
void FitPoints(std::span<const point2d> points, const vector2d& start, const vector2d& end, const Settings& settings,
               Totals& totals)
{
    Cubic curve{};
    const double error =
        ZarnMath::LeastSquares(points.data(), static_cast<int>(points.size()), start, end, curve.points, passes);
    const Deviation worst = Measure(curve, points);
    const bool isNear = error <= settings.tolerance * settings.tolerance && worst.distance <= settings.tolerance;
    if (isNear || points.size() == 2) {
        totals.cubics.push_back({curve, points});
        if (worst.distance > totals.worst.distance)
            totals.worst = worst;
        return;
    }
    const std::size_t cut = std::clamp<std::size_t>(worst.index, 1, points.size() - 2);
    const vector2d direction = DirectionInside(points, cut, settings.reach);
    FitPoints(points.first(cut + 1), start, direction, settings, totals);
    FitPoints(points.subspan(cut), direction, end, settings, totals);
}

void FitRun(const Run& run, const Settings& settings, Totals& totals)
{
    const bool isPoint =
        std::all_of(run.points.begin(), run.points.end(), [&](const point2d& p) { return p == run.points[0]; });
    if (isPoint)
        return;
    if (run.isLoop) {
        const vector2d direction = DirectionOfLoop(run.points, settings.reach);
        FitPoints(run.points, direction, direction, settings, totals);
    } else {
        FitPoints(run.points, DirectionInside(run.points, 0, settings.reach),
                  DirectionInside(run.points, run.points.size() - 1, settings.reach), settings, totals);
    }
}

/// Far more points than the drawing can show are a mistake in the spacing.
void RequireFew(const Drawing& drawing, double spacing)
{
    if (spacing == 0.0)
        return;
    double length = 0.0;
    for (const Contour& contour : drawing.contours)
        for (const Cubic& curve : contour.curves)
            length += LengthOf(Sampled(curve, 16));
    if (length / spacing > mostPoints)
        throw Failure("--spacing: " + FormatNumber(spacing) + " is too small: there would be more than " +
                      FormatNumber(mostPoints) + " points");
}

Totals Find(const Settings& settings, const Job& job)
{
    RequireFew(job.drawing, settings.spacing);
    Totals totals;
    Noise noise(settings.noise, settings.seed);
    for (const Contour& original : job.drawing.contours) {
        Contour contour = original;
        for (Cubic& curve : contour.curves)
            curve = Asked(job, curve);
        std::erase_if(contour.curves, IsPoint);
        if (contour.curves.empty())
            continue;
        const PointChain chain = ToPoints(contour, settings, noise);
        totals.points += static_cast<std::int64_t>(chain.points.size());
        totals.corners += std::count(chain.isCorner.begin(), chain.isCorner.end(), true);
        AddRuns(chain, totals.runs);
    }
    job.progress.Begin("fitting", totals.runs.size());
    for (const Run& run : totals.runs) {
        FitRun(run, settings, totals);
        job.progress.Step();
    }
    return totals;
}

void Describe(const Settings& settings, const Job& job, const Totals& totals, Report& report)
{
    std::vector<point2d> joints;
    for (const Fitted& each : totals.cubics)
        joints.push_back(each.curve[0]);
    report.Add("tolerance", "tolerance", settings.tolerance);
    report.AddNumbers("spacing", settings.spacing);
    if (settings.noise > 0.0)
        report.Add("noise", "noise, in each coordinate", settings.noise);
    report.Add("points", "points", totals.points);
    report.Add("corners", "corners and ends", totals.corners);
    report.Add("cubics", "cubics", static_cast<std::int64_t>(totals.cubics.size()));
    report.Add("curves", "curves of the drawing", static_cast<std::int64_t>(CountCurves(job.drawing)));
    report.Add("largestDeviation", "worst error at a point", totals.worst.distance);
    report.AddNumbers("largestDeviationAt", totals.worst.at);
    report.AddNumbers("joints", joints);
}

/// Shows the worst place so large that the error is a fifth of the lens.
void ShowWorst(const Deviation& worst, Picture& picture)
{
    const double radius = std::min(2.5 * worst.distance, picture.LensRadius(2.0));
    const double magnification = picture.LensRadius(1.0) / radius;
    if (worst.distance == 0.0 || magnification > 1e7)
        return;
    picture.SetLens({worst.at, radius, "the worst error, " + FormatNumber(magnification, 3) + " times larger"});
}

void Show(const Totals& totals, Picture& picture)
{
    double length = 0.0;
    for (const Run& run : totals.runs)
        length += LengthOf(run.points);
    for (const Fitted& each : totals.cubics)
        for (const point2d& p : each.curve.points)
            picture.MakeRoomFor(p);
    const double dot = picture.DotWidth(static_cast<std::size_t>(totals.points), length, 6.0);
    const Style handle{colour::green, 1.2, "", 0.8};
    const Style line{colour::blue, 2.2, "", 1.0};
    const Style point{colour::orange, dot, "", 1.0};
    const Style joint{colour::ink, 7.0, "", 1.0};
    Layer& handles = picture.AddLayer(handle);
    Layer& handleEnds = picture.AddLayer({colour::green, 4.5, "", 1.0});
    Layer& lines = picture.AddLayer(line);
    Layer& points = picture.AddLayer(point);
    Layer& halos = picture.AddLayer({colour::paper, joint.width + 2.5, "", 1.0});
    Layer& joints = picture.AddLayer(joint);
    for (const Run& run : totals.runs)
        for (const point2d& p : run.points)
            points.AddDot(p);
    for (const Fitted& each : totals.cubics) {
        const Cubic& c = each.curve;
        lines.AddCurve(c);
        if (each.points.size() > 2 && Track(LineAsCubic(c[0], c[3]), 0.0).Distance(c[1]) > 0.0) {
            handles.AddPolyline({c[0], c[1]});
            handles.AddPolyline({c[2], c[3]});
            handleEnds.AddDot(c[1]);
            handleEnds.AddDot(c[2]);
        }
        for (const point2d& p : {c[0], c[3]}) {
            halos.AddDot(p);
            joints.AddDot(p);
        }
    }
    picture.AddLegend(point, Sample::Dot, "points");
    picture.AddLegend(line, Sample::Stroke, "fitted cubics");
    picture.AddLegend(joint, Sample::Dot, "their ends");
    picture.AddLegend(handle, Sample::Stroke, "their handles");
    ShowWorst(totals.worst, picture);
}

Question Prepare(const Arguments& arguments)
{
    constexpr std::int64_t largestSeed = 4294967295;
    const auto seed = ReadWhole("--seed", arguments.at("--seed"), 0, largestSeed);
    const Settings settings{ReadNonNegative("--tolerance", arguments.at("--tolerance")),
                            ReadNonNegative("--spacing", arguments.at("--spacing")),
                            ReadNonNegative("--noise", arguments.at("--noise")),
                            static_cast<std::uint64_t>(seed),
                            ReadNumberWithin("--corner", arguments.at("--corner"), 0.0, 180.0),
                            static_cast<std::size_t>(ReadWhole("--reach", arguments.at("--reach"), 1, 1000))};
    return [settings](const Job& job, Report& report, Picture& picture) {
        const Totals totals = Find(settings, job);
        Describe(settings, job, totals, report);
        Show(totals, picture);
    };
}

} // namespace

Command FitCommand()
{
    return {"fit",
            "Makes points of the drawing, and cubics of the points",
            "The points stand at equal steps along the outlines; with --spacing 0 they are the ends of the curves\n"
            "alone, which are the points of a polyline. A drawing named *.txt is a list of points. With --noise they\n"
            "are moved at random. Corners are kept: ends, and joints at which the outline turns by more than\n"
            "--corner. From corner to corner one cubic is fitted; where that is not within the tolerance, the points\n"
            "are cut at the worst one and each side is fitted for itself, with one direction for both. The worst\n"
            "error is the largest distance of a point from its cubic, measured without the library.",
            {{"--tolerance", "E", "How far a point may be from its cubic, in drawing units", ""},
             {"--spacing", "S", "Distance of the points along the outlines, or 0", "500"},
             {"--noise", "A", "How far points are moved, at most, in each coordinate", "0"},
             {"--seed", "N", "Another seed moves them otherwise", "1"},
             {"--corner", "DEGREES", "Joints that turn by more are corners", "20"},
             {"--reach", "N", "So many points on either side tell the direction of a cut", "3"}},
            {{"fit --text \"R&\" --font DejaVuSans.ttf --tolerance 500 --noise 250 --reach 10 -o fitted.svg",
              "Cubics through points that are moved at random"}},
            Prepare};
}

} // namespace curvelab
