/// @file
/// The names of the types that cross the interface, as a reader writes them: the same from every compiler.
#pragma once

#include "ZarnMath/ZarnMath.h"

#include <string>
#include <type_traits>
#include <vector>

namespace ZarnMath::Catalogue {

/// @name Types that are not made of others
/// @{
template <typename T>
constexpr const char* plainName = nullptr;
template <>
inline constexpr const char* plainName<bool> = "bool";
template <>
inline constexpr const char* plainName<int> = "int";
template <>
inline constexpr const char* plainName<unsigned long> = "unsigned long";
template <>
inline constexpr const char* plainName<std::int64_t> = "int64_t";
template <>
inline constexpr const char* plainName<double> = "double";
template <>
inline constexpr const char* plainName<point2d> = "point2d";
template <>
inline constexpr const char* plainName<vector2d> = "vector2d";
template <>
inline constexpr const char* plainName<vector2dT<float, true>> = "vector2dT<float, true>";
template <>
inline constexpr const char* plainName<vector3dT<double>> = "vector3dT<double>";
template <>
inline constexpr const char* plainName<POINT> = "POINT";
template <>
inline constexpr const char* plainName<SIZE> = "SIZE";
template <>
inline constexpr const char* plainName<RECT> = "RECT";
template <>
inline constexpr const char* plainName<BoundsT<double>> = "BoundsT<double>";
template <>
inline constexpr const char* plainName<CubicBezier::bezier2dT<point2d>> = "bezier2dT<point2d>";
template <>
inline constexpr const char* plainName<MATRIX> = "MATRIX";
template <>
inline constexpr const char* plainName<AFF_TRANSFORM> = "AFF_TRANSFORM";
template <>
inline constexpr const char* plainName<MATRIX3D> = "MATRIX3D";
template <>
inline constexpr const char* plainName<POINT3D> = "POINT3D";
template <>
inline constexpr const char* plainName<Quaternion> = "Quaternion";
template <>
inline constexpr const char* plainName<VectorField> = "VectorField";
template <>
inline constexpr const char* plainName<Layout> = "Layout";
template <>
inline constexpr const char* plainName<Side> = "Side";
template <>
inline constexpr const char* plainName<LengthAccuracy> = "LengthAccuracy";
template <>
inline constexpr const char* plainName<MapMode> = "MapMode";
/// @}

template <typename T>
constexpr bool isVector = false;
template <typename T>
constexpr bool isVector<std::vector<T>> = true;

/// `const point2d*` and the like: qualifiers in front, what points behind.
template <typename T>
void AppendNameOfType(std::string& name)
{
    if constexpr (std::is_lvalue_reference_v<T>) {
        AppendNameOfType<std::remove_reference_t<T>>(name);
        name += '&';
    } else if constexpr (std::is_pointer_v<T>) {
        AppendNameOfType<std::remove_pointer_t<T>>(name);
        name += '*';
    } else if constexpr (std::is_const_v<T>) {
        name += "const ";
        AppendNameOfType<std::remove_const_t<T>>(name);
    } else if constexpr (isVector<T>) {
        name += "vector<";
        AppendNameOfType<typename T::value_type>(name);
        name += '>';
    } else {
        name += plainName<T>;
    }
}

/// The parameters of a function type in their parentheses, and `const` where it stands behind them.
template <typename Signature>
struct Parameters;

template <typename Result, typename... Types>
struct Parameters<Result(Types...)>
{
    static void AppendTo(std::string& name)
    {
        name += '(';
        [[maybe_unused]] const char* separator = "";
        ((name += separator, separator = ", ", AppendNameOfType<Types>(name)), ...);
        name += ')';
    }
};

template <typename Result, typename... Types>
struct Parameters<Result(Types...) const>
{
    static void AppendTo(std::string& name)
    {
        Parameters<Result(Types...)>::AppendTo(name);
        name += " const";
    }
};

} // namespace ZarnMath::Catalogue
