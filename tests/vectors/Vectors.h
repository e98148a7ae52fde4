/// @file
/// Test vectors: recorded inputs of the library's functions with the outputs that they must give, a case a line.
///
/// An adapter takes the inputs of a case front to back from an `Input`, calls the function, and puts what came out into
/// an `Output`. New types join by overloads of `Read` and `Write` in this namespace.
#pragma once

#include "ZarnMath/ValueTypes.h"

#include <array>
#include <concepts>
#include <cstdint>
#include <iosfwd>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>
#include <type_traits>
#include <utility>
#include <vector>

namespace ZarnMath::Vectors {

/// One recorded value, by its type and bits.
struct Value
{
    enum class Kind
    {
        Double,
        Float,
        Integer,
        AnyNaN
    };

    Kind kind;
    std::uint64_t bits; ///< of a `Float` the lower half; of an `Integer` its two's complement; of `AnyNaN` nothing
};

/// One line of a file.
struct Case
{
    int line;
    std::string name;
    std::vector<Value> inputs;
    std::vector<Value> outputs;
};

/// A line that is no case, or an adapter that takes other values than were recorded.
class Malformed : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

/// An integer that a `long` of this machine does not hold. It was recorded where one has 64 bits.
class TooWide : public Malformed
{
public:
    using Malformed::Malformed;
};

/// One value of a line: `d` and 16 hexadecimal digits, `f` and 8, `i` and a decimal integer, or `nan`.
/// @throws Malformed
Value ParseValue(std::string_view token);

/// All cases of a file.
/// @throws Malformed, with the number of the line
std::vector<Case> ReadCases(std::istream& file);

/// The value as it is written in a file, and in decimal.
std::string Describe(const Value& value);

Value ToValue(double v);
Value ToValue(float v);

template <typename T>

requires std::is_integral_v<T> Value ToValue(T v)
{
    if constexpr (std::is_signed_v<T>)
        return {Value::Kind::Integer, static_cast<std::uint64_t>(static_cast<std::int64_t>(v))};
    else
        return {Value::Kind::Integer, static_cast<std::uint64_t>(v)};
}

/// Hands out the inputs of a case, front to back.
class Input
{
public:
    explicit Input(std::vector<Value> recorded) : values(std::move(recorded)) {}

    /// The next value or values, as a T.
    /// @throws Malformed if they are of another type or missing
    template <typename T>
    [[nodiscard]] T Get()
    {
        T value{};
        Read(*this, value);
        return value;
    }

    /// Reads into several variables, in order.
    template <typename... T>
    void Into(T&... variables)
    {
        (Read(*this, variables), ...);
    }

    /// A fixed number of elements.
    template <typename T, std::size_t N>
    [[nodiscard]] std::array<T, N> GetArray()
    {
        std::array<T, N> elements{};
        for (T& element : elements)
            Read(*this, element);
        return elements;
    }

    /// n elements that stand without their number.
    template <typename T>
    [[nodiscard]] std::vector<T> GetRun(std::size_t n)
    {
        std::vector<T> elements;
        for (std::size_t i = 0; i < n; ++i)
            elements.push_back(Get<T>());
        return elements;
    }

    /// A number of elements, and then the elements.
    template <typename T>
    [[nodiscard]] std::vector<T> GetVector()
    {
        return GetRun<T>(Get<std::uint32_t>());
    }

    /// The next value with its type unchecked.
    [[nodiscard]] const Value& Next();

    [[nodiscard]] std::size_t Remaining() const
    {
        return values.size() - position;
    }

    /// @throws Malformed if a value is left
    void ExpectEnd() const;

private:
    std::vector<Value> values;
    std::size_t position = 0;
};

void Read(Input& in, double& v);
void Read(Input& in, float& v);
void Read(Input& in, bool& v);

/// An integer or an enumeration; throws where the recorded integer is out of its range.
template <typename T>
requires std::is_integral_v<T> || std::is_enum_v<T>

void Read(Input& in, T& v)
{
    if constexpr (std::is_enum_v<T>) {
        v = static_cast<T>(in.Get<std::underlying_type_t<T>>());
    } else {
        const Value& value = in.Next();
        v = static_cast<T>(value.bits);
        const bool isInteger = value.kind == Value::Kind::Integer;
        if (isInteger && ToValue(v).bits == value.bits)
            return;
        if (isInteger && sizeof(T) < sizeof value.bits && std::is_same_v<std::make_signed_t<T>, long>)
            throw TooWide("no long of this machine: " + Describe(value));
        throw Malformed("no integer of this width: " + Describe(value));
    }
}

template <typename T, bool IsPosition>
void Read(Input& in, vector2dT<T, IsPosition>& v)
{
    in.Into(v.x, v.y);
}

template <typename T>
void Read(Input& in, vector3dT<T>& v)
{
    in.Into(v.x, v.y, v.z);
}

template <typename T>
void Read(Input& in, BoundsT<T>& v)
{
    in.Into(v.left, v.top, v.right, v.bottom);
}

void Read(Input& in, POINT& v);
void Read(Input& in, SIZE& v);
void Read(Input& in, RECT& v);

/// Collects what a function gave, in the order of the record.
class Output
{
public:
    /// Appends each argument, by its type.
    template <typename... T>
    void Add(const T&... results)
    {
        (Write(*this, results), ...);
    }

    /// Appends n elements without their number.
    template <typename T>
    void AddRun(const T* elements, std::size_t n)
    {
        for (std::size_t i = 0; i < n; ++i)
            Write(*this, elements[i]);
    }

    /// Appends all elements without their number.
    template <typename T, std::size_t N>
    void AddArray(const std::array<T, N>& elements)
    {
        AddRun(elements.data(), N);
    }

    /// Appends the number of elements, and then the elements.
    template <typename T>
    void AddVector(const std::vector<T>& elements)
    {
        Append(ToValue(elements.size()));
        AddRun(elements.data(), elements.size());
    }

    void Append(const Value& value)
    {
        values.push_back(value);
    }

    [[nodiscard]] const std::vector<Value>& Values() const
    {
        return values;
    }

private:
    std::vector<Value> values;
};

/// A number, a truth value or an enumeration.
template <typename T>
requires std::is_arithmetic_v<T> || std::is_enum_v<T>

void Write(Output& out, const T& v)
{
    if constexpr (std::is_enum_v<T>)
        out.Append(ToValue(static_cast<std::underlying_type_t<T>>(v)));
    else
        out.Append(ToValue(v));
}

template <typename T, bool IsPosition>
void Write(Output& out, const vector2dT<T, IsPosition>& v)
{
    out.Add(v.x, v.y);
}

template <typename T>
void Write(Output& out, const vector3dT<T>& v)
{
    out.Add(v.x, v.y, v.z);
}

template <typename T>
void Write(Output& out, const BoundsT<T>& v)
{
    out.Add(v.left, v.top, v.right, v.bottom);
}

void Write(Output& out, const POINT& v);
void Write(Output& out, const SIZE& v);
void Write(Output& out, const RECT& v);

/// When an output counts as the recorded one.
struct Comparison
{
    bool zeroSignCounts = true;
    /// 0 compares bits. Otherwise doubles and floats may differ by so many units in the last place of the largest number
    /// of the case, and integers beyond 0 and 1, which are rounded coordinates and angles, by one.
    int units = 0;
};

/// The first difference between what was recorded and what came out, in words; nothing if there is none.
///
/// Any NaN equals any other. Too few and too many values are a difference.
std::optional<std::string> FindMismatch(const Case& recorded, const std::vector<Value>& actual,
                                        const Comparison& comparison);

} // namespace ZarnMath::Vectors
