#include "Picture.h"

#include "PictureWriter.h"

#include <algorithm>
#include <utility>

namespace curvelab {

void Layer::AddPolyline(std::vector<point2d> points)
{
    Add(Kind::Polyline, std::move(points));
}

void Layer::AddCurve(const Cubic& curve)
{
    Add(Kind::Curve, {curve.points, curve.points + 4});
}

void Layer::AddDot(const point2d& p)
{
    Add(Kind::Dot, {p});
}

void Layer::AddCircle(const point2d& centre, double radius)
{
    Add(Kind::Circle, {centre, {centre.x + radius, centre.y}});
}

void Layer::Add(Kind kind, std::vector<point2d> points)
{
    marks_.push_back({kind, std::move(points)});
}

Picture::Picture(const Drawing& drawing, std::string title)
    : drawing_(drawing), title_(std::move(title)), view_(drawing.bounds)
{}

Layer& Picture::AddLayer(const Style& style)
{
    return layers_.emplace_back(style);
}

void Picture::AddLegend(const Style& style, Sample sample, const std::string& text)
{
    legend_.push_back({style, sample, text});
}

void Picture::MakeRoomFor(const point2d& p)
{
    Include(view_, p);
}

void Picture::SetLens(const Lens& lens)
{
    lens_ = lens;
}

double Picture::LensRadius(double magnification) const
{
    return layout::lensRadius / (PixelsPerUnit() * magnification);
}

double Picture::DotWidth(std::size_t dots, double length, double largest) const
{
    constexpr double smallest = 2.6;
    const double distance = dots > 0 ? PixelsPerUnit() * length / static_cast<double>(dots) : largest;
    return std::clamp(0.7 * distance, smallest, largest);
}

double Picture::PixelsPerUnit() const
{
    return layout::side / std::max(view_.right - view_.left, view_.top - view_.bottom);
}

void Picture::ReplaceByPage(std::string page)
{
    replacement_ = std::move(page);
}

std::string Picture::Render(const Report& report) const
{
    return replacement_.empty() ? PictureWriter::OfPage(*this).Write(report) : replacement_;
}

std::string Picture::RenderFigure(const std::string& id) const
{
    return PictureWriter::OfFigure(*this, id).WriteFigure();
}

} // namespace curvelab
