#include "PictureWriter.h"

#include "Markup.h"
#include "Numbers.h"

#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <initializer_list>
#include <span>
#include <system_error>

namespace curvelab {

namespace {

// Thin enough that shapes which lie upon each other can be told apart.
constexpr const char* artFill = "#5d6a79";
constexpr double artFillOpacity = 0.13;
constexpr const char* artStroke = "#8d97a3";
constexpr const char* quiet = "#6b7683";
constexpr const char* rule = "#dfe3e8";
constexpr const char* lensPaper = "#f6f7f9";
constexpr const char* fontFamily = "'Helvetica Neue', Helvetica, Arial, 'DejaVu Sans', sans-serif";

/// What a colour becomes for those who read light on dark.
struct Shade
{
    const char* light;
    const char* dark;
};

constexpr Shade shades[] = {
    {colour::ink, "#e8edf3"},   {colour::blue, "#6cb2ff"}, {colour::orange, "#ff9550"}, {colour::green, "#3ecf9a"},
    {colour::paper, "#14181d"}, {artFill, "#aab4c0"},      {artStroke, "#76818d"},      {quiet, "#98a3b0"},
    {rule, "#323941"},          {lensPaper, "#1d2228"},
};

/// The longest of 1, 2 and 5 times a power of ten that is not above a positive limit.
double RoundBelow(double limit)
{
    const double power = std::pow(10.0, std::floor(std::log10(limit)));
    for (const double factor : {5.0, 2.0})
        if (factor * power <= limit)
            return factor * power;
    return power;
}

/// A length on the page, to a thousandth of a pixel.
std::string Pixels(double value)
{
    char buffer[400];
    const auto [end, error] = std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::fixed, 3);
    std::string text(error == std::errc() ? std::string(buffer, end) : "0");
    text.erase(text.find_last_not_of('0') + 1);
    if (text.back() == '.')
        text.pop_back();
    return text == "-0" ? "0" : text;
}

/// A command of path data with its points.
std::string PathCommand(char command, std::initializer_list<point2d> points)
{
    std::string text(1, command);
    for (const point2d& p : points) {
        if (text.size() > 1)
            text += ' ';
        text += Pixels(p.x);
        text += ' ';
        text += Pixels(p.y);
    }
    return text;
}

std::string Attribute(std::string_view name, const std::string& value)
{
    return ' ' + std::string(name) + "=\"" + value + '"';
}

std::string StrokeAttributes(const Style& style)
{
    std::string text = Attribute("stroke", style.stroke) + Attribute("stroke-width", Pixels(style.width));
    if (!style.dash.empty())
        text += Attribute("stroke-dasharray", style.dash);
    if (style.opacity < 1.0)
        text += Attribute("opacity", Pixels(style.opacity));
    return text;
}

/// Path data of a chain of curves; each begins where the one before ended.
std::string ChainData(std::span<const Cubic> curves, const Frame& frame)
{
    std::string data = PathCommand('M', {frame(curves.front()[0])});
    for (const Cubic& curve : curves)
        data += PathCommand('C', {frame(curve[1]), frame(curve[2]), frame(curve[3])});
    return data;
}

std::string PolylineData(std::span<const point2d> points, const Frame& frame)
{
    std::string data;
    for (const point2d& p : points)
        data += PathCommand(data.empty() ? 'M' : 'L', {frame(p)});
    return data;
}

/// A stroke of no length; its round caps make it a disc.
std::string DotData(const point2d& p, const Frame& frame)
{
    return PathCommand('M', {frame(p)}) + "h0";
}

std::vector<Cubic> CircleAsCubics(const point2d& centre, const point2d& right)
{
    const double radius = right.x - centre.x;
    const point2d left{centre.x - radius, centre.y};
    std::vector<Cubic> around = ArcAsCubics(right, {radius, radius, 0.0, false, true, left});
    for (const Cubic& piece : ArcAsCubics(left, {radius, radius, 0.0, false, true, right}))
        around.push_back(piece);
    return around;
}

/// Path data of a circle; of one without extent none.
std::string CircleData(const point2d& centre, const point2d& right, const Frame& frame)
{
    const std::vector<Cubic> around = CircleAsCubics(centre, right);
    return around.empty() ? "" : ChainData(around, frame) + "Z";
}

bool Overlap(const Bounds& a, const Bounds& b)
{
    return a.left <= b.right && b.left <= a.right && a.bottom <= b.top && b.bottom <= a.top;
}

/// Appends the stretches of a curve that can be seen in a window, halving it until a piece lies outside or is not much
/// larger than the window: renderers compute with few digits, and a whole curve under a strong lens runs far out.
void AppendVisible(const Cubic& curve, const Bounds& window, int halvings, std::vector<Cubic>& visible)
{
    Bounds box = NoBounds();
    for (const point2d& p : curve.points)
        Include(box, p);
    if (!Overlap(box, window))
        return;
    const double size = std::max(box.right - box.left, box.top - box.bottom);
    if (halvings == 0 || size <= 4.0 * (window.right - window.left)) {
        visible.push_back(curve);
        return;
    }
    Cubic left, right;
    ZarnMath::CubicBezier::Split(curve.points, left.points, right.points);
    AppendVisible(left, window, halvings - 1, visible);
    AppendVisible(right, window, halvings - 1, visible);
}

/// Path data of what can be seen of some curves.
std::string VisibleData(std::span<const Cubic> curves, const Bounds& window, const Frame& frame)
{
    constexpr int enoughHalvings = 48;
    std::vector<Cubic> visible;
    for (const Cubic& curve : curves)
        AppendVisible(curve, window, enoughHalvings, visible);
    std::string data;
    for (const Cubic& piece : visible)
        data += ChainData({&piece, 1}, frame);
    return data;
}

Bounds WindowOf(const Lens& lens)
{
    return {lens.centre.x - lens.radius, lens.centre.y + lens.radius, lens.centre.x + lens.radius,
            lens.centre.y - lens.radius};
}

/// A width that holds a text of the legend; there are no font metrics here, so it is an ample guess.
double TextWidth(const std::string& text, double size)
{
    return 0.56 * size * static_cast<double>(text.size());
}

} // namespace

