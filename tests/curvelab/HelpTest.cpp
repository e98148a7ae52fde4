// What the program says about itself: the help, the manual page and the completion, each against the table of commands,
// and the examples by running them.

#include "Help.h"
#include "Program.h"

#include <algorithm>
#include <gtest/gtest.h>
#include <iterator>
#include <regex>
#include <sstream>

using namespace curvelab;

namespace {

/// The lines of a help that show what to type, without their blanks.
std::vector<std::string> ExampleLines(const std::string& help)
{
    std::istringstream lines(help.substr(help.find("\nExamples:\n")));
    std::vector<std::string> examples;
    for (std::string line; std::getline(lines, line);)
        if (line.rfind("  curvelab ", 0) == 0)
            examples.push_back(line.substr(2));
    return examples;
}

/// The file that an example says it writes, or nothing.
std::string PictureOf(const std::string& example)
{
    std::smatch match;
    return std::regex_search(example, match, std::regex(" -o ([^ ]+)")) ? match[1].str() : "";
}

/// What the examples are asked about.
void LayOut(const TemporaryFolder& folder)
{
    for (const char* name : {"nautilus.svg", "rose-window.svg", "knots.svg"})
        std::filesystem::copy(std::filesystem::path(CURVELAB_DRAWINGS) / name, folder.Path());
    const std::string font = CURVELAB_QUADRATIC_FONT;
    if (!font.empty())
        std::filesystem::copy_file(font, folder.Path() / "DejaVuSans.ttf");
}

bool CanBeRun(const std::string& example)
{
    return std::string(CURVELAB_QUADRATIC_FONT) != "" || example.find("--font") == std::string::npos;
}

void ExpectRuns(const std::string& example, const TemporaryFolder& folder)
{
    SCOPED_TRACE(example);
    const std::string program = std::filesystem::path(CURVELAB_PROGRAM).parent_path().string();
    const Outcome outcome = RunProgram({"sh", "-c", "PATH='" + program + "':$PATH; " + example}, folder.Path());
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.err, "");
    const std::string picture = PictureOf(example);
    if (!picture.empty()) {
        EXPECT_GT(ContentOf(folder.Path() / picture).size(), 1000u);
    }
}

/// The words that bash offers for the last of these.
std::vector<std::string> Offered(const std::vector<std::string>& words, const TemporaryFolder& folder)
{
    std::string line = "source '" CURVELAB_COMPLETION "'; COMP_WORDS=(";
    for (const std::string& word : words)
        line += " '" + word + "'";
    line += "); COMP_CWORD=" + std::to_string(words.size() - 1) + "; _curvelab; printf '%s\\n' \"${COMPREPLY[@]}\"";
    const Outcome outcome = RunProgram({"bash", "-c", line}, folder.Path());
    EXPECT_EQ(outcome.status, 0) << outcome.err;
    EXPECT_EQ(outcome.err, "");
    std::istringstream stream(outcome.out);
    std::vector<std::string> offered{std::istream_iterator<std::string>(stream), {}};
    std::sort(offered.begin(), offered.end());
    return offered;
}

bool IsInstalled(const std::string& program)
{
    const TemporaryFolder folder;
    return RunProgram({"sh", "-c", "command -v " + program}, folder.Path()).status == 0;
}

std::vector<std::string> OptionsOf(const Command& command)
{
    std::vector<std::string> names{"--help", "-o"};
    for (const OptionSpec& option : command.options)
        names.push_back(option.name);
    for (const CommonOptionSpec& spec : CommonOptionSpecs())
        names.push_back(spec.option.name);
    std::sort(names.begin(), names.end());
    return names;
}

} // namespace

TEST(Help, EveryExampleRuns)
{
    const TemporaryFolder folder;
    LayOut(folder);
    for (const Command& command : Commands()) {
        const Outcome help = RunCurvelab({command.name, "--help"}, folder.Path());
        EXPECT_EQ(help.status, 0);
        const std::vector<std::string> examples = ExampleLines(help.out);
        EXPECT_GE(examples.size(), 1u) << command.name;
        for (const std::string& example : examples) {
            EXPECT_EQ(example.rfind("curvelab " + command.name + ' ', 0), 0u) << example;
            if (CanBeRun(example))
                ExpectRuns(example, folder);
        }
    }
}

