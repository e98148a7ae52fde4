// A sparse field of displacements bends a grid of lines. A swirl and a lens are painted once, into small fields of their
// own, and stamped into the large one.
#include "picture/Svg.h"

#include <cmath>

using namespace ZarnMath;

namespace {

constexpr BoundsT<double> view{0.0, 120.0, 192.0, 0.0};

/// A round field about the origin: what `displace` says of a cell, fading to nothing at the radius.
template <typename Displace>
VectorField Stamp(int radius, Displace displace)
{
    VectorField stamp;
    stamp.Initialize({-radius, radius, radius, -radius});
    for (int y = -radius; y <= radius; ++y)
        for (int x = -radius; x <= radius; ++x)
            if (const double fade = 1.0 - static_cast<double>(x * x + y * y) / (radius * radius); fade > 0.0) {
                const vector2d v = displace(vector2d{double(x), double(y)}, fade * fade);
                stamp.SetVector(x, y, {static_cast<float>(v.x), static_cast<float>(v.y)});
            }
    return stamp;
}

vector2d Swirl(const vector2d& place, double strength)
{
    const MATRIX turn = ConstructRotationMatrix(2.4 * strength);
    return turn(place) - place;
}

vector2d Lens(const vector2d& place, double strength)
{
    return 0.75 * strength * place;
}

point2d Warp(const VectorField& field, const point2d& p)
{
    const auto v = field.Get({static_cast<float>(p.x), static_cast<float>(p.y)});
    return p + vector2d{v.x, v.y};
}

/// A straight line, bent by the field, in steps of a quarter of a cell.
std::vector<point2d> Bend(const VectorField& field, const point2d& from, const point2d& to)
{
    const int steps = static_cast<int>(4.0 * std::sqrt(LengthSquared(to - from)));
    std::vector<point2d> line;
    for (int i = 0; i <= steps; ++i)
        line.push_back(Warp(field, from + (to - from) * (double(i) / steps)));
    return line;
}

} // namespace

void Draw(const std::string& path)
{
    VectorField field;
    field.Initialize({0, 120, 192, 0});
    field.Blit(Stamp(44, Swirl), 54, 62);
    field.Blit(Stamp(34, Lens), 140, 72);
    field.Blit(Stamp(17, Swirl), 119, 20);

    Svg picture(path, view);
    for (int i = 0; i <= 48; ++i) // every fourth unit, every fourth line darker
        picture.Polyline(Bend(field, {i * 4.0, 0.0}, {i * 4.0, view.top}),
                         i % 4 == 0 ? "stroke='#1f4e79' stroke-width='.5'" : "stroke='#7aa6c9' stroke-width='.25'");
    for (int i = 0; i <= 30; ++i)
        picture.Polyline(Bend(field, {0.0, i * 4.0}, {view.right, i * 4.0}),
                         i % 4 == 0 ? "stroke='#a33b20' stroke-width='.5'" : "stroke='#dd9a80' stroke-width='.25'");

    std::size_t stored = 0;
    for (const auto& row : field.rows)
        stored += row.data.size();
    std::printf("field of %d by %d cells, %zu of them stored\n", field.width, field.height, stored);
    const point2d moved = Warp(field, {54.5, 90.25});
    std::printf("(54.5, 90.25) goes to (%.6f, %.6f)\n", moved.x, moved.y);
}
