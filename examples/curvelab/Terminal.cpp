#include "Terminal.h"

#include <cstdlib>
#include <sstream>
#include <string_view>
#include <unistd.h>

namespace curvelab {

namespace {

std::string_view Environment(const char* name)
{
    const char* const value = std::getenv(name);
    return value ? value : "";
}

/// One word and a colon.
bool IsHeading(const std::string& line)
{
    return line.size() > 1 && line.back() == ':' && line.find(' ') == std::string::npos;
}

} // namespace

bool TakesColours(int descriptor)
{
    const std::string_view terminal = Environment("TERM");
    return ::isatty(descriptor) == 1 && Environment("NO_COLOR").empty() && !terminal.empty() && terminal != "dumb";
}

std::string Paint::Heading(const std::string& text) const
{
    return Wrap("1", text);
}

std::string Paint::Quiet(const std::string& text) const
{
    return Wrap("2", text);
}

std::string Paint::Alarm(const std::string& text) const
{
    return Wrap("1;31", text);
}

std::string Paint::Help(const std::string& text) const
{
    if (!isOn_)
        return text;
    std::istringstream lines(text);
    std::string out;
    for (std::string line; std::getline(lines, line);) {
        const bool isRemark = line.rfind("  # ", 0) == 0;
        const bool isExample = line.rfind("  curvelab ", 0) == 0;
        out += IsHeading(line) ? Heading(line) : isRemark ? Quiet(line) : isExample ? Wrap("36", line) : line;
        out += '\n';
    }
    return out;
}

std::string Paint::Wrap(const char* code, const std::string& text) const
{
    return isOn_ && !text.empty() ? std::string("\033[") + code + 'm' + text + "\033[0m" : text;
}

} // namespace curvelab
