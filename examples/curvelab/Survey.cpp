// The command `report`: the questions that any drawing invites, and a page of the answers.

#include "Command.h"
#include "Measure.h"
#include "Numbers.h"
#include "Page.h"
#include "Timings.h"

#include <algorithm>

namespace curvelab {

namespace {

/// A fact of a chapter that the report itself tells as well.
struct Highlight
{
    const char* key; ///< in the chapter
    const char* label;
};

/// One of the commands, as the report asks it.
struct Plan
{
    Command command;
    Arguments arguments;
    const char* heading;
    const char* remark;
    std::vector<Highlight> highlights;
};

/// A spacing of a hundredth of the drawing, or wider where that would take too many points.
std::string SpacingFor(const Drawing& drawing)
{
    constexpr double mostPoints = 20000.0;
    double length = 0.0;
    for (const Contour& contour : drawing.contours)
        for (const Cubic& curve : contour.curves)
            length += LengthOf(Sampled(curve, 16));
    return FormatNumber(std::max(LargerSide(drawing.bounds) / 100.0, length / mostPoints), 4);
}

std::vector<Plan> Plans(const Drawing& drawing)
{
    return {
        {BoundsCommand(),
         {},
         "Extents",
         "The tight box of each curve, of each contour and of all, and the places where a coordinate is extreme.",
         {{"width", "width"}, {"height", "height"}}},
        {LengthCommand(),
         {{"--spacing", SpacingFor(drawing)}},
         "Lengths",
         "Each contour with marks at equal lengths.",
         {{"length", "total length"}}},
        {AreaCommand(),
         {},
         "Areas",
         "Which way each closed contour runs, and what it encloses; clockwise is positive.",
         {{"closedContours", "closed contours"}, {"area", "sum of signed areas"}}},
        {CurvatureCommand(),
         {{"--tooth", "2.5"}},
         "Curvature",
         "Teeth as long as the curves bend, inflections, and where the speed is extreme.",
         {{"straightCurves", "straight curves"},
          {"strongest", "strongest curvature"},
          {"radius", "its radius"},
          {"inflections", "inflections"}}},
        {IntersectCommand(),
         {},
         "Crossings",
         "Where curves cross each other and themselves, and where an end lies on another curve.",
         {{"crossings", "crossings"},
          {"selfCrossings", "of a curve with itself"},
          {"contacts", "ends on other curves"}}},
    };
}

std::string CommandLineOf(const Plan& plan, const Job& job)
{
    std::string line = "curvelab " + plan.command.name;
    for (const auto& [option, value] : plan.arguments)
        line += ' ' + option + ' ' + value;
    line += " --units " + FormatNumber(LargerSide(job.drawing.bounds), 10);
    return line + (job.integer ? " --integer" : "");
}

Chapter Ask(const Plan& plan, const Job& job)
{
    const double start = SecondsNow();
    Report report;
    Picture picture(job.drawing, plan.command.name);
    plan.command.prepare(plan.arguments)(job, report, picture);
    const double seconds = SecondsNow() - start;
    return {
        plan.command.name,        plan.heading, plan.remark, picture.RenderFigure(plan.command.name), std::move(report),
        CommandLineOf(plan, job), seconds};
}

void AddHighlights(const Plan& plan, const Report& chapter, Report& report)
{
    for (const Highlight& highlight : plan.highlights)
        for (const Fact& fact : chapter.Facts())
            if (fact.key == highlight.key)
                report.Add(fact.key, highlight.label, fact.value);
}

void Run(const Job& job, Report& report, Picture& picture)
{
    Page page(job.drawing.name);
    report.Add("shapes", "shapes", static_cast<std::int64_t>(job.drawing.shapes.size()));
    report.Add("contours", "contours", static_cast<std::int64_t>(job.drawing.contours.size()));
    report.Add("curves", "curves", static_cast<std::int64_t>(CountCurves(job.drawing)));
    for (const Plan& plan : Plans(job.drawing)) {
        Chapter chapter = Ask(plan, job);
        AddHighlights(plan, chapter.report, report);
        page.Add(std::move(chapter));
    }
    page.SetTimings(TimeQuestions(job));
    page.SetOverview(Picture(job.drawing, "").RenderFigure("overview"), report);
    picture.ReplaceByPage(page.Html());
}

Question Prepare(const Arguments&)
{
    return Run;
}

} // namespace

Command ReportCommand()
{
    return {"report",
            "Makes a page about the drawing: extents, lengths, areas, bends, crossings, timings",
            "The page is one HTML file that needs no other, for light and dark; --output says where it goes. It asks\n"
            "what bounds, length, area, curvature and intersect ask, with marks at every hundredth of the drawing,\n"
            "and shows their pictures and facts. Its last table is the time that the library took for each of eleven\n"
            "questions, asked once of every curve without a check of the answers; no other output holds a time.\n"
            "With --integer everything is asked about the rounded control points.",
            {},
            {{"report nautilus.svg -o nautilus.html", "A page about a drawing"},
             {"report --text \"Rag&\" --font DejaVuSans.ttf -o rag.html --json rag.json",
              "The same for letters, and its main numbers"}},
            Prepare};
}

} // namespace curvelab
