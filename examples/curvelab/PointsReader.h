/// @file
/// Lists of points as drawings.
#pragma once

#include "Drawing.h"

#include <string>

namespace curvelab {

/// Whether a file is a list of points, by its name.
[[nodiscard]] bool IsListOfPoints(const std::string& path);

/// Reads polylines: two numbers to a line, apart by spaces or a comma, with y upward. An empty line ends a polyline, and
/// one that ends where it began is closed. What follows a # is a remark.
///
/// @throw Failure if the file cannot be read, or a line is no point (with the line)
[[nodiscard]] Drawing ReadPoints(const std::string& path);

} // namespace curvelab
