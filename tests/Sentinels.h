/// @file
/// Values that no function gives, to see what a call wrote and what it left alone.
#pragma once

#include "tests/Bits.h"

namespace ZarnMath {

template <typename T>
constexpr T sentinel = T{};

template <>
inline constexpr double sentinel<double> = -1.2345678901234567e+77;
template <>
inline constexpr point2d sentinel<point2d> = {-7.7e+77, 8.8e+88};
template <>
inline constexpr vector2d sentinel<vector2d> = {-7.7e+77, 8.8e+88};
template <>
inline constexpr POINT sentinel<POINT> = {-1234567891, 1234567891};
template <>
inline constexpr int sentinel<int> = -1234567891;

/// N elements of an output array between guards, all of them sentinels at first.
template <typename T, int N>
class Guarded
{
public:
    Guarded()
    {
        for (T& element : elements)
            element = sentinel<T>;
    }

    T* data()
    {
        return elements + guards;
    }

    const T& operator[](int i) const
    {
        return elements[guards + i];
    }

    /// Whether nothing from element `from` on, and nothing before the array, was written.
    [[nodiscard]] testing::AssertionResult IsUntouchedFrom(int from) const
    {
        for (int i = -guards; i < N + guards; ++i)
            if ((i < 0 || i >= from) && !HasSameBits((*this)[i], sentinel<T>))
                return testing::AssertionFailure() << "element " << i << " was written";
        return testing::AssertionSuccess();
    }

    /// Whether nothing outside the array was written.
    [[nodiscard]] testing::AssertionResult IsIntact() const
    {
        return IsUntouchedFrom(N);
    }

private:
    static constexpr int guards = 4;
    T elements[N + 2 * guards];
};

} // namespace ZarnMath
