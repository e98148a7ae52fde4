#include "TextReader.h"

#include "Failure.h"

#include <ft2build.h>
#include FT_FREETYPE_H
#include FT_OUTLINE_H
#include <libxml/xmlstring.h>

#include <cstdio>
#include <memory>
#include <type_traits>
#include <vector>

namespace curvelab {

namespace {

struct FreeLibrary
{
    void operator()(FT_Library library) const
    {
        FT_Done_FreeType(library);
    }
};

struct FreeFace
{
    void operator()(FT_Face face) const
    {
        FT_Done_Face(face);
    }
};

using Library = std::unique_ptr<std::remove_pointer_t<FT_Library>, FreeLibrary>;
using Face = std::unique_ptr<std::remove_pointer_t<FT_Face>, FreeFace>;

Library OpenLibrary()
{
    FT_Library library = nullptr;
    if (FT_Init_FreeType(&library) != 0)
        throw Failure("--font: the font library does not start");
    return Library(library);
}

Face OpenFace(FT_Library library, const std::string& file)
{
    if (std::FILE* const probe = std::fopen(file.c_str(), "rb"))
        std::fclose(probe);
    else
        throw Failure("--font: " + file + ": cannot be read");
    FT_Face face = nullptr;
    if (FT_New_Face(library, file.c_str(), 0, &face) != 0)
        throw Failure("--font: " + file + ": is not a font");
    Face owned(face);
    if (!FT_IS_SCALABLE(face))
        throw Failure("--font: " + file + ": the font has no outlines");
    return owned;
}

std::vector<FT_ULong> DecodeUtf8(const std::string& text)
{
    std::vector<FT_ULong> characters;
    for (std::size_t i = 0; i < text.size();) {
        int length = static_cast<int>(text.size() - i);
        const int character = xmlGetUTF8Char(reinterpret_cast<const unsigned char*>(text.data()) + i, &length);
        if (character < 0)
            throw Failure("--text: byte " + std::to_string(i + 1) + " is not UTF-8");
        characters.push_back(static_cast<FT_ULong>(character));
        i += static_cast<std::size_t>(length);
    }
    return characters;
}

FT_UInt GlyphOf(FT_Face face, FT_ULong character, const std::string& file)
{
    const FT_UInt glyph = FT_Get_Char_Index(face, character);
    if (glyph == 0) {
        char name[16];
        std::snprintf(name, sizeof name, "U+%04lX", character);
        throw Failure("--text: " + file + " has no character " + name);
    }
    return glyph;
}

/// Draws a glyph's outline with a pen, moved along the line of text.
struct GlyphPen
{
    Pen pen;
    double advance = 0.0;

    point2d operator()(const FT_Vector* v) const
    {
        return {advance + static_cast<double>(v->x), static_cast<double>(v->y)};
    }
};

GlyphPen& PenOf(void* user)
{
    return *static_cast<GlyphPen*>(user);
}

int MoveTo(const FT_Vector* to, void* user)
{
    // A font's contours are closed, whether they return to their start or not.
    GlyphPen& pen = PenOf(user);
    pen.pen.Close();
    pen.pen.MoveTo(pen(to));
    return 0;
}

int LineTo(const FT_Vector* to, void* user)
{
    GlyphPen& pen = PenOf(user);
    pen.pen.LineTo(pen(to));
    return 0;
}

int ConicTo(const FT_Vector* control, const FT_Vector* to, void* user)
{
    GlyphPen& pen = PenOf(user);
    pen.pen.QuadraticTo(pen(control), pen(to));
    return 0;
}

int CubicTo(const FT_Vector* control1, const FT_Vector* control2, const FT_Vector* to, void* user)
{
    GlyphPen& pen = PenOf(user);
    pen.pen.CubicTo(pen(control1), pen(control2), pen(to));
    return 0;
}

std::vector<Contour> OutlineOf(FT_Face face, double advance)
{
    const FT_Outline_Funcs calls{MoveTo, LineTo, ConicTo, CubicTo, 0, 0};
    GlyphPen pen{{}, advance};
    FT_Outline_Decompose(&face->glyph->outline, &calls, &pen);
    pen.pen.Close();
    return pen.pen.Finish();
}

double Kerning(FT_Face face, FT_UInt left, FT_UInt right)
{
    FT_Vector kerning{0, 0};
    if (left != 0 && FT_HAS_KERNING(face))
        FT_Get_Kerning(face, left, right, FT_KERNING_UNSCALED, &kerning);
    return static_cast<double>(kerning.x);
}

} // namespace

Drawing ReadText(const std::string& text, const std::string& fontFile)
{
    const Library library = OpenLibrary();
    const Face face = OpenFace(library.get(), fontFile);
    Drawing drawing;
    drawing.name = "--text " + Quoted(text);

    double advance = 0.0;
    FT_UInt previous = 0;
    for (const FT_ULong character : DecodeUtf8(text)) {
        const FT_UInt glyph = GlyphOf(face.get(), character, fontFile);
        // Unscaled and unhinted: the points as the designer set them, in whole font units.
        if (FT_Load_Glyph(face.get(), glyph, FT_LOAD_NO_SCALE) != 0)
            throw Failure("--font: " + fontFile + ": glyph " + std::to_string(glyph) + " is damaged");
        advance += Kerning(face.get(), previous, glyph);
        AddShape(drawing, {}, OutlineOf(face.get(), advance));
        advance += static_cast<double>(face->glyph->metrics.horiAdvance);
        previous = glyph;
    }
    return drawing;
}

} // namespace curvelab
