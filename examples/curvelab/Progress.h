/// @file
/// A sign of life from runs that take long.
#pragma once

#include <cstddef>
#include <functional>
#include <iosfwd>
#include <string>

namespace curvelab {

/// Says how far a run has come, once it has taken longer than a second; a quick run says nothing.
///
/// On a terminal one line is rewritten ten times a second, elsewhere a new line comes every five seconds.
class Progress
{
public:
    /// @param out        where the line goes
    /// @param isTerminal whether `out` is one
    /// @param seconds    a clock; where it starts does not matter
    Progress(std::ostream& out, bool isTerminal, std::function<double()> seconds);

    /// Ends the rewritten line, so that what follows starts on its own.
    ~Progress();
    Progress(const Progress&) = delete;
    Progress& operator=(const Progress&) = delete;

    /// Begins a count.
    ///
    /// @param task  what is being done, as in "flattening"
    /// @param total how many steps there are
    void Begin(const std::string& task, std::size_t total);

    /// One step is done.
    void Step();

private:
    void Say();

    std::ostream& out_;
    const bool isTerminal_;
    const std::function<double()> seconds_;
    double due_;
    bool said_ = false;
    std::string task_;
    std::size_t done_ = 0;
    std::size_t total_ = 0;
};

} // namespace curvelab
