#include "Command.h"
#include "Measure.h"
#include "Numbers.h"

#include <algorithm>
#include <array>
#include <cmath>

namespace curvelab {

namespace {

/// What stands on a curve at a parameter: the foot of a tooth of the comb.
struct Tooth
{
    point2d point;
    ZarnMath::vector2d left; ///< the unit normal
    double curvature;
};

/// A place on a curve that the library lists.
struct Place
{
    std::size_t curve;
    double t;
    point2d point;
};

/// What is known after all curves.
struct Totals
{
    std::vector<std::vector<Tooth>> combs; ///< of each curve
    std::vector<Place> speedExtremes;
    std::vector<Place> inflections;
    std::int64_t missedInflections = 0; ///< those that the library does not list
    std::int64_t strayInflections = 0;  ///< those that it lists elsewhere
};

Tooth SampleAt(const PowerForm& p, double t)
{
    const ZarnMath::vector2d along =
        ZarnMath::Normalize(ZarnMath::CubicBezier::SafeBezierTangent(t, p.a, p.b, p.c, p.d));
    return {Evaluate(p, t), ZarnMath::Perpendicular(along),
            ZarnMath::CubicBezier::SafeBezierCurvature(t, p.a, p.b, p.c)};
}

std::vector<Tooth> CombOf(const PowerForm& p, int steps)
{
    std::vector<Tooth> comb;
    for (int i = 0; i <= steps; ++i)
        comb.push_back(SampleAt(p, static_cast<double>(i) / steps));
    return comb;
}

std::vector<double> SpeedExtremes(const PowerForm& p)
{
    std::array<double, 11> parameters{};
    const int count = ZarnMath::CubicBezier::FindCurvatureMinMax(p.a, p.b, p.c, parameters.data());
    return {parameters.begin(), parameters.begin() + count};
}

bool IsInside(double t)
{
    return t > 0.0 && t < 1.0;
}

/// The library's inflections, those inside the curve.
std::vector<double> ListedInflections(const PowerForm& p)
{
    std::array<double, 2> parameters{};
    const int count = ZarnMath::CubicBezier::BezierInflectionPoints(p.a, p.b, p.c, parameters.data());
    std::vector<double> inside(parameters.begin(), parameters.begin() + count);
    inside.erase(std::remove_if(inside.begin(), inside.end(), [](double t) { return !IsInside(t); }), inside.end());
    if (inside.size() == 2 && inside[0] == inside[1])
        inside.pop_back();
    return inside;
}

/// The inflections by the form of the quadratic without cancellation, one root from the larger sum and the other from
/// the product of the roots: it holds where the leading coefficient is zero, too.
std::vector<double> AllInflections(const PowerForm& p)
{
    const double a = ZarnMath::Cross(p.b, p.a) * 3.0;
    const double b = ZarnMath::Cross(p.c, p.a) * 3.0;
    const double c = ZarnMath::Cross(p.c, p.b);
    const double discriminant = b * b - 4.0 * a * c;
    std::vector<double> inside;
    if (!(discriminant > 0.0))
        return inside;
    const double s = -0.5 * (b + std::copysign(std::sqrt(discriminant), b));
    for (const double t : {s / a, c / s})
        if (IsInside(t))
            inside.push_back(t);
    return inside;
}

bool Holds(const std::vector<double>& parameters, double t)
{
    return std::any_of(parameters.begin(), parameters.end(), [t](double u) { return std::fabs(u - t) < 1e-6; });
}

/// A line made a cubic has curvature by rounding only; teeth of it would be noise.
bool IsStraight(const Cubic& curve)
{
    const ZarnMath::vector2d chord = curve[3] - curve[0];
    const double length = std::sqrt(ZarnMath::LengthSquared(chord));
    const double across = std::max(std::fabs(ZarnMath::Cross(chord, curve[1] - curve[0])),
                                   std::fabs(ZarnMath::Cross(chord, curve[2] - curve[0])));
    return across <= 1e-9 * length * length;
}

void AddPlaces(const PowerForm& p, std::size_t curve, const std::vector<double>& parameters, std::vector<Place>& places)
{
    for (const double t : parameters)
        places.push_back({curve, t, Evaluate(p, t)});
}

void AddInflections(const PowerForm& p, std::size_t curve, Totals& totals)
{
    const std::vector<double> listed = ListedInflections(p), all = AllInflections(p);
    for (const double t : listed)
        totals.strayInflections += Holds(all, t) ? 0 : 1;
    for (const double t : all)
        totals.missedInflections += Holds(listed, t) ? 0 : 1;
    AddPlaces(p, curve, all, totals.inflections);
}

/// How many steps from tooth to tooth of a curve: so many that they stand a few pixels apart, and enough for a round
/// outline on a small one.
int StepsFor(const Cubic& curve, double pixelsPerUnit)
{
    constexpr double gap = 5.0;
    const double length = LengthOf(Sampled(curve, 16)) * pixelsPerUnit;
    return static_cast<int>(std::clamp(length / gap, 12.0, 400.0));
}

Totals Find(const Job& job, double pixelsPerUnit)
{
    Totals totals;
    ForEachCurve(job, "measuring", [&](const Cubic& exact, std::size_t index) {
        const Cubic curve = Asked(job, exact);
        const PowerForm p = ToPowerForm(curve);
        if (IsStraight(curve)) {
            totals.combs.push_back({});
            return;
        }
        totals.combs.push_back(CombOf(p, StepsFor(curve, pixelsPerUnit)));
        AddPlaces(p, index, SpeedExtremes(p), totals.speedExtremes);
        AddInflections(p, index, totals);
    });
    return totals;
}

/// The curvature that is not exceeded on three quarters of the length of all combs; 0 without any.
double TypicalCurvature(const Totals& totals)
{
    struct Stretch
    {
        double curvature;
        double length;
    };

    std::vector<Stretch> stretches;
    double total = 0.0;
    for (const std::vector<Tooth>& comb : totals.combs)
        for (std::size_t i = 1; i < comb.size(); ++i) {
            stretches.push_back({std::fabs(comb[i].curvature), Distance(comb[i - 1].point, comb[i].point)});
            total += stretches.back().length;
        }
    std::sort(stretches.begin(), stretches.end(),
              [](const Stretch& a, const Stretch& b) { return a.curvature < b.curvature; });
    double length = 0.0;
    for (const Stretch& each : stretches)
        if ((length += each.length) >= 0.75 * total)
            return each.curvature;
    return 0.0;
}

/// How the comb is drawn.
struct Scale
{
    double perCurvature; ///< length of a tooth for a curvature of 1
    double longest;      ///< where teeth are cut, in drawing units
};

/// The typical tooth gets the stated length. Teeth longer than two of these are cut: near a cusp they have no bounds.
Scale ScaleFor(const Totals& totals, double tooth)
{
    const double typical = TypicalCurvature(totals);
    return {typical > 0.0 ? tooth / typical : 0.0, 2.0 * tooth};
}

bool IsCut(const Tooth& tooth, const Scale& scale)
{
    return std::fabs(tooth.curvature) * scale.perCurvature > scale.longest;
}

/// Teeth stand on the outer side of the bend.
point2d TipOf(const Tooth& tooth, const Scale& scale)
{
    const double height = std::clamp(tooth.curvature * scale.perCurvature, -scale.longest, scale.longest);
    return tooth.point - tooth.left * height;
}

void AddPlacesTo(Report& report, const std::string& key, const std::vector<Place>& places)
{
    std::vector<std::int64_t> curves;
    std::vector<double> parameters;
    std::vector<point2d> points;
    for (const Place& place : places) {
        curves.push_back(static_cast<std::int64_t>(place.curve));
        parameters.push_back(place.t);
        points.push_back(place.point);
    }
    report.AddNumbers(key + "At", points);
    report.AddNumbers(key + "Curve", curves);
    report.AddNumbers(key + "T", parameters);
}

/// The teeth of least and of greatest curvature, by size.
struct Range
{
    Tooth weakest;
    Tooth strongest;
};

Range RangeOf(const std::vector<Tooth>& comb)
{
    const auto [weakest, strongest] = std::minmax_element(comb.begin(), comb.end(), [](const auto& a, const auto& b) {
        return std::fabs(a.curvature) < std::fabs(b.curvature);
    });
    return {*weakest, *strongest};
}

void DescribeCurvature(const Totals& totals, Report& report)
{
    std::vector<double> weakest, strongest;
    Tooth sharpest{{}, {}, 0.0};
    for (const std::vector<Tooth>& comb : totals.combs) {
        const Range range = comb.empty() ? Range{{{}, {}, 0.0}, {{}, {}, 0.0}} : RangeOf(comb);
        weakest.push_back(range.weakest.curvature);
        strongest.push_back(range.strongest.curvature);
        if (std::fabs(range.strongest.curvature) > std::fabs(sharpest.curvature))
            sharpest = range.strongest;
    }
    const bool bends = sharpest.curvature != 0.0;
    report.Add("strongest", "strongest curvature", sharpest.curvature);
    report.Add("radius", "its radius", bends ? Value(1.0 / std::fabs(sharpest.curvature)) : Value());
    report.Add("at", "its place", bends ? Value(sharpest.point) : Value());
    report.AddNumbers("weakestOfCurve", weakest);
    report.AddNumbers("strongestOfCurve", strongest);
}

void Describe(const Totals& totals, const Scale& scale, Report& report)
{
    const auto straight =
        std::count_if(totals.combs.begin(), totals.combs.end(), [](const auto& c) { return c.empty(); });
    std::int64_t teeth = 0, cut = 0;
    for (const std::vector<Tooth>& comb : totals.combs)
        for (const Tooth& tooth : comb) {
            ++teeth;
            cut += IsCut(tooth, scale) ? 1 : 0;
        }
    report.Add("curves", "curves", static_cast<std::int64_t>(totals.combs.size()));
    report.Add("straightCurves", "straight ones", static_cast<std::int64_t>(straight));
    DescribeCurvature(totals, report);
    report.Add("speedExtremes", "extremes of speed", static_cast<std::int64_t>(totals.speedExtremes.size()));
    report.Add("inflections", "inflections", static_cast<std::int64_t>(totals.inflections.size()));
    report.Add("missedInflections", "of these, not listed", totals.missedInflections);
    report.Add("strayInflections", "listed, and elsewhere", totals.strayInflections);
    report.Add("teeth", "teeth", teeth);
    report.Add("cutTeeth", "cut short", cut);
    report.AddNumbers("toothPerCurvature", scale.perCurvature);
    AddPlacesTo(report, "speedExtreme", totals.speedExtremes);
    AddPlacesTo(report, "inflection", totals.inflections);
}

/// The layers of the comb, for one direction of turning.
struct Side
{
    Layer& teeth;
    Layer& outline;
};

/// Where the curvature passes through zero between two teeth.
point2d ZeroBetween(const Tooth& before, const Tooth& after)
{
    const double share = before.curvature / (before.curvature - after.curvature);
    return before.point + (after.point - before.point) * share;
}

/// Teeth and outline of one curve; the outline changes its layer where the curve changes its turning.
void AddComb(const std::vector<Tooth>& comb, const Scale& scale, const Side& left, const Side& right)
{
    std::vector<point2d> outline;
    for (std::size_t i = 0; i < comb.size(); ++i) {
        const bool isLeft = comb[i].curvature > 0.0;
        const Side& side = isLeft ? left : right;
        const point2d tip = TipOf(comb[i], scale);
        side.teeth.AddPolyline({comb[i].point, tip});
        outline.push_back(tip);
        const bool isLast = i + 1 == comb.size();
        if (!isLast && (comb[i + 1].curvature > 0.0) == isLeft)
            continue;
        if (!isLast)
            outline.push_back(ZeroBetween(comb[i], comb[i + 1]));
        side.outline.AddPolyline(outline);
        outline = {outline.back()};
    }
}

void MakeRoom(const Totals& totals, const Scale& scale, Picture& picture)
{
    for (const std::vector<Tooth>& comb : totals.combs)
        for (const Tooth& tooth : comb)
            picture.MakeRoomFor(TipOf(tooth, scale));
}

void AddDots(const std::vector<Place>& places, Layer& halos, Layer& dots)
{
    for (const Place& place : places) {
        halos.AddDot(place.point);
        dots.AddDot(place.point);
    }
}

void Show(const Totals& totals, const Scale& scale, Picture& picture)
{
    MakeRoom(totals, scale, picture);
    const Style leftTeeth{colour::blue, 1.0, "", 0.4}, left{colour::blue, 1.75, "", 1.0};
    const Style rightTeeth{colour::orange, 1.0, "", 0.4}, right{colour::orange, 1.75, "", 1.0};
    const Style extreme{colour::green, 7.0, "", 1.0};
    const Style inflection{colour::ink, 8.0, "", 1.0};
    Layer& leftTeethLayer = picture.AddLayer(leftTeeth);
    Layer& rightTeethLayer = picture.AddLayer(rightTeeth);
    Layer& leftOutline = picture.AddLayer(left);
    Layer& rightOutline = picture.AddLayer(right);
    for (const std::vector<Tooth>& comb : totals.combs)
        AddComb(comb, scale, {leftTeethLayer, leftOutline}, {rightTeethLayer, rightOutline});
    Layer& halos = picture.AddLayer({colour::paper, inflection.width + 2.5, "", 1.0});
    AddDots(totals.speedExtremes, halos, picture.AddLayer(extreme));
    AddDots(totals.inflections, halos, picture.AddLayer(inflection));

    picture.AddLegend(left, Sample::Stroke, "turns left");
    picture.AddLegend(right, Sample::Stroke, "turns right");
    picture.AddLegend(extreme, Sample::Dot, "speed is extreme");
    picture.AddLegend(inflection, Sample::Dot, "inflections");
}

void Run(double percent, const Job& job, Report& report, Picture& picture)
{
    const Totals totals = Find(job, picture.PixelsPerUnit());
    const Scale scale = ScaleFor(totals, percent / 100.0 * LargerSide(job.drawing.bounds));
    Describe(totals, scale, report);
    Show(totals, scale, picture);
}

Question Prepare(const Arguments& arguments)
{
    const double percent = ReadNumberWithin("--tooth", arguments.at("--tooth"), 0.0, 50.0);
    return [percent](const Job& job, Report& report, Picture& picture) { Run(percent, job, report, picture); };
}

} // namespace

Command CurvatureCommand()
{
    return {"curvature",
            "Draws the curvature comb, inflections and where the speed is extreme",
            "A tooth of the comb is as long as the curvature is strong, on the outer side of the bend; teeth of more\n"
            "than twice the length of --tooth are cut short. The strongest curvature is that of the teeth. The\n"
            "library's FindCurvatureMinMax lists, despite its name, the extremes of the SPEED, as those of its sixth\n"
            "power |P'|^6: on common curves they lie near the sharpest and the flattest places, but curvature does\n"
            "not enter. Inflections are asked of BezierInflectionPoints, and those inside their curve are taken.\n"
            "Where the leading term of its quadratic all but vanishes, as on a symmetric S, it has no answer, or one\n"
            "that is off; so curvelab solves the quadratic in the form without cancellation, shows these, and counts\n"
            "where the library's differ by a millionth in t. Straight curves have no comb. There are no integer\n"
            "overloads: --integer asks about the rounded control points in double.",
            {{"--tooth", "PERCENT",
              "Length of a tooth that three quarters of the comb do not exceed, in percent of the larger side, 0 to 50",
              "2.5"}},
            {{"curvature nautilus.svg -o comb.svg", "How the drawing bends"},
             {"curvature knots.svg --tooth 5 -o comb.svg", "The same with longer teeth"}},
            Prepare};
}

} // namespace curvelab
