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
#include "ZarnMath/Layout.h"
#include "ZarnMath/Line.h"
#include "ZarnMath/Numeric.h"
#include "ZarnMath/PlainC.h"
#include "ZarnMath/Quaternion.h"
#include "ZarnMath/Random.h"
#include "ZarnMath/TridiagonalMatrix.h"
#include "ZarnMath/ValueTypes.h"
#include "ZarnMath/VectorField.h"
#include "ZarnMath/WMath.h"
#include "ZarnMath/WMath3D.h"
