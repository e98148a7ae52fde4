/// @file
/// The picture: the artwork in grey, the answer drawn over it, and a legend with the numbers.
///
/// Everything is placed in drawing units with y upward; widths and sizes are in pixels of a picture whose artwork is
/// 1000 pixels on its larger side, so that it looks the same whatever the drawing's units are.
#pragma once

#include "Drawing.h"
#include "Report.h"

#include <deque>
#include <optional>
#include <string>
#include <vector>

namespace curvelab {

/// The colours of answers: strong, told apart by people with any colour vision, and against the grey of the artwork.
namespace colour {
inline constexpr const char* ink = "#1d2530";
inline constexpr const char* blue = "#0b63c5";
inline constexpr const char* orange = "#e0590b";
inline constexpr const char* green = "#0a8a5f";
inline constexpr const char* paper = "#ffffff";
} // namespace colour

/// How the marks of a layer look.
struct Style
{
    std::string stroke = colour::ink;
    double width = 2.0;
    std::string dash = {}; ///< lengths of dashes and gaps in pixels, as in "6 4"; solid if empty
    double opacity = 1.0;
};

/// Marks of one style. Later marks lie above earlier ones.
class Layer
{
public:
    explicit Layer(Style style) : style_(std::move(style)) {}

    void AddPolyline(std::vector<point2d> points);
    void AddCurve(const Cubic& curve);
    /// A disc; the diameter is the layer's width.
    void AddDot(const point2d& p);
    /// A circle, the radius in drawing units.
    void AddCircle(const point2d& centre, double radius);

private:
    friend class PictureWriter;

    enum class Kind
    {
        Polyline,
        Curve,
        Dot,
        Circle
    };

    struct Mark
    {
        Kind kind;
        std::vector<point2d> points; ///< of a circle the centre and its rightmost point
    };

    void Add(Kind kind, std::vector<point2d> points);

    Style style_;
    std::vector<Mark> marks_;
};

/// How a legend shows its sample.
enum class Sample
{
    Stroke,
    Dot
};

/// A magnified view of one place, shown beside the legend.
struct Lens
{
    point2d centre;
    double radius; ///< what it shows, in drawing units
    std::string caption;
};

/// A picture in the making.
class Picture
{
public:
    /// @param drawing shown in grey; must outlive the picture
    Picture(const Drawing& drawing, std::string title);

    /// A layer above the ones before; the reference stays valid.
    [[nodiscard]] Layer& AddLayer(const Style& style);

    /// Explains a style in the legend.
    void AddLegend(const Style& style, Sample sample, const std::string& text);

    /// Makes room for a point that may lie outside the artwork.
    void MakeRoomFor(const point2d& p);

    /// Shows one place magnified, and marks where it is. There is one lens; a later one replaces it.
    void SetLens(const Lens& lens);

    /// The radius, in drawing units, of a lens that magnifies so much.
    [[nodiscard]] double LensRadius(double magnification) const;

    /// A diameter for so many dots along marks of that length (in drawing units): they leave a gap, unless they would be
    /// too small to be seen, and are no larger than `largest` pixels.
    [[nodiscard]] double DotWidth(std::size_t dots, double length, double largest) const;

    /// How many pixels a drawing unit is wide.
    [[nodiscard]] double PixelsPerUnit() const;

    /// Puts a page of HTML in the place of the picture, for an answer that takes more than one.
    void ReplaceByPage(std::string page);

    /// The whole picture as SVG, or the page in its place.
    [[nodiscard]] std::string Render(const Report& report) const;

    /// The artwork, the layers and the legend as SVG that may stand in a page with others.
    ///
    /// @param id differs from that of the others
    [[nodiscard]] std::string RenderFigure(const std::string& id) const;

private:
    friend class PictureWriter;

    struct LegendLine
    {
        Style style;
        Sample sample;
        std::string text;
    };

    const Drawing& drawing_;
    std::string title_;
    Bounds view_;
    std::deque<Layer> layers_;
    std::vector<LegendLine> legend_;
    std::optional<Lens> lens_;
    std::string replacement_; ///< empty as a rule
};

} // namespace curvelab
