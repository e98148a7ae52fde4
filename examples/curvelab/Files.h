/// @file
/// Whole files in and out.
#pragma once

#include <filesystem>
#include <string>

namespace curvelab {

/// The bytes of a file.
///
/// @throw Failure if it cannot be read
[[nodiscard]] std::string ReadFile(const std::string& path);

/// A file that appears whole or not at all: the bytes go to a temporary file beside it, which takes its place on
/// `Commit`. An uncommitted one disappears with this object.
///
/// A target that exists and is no regular file (a device, a pipe) cannot be replaced so, and is written on `Commit`.
class StagedFile
{
public:
    /// @throw Failure if the bytes cannot be written there
    StagedFile(const std::string& path, std::string bytes);
    ~StagedFile();
    StagedFile(StagedFile&& other) noexcept;
    StagedFile& operator=(StagedFile&&) = delete;
    StagedFile(const StagedFile&) = delete;
    StagedFile& operator=(const StagedFile&) = delete;

    /// @throw Failure if the temporary file cannot take the place
    void Commit();

private:
    std::string path_;
    std::filesystem::path target_;
    std::filesystem::path temporary_; ///< empty when there is none
    std::string bytes_;               ///< kept only for a target that is written directly
};

/// Whether two paths lead to the same existing file.
[[nodiscard]] bool IsSameFile(const std::string& a, const std::string& b);

} // namespace curvelab
