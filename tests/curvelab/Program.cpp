#include "Program.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <fstream>
#include <gtest/gtest.h>
#include <nlohmann/json.hpp>
#include <regex>
#include <sstream>
#include <sys/wait.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace {

/// In the child: standard input from nowhere, the outputs to files.
void Redirect(const fs::path& out, const fs::path& err)
{
    constexpr int flags = O_WRONLY | O_CREAT | O_TRUNC;
    ::dup2(::open("/dev/null", O_RDONLY), STDIN_FILENO);
    ::dup2(::open(out.c_str(), flags, 0600), STDOUT_FILENO);
    ::dup2(::open(err.c_str(), flags, 0600), STDERR_FILENO);
}

std::vector<char*> Pointers(std::vector<std::string>& words)
{
    std::vector<char*> pointers;
    for (std::string& word : words)
        pointers.push_back(word.data());
    pointers.push_back(nullptr);
    return pointers;
}

/// What was said, less how far a long run has come: a busy machine makes any run a long one.
std::string WithoutProgress(const std::string& said)
{
    static const std::regex progress("curvelab: [^\n]*, [0-9]+ of [0-9]+ curves\n");
    return std::regex_replace(said, progress, "");
}

/// All that comes from the other end of a terminal until that is closed; line ends as they were written.
std::string SentTo(int terminal)
{
    std::string sent;
    char buffer[4096];
    for (ssize_t count; (count = ::read(terminal, buffer, sizeof buffer)) > 0;)
        sent.append(buffer, static_cast<std::size_t>(count));
    ::close(terminal);
    sent.erase(std::remove(sent.begin(), sent.end(), '\r'), sent.end());
    return sent;
}

} // namespace

Outcome RunProgram(std::vector<std::string> words, const fs::path& folder)
{
    const TemporaryFolder outputs;
    const fs::path out = outputs.Path() / "out";
    const fs::path err = outputs.Path() / "err";
    const std::vector<char*> pointers = Pointers(words);

    const pid_t child = ::fork();
    if (child == 0) {
        Redirect(out, err);
        if (::chdir(folder.c_str()) == 0)
            ::execvp(pointers[0], pointers.data());
        ::_exit(127);
    }
    int status = 0;
    ::waitpid(child, &status, 0);
    return {WIFEXITED(status) ? WEXITSTATUS(status) : -1, ContentOf(out), WithoutProgress(ContentOf(err))};
}

Outcome RunCurvelab(const std::vector<std::string>& arguments, const fs::path& folder)
{
    std::vector<std::string> words{CURVELAB_PROGRAM};
    words.insert(words.end(), arguments.begin(), arguments.end());
    return RunProgram(std::move(words), folder);
}

Outcome RunOnTerminal(const std::vector<std::string>& arguments, const fs::path& folder,
                      std::vector<std::string> environment)
{
    std::vector<std::string> words{CURVELAB_PROGRAM};
    words.insert(words.end(), arguments.begin(), arguments.end());
    const std::vector<char*> pointers = Pointers(words), values = Pointers(environment);
    const int terminal = ::posix_openpt(O_RDWR | O_NOCTTY);
    if (terminal < 0 || ::grantpt(terminal) != 0 || ::unlockpt(terminal) != 0)
        std::abort();
    const int inside = ::open(::ptsname(terminal), O_RDWR | O_NOCTTY);

    const pid_t child = ::fork();
    if (child == 0) {
        ::dup2(inside, STDOUT_FILENO);
        ::dup2(inside, STDERR_FILENO);
        if (::chdir(folder.c_str()) == 0)
            ::execve(pointers[0], pointers.data(), values.data());
        ::_exit(127);
    }
    ::close(inside);
    const std::string sent = SentTo(terminal);
    int status = 0;
    ::waitpid(child, &status, 0);
    return {WIFEXITED(status) ? WEXITSTATUS(status) : -1, WithoutProgress(sent), ""};
}

struct Numbers::Tree
{
    nlohmann::json root;
};

Numbers::Numbers(const std::string& json)
    : tree_(std::make_unique<Tree>(Tree{nlohmann::json::parse(json, nullptr, false)}))
{
    EXPECT_FALSE(tree_->root.is_discarded()) << json;
}

Numbers::~Numbers() = default;
Numbers::Numbers(Numbers&&) noexcept = default;

template <typename T>
T Numbers::Value(const std::string& pointer) const
{
    try {
        return tree_->root.at(nlohmann::json::json_pointer(pointer)).get<T>();
    } catch (const nlohmann::json::exception& error) {
        ADD_FAILURE() << pointer << ": " << error.what();
        return T();
    }
}

bool Numbers::Has(const std::string& pointer) const
{
    return tree_->root.contains(nlohmann::json::json_pointer(pointer));
}

double Numbers::Number(const std::string& pointer) const
{
    return Value<double>(pointer);
}

bool Numbers::Truth(const std::string& pointer) const
{
    return Value<bool>(pointer);
}

std::string Numbers::Text(const std::string& pointer) const
{
    return Value<std::string>(pointer);
}

std::size_t Numbers::Size(const std::string& pointer) const
{
    return Value<nlohmann::json::array_t>(pointer).size();
}

TemporaryFolder::TemporaryFolder()
{
    std::string pattern = (fs::temp_directory_path() / "curvelab-test-XXXXXX").string();
    if (!::mkdtemp(pattern.data()))
        std::abort();
    path_ = pattern;
}

TemporaryFolder::~TemporaryFolder()
{
    std::error_code ignored;
    fs::remove_all(path_, ignored);
}

std::string TemporaryFolder::Write(const std::string& name, const std::string& content) const
{
    const fs::path path = path_ / name;
    std::ofstream(path, std::ios::binary) << content;
    return path.string();
}

std::string TemporaryFolder::WriteSvg(const std::string& content, const std::string& name) const
{
    return Write(name, R"(<svg xmlns="http://www.w3.org/2000/svg" xmlns:xlink="http://www.w3.org/1999/xlink" )"
                       R"(width="1000" height="1000">)" +
                           content + "</svg>");
}

std::vector<std::string> TemporaryFolder::Names() const
{
    std::vector<std::string> names;
    for (const fs::directory_entry& entry : fs::directory_iterator(path_))
        names.push_back(entry.path().filename().string());
    std::sort(names.begin(), names.end());
    return names;
}

std::string ContentOf(const fs::path& path)
{
    std::ifstream file(path, std::ios::binary);
    EXPECT_TRUE(file.good()) << path;
    std::ostringstream content;
    content << file.rdbuf();
    return content.str();
}

Numbers AskCurvelab(const std::string& content, std::vector<std::string> arguments)
{
    const TemporaryFolder folder;
    arguments.insert(arguments.begin() + 1, folder.WriteSvg(content));
    arguments.push_back("--json=-");
    const Outcome outcome = RunCurvelab(arguments, folder.Path());
    EXPECT_EQ(outcome.status, 0) << outcome.err;
    EXPECT_EQ(outcome.err, "");
    return Numbers(outcome.out);
}

std::string Number(double value)
{
    char text[40];
    std::snprintf(text, sizeof text, "%.17g", value);
    return text;
}

void ExpectPoint(const Numbers& json, const std::string& pointer, double x, double y, double tolerance)
{
    EXPECT_NEAR(json.Number(pointer + "/0"), x, tolerance);
    EXPECT_NEAR(json.Number(pointer + "/1"), y, tolerance);
}
