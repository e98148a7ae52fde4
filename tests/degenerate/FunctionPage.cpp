#include "tests/degenerate/FunctionPage.h"

#include "tests/Random.h"
#include "tests/degenerate/AnswerText.h"
#include "tests/degenerate/Sources.h"

#include <algorithm>
#include <cstdio>
#include <set>

namespace ZarnMath::Degenerate {

namespace {

using Catalogue::Function;

std::string Answer(const Function& function, Catalogue::Source& in, Detail detail)
{
    AnswerText out(detail);
    (*function.call)(in, out);
    return out.Text();
}

std::string Join(const std::vector<std::string>& parts, const char* separator)
{
    std::string text;
    for (const std::string& part : parts)
        text += (text.empty() ? "" : separator) + part;
    return text;
}

std::string Row(const std::vector<std::string>& cells)
{
    return "| " + Join(cells, " | ") + " |\n";
}

/// @name Coincident control points
/// @{

/// `P0=P1, P2=P3`, or `all distinct`.
std::string NameOf(const Partition& partition)
{
    std::vector<std::string> groups;
    for (const int c : {0, 1, 2, 3}) {
        std::vector<std::string> points;
        for (std::size_t i = 0; i < 4; ++i)
            if (partition[i] == c)
                points.push_back("P" + std::to_string(i));
        if (points.size() > 1)
            groups.push_back(Join(points, "="));
    }
    return groups.empty() ? "all distinct" : Join(groups, ", ");
}

/// The partitions that have one answer.
struct Coincidence
{
    std::string answer;
    std::vector<std::string> names;
};

std::vector<Coincidence> CoincidencesOf(const Function& function, int whose)
{
    std::vector<Coincidence> rows;
    for (const Partition& partition : partitions) {
        CoincidentSource source(partition, whose);
        const std::string answer = Answer(function, source, Detail::Values);
        auto row = std::ranges::find(rows, answer, &Coincidence::answer);
        if (row == rows.end())
            row = rows.insert(row, {answer, {}});
        row->names.push_back(NameOf(partition));
    }
    return rows;
}

int CountCurves(const Function& function)
{
    CoincidentSource source(partitions.back(), -1);
    Answer(function, source, Detail::Values);
    return source.Curves();
}

std::string CoincidenceTable(const Function& function, int whose, int curves)
{
    const std::string which = curves == 1 ? "" : whose == 0 ? " in the first curve" : " in the second curve";
    std::string table = "\n" + Row({"coincident" + which, "answer"}) + "|---|---|\n";
    std::vector<Coincidence> rows = CoincidencesOf(function, whose);
    const auto largest = std::ranges::max_element(rows, {}, [](const Coincidence& row) { return row.names.size(); });
    constexpr std::size_t tooManyToName = 5;
    if (largest->names.size() >= tooManyToName) {
        const std::string count = std::to_string(largest->names.size());
        largest->names = {rows.size() == 1 ? "all " + count : "the other " + count};
        std::rotate(largest, largest + 1, rows.end());
    }
    for (const Coincidence& row : rows)
        table += Row({Join(row.names, "; "), row.answer});
    return table;
}

/// @}
/// @name Special values
/// @{

/// The places at which one value leads to one answer.
struct Finding
{
    std::string answer;
    std::vector<std::string> places;
    std::vector<std::string> values;
};

/// `P0.x, P0.y` as `P0`, and `P0, P1, P2, P3` as `P0 to P3`.
std::string NamePlaces(const std::vector<std::string>& places)
{
    std::vector<std::string> points;
    for (std::size_t i = 0; i < places.size(); ++i) {
        const std::string stem = places[i].substr(0, places[i].find('.'));
        const bool isPair = i + 1 < places.size() && places[i].ends_with(".x") && places[i + 1] == stem + ".y";
        points.push_back(isPair ? stem : places[i]);
        i += isPair ? 1 : 0;
    }
    std::string text = Join(points, ", ");
    for (const auto& [list, range] :
         {std::pair{"P0, P1, P2, P3", "P0 to P3"}, {"Q0, Q1, Q2, Q3", "Q0 to Q3"}, {"a, b, c, d", "a to d"}})
        if (const std::size_t at = text.find(list); at != std::string::npos)
            text.replace(at, std::string(list).size(), range);
    return text;
}

/// The findings of one value, in the order of the places; those where the answer is the ordinary one are left out.
std::vector<Finding> FindingsOf(const Function& function, const Special& value, const std::string& ordinary)
{
    std::vector<Finding> findings;
    SpecialSource counting(value, -1);
    Answer(function, counting, Detail::Classes);
    for (std::size_t place = 0; place < counting.Names().size(); ++place) {
        SpecialSource source(value, static_cast<int>(place));
        const std::string answer = Answer(function, source, Detail::Classes);
        if (answer == ordinary)
            continue;
        auto finding = std::ranges::find(findings, answer, &Finding::answer);
        if (finding == findings.end())
            finding = findings.insert(finding, {answer, {}, {value.name}});
        finding->places.push_back(counting.Names()[place]);
    }
    return findings;
}

/// Values that lead to the same answer at the same places share a row.
void Merge(std::vector<Finding>& all, const std::vector<Finding>& some)
{
    for (const Finding& finding : some) {
        const auto same = std::ranges::find_if(all, [&finding](const Finding& other) {
            return other.answer == finding.answer && other.places == finding.places;
        });
        if (same == all.end())
            all.push_back(finding);
        else
            same->values.push_back(finding.values.front());
    }
}

std::string SpecialTable(const Function& function)
{
    SpecialSource ordinarySource(specials.front(), -1);
    const std::string ordinary = Answer(function, ordinarySource, Detail::Classes);
    std::vector<Finding> findings;
    for (const Special& value : specials)
        Merge(findings, FindingsOf(function, value, ordinary));
    std::string table = "\n" + Row({"value", "in", "answer"}) + "|---|---|---|\n";
    for (const Finding& finding : findings)
        table += Row({Join(finding.values, ", "), NamePlaces(finding.places), finding.answer});
    return table + Row({findings.empty() ? "any" : "any other", "any", ordinary});
}

/// @}

/// @name Both at once
/// @{

/// The checksum of Adler, on text (M. Adler, 1995).
class Checksum
{
public:
    void Add(const std::string& text) noexcept
    {
        constexpr std::uint32_t largestPrime = 65521;
        for (const char c : text) {
            low = (low + static_cast<unsigned char>(c)) % largestPrime;
            high = (high + low) % largestPrime;
        }
    }

