#include "tests/vectors/Vectors.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstring>
#include <iomanip>
#include <istream>
#include <limits>
#include <sstream>

namespace ZarnMath::Vectors {

namespace {

/// The whole of a token as a number; nothing if a character is left over.
template <typename T, typename... Base>
std::optional<T> ParseNumber(std::string_view digits, Base... base)
{
    T number{};
    const auto [end, error] = std::from_chars(digits.data(), digits.data() + digits.size(), number, base...);
    if (error != std::errc{} || end != digits.data() + digits.size())
        return std::nullopt;
    return number;
}

std::optional<std::uint64_t> ParseHexadecimal(std::string_view digits, std::size_t length)
{
    return digits.size() == length ? ParseNumber<std::uint64_t>(digits, 16) : std::nullopt;
}

std::optional<std::uint64_t> ParseInteger(std::string_view digits)
{
    if (const auto number = ParseNumber<std::int64_t>(digits))
        return static_cast<std::uint64_t>(*number);
    return ParseNumber<std::uint64_t>(digits);
}

std::vector<std::string_view> SplitAt(std::string_view text, char separator)
{
    std::vector<std::string_view> parts;
    for (std::size_t end = text.find(separator); end != std::string_view::npos; end = text.find(separator)) {
        parts.push_back(text.substr(0, end));
        text.remove_prefix(end + 1);
    }
    parts.push_back(text);
    return parts;
}

std::vector<Value> ParseValues(std::string_view text)
{
    std::vector<Value> values;
    if (text.empty())
        return values;
    for (const std::string_view token : SplitAt(text, ' '))
        values.push_back(ParseValue(token));
    return values;
}

Case ParseCase(std::string_view text, int line)
{
    const auto fields = SplitAt(text, '\t');
    if (fields.size() != 3 || fields[0].empty())
        throw Malformed("not a name, inputs and outputs");
    return {line, std::string(fields[0]), ParseValues(fields[1]), ParseValues(fields[2])};
}

double DoubleFromBits(std::uint64_t bits)
{
    double v;
    std::memcpy(&v, &bits, sizeof v);
    return v;
}

float FloatFromBits(std::uint64_t bits)
{
    const auto lower = static_cast<std::uint32_t>(bits);
    float v;
    std::memcpy(&v, &lower, sizeof v);
    return v;
}

bool IsFloating(const Value& v)
{
    return v.kind != Value::Kind::Integer;
}

/// The number that a value stands for, integers signed.
double NumberOf(const Value& v)
{
    switch (v.kind) {
    case Value::Kind::Double:
        return DoubleFromBits(v.bits);
    case Value::Kind::Float:
        return static_cast<double>(FloatFromBits(v.bits));
    case Value::Kind::Integer:
        return static_cast<double>(static_cast<std::int64_t>(v.bits));
    case Value::Kind::AnyNaN:
        break;
    }
    return std::numeric_limits<double>::quiet_NaN();
}

bool IsNaN(const Value& v)
{
    return IsFloating(v) && std::isnan(NumberOf(v));
}

double LargestMagnitude(const std::vector<Value>& values, double largest)
{
    for (const Value& v : values) {
        const double magnitude = std::fabs(NumberOf(v));
        if (std::isfinite(magnitude))
            largest = std::max(largest, magnitude);
    }
    return largest;
}

/// Whether two numbers of one kind are as near as another mathematical library may bring them.
bool AreWithinUnits(const Value& expected, const Value& actual, int units, double scale)
{
    const double a = NumberOf(expected);
    const double b = NumberOf(actual);
    if (!IsFloating(expected))
        return std::fabs(a) > 1.0 && std::fabs(a - b) <= 1.0;
    const bool isFloat = expected.kind == Value::Kind::Float;
    const double unit =
        isFloat ? static_cast<double>(std::numeric_limits<float>::epsilon()) : std::numeric_limits<double>::epsilon();
    return a == b || std::fabs(a - b) <= units * unit * scale;
}

bool AreSame(const Value& expected, const Value& actual, const Comparison& comparison, double scale)
{
    if (expected.kind == Value::Kind::AnyNaN)
        return IsNaN(actual);
    if (expected.kind != actual.kind)
        return false;
    if (expected.bits == actual.bits || (IsNaN(expected) && IsNaN(actual)))
        return true;
    if (!comparison.zeroSignCounts && IsFloating(expected) && NumberOf(expected) == 0.0 && NumberOf(actual) == 0.0)
        return true;
    return comparison.units > 0 && AreWithinUnits(expected, actual, comparison.units, scale);
}

} // namespace

Value ParseValue(std::string_view token)
{
    if (token == "nan")
        return {Value::Kind::AnyNaN, 0};
    const char type = token.empty() ? '\0' : token.front();
    const std::string_view digits = token.substr(token.empty() ? 0 : 1);
    if (type == 'd')
        if (const auto bits = ParseHexadecimal(digits, 16))
            return {Value::Kind::Double, *bits};
    if (type == 'f')
        if (const auto bits = ParseHexadecimal(digits, 8))
            return {Value::Kind::Float, *bits};
    if (type == 'i')
        if (const auto bits = ParseInteger(digits))
            return {Value::Kind::Integer, *bits};
    throw Malformed("no value: '" + std::string(token) + "'");
}

std::vector<Case> ReadCases(std::istream& file)
{
    std::vector<Case> cases;
    std::string text;
    for (int line = 1; std::getline(file, text); ++line) {
        try {
            cases.push_back(ParseCase(text, line));
        } catch (const Malformed& trouble) {
            throw Malformed("line " + std::to_string(line) + ": " + trouble.what());
        }
    }
    return cases;
}

std::string Describe(const Value& value)
{
    std::ostringstream text;
    switch (value.kind) {
    case Value::Kind::Double:
        text << 'd' << std::hex << std::setw(16) << std::setfill('0') << value.bits << " ("
             << std::setprecision(std::numeric_limits<double>::max_digits10) << NumberOf(value) << ')';
        break;
    case Value::Kind::Float:
        text << 'f' << std::hex << std::setw(8) << std::setfill('0') << value.bits << " ("
             << std::setprecision(std::numeric_limits<float>::max_digits10) << NumberOf(value) << ')';
        break;
    case Value::Kind::Integer:
        text << 'i' << static_cast<std::int64_t>(value.bits) << " (0x" << std::hex << value.bits << ')';
        break;
    case Value::Kind::AnyNaN:
        text << "nan";
        break;
    }
    return text.str();
}

Value ToValue(double v)
{
    Value value{Value::Kind::Double, 0};
    std::memcpy(&value.bits, &v, sizeof v);
    return value;
}

Value ToValue(float v)
{
    std::uint32_t bits;
    std::memcpy(&bits, &v, sizeof v);
    return {Value::Kind::Float, bits};
}

const Value& Input::Next()
{
    if (Remaining() == 0)
        throw Malformed("the adapter takes more than the " + std::to_string(values.size()) + " recorded inputs");
    return values[position++];
}

void Input::ExpectEnd() const
{
    if (Remaining() > 0)
        throw Malformed("the adapter leaves " + std::to_string(Remaining()) + " of " + std::to_string(values.size()) +
                        " recorded inputs");
}

void Read(Input& in, double& v)
{
    const Value& value = in.Next();
    if (value.kind != Value::Kind::Double && value.kind != Value::Kind::AnyNaN)
        throw Malformed("no double: " + Describe(value));
    v = value.kind == Value::Kind::AnyNaN ? std::numeric_limits<double>::quiet_NaN() : DoubleFromBits(value.bits);
}

void Read(Input& in, float& v)
{
    const Value& value = in.Next();
    if (value.kind != Value::Kind::Float && value.kind != Value::Kind::AnyNaN)
        throw Malformed("no float: " + Describe(value));
    v = value.kind == Value::Kind::AnyNaN ? std::numeric_limits<float>::quiet_NaN() : FloatFromBits(value.bits);
}

void Read(Input& in, bool& v)
{
    const Value& value = in.Next();
    if (value.kind != Value::Kind::Integer || value.bits > 1)
        throw Malformed("no truth value: " + Describe(value));
    v = value.bits == 1;
}

void Read(Input& in, POINT& v)
{
    in.Into(v.x, v.y);
}

void Read(Input& in, SIZE& v)
{
    in.Into(v.cx, v.cy);
}

void Read(Input& in, RECT& v)
{
    in.Into(v.left, v.top, v.right, v.bottom);
}

void Write(Output& out, const POINT& v)
{
    out.Add(v.x, v.y);
}

void Write(Output& out, const SIZE& v)
{
    out.Add(v.cx, v.cy);
}

void Write(Output& out, const RECT& v)
{
    out.Add(v.left, v.top, v.right, v.bottom);
}

std::optional<std::string> FindMismatch(const Case& recorded, const std::vector<Value>& actual,
                                        const Comparison& comparison)
{
    const std::vector<Value>& expected = recorded.outputs;
    const double scale = LargestMagnitude(expected, LargestMagnitude(recorded.inputs, 0.0));
    const std::size_t common = std::min(expected.size(), actual.size());
    for (std::size_t i = 0; i < common; ++i)
        if (!AreSame(expected[i], actual[i], comparison, scale))
            return "output " + std::to_string(i) + " of " + std::to_string(expected.size()) + ": expected " +
                   Describe(expected[i]) + ", got " + Describe(actual[i]);
    if (expected.size() != actual.size())
        return "expected " + std::to_string(expected.size()) + " outputs, got " + std::to_string(actual.size());
    return std::nullopt;
}

} // namespace ZarnMath::Vectors
