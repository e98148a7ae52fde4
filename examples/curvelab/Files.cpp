#include "Files.h"

#include "Failure.h"

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <memory>
#include <system_error>
#include <unistd.h>
#include <utility>

namespace curvelab {

namespace fs = std::filesystem;

namespace {

struct CloseFile
{
    void operator()(std::FILE* file) const
    {
        std::fclose(file);
    }
};

using File = std::unique_ptr<std::FILE, CloseFile>;

Failure SystemFailure(const std::string& path, const std::string& what)
{
    return Failure(path + ": " + what + ": " + std::strerror(errno));
}

/// Writes and closes, so that a full disk is noticed here.
bool WriteAll(const fs::path& path, const char* mode, const std::string& bytes)
{
    std::FILE* const file = std::fopen(path.c_str(), mode);
    if (!file)
        return false;
    const bool written = std::fwrite(bytes.data(), 1, bytes.size(), file) == bytes.size();
    const int error = errno;
    const bool closed = std::fclose(file) == 0;
    if (!written)
        errno = error;
    return written && closed;
}

} // namespace

std::string ReadFile(const std::string& path)
{
    if (fs::is_directory(path))
        throw Failure(path + ": cannot be read: it is a folder");
    const File file(std::fopen(path.c_str(), "rb"));
    if (!file)
        throw SystemFailure(path, "cannot be read");
    std::string bytes;
    char buffer[65536];
    while (const std::size_t count = std::fread(buffer, 1, sizeof buffer, file.get()))
        bytes.append(buffer, count);
    if (std::ferror(file.get()))
        throw SystemFailure(path, "cannot be read");
    return bytes;
}

StagedFile::StagedFile(const std::string& path, std::string bytes) : path_(path)
{
    std::error_code ignored;
    const fs::path resolved = fs::weakly_canonical(path, ignored);
    target_ = resolved.empty() ? fs::path(path) : resolved;
    const fs::file_status status = fs::status(target_, ignored);
    if (fs::is_directory(status))
        throw Failure(path + ": cannot be written: it is a folder");
    if (fs::exists(status) && !fs::is_regular_file(status)) {
        bytes_ = std::move(bytes);
        return;
    }

    fs::path temporary = target_;
    temporary += ".";
    temporary += std::to_string(::getpid());
    temporary += ".tmp";
    if (!WriteAll(temporary, "wbx", bytes)) {
        const Failure failure = SystemFailure(path, "cannot be written");
        if (errno != EEXIST)
            fs::remove(temporary, ignored);
        throw failure;
    }
    temporary_ = temporary;
}

StagedFile::~StagedFile()
{
    std::error_code ignored;
    if (!temporary_.empty())
        fs::remove(temporary_, ignored);
}

StagedFile::StagedFile(StagedFile&& other) noexcept
    : path_(std::move(other.path_)), target_(std::move(other.target_)),
      temporary_(std::exchange(other.temporary_, fs::path())), bytes_(std::move(other.bytes_))
{}

void StagedFile::Commit()
{
    if (temporary_.empty()) {
        if (!WriteAll(target_, "wb", bytes_))
            throw SystemFailure(path_, "cannot be written");
        return;
    }
    std::error_code error;
    fs::rename(temporary_, target_, error);
    if (error)
        throw Failure(path_ + ": cannot be written: " + error.message());
    temporary_.clear();
}

bool IsSameFile(const std::string& a, const std::string& b)
{
    std::error_code ignored;
    return fs::equivalent(a, b, ignored);
}

} // namespace curvelab
