// The program on bad input: status 2, one line that names what is wrong, and no file left behind.

#include "Program.h"

#include <algorithm>
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

/// A wrong command line, and what its message has to name. "drawing.svg" is there to be used.
struct Mistake
{
    std::vector<std::string> arguments;
    std::vector<std::string> named;
};

std::string Words(const std::vector<std::string>& arguments)
{
    std::string text;
    for (const std::string& argument : arguments)
        text += " '" + argument + "'";
    return text;
}

void ExpectRefused(const Mistake& mistake, const TemporaryFolder& folder)
{
    SCOPED_TRACE("curvelab" + Words(mistake.arguments));
    const std::vector<std::string> before = folder.Names();
    const Outcome outcome = RunCurvelab(mistake.arguments, folder.Path());
    EXPECT_EQ(outcome.status, 2);
    EXPECT_EQ(outcome.out, "");
    EXPECT_EQ(outcome.err.rfind("curvelab: ", 0), 0u) << outcome.err;
    EXPECT_EQ(std::count(outcome.err.begin(), outcome.err.end(), '\n'), 1) << outcome.err;
    ASSERT_FALSE(outcome.err.empty());
    EXPECT_EQ(outcome.err.back(), '\n');
    for (const std::string& part : mistake.named)
        EXPECT_NE(outcome.err.find(part), std::string::npos) << "\"" << part << "\" is not in: " << outcome.err;
    EXPECT_EQ(folder.Names(), before);
}

void ExpectAllRefused(const std::vector<Mistake>& mistakes)
{
    const TemporaryFolder folder;
    folder.WriteSvg("<circle r='10'/>");
    for (const Mistake& mistake : mistakes)
        ExpectRefused(mistake, folder);
}

} // namespace

TEST(Errors, CommandLinesThatMakeNoSense)
{
    ExpectAllRefused({
        {{}, {"no command", "flatten"}},
        {{"bend", "drawing.svg"}, {"\"bend\"", "flatten", "split", "closest"}},
        {{"--frobnicate"}, {"--frobnicate"}},
        {{"flatten", "drawing.svg", "--tolerance", "1", "--frobnicate"}, {"--frobnicate"}},
        {{"flatten", "drawing.svg"}, {"--tolerance"}},
        {{"closest", "drawing.svg"}, {"--to"}},
        {{"tangents", "drawing.svg"}, {"--to"}},
        {{"length", "drawing.svg"}, {"--spacing"}},
        {{"cusps", "drawing.svg"}, {"--distance"}},
        {{"offset", "drawing.svg"}, {"--distance"}},
        {{"fit", "drawing.svg"}, {"--tolerance"}},
        {{"area", "drawing.svg", "--spacing", "5"}, {"--spacing"}},
        {{"flatten", "drawing.svg", "--tolerance"}, {"--tolerance"}},
        {{"split"}, {"no drawing"}},
        {{"split", "drawing.svg", "other.svg"}, {"other.svg"}},
        {{"split", "drawing.svg", "--text", "a", "--font", "f"}, {"--text", "drawing.svg"}},
        {{"split", "--text", "a"}, {"--font"}},
        {{"split", "drawing.svg", "--font", "f"}, {"--font", "--text"}},
    });
}

