/// @file
/// The XML tree under an SVG file, made plain before its geometry is read.
#pragma once

#include <libxml/tree.h>

#include <memory>
#include <string>

namespace curvelab {

struct FreeXmlDocument
{
    void operator()(xmlDoc* document) const
    {
        xmlFreeDoc(document);
    }
};

using XmlDocument = std::unique_ptr<xmlDoc, FreeXmlDocument>;

/// Parses a file and prepares its tree:
/// - elements without a namespace are taken as SVG;
/// - `use` is replaced by a group with a copy of what it refers to (`symbol` and `svg` by an `svg` of the size asked for);
///   a reference that contains itself is left out;
/// - links become groups, and a `switch` a group with its first child that can be drawn;
/// - numbers that touch, as in "translate(-1-1)" or "1.5.5", are set apart, and "1." is completed.
///
/// Network access, external entities and document types are off.
///
/// @throw Failure if the file cannot be read, is no well-formed XML (with the line), its root is not `svg`, or its
///        references multiply beyond reason
[[nodiscard]] XmlDocument LoadSvgTree(const std::string& path);

/// The value of a presentation property of an element: from its `style` attribute, or else from the attribute of that
/// name; empty if it has neither.
[[nodiscard]] std::string PropertyOf(const xmlNode* element, const std::string& name);

/// Sets numbers apart that touch: a space before a sign or a second point that ends a number, a zero after a point that
/// has no digit behind it. Other characters stay as they are.
[[nodiscard]] std::string SeparateNumbers(const std::string& text);

} // namespace curvelab