std::string PictureWriter::DarkColours()
{
    std::string rules;
    for (const Shade& shade : shades)
        for (const std::string property : {"fill", "stroke"})
            rules += '[' + property + "=\"" + shade.light + "\"]{" + property + ':' + shade.dark + '}';
    return "@media (prefers-color-scheme:dark){" + rules + '}';
}

PictureWriter::PictureWriter(const Picture& picture, const std::string& id, double above)
    : picture_(picture), id_(id), above_(above)
{
    const Bounds& view = picture.view_;
    const double scale = picture.PixelsPerUnit();
    artWidth_ = (view.right - view.left) * scale;
    artHeight_ = (view.top - view.bottom) * scale;
    width_ = std::max(artWidth_, layout::narrowest) + 2.0 * layout::margin;
    const double left = (width_ - artWidth_) / 2.0;
    const double bottom = above_ + artHeight_;
    page_ = {scale, left - scale * view.left, bottom + scale * view.bottom};
}

PictureWriter PictureWriter::OfPage(const Picture& picture)
{
    return {picture, "", layout::margin + layout::titleHeight};
}

PictureWriter PictureWriter::OfFigure(const Picture& picture, const std::string& id)
{
    return {picture, id + '-', layout::margin};
}

std::string PictureWriter::Write(const Report& report)
{
    out_ += "<style>" + DarkColours() + "</style>\n<rect" + Attribute("width", "100%") + Attribute("height", "100%") +
            Attribute("fill", colour::paper) + "/>\n";
    WriteTitle();
    const double top = WriteView(true);
    double bottom = WriteFacts(report, WriteLegend(top));
    if (picture_.lens_)
        bottom = std::max(bottom, WriteLens(*picture_.lens_, top));
    return Whole(bottom + layout::margin - 12.0);
}

std::string PictureWriter::WriteFigure()
{
    const double top = WriteView(!picture_.legend_.empty());
    double bottom = WriteLegend(top) - 30.0;
    if (picture_.lens_)
        bottom = std::max(bottom, WriteLens(*picture_.lens_, top));
    return Whole(bottom + 20.0);
}

std::string PictureWriter::Whole(double height) const
{
    return "<svg xmlns=\"http://www.w3.org/2000/svg\" viewBox=\"0 0 " + Pixels(width_) + ' ' + Pixels(height) +
           "\" font-family=\"" + fontFamily + "\" stroke-linecap=\"round\" stroke-linejoin=\"round\" fill=\"none\">\n" +
           out_ + "</svg>\n";
}

/// The artwork with the layers over it, and the scale below them.
double PictureWriter::WriteView(bool isRuledOff)
{
    WriteArtwork();
    WriteLayers();
    if (picture_.lens_)
        WriteLensMark(*picture_.lens_);
    const double bottom = above_ + artHeight_;
    WriteScale(bottom + layout::scaleGap);
    const double line = bottom + layout::panelGap;
    if (isRuledOff)
        out_ += "<path d=\"" + PathCommand('M', {{layout::margin, line}}) + "H" + Pixels(width_ - layout::margin) +
                '"' + Attribute("stroke", rule) + "/>\n";
    return line + 30.0;
}

