// Colours are for terminals only, and for readers who want them.

#include "Terminal.h"
#include "Program.h"

#include <gtest/gtest.h>

namespace {

constexpr char escape = '\033';

bool HasColours(const std::string& text)
{
    return text.find(escape) != std::string::npos;
}

/// Text without the sequences that colour it.
std::string Plain(const std::string& text)
{
    std::string plain;
    for (std::size_t i = 0; i < text.size(); ++i)
        if (text[i] == escape)
            i = text.find('m', i);
        else
            plain += text[i];
    return plain;
}

} // namespace

TEST(Terminal, GetsColours)
{
    const TemporaryFolder folder;
    const std::string file = folder.WriteSvg("<circle r='10'/>");
    for (const std::vector<std::string>& arguments :
         std::vector<std::vector<std::string>>{{"--help"}, {"split", "--help"}, {"split", file}, {"bend"}}) {
        const Outcome painted = RunOnTerminal(arguments, folder.Path(), {"TERM=xterm"});
        const Outcome plain = RunCurvelab(arguments, folder.Path());
        EXPECT_TRUE(HasColours(painted.out)) << painted.out;
        EXPECT_EQ(painted.status, plain.status);
        EXPECT_EQ(Plain(painted.out), plain.out + plain.err);
        EXPECT_FALSE(HasColours(plain.out + plain.err));
    }
}

TEST(Terminal, GetsNoneWhereTheyAreNotWanted)
{
    const TemporaryFolder folder;
    for (const std::vector<std::string>& environment :
         std::vector<std::vector<std::string>>{{"TERM=xterm", "NO_COLOR=1"}, {"TERM=dumb"}, {"TERM="}, {}}) {
        const Outcome help = RunOnTerminal({"--help"}, folder.Path(), environment);
        EXPECT_EQ(help.status, 0);
        EXPECT_EQ(help.out, RunCurvelab({"--help"}, folder.Path()).out);
    }
    // Empty is as good as not set.
    EXPECT_TRUE(HasColours(RunOnTerminal({"--help"}, folder.Path(), {"TERM=xterm", "NO_COLOR="}).out));
}

TEST(Terminal, NumbersAreNotPainted)
{
    const TemporaryFolder folder;
    const std::string file = folder.WriteSvg("<circle r='10'/>");
    const Outcome json = RunOnTerminal({"split", file, "--json"}, folder.Path(), {"TERM=xterm"});
    EXPECT_FALSE(HasColours(json.out));
    EXPECT_EQ(Numbers(json.out).Text("/command"), "split");
}

TEST(Terminal, PaintTurnedOffLeavesTextAlone)
{
    const curvelab::Paint paint(false);
    EXPECT_EQ(paint.Heading("a"), "a");
    EXPECT_EQ(paint.Quiet("a"), "a");
    EXPECT_EQ(paint.Alarm("a"), "a");
    EXPECT_EQ(paint.Help("Commands:\n  curvelab split\n"), "Commands:\n  curvelab split\n");
}
