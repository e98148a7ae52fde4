/// @file
/// The one way in which curvelab refuses: a line that names what is wrong and where.
#pragma once

#include <stdexcept>
#include <string>

namespace curvelab {

/// Thrown with one line for the user; the program prints it behind "curvelab: " and ends with status 2.
class Failure : public std::runtime_error
{
public:
    using std::runtime_error::runtime_error;
};

/// A value in double quotes, for messages.
[[nodiscard]] inline std::string Quoted(const std::string& text)
{
    return '"' + text + '"';
}

} // namespace curvelab
