/// @file
/// A sparse grid of float vectors over a rectangle of the plane, sampled with bilinear interpolation.
///
/// @code
///        y
///        ^   row height-1   +---+---+---+---+  top
///        |                  |   |   |   |   |
///        |   row 0          +---+---+---+---+  bottom = originY
///        |             left = originX     right = originX + width - 1
///        +---------------------------------------> x
/// @endcode
///
/// The rectangle is inclusive on all four sides: cell (x, y) of the plane is column x - originX of row y - originY. The
/// sums of origins, sizes and offsets wrap in 32 bits, but for the sizes that are taken from a rectangle.
///
/// All functions are in the arithmetic class, the same bits on every machine. No locks: several threads may sample, and
/// use a field as the source of a blit, at once; everything else needs exclusive access.
#pragma once

#include "ZarnMath/Export.h"
#include "ZarnMath/ValueTypes.h"
#include "ZarnUtils/interval_vector.h"

#include <vector>

namespace ZarnMath {

/// The field. It owns its rows, each of which stores the span of its cells that was written; every other cell is the
/// zero vector. The exceptions of growing vectors pass through.
///
/// There are two states, empty (no rows, all four integers 0) and sized (`height` rows of `width` cells). A moved-from
/// field has no rows but keeps its four integers: it may only be assigned to, initialised or destroyed.
struct VectorField
{
    /// One row of the grid: the zero vector wherever nothing is stored.
    using Row = ZarnUtils::interval_vector<vector2dT<float, false>>;

    std::vector<Row> rows; ///< row 0 lies at the smallest y
    int width = 0;         ///< columns
    int height = 0;        ///< rows
    int originX = 0;       ///< x of column 0
    int originY = 0;       ///< y of row 0

    /// The empty field.
    VectorField() = default;
    /// A copy of its own, content and bounds.
    VectorField(const VectorField&) = default;
    ~VectorField() = default;

    /// A copy of its own of `other`, empty or not. If an exception comes out, the field is as it was.
    VectorField& operator=(const VectorField& other)
    {
        return *this = VectorField(other);
    }

    /// Takes over the rows of `other` and copies its four integers; it is left without rows.
    /// @arithmetic
    ZARNMATH_API VectorField(VectorField&& other) noexcept;

    /// The same; the rows that stood here are released, whether or not `other` has any.
    /// @arithmetic
    ZARNMATH_API VectorField& operator=(VectorField&& other) noexcept;

    /// @name Bounds
    /// @{

    /// Discards all content and sets the size and the origin.
    ///
    /// @param columns, lines the size; if either is below 1 the field becomes the empty one, and its row storage is
    ///                       released
    /// @param x, y           the origin
    /// @arithmetic
    ZARNMATH_API void Initialize(int columns, int lines, int x, int y);

    /// The same from an inclusive rectangle.
    ///
    /// @param rect the bounds; inside out in either direction, it makes the field empty. A size beyond 2147483647
    ///             counts as that
    /// @arithmetic
    ZARNMATH_API void Initialize(const RECT& rect);

    /// Empties every row and keeps its storage. Bounds stay; an empty field stays empty.
    /// @arithmetic
    ZARNMATH_API void ClearVectors() noexcept;

    /// Sets new bounds and keeps the content that lies inside them, in place in the plane. If an exception comes out,
    /// the field is as it was.
    ///
    /// @param rect the new bounds, as for `Initialize`; inside out, they make the field empty
    /// @return whether all of the old bounds lay inside rect; also true where the old field had no columns
    /// @arithmetic
    ZARNMATH_API bool Rebound(const RECT& rect);

    /// Grows the bounds to what `UnionRect` makes of them and a rectangle. That counts bounds one cell wide or high as
    /// empty: they are replaced.
    ///
    /// @param rect what the bounds are to hold
    /// @return whether the bounds changed
    /// @arithmetic
    ZARNMATH_API bool Extend(const RECT& rect);

    /// The bounds, inclusive: of the empty field left 0, top -1, right -1, bottom 0.
    /// @arithmetic
    [[nodiscard]] ZARNMATH_API RECT GetZGIRECT() const noexcept;

    /// @}
    /// @name Copying blocks
    /// The source may be the field itself, and then counts as a copy of it.
    /// @{

    /// Copies a field in, moved by an offset. Within the moved bounds of the source everything is overwritten, by its
    /// empty cells too; what falls outside these bounds is dropped.
    ///
    /// @param source the field to copy
    /// @param dx, dy the offset
    /// @return whether it fitted whole; true for a source without columns
    /// @arithmetic
    ZARNMATH_API bool Blit(const VectorField& source, int dx, int dy);

    /// Grows the bounds as by `Extend` to hold the moved source, and copies it in. An empty source leaves bounds of two
    /// cells or more each way as they are, and turns narrower ones into the empty field.
    ///
    /// @param source the field to copy
    /// @param dx, dy the offset
    /// @return whether the bounds changed
    /// @arithmetic
    ZARNMATH_API bool BlitExtend(const VectorField& source, int dx, int dy);

    /// A new field with what this one holds inside a rectangle.
    ///
    /// @param rect the rectangle, inclusive
    /// @return the overlap; the empty field where it is less than two cells wide or high. This field stays as it is
    /// @arithmetic
    [[nodiscard]] ZARNMATH_API VectorField GetRegion(const RECT& rect);

    /// @}
    /// @name Cells
    /// @{

    /// The vector at a position between cells, interpolated bilinearly in single precision.
    ///
    /// A position outside is moved to the nearest one inside, where inside ends at column `width` - 2 and row
    /// `height` - 2: the last column and the last row never carry weight. NaN counts as beyond that end.
    ///
    /// @param position in the plane; with a height of at least 2. With a width of 1 the zero vector comes out
    /// @return the vector. No allocation, no division, four reads
    /// @arithmetic
    [[nodiscard]] ZARNMATH_API vector2dT<float, false> Get(vector2dT<float, true> position) const noexcept;

    /// Writes one cell.
    ///
    /// @param x, y  its place in the plane; outside the bounds nothing is written
    /// @param value the vector
    void SetVector(int x, int y, vector2dT<float, false> value)
    {
        if (IsInside(x, y))
            rows[RowOf(y)].set(ColumnOf(x), value);
    }

    /// Reads one cell.
    ///
    /// @param x, y its place in the plane
    /// @return the vector; zero outside the bounds
    [[nodiscard]] vector2dT<float, false> GetVector(int x, int y) const noexcept
    {
        return IsInside(x, y) ? rows[RowOf(y)][ColumnOf(x)] : vector2dT<float, false>{};
    }

    /// @}

private:
    [[nodiscard]] std::uint64_t ColumnOf(int x) const noexcept
    {
        return static_cast<std::uint64_t>(std::int64_t{x} - originX);
    }

    [[nodiscard]] std::size_t RowOf(int y) const noexcept
    {
        return static_cast<std::size_t>(std::int64_t{y} - originY);
    }

    [[nodiscard]] bool IsInside(int x, int y) const noexcept
    {
        const std::int64_t column = std::int64_t{x} - originX;
        const std::int64_t row = std::int64_t{y} - originY;
        return column >= 0 && column < width && row >= 0 && row < height;
    }
};

} // namespace ZarnMath
