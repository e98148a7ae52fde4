/// @file
/// Numbers as text: read strictly from the command line, written legibly for people.
#pragma once

#include <ZarnMath/ZarnMath.h>

#include <cstdint>
#include <string>

namespace curvelab {

/// Reads a finite number. The whole text must be the number; the decimal sign is a point in every locale.
///
/// @param option the option's name, for the message
/// @param text   what stands on the command line
/// @throw Failure if the text is no number, or is infinite or NaN
[[nodiscard]] double ReadNumber(const std::string& option, const std::string& text);

/// `ReadNumber` within [low, high].
[[nodiscard]] double ReadNumberWithin(const std::string& option, const std::string& text, double low, double high);

/// `ReadNumber` that refuses negative values.
[[nodiscard]] double ReadNonNegative(const std::string& option, const std::string& text);

/// Reads a whole number within [low, high].
[[nodiscard]] std::int64_t ReadWhole(const std::string& option, const std::string& text, std::int64_t low,
                                     std::int64_t high);

/// Reads "X,Y" as a point.
[[nodiscard]] ZarnMath::point2d ReadPoint(const std::string& option, const std::string& text);

/// A number to the stated count of significant digits, without trailing zeros.
[[nodiscard]] std::string FormatNumber(double value, int digits = 6);

} // namespace curvelab
