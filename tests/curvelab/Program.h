/// @file
/// The built program, run as its users run it, in a folder of its own.
#pragma once

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

/// What a run left behind.
struct Outcome
{
    int status; ///< the exit status, -1 if a signal ended it
    std::string out;
    std::string err;
};

/// Runs curvelab with these arguments, in the given folder.
[[nodiscard]] Outcome RunCurvelab(const std::vector<std::string>& arguments, const std::filesystem::path& folder);

/// Runs any program likewise; it is looked for where the shell would.
[[nodiscard]] Outcome RunProgram(std::vector<std::string> words, const std::filesystem::path& folder);

/// Runs curvelab with both its outputs on a terminal, in an environment with these values ("NAME=VALUE").
///
/// @return what the terminal was sent, as `out`
[[nodiscard]] Outcome RunOnTerminal(const std::vector<std::string>& arguments, const std::filesystem::path& folder,
                                    std::vector<std::string> environment);

/// The numbers of a run, found by JSON pointers such as "/answer/cuts/0/1". Looking for what is not there, or is of another
/// kind, fails the test.
class Numbers
{
public:
    explicit Numbers(const std::string& json);
    ~Numbers();
    Numbers(Numbers&&) noexcept;

    [[nodiscard]] bool Has(const std::string& pointer) const;
    [[nodiscard]] double Number(const std::string& pointer) const;
    [[nodiscard]] bool Truth(const std::string& pointer) const;
    [[nodiscard]] std::string Text(const std::string& pointer) const;
    /// The length of a list.
    [[nodiscard]] std::size_t Size(const std::string& pointer) const;

private:
    struct Tree;

    template <typename T>
    T Value(const std::string& pointer) const;

    std::unique_ptr<const Tree> tree_;
};

/// A folder that disappears with this object.
class TemporaryFolder
{
public:
    TemporaryFolder();
    ~TemporaryFolder();
    TemporaryFolder(const TemporaryFolder&) = delete;
    TemporaryFolder& operator=(const TemporaryFolder&) = delete;

    [[nodiscard]] const std::filesystem::path& Path() const
    {
        return path_;
    }

    /// Writes a file there.
    ///
    /// @return its path
    std::string Write(const std::string& name, const std::string& content) const;

    /// An SVG file with this content in its root, and a view box wide enough not to scale.
    ///
    /// @return its path
    std::string WriteSvg(const std::string& content, const std::string& name = "drawing.svg") const;

    /// The names of the files there, sorted.
    [[nodiscard]] std::vector<std::string> Names() const;

private:
    std::filesystem::path path_;
};

/// The content of a file; a failure of the test if there is none.
[[nodiscard]] std::string ContentOf(const std::filesystem::path& path);

/// Runs a command on a drawing and gives its JSON; the test fails if the program does not end well, or says anything else.
///
/// @param content   what stands in the root of the SVG file
/// @param arguments the command's name and its options
[[nodiscard]] Numbers AskCurvelab(const std::string& content, std::vector<std::string> arguments);

/// A number as an argument, to the last bit.
[[nodiscard]] std::string Number(double value);

/// Expects a pair of coordinates.
void ExpectPoint(const Numbers& json, const std::string& pointer, double x, double y, double tolerance);
