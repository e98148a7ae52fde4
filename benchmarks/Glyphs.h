/// @file
/// Cubics as type designers draw them.
#pragma once

#include "tests/Random.h"

#include <vector>

namespace ZarnMath::Benchmarks {

/// All cubics in the outlines of the Latin letters and figures of a font, in the order of the character codes.
///
/// @param em the size of the font's em, in drawing units
[[nodiscard]] std::vector<Cubic> GlyphCurves(double em);

} // namespace ZarnMath::Benchmarks
