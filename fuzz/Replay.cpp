/// @file
/// Runs the targets over a corpus, without a fuzzer; and measures the medians that the work is held against.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include <algorithm>
#include <cmath>
#include <filesystem>
#include <fstream>
#include <iostream>
#include <iterator>
#include <random>
#include <string_view>

namespace {

namespace fs = std::filesystem;
using namespace ZarnMath::Fuzzing;
using Bytes = std::vector<std::uint8_t>;

Bytes ReadFile(const fs::path& path)
{
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

void Run(const Target& target, const Bytes& bytes)
{
    Input input(bytes.data(), bytes.size());
    target.run(input);
}

/// The files of a folder, in an order that does not depend on the file system.
std::vector<fs::path> FilesIn(const fs::path& folder)
{
    std::vector<fs::path> files;
    if (fs::is_directory(folder))
        for (const fs::directory_entry& entry : fs::directory_iterator(folder))
            files.push_back(entry.path());
    std::sort(files.begin(), files.end());
    return files;
}

/// @return the number of inputs
int RunCorpus(const fs::path& corpus)
{
    int count = 0;
    for (const Target& target : targets) {
        const std::vector<fs::path> files = FilesIn(corpus / target.name);
        Require(!files.empty(), "every target has a corpus");
        for (const fs::path& file : files) {
            std::clog << file.string() << '\n'; // the last line names the one that failed
            Run(target, ReadFile(file));
            ++count;
        }
    }
    return count;
}

void RunAtRandom()
{
    constexpr int inputs = 2000;
    constexpr std::size_t longest = 2000;
    for (const Target& target : targets) {
        std::mt19937_64 engine(20261121);
        for (int i = 0; i < inputs; ++i) {
            Bytes bytes(longest);
            for (std::uint8_t& byte : bytes)
                byte = static_cast<std::uint8_t>(engine());
            Run(target, bytes);
        }
    }
}

/// The medians of inputs drawn at random, as Medians.h lists them, and beside them how much more the corpus takes.
void Measure(const fs::path& corpus)
{
    StartMeasuring();
    RunAtRandom();
    FinishMeasuring();
    RunCorpus(corpus);
    for (const Budget* budget : AllBudgets())
        std::cout << "    {\"" << budget->function << "\", " << budget->median << "}, // at most "
                  << std::ceil(budget->largest / budget->median) << " times that\n";
}

int PrintUsage()
{
    std::cerr << "usage: ReplayCorpus CORPUS            runs every target over its folder of the corpus\n"
                 "       ReplayCorpus TARGET FILE...    runs one target over files\n"
                 "       ReplayCorpus --measure CORPUS  prints the median of the steps of every function\n";
    return 2;
}

int RunFiles(std::string_view name, char** files, int count)
{
    for (const Target& target : targets) {
        if (name == target.name) {
            for (int i = 0; i < count; ++i)
                Run(target, ReadFile(files[i]));
            return 0;
        }
    }
    return PrintUsage();
}

} // namespace

int main(int argc, char** argv)
{
    if (argc == 2) {
        std::clog.setstate(std::ios::failbit);
        std::cout << RunCorpus(argv[1]) << " inputs\n";
        return 0;
    }
    if (argc == 3 && std::string_view(argv[1]) == "--measure") {
        Measure(argv[2]);
        return 0;
    }
    return argc < 3 ? PrintUsage() : RunFiles(argv[1], argv + 2, argc - 2);
}
