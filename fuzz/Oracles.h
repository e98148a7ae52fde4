/// @file
/// What a call has to keep to, whatever it was given. A promise that is not kept ends the program, where the fuzzer
/// catches it.
#pragma once

#include "ZarnMath/ValueTypes.h"

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <vector>

namespace ZarnMath::Fuzzing {

/// Ends the program, with what was promised, unless it was kept.
inline void Require(bool kept, const char* promise)
{
    if (kept)
        return;
    std::fprintf(stderr, "not kept: %s\n", promise);
    std::abort();
}

/// Between 0 and 1, both included.
[[nodiscard]] inline bool IsInUnit(double t) noexcept
{
    return 0.0 <= t && t <= 1.0;
}

/// Between 0 and 1, neither included.
[[nodiscard]] inline bool IsInside(double t) noexcept
{
    return 0.0 < t && t < 1.0;
}

[[nodiscard]] inline bool IsFinite(double x) noexcept
{
    return std::isfinite(x);
}

template <typename T, bool IsPosition>
[[nodiscard]] bool IsFinite(const vector2dT<T, IsPosition>& p) noexcept
{
    return std::isfinite(p.x) && std::isfinite(p.y);
}

[[nodiscard]] inline bool IsFinite(const POINT&) noexcept
{
    return true;
}

/// Small enough that nothing overflows, large enough that nothing underflows but to zero: where results are promised to
/// be finite.
[[nodiscard]] inline bool IsOrdinary(double x) noexcept
{
    const double magnitude = std::fabs(x);
    return magnitude == 0.0 || (1e-6 <= magnitude && magnitude <= 1e6);
}

template <bool IsPosition>
[[nodiscard]] bool IsOrdinary(const vector2dT<double, IsPosition>& p) noexcept
{
    return IsOrdinary(p.x) && IsOrdinary(p.y);
}

template <typename T>
[[nodiscard]] bool AreOrdinary(const T* values, int count) noexcept
{
    for (int i = 0; i < count; ++i)
        if (!IsOrdinary(values[i]))
            return false;
    return true;
}

/// The same bits, any NaN being as good as any other.
[[nodiscard]] inline bool IsSame(double a, double b) noexcept
{
    return (a != a && b != b) || std::memcmp(&a, &b, sizeof a) == 0;
}

[[nodiscard]] inline bool IsSame(float a, float b) noexcept
{
    return (a != a && b != b) || std::memcmp(&a, &b, sizeof a) == 0;
}

template <typename T, bool IsPosition>
[[nodiscard]] bool IsSame(const vector2dT<T, IsPosition>& a, const vector2dT<T, IsPosition>& b) noexcept
{
    return IsSame(a.x, b.x) && IsSame(a.y, b.y);
}

[[nodiscard]] inline bool IsSame(int a, int b) noexcept
{
    return a == b;
}

[[nodiscard]] inline bool IsSame(const POINT& a, const POINT& b) noexcept
{
    return a == b;
}

template <typename T>
[[nodiscard]] bool AreSame(const T* a, const T* b, int count) noexcept
{
    for (int i = 0; i < count; ++i)
        if (!IsSame(a[i], b[i]))
            return false;
    return true;
}

template <typename T>
[[nodiscard]] bool AreSame(const std::vector<T>& a, const std::vector<T>& b) noexcept
{
    return a.size() == b.size() && AreSame(a.data(), b.data(), static_cast<int>(a.size()));
}

/// A value that no call gives.
template <typename T>
inline constexpr T guard = {-7.7e+77, 8.8e+88};

template <>
inline constexpr double guard<double> = -1.2345678901234567e+77;

template <>
inline constexpr int guard<int> = -1234567891;

template <>
inline constexpr POINT guard<POINT> = {-1234567891, 1234567891};

/// Room for N results, with guards before and behind; or for fewer, with more guards behind.
template <typename T, int N>
class Guarded
{
public:
    Guarded() noexcept
    {
        for (T& element : elements)
            element = guard<T>;
    }

    [[nodiscard]] T* data() noexcept
    {
        return elements + guards;
    }

    [[nodiscard]] const T& operator[](int i) const noexcept
    {
        return elements[guards + i];
    }

    /// Whether nothing was written before the array, and nothing from an element on.
    [[nodiscard]] bool IsUntouchedFrom(int from) const noexcept
    {
        for (int i = -guards; i < N + guards; ++i)
            if ((i < 0 || i >= from) && !IsSame((*this)[i], guard<T>))
                return false;
        return true;
    }

    [[nodiscard]] bool IsIntact() const noexcept
    {
        return IsUntouchedFrom(N);
    }

    [[nodiscard]] bool IsUntouched() const noexcept
    {
        return IsUntouchedFrom(0);
    }

private:
    static constexpr int guards = 4;
    T elements[N + 2 * guards];
};

/// A single result that a call may leave alone.
template <typename T>
struct Result
{
    T value = guard<T>;

    [[nodiscard]] bool IsUntouched() const noexcept
    {
        return IsSame(value, guard<T>);
    }
};

/// A vector with something in it already, to which results are appended.
template <typename T>
class Appended
{
public:
    Appended() : results(before, guard<T>) {}

    [[nodiscard]] std::vector<T>& Vector() noexcept
    {
        return results;
    }

    /// The number of results appended.
    [[nodiscard]] int Count() const noexcept
    {
        return static_cast<int>(results.size()) - before;
    }

    [[nodiscard]] const T& operator[](int i) const noexcept
    {
        return results[static_cast<std::size_t>(before + i)];
    }

    /// Whether what was there before is there still.
    [[nodiscard]] bool IsAppended() const noexcept
    {
        for (std::size_t i = 0; i < before; ++i)
            if (i >= results.size() || !IsSame(results[i], guard<T>))
                return false;
        return true;
    }

private:
    static constexpr int before = 3;
    std::vector<T> results;
};

} // namespace ZarnMath::Fuzzing
