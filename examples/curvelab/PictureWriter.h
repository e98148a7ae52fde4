/// @file
/// A picture as SVG text: where everything goes on the page, and how marks become path data.
#pragma once

#include "Picture.h"

#include <string>
#include <string_view>

namespace curvelab {

/// The page, in pixels.
namespace layout {
inline constexpr double side = 1000.0; ///< the larger side of the artwork
inline constexpr double margin = 48.0;
inline constexpr double titleHeight = 52.0;
inline constexpr double narrowest = 680.0; ///< room for the legend below slender artwork
inline constexpr double scaleGap = 36.0;   ///< from the artwork to the bar that tells its scale
inline constexpr double longestScale = 200.0;
inline constexpr double panelGap = 58.0; ///< from the artwork to the panel below it
inline constexpr double legendLine = 26.0;
inline constexpr double factWidth = 200.0;
inline constexpr double factHeight = 58.0;
inline constexpr double lensRadius = 112.0;
} // namespace layout

/// A place on the page: a point of the drawing stands at (x + scale*p.x, y - scale*p.y).
struct Frame
{
    double scale;
    double x;
    double y;

    [[nodiscard]] point2d operator()(const point2d& p) const
    {
        return {x + scale * p.x, y - scale * p.y};
    }
};

/// Writes one picture.
class PictureWriter
{
public:
    /// Of a picture that stands for itself.
    [[nodiscard]] static PictureWriter OfPage(const Picture& picture);

    /// Of one among others in a page, which brings the title, the facts and the colours for the dark.
    ///
    /// @param id differs from that of the others
    [[nodiscard]] static PictureWriter OfFigure(const Picture& picture, const std::string& id);

    /// Rules of a style sheet, which give those who read light on dark other colours.
    [[nodiscard]] static std::string DarkColours();

    [[nodiscard]] std::string Write(const Report& report);
    [[nodiscard]] std::string WriteFigure();

private:
    PictureWriter(const Picture& picture, const std::string& id, double above);

    [[nodiscard]] std::string Whole(double height) const;
    /// @return where the panel below begins
    double WriteView(bool isRuledOff);
    void WriteScale(double y);
    void WriteTitle();
    void WriteArtwork();
    void WriteLayers();
    void WriteLayer(const Layer& layer);
    void WriteLensMark(const Lens& lens);
    double WriteLegend(double top);
    double WriteFacts(const Report& report, double top);
    double WriteLens(const Lens& lens, double top);
    void WriteLensContent(const Lens& lens, const Frame& frame);
    void WriteText(double x, double y, double size, std::string_view attributes, const std::string& text);

    const Picture& picture_;
    std::string id_; ///< in front of the names of what is referred to
    double above_;   ///< where the artwork begins
    double artWidth_;
    double artHeight_;
    double width_;
    Frame page_;
    std::string out_;
};

} // namespace curvelab
