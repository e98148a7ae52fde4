#include "docs/figures/Figure.h"

#include <cmath>
#include <cstdio>
#include <stdexcept>

namespace ZarnMath::Figures {

namespace {

constexpr const char* style = R"(<style>
svg { color-scheme: light dark; --paper: #fbfaf7; --ink: #22262b; --faint: #8b8880; --curve: #1f5c94; --other: #a85a10; --answer: #b3262d }
@media (prefers-color-scheme: dark) {
svg { --paper: #1b1f24; --ink: #e8e6e1; --faint: #8d9299; --curve: #7fb8ec; --other: #eaa95e; --answer: #ff8a80 } }
.paper { fill: var(--paper) }
.ink { --colour: var(--ink) } .faint { --colour: var(--faint) } .curve { --colour: var(--curve) }
.other { --colour: var(--other) } .answer { --colour: var(--answer) }
path { fill: none; stroke: var(--colour); stroke-width: 2.4; stroke-linejoin: round; stroke-linecap: round }
path.faint { stroke-width: 1.2 } path.ink { stroke-width: 1.5 } path.thin { stroke-width: 1.2 }
path.dashed { stroke-dasharray: 5 5 } path.filled { fill: var(--colour); fill-opacity: .14 }
path.head, circle { fill: var(--colour); stroke: none }
text { fill: var(--colour); font: 15px sans-serif; stroke: var(--paper); stroke-width: 4px; paint-order: stroke }
</style>
)";

constexpr double headLength = 11.0;
constexpr double headWidth = 8.0;
constexpr double dotRadius = 4.2;

std::string Number(double v)
{
    char digits[32];
    std::snprintf(digits, sizeof digits, "%.2f", v);
    return digits;
}

std::string Escaped(const std::string& words)
{
    std::string escaped;
    for (const char letter : words) {
        if (letter == '<')
            escaped += "&lt;";
        else if (letter == '&')
            escaped += "&amp;";
        else
            escaped += letter;
    }
    return escaped;
}

} // namespace

Figure::Figure(const std::string& path, const BoundsT<double>& view, double width) : out(path)
{
    if (!out)
        throw std::runtime_error("cannot write " + path);
    const double height = width * (view.top - view.bottom) / (view.right - view.left);
    // Of the screen y grows downward: the target is inside out, which flips.
    toScreen = ConstructRectTransformMatrix(view, {0.0, 0.0, width, height}, MapStretch);
    out << "<svg xmlns='http://www.w3.org/2000/svg' width='" << Number(width) << "' height='" << Number(height)
        << "' viewBox='0 0 " << Number(width) << ' ' << Number(height) << "'>\n"
        << style << "<rect class='paper' width='100%' height='100%'/>\n";
}

Figure::~Figure()
{
    out << "</svg>\n";
}

std::string Figure::Place(const point2d& p) const
{
    const point2d place = toScreen(p);
    return Number(place.x) + ' ' + Number(place.y);
}

void Figure::Path(const std::string& steps, Look look)
{
    out << "<path class='" << look << "' d='" << steps << "'/>\n";
}

void Figure::Segment(const point2d& from, const point2d& to, Look look)
{
    Path('M' + Place(from) + 'L' + Place(to), look);
}

void Figure::Polyline(const std::vector<point2d>& points, Look look)
{
    std::string steps;
    for (const point2d& p : points)
        steps += (steps.empty() ? 'M' : 'L') + Place(p);
    Path(steps, look);
}

void Figure::Polygon(const std::vector<point2d>& points, Look look)
{
    std::string steps;
    for (const point2d& p : points)
        steps += (steps.empty() ? 'M' : 'L') + Place(p);
    Path(steps + 'Z', look);
}

void Figure::Box(const BoundsT<double>& box, Look look)
{
    point2d corners[4];
    GetRectCorners(box, corners);
    Polygon({corners, corners + 4}, look);
}

void Figure::Circle(const point2d& centre, double radius, Look look)
{
    constexpr int steps = 90;
    std::vector<point2d> points;
    for (int i = 0; i < steps; ++i)
        points.push_back(centre + Degrees::AngleToVector(i * 360.0 / steps, radius));
    Polygon(points, look);
}

void Figure::Curve(const Cubic& curve, Look look)
{
    Path('M' + Place(curve[0]) + 'C' + Place(curve[1]) + ' ' + Place(curve[2]) + ' ' + Place(curve[3]), look);
}

void Figure::CurveWithHandles(const Cubic& curve, Look look)
{
    Polyline({curve.points, curve.points + 4}, "faint");
    for (const point2d& p : curve.points)
        Dot(p, "faint");
    Curve(curve, look);
}

void Figure::Turn(const point2d& centre, double radius, double fromDegrees, double toDegrees, Look look)
{
    constexpr int steps = 40;
    std::vector<point2d> points;
    for (int i = 0; i <= steps; ++i)
        points.push_back(centre + Degrees::AngleToVector(fromDegrees + (toDegrees - fromDegrees) * i / steps, radius));
    Polyline(points, look);
    // The head is as long as a few steps, so that it follows the arc.
    Arrow(points[steps - 4], points[steps], look);
}

void Figure::Arrow(const point2d& from, const point2d& to, Look look)
{
    const point2d tip = toScreen(to);
    const vector2d along = Normalize(tip - toScreen(from));
    const vector2d side = Perpendicular(along) * (headWidth / 2.0);
    const point2d foot = tip - along * headLength;
    const auto place = [](const point2d& p) { return Number(p.x) + ' ' + Number(p.y); };
    Path('M' + Place(from) + 'L' + place(foot), look);
    Path('M' + place(tip) + 'L' + place(foot + side) + 'L' + place(foot - side) + 'Z',
         (std::string(look) + " head").c_str());
}

void Figure::Dot(const point2d& at, Look look)
{
    const point2d place = toScreen(at);
    out << "<circle class='" << look << "' cx='" << Number(place.x) << "' cy='" << Number(place.y) << "' r='"
        << Number(dotRadius) << "'/>\n";
}

void Figure::Label(const point2d& at, Beside beside, const std::string& words, Look look)
{
    constexpr double gap = 9.0;
    constexpr double letterMiddle = 5.0; // how far the base line lies below the middle of the letters
    point2d place = toScreen(at);
    const char* anchor = "middle";
    switch (beside) {
    case Beside::Right:
        place = {place.x + gap, place.y + letterMiddle};
        anchor = "start";
        break;
    case Beside::Left:
        place = {place.x - gap, place.y + letterMiddle};
        anchor = "end";
        break;
    case Beside::Above:
        place.y -= gap;
        break;
    case Beside::Below:
        place.y += gap + 2.0 * letterMiddle;
        break;
    case Beside::On:
        place.y += letterMiddle;
        break;
    }
    out << "<text class='" << look << "' x='" << Number(place.x) << "' y='" << Number(place.y) << "' text-anchor='"
        << anchor << "'>" << Escaped(words) << "</text>\n";
}

void Figure::Axes(const point2d& origin, double right, double top)
{
    Arrow(origin, {right, origin.y}, "ink");
    Arrow(origin, {origin.x, top}, "ink");
    Label({right, origin.y}, Beside::Below, "x");
    Label({origin.x, top}, Beside::Left, "y");
}

point2d PointAt(const Cubic& curve, double t)
{
    Cubic piece{};
    CubicBezier::LeftOf(t, curve.points, piece.points);
    return piece[3];
}

PowerForm ToPowerForm(const Cubic& curve)
{
    const auto [p0, p1, p2, p3] = curve.points;
    return {AsPoint(((p3 - p0) - (p2 - p1) * 3.0)), AsPoint(((p2 - p1) - (p1 - p0)) * 3.0), AsPoint((p1 - p0) * 3.0),
            p0};
}

std::vector<point2d> OffsetPoints(const Cubic& curve, double distance, int steps)
{
    std::vector<point2d> points;
    for (int i = 0; i <= steps; ++i)
        points.push_back(CubicBezier::MapToBezier(curve.points, static_cast<double>(i) / steps, distance, 1.0));
    return points;
}

} // namespace ZarnMath::Figures
