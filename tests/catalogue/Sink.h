/// @file
/// Where the results of a catalogued function go.
#pragma once

#include "ZarnMath/ZarnMath.h"

#include <array>
#include <type_traits>
#include <vector>

namespace ZarnMath::Catalogue {

/// What every output of a call holds before it, so that one that is left alone shows.
/// @{
inline constexpr double unwrittenNumber = -1.2345678901234567e+77;
inline constexpr std::int32_t unwrittenInteger = -1234567891;
template <typename T>
constexpr T unwritten = static_cast<T>(unwrittenInteger);
template <>
inline constexpr bool unwritten<bool> = true;
template <>
inline constexpr Side unwritten<Side> = Side{unwrittenInteger};
template <>
inline constexpr double unwritten<double> = unwrittenNumber;
template <>
inline constexpr point2d unwritten<point2d> = {unwrittenNumber, unwrittenNumber};
template <>
inline constexpr vector2d unwritten<vector2d> = {unwrittenNumber, unwrittenNumber};
template <>
inline constexpr POINT unwritten<POINT> = {unwrittenInteger, unwrittenInteger};
template <>
inline constexpr RECT unwritten<RECT> = {unwrittenInteger, unwrittenInteger, unwrittenInteger, unwrittenInteger};
template <>
inline constexpr BoundsT<double> unwritten<BoundsT<double>> = {unwrittenNumber, unwrittenNumber, unwrittenNumber,
                                                               unwrittenNumber};
template <>
inline constexpr MATRIX unwritten<MATRIX> = {unwrittenNumber, unwrittenNumber, unwrittenNumber,
                                             unwrittenNumber, unwrittenNumber, unwrittenNumber};
template <>
inline constexpr AFF_TRANSFORM unwritten<AFF_TRANSFORM> = {unwrittenNumber, unwrittenNumber, unwrittenNumber,
                                                           unwrittenNumber, unwritten<point2d>};
template <>
inline constexpr Quaternion unwritten<Quaternion> = {unwrittenNumber, unwrittenNumber, unwrittenNumber,
                                                     unwrittenNumber};
template <>
inline constexpr MATRIX3D unwritten<MATRIX3D> = {
    {{unwrittenInteger, unwrittenInteger, unwrittenInteger, unwrittenInteger},
     {unwrittenInteger, unwrittenInteger, unwrittenInteger, unwrittenInteger},
     {unwrittenInteger, unwrittenInteger, unwrittenInteger, unwrittenInteger}}};

/// @}

/// Takes the results of a call in this order: the returned value, and then every output and every array, vector or object
/// that the call may change, in the order of the arguments. `Put` takes values apart down to five kinds.
class Sink
{
public:
    Sink() = default;
    Sink(const Sink&) = delete;
    Sink& operator=(const Sink&) = delete;
    virtual ~Sink() = default;

    /// @name The kinds
    /// @{
    virtual void Number(double value) = 0;
    virtual void Single(float value) = 0;
    virtual void Integer(std::int64_t value) = 0;
    virtual void Flag(bool value) = 0;
    /// So many elements of a vector follow.
    virtual void Size(std::uint64_t size) = 0;
    /// The call ended with the exception of a vector that cannot be that long; the outputs follow all the same.
    virtual void LengthError() = 0;

    /// @}

    void Put(double value)
    {
        Number(value);
    }

    void Put(float value)
    {
        Single(value);
    }

    void Put(bool value)
    {
        Flag(value);
    }

    template <typename T>

    requires(std::is_integral_v<T> || std::is_enum_v<T>) void Put(T value)
    {
        Integer(static_cast<std::int64_t>(value));
    }

    template <typename T, bool IsPosition>
    void Put(const vector2dT<T, IsPosition>& value)
    {
        Put(value.x);
        Put(value.y);
    }

    template <typename T, std::size_t N>
    void Put(const std::array<T, N>& values)
    {
        for (const T& value : values)
            Put(value);
    }

    template <typename T>
    void Put(const std::vector<T>& values)
    {
        Size(values.size());
        for (const T& value : values)
            Put(value);
    }

    void Put(const vector3dT<double>& value);
    void Put(const POINT& value);
    void Put(const SIZE& value);
    void Put(const RECT& value);
    void Put(const BoundsT<double>& value);
    void Put(const MATRIX& value);
    void Put(const MATRIX3D& value);
    void Put(const POINT3D& value);
    void Put(const Quaternion& value);
    void Put(const AFF_TRANSFORM& value);
    void Put(const CubicBezier::bezier2dT<point2d>& value);
    /// Sizes and origin, and then the vectors of all cells, row by row.
    void Put(const VectorField& value);
};

} // namespace ZarnMath::Catalogue