TEST(Errors, NumbersThatAreNone)
{
    ExpectAllRefused({
        {{"flatten", "drawing.svg", "--tolerance", "abc"}, {"--tolerance", "\"abc\"", "not a number"}},
        {{"flatten", "drawing.svg", "--tolerance", "-1"}, {"--tolerance", "\"-1\"", "negative"}},
        {{"flatten", "drawing.svg", "--tolerance", "nan"}, {"--tolerance", "\"nan\"", "finite"}},
        {{"flatten", "drawing.svg", "--tolerance=inf"}, {"--tolerance", "\"inf\"", "finite"}},
        {{"flatten", "drawing.svg", "--tolerance="}, {"--tolerance"}},
        {{"flatten", "drawing.svg", "--tolerance", "1", "--max-lines", "2048"}, {"--max-lines", "\"2048\"", "2047"}},
        {{"flatten", "drawing.svg", "--tolerance", "1", "--max-lines", "0"}, {"--max-lines", "\"0\""}},
        {{"flatten", "drawing.svg", "--tolerance", "1", "--max-lines", "2.5"}, {"--max-lines", "\"2.5\"", "whole"}},
        {{"split", "drawing.svg", "--at", "1.5"}, {"--at", "\"1.5\"", "0 to 1"}},
        {{"split", "drawing.svg", "--at", "x"}, {"--at", "\"x\""}},
        {{"closest", "drawing.svg", "--to", "5"}, {"--to", "\"5\"", "X,Y"}},
        {{"closest", "drawing.svg", "--to", "5,six"}, {"--to", "\"six\""}},
        {{"closest", "drawing.svg", "--to", "nan,0"}, {"--to", "\"nan\""}},
        {{"closest", "drawing.svg", "--to", "1e10,0", "--integer"}, {"--to", "--integer"}},
        {{"curvature", "drawing.svg", "--tooth", "51"}, {"--tooth", "\"51\"", "0 to 50"}},
        {{"curvature", "drawing.svg", "--tooth", "nan"}, {"--tooth", "\"nan\"", "finite"}},
        {{"length", "drawing.svg", "--spacing", "0"}, {"--spacing", "above 0"}},
        {{"length", "drawing.svg", "--spacing", "-5"}, {"--spacing", "\"-5\"", "negative"}},
        {{"length", "drawing.svg", "--spacing", "nan"}, {"--spacing", "\"nan\"", "finite"}},
        {{"length", "drawing.svg", "--spacing", "0.5"}, {"--spacing", "0.5", "too small", "100000"}},
        {{"length", "drawing.svg", "--spacing", "1e-300"}, {"--spacing", "1e-300", "too small"}},
        {{"tangents", "drawing.svg", "--to", "1;2"}, {"--to", "\"1;2\"", "X,Y"}},
        {{"tangents", "drawing.svg", "--to", "inf,2"}, {"--to", "\"inf\"", "finite"}},
        {{"cusps", "drawing.svg", "--distance", "nan"}, {"--distance", "\"nan\"", "finite"}},
        {{"cusps", "drawing.svg", "--distance", "far"}, {"--distance", "\"far\"", "not a number"}},
        {{"cusps", "drawing.svg", "--distance", "-1000001"}, {"--distance", "-1e+06", "ten times"}},
        {{"offset", "drawing.svg", "--distance", "-1000001"}, {"--distance", "-1e+06", "ten times"}},
        {{"offset", "drawing.svg", "--distance", "1", "--sides", "3"}, {"--sides", "\"3\"", "1 to 2"}},
        {{"offset", "drawing.svg", "--distance", "1", "--tolerance", "-1"}, {"--tolerance", "\"-1\"", "negative"}},
        {{"fit", "drawing.svg", "--tolerance", "9", "--spacing", "1"}, {"--spacing", "1", "too small", "100000"}},
        {{"fit", "drawing.svg", "--tolerance", "9", "--noise", "-1"}, {"--noise", "negative"}},
        {{"fit", "drawing.svg", "--tolerance", "9", "--seed", "1.5"}, {"--seed", "whole"}},
        {{"fit", "drawing.svg", "--tolerance", "9", "--corner", "181"}, {"--corner", "\"181\"", "0 to 180"}},
        {{"fit", "drawing.svg", "--tolerance", "9", "--reach", "0"}, {"--reach", "\"0\""}},
        {{"smooth", "drawing.svg", "--corner", "-1"}, {"--corner", "\"-1\"", "0 to 180"}},
        {{"split", "drawing.svg", "--units", "0"}, {"--units", "\"0\""}},
        {{"split", "drawing.svg", "--units", "-5"}, {"--units", "\"-5\""}},
        {{"split", "drawing.svg", "--units", "268435457"}, {"--units", "\"268435457\"", "268435456"}},
        {{"split", "drawing.svg", "--units", "1e5"}, {"--units", "\"1e5\""}},
    });
}

TEST(Errors, DrawingsThatAreNone)
{
    const TemporaryFolder folder;
    folder.Write("broken.svg", "<svg xmlns='http://www.w3.org/2000/svg'>\n\n<path d='M0,0'>\n</svg>");
    folder.Write("page.html", "<html/>");
    folder.Write("noise.png", "\x89PNG\r\n");
    folder.Write("blank.svg", "");
    folder.WriteSvg("", "empty.svg");
    folder.WriteSvg("<path d='M5,5 C5,5 5,5 5,5'/>", "point.svg");
    folder.WriteSvg("<path d='M0,0 L1e308,0' transform='scale(1e10)'/>", "huge.svg");
    folder.Write("three.txt", "1 2\n3 4 5\n");
    folder.Write("word.txt", "1 2\n\n3 four\n");
    folder.Write("remarks.txt", "# nothing\n");
    ExpectRefused({{"split", "missing.txt", "-o", "p.svg"}, {"missing.txt", "No such file"}}, folder);
    ExpectRefused({{"split", "three.txt", "-o", "p.svg"}, {"three.txt", "line 2", "two numbers"}}, folder);
    ExpectRefused({{"split", "word.txt", "-o", "p.svg"}, {"word.txt", "line 3", "\"four\""}}, folder);
    ExpectRefused({{"split", "remarks.txt", "-o", "p.svg"}, {"remarks.txt", "no curves"}}, folder);
    std::filesystem::create_directory(folder.Path() / "folder.svg");
    ExpectRefused({{"split", "missing.svg", "-o", "p.svg"}, {"missing.svg", "No such file"}}, folder);
    ExpectRefused({{"split", "broken.svg", "-o", "p.svg"}, {"broken.svg", "line 4"}}, folder);
    ExpectRefused({{"split", "page.html", "-o", "p.svg"}, {"page.html", "<html>"}}, folder);
    ExpectRefused({{"split", "noise.png", "-o", "p.svg"}, {"noise.png", "line 1"}}, folder);
    ExpectRefused({{"split", "blank.svg", "-o", "p.svg"}, {"blank.svg"}}, folder);
    ExpectRefused({{"split", "empty.svg", "-o", "p.svg"}, {"empty.svg", "no curves"}}, folder);
    ExpectRefused({{"split", "point.svg", "-o", "p.svg"}, {"point.svg", "no extent"}}, folder);
    ExpectRefused({{"split", "huge.svg", "-o", "p.svg"}, {"huge.svg", "finite"}}, folder);
    ExpectRefused({{"split", "folder.svg", "-o", "p.svg"}, {"folder.svg", "folder"}}, folder);
}

