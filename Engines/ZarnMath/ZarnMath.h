/// @file
/// The whole library.
#pragma once

#include "ZarnMath/Bezier.h"
#include "ZarnMath/BezierOffset.h"
#include "ZarnMath/BezierToLines.h"
#include "ZarnMath/Bounds.h"
#include "ZarnMath/Circle.h"
#include "ZarnMath/FitBezier.h"
#include "ZarnMath/FitLine.h"
#include "ZarnMath/Line.h"
#include "ZarnMath/PlainC.h"
#include "ZarnMath/ValueTypes.h"
#include "ZarnMath/WMath.h"
