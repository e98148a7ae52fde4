#include "CommandLine.h"

#include "Failure.h"
#include "Help.h"
#include "Numbers.h"

#include <CLI/CLI.hpp>

#include <algorithm>
#include <map>

namespace curvelab {

namespace {

/// A cubic whose coordinates stay within [0, N] has control points within [-2N, 3N] (the Bernstein coefficients of the
/// cubic Chebyshev polynomial, 1, -5, 5, -1, are the extreme case). With N = 2^28 their differences, at most 5N, and the
/// sums of two stay within 32 bits.
constexpr std::int64_t largestUnits = std::int64_t{1} << 28;

/// The texts of one command's options, in the order in which it lists them.
struct Texts
{
    Arguments arguments;
    CommonOptions common;
    std::string units = "100000";
};

/// Where the value of a common option goes.
std::string& TargetOf(const std::string& name, Texts& texts)
{
    const std::map<std::string, std::string*> targets{
        {"--text", &texts.common.text},      {"--font", &texts.common.font}, {"--units", &texts.units},
        {"--output", &texts.common.picture}, {"--json", &texts.common.json},
    };
    return *targets.at(name);
}

void AddCommonOptions(CLI::App& app, Texts& texts)
{
    app.add_option("drawing", texts.common.input);
    for (const CommonOptionSpec& spec : CommonOptionSpecs()) {
        const std::string names = (spec.shortName.empty() ? "" : spec.shortName + ',') + spec.option.name;
        if (spec.option.valueName.empty()) {
            app.add_flag(names, texts.common.integer);
            continue;
        }
        CLI::Option* const option = app.add_option(names, TargetOf(spec.option.name, texts));
        if (spec.isOptional)
            option->expected(0, 1)->default_str("-");
    }
}

void AddOwnOptions(CLI::App& app, const Command& command, Texts& texts)
{
    for (const OptionSpec& option : command.options) {
        std::string& value = texts.arguments[option.name] = option.fallback;
        app.add_option(option.name, value)->required(option.fallback.empty());
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
    if (!isCommand && word != "--help" && word != "-h" && word != "--version")
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

    CLI::App app;
    app.require_subcommand(1);
    app.set_version_flag("--version", Version());
    std::vector<Texts> texts(commands.size());
    std::vector<CLI::App*> apps;
    for (std::size_t i = 0; i < commands.size(); ++i) {
        apps.push_back(app.add_subcommand(commands[i].name));
        AddOwnOptions(*apps.back(), commands[i], texts[i]);
        AddCommonOptions(*apps.back(), texts[i]);
    }
    const auto chosen = [&] {
        return std::find_if(apps.begin(), apps.end(), [](const CLI::App* sub) { return sub->parsed(); }) - apps.begin();
    };
    try {
        app.parse(argc, argv);
    } catch (const CLI::CallForHelp&) {
        const auto index = static_cast<std::size_t>(chosen());
        help = index < commands.size() ? Help(commands[index]) : Help(commands);
        return std::nullopt;
    } catch (const CLI::CallForVersion&) {
        help = Version();
        return std::nullopt;
    } catch (const CLI::ParseError& error) {
        throw Failure(error.what());
    }
    const auto index = static_cast<std::size_t>(chosen());
    return Request{commands[index], texts[index].arguments, Checked(texts[index])};
}

} // namespace curvelab