TEST(Errors, FontsAndTextsThatAreNone)
{
    const TemporaryFolder folder;
    folder.Write("letter.txt", "Dear reader");
    ExpectRefused({{"split", "--text", "a", "--font", "missing.otf"}, {"--font", "missing.otf"}}, folder);
    ExpectRefused({{"split", "--text", "a", "--font", "letter.txt"}, {"--font", "letter.txt", "not a font"}}, folder);
    const std::string font = CURVELAB_QUADRATIC_FONT;
    if (font.empty())
        GTEST_SKIP() << "the font is not installed";
    ExpectRefused({{"split", "--text", "   ", "--font", font, "-o", "p.svg"}, {"--text", "no curves"}}, folder);
    ExpectRefused({{"split", "--text", "a\nb", "--font", font, "-o", "p.svg"}, {"--text", "U+000A"}}, folder);
    ExpectRefused({{"split", "--text", "\xff", "--font", font, "-o", "p.svg"}, {"--text", "UTF-8"}}, folder);
}

TEST(Errors, OutputsThatCannotBe)
{
    const TemporaryFolder folder;
    folder.WriteSvg("<circle r='10'/>");
    std::filesystem::create_directory(folder.Path() / "place");
    ExpectRefused({{"split", "drawing.svg", "-o", "nowhere/p.svg"}, {"nowhere/p.svg"}}, folder);
    ExpectRefused({{"split", "drawing.svg", "-o", "place"}, {"place", "folder"}}, folder);
    // Neither of two outputs is written when one cannot be.
    ExpectRefused({{"split", "drawing.svg", "-o", "p.svg", "--json", "nowhere/n.json"}, {"nowhere/n.json"}}, folder);
    ExpectRefused({{"split", "drawing.svg", "-o", "same", "--json", "same"}, {"--output", "same", "--json"}}, folder);
    // Artwork is not overwritten, neither by its picture nor by numbers meant for standard output.
    ExpectRefused({{"split", "drawing.svg", "-o", "./drawing.svg"}, {"--output", "drawing.svg"}}, folder);
    ExpectRefused({{"split", "--json", "drawing.svg"}, {"--json", "drawing.svg"}}, folder);
    EXPECT_NE(ContentOf(folder.Path() / "drawing.svg").find("<circle"), std::string::npos);

    std::filesystem::permissions(folder.Path() / "place", std::filesystem::perms::owner_read);
    if (::access((folder.Path() / "place").c_str(), W_OK) != 0) // the superuser may write anywhere
        ExpectRefused({{"split", "drawing.svg", "-o", "place/p.svg"}, {"place/p.svg"}}, folder);
    std::filesystem::permissions(folder.Path() / "place", std::filesystem::perms::owner_all);
}

TEST(Errors, AnOldPictureSurvivesAFailure)
{
    const TemporaryFolder folder;
    folder.WriteSvg("<circle r='10'/>");
    folder.Write("p.svg", "the old picture");
    EXPECT_EQ(RunCurvelab({"split", "drawing.svg", "-o", "p.svg", "--json", "nowhere/n.json"}, folder.Path()).status,
              2);
    EXPECT_EQ(ContentOf(folder.Path() / "p.svg"), "the old picture");
    EXPECT_EQ(RunCurvelab({"split", "drawing.svg", "-o", "p.svg"}, folder.Path()).status, 0);
    EXPECT_NE(ContentOf(folder.Path() / "p.svg"), "the old picture");
}

TEST(Errors, NamesAreKeptOnOneLine)
{
    const TemporaryFolder folder;
    ExpectRefused({{"split", "two\nlines.svg"}, {"two lines.svg"}}, folder);
}
