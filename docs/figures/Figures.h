/// @file
/// The figures of the manual. Each is drawn into the file that it is given.
///
/// The pages show parts of the functions as examples, between marks of the form `//! [name]`, so that what a page shows
/// is what has drawn its figure.
#pragma once

#include "docs/figures/Figure.h"

namespace ZarnMath::Figures {

using Draw = void(const std::string& path);

/// @name The plane
/// @{
Draw Plane;
Draw Neighbours;
Draw CurvatureSign;
Draw Sides;
Draw OffsetSides;
Draw AngleUnits;
/// @}
/// @name Matrices and boxes
/// @{
Draw MatrixColumns;
Draw MatrixOrder;
Draw MapModes;
Draw EllipseAxes;
Draw BoxesOfTheSame;
/// @}
/// @name One curve
/// @{
Draw Cutting;
Draw ThroughThreePoints;
Draw NearestPoint;
Draw NearestIsAnEnd;
Draw TangentsToPoint;
Draw EqualSpacing;
Draw CurvatureComb;
Draw Extents;
Draw Loop;
Draw Flattening;
/// @}
/// @name Two curves, and curves through points
/// @{
Draw Crossings;
Draw LineCrossings;
Draw StraightBand;
Draw OffsetCusps;
Draw FittedCurve;
Draw JointFit;
Draw FittedLine;
/// @}
/// @name The rest
/// @{
Draw Ramps;
Draw Spline;
Draw Field;
Draw Projection;
Draw Layers;
/// @}

} // namespace ZarnMath::Figures
