// The page about a drawing. Its times are shown, and no test looks at them.

#include "Page.h"
#include "Program.h"

#include <gtest/gtest.h>
#include <regex>
#include <set>
#include <sstream>

using namespace curvelab;

namespace {

std::size_t Count(const std::string& text, const std::string& part)
{
    std::size_t count = 0;
    for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + 1))
        ++count;
    return count;
}

/// All first groups of a pattern.
std::vector<std::string> All(const std::string& text, const std::string& pattern)
{
    const std::regex expression(pattern);
    std::vector<std::string> found;
    for (std::sregex_iterator i(text.begin(), text.end(), expression), end; i != end; ++i)
        found.push_back((*i)[1]);
    return found;
}

/// The page of a drawing with two crossing lines and a circle.
std::string PageOf(const std::vector<std::string>& more = {})
{
    const TemporaryFolder folder;
    const std::string file =
        folder.WriteSvg("<path d='M0,0 L400,300 M0,300 L400,0'/><circle cx='500' cy='150' r='50'/>", "a <b> & c.svg");
    std::vector<std::string> arguments{"report", file, "-o", "page.html"};
    arguments.insert(arguments.end(), more.begin(), more.end());
    const Outcome outcome = RunCurvelab(arguments, folder.Path());
    EXPECT_EQ(outcome.status, 0) << outcome.err;
    return ContentOf(folder.Path() / "page.html");
}

} // namespace

TEST(Report, TellsWhatTheCommandsTell)
{
    const std::string content = "<path d='M0,0 L400,300 M0,300 L400,0'/><circle cx='500' cy='150' r='50'/>";
    const Numbers report = AskCurvelab(content, {"report"});
    EXPECT_EQ(report.Number("/answer/contours"), 3);
    EXPECT_EQ(report.Number("/answer/curves"), 6);
    EXPECT_EQ(report.Number("/answer/crossings"), 1);
    EXPECT_EQ(report.Number("/answer/selfCrossings"), 0);
    EXPECT_EQ(report.Number("/answer/straightCurves"), 2);
    EXPECT_EQ(report.Number("/answer/closedContours"), 1);
    // 550 pixels become 100000 units.
    const double unit = 100000.0 / 550.0;
    EXPECT_NEAR(report.Number("/answer/width"), 100000.0, 1e-6);
    EXPECT_NEAR(report.Number("/answer/height"), 300.0 * unit, 1e-6);
    EXPECT_NEAR(report.Number("/answer/length"), (2.0 * 500.0 + 314.159) * unit, 0.1 * unit);
    EXPECT_NEAR(report.Number("/answer/radius"), 50.0 * unit, unit);
}

TEST(Report, IsOnePageThatNeedsNoOther)
{
    const std::string page = PageOf();
    EXPECT_EQ(page.rfind("<!DOCTYPE html>\n", 0), 0u);
    EXPECT_EQ(Count(page, "<svg "), 6u);
    EXPECT_EQ(Count(page, "prefers-color-scheme"), 2u); // the page's own, and the pictures' colours
    EXPECT_EQ(All(page, "(src=|<link|@import|<script)").size(), 0u);
    EXPECT_NE(page.find("a &lt;b> &amp; c.svg</h1>"), std::string::npos);
    for (const std::string& address : All(page, "(https?://[^\"]*)"))
        EXPECT_EQ(address, "http://www.w3.org/2000/svg");
}

TEST(Report, HasEveryNameOnce)
{
    const std::string page = PageOf();
    const std::vector<std::string> names = All(page, " id=\"([^\"]*)\"");
    const std::set<std::string> different(names.begin(), names.end());
    EXPECT_EQ(different.size(), names.size());
    std::vector<std::string> links = All(page, "href=\"#([^\"]*)\"");
    for (const std::string& clip : All(page, "url\\(#([^)]*)\\)"))
        links.push_back(clip);
    EXPECT_GE(links.size(), 13u);
    for (const std::string& link : links)
        EXPECT_EQ(different.count(link), 1u) << link;
}

TEST(Report, EveryElementIsClosed)
{
    const std::string page = PageOf({"--integer"});
    for (const char* element :
         {"section", "figure", "svg", "table", "tr", "td", "th", "div", "p", "code", "nav", "style"})
        EXPECT_EQ(All(page, std::string("(<") + element + "[ >])").size(),
                  Count(page, std::string("</") + element + ">"))
            << element;
}

TEST(Report, CountsTheQuestionsThatItTimes)
{
    Drawing drawing;
    Pen pen;
    pen.MoveTo({0.0, 0.0});
    pen.CubicTo({1.0, 2.0}, {3.0, 2.0}, {4.0, 0.0});
    pen.LineTo({0.0, 3.0});
    AddShape(drawing, {}, pen.Finish());
    Fit(drawing, 1000.0);
    std::ostringstream said;
    Progress progress(said, false, [] { return 0.0; });
    const std::vector<Timing> timings = TimeQuestions({drawing, false, progress});
    EXPECT_EQ(timings.size(), 11u); // as the help says
    for (const Timing& timing : timings) {
        EXPECT_EQ(timing.calls, 2);
        EXPECT_GE(timing.seconds, 0.0);
    }
}
