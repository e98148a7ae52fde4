/// @file
/// The whole library.
#pragma once

#include "ZarnMath/Bezier.h"
#include "ZarnMath/BezierToLines.h"
#include "ZarnMath/ValueTypes.h"
