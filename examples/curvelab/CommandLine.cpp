#include "CommandLine.h"

#include "Failure.h"
#include "Numbers.h"

#include <CLI/CLI.hpp>

#include <algorithm>

namespace curvelab {

namespace {

/// A cubic whose coordinates stay within [0, N] has control points within [-2N, 3N] (the Bernstein coefficients of the
/// cubic Chebyshev polynomial, 1, -5, 5, -1, are the extreme case). With N = 2^28 their differences, at most 5N, and the
/// sums of two stay within 32 bits.
constexpr std::int64_t largestUnits = std::int64_t{1} << 28;

constexpr const char* planeNote =
    "Drawing units: the artwork is turned so that y grows upward, its lower left corner is put at 0,0, and its larger\n"
    "side is scaled to 100000 units, or as many as --units says. All coordinates and distances are in these units.\n"
    "Lines, quadratics and arcs become cubics. Errors end with status 2 and one line that says what is wrong.";

/// The texts of one command's options, in the order in which it lists them.
struct Texts
{
    Arguments arguments;
    CommonOptions common;
    std::string units = "100000";
};

void AddCommonOptions(CLI::App& app, Texts& texts)
{
    CommonOptions& common = texts.common;
    app.add_option("drawing", common.input, "An SVG file, or a list of points named *.txt")
        ->type_name("FILE")
        ->group("Drawing");
    app.add_option("--text", common.text, "Take this text as the drawing instead, set in --font")
        ->type_name("TEXT")
        ->group("Drawing");
    app.add_option("--font", common.font, "The font for --text, any outline font file")
        ->type_name("FILE")
        ->group("Drawing");
    app.add_option("--units", texts.units, "Length of the drawing's larger side, 1 to 268435456 (default 100000)")
        ->type_name("N")
        ->group("Drawing");
    app.add_flag("--integer", common.integer, "Round the control points to whole units and ask the integer overloads")
        ->group("Drawing");
    app.add_option("-o,--output", common.picture, "Write the picture, an SVG file")->type_name("FILE")->group("Output");
    app.add_option("--json", common.json,
                   "Write the numbers as JSON; - or nothing for standard output. Without it they are summed up there")
        ->type_name("FILE")
        ->expected(0, 1)
        ->default_str("-")
        ->group("Output");
}

void AddOwnOptions(CLI::App& app, const Command& command, Texts& texts)
{
    for (const OptionSpec& option : command.options) {
        std::string& value = texts.arguments[option.name] = option.fallback;
        const std::string help = option.help + (option.fallback.empty() ? "" : " (default " + option.fallback + ")");
        app.add_option(option.name, value, help)
            ->type_name(option.valueName)
            ->required(option.fallback.empty())
            ->group("Question");
    }
}

std::string CommandNames(const std::vector<Command>& commands)
{
    std::string names;
    for (const Command& command : commands)
        names += (names.empty() ? "" : ", ") + command.name;
    return names;
}

/// Looks at the first word before anything else does: a mistyped command is told from a surplus argument.
void RequireCommand(int argc, const char* const* argv, const std::vector<Command>& commands)
{
    const std::string advice = ", use one of " + CommandNames(commands) + ", or --help";
    if (argc < 2)
        throw Failure("no command given" + advice);
    const std::string word = argv[1];
    const bool isCommand =
        std::any_of(commands.begin(), commands.end(), [&](const Command& command) { return command.name == word; });
    if (!isCommand && word != "--help" && word != "-h")
        throw Failure("unknown command " + Quoted(word) + advice);
}

void RequireSource(const CommonOptions& common)
{
    const bool hasText = !common.text.empty();
    if (hasText && !common.input.empty())
        throw Failure("--text: a drawing is given as well, " + common.input);
    if (!hasText && common.input.empty())
        throw Failure(common.font.empty() ? "no drawing given, neither a file nor --text"
                                          : "--font: there is no --text to set in it");
    if (hasText && common.font.empty())
        throw Failure("--text: needs a --font to set it in");
    if (!hasText && !common.font.empty())
        throw Failure("--font: there is no --text to set in it");
}

void RequireTargets(const CommonOptions& common)
{
    // "--json drawing.svg" reads like an input; it would overwrite the artwork with numbers.
    if (common.json.size() > 4 && common.json.substr(common.json.size() - 4) == ".svg")
        throw Failure("--json: " + Quoted(common.json) +
                      " is named like a drawing; write --json=FILE, or --json=- "
                      "for standard output");
    if (!common.picture.empty() && common.picture == common.json)
        throw Failure("--output: " + common.picture + " is the file for --json, too");
}

CommonOptions Checked(const Texts& texts)
{
    CommonOptions common = texts.common;
    RequireTargets(common);
    RequireSource(common);
    common.units = static_cast<double>(ReadWhole("--units", texts.units, 1, largestUnits));
    return common;
}

} // namespace

std::optional<Request> ReadCommandLine(int argc, const char* const* argv, std::string& help)
{
    const std::vector<Command> commands = Commands();
    RequireCommand(argc, argv, commands);

    CLI::App app("Shows what ZarnMath knows about the curves of a drawing.", "curvelab");
    app.footer(planeNote);
    app.require_subcommand(1);
    std::vector<Texts> texts(commands.size());
    std::vector<CLI::App*> apps;
    for (std::size_t i = 0; i < commands.size(); ++i) {
        apps.push_back(app.add_subcommand(commands[i].name, commands[i].summary));
        apps.back()->footer(commands[i].details + "\n\n" + planeNote);
        AddOwnOptions(*apps.back(), commands[i], texts[i]);
        AddCommonOptions(*apps.back(), texts[i]);
    }
    try {
        app.parse(argc, argv);
    } catch (const CLI::CallForHelp&) {
        help = app.help();
        return std::nullopt;
    } catch (const CLI::ParseError& error) {
        throw Failure(error.what());
    }

    const auto chosen = std::find_if(apps.begin(), apps.end(), [](const CLI::App* sub) { return sub->parsed(); });
    const auto index = static_cast<std::size_t>(chosen - apps.begin());
    return Request{commands[index], texts[index].arguments, Checked(texts[index])};
}

} // namespace curvelab
