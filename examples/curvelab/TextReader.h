/// @file
/// Text, set in a font, as a drawing.
#pragma once

#include "Drawing.h"

#include <string>

namespace curvelab {

/// Sets one line of text by the advances and the kerning table of the font; one shape per glyph, in font units, not yet
/// fitted.
///
/// @param text     UTF-8
/// @param fontFile a font with outlines, in any format that FreeType opens; its first face is taken
/// @throw Failure if the font cannot be opened or has no outlines, if the text is no UTF-8, or if the font lacks a
///        character
[[nodiscard]] Drawing ReadText(const std::string& text, const std::string& fontFile);

} // namespace curvelab
