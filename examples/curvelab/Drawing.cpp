#include "Drawing.h"

#include "Failure.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace curvelab {

namespace {

/// Calls f with each control point of the drawing.
template <typename F>
void ForEachPoint(Drawing& drawing, F f)
{
    for (Contour& contour : drawing.contours)
        for (Cubic& curve : contour.curves)
            for (point2d& p : curve.points)
                f(p);
}

Bounds TightBounds(const Drawing& drawing)
{
    Bounds bounds = NoBounds();
    for (const Contour& contour : drawing.contours)
        for (const Cubic& curve : contour.curves)
            Include(bounds, curve);
    return bounds;
}

void RequireFinite(Drawing& drawing)
{
    ForEachPoint(drawing, [&](const point2d& p) {
        if (!std::isfinite(p.x) || !std::isfinite(p.y))
            throw Failure(drawing.name + ": a coordinate is not a finite number");
    });
}

/// Whether two points differ by no more than what relative coordinates add up to: such a gap is no line of the artwork.
bool IsRoundingGap(const point2d& p, const point2d& q)
{
    const double size = std::max({std::fabs(p.x), std::fabs(p.y), std::fabs(q.x), std::fabs(q.y)});
    return std::max(std::fabs(p.x - q.x), std::fabs(p.y - q.y)) <= 1e-10 * size;
}

} // namespace

std::size_t CountCurves(const Drawing& drawing)
{
    std::size_t count = 0;
    for (const Contour& contour : drawing.contours)
        count += contour.curves.size();
    return count;
}

void Fit(Drawing& drawing, double units)
{
    if (drawing.contours.empty())
        throw Failure(drawing.name + ": nothing is drawn there, the drawing has no curves");
    RequireFinite(drawing);

    const Bounds old = TightBounds(drawing);
    const double side = std::max(old.right - old.left, old.top - old.bottom);
    if (!(side > 0.0))
        throw Failure(drawing.name + ": the drawing has no extent, all of it lies in one point");

    // Divided first: the larger side becomes side/side*units, which is `units` to the last bit.
    ForEachPoint(drawing, [&](point2d& p) {
        p = {(p.x - old.left) / side * units, (p.y - old.bottom) / side * units};
    });
    RequireFinite(drawing);
    drawing.bounds = {0.0, (old.top - old.bottom) / side * units, (old.right - old.left) / side * units, 0.0};
}

void Pen::MoveTo(const point2d& p)
{
    EndContour(false);
    start_ = at_ = p;
}

void Pen::LineTo(const point2d& p)
{
    if (p != at_)
        Add(LineAsCubic(at_, p));
}

void Pen::QuadraticTo(const point2d& control, const point2d& p)
{
    Add(QuadraticAsCubic(at_, control, p));
}

void Pen::CubicTo(const point2d& control1, const point2d& control2, const point2d& p)
{
    Add({{at_, control1, control2, p}});
}

void Pen::ArcTo(const Arc& arc)
{
    for (const Cubic& piece : ArcAsCubics(at_, arc))
        Add(piece);
}

void Pen::Close()
{
    if (IsRoundingGap(at_, start_) && !current_.curves.empty())
        current_.curves.back()[3] = start_;
    else
        LineTo(start_);
    EndContour(true);
}

std::vector<Contour> Pen::Finish()
{
    EndContour(false);
    return std::exchange(*this, Pen()).contours_;
}

void Pen::Add(const Cubic& curve)
{
    current_.curves.push_back(curve);
    at_ = curve[3];
}

void Pen::EndContour(bool closed)
{
    if (!current_.curves.empty()) {
        current_.closed = closed;
        contours_.push_back(std::exchange(current_, Contour()));
    }
    at_ = start_;
}

void AddShape(Drawing& drawing, const Shape& shape, std::vector<Contour> contours)
{
    if (contours.empty())
        return;
    for (Contour& contour : contours) {
        contour.shape = drawing.shapes.size();
        drawing.contours.push_back(std::move(contour));
    }
    drawing.shapes.push_back(shape);
}

} // namespace curvelab
