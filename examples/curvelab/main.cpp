#include "CommandLine.h"
#include "Failure.h"
#include "Files.h"
#include "PointsReader.h"
#include "SvgReader.h"
#include "Terminal.h"
#include "TextReader.h"

#include <chrono>
#include <exception>
#include <iostream>
#include <unistd.h>

namespace curvelab {

namespace {

constexpr int refused = 2;

Drawing Load(const CommonOptions& common)
{
    Drawing drawing = common.input.empty()           ? ReadText(common.text, common.font)
                      : IsListOfPoints(common.input) ? ReadPoints(common.input)
                                                     : ReadSvg(common.input);
    Fit(drawing, common.units);
    return drawing;
}

Subject Describe(const Request& request, const Drawing& drawing)
{
    Subject subject{request.command.name, {}};
    subject.drawing.AddNumbers("name", drawing.name);
    subject.drawing.AddNumbers("units", request.common.units);
    subject.drawing.AddNumbers("integer", request.common.integer);
    subject.drawing.AddNumbers("width", drawing.bounds.right);
    subject.drawing.AddNumbers("height", drawing.bounds.top);
    subject.drawing.AddNumbers("shapes", static_cast<std::int64_t>(drawing.shapes.size()));
    subject.drawing.AddNumbers("contours", static_cast<std::int64_t>(drawing.contours.size()));
    subject.drawing.AddNumbers("curves", static_cast<std::int64_t>(CountCurves(drawing)));
    return subject;
}

void RequireOtherFile(const CommonOptions& common, const std::string& option, const std::string& target)
{
    for (const std::string& source : {common.input, common.font})
        if (!target.empty() && !source.empty() && IsSameFile(source, target))
            throw Failure(option + ": " + target + " is the file that is read");
}

/// Everything is worked out and written aside before anything takes its place.
void Write(const Request& request, const Subject& subject, const Report& report, const Picture& picture)
{
    const CommonOptions& common = request.common;
    const std::string json = Json(subject, report);
    std::vector<StagedFile> files;
    if (!common.picture.empty())
        files.emplace_back(common.picture, picture.Render(report));
    if (!common.json.empty() && common.json != "-")
        files.emplace_back(common.json, json);
    for (StagedFile& file : files)
        file.Commit();
    if (common.json == "-")
        std::cout << json;
    else if (common.json.empty())
        std::cout << Summary(report, Paint(TakesColours(STDOUT_FILENO)));
    if (!std::cout.flush())
        throw Failure("standard output cannot be written");
}

/// The line that tells the progress is ended before anything else is said.
void Ask(const Question& ask, bool integer, const Drawing& drawing, Report& report, Picture& picture)
{
    using Clock = std::chrono::steady_clock;
    Progress progress(std::cerr, ::isatty(STDERR_FILENO) == 1,
                      [] { return std::chrono::duration<double>(Clock::now().time_since_epoch()).count(); });
    ask({drawing, integer, progress}, report, picture);
}

void Run(const Request& request)
{
    const Question question = request.command.prepare(request.arguments);
    RequireOtherFile(request.common, "--output", request.common.picture);
    RequireOtherFile(request.common, "--json", request.common.json);

    const Drawing drawing = Load(request.common);
    Report report;
    Picture picture(drawing, request.command.name + (request.common.integer ? " in whole units" : ""));
    Ask(question, request.common.integer, drawing, report, picture);
    Write(request, Describe(request, drawing), report, picture);
}

/// The message on one line, whatever a file name or a library put into it.
std::string OneLine(const std::string& message)
{
    std::string line;
    for (const char c : message) {
        const bool isControl = static_cast<unsigned char>(c) < 0x20 || c == 0x7f;
        if (!isControl)
            line += c;
        else if (!line.empty() && line.back() != ' ')
            line += ' ';
    }
    line.erase(line.find_last_not_of(' ') + 1);
    return line;
}

int Main(int argc, const char* const* argv)
{
    try {
        std::string help;
        if (const std::optional<Request> request = ReadCommandLine(argc, argv, help))
            Run(*request);
        else
            std::cout << Paint(TakesColours(STDOUT_FILENO)).Help(help);
        return 0;
    } catch (const std::exception& error) {
        const Paint paint(TakesColours(STDERR_FILENO));
        std::cerr << paint.Alarm("curvelab:") << ' ' << OneLine(error.what()) << '\n';
        return refused;
    }
}

} // namespace

} // namespace curvelab

int main(int argc, char** argv)
{
    return curvelab::Main(argc, argv);
}