TEST(Help, TheProgramsOwnExamplesAreThoseOfCommands)
{
    std::string all;
    for (const Command& command : Commands())
        all += Help(command);
    const std::vector<std::string> examples = ExampleLines(Help(Commands()));
    EXPECT_EQ(examples.size(), 3u);
    for (const std::string& example : examples)
        EXPECT_NE(all.find("  " + example + '\n'), std::string::npos) << example;
}

TEST(Help, NamesEveryOption)
{
    for (const Command& command : Commands())
        for (const std::string& option : OptionsOf(command))
            EXPECT_TRUE(option == "--help" || Help(command).find(option) != std::string::npos)
                << command.name << ' ' << option;
}

TEST(Help, FitsATerminal)
{
    std::istringstream lines(Help(Commands()));
    for (std::string line; std::getline(lines, line);)
        EXPECT_LE(line.size(), 120u) << line;
}

TEST(Help, TellsTheVersion)
{
    const TemporaryFolder folder;
    const Outcome outcome = RunCurvelab({"--version"}, folder.Path());
    EXPECT_EQ(outcome.status, 0);
    EXPECT_TRUE(std::regex_match(outcome.out, std::regex("curvelab [0-9]+\\.[0-9]+\\.[0-9]+\n"))) << outcome.out;
}

TEST(Manual, NamesEveryCommandAndOption)
{
    const std::string text = std::regex_replace(ContentOf(CURVELAB_MANUAL), std::regex(R"(\\-)"), "-");
    for (const Command& command : Commands()) {
        const std::size_t at = text.find(".SS \"" + command.name + "\"\n");
        ASSERT_NE(at, std::string::npos) << command.name;
        const std::string part = text.substr(at, text.find(".S", at + 3) - at);
        for (const OptionSpec& option : command.options)
            EXPECT_NE(part.find(".B \"" + option.name + ' '), std::string::npos) << command.name << option.name;
        for (const Example& example : command.examples)
            EXPECT_NE(part.find("\ncurvelab " + example.arguments + '\n'), std::string::npos) << example.arguments;
    }
    for (const CommonOptionSpec& spec : CommonOptionSpecs())
        EXPECT_NE(text.find(spec.option.name), std::string::npos) << spec.option.name;
}

TEST(Manual, IsReadWithoutAWarning)
{
    if (!IsInstalled("man"))
        GTEST_SKIP() << "man is not installed";
    const TemporaryFolder folder;
    const Outcome outcome =
        RunProgram({"sh", "-c",
                    "LC_ALL=C.UTF-8 MANROFFSEQ= MANWIDTH=80 man --warnings -E UTF-8 -l -Tutf8 -Z '" CURVELAB_MANUAL
                    "' >/dev/null"},
                   folder.Path());
    EXPECT_EQ(outcome.status, 0);
    EXPECT_EQ(outcome.err, "");
}

TEST(Completion, OffersTheCommands)
{
    const TemporaryFolder folder;
    std::vector<std::string> names{"--help", "--version"};
    for (const Command& command : Commands())
        names.push_back(command.name);
    std::sort(names.begin(), names.end());
    EXPECT_EQ(Offered({"curvelab", ""}, folder), names);
    EXPECT_EQ(Offered({"curvelab", "sp"}, folder), std::vector<std::string>{"split"});
}

TEST(Completion, OffersTheOptionsOfTheCommand)
{
    const TemporaryFolder folder;
    for (const Command& command : Commands())
        EXPECT_EQ(Offered({"curvelab", command.name, "-"}, folder), OptionsOf(command)) << command.name;
    EXPECT_EQ(Offered({"curvelab", "flatten", "--to"}, folder), std::vector<std::string>{"--tolerance"});
}

TEST(Completion, OffersDrawingsAndFiles)
{
    const TemporaryFolder folder;
    for (const char* name : {"a.svg", "b.txt", "c.otf", "d e.svg"})
        folder.Write(name, "");
    std::filesystem::create_directory(folder.Path() / "place");
    using Words = std::vector<std::string>;
    EXPECT_EQ(Offered({"curvelab", "split", ""}, folder), (Words{"a.svg", "b.txt", "d", "e.svg", "place"}));
    EXPECT_EQ(Offered({"curvelab", "split", "--font", "c"}, folder), Words{"c.otf"});
    EXPECT_EQ(Offered({"curvelab", "split", "--font", "=", "c"}, folder), Words{"c.otf"});
    EXPECT_EQ(Offered({"curvelab", "split", "--font", "="}, folder).size(), 6u);
    EXPECT_EQ(Offered({"curvelab", "flatten", "--tolerance", ""}, folder), Words{});
}
