#include "Command.h"
#include "Failure.h"
#include "Measure.h"
#include "Numbers.h"

#include <algorithm>
#include <cmath>

namespace curvelab {

namespace {

/// The offset of one curve.
struct Offset
{
    Cubic curve;
    std::vector<double> cusps; ///< their parameters, ascending
};

/// What is known after all curves.
struct Totals
{
    std::vector<Offset> offsets;
    std::int64_t curvesWithCusp = 0;
    std::int64_t folds = 0;  ///< how often samples see the offset turn back, or forward again
    double difference = 0.0; ///< of a radius from the distance
};

point2d OffsetAt(const Cubic& curve, double t, double distance)
{
    return ZarnMath::CubicBezier::MapToBezier(curve.points, t, distance, 1.0);
}

/// Whether the offset runs against its curve at t: its derivative is (1 - curvature*distance) times that of the curve.
bool IsFolded(const PowerForm& p, double t, double distance)
{
    return ZarnMath::CubicBezier::SafeBezierCurvature(t, p.a, p.b, p.c) * distance > 1.0;
}

/// Counts the changes between folded and not at dense samples.
std::int64_t CountFolds(const PowerForm& p, double distance)
{
    constexpr int samples = 1024;
    std::int64_t changes = 0;
    bool wasFolded = IsFolded(p, 0.0, distance);
    for (int i = 1; i <= samples; ++i) {
        const bool isFolded = IsFolded(p, static_cast<double>(i) / samples, distance);
        changes += isFolded != wasFolded ? 1 : 0;
        wasFolded = isFolded;
    }
    return changes;
}

/// By how much the radius of curvature at a cusp differs from the distance.
double RadiusError(const PowerForm& p, double t, double distance)
{
    double radius = 0.0;
    ZarnMath::CubicBezier::GetCurvatureRadiusAt(t, p.a, p.b, p.c, radius);
    return std::fabs(radius - distance);
}

Totals Find(double distance, const Job& job)
{
    Totals totals;
    ForEachCurve(job, "looking for cusps", [&](const Cubic& exact, std::size_t) {
        Offset offset{Asked(job, exact), {}};
        const PowerForm p = ToPowerForm(offset.curve);
        totals.curvesWithCusp += ZarnMath::CubicBezier::FindOffsetCusps(p.a, p.b, p.c, distance, offset.cusps) ? 1 : 0;
        totals.folds += CountFolds(p, distance);
        for (const double t : offset.cusps)
            totals.difference = std::max(totals.difference, RadiusError(p, t, distance));
        std::sort(offset.cusps.begin(), offset.cusps.end());
        totals.offsets.push_back(std::move(offset));
    });
    return totals;
}

void Describe(double distance, const Totals& totals, Report& report)
{
    std::vector<std::int64_t> curves;
    std::vector<double> parameters;
    std::vector<point2d> points;
    for (std::size_t i = 0; i < totals.offsets.size(); ++i)
        for (const double t : totals.offsets[i].cusps) {
            curves.push_back(static_cast<std::int64_t>(i));
            parameters.push_back(t);
            points.push_back(OffsetAt(totals.offsets[i].curve, t, distance));
        }
    report.Add("distance", "distance to the left", distance);
    report.Add("curves", "curves", static_cast<std::int64_t>(totals.offsets.size()));
    report.Add("cusps", "cusps", static_cast<std::int64_t>(points.size()));
    report.Add("curvesWithCusp", "curves with a cusp", totals.curvesWithCusp);
    report.Add("turns", "turns seen at samples", totals.folds);
    report.Add("largestRadiusError", "radius differs by at most", totals.difference);
    report.AddNumbers("points", points);
    report.AddNumbers("curve", curves);
    report.AddNumbers("t", parameters);
}

/// A stretch of the offset between two parameters, sampled.
std::vector<point2d> Stretch(const Cubic& curve, double from, double to, double distance, int chords)
{
    std::vector<point2d> points;
    for (int i = 0; i <= chords; ++i)
        points.push_back(OffsetAt(curve, from + (to - from) * i / chords, distance));
    return points;
}

/// The layers that an offset is drawn on.
struct Layers
{
    Layer& along;
    Layer& folded;
    Layer& halos;
    Layer& cusps;
};

void AddOffset(const Offset& offset, double distance, double chord, Layers& layers)
{
    const PowerForm p = ToPowerForm(offset.curve);
    double from = 0.0;
    for (std::size_t i = 0; i <= offset.cusps.size(); ++i) {
        const double to = i < offset.cusps.size() ? offset.cusps[i] : 1.0;
        const double length = LengthOf(Stretch(offset.curve, from, to, distance, 16));
        const int chords = static_cast<int>(std::clamp(length / chord, 4.0, 400.0));
        Layer& layer = IsFolded(p, 0.5 * (from + to), distance) ? layers.folded : layers.along;
        layer.AddPolyline(Stretch(offset.curve, from, to, distance, chords));
        from = to;
    }
    for (const double t : offset.cusps) {
        layers.halos.AddDot(OffsetAt(offset.curve, t, distance));
        layers.cusps.AddDot(OffsetAt(offset.curve, t, distance));
    }
}

void Show(double distance, const Totals& totals, Picture& picture)
{
    for (const Offset& offset : totals.offsets)
        for (const point2d& p : Stretch(offset.curve, 0.0, 1.0, distance, 32))
            picture.MakeRoomFor(p);

    const Style along{colour::blue, 2.0, "", 1.0};
    const Style folded{colour::orange, 2.0, "", 1.0};
    const Style cusp{colour::ink, 8.0, "", 1.0};
    Layer& alongLayer = picture.AddLayer(along);
    Layer& foldedLayer = picture.AddLayer(folded);
    Layer& halos = picture.AddLayer({colour::paper, cusp.width + 3.0, "", 1.0});
    Layers layers{alongLayer, foldedLayer, halos, picture.AddLayer(cusp)};
    const double chord = 3.0 / picture.PixelsPerUnit();
    for (const Offset& offset : totals.offsets)
        AddOffset(offset, distance, chord, layers);

    picture.AddLegend(along, Sample::Stroke, "offset curves");
    picture.AddLegend(folded, Sample::Stroke, "where they run backwards");
    picture.AddLegend(cusp, Sample::Dot, "cusps");
}

/// Farther away, an offset is a fan of circles in whose middle the drawing is a dot.
void RequireNear(double distance, const Drawing& drawing)
{
    const double farthest = 10.0 * LargerSide(drawing.bounds);
    if (std::fabs(distance) > farthest)
        throw Failure("--distance: " + FormatNumber(distance) +
                      " is farther than ten times the drawing's larger side, " + FormatNumber(farthest));
}

void Run(double distance, const Job& job, Report& report, Picture& picture)
{
    RequireNear(distance, job.drawing);
    const Totals totals = Find(distance, job);
    Describe(distance, totals, report);
    Show(distance, totals, picture);
}

Question Prepare(const Arguments& arguments)
{
    const double distance = ReadNumber("--distance", arguments.at("--distance"));
    return [distance](const Job& job, Report& report, Picture& picture) { Run(distance, job, report, picture); };
}

} // namespace

Command CuspsCommand()
{
    return {"cusps",
            "Draws the offset of every curve and marks where it turns back",
            "The offset of a curve has a cusp where the radius of curvature equals the distance; between two cusps it\n"
            "runs backwards. A positive distance goes to the left, seen along the curve. Offsets are drawn by\n"
            "samples, each curve for itself: at the corners of a contour they neither meet nor are cut. The turns are\n"
            "counted again at 1024 samples of each curve. Where the radius only touches the distance, or the curve\n"
            "itself has a cusp, the library may list one cusp, two or none. There is no integer overload: --integer\n"
            "asks about the rounded control points in double.",
            {{"--distance", "D", "Distance of the offset, in drawing units; at most ten times the larger side", ""}},
            {{"cusps rose-window.svg --distance=-2500 -o cusps.svg", "Where the offsets to the right turn back"}},
            Prepare};
}

} // namespace curvelab