    [[nodiscard]] std::uint32_t Value() const noexcept
    {
        return high << 16 | low;
    }

private:
    std::uint32_t low = 1;
    std::uint32_t high = 0;
};

/// Calls answer(text) for each special value in each place, with one partition.
template <typename Take>
void CrossOne(const Function& function, const Partition& partition, int whose, bool flags, Take take)
{
    for (const Special& value : specials) {
        SpecialSource counting(value, -1, partition, whose, flags);
        take(Answer(function, counting, Detail::Classes));
        for (std::size_t place = 0; place < counting.Names().size(); ++place) {
            SpecialSource source(value, static_cast<int>(place), partition, whose, flags);
            take(Answer(function, source, Detail::Classes));
        }
    }
}

/// What depends on the machine's mathematical functions may end on either side of a limit, and is only called.
std::string CrossingLine(const Function& function)
{
    const Crossing crossing = CrossAll(function);
    if (function.numberClass == Catalogue::NumberClass::Platform)
        return "";
    char line[120];
    std::snprintf(line, sizeof line, "\nBoth at once: %ld calls, %ld answers, %08lx.\n", crossing.calls,
                  crossing.answers, static_cast<unsigned long>(crossing.checksum));
    return line;
}

/// @}

} // namespace

Crossing CrossAll(const Function& function)
{
    Crossing crossing{};
    Checksum checksum;
    std::set<std::string> answers;
    const auto take = [&](const std::string& answer) {
        ++crossing.calls;
        checksum.Add(answer + "\n");
        answers.insert(answer);
    };
    const int curves = CountCurves(function);
    for (const bool flags : {false, true})
        for (int whose = 0; whose < std::max(curves, 1); ++whose)
            for (const Partition& partition : partitions)
                if (curves > 0 || partition == distinctPoints)
                    CrossOne(function, partition, whose, flags, take);
    crossing.answers = static_cast<long>(answers.size());
    crossing.checksum = checksum.Value();
    return crossing;
}

std::string SectionOn(const Function& function)
{
    std::string section = "\n### `" + function.name + "`\n";
    const int curves = CountCurves(function);
    for (int whose = 0; whose < curves; ++whose)
        section += CoincidenceTable(function, whose, curves);
    return section + SpecialTable(function) + CrossingLine(function);
}

} // namespace ZarnMath::Degenerate
