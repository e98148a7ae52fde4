// A page laid out by descriptions: each part says how large it is, where it aligns and what it keeps clear. The same
// ornament is then carried into every part by the transform of its layout.
#include "picture/Svg.h"

using namespace ZarnMath;

namespace {

constexpr BoundsT<double> page{0.0, 900.0, 1400.0, 0.0};

constexpr LayoutMeasure none{};

constexpr LayoutMeasure Units(double value)
{
    return {LayoutUnit::Absolute, value};
}

constexpr LayoutMeasure Share(double value)
{
    return {LayoutUnit::Relative, value};
}

constexpr int bottom = 0;
constexpr int top = 1;
constexpr int left = 0;
constexpr int right = 1;
constexpr int centre = 2;

struct Part
{
    const char* name;
    const char* colour;
    Layout layout;
};

/// In the order of the fields: sizes, minima, margins at left, right, top and bottom, vertical and horizontal alignment.
constexpr Part parts[] = {
    {"banner: stretched, 16 % high, at the top",
     "#1f4e79",
     {none, Share(0.16), none, none, Units(40), Units(40), Units(40), none, top, left}},
    {"column: a fifth wide, stretched",
     "#a33b20",
     {Share(0.2), none, none, none, Units(40), none, Units(220), Units(40), bottom, left}},
    {"centre: 420 by 300", "#4c7a34", {Units(420), Units(300), none, none, none, none, none, none, centre, centre}},
    {"note: stretched, but not below 300",
     "#8a5a9c",
     {none, Units(180), Units(300), none, Units(1060), Units(60), none, Units(40), bottom, right}},
    {"badge: 240 square",
     "#d08a3a",
     {Units(240), Units(240), none, none, none, Units(60), Units(220), none, top, right}},
};

/// A leaf in the unit square.
std::vector<CubicBezier::bezier2dT<point2d>> Leaf(const MATRIX& place)
{
    constexpr point2d leaf[] = {{0.1, 0.15}, {0.1, 0.6}, {0.4, 0.9}, {0.9, 0.9}, {0.9, 0.4}, {0.6, 0.15}, {0.1, 0.15}};
    const auto at = [&](int i) { return place(leaf[i]); };
    return {{at(0), at(1), at(2), at(3)}, {at(3), at(4), at(5), at(6)}};
}

} // namespace

void Draw(const std::string& path)
{
    Svg picture(path, page);
    picture.Rectangle(page, "fill='none' stroke='#9aa7b4' stroke-width='4'");
    for (const auto& [name, colour, layout] : parts) {
        const BoundsT<double> box = LayoutObject(page, layout);
        const std::string fill = std::string("fill='") + colour + "' ";
        picture.Rectangle(box, fill + "fill-opacity='.12' stroke='" + colour + "' stroke-width='2'");
        picture.Cubics(Leaf(GetLayoutTransformation(page, IdentityBounds(), layout)), fill + "fill-opacity='.5'");
        picture.Text({box.left + 8.0, box.bottom + 8.0}, name, "font-size='16' fill='#1d2530'");
        std::printf("%-42s left %6.1f  top %6.1f  right %6.1f  bottom %6.1f\n", name, box.left, box.top, box.right,
                    box.bottom);
    }
}
