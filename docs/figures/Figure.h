/// @file
/// A figure of the manual in the making: an SVG file, drawn in a plane whose y grows upward.
#pragma once

#include <ZarnMath/ZarnMath.h>

#include <fstream>
#include <string>
#include <vector>

namespace ZarnMath::Figures {

using Cubic = CubicBezier::bezier2dT<point2d>;

/// Where a label stands, seen from its place.
enum class Beside
{
    Right,
    Left,
    Above,
    Below,
    On, ///< centred on the place
};

/// How something looks is the name of a class of the style sheet inside the file, which knows light and dark surroundings:
/// `curve`, `other` (a second curve), `answer` (what the library says), `ink`, `faint`; each can be followed by `dashed`,
/// `thin` or `filled`.
using Look = const char*;

/// Lengths in the plane are those of the view, sizes of dots, arrow heads and letters those of the screen.
class Figure
{
public:
    /// @param path  where to write
    /// @param view  what of the plane is shown
    /// @param width of the picture, in pixels
    /// @throws std::runtime_error if the file cannot be written
    Figure(const std::string& path, const BoundsT<double>& view, double width = 480.0);
    Figure(const Figure&) = delete;
    Figure& operator=(const Figure&) = delete;
    ~Figure();

    void Segment(const point2d& from, const point2d& to, Look look);
    void Polyline(const std::vector<point2d>& points, Look look);
    void Polygon(const std::vector<point2d>& points, Look look);
    void Box(const BoundsT<double>& box, Look look);
    void Circle(const point2d& centre, double radius, Look look);
    void Curve(const Cubic& curve, Look look);
    /// A curve with its control polygon.
    void CurveWithHandles(const Cubic& curve, Look look);
    /// An arc about a centre, from one angle to another, in degrees; with a head at its end.
    void Turn(const point2d& centre, double radius, double fromDegrees, double toDegrees, Look look);
    void Arrow(const point2d& from, const point2d& to, Look look);
    void Dot(const point2d& at, Look look);
    void Label(const point2d& at, Beside beside, const std::string& words, Look look = "ink");
    /// The axes of the plane, with their names.
    void Axes(const point2d& origin, double right, double top);

private:
    void Path(const std::string& steps, Look look);
    [[nodiscard]] std::string Place(const point2d& p) const;

    MATRIX toScreen;
    std::ofstream out;
};

/// The curve at t, by the piece that ends there.
[[nodiscard]] point2d PointAt(const Cubic& curve, double t);

/// The power form, as the functions of curvature, length and closest points take it.
struct PowerForm
{
    point2d a;
    point2d b;
    point2d c;
    point2d d;
};

[[nodiscard]] PowerForm ToPowerForm(const Cubic& curve);

/// The points of the plane at a distance from a curve, many of them.
[[nodiscard]] std::vector<point2d> OffsetPoints(const Cubic& curve, double distance, int steps = 128);

} // namespace ZarnMath::Figures
