/// @file
/// The worker behind the axes of transformed circles. Internal.
#pragma once

#include "ZarnMath/WMath.h"

namespace ZarnMath {

/// The half axes of the unit circle's image, and the direction of the longer one (arithmetic but for the angle).
///
/// @param m            the transform; its translation is not used
/// @param[out] major   the length of the longer half axis
/// @param[out] minor   the length of the shorter half axis
/// @param[out] angle   its direction up to a half turn, -pi/4 to 3*pi/4; may be null
void GetTransformedCircleParams(const MATRIX& m, double& major, double& minor, double* angle) noexcept;

} // namespace ZarnMath
