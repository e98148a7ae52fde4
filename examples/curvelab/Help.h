/// @file
/// What the program says about itself, all of it made from the table of commands: the help, the manual page and the
/// completion of a shell.
#pragma once

#include "Command.h"

#include <string>
#include <vector>

namespace curvelab {

/// What an option that every command takes is about.
enum class Topic
{
    Drawing,
    Output
};

/// An option that every command takes.
struct CommonOptionSpec
{
    OptionSpec option; ///< `valueName` is empty for a flag
    Topic topic;
    std::string shortName = {}; ///< with its dash, or empty
    bool isFile = false;        ///< whether the value names a file
    bool isOptional = false;    ///< whether the value can be left out
};

/// In the order in which the help lists them.
[[nodiscard]] const std::vector<CommonOptionSpec>& CommonOptionSpecs();

/// The help of the program: the commands, and where to go on.
[[nodiscard]] std::string Help(const std::vector<Command>& commands);

/// The help of one command: its options, what it does, and examples.
[[nodiscard]] std::string Help(const Command& command);

/// One line with the program's name and version.
[[nodiscard]] std::string Version();

/// The manual page, in the man macros.
[[nodiscard]] std::string ManualPage(const std::vector<Command>& commands);

/// The completion for bash: commands, options of the command that stands there, drawings and other files.
[[nodiscard]] std::string BashCompletion(const std::vector<Command>& commands);

} // namespace curvelab
