#include "Page.h"

#include "Markup.h"
#include "Numbers.h"
#include "PictureWriter.h"

#include <utility>

namespace curvelab {

namespace {

constexpr const char* style = R"(:root { color-scheme: light dark; --paper: #eef0f3; --card: #fff; --ink: #1d2530;
--quiet: #5b6673; --line: #dfe3e8; }
@media (prefers-color-scheme: dark) { :root { --paper: #0d1013; --card: #14181d; --ink: #e8edf3; --quiet: #98a3b0;
--line: #323941; } }
body { max-width: 76rem; margin: 0 auto; padding: 2rem 1.25rem 4rem; background: var(--paper); color: var(--ink);
font: 16px/1.5 "Helvetica Neue", Helvetica, Arial, "DejaVu Sans", sans-serif; }
h1 { margin: 0 0 .3rem; font-size: 1.9rem; overflow-wrap: anywhere; }
h2 { margin: 0; font-size: 1.25rem; }
p { margin: .2rem 0 1rem; color: var(--quiet); }
a { color: inherit; }
nav { display: flex; flex-wrap: wrap; gap: .3rem 1.2rem; margin: 0 0 1.5rem; }
section { margin: 0 0 1.5rem; padding: 1.25rem 1.5rem; background: var(--card); border: 1px solid var(--line);
border-radius: 8px; }
.answer { display: grid; grid-template-columns: minmax(0, 3fr) minmax(15rem, 1fr); gap: 1.5rem; align-items: start; }
@media (max-width: 52rem) { .answer { grid-template-columns: minmax(0, 1fr); } }
figure { margin: 0; }
figure svg { display: block; width: 100%; max-height: 85vh; }
table { border-collapse: collapse; width: 100%; }
th, td { padding: .25rem 0; border-bottom: 1px solid var(--line); text-align: left; vertical-align: baseline; }
th { padding-right: 1rem; font-weight: 400; color: var(--quiet); }
td { font-variant-numeric: tabular-nums; }
td:not(:first-child), th.number { text-align: right; padding-left: 1rem; }
code { font-size: .85rem; overflow-wrap: anywhere; }
)";

std::string FactTable(const Report& report)
{
    std::string rows;
    for (const Fact& fact : report.Facts())
        if (!fact.label.empty())
            rows += "<tr><th scope=\"row\">" + Escaped(fact.label) + "</th><td>" + Escaped(Readable(fact.value)) +
                    "</td></tr>\n";
    return "<table>\n" + rows + "</table>\n";
}

std::string Answer(const std::string& figure, const Report& report)
{
    return "<div class=\"answer\">\n<figure>\n" + figure + "</figure>\n<div>\n" + FactTable(report) +
           "</div>\n</div>\n";
}

std::string Section(const std::string& id, const std::string& heading, const std::string& remark,
                    const std::string& content)
{
    return "<section id=\"" + id + "\">\n<h2>" + Escaped(heading) + "</h2>\n<p>" + Escaped(remark) + "</p>\n" +
           content + "</section>\n";
}

std::string SectionOf(const Chapter& chapter)
{
    const std::string below = "<p><code>" + Escaped(chapter.command) + "</code><br>Asked and checked in " +
                              FormatNumber(1e3 * chapter.seconds, 3) + " ms.</p>\n";
    return Section(chapter.id, chapter.heading, chapter.remark, Answer(chapter.figure, chapter.report) + below);
}

} // namespace

void Page::SetOverview(std::string figure, Report report)
{
    figure_ = std::move(figure);
    report_ = std::move(report);
}

void Page::Add(Chapter chapter)
{
    chapters_.push_back(std::move(chapter));
}

void Page::SetTimings(std::vector<Timing> timings)
{
    timings_ = std::move(timings);
}

std::string Page::Overview() const
{
    return Section("overview", "What is in it",
                   "The artwork, and what the chapters below find. Lengths are in drawing units, with y upward.",
                   Answer(figure_, report_));
}

std::string Page::Contents() const
{
    std::string links = "<a href=\"#overview\">What is in it</a>\n";
    for (const Chapter& chapter : chapters_)
        links += "<a href=\"#" + chapter.id + "\">" + Escaped(chapter.heading) + "</a>\n";
    return "<nav>\n" + links + "<a href=\"#timings\">Timings</a>\n</nav>\n";
}

std::string Page::TimingTable() const
{
    std::string rows = "<tr><th>question</th><th>function</th><th class=\"number\">calls</th><th class=\"number\">all, "
                       "ms</th><th class=\"number\">each, µs</th></tr>\n";
    for (const Timing& timing : timings_) {
        const double each = 1e6 * timing.seconds / static_cast<double>(timing.calls);
        rows += "<tr><td>" + Escaped(timing.question) + "</td><td><code>" + Escaped(timing.function) +
                "</code></td><td>" + std::to_string(timing.calls) + "</td><td>" +
                FormatNumber(1e3 * timing.seconds, 3) + "</td><td>" + FormatNumber(each, 3) + "</td></tr>\n";
    }
    return Section("timings", "Timings",
                   "Each question, asked of the library once for every curve, with no check of the answers. One run, "
                   "on whatever else the machine was doing.",
                   "<table>\n" + rows + "</table>\n");
}

std::string Page::Html() const
{
    std::string sections = Overview();
    for (const Chapter& chapter : chapters_)
        sections += SectionOf(chapter);
    const std::string title = Escaped(BaseName(name_));
    return "<!DOCTYPE html>\n<html lang=\"en\">\n<head>\n<meta charset=\"utf-8\">\n<meta name=\"viewport\" "
           "content=\"width=device-width, initial-scale=1\">\n<title>" +
           title + "</title>\n<style>\n" + style + PictureWriter::DarkColours() + "\n</style>\n</head>\n<body>\n<h1>" +
           title + "</h1>\n<p>What ZarnMath knows about the curves of this drawing.</p>\n" + Contents() + sections +
           TimingTable() + "</body>\n</html>\n";
}

} // namespace curvelab
