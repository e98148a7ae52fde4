// Runs every line of every file through the function that it names.
#include "tests/vectors/Table.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cctype>
#include <filesystem>
#include <fstream>
#include <iostream>

namespace ZarnMath::Vectors {

namespace {

/// So that a function that is wrong throughout does not bury the rest.
constexpr int mostMessagesPerFunction = 5;

/// Functions with an adapter of which no file holds a case.
const std::set<std::string> adaptersWithoutVectors = {};

std::vector<std::string> ListFiles()
{
    std::vector<std::string> files;
    for (const auto& entry : std::filesystem::directory_iterator(ZARNMATH_VECTORS_DIRECTORY))
        if (entry.path().extension() == ".tsv")
            files.push_back(entry.path().stem().string());
    std::sort(files.begin(), files.end());
    return files;
}

std::string PathOf(const std::string& file)
{
    return std::string(ZARNMATH_VECTORS_DIRECTORY) + "/" + file + ".tsv";
}

std::vector<Case> ReadFile(const std::string& file)
{
    std::ifstream stream(PathOf(file));
    if (!stream)
        throw std::runtime_error("cannot read " + PathOf(file));
    return ReadCases(stream);
}

/// There the sign of a zero depends on the order of a sum that is left open.
bool DoesZeroSignCount(const std::string& file)
{
    return file != "closest" && file != "intersect";
}

/// What was done, over all files of a run.
struct Tally
{
    int casesRun = 0;
    int casesWithinUnits = 0;
    int casesTooWide = 0;
    std::map<std::string, int> withoutAdapter;

    [[nodiscard]] int CasesWithoutAdapter() const
    {
        int sum = 0;
        for (const auto& [name, number] : withoutAdapter)
            sum += number;
        return sum;
    }

    void Merge(const Tally& other)
    {
        casesRun += other.casesRun;
        casesWithinUnits += other.casesWithinUnits;
        casesTooWide += other.casesTooWide;
        for (const auto& [name, number] : other.withoutAdapter)
            withoutAdapter[name] += number;
    }
};

std::ostream& operator<<(std::ostream& out, const Tally& tally)
{
    out << tally.casesRun << " cases ran";
    if (tally.casesWithinUnits > 0)
        out << " (" << tally.casesWithinUnits << " of them compared within units in the last place)";
    if (tally.casesTooWide > 0)
        out << ", " << tally.casesTooWide << " hold an integer that no long takes here";
    out << ", " << tally.CasesWithoutAdapter() << " without an adapter";
    const char* separator = ": ";
    for (const auto& [name, number] : tally.withoutAdapter) {
        out << separator << name << ' ' << number;
        separator = ", ";
    }
    return out;
}

class VectorFile : public testing::TestWithParam<std::string>
{
protected:
    static void SetUpTestSuite()
    {
        table = new Table(MakeTable());
        differing = new std::set<Platform>(FindDifferingFunctions(ReadFile("platform"), *table));
        total = new Tally;
    }

    static void TearDownTestSuite()
    {
        for (const Platform function : *differing)
            std::cout << "The platform's " << NameOf(function) << " differs from the recorded one.\n";
        std::cout << "All files: " << *total << '\n';
        delete table;
        delete differing;
        delete total;
    }

    static Table* table;
    static std::set<Platform>* differing;
    static Tally* total;
};

Table* VectorFile::table = nullptr;
std::set<Platform>* VectorFile::differing = nullptr;
Tally* VectorFile::total = nullptr;

TEST_P(VectorFile, GivesWhatWasRecorded)
{
    const std::vector<Case> cases = ReadFile(GetParam());
    ASSERT_FALSE(cases.empty());
    Tally tally;
    std::map<std::string, int> failures;
    for (const Case& recorded : cases) {
        const Table::Entry* entry = table->Find(recorded.name);
        if (!entry) {
            ++tally.withoutAdapter[recorded.name];
            continue;
        }
        const Comparison comparison = ComparisonFor(*entry, *differing, DoesZeroSignCount(GetParam()));
        try {
            const auto mismatch = RunCase(recorded, entry->adapter, comparison);
            if (mismatch && ++failures[recorded.name] <= mostMessagesPerFunction)
                ADD_FAILURE_AT(PathOf(GetParam()).c_str(), recorded.line) << recorded.name << ": " << *mismatch;
        } catch (const TooWide&) {
            ++tally.casesTooWide;
            continue;
        }
        ++tally.casesRun;
        tally.casesWithinUnits += comparison.units > 0 ? 1 : 0;
    }
    for (const auto& [name, number] : failures)
        ADD_FAILURE() << number << " cases of " << name << " failed";
    for (const auto& [name, number] : tally.withoutAdapter)
        std::cout << "no adapter: " << name << ", " << number << " cases\n";
    RecordProperty("casesRun", tally.casesRun);
    RecordProperty("casesWithoutAdapter", tally.CasesWithoutAdapter());
    std::cout << GetParam() << ".tsv: " << tally << '\n';
    total->Merge(tally);
}

INSTANTIATE_TEST_SUITE_P(Each, VectorFile, testing::ValuesIn(ListFiles()),
                         [](const auto& parameter) { return parameter.param; });

TEST(VectorTable, HasAVectorForEveryAdapter)
{
    std::set<std::string> recorded;
    for (const std::string& file : ListFiles())
        for (const Case& one : ReadFile(file))
            recorded.insert(one.name);
    const Table table = MakeTable();
    for (const auto& [name, entry] : table.Entries())
        EXPECT_NE(recorded.contains(name), adaptersWithoutVectors.contains(name)) << name;
}

} // namespace

} // namespace ZarnMath::Vectors
