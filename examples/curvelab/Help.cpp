#include "Help.h"

#include <algorithm>
#include <sstream>
#include <string_view>

namespace curvelab {

namespace {

constexpr std::size_t pageWidth = 100;

constexpr std::string_view description = "Shows what ZarnMath knows about the curves of a drawing.";

constexpr std::string_view usage = "Usage: curvelab COMMAND DRAWING [OPTION]...\n"
                                   "       curvelab COMMAND --text TEXT --font FILE [OPTION]...\n"
                                   "       curvelab [COMMAND] --help\n"
                                   "       curvelab --version\n";

constexpr std::string_view planeNote =
    "Drawing units: the artwork is turned so that y grows upward, its lower left corner is put at 0,0, and its larger\n"
    "side is scaled to 100000 units, or as many as --units says. All coordinates and distances are in these units.\n"
    "Lines, quadratics and arcs become cubics. Errors end with status 2 and one line that says what is wrong.\n";

/// A term and what is said of it, as the lists of the help show them.
struct Entry
{
    std::string term;
    std::string text;
};

/// Text in lines of limited length, each after the first behind so many blanks.
std::string Wrapped(const std::string& text, std::size_t indent)
{
    std::istringstream words(text);
    std::string out;
    std::size_t column = indent;
    for (std::string word; words >> word;) {
        if (column > indent && column + 1 + word.size() > pageWidth) {
            out += '\n' + std::string(indent, ' ');
            column = indent;
        }
        out += (column > indent ? " " : "") + word;
        column += (column > indent ? 1 : 0) + word.size();
    }
    return out;
}

/// A heading and its entries, the texts in one column.
std::string List(const std::string& heading, const std::vector<Entry>& entries)
{
    std::size_t width = 0;
    for (const Entry& entry : entries)
        width = std::max(width, entry.term.size());
    std::string out = "\n" + heading + ":\n";
    for (const Entry& entry : entries)
        out +=
            "  " + entry.term + std::string(width + 2 - entry.term.size(), ' ') + Wrapped(entry.text, width + 4) + '\n';
    return out;
}

std::string TermOf(const OptionSpec& option)
{
    return option.name + ' ' + option.valueName;
}

std::string TermOf(const CommonOptionSpec& common)
{
    const std::string& value = common.option.valueName;
    return (common.shortName.empty() ? "" : common.shortName + ", ") + common.option.name +
           (value.empty() ? "" : (common.isOptional ? " [" + value + ']' : ' ' + value));
}

std::string TextOf(const OptionSpec& option)
{
    return option.help + (option.fallback.empty() ? "" : " (default " + option.fallback + ")");
}

/// What is said of an option of a command: one without a value of its own has to be given.
std::string OwnTextOf(const OptionSpec& option)
{
    return TextOf(option) + (option.fallback.empty() ? " (required)" : "");
}

std::vector<Entry> CommonEntries(Topic topic)
{
    std::vector<Entry> entries;
    for (const CommonOptionSpec& common : CommonOptionSpecs())
        if (common.topic == topic)
            entries.push_back({TermOf(common), TextOf(common.option)});
    return entries;
}

const Entry drawingEntry{"DRAWING", "An SVG file, or a list of points named *.txt"};

std::string ExampleText(const std::vector<Example>& examples)
{
    std::string out = "\nExamples:\n";
    for (const Example& example : examples)
        out += "  # " + example.shows + "\n  curvelab " + example.arguments + "\n";
    return out;
}

/// What the help of the program shows: the first example of some commands.
std::vector<Example> FirstExamples(const std::vector<Command>& commands)
{
    std::vector<Example> examples;
    for (const Command& command : commands)
        if (command.name == "flatten" || command.name == "intersect" || command.name == "report")
            examples.push_back(command.examples.front());
    return examples;
}

/// Text as the man macros read it: no dash becomes a hyphen, and no line is taken for a request.
std::string Roff(const std::string& text)
{
    std::string out;
    for (const char c : text) {
        const bool startsLine = out.empty() || out.back() == '\n';
        if (startsLine && (c == '.' || c == '\''))
            out += "\\&";
        if (c == '\\')
            out += "\\e";
        else if (c == '-')
            out += "\\-";
        else
            out += c;
    }
    return out;
}

/// Lines of which some are set apart by blanks at their start: those keep lines of their own.
std::string RoffLines(const std::string& text)
{
    std::istringstream lines(text);
    std::string out;
    bool wasApart = false;
    for (std::string line; std::getline(lines, line);) {
        const std::size_t start = std::min(line.find_first_not_of(' '), line.size());
        if (start > 0 || wasApart)
            out += ".br\n";
        out += Roff(line.substr(start)) + '\n';
        wasApart = start > 0;
    }
    return out;
}

std::string RoffEntry(const Entry& entry)
{
    return ".TP\n.B \"" + Roff(entry.term) + "\"\n" + Roff(entry.text) + '\n';
}

std::string RoffExamples(const std::vector<Example>& examples)
{
    std::string out;
    for (const Example& example : examples)
        out += ".PP\n" + Roff(example.shows) + ":\n.PP\n.RS 4\n.nf\n" + Roff("curvelab " + example.arguments) +
               "\n.fi\n.RE\n";
    return out;
}

std::string RoffCommand(const Command& command)
{
    std::string out = ".SS \"" + command.name + "\"\n" + Roff(command.summary) + ".\n";
    for (const OptionSpec& option : command.options)
        out += RoffEntry({TermOf(option), OwnTextOf(option)});
    return out + ".PP\n" + RoffLines(command.details) + RoffExamples(command.examples);
}

/// Words in one string, with blanks between them.
std::string Joined(const std::vector<std::string>& words)
{
    std::string out;
    for (const std::string& word : words)
        out += (out.empty() ? "" : " ") + word;
    return out;
}

std::vector<std::string> NamesOf(const Command& command)
{
    std::vector<std::string> names;
    for (const OptionSpec& option : command.options)
        names.push_back(option.name);
    return names;
}

/// The names of the common options that a test holds for, as alternatives of a pattern of the shell.
template <typename Test>
std::string Alternatives(Test test)
{
    std::string out;
    for (const CommonOptionSpec& common : CommonOptionSpecs())
        if (test(common))
            out += (out.empty() ? "" : " | ") + common.option.name +
                   (common.shortName.empty() ? "" : " | " + common.shortName);
    return out;
}

/// The options after which a value follows that only its author knows.
std::string ValueAlternatives(const std::vector<Command>& commands)
{
    std::vector<std::string> names;
    for (const Command& command : commands)
        for (const std::string& name : NamesOf(command))
            if (std::find(names.begin(), names.end(), name) == names.end())
                names.push_back(name);
    std::string out = Alternatives([](const CommonOptionSpec& c) { return !c.isFile && !c.option.valueName.empty(); });
    for (const std::string& name : names)
        out += " | " + name;
    return out;
}

} // namespace

const std::vector<CommonOptionSpec>& CommonOptionSpecs()
{
    static const std::vector<CommonOptionSpec> specs{
        {{"--text", "TEXT", "Take this text as the drawing instead, set in --font", ""}, Topic::Drawing},
        {{"--font", "FILE", "The font for --text, any outline font file", ""}, Topic::Drawing, "", true},
        {{"--units", "N", "Length of the drawing's larger side, 1 to 268435456", "100000"}, Topic::Drawing},
        {{"--integer", "", "Round the control points to whole units and ask the integer overloads", ""},
         Topic::Drawing},
        {{"--output", "FILE", "Write the picture, an SVG file; of report the page, an HTML file", ""},
         Topic::Output,
         "-o",
         true},
        {{"--json", "FILE",
          "Write the numbers as JSON; - or nothing for standard output. Without it they are summed up there", ""},
         Topic::Output,
         "",
         true,
         true},
    };
    return specs;
}

std::string Help(const std::vector<Command>& commands)
{
    std::vector<Entry> entries;
    for (const Command& command : commands)
        entries.push_back({command.name, command.summary});
    return std::string(description) + "\n\n" + std::string(usage) + List("Commands", entries) +
           ExampleText(FirstExamples(commands)) + "\n" + std::string(planeNote);
}

std::string Help(const Command& command)
{
    std::string required;
    std::vector<Entry> own;
    for (const OptionSpec& option : command.options) {
        own.push_back({TermOf(option), OwnTextOf(option)});
        if (option.fallback.empty())
            required += ' ' + TermOf(option);
    }
    std::vector<Entry> drawing = CommonEntries(Topic::Drawing);
    drawing.insert(drawing.begin(), drawingEntry);
    return command.summary + ".\n\nUsage: curvelab " + command.name + " DRAWING" + required + " [OPTION]...\n" +
           (own.empty() ? "" : List("Question", own)) + List("Drawing", drawing) +
           List("Output", CommonEntries(Topic::Output)) + ExampleText(command.examples) + '\n' + command.details +
           "\n\n" + std::string(planeNote);
}

std::string Version()
{
    return "curvelab " CURVELAB_VERSION "\n";
}

std::string ManualPage(const std::vector<Command>& commands)
{
    std::string out =
        ".TH CURVELAB 1 \"\" \"curvelab " CURVELAB_VERSION "\" \"User Commands\"\n"
        ".SH NAME\ncurvelab \\- show what ZarnMath knows about the curves of a drawing\n"
        ".SH SYNOPSIS\n"
        ".B curvelab\n.I COMMAND DRAWING\n[\\fIOPTION\\fR]...\n.br\n"
        ".B curvelab\n.I COMMAND\n.B \\-\\-text\n.I TEXT\n.B \\-\\-font\n.I FILE\n[\\fIOPTION\\fR]...\n.br\n"
        ".B curvelab\n[\\fICOMMAND\\fR]\n.B \\-\\-help\n.br\n"
        ".B curvelab \\-\\-version\n"
        ".SH DESCRIPTION\n"
        "Reads artwork \\- an SVG file, text set in a font, or a list of points \\- and shows what the "
        "library knows\nabout its curves: a picture with the artwork in grey and the answer drawn over "
        "it, and the numbers, for people or as\nJSON.\n.PP\n" +
        RoffLines(std::string(planeNote)) + ".SH OPTIONS\nThese go with every command.\n" + RoffEntry(drawingEntry);
    for (const Topic topic : {Topic::Drawing, Topic::Output})
        for (const Entry& entry : CommonEntries(topic))
            out += RoffEntry(entry);
    out += RoffEntry({"-h, --help", "Explain the program, or the command in front of it"}) + ".SH COMMANDS\n";
    for (const Command& command : commands)
        out += RoffCommand(command);
    return out + ".SH ENVIRONMENT\n" +
           RoffEntry(
               {"NO_COLOR", "When it is set to anything, a terminal gets no colours. Nothing else ever gets any."}) +
           ".SH EXIT STATUS\n" + RoffEntry({"0", "The question is answered, and all outputs are written."}) +
           RoffEntry({"2", "It is not, and no output is written; a line on standard error says why."});
}

std::string BashCompletion(const std::vector<Command>& commands)
{
    std::string names, cases, common;
    for (const Command& command : commands) {
        names += command.name + ' ';
        cases += "        " + command.name + ") own=\"" + Joined(NamesOf(command)) + "\" ;;\n";
    }
    for (const CommonOptionSpec& spec : CommonOptionSpecs())
        common += spec.option.name + ' ' + (spec.shortName.empty() ? "" : spec.shortName + ' ');
    const std::string files = Alternatives([](const CommonOptionSpec& spec) { return spec.isFile; });
    return "# Completion of curvelab for bash.\n"
           "_curvelab()\n{\n"
           "    local word=${COMP_WORDS[COMP_CWORD]} before=${COMP_WORDS[COMP_CWORD - 1]} own=\n"
           "    # Bash takes --option=value for three words.\n"
           "    if [[ $word == = ]]; then\n"
           "        word=\n"
           "    elif [[ $before == = ]]; then\n"
           "        before=${COMP_WORDS[COMP_CWORD - 2]}\n"
           "    fi\n"
           "    COMPREPLY=()\n"
           "    if ((COMP_CWORD == 1)); then\n"
           "        mapfile -t COMPREPLY < <(compgen -W \"" +
           names +
           "--help --version\" -- \"$word\")\n"
           "        return\n"
           "    fi\n"
           "    case $before in\n"
           "        " +
           files +
           ")\n"
           "            mapfile -t COMPREPLY < <(compgen -f -- \"$word\")\n"
           "            return\n"
           "            ;;\n"
           "        " +
           ValueAlternatives(commands) +
           ")\n"
           "            return\n"
           "            ;;\n"
           "    esac\n"
           "    case ${COMP_WORDS[1]} in\n" +
           cases +
           "    esac\n"
           "    if [[ $word == -* ]]; then\n"
           "        mapfile -t COMPREPLY < <(compgen -W \"$own " +
           common +
           "--help\" -- \"$word\")\n"
           "    else\n"
           "        mapfile -t COMPREPLY < <(compgen -d -- \"$word\"; compgen -f -X '!*.svg' -- \"$word\"\n"
           "            compgen -f -X '!*.txt' -- \"$word\")\n"
           "    fi\n"
           "}\n"
           "complete -o filenames -F _curvelab curvelab\n";
}

} // namespace curvelab
