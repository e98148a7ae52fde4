/// @file
/// The integer value types that the library shares with the application around it.
#pragma once

#include <cstdint>

namespace Framework::common_types {

/// A position in whole drawing units.
struct POINT
{
    std::int32_t x; ///< grows to the right
    std::int32_t y; ///< grows upward

    friend constexpr bool operator==(const POINT&, const POINT&) noexcept = default;
};

/// An extent in whole drawing units.
struct SIZE
{
    std::int32_t cx; ///< width
    std::int32_t cy; ///< height

    friend constexpr bool operator==(const SIZE&, const SIZE&) noexcept = default;
};

/// A rectangle in whole drawing units, in a plane whose y grows upward.
///
/// Normal form: `left <= right` and `top >= bottom`. The empty rectangle is inside out, so that the first point merged
/// into it sets all four fields.
struct RECT
{
    std::int32_t left;   ///< smallest x
    std::int32_t top;    ///< largest y
    std::int32_t right;  ///< largest x
    std::int32_t bottom; ///< smallest y

    friend constexpr bool operator==(const RECT&, const RECT&) noexcept = default;
};

} // namespace Framework::common_types
