/// @file
/// The commands of curvelab: each asks the library one question about a drawing.
///
/// A command is one entry of the table, made in a file of its own. To add one, write that file, declare its entry below
/// and list it in `Commands`.
#pragma once

#include "Drawing.h"
#include "Picture.h"
#include "Progress.h"
#include "Report.h"

#include <functional>
#include <map>
#include <string>
#include <vector>

namespace curvelab {

/// An option of a command that takes one value.
struct OptionSpec
{
    std::string name;      ///< with its dashes
    std::string valueName; ///< what the help shows for the value
    std::string help;
    std::string fallback; ///< the value when the option is not given; empty if it must be
};

/// A command line to try, on one of the drawings that come with the program.
struct Example
{
    std::string arguments; ///< behind the program's name
    std::string shows;
};

/// The values of a command's own options, by the name with its dashes. Each option of the command is present.
using Arguments = std::map<std::string, std::string>;

/// What a command works on.
struct Job
{
    const Drawing& drawing;
    bool integer; ///< whether the `POINT` overloads are asked, on control points rounded to whole units
    Progress& progress;
};

/// Answers: asks the library, and tells the report and the picture.
using Question = std::function<void(const Job& job, Report& report, Picture& picture)>;

/// An entry of the table.
struct Command
{
    std::string name;
    std::string summary; ///< one line
    std::string details; ///< what the help says below the options
    std::vector<OptionSpec> options;
    std::vector<Example> examples; ///< at least one
    /// Reads the option values, before the drawing is loaded, so that a wrong one is named at once.
    Question (*prepare)(const Arguments& arguments);
};

[[nodiscard]] Command AreaCommand();
[[nodiscard]] Command BoundsCommand();
[[nodiscard]] Command ClosestCommand();
[[nodiscard]] Command CurvatureCommand();
[[nodiscard]] Command CuspsCommand();
[[nodiscard]] Command FitCommand();
[[nodiscard]] Command FlattenCommand();
[[nodiscard]] Command IntersectCommand();
[[nodiscard]] Command LengthCommand();
[[nodiscard]] Command OffsetCommand();
[[nodiscard]] Command ReportCommand();
[[nodiscard]] Command SmoothCommand();
[[nodiscard]] Command SplitCommand();
[[nodiscard]] Command TangentsCommand();
[[nodiscard]] Command TransformCommand();

/// The table, in the order in which the help lists it.
[[nodiscard]] inline std::vector<Command> Commands()
{
    return {FlattenCommand(),   SplitCommand(),     ClosestCommand(),  CurvatureCommand(), LengthCommand(),
            BoundsCommand(),    IntersectCommand(), TangentsCommand(), AreaCommand(),      CuspsCommand(),
            TransformCommand(), OffsetCommand(),    FitCommand(),      SmoothCommand(),    ReportCommand()};
}

/// Calls f(curve, index) with each curve of a job's drawing in turn, and keeps the progress.
template <typename F>
void ForEachCurve(const Job& job, const std::string& task, F f)
{
    job.progress.Begin(task, CountCurves(job.drawing));
    std::size_t index = 0;
    for (const Contour& contour : job.drawing.contours)
        for (const Cubic& curve : contour.curves) {
            f(curve, index++);
            job.progress.Step();
        }
}

/// A curve as the library is asked about it where there is no `POINT` overload: with --integer, the one whose control
/// points are rounded.
[[nodiscard]] inline Cubic Asked(const Job& job, const Cubic& curve)
{
    return job.integer ? ToDouble(Rounded(curve)) : curve;
}

/// Calls f(contour, index) with each contour of a job's drawing in turn, its curves as `Asked`, and keeps the progress.
template <typename F>
void ForEachContour(const Job& job, const std::string& task, F f)
{
    job.progress.Begin(task, CountCurves(job.drawing));
    for (std::size_t index = 0; index < job.drawing.contours.size(); ++index) {
        Contour contour = job.drawing.contours[index];
        for (Cubic& curve : contour.curves)
            curve = Asked(job, curve);
        f(contour, index);
        for (std::size_t i = 0; i < contour.curves.size(); ++i)
            job.progress.Step();
    }
}

} // namespace curvelab
