#include "Command.h"
#include "Measure.h"
#include "Numbers.h"

#include <algorithm>
#include <cmath>
#include <optional>

namespace curvelab {

namespace {

using ZarnMath::LengthAccuracy;
using ZarnMath::vector2d;

/// A joint that turns by less, in degrees, is smooth already.
constexpr double smallestKink = 0.01;

/// Points on each side of a joint.
constexpr int samples = 24;
constexpr int passes = 16;

/// Two curves that meet.
struct Joint
{
    Cubic before;
    Cubic after;
};

/// A joint that has been smoothed: the stretches beside it as they were, and the two cubics in their place.
struct Mended
{
    Joint old;
    Joint fresh;
    double turn; ///< of the old one, in degrees
};

struct Largest
{
    double value = 0.0;
    point2d at{};
};

/// What is known after all joints.
struct Totals
{
    std::vector<Mended> mended;
    std::vector<point2d> corners;
    std::vector<point2d> refused;
    std::int64_t joints = 0;
    std::int64_t smooth = 0; ///< before
    Largest turnBefore;
    double turnAfter = 0.0;
    Largest move;
};

double Length(const Cubic& curve)
{
    return ZarnMath::CubicBezier::Length(curve.points, LengthAccuracy::Order16);
}

double ParameterAt(const Cubic& curve, double fraction)
{
    const PowerForm p = ToPowerForm(curve);
    return ZarnMath::CubicBezier::GetCurveRelativeLengthParameter(fraction, p.a, p.b, p.c, 1e-6 * Length(curve),
                                                                  LengthAccuracy::Order16);
}

/// The stretches of equal length on both sides of a joint: half of the shorter curve, so that neighbours have theirs. The
/// two cubics of a joint fit share a handle, and are best where they are of one length.
Joint Beside(const Joint& joint)
{
    const double before = Length(joint.before);
    const double after = Length(joint.after);
    const double length = 0.5 * std::min(before, after);
    Joint beside{};
    ZarnMath::CubicBezier::Subsection(ParameterAt(joint.before, 1.0 - length / before), 1.0, joint.before.points,
                                      beside.before.points);
    ZarnMath::CubicBezier::Subsection(0.0, ParameterAt(joint.after, length / after), joint.after.points,
                                      beside.after.points);
    return beside;
}

/// Points along both stretches, without the place where they meet.
std::vector<point2d> PointsOf(const Joint& joint)
{
    std::vector<point2d> points = Sampled(joint.before, samples);
    points.pop_back();
    const std::vector<point2d> after = Sampled(joint.after, samples);
    points.insert(points.end(), after.begin() + 1, after.end());
    return points;
}

/// Two cubics with a smooth joint; none where a handle comes out on the wrong side, which no repair mends.
std::optional<Joint> Smoothed(const Joint& old)
{
    const std::vector<point2d> points = PointsOf(old);
    const vector2d start = StartDirection(old.before);
    const vector2d end = EndDirection(old.after);
    Joint fresh = old;
    ZarnMath::LeastSquares(points.data(), 2 * samples, samples, start, end, fresh.before.points, fresh.after.points,
                           passes);
    const auto runs = [](const point2d& from, const point2d& to, const vector2d& direction) {
        return ZarnMath::Dot(to - from, direction) > 0.0;
    };
    const bool isSound = runs(fresh.before[0], fresh.before[1], start) && runs(fresh.after[2], fresh.after[3], end) &&
                         runs(fresh.before[2], fresh.after[1], old.after[3] - old.before[0]);
    return isSound ? std::optional(fresh) : std::nullopt;
}

/// The farthest that a curve has moved away from what was there.
void MeasureMove(const Mended& mended, Largest& move)
{
    const Track before(mended.old.before, 0.0);
    const Track after(mended.old.after, 0.0);
    for (const Cubic& curve : {mended.fresh.before, mended.fresh.after})
        for (const point2d& q : Sampled(curve, 64))
            if (const double distance = std::min(before.Distance(q), after.Distance(q)); distance > move.value)
                move = {distance, q};
}

void Mend(const Joint& joint, double corner, Totals& totals)
{
    const double turn = TurnBetween(joint.before, joint.after);
    const point2d& at = joint.before[3];
    ++totals.joints;
    if (turn > corner) {
        totals.corners.push_back(at);
        return;
    }
    if (turn < smallestKink) {
        ++totals.smooth;
        return;
    }
    if (turn > totals.turnBefore.value)
        totals.turnBefore = {turn, at};
    const Joint old = Beside(joint);
    const std::optional<Joint> fresh = Smoothed(old);
    if (!fresh) {
        totals.refused.push_back(at);
        totals.turnAfter = std::max(totals.turnAfter, turn);
        return;
    }
    totals.mended.push_back({old, *fresh, turn});
    totals.turnAfter = std::max(totals.turnAfter, TurnBetween(fresh->before, fresh->after));
    MeasureMove(totals.mended.back(), totals.move);
}

Totals Find(double corner, const Job& job)
{
    Totals totals;
    ForEachContour(job, "smoothing", [&](const Contour& contour, std::size_t) {
        const std::vector<Cubic>& curves = contour.curves;
        const std::size_t joints = contour.closed ? curves.size() : curves.size() - 1;
        for (std::size_t i = 0; i < joints; ++i)
            Mend({curves[i], curves[(i + 1) % curves.size()]}, corner, totals);
    });
    return totals;
}

void Describe(double corner, const Totals& totals, Report& report)
{
    std::vector<point2d> places;
    std::vector<double> turns;
    for (const Mended& each : totals.mended) {
        places.push_back(each.old.before[3]);
        turns.push_back(each.turn);
    }
    report.AddNumbers("corner", corner);
    report.Add("joints", "joints", totals.joints);
    report.Add("corners", "corners, kept", static_cast<std::int64_t>(totals.corners.size()));
    report.Add("smoothBefore", "smooth before", totals.smooth);
    report.Add("smoothed", "smoothed", static_cast<std::int64_t>(totals.mended.size()));
    report.Add("refused", "not to be smoothed", static_cast<std::int64_t>(totals.refused.size()));
    report.Add("largestTurnBefore", "largest kink before, degrees", totals.turnBefore.value);
    report.Add("largestTurnAfter", "largest kink after", totals.turnAfter);
    report.Add("largestMove", "largest move", totals.move.value);
    report.AddNumbers("largestMoveAt", totals.move.at);
    report.AddNumbers("places", places);
    report.AddNumbers("turns", turns);
}

/// The lens shows the worst of the kinks, and both sides of it.
void ShowWorst(const Totals& totals, Picture& picture)
{
    const auto worst = std::max_element(totals.mended.begin(), totals.mended.end(),
                                        [](const Mended& a, const Mended& b) { return a.turn < b.turn; });
    if (worst == totals.mended.end())
        return;
    const double radius = std::min(0.35 * Length(worst->old.before), picture.LensRadius(2.0));
    const double magnification = picture.LensRadius(1.0) / radius;
    if (magnification < 1e7)
        picture.SetLens({worst->old.before[3], radius,
                         "a kink of " + FormatNumber(worst->turn, 3) + " degrees, " + FormatNumber(magnification, 3) +
                             " times larger"});
}

void Show(const Totals& totals, Picture& picture)
{
    const Style before{colour::orange, 2.4, "", 1.0};
    const Style after{colour::blue, 1.8, "", 1.0};
    const Style joint{colour::blue, 5.0, "", 1.0};
    const Style corner{colour::ink, 6.0, "", 1.0};
    Layer& befores = picture.AddLayer(before);
    Layer& afters = picture.AddLayer(after);
    Layer& halos = picture.AddLayer({colour::paper, joint.width + 2.5, "", 1.0});
    Layer& joints = picture.AddLayer(joint);
    Layer& corners = picture.AddLayer(corner);
    for (const Mended& each : totals.mended) {
        for (const Cubic& curve : {each.old.before, each.old.after})
            befores.AddCurve(curve);
        for (const Cubic& curve : {each.fresh.before, each.fresh.after})
            afters.AddCurve(curve);
        halos.AddDot(each.fresh.after[0]);
        joints.AddDot(each.fresh.after[0]);
    }
    for (const std::vector<point2d>& places : {totals.corners, totals.refused})
        for (const point2d& p : places)
            corners.AddDot(p);
    picture.AddLegend(before, Sample::Stroke, "before");
    picture.AddLegend(after, Sample::Stroke, "after");
    picture.AddLegend(joint, Sample::Dot, "smooth joints");
    picture.AddLegend(corner, Sample::Dot, "corners that stay");
    ShowWorst(totals, picture);
}

Question Prepare(const Arguments& arguments)
{
    const double corner = ReadNumberWithin("--corner", arguments.at("--corner"), 0.0, 180.0);
    return [corner](const Job& job, Report& report, Picture& picture) {
        const Totals totals = Find(corner, job);
        Describe(corner, totals, report);
        Show(totals, picture);
    };
}

} // namespace

Command SmoothCommand()
{
    return {
        "smooth",
        "Takes small kinks out of the joints",
        "A joint that turns by more than --corner is a corner and stays. At any other that turns by more than 0.01\n"
        "degrees, the stretches beside it, half of the shorter curve on either side, become two cubics that meet\n"
        "smoothly: the joint fit to 48 points of the stretches, with their outer ends and directions kept. Where\n"
        "a handle of the fit comes out on the wrong side the joint stays as it is. What the fit moves is measured\n"
        "without the library. Coarse whole units make kinks: --units 100 --integer. There is no integer\n"
        "overload: --integer asks about the rounded control points in double.",
        {{"--corner", "DEGREES", "Joints that turn by more are corners", "30"}},
        {{"smooth rose-window.svg --units 150 --integer -o smooth.svg",
          "The kinks that a coarse grid makes, taken out"}},
        Prepare};
}

} // namespace curvelab
