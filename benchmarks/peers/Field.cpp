// A sparse field sampled at random positions and along scanlines, beside a dense grid, whose cells stand in one array and
// are found by their index. A hundredth of each row was written, or all of it; the grid's time does not depend on that.

#include "benchmarks/FieldGrids.h"
#include "benchmarks/peers/Questions.h"

namespace ZarnMath::Peers {
namespace {

using namespace Benchmarks;

template <typename Grid>
Grid Painted(int size, int percent)
{
    Grid grid(size);
    Paint(grid, size, percent);
    return grid;
}

/// The largest coordinate by which two grids differ at any of the positions.
double LargestDifference(const SparseField& field, const DenseGrid& grid, const std::vector<Position>& positions)
{
    double largest = 0.0;
    for (const Position& p : positions) {
        const Vector difference = field.Get(p) - grid.Get(p);
        largest = std::max<double>({largest, std::fabs(difference.x), std::fabs(difference.y)});
    }
    return largest;
}

void AskForField(int size, int percent)
{
    const auto field = Painted<SparseField>(size, percent);
    const auto grid = Painted<DenseGrid>(size, percent);
    const auto ask = [&](const std::string& where, const std::vector<Position>& positions) {
        Question question("field sampled " + where + ", " + std::to_string(size) + ", " + std::to_string(percent) +
                              " %",
                          positions.size());
        const auto add = [&](const char* library, const auto& cells, double error) {
            question.Add(library, "", [&](std::size_t i) { return cells.Get(positions[i]); },
                         {{"largest error", error}, {"bytes", static_cast<double>(cells.Bytes())}});
        };
        add("ZarnMath", field, LargestDifference(field, grid, positions));
        add("dense grid", grid, 0.0);
        question.Ask();
    };
    ask("at random", RandomPositions(size));
    ask("along scanlines", ScanlinePositions(size));
}

} // namespace

void AskForField()
{
    for (const int size : {256, 8192})
        for (const int percent : {1, 100})
            AskForField(size, percent);
}

} // namespace ZarnMath::Peers
