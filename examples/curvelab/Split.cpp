#include "Command.h"
#include "Numbers.h"

#include <algorithm>
#include <cmath>

namespace curvelab {

namespace {

double Distance(const point2d& p, const point2d& q)
{
    return std::sqrt(ZarnMath::LengthSquared(p - q));
}

struct Halves
{
    Cubic left;
    Cubic right;
};

Halves Cut(const Cubic& curve, double t)
{
    Halves halves{};
    ZarnMath::CubicBezier::Split(t, curve.points, halves.left.points, halves.right.points);
    return halves;
}

Halves Cut(const IntegerCubic& curve, double t)
{
    IntegerCubic left{};
    IntegerCubic right{};
    ZarnMath::CubicBezier::Split(t, curve.data(), left.data(), right.data());
    return {ToDouble(left), ToDouble(right)};
}

/// How far apart the shared ends are: those of the halves, and those of each half and its curve.
double Gap(const Cubic& curve, const Halves& halves)
{
    return std::max({Distance(halves.left[3], halves.right[0]), Distance(halves.left[0], curve[0]),
                     Distance(halves.right[3], curve[3])});
}

/// How far the control points of two cuts are apart.
double Difference(const Halves& a, const Halves& b)
{
    double largest = 0.0;
    for (std::size_t i = 0; i < 4; ++i)
        largest = std::max({largest, Distance(a.left[i], b.left[i]), Distance(a.right[i], b.right[i])});
    return largest;
}

/// What is known after all curves.
struct Totals
{
    std::vector<Halves> halves;
    double gap = 0.0;
    double rounding = 0.0; ///< how far the integer cut is from the one in double
};

Totals CutAll(double t, const Job& job)
{
    Totals totals;
    ForEachCurve(job, "splitting", [&](const Cubic& exact, std::size_t) {
        const IntegerCubic whole = Rounded(exact);
        const Cubic curve = job.integer ? ToDouble(whole) : exact;
        const Halves halves = job.integer ? Cut(whole, t) : Cut(curve, t);
        totals.gap = std::max(totals.gap, Gap(curve, halves));
        if (job.integer)
            totals.rounding = std::max(totals.rounding, Difference(halves, Cut(curve, t)));
        totals.halves.push_back(halves);
    });
    return totals;
}

void Describe(double t, const Totals& totals, bool integer, Report& report)
{
    std::vector<point2d> cuts;
    for (const Halves& each : totals.halves)
        cuts.push_back(each.left[3]);
    report.Add("at", "cut at", t);
    report.Add("curves", "curves", static_cast<std::int64_t>(cuts.size()));
    report.Add("pieces", "pieces", static_cast<std::int64_t>(2 * cuts.size()));
    report.Add("largestGap", "largest gap at shared ends", totals.gap);
    if (integer)
        report.Add("largestRounding", "farthest from the cut in double", totals.rounding);
    report.AddNumbers("cuts", cuts);
}

/// The lengths of the chords; near enough for the size of dots.
double LengthOf(const std::vector<Halves>& halves)
{
    double length = 0.0;
    for (const Halves& each : halves)
        length += Distance(each.left[0], each.left[3]) + Distance(each.right[0], each.right[3]);
    return length;
}

void Show(double t, const std::vector<Halves>& halves, Picture& picture)
{
    const double dot = picture.DotWidth(3 * halves.size(), LengthOf(halves), 7.0);
    const Style left{colour::blue, std::min(3.0, 0.6 * dot), "", 1.0};
    const Style right{colour::orange, std::min(3.0, 0.6 * dot), "", 1.0};
    const Style joint{colour::ink, dot, "", 1.0};
    Layer& lefts = picture.AddLayer(left);
    Layer& rights = picture.AddLayer(right);
    Layer& halos = picture.AddLayer({colour::paper, 1.4 * dot, "", 1.0});
    Layer& joints = picture.AddLayer(joint);
    for (const Halves& each : halves) {
        lefts.AddCurve(each.left);
        rights.AddCurve(each.right);
        halos.AddDot(each.left[3]);
        joints.AddDot(each.left[3]);
    }
    const std::string at = FormatNumber(t);
    picture.AddLegend(left, Sample::Stroke, "from 0 to " + at);
    picture.AddLegend(right, Sample::Stroke, "from " + at + " to 1");
    picture.AddLegend(joint, Sample::Dot, "cuts");
}

void Run(double t, const Job& job, Report& report, Picture& picture)
{
    const Totals totals = CutAll(t, job);
    Describe(t, totals, job.integer, report);
    Show(t, totals.halves, picture);
}

Question Prepare(const Arguments& arguments)
{
    const double t = ReadNumberWithin("--at", arguments.at("--at"), 0.0, 1.0);
    return [t](const Job& job, Report& report, Picture& picture) { Run(t, job, report, picture); };
}

} // namespace

Command SplitCommand()
{
    return {
        "split",
        "Cuts every curve at a parameter and checks that the pieces meet",
        "The gap is measured where the two pieces share an end, and where they share one with their curve. It is\n"
        "exactly 0, in double and in whole units. With --integer each control point of the pieces is rounded once,\n"
        "so none lies farther than sqrt(1/2) units from the same cut in double.",
        {{"--at", "T", "Parameter of the cut, 0 to 1", "0.5"}},
        {{"split rose-window.svg --at 0.4 --json", "Every curve cut at t = 0.4, as JSON on standard output"}},
        Prepare};
}

} // namespace curvelab
