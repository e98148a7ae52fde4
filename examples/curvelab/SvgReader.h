/// @file
/// SVG files as drawings.
#pragma once

#include "Drawing.h"

#include <string>

namespace curvelab {

/// Reads the outlines of an SVG file, in the file's user units with y turned upward, not yet fitted.
///
/// Read are paths with all commands, the basic shapes, groups, links, `switch` (its first child that can be drawn), nested `svg` with
/// their view boxes, and `use`, under all transforms. Whatever is not drawn itself stays out: definitions, clip paths,
/// masks, markers, patterns, text, images, elements with `display: none` or hidden. What the reader does not know (style
/// sheets, filters, foreign elements and attributes, values it cannot read) is passed over, and a path that breaks off is
/// read up to that place. Clips are not applied. Network access and external entities are off.
///
/// @throw Failure if the file cannot be read, is no well-formed XML (with the line), or its root is not `svg`
[[nodiscard]] Drawing ReadSvg(const std::string& path);

} // namespace curvelab