void PictureWriter::WriteTitle()
{
    const double line = layout::margin + 14.0;
    const std::string title = "curvelab " + picture_.title_;
    const double room = width_ - 2.0 * layout::margin - TextWidth(title, 24.0) - 20.0;
    WriteText(layout::margin, line, 24.0, R"( font-weight="600" fill="#1d2530")", title);
    WriteText(width_ - layout::margin, line, 15.0, std::string(R"( text-anchor="end" fill=")") + quiet + '"',
              Shortened(BaseName(picture_.drawing_.name), static_cast<std::size_t>(room / TextWidth("x", 15.0))));
}

/// A bar of a round length, and what it stands for.
void PictureWriter::WriteScale(double y)
{
    const double units = RoundBelow(layout::longestScale / page_.scale);
    const double right = width_ - layout::margin;
    const double left = right - units * page_.scale;
    const auto tick = [&](double x) { return PathCommand('M', {{x, y - 5.0}}) + "v10"; };
    out_ += "<path" + Attribute("stroke", quiet) + Attribute("stroke-width", "1.5") +
            Attribute("d", PathCommand('M', {{left, y}}) + 'H' + Pixels(right) + tick(left) + tick(right)) + "/>\n";
    WriteText(left - 12.0, y + 5.0, 13.0, std::string(R"( text-anchor="end" fill=")") + quiet + '"',
              FormatNumber(units) + (units == 1.0 ? " unit" : " units"));
}

void PictureWriter::WriteArtwork()
{
    const Drawing& drawing = picture_.drawing_;
    out_ += "<g" + Attribute("stroke", artStroke) + Attribute("stroke-width", "1.25") +
            Attribute("fill-opacity", Pixels(artFillOpacity)) + ">\n";
    for (std::size_t i = 0; i < drawing.contours.size();) {
        const std::size_t number = drawing.contours[i].shape;
        std::string data;
        for (; i < drawing.contours.size() && drawing.contours[i].shape == number; ++i)
            data += ChainData(drawing.contours[i].curves, page_) + (drawing.contours[i].closed ? "Z" : "");
        const Shape& shape = drawing.shapes[number];
        out_ += "<path" + (shape.filled ? Attribute("fill", artFill) : "") +
                (shape.evenOdd ? Attribute("fill-rule", "evenodd") : "") + Attribute("d", data) + "/>\n";
    }
    out_ += "</g>\n";
}

/// All layers, cut off at the margin: a circle may reach far beyond the artwork.
void PictureWriter::WriteLayers()
{
    const point2d corner = page_({picture_.view_.left, picture_.view_.top});
    const double room = layout::margin / 2.0;
    out_ += "<clipPath id=\"" + id_ + "page\"><rect" + Attribute("x", Pixels(corner.x - room)) +
            Attribute("y", Pixels(corner.y - room)) + Attribute("width", Pixels(artWidth_ + 2.0 * room)) +
            Attribute("height", Pixels(artHeight_ + 2.0 * room)) + "/></clipPath>\n<g clip-path=\"url(#" + id_ +
            "page)\">\n";
    for (const Layer& layer : picture_.layers_)
        WriteLayer(layer);
    out_ += "</g>\n";
}

void PictureWriter::WriteLayer(const Layer& layer)
{
    std::string data;
    for (const Layer::Mark& mark : layer.marks_) {
        const std::vector<point2d>& p = mark.points;
        switch (mark.kind) {
        case Layer::Kind::Polyline:
            data += PolylineData(p, page_);
            break;
        case Layer::Kind::Curve:
            data += ChainData(std::array{Cubic{{p[0], p[1], p[2], p[3]}}}, page_);
            break;
        case Layer::Kind::Dot:
            data += DotData(p[0], page_);
            break;
        case Layer::Kind::Circle:
            data += CircleData(p[0], p[1], page_);
            break;
        }
    }
    if (!data.empty())
        out_ += "<path" + StrokeAttributes(layer.style_) + Attribute("d", data) + "/>\n";
}

void PictureWriter::WriteLensMark(const Lens& lens)
{
    const point2d centre = page_(lens.centre);
    out_ += "<circle cx=\"" + Pixels(centre.x) + "\" cy=\"" + Pixels(centre.y) + "\" r=\"" +
            Pixels(std::max(16.0, lens.radius * page_.scale)) + "\" stroke=\"" + colour::ink +
            "\" stroke-width=\"1.75\"/>\n";
}

/// Samples and texts in lines, as many to a line as fit beside the lens.
double PictureWriter::WriteLegend(double top)
{
    const double right = width_ - layout::margin - (picture_.lens_ ? 2.0 * layout::lensRadius + 40.0 : 0.0);
    double x = layout::margin;
    double y = top;
    for (const Picture::LegendLine& line : picture_.legend_) {
        const double needed = 44.0 + TextWidth(line.text, 15.0);
        if (x > layout::margin && x + needed > right) {
            x = layout::margin;
            y += layout::legendLine;
        }
        const bool isDot = line.sample == Sample::Dot;
        out_ += "<path" + StrokeAttributes(line.style) + " d=\"" + PathCommand('M', {{isDot ? x + 12.0 : x, y}}) +
                (isDot ? "h0" : "h24") + "\"/>\n";
        WriteText(x + 34.0, y + 5.0, 15.0, R"( fill="#1d2530")", line.text);
        x += needed + 20.0;
    }
    return y + (picture_.legend_.empty() ? 0.0 : 40.0);
}

/// The facts with labels, in columns, read line by line.
double PictureWriter::WriteFacts(const Report& report, double top)
{
    const double room = width_ - 2.0 * layout::margin - (picture_.lens_ ? 2.0 * layout::lensRadius + 40.0 : 0.0);
    const int columns = std::max(1, static_cast<int>(room / layout::factWidth));
    int count = 0;
    for (const Fact& fact : report.Facts()) {
        if (fact.label.empty())
            continue;
        const double x = layout::margin + (count % columns) * room / columns;
        const double y = top + (count / columns) * layout::factHeight;
        WriteText(x, y, 13.0, std::string(R"( fill=")") + quiet + '"', fact.label);
        WriteText(x, y + 24.0, 20.0, R"( fill="#1d2530")", Readable(fact.value));
        ++count;
    }
    return top + ((count + columns - 1) / columns) * layout::factHeight - 16.0;
}

double PictureWriter::WriteLens(const Lens& lens, double top)
{
    const double radius = layout::lensRadius;
    const point2d centre{width_ - layout::margin - radius, top - 8.0 + radius};
    const double scale = radius / lens.radius;
    const Frame frame{scale, centre.x - scale * lens.centre.x, centre.y + scale * lens.centre.y};
    const std::string circle =
        "<circle cx=\"" + Pixels(centre.x) + "\" cy=\"" + Pixels(centre.y) + "\" r=\"" + Pixels(radius) + "\"";
    out_ += "<clipPath id=\"" + id_ + "lens\">" + circle + "/></clipPath>\n<g clip-path=\"url(#" + id_ + "lens)\">\n" +
            circle + Attribute("fill", lensPaper) + "/>\n";
    WriteLensContent(lens, frame);
    out_ += "</g>\n" + circle + " stroke=\"" + colour::ink + "\" stroke-width=\"1.75\"/>\n";
    WriteText(centre.x, centre.y + radius + 24.0, 13.0, std::string(R"( text-anchor="middle" fill=")") + quiet + '"',
              lens.caption);
    return centre.y + radius + 30.0;
}

void PictureWriter::WriteLensContent(const Lens& lens, const Frame& frame)
{
    const Bounds window = WindowOf(lens);
    std::string art;
    for (const Contour& contour : picture_.drawing_.contours)
        art += VisibleData(contour.curves, window, frame);
    out_ += "<path" + Attribute("stroke", artStroke) + Attribute("stroke-width", "5") + Attribute("d", art) + "/>\n";

    for (const Layer& layer : picture_.layers_) {
        std::string data;
        for (const Layer::Mark& mark : layer.marks_) {
            const std::vector<point2d>& p = mark.points;
            if (mark.kind == Layer::Kind::Curve)
                data += VisibleData(std::array{Cubic{{p[0], p[1], p[2], p[3]}}}, window, frame);
            else if (mark.kind == Layer::Kind::Circle)
                data += VisibleData(CircleAsCubics(p[0], p[1]), window, frame);
            else if (mark.kind == Layer::Kind::Dot)
                data += Overlap(window, {p[0].x, p[0].y, p[0].x, p[0].y}) ? DotData(p[0], frame) : "";
            else
                for (std::size_t i = 1; i < p.size(); ++i)
                    data += VisibleData(std::array{LineAsCubic(p[i - 1], p[i])}, window, frame);
        }
        if (!data.empty())
            out_ += "<path" + StrokeAttributes(layer.style_) + Attribute("d", data) + "/>\n";
    }
}

void PictureWriter::WriteText(double x, double y, double size, std::string_view attributes, const std::string& text)
{
    out_ += "<text x=\"" + Pixels(x) + "\" y=\"" + Pixels(y) + "\" font-size=\"" + Pixels(size) + '"';
    out_ += attributes;
    out_ += '>' + Escaped(text) + "</text>\n";
}

} // namespace curvelab
