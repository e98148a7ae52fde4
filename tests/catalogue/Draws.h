/// @file
/// What an argument of a catalogued function is drawn as, and whether it is looked at after the call.
#pragma once

#include "tests/catalogue/Catalogue.h"

namespace ZarnMath::Catalogue {

/// @name Holders
/// @{

/// An argument that the call only reads.
template <typename T>
struct Given
{
    T value;

    const T& Argument() const
    {
        return value;
    }

    void Report(Sink&) const {}
};

/// An argument that the call may change, by reference.
template <typename T>
struct Changed
{
    T value;

    T& Argument()
    {
        return value;
    }

    void Report(Sink& out) const
    {
        out.Put(value);
    }
};

/// The same by pointer.
template <typename T>
struct ChangedByPointer
{
    T value;

    T* Argument()
    {
        return &value;
    }

    void Report(Sink& out) const
    {
        out.Put(value);
    }
};

/// A pointer to something that the call only reads.
template <typename T>
struct Pointed
{
    T value;

    const T* Argument() const
    {
        return &value;
    }

    void Report(Sink&) const {}
};

/// An array that the call only reads.
template <typename Array>
struct GivenArray
{
    Array values;

    auto* Argument() const
    {
        return values.data();
    }

    void Report(Sink&) const {}
};

/// An array that the call may change.
template <typename Array>
struct ChangedArray
{
    Array values;

    auto* Argument()
    {
        return values.data();
    }

    void Report(Sink& out) const
    {
        out.Put(values);
    }
};

/// @}
/// @name Draws of arguments that are read
/// @{

inline constexpr auto number = [](Draft& draft) { return Given<double>{draft.in.Number()}; };
inline constexpr auto coordinate = [](Draft& draft) { return Given<double>{draft.in.Coordinate()}; };
inline constexpr auto parameter = [](Draft& draft) { return Given<double>{draft.in.Parameter()}; };
inline constexpr auto tolerance = [](Draft& draft) { return Given<double>{draft.in.Tolerance()}; };
inline constexpr auto distance = [](Draft& draft) { return Given<double>{draft.in.Distance()}; };
inline constexpr auto radians = [](Draft& draft) { return Given<double>{draft.in.Angle(6.283185307179586)}; };
inline constexpr auto degrees = [](Draft& draft) { return Given<double>{draft.in.Angle(360.0)}; };
inline constexpr auto fineDegrees = [](Draft& draft) { return Given<int>{draft.in.IntegerAngle()}; };
inline constexpr auto integer = [](Draft& draft) { return Given<int>{draft.in.Integer()}; };
inline constexpr auto flag = [](Draft& draft) { return Given<bool>{draft.in.Flag()}; };
inline constexpr auto vector = [](Draft& draft) { return Given<vector2d>{draft.in.Vector()}; };
inline constexpr auto rect = [](Draft& draft) { return Given<RECT>{draft.in.Rect()}; };
inline constexpr auto bounds = [](Draft& draft) { return Given<BoundsT<double>>{draft.in.Bounds()}; };
inline constexpr auto matrix = [](Draft& draft) { return Given<MATRIX>{draft.in.Matrix()}; };
inline constexpr auto quaternion = [](Draft& draft) { return Given<Quaternion>{draft.in.Quaternion()}; };

/// @name A cubic in power form
/// The first coefficient draws it, the others follow.
/// @{
inline constexpr auto powerA = [](Draft& draft) {
    draft.cubic = draft.in.PowerForm();
    return Given<point2d>{draft.cubic.a};
};
inline constexpr auto powerB = [](Draft& draft) { return Given<point2d>{draft.cubic.b}; };
inline constexpr auto powerC = [](Draft& draft) { return Given<point2d>{draft.cubic.c}; };
inline constexpr auto powerD = [](Draft& draft) { return Given<point2d>{draft.cubic.d}; };
/// @}

template <typename P = point2d>
inline constexpr auto point = [](Draft& draft) { return Given<P>{DrawPoint<P>(draft.in)}; };

/// Four control points.
template <typename P = point2d>
inline constexpr auto cubic = [](Draft& draft) { return GivenArray<CurveOf<P>>{DrawCubic<P>(draft.in)}; };

/// The two ends of a line.
template <typename P = point2d>
inline constexpr auto line = [](Draft& draft) {
    return GivenArray<std::array<P, 2>>{{DrawPoint<P>(draft.in), DrawPoint<P>(draft.in)}};
};

/// A count within the contract, also for an enumeration that any such number can be cast to.
template <int Low, int High, typename T = int>
inline constexpr auto count = [](Draft& draft) { return Given<T>{static_cast<T>(draft.in.Count(Low, High))}; };

/// Points, from Low to High of them and none for a negative number. `countOfPoints` follows.
template <typename P, int Low = 0, int High = 12>
inline constexpr auto points = [](Draft& draft) {
    draft.count = draft.in.Count(Low, High);
    return GivenArray<std::vector<P>>{DrawPoints<P>(draft.in, draft.count)};
};

template <typename T = int>
inline constexpr auto countOfPoints = [](Draft& draft) { return Given<T>{static_cast<T>(draft.count)}; };

/// @}
/// @name Draws of arguments that are looked at afterwards
/// @{

template <typename T>
inline constexpr auto written = [](Draft&) { return Changed<T>{unwritten<T>}; };

template <typename T>
inline constexpr auto writtenByPointer = [](Draft&) { return ChangedByPointer<T>{unwritten<T>}; };

template <typename T, int N>
inline constexpr auto writtenArray = [](Draft&) {
    ChangedArray<std::array<T, N>> held;
    held.values.fill(unwritten<T>);
    return held;
};

/// A vector that is appended to, replaced or cleared: empty before, or with one element.
template <typename T>
inline constexpr auto appended = [](Draft& draft) {
    return Changed<std::vector<T>>{draft.in.Flag() ? std::vector<T>(1, unwritten<T>) : std::vector<T>()};
};

/// Points that are changed in place, and `countOfPoints` after them.
template <typename P>
inline constexpr auto changedPoints = [](Draft& draft) {
    draft.count = draft.in.Count(0, 12);
    return ChangedArray<std::vector<P>>{DrawPoints<P>(draft.in, draft.count)};
};

inline constexpr auto changedRect = [](Draft& draft) { return Changed<RECT>{draft.in.Rect()}; };
inline constexpr auto changedMatrix = [](Draft& draft) { return Changed<MATRIX>{draft.in.Matrix()}; };
inline constexpr auto changedMatrixByPointer = [](Draft& draft) { return ChangedByPointer<MATRIX>{draft.in.Matrix()}; };
inline constexpr auto changedQuaternion = [](Draft& draft) { return Changed<Quaternion>{draft.in.Quaternion()}; };

/// @}

} // namespace ZarnMath::Catalogue
