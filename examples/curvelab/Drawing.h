/// @file
/// The artwork that the commands work on, whichever source it comes from.
///
/// A drawing is a list of contours, each a chain of cubics in which every curve begins where the one before it ended.
/// Lines, quadratics and arcs are cubics already. Contours that are painted together (a letter and its counters) carry
/// the number of the same shape.
///
/// The plane has y growing upward. A drawing that has been fitted has its lower left corner at (0, 0) and its larger
/// side as long as the stated count of units.
#pragma once

#include "Cubic.h"

#include <cstddef>
#include <string>
#include <vector>

namespace curvelab {

/// How a shape is painted: what the picture needs to show the artwork as such.
struct Shape
{
    bool filled = true;
    bool evenOdd = false; ///< inside by the even-odd rule instead of the winding number
};

/// A chain of curves. A closed contour ends exactly where it began, by a straight line of its own where necessary.
struct Contour
{
    std::vector<Cubic> curves;
    bool closed = false;
    std::size_t shape = 0; ///< index into `Drawing::shapes`
};

/// Artwork.
struct Drawing
{
    std::string name;
    std::vector<Shape> shapes;
    std::vector<Contour> contours; ///< none is empty
    Bounds bounds = NoBounds();    ///< tight; set by `Fit`
};

/// The number of curves over all contours.
[[nodiscard]] std::size_t CountCurves(const Drawing& drawing);

/// Moves and scales a drawing, so that its lower left corner lies at (0, 0) and its larger side is `units` long.
///
/// @throw Failure if the drawing has no curve, no extent, or a coordinate that is not finite
void Fit(Drawing& drawing, double units);

/// Collects the contours of one shape from pen movements.
///
/// Lines of no length, and contours without any curve, are left out.
class Pen
{
public:
    void MoveTo(const point2d& p);
    void LineTo(const point2d& p);
    void QuadraticTo(const point2d& control, const point2d& p);
    void CubicTo(const point2d& control1, const point2d& control2, const point2d& p);
    void ArcTo(const Arc& arc);
    /// Returns to the contour's start; the next contour begins there unless the pen is moved.
    void Close();

    /// Ends the shape.
    ///
    /// @return its contours; the pen is as new
    [[nodiscard]] std::vector<Contour> Finish();

private:
    void Add(const Cubic& curve);
    void EndContour(bool closed);

    std::vector<Contour> contours_;
    Contour current_;
    point2d start_{};
    point2d at_{};
};

/// Appends the contours of one shape to a drawing; a shape without contours leaves no trace.
void AddShape(Drawing& drawing, const Shape& shape, std::vector<Contour> contours);

} // namespace curvelab
