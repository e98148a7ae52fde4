// Sampling a sparse field beside a dense grid of the same vectors with the same interpolation, at random positions and
// along scanlines, where 1 % and 100 % of each row was written. Both run in turn on the same positions; what counts are
// the ratios. "bytes" is the memory that the field or the grid holds.

#include "ZarnMath/VectorField.h"

#include <benchmark/benchmark.h>
#include <cmath>
#include <random>
#include <vector>

namespace ZarnMath {
namespace {

using Vector = vector2dT<float, false>;
using Position = vector2dT<float, true>;

constexpr std::size_t positionCount = 1 << 16;

/// Every cell stored, and the formulas of the field.
class DenseGrid
{
public:
    explicit DenseGrid(int size)
        : width(size), height(size), cells(static_cast<std::size_t>(size) * static_cast<std::size_t>(size))
    {}

    void SetVector(int x, int y, const Vector& value)
    {
        cells[IndexOf(x, y)] = value;
    }

    /// Not inlined, as the library's is not.
    [[gnu::noinline]] Vector Get(const Position& position) const
    {
        const float fx = Clamp(position.x - static_cast<float>(originX), static_cast<float>(width) - 2.0F);
        const float fy = Clamp(position.y - static_cast<float>(originY), static_cast<float>(height) - 2.0F);
        const int ix = static_cast<int>(fx);
        const int iy = static_cast<int>(fy);
        const float tx = fx - static_cast<float>(ix);
        const float ty = fy - static_cast<float>(iy);
        const Vector* cell = &cells[IndexOf(ix, iy)];
        const Vector lower = cell[0] + (cell[1] - cell[0]) * tx;
        cell += width;
        const Vector upper = cell[0] + (cell[1] - cell[0]) * tx;
        return lower + (upper - lower) * ty;
    }

    [[nodiscard]] std::size_t Bytes() const
    {
        return cells.capacity() * sizeof(Vector);
    }

private:
    static float Clamp(float v, float limit)
    {
        if (v < 0.0F)
            return 0.0F;
        return v <= limit ? v : limit;
    }

    [[nodiscard]] std::size_t IndexOf(int x, int y) const
    {
        return static_cast<std::size_t>(y) * static_cast<std::size_t>(width) + static_cast<std::size_t>(x);
    }

    int width;
    int height;
    int originX = 0;
    int originY = 0;
    std::vector<Vector> cells;
};

/// The library's field with what it holds.
class SparseField
{
public:
    explicit SparseField(int size)
    {
        field.Initialize(size, size, 0, 0);
    }

    void SetVector(int x, int y, const Vector& value)
    {
        field.SetVector(x, y, value);
    }

    [[nodiscard]] Vector Get(const Position& position) const
    {
        return field.Get(position);
    }

    [[nodiscard]] std::size_t Bytes() const
    {
        std::size_t bytes = field.rows.capacity() * sizeof(VectorField::Row);
        for (const VectorField::Row& row : field.rows)
            bytes += row.data.capacity() * sizeof(Vector);
        return bytes;
    }

private:
    VectorField field;
};

/// Writes a stroke across the grid: a part of each row, which wanders from row to row.
template <typename Grid>
void Paint(Grid& grid, int size, int percent)
{
    const int touched = std::max(1, size * percent / 100);
    for (int y = 0; y < size; ++y) {
        const double wander = 0.5 + 0.5 * std::sin(y * 0.01);
        const int start = static_cast<int>(wander * (size - touched));
        for (int x = start; x < start + touched; ++x)
            grid.SetVector(x, y, {static_cast<float>(x % 17), static_cast<float>(y % 13)});
    }
}

std::vector<Position> RandomPositions(int size)
{
    std::mt19937 engine(7);
    std::uniform_real_distribution<float> place(0.0F, static_cast<float>(size));
    std::vector<Position> positions(positionCount);
    for (Position& p : positions)
        p = {place(engine), place(engine)};
    return positions;
}

/// Left to right, row above row, by steps that are no whole cells.
std::vector<Position> ScanlinePositions(int size)
{
    std::vector<Position> positions(positionCount);
    Position p{0.0F, static_cast<float>(size) * 0.4F};
    for (Position& position : positions) {
        position = p;
        p.x += 0.7F;
        if (p.x > static_cast<float>(size))
            p = {0.0F, p.y + 0.7F};
    }
    return positions;
}

template <typename Grid>
void Sample(benchmark::State& state, const std::vector<Position>& positions)
{
    const int size = static_cast<int>(state.range(0));
    Grid grid(size);
    Paint(grid, size, static_cast<int>(state.range(1)));
    std::size_t next = 0;
    for (auto _ : state) {
        benchmark::DoNotOptimize(grid.Get(positions[next]));
        next = (next + 1) % positionCount;
    }
    state.counters["bytes"] = benchmark::Counter(static_cast<double>(grid.Bytes()), benchmark::Counter::kDefaults,
                                                 benchmark::Counter::OneK::kIs1024);
}

template <typename Grid>
void AtRandom(benchmark::State& state)
{
    Sample<Grid>(state, RandomPositions(static_cast<int>(state.range(0))));
}

template <typename Grid>
void AlongScanlines(benchmark::State& state)
{
    Sample<Grid>(state, ScanlinePositions(static_cast<int>(state.range(0))));
}

void Sizes(benchmark::internal::Benchmark* benchmark)
{
    benchmark->ArgNames({"size", "percent"});
    for (const int size : {256, 8192})
        for (const int percent : {1, 100})
            benchmark->Args({size, percent});
}

BENCHMARK_TEMPLATE(AtRandom, SparseField)->Apply(Sizes);
BENCHMARK_TEMPLATE(AtRandom, DenseGrid)->Apply(Sizes);
BENCHMARK_TEMPLATE(AlongScanlines, SparseField)->Apply(Sizes);
BENCHMARK_TEMPLATE(AlongScanlines, DenseGrid)->Apply(Sizes);

} // namespace
} // namespace ZarnMath
