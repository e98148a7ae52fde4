#include "benchmarks/Glyphs.h"

#include <ft2build.h>
#include FT_FREETYPE_H
#include FT_OUTLINE_H

#include <stdexcept>

namespace ZarnMath::Benchmarks {

namespace {

void Require(FT_Error error)
{
    if (error != 0)
        throw std::runtime_error("the font of the corpus cannot be read: " ZARNMATH_BENCH_FONT);
}

/// What FreeType's walk along an outline collects.
struct Collector
{
    std::vector<Cubic> curves;
    double scale;
    point2d pen{};

    point2d Place(const FT_Vector* v) const
    {
        return {scale * static_cast<double>(v->x), scale * static_cast<double>(v->y)};
    }
};

Collector& CollectorOf(void* user)
{
    return *static_cast<Collector*>(user);
}

int MoveTo(const FT_Vector* to, void* user)
{
    Collector& collector = CollectorOf(user);
    collector.pen = collector.Place(to);
    return 0;
}

int IgnoreQuadratic(const FT_Vector*, const FT_Vector* to, void* user)
{
    return MoveTo(to, user);
}

int CubicTo(const FT_Vector* first, const FT_Vector* second, const FT_Vector* to, void* user)
{
    Collector& collector = CollectorOf(user);
    const point2d end = collector.Place(to);
    collector.curves.push_back({collector.pen, collector.Place(first), collector.Place(second), end});
    collector.pen = end;
    return 0;
}

} // namespace

std::vector<Cubic> GlyphCurves(double em)
{
    FT_Library library;
    FT_Face face;
    Require(FT_Init_FreeType(&library));
    Require(FT_New_Face(library, ZARNMATH_BENCH_FONT, 0, &face));

    Collector collector{{}, em / face->units_per_EM, {}};
    const FT_Outline_Funcs walk = {MoveTo, MoveTo, IgnoreQuadratic, CubicTo, 0, 0};
    for (FT_ULong character = 0x21; character < 0x250; ++character) {
        const FT_UInt glyph = FT_Get_Char_Index(face, character);
        // Unscaled: the points as the designer set them.
        if (glyph != 0 && FT_Load_Glyph(face, glyph, FT_LOAD_NO_SCALE) == 0)
            Require(FT_Outline_Decompose(&face->glyph->outline, &walk, &collector));
    }
    FT_Done_Face(face);
    FT_Done_FreeType(library);
    return collector.curves;
}

} // namespace ZarnMath::Benchmarks
