/// @file
/// The whole library.
///
/// The last line of each function's description names its class. What is *arithmetic* computes with + - * /, sqrt, fmod,
/// ceil, floor, fabs and integers alone, and gives the same bits on every machine. What is *platform* goes through other
/// mathematical functions of the C library, and has that library's last bits.
///
/// @namespace ZarnMath
/// Everything but the matrices and the plain-C families, which stand in the global namespace.
///
/// @namespace ZarnMath::CubicBezier
/// What can be asked of one cubic Bezier segment, or of two.
///
/// @namespace ZarnUtils
/// What is shared with the application's other libraries.
///
/// @namespace Framework::common_types
/// The integer types that are shared with the application.
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
