/// @file
/// A sparse field beside a dense grid of the same vectors, and where to sample them.
#pragma once

#include "ZarnMath/VectorField.h"
#include "tests/Random.h"

#include <algorithm>
#include <cmath>
#include <vector>

namespace ZarnMath::Benchmarks {

using Vector = vector2dT<float, false>;
using Position = vector2dT<float, true>;

/// How many positions there are in a list, of either kind.
inline constexpr std::size_t positionCount = 1 << 16;

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

/// Anywhere in the grid.
inline std::vector<Position> RandomPositions(int size)
{
    RandomSource random(7);
    const auto place = [&] { return static_cast<float>(random.Uniform(0.0, size)); };
    std::vector<Position> positions(positionCount);
    for (Position& p : positions) {
        p.x = place();
        p.y = place();
    }
    return positions;
}

/// Left to right, row above row, by steps that are no whole cells.
inline std::vector<Position> ScanlinePositions(int size)
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

} // namespace ZarnMath::Benchmarks
