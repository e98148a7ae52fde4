// What a matrix is made of: it scales, then skews, then turns, then moves. A letter shows each step.
#include "picture/Svg.h"

#include <algorithm>
#include <cmath>

using namespace ZarnMath;

namespace {

constexpr MATRIX matrix{1.1, 0.05, 30.0, 0.4, 0.95, 25.0};

void DrawLetter(Svg& picture, const MATRIX& m, const std::string& look)
{
    std::vector<point2d> letter{{0, 0},   {16, 0},  {16, 32}, {44, 32}, {44, 46},
                                {16, 46}, {16, 66}, {52, 66}, {52, 80}, {0, 80}};
    m.TransformPoints(letter.data(), static_cast<unsigned long>(letter.size()));
    picture.Polygon(letter, look);
}

} // namespace

void Draw(const std::string& path)
{
    AFF_TRANSFORM whole{};
    if (!DecomposeAffineTransform(whole, matrix))
        throw std::runtime_error("the matrix cannot be taken apart");
    std::printf("scale (%.9f, %.9f), skew %.9f, rotation %.9f, translation (%g, %g)\n", whole.scaleX, whole.scaleY,
                whole.skew, whole.rotation, whole.translation.x, whole.translation.y);

    Svg picture(path, {-40.0, 190.0, 860.0, -40.0});
    AFF_TRANSFORM part{1.0, 1.0, 0.0, 0.0, {0.0, 0.0}};
    int column = 0;
    const auto drawStep = [&](const char* name) {
        MATRIX m{};
        ComposeAffineTransform(m, part);
        const point2d corner{40.0 + 165.0 * column++, 20.0};
        picture.Polyline({corner + vector2d{0, 140}, corner, corner + vector2d{110, 0}},
                         "stroke='#9aa7b4' stroke-width='1'");
        const MATRIX place = ConstructTranslationMatrix(corner - point2d{0.0, 0.0});
        DrawLetter(picture, place, "fill='#9aa7b4' fill-opacity='.25'");
        DrawLetter(picture, place * m, "fill='#1f4e79' fill-opacity='.75'");
        picture.Text(corner - vector2d{0, 30}, name, "font-size='15' fill='#1d2530'");
        return m;
    };
    drawStep("as it was");
    part.scaleX = whole.scaleX;
    part.scaleY = whole.scaleY;
    drawStep("scaled");
    part.skew = whole.skew;
    drawStep("skewed");
    part.rotation = whole.rotation;
    drawStep("turned");
    part.translation = whole.translation;
    const MATRIX again = drawStep("moved");
    std::printf("put together again: %.9f %.9f %.9f, %.9f %.9f %.9f\n", again.m11, again.m12, again.dx, again.m21,
                again.m22, again.dy);
}
