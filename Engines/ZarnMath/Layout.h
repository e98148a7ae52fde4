/// @file
/// An object placed inside a frame by a description: a size or a stretch between margins, a minimum, an alignment.
///
/// @code
///   frame  +---------------------------------+ top
///          |      topMargin                  |
///          |   +-----------+                 |
///          |<->|  object   |<--------------->|
///          |   +-----------+    rightMargin  |
///          | leftMargin                      |
///          +---------------------------------+ bottom
///         left                             right
/// @endcode
///
/// All functions are in the arithmetic class, the same bits on every machine.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"
#include "ZarnMath/WMath.h"

namespace ZarnMath {

/// What the number of a measure means.
enum class LayoutUnit : std::int32_t
{
    None = 0,     ///< not given
    Absolute = 1, ///< the length itself, in the units of the bounds
    Relative = 2, ///< a fraction of the frame's extent on that axis
};

/// One length. A measure of an unknown kind counts as given, with the value that one not given would have.
struct LayoutMeasure
{
    LayoutUnit kind; ///< what the value means
    double value;    ///< the number; not read where the kind is `LayoutUnit::None`

    friend constexpr bool operator==(const LayoutMeasure&, const LayoutMeasure&) noexcept = default;
};

/// The description. Where the size is not given, the object stretches between its margins, but not below its minimum;
/// where it is given, the minimum has no effect. An alignment of another value leaves its edges where the rest put them.
struct Layout
{
    LayoutMeasure width;          ///< of the object; with none it stretches
    LayoutMeasure height;         ///< of the object; with none it stretches
    LayoutMeasure minWidth;       ///< below which it does not stretch
    LayoutMeasure minHeight;      ///< below which it does not stretch
    LayoutMeasure leftMargin;     ///< from the left edge of the frame
    LayoutMeasure rightMargin;    ///< from the right edge of the frame
    LayoutMeasure topMargin;      ///< from the top of the frame
    LayoutMeasure bottomMargin;   ///< from the bottom of the frame
    std::int32_t verticalAlign;   ///< 0 bottom, 1 top, 2 centre; the vertical one comes first
    std::int32_t horizontalAlign; ///< 0 left, 1 right, 2 centre

    friend constexpr bool operator==(const Layout&, const Layout&) noexcept = default;
};

/// The rectangle that the object takes in a frame.
///
/// Positive lengths point into the frame whichever way its edges are ordered; on an axis without extent every length is
/// 0. Centred, a given size lies about the middle of the frame, without its margins. A stretch that its minimum widens,
/// centred, is placed as if the left edge of the frame, or its top, stood at 0. A minimum height of 0 that is given
/// flattens the object in a normal frame: heights run downward there, and are all below it.
///
/// @param frame  the frame, of any kind
/// @param layout the description
/// @return the rectangle; the frame itself if nothing is given
/// @arithmetic
[[nodiscard]] ZARNMATH_API BoundsT<double> LayoutObject(BoundsT<double> frame, const Layout& layout) noexcept;

/// The transform that takes an object onto the rectangle that `LayoutObject` gives it: a scale, and then a move.
///
/// @param frame  the frame
/// @param object the object's own bounds; where they have no width or height, the scale is infinite or NaN
/// @param layout the description
/// @return the matrix; left and bottom of the object land on left and bottom of the rectangle
/// @arithmetic
[[nodiscard]] ZARNMATH_API MATRIX GetLayoutTransformation(const BoundsT<double>& frame, const BoundsT<double>& object,
                                                          const Layout& layout) noexcept;

} // namespace ZarnMath
