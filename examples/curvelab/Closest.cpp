#include "Command.h"
#include "Failure.h"
#include "Numbers.h"

#include <cmath>
#include <limits>

namespace curvelab {

namespace {

/// How far from the drawing a point may be asked about in whole units, so that no difference leaves 32 bits.
constexpr double farthestInteger = 1 << 30;

/// The nearest point of a curve, or of several.
struct Nearest
{
    double squared = std::numeric_limits<double>::infinity();
    std::size_t curve = 0;
    double t = 0.0;
    point2d point{};
    bool isFoot = false;    ///< whether the distance is stationary there
    bool wasMissed = false; ///< whether the foot was found on a piece of the curve only
    ZarnMath::Side side = ZarnMath::SideNone;

    void Take(const Nearest& other)
    {
        if (other.squared < squared)
            *this = other;
    }
};

/// The foot that the library finds on a curve; infinitely far if there is none.
Nearest FootOn(const Cubic& curve, const point2d& q)
{
    Nearest foot;
    foot.isFoot = ZarnMath::CubicBezier::FindClosestPointOnBezier(curve.points, q, foot.t, foot.point, foot.squared);
    return foot;
}

Nearest FootOn(const IntegerCubic& curve, const point2d& q)
{
    Nearest foot;
    POINT point{};
    foot.isFoot = ZarnMath::CubicBezier::FindClosestPointOnBezier(
        curve.data(), POINT{ZarnMath::RoundToInt(q.x), ZarnMath::RoundToInt(q.y)}, foot.t, point, foot.squared);
    foot.point = {static_cast<double>(point.x), static_cast<double>(point.y)};
    return foot;
}

/// The nearest of the feet on two pieces of a curve, with its parameter on the whole curve.
///
/// The library's search halves the parameter range, and a foot exactly on a cut is lost, as at t = 0.5 above the apex of a
/// symmetric arch. On the pieces of an uneven cut that foot lies elsewhere.
Nearest FootOnPieces(const Cubic& curve, const point2d& q)
{
    constexpr double cut = 3.0 / 7.0;
    Cubic left{};
    Cubic right{};
    ZarnMath::CubicBezier::Split(cut, curve.points, left.points, right.points);
    Nearest onLeft = FootOn(left, q);
    Nearest onRight = FootOn(right, q);
    onLeft.t *= cut;
    onRight.t = cut + onRight.t * (1.0 - cut);
    onLeft.Take(onRight);
    return onLeft;
}

Nearest EndOf(const Cubic& curve, double t, const point2d& q)
{
    Nearest end;
    end.t = t;
    end.point = curve[t == 0.0 ? 0 : 3];
    end.squared = ZarnMath::LengthSquared(q - end.point);
    return end;
}

/// The side as the library sees it from the foot; a missed foot is seen from the tangent there.
ZarnMath::Side SideOf(const Cubic& curve, const Nearest& foot, const point2d& q)
{
    const PowerForm p = ToPowerForm(curve);
    if (!foot.wasMissed)
        return ZarnMath::CubicBezier::GetSide(p.a, p.b, p.c, p.d, q);
    const double t = foot.t;
    const ZarnMath::vector2d tangent{(p.a.x * 3.0 * t + 2.0 * p.b.x) * t + p.c.x,
                                     (p.a.y * 3.0 * t + 2.0 * p.b.y) * t + p.c.y};
    const double cross = ZarnMath::Cross(tangent, q - foot.point);
    return cross > 0.0 ? ZarnMath::SidePositive : cross < 0.0 ? ZarnMath::SideNegative : ZarnMath::SideNone;
}

std::string SideName(ZarnMath::Side side)
{
    return side == ZarnMath::SidePositive ? "left" : side == ZarnMath::SideNegative ? "right" : "none";
}

/// What was found over the whole drawing.
struct Answer
{
    Nearest nearest;
    Cubic curve{}; ///< the one that the nearest point lies on
    std::vector<point2d> feet;
    std::int64_t missed = 0; ///< curves whose nearest foot was found on a piece only
};

/// The nearest point of one curve.
///
/// @param foot what the library found on the curve
Nearest NearestOn(const Cubic& curve, const Nearest& foot, const point2d& q)
{
    Nearest nearest = foot;
    nearest.Take(EndOf(curve, 0.0, q));
    nearest.Take(EndOf(curve, 1.0, q));
    Nearest onPiece = FootOnPieces(curve, q);
    // The same foot again differs by rounding.
    onPiece.wasMissed = onPiece.squared < nearest.squared * (1.0 - 1e-9);
    return onPiece.wasMissed ? onPiece : nearest;
}

Answer Find(const point2d& q, const Job& job)
{
    Answer answer;
    ForEachCurve(job, "measuring", [&](const Cubic& exact, std::size_t index) {
        const IntegerCubic whole = Rounded(exact);
        const Cubic curve = job.integer ? ToDouble(whole) : exact;
        const Nearest foot = job.integer ? FootOn(whole, q) : FootOn(curve, q);
        if (foot.isFoot)
            answer.feet.push_back(foot.point);

        const Nearest here = NearestOn(curve, foot, q);
        answer.missed += here.wasMissed ? 1 : 0;
        if (here.squared >= answer.nearest.squared)
            return;
        answer.nearest = here;
        answer.nearest.curve = index;
        answer.nearest.side = here.isFoot ? SideOf(curve, here, q) : ZarnMath::SideNone;
        answer.curve = curve;
    });
    return answer;
}

void Describe(const point2d& q, const Answer& answer, std::size_t curves, Report& report)
{
    const Nearest& nearest = answer.nearest;
    report.Add("to", "asked for", q);
    report.Add("point", "nearest point", nearest.point);
    report.Add("distance", "distance", std::sqrt(nearest.squared));
    report.Add("t", "parameter", nearest.t);
    report.Add("curve", "curve", static_cast<std::int64_t>(nearest.curve));
    report.Add("side", "side of travel", SideName(nearest.side));
    report.Add("isFoot", "foot of a perpendicular", nearest.isFoot);
    report.Add("curves", "curves", static_cast<std::int64_t>(curves));
    report.Add("curvesWithFoot", "curves with a foot", static_cast<std::int64_t>(answer.feet.size()));
    report.Add("missedFeet", "found on a piece only", answer.missed);
    report.AddNumbers("feet", answer.feet);
}

/// A foot line that is short on the page is shown under the lens.
void ShowMagnified(const Nearest& nearest, Picture& picture)
{
    const double radius = 1.5 * std::sqrt(nearest.squared);
    const double magnification = picture.LensRadius(1.0) / radius;
    if (magnification > 3.0 && magnification < 1e7)
        picture.SetLens(
            {nearest.point, radius, "the nearest point, " + FormatNumber(magnification, 3) + " times larger"});
}

void Show(const point2d& q, const Answer& answer, Picture& picture)
{
    const Style curve{colour::blue, 4.0, "", 1.0};
    const Style foot{colour::blue, 6.0, "", 0.35};
    const Style circle{colour::green, 1.5, "2 6", 1.0};
    const Style line{colour::orange, 3.0, "", 1.0};
    const Style query{colour::ink, 11.0, "", 1.0};
    const Style nearest{colour::orange, 12.0, "", 1.0};

    const point2d& p = answer.nearest.point;
    picture.MakeRoomFor(q);
    picture.AddLayer(circle).AddCircle(q, std::sqrt(answer.nearest.squared));
    Layer& feet = picture.AddLayer(foot);
    for (const point2d& each : answer.feet)
        feet.AddDot(each);
    picture.AddLayer(curve).AddCurve(answer.curve);
    picture.AddLayer(line).AddPolyline({q, p});
    picture.AddLayer({colour::paper, query.width + 4.0, "", 1.0}).AddDot(q);
    picture.AddLayer(query).AddDot(q);
    picture.AddLayer({colour::paper, nearest.width + 4.0, "", 1.0}).AddDot(p);
    picture.AddLayer(nearest).AddDot(p);

    ShowMagnified(answer.nearest, picture);

    picture.AddLegend(query, Sample::Dot, "asked for");
    picture.AddLegend(nearest, Sample::Dot, "nearest point");
    picture.AddLegend(line, Sample::Stroke, "foot line");
    picture.AddLegend(curve, Sample::Stroke, "its curve");
    picture.AddLegend(foot, Sample::Dot, "feet on all curves");
    picture.AddLegend(circle, Sample::Stroke, "nothing is nearer");
}

void Run(const point2d& asked, const Job& job, Report& report, Picture& picture)
{
    point2d q = asked;
    if (job.integer) {
        if (std::fabs(q.x) > farthestInteger || std::fabs(q.y) > farthestInteger)
            throw Failure("--to: with --integer, coordinates go from -1073741824 to 1073741824");
        q = {static_cast<double>(ZarnMath::RoundToInt(q.x)), static_cast<double>(ZarnMath::RoundToInt(q.y))};
    }
    const Answer answer = Find(q, job);
    Describe(q, answer, CountCurves(job.drawing), report);
    Show(q, answer, picture);
}

Question Prepare(const Arguments& arguments)
{
    const point2d to = ReadPoint("--to", arguments.at("--to"));
    return [to](const Job& job, Report& report, Picture& picture) { Run(to, job, report, picture); };
}

} // namespace

Command ClosestCommand()
{
    return {
        "closest",
        "Finds the point of the drawing that is nearest to a given one",
        "The library answers with the nearest FOOT on a curve: a point where the distance is stationary. A curve may\n"
        "have none, so curvelab takes the ends of every curve as candidates too, and says which kind the nearest is.\n"
        "A foot exactly on a cut of the library's search is lost; curvelab asks the two pieces of an uneven cut as\n"
        "well, and counts the curves where that found a nearer point. The side (left or right, seen along the curve) "
        "is\n"
        "that of a foot; for an end without one it is \"none\". Curves count from 0, in drawing order.",
        {{"--to", "X,Y", "The point, in drawing units; it may lie outside the drawing", ""}},
        {{"closest nautilus.svg --to 67000,52000 -o nearest.svg",
          "The point of the drawing that is nearest to one beside it"},
         {"closest --text \"Ampersand &\" --font DejaVuSans.ttf --to 53000,16500 --json",
          "The same for letters, as JSON on standard output"}},
        Prepare};
}

} // namespace curvelab
