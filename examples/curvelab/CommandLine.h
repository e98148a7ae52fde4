/// @file
/// What stands on the command line.
#pragma once

#include "Command.h"

#include <optional>
#include <string>

namespace curvelab {

/// The options that all commands share.
struct CommonOptions
{
    std::string input; ///< an SVG file, or empty
    std::string text;
    std::string font;
    double units = 100000.0;
    bool integer = false;
    std::string picture; ///< where the picture goes; empty for none
    std::string json;    ///< where the numbers go; empty for none, "-" for standard output
};

/// A command with all that was asked of it.
struct Request
{
    Command command;
    Arguments arguments;
    CommonOptions common;
};

/// Reads the command line.
///
/// @return what to do; nothing if the help or the version has been asked for, and is in `help` now
/// @throw Failure if the command line makes no sense
[[nodiscard]] std::optional<Request> ReadCommandLine(int argc, const char* const* argv, std::string& help);

} // namespace curvelab
