/// @file
/// A transform as people write it: steps such as "rotate:30@100,200 scale:2,1", applied one after the other.
#pragma once

#include <ZarnMath/ZarnMath.h>

#include <optional>
#include <string>
#include <vector>

namespace curvelab {

/// One step.
struct TransformStep
{
    enum class Kind
    {
        Move,   ///< dx, dy
        Rotate, ///< degrees, counter-clockwise
        Scale,  ///< sx, sy
        Skew,   ///< degrees by which x leans and y leans
        Mirror, ///< degrees of the axis
        Matrix  ///< m11, m12, dx, m21, m22, dy
    };

    Kind kind;
    std::vector<double> values;
    std::optional<ZarnMath::point2d> centre; ///< what stays in place; without one, the centre of the drawing
};

/// Reads steps that are set apart by blanks.
///
/// @param option the option's name, for messages
/// @throw Failure naming the step that is wrong
[[nodiscard]] std::vector<TransformStep> ReadTransformSteps(const std::string& option, const std::string& text);

/// The steps as one matrix, by the members of `MATRIX` and the constructors.
[[nodiscard]] MATRIX Combine(const std::vector<TransformStep>& steps, const ZarnMath::point2d& centre);

/// The steps as one matrix, by the plain-C family: angles in millionths of a degree, centres and moves in whole units.
[[nodiscard]] MATRIX CombineInWholeUnits(const std::vector<TransformStep>& steps, const ZarnMath::point2d& centre);

} // namespace curvelab
