/// @file
/// Text in XML and HTML.
#pragma once

#include <cstddef>
#include <string>

namespace curvelab {

/// Text that may stand in XML, whatever bytes a file name holds.
[[nodiscard]] std::string Escaped(const std::string& text);

/// A file's name without its folders; anything else as it is.
[[nodiscard]] std::string BaseName(const std::string& name);

/// A text of no more than so many bytes, with an ellipsis in its middle where it was longer. Its end stays: there a file's
/// name differs from others.
[[nodiscard]] std::string Shortened(const std::string& text, std::size_t most);

} // namespace curvelab
