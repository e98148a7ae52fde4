/// @file
/// Equality as this library promises it: the same bits, any NaN being as good as any other.
#pragma once

#include "ZarnMath/ValueTypes.h"

#include <gtest/gtest.h>

#include <cstring>
#include <iomanip>
#include <limits>

namespace ZarnMath {

inline constexpr double nan = std::numeric_limits<double>::quiet_NaN();
inline constexpr double infinity = std::numeric_limits<double>::infinity();

template <typename T>
bool HasSameBits(T a, T b)
{
    return (a != a && b != b) || std::memcmp(&a, &b, sizeof a) == 0;
}

template <typename T, bool IsPosition>
bool HasSameBits(const vector2dT<T, IsPosition>& a, const vector2dT<T, IsPosition>& b)
{
    return HasSameBits(a.x, b.x) && HasSameBits(a.y, b.y);
}

inline bool HasSameBits(const POINT& a, const POINT& b)
{
    return a == b;
}

/// @name How failures show values
/// @{
template <typename T, bool IsPosition>
void PrintTo(const vector2dT<T, IsPosition>& v, std::ostream* out)
{
    *out << std::setprecision(17) << '(' << v.x << ", " << v.y << ')';
}

/// @}

/// To be read `EXPECT_TRUE(SameBits(actual, expected))`.
template <typename T>
testing::AssertionResult SameBits(const T& actual, const T& expected)
{
    if (HasSameBits(actual, expected))
        return testing::AssertionSuccess();
    return testing::AssertionFailure() << std::setprecision(17) << "got " << testing::PrintToString(actual)
                                       << ", expected " << testing::PrintToString(expected);
}

/// n elements of two arrays.
template <typename T>
testing::AssertionResult SameBits(const T* actual, const T* expected, int n)
{
    for (int i = 0; i < n; ++i)
        if (!HasSameBits(actual[i], expected[i]))
            return SameBits(actual[i], expected[i]) << " at " << i;
    return testing::AssertionSuccess();
}

/// The doubles next to x.
inline double Above(double x)
{
    return std::nextafter(x, infinity);
}

inline double Below(double x)
{
    return std::nextafter(x, -infinity);
}

} // namespace ZarnMath

namespace Framework::common_types {

inline void PrintTo(const POINT& p, std::ostream* out)
{
    *out << '(' << p.x << ", " << p.y << ')';
}

} // namespace Framework::common_types
