#include "Command.h"
#include "Failure.h"
#include "Measure.h"
#include "Numbers.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace curvelab {

namespace {

/// How often a stretch is cut in two at most: 64 cubics of one stretch are more than a page has room for.
constexpr int mostCuts = 6;

struct Settings
{
    double distance;
    std::vector<double> sides; ///< the signed distances
    double tolerance;
};

/// A piece of a curve, and the cubic that stands for its offset.
struct Fit
{
    Cubic source;
    Cubic offset;
    double distance;
    bool isNear; ///< whether the library takes it to be within the tolerance
};

/// The offset of one curve to one side.
struct Side
{
    Cubic curve;
    double distance;
    std::vector<double> cusps;
    std::vector<double> changes; ///< where stretches that can be offset meet those that cannot
    std::size_t stretches;
};

struct Deviation
{
    double distance = 0.0;
    point2d at{};
    Fit fit{};
};

/// What is known after all curves.
struct Totals
{
    std::vector<Side> sides;
    std::vector<Fit> fits;
    Deviation worst;
    std::int64_t points = 0; ///< curves of no extent: they have no offset
};

/// Fits, and cuts what is not near enough where the library says.
void FitPiece(const Cubic& source, double distance, double tolerance, int cuts, std::vector<Fit>& fits)
{
    Fit fit{source, {}, distance, false};
    double at = 0.0;
    fit.isNear = ZarnMath::FindBezierOffsetCurve(source.points, fit.offset.points, distance, tolerance * tolerance, at);
    if (fit.isNear || cuts == 0) {
        fits.push_back(fit);
        return;
    }
    Cubic left{};
    Cubic right{};
    ZarnMath::CubicBezier::Split(at, source.points, left.points, right.points);
    FitPiece(left, distance, tolerance, cuts - 1, fits);
    FitPiece(right, distance, tolerance, cuts - 1, fits);
}

void AddSide(const Cubic& curve, double distance, double tolerance, Totals& totals)
{
    Side side{curve, distance, {}, {}, 0};
    const PowerForm p = ToPowerForm(curve);
    ZarnMath::CubicBezier::FindOffsetCusps(p.a, p.b, p.c, distance, side.cusps);
    std::vector<Cubic> stretches;
    ZarnMath::GetSegmentsToOffset(curve, stretches, distance, &side.changes);
    side.stretches = stretches.size();
    for (const Cubic& stretch : stretches)
        FitPiece(stretch, distance, tolerance, mostCuts, totals.fits);
    totals.sides.push_back(std::move(side));
}

/// How far a fit strays from the exact offset of its piece.
void Measure(const Fit& fit, Deviation& worst)
{
    const Track exact(fit.source, fit.distance);
    for (const point2d& q : Sampled(fit.offset, 64))
        if (const double distance = exact.Distance(q); distance > worst.distance)
            worst = {distance, q, fit};
}

Totals Find(const Settings& settings, const Job& job)
{
    Totals totals;
    ForEachCurve(job, "offsetting", [&](const Cubic& exact, std::size_t) {
        const Cubic curve = Asked(job, exact);
        if (IsPoint(curve)) {
            ++totals.points;
            return;
        }
        const std::size_t before = totals.fits.size();
        for (const double distance : settings.sides)
            AddSide(curve, distance, settings.tolerance, totals);
        for (std::size_t i = before; i < totals.fits.size(); ++i)
            Measure(totals.fits[i], totals.worst);
    });
    return totals;
}

void Describe(const Settings& settings, const Totals& totals, Report& report)
{
    std::vector<point2d> changes;
    std::vector<point2d> cusps;
    std::int64_t stretches = 0;
    std::int64_t dropped = 0;
    for (const Side& side : totals.sides) {
        const Track curve(side.curve, 0.0);
        const Track offset(side.curve, side.distance);
        for (const double t : side.changes)
            changes.push_back(curve.PointAt(t));
        for (const double t : side.cusps)
            cusps.push_back(offset.PointAt(t));
        stretches += static_cast<std::int64_t>(side.stretches);
        dropped += side.stretches == 0 ? 1 : 0;
    }
    const auto far = std::count_if(totals.fits.begin(), totals.fits.end(), [](const Fit& fit) { return !fit.isNear; });
    report.Add("distance", "distance to the left", settings.distance);
    report.AddNumbers("sides", static_cast<std::int64_t>(settings.sides.size()));
    report.Add("tolerance", "tolerance", settings.tolerance);
    report.Add("offsets", "offsets of curves", static_cast<std::int64_t>(totals.sides.size()));
    report.Add("stretches", "stretches without fold", stretches);
    report.Add("cubics", "cubics", static_cast<std::int64_t>(totals.fits.size()));
    report.Add("dropped", "offsets left out", dropped);
    report.Add("cusps", "cusps", static_cast<std::int64_t>(cusps.size()));
    report.Add("changes", "changes of validity", static_cast<std::int64_t>(changes.size()));
    report.Add("notNear", "beyond the tolerance", std::int64_t{far});
    report.Add("largestDeviation", "largest true deviation", totals.worst.distance);
    report.AddNumbers("largestDeviationAt", totals.worst.at);
    report.AddNumbers("pointCurves", totals.points);
    report.AddNumbers("cuspPoints", cusps);
    report.AddNumbers("changePoints", changes);
}

/// Shows the worst place so large that the deviation is a tenth of the lens.
void ShowWorst(const Deviation& worst, Picture& picture)
{
    const double radius = std::min(5.0 * worst.distance, picture.LensRadius(2.0));
    const double magnification = picture.LensRadius(1.0) / radius;
    // Stronger than this, the rounding of the coordinates themselves would be in the picture.
    if (worst.distance == 0.0 || magnification > 1e7)
        return;
    picture.SetLens({worst.at, radius, "the largest deviation, " + FormatNumber(magnification, 3) + " times larger"});
}

void ShowExact(const Totals& totals, Layer& layer, const Picture& picture)
{
    const double chord = 3.0 / picture.PixelsPerUnit();
    for (const Side& side : totals.sides) {
        const Track offset(side.curve, side.distance);
        layer.AddPolyline(
            offset.Stretch(static_cast<int>(std::clamp(LengthOf(offset.Stretch(16)) / chord, 8.0, 400.0))));
    }
    // In the lens chords that long would be seen.
    if (totals.worst.distance > 0.0)
        layer.AddPolyline(Track(totals.worst.fit.source, totals.worst.fit.distance).Stretch(fineChords));
}

void Show(const Totals& totals, Picture& picture)
{
    for (const Side& side : totals.sides)
        for (const point2d& p : Track(side.curve, side.distance).Stretch(32))
            picture.MakeRoomFor(p);

    const Style exact{colour::orange, 1.3, "", 1.0};
    const Style fitted{colour::blue, 2.4, "", 1.0};
    const Style joint{colour::blue, 5.5, "", 1.0};
    const Style change{colour::green, 7.5, "", 1.0};
    const Style cusp{colour::ink, 7.5, "", 1.0};
    ShowExact(totals, picture.AddLayer(exact), picture);
    Layer& fits = picture.AddLayer(fitted);
    Layer& joints = picture.AddLayer(joint);
    Layer& halos = picture.AddLayer({colour::paper, cusp.width + 3.0, "", 1.0});
    Layer& changes = picture.AddLayer(change);
    Layer& cusps = picture.AddLayer(cusp);
    for (const Fit& fit : totals.fits) {
        fits.AddCurve(fit.offset);
        joints.AddDot(fit.offset[0]);
        joints.AddDot(fit.offset[3]);
    }
    for (const Side& side : totals.sides) {
        const Track curve(side.curve, 0.0);
        const Track offset(side.curve, side.distance);
        for (const double t : side.changes) {
            halos.AddDot(curve.PointAt(t));
            changes.AddDot(curve.PointAt(t));
        }
        for (const double t : side.cusps) {
            halos.AddDot(offset.PointAt(t));
            cusps.AddDot(offset.PointAt(t));
        }
    }
    picture.AddLegend(fitted, Sample::Stroke, "fitted cubics");
    picture.AddLegend(exact, Sample::Stroke, "exact offset, where nothing covers it");
    picture.AddLegend(cusp, Sample::Dot, "cusps of the offset");
    picture.AddLegend(change, Sample::Dot, "where the curve gets too tight");
    ShowWorst(totals.worst, picture);
}

/// Farther away, an offset is a fan of circles in whose middle the drawing is a dot.
void RequireNear(double distance, const Drawing& drawing)
{
    const double farthest = 10.0 * LargerSide(drawing.bounds);
    if (std::fabs(distance) > farthest)
        throw Failure("--distance: " + FormatNumber(distance) +
                      " is farther than ten times the drawing's larger side, " + FormatNumber(farthest));
}

Question Prepare(const Arguments& arguments)
{
    Settings settings{ReadNumber("--distance", arguments.at("--distance")), {}, 0.0};
    settings.sides = {settings.distance};
    if (ReadWhole("--sides", arguments.at("--sides"), 1, 2) == 2)
        settings.sides.push_back(-settings.distance);
    settings.tolerance = ReadNonNegative("--tolerance", arguments.at("--tolerance"));
    return [settings](const Job& job, Report& report, Picture& picture) {
        RequireNear(settings.distance, job.drawing);
        const Totals totals = Find(settings, job);
        Describe(settings, totals, report);
        Show(totals, picture);
    };
}

} // namespace

Command OffsetCommand()
{
    return {"offset",
            "Fits cubics to the offset of every curve",
            "Each curve is cut into the stretches whose offset does not fold, and each stretch is fitted with one\n"
            "cubic; one that is not within the tolerance is cut in two where the library says, up to six times. The\n"
            "library judges by a dozen samples. The largest deviation is measured without it: along the normals of\n"
            "the exact offset, from 65 points of each fitted cubic. A positive distance goes to the left, seen along\n"
            "the curve. Each curve is offset for itself: at the corners of a contour the offsets neither meet nor are\n"
            "cut. There is no integer overload: --integer asks about the rounded control points in double.",
            {{"--distance", "D", "Distance of the offset, in drawing units; at most ten times the larger side", ""},
             {"--sides", "N", "1 for one side, 2 for the other side as well", "1"},
             {"--tolerance", "E", "How far a cubic may be from the offset, in drawing units", "50"}},
            {{"offset nautilus.svg --distance=-2500 -o outline.svg", "Cubics beside the drawing"},
             {"offset --text \"&\" --font DejaVuSans.ttf --distance 2500 --sides 2 -o outline.svg",
              "The same on both sides of a letter"}},
            Prepare};
}

} // namespace curvelab
