#include "Numbers.h"

#include "Failure.h"

#include <charconv>
#include <cmath>
#include <system_error>

namespace curvelab {

namespace {

/// A plus sign in front is allowed to people, but not to `std::from_chars`.
std::string WithoutPlus(const std::string& text)
{
    const bool signedTwice = text.size() > 1 && (text[1] == '+' || text[1] == '-');
    return !text.empty() && text[0] == '+' && !signedTwice ? text.substr(1) : text;
}

/// Reads the whole text as a number.
///
/// @throw Failure if it is none of that kind, or too large (or too small) for it
template <typename T>
T Parse(const std::string& option, const std::string& text, const std::string& kind)
{
    T value{};
    const std::string digits = WithoutPlus(text);
    const char* const end = digits.data() + digits.size();
    const auto [stop, error] = std::from_chars(digits.data(), end, value);
    if (error == std::errc::invalid_argument || stop != end)
        throw Failure(option + ": " + Quoted(text) + " is not a " + kind);
    if (error != std::errc())
        throw Failure(option + ": " + Quoted(text) + " is out of the range of numbers");
    return value;
}

std::string Range(const std::string& low, const std::string& high)
{
    return " is outside " + low + " to " + high;
}

} // namespace

double ReadNumber(const std::string& option, const std::string& text)
{
    const auto value = Parse<double>(option, text, "number");
    if (!std::isfinite(value))
        throw Failure(option + ": " + Quoted(text) + " is not a finite number");
    return value;
}

double ReadNumberWithin(const std::string& option, const std::string& text, double low, double high)
{
    const double value = ReadNumber(option, text);
    if (value < low || value > high)
        throw Failure(option + ": " + Quoted(text) + Range(FormatNumber(low), FormatNumber(high)));
    return value;
}

double ReadNonNegative(const std::string& option, const std::string& text)
{
    const double value = ReadNumber(option, text);
    if (value < 0.0)
        throw Failure(option + ": " + Quoted(text) + " is negative");
    return value;
}

std::int64_t ReadWhole(const std::string& option, const std::string& text, std::int64_t low, std::int64_t high)
{
    const auto value = Parse<std::int64_t>(option, text, "whole number");
    if (value < low || value > high)
        throw Failure(option + ": " + Quoted(text) + Range(std::to_string(low), std::to_string(high)));
    return value;
}

ZarnMath::point2d ReadPoint(const std::string& option, const std::string& text)
{
    const std::size_t comma = text.find(',');
    if (comma == std::string::npos)
        throw Failure(option + ": " + Quoted(text) + " is not a point X,Y");
    return {ReadNumber(option, text.substr(0, comma)), ReadNumber(option, text.substr(comma + 1))};
}

std::string FormatNumber(double value, int digits)
{
    char buffer[64];
    const auto [end, error] = std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::general, digits);
    return error == std::errc() ? std::string(buffer, end) : "?";
}

} // namespace curvelab
