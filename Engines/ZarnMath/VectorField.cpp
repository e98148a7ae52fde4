#include "ZarnMath/VectorField.h"

#include "ZarnMath/Bounds.h"
#include "ZarnMath/ValueTypesInternal.h"

#include <algorithm>
#include <cstring>
#include <utility>

namespace ZarnMath {

namespace {

using Vector = vector2dT<float, false>;

/// The number of cells from low to high, both included: 0 where they are inside out, at most the largest integer.
int CellsBetween(int low, int high) noexcept
{
    const std::int64_t cells = std::int64_t{high} - low + 1;
    return static_cast<int>(std::clamp<std::int64_t>(cells, 0, std::numeric_limits<int>::max()));
}

/// The inclusive bounds of a grid.
RECT BoundsFrom(int x, int y, int width, int height) noexcept
{
    return {x, WrappingSubtract(WrappingAdd(y, height), 1), WrappingSubtract(WrappingAdd(x, width), 1), y};
}

/// Both coordinates of a position: one instruction works on the two side by side, each with its own rounding.
using FloatPair = float __attribute__((vector_size(8)));

FloatPair LoadPair(const vector2dT<float, true>& v) noexcept
{
    FloatPair p;
    std::memcpy(&p, &v, sizeof p);
    return p;
}

/// Into [0, limit]; NaN, which is not below 0 and not within the limit, becomes the limit.
FloatPair Clamp(FloatPair v, FloatPair limit) noexcept
{
    return v < FloatPair{} ? FloatPair{} : (v <= limit ? v : limit);
}

Vector Interpolate(const Vector& a, const Vector& b, float t) noexcept
{
    return a + (b - a) * t;
}

/// Between columns i and i + 1 of a row. A column before the first one, and one beyond the last, reads as zero.
Vector InterpolateColumns(const VectorField::Row& row, std::int64_t i, float t) noexcept
{
    const auto column = static_cast<std::uint64_t>(i);
    if (static_cast<std::int64_t>(row.start) <= i && i + 1 < static_cast<std::int64_t>(row.end)) {
        const Vector* cell = row.data.data() + (column - row.start);
        return Interpolate(cell[0], cell[1], t);
    }
    return Interpolate(row[column], row[column + 1], t);
}

} // namespace

VectorField::VectorField(VectorField&& other) noexcept
    : rows(std::move(other.rows)), width(other.width), height(other.height), originX(other.originX),
      originY(other.originY)
{}

VectorField& VectorField::operator=(VectorField&& other) noexcept
{
    rows = std::exchange(other.rows, {});
    width = other.width;
    height = other.height;
    originX = other.originX;
    originY = other.originY;
    return *this;
}

void VectorField::Initialize(int columns, int lines, int x, int y)
{
    const bool hasCells = columns >= 1 && lines >= 1;
    rows.clear();
    // Until the rows stand the field is the empty one, and so it stays if there is no memory for them.
    width = height = originX = originY = 0;
    if (!hasCells) {
        std::vector<Row>().swap(rows);
        return;
    }
    rows.resize(static_cast<std::size_t>(lines), Row(Vector{}, static_cast<std::uint64_t>(columns)));
    width = columns;
    height = lines;
    originX = x;
    originY = y;
}

void VectorField::Initialize(const RECT& rect)
{
    Initialize(CellsBetween(rect.left, rect.right), CellsBetween(rect.bottom, rect.top), rect.left, rect.bottom);
}

void VectorField::ClearVectors() noexcept
{
    for (Row& row : rows)
        row.clear_section(row.start, row.end);
}

bool VectorField::Rebound(const RECT& rect)
{
    VectorField rebound;
    rebound.Initialize(rect);
    const bool isComplete = rebound.Blit(*this, 0, 0);
    *this = std::move(rebound);
    return isComplete;
}

bool VectorField::Extend(const RECT& rect)
{
    const RECT bounds = GetZGIRECT();
    RECT united = bounds;
    UnionRect(united, rect);
    if (united == bounds)
        return false;
    Rebound(united);
    return true;
}

RECT VectorField::GetZGIRECT() const noexcept
{
    return BoundsFrom(originX, originY, width, height);
}

bool VectorField::Blit(const VectorField& source, int dx, int dy)
{
    if (&source == this)
        return Blit(VectorField(source), dx, dy);
    if (source.width < 1 || source.height < 0)
        return true;
    if (width < 1 || height < 1)
        return false;
    const int ox = WrappingAdd(WrappingSubtract(source.originX, originX), dx);
    const int oy = WrappingAdd(WrappingSubtract(source.originY, originY), dy);
    if (ox >= width || oy >= height)
        return false;
    const int endX = WrappingAdd(ox, source.width);
    const int endY = WrappingAdd(oy, source.height);
    for (int r = std::max(oy, 0); r < std::min(height, endY); ++r)
        rows[static_cast<std::size_t>(r)].fast_blit_from_another(source.rows[static_cast<std::size_t>(r - oy)], ox);
    return ox >= 0 && oy >= 0 && endY <= height && endX <= width;
}

bool VectorField::BlitExtend(const VectorField& source, int dx, int dy)
{
    if (&source == this)
        return BlitExtend(VectorField(source), dx, dy);
    const bool hasGrown = Extend(
        BoundsFrom(WrappingAdd(source.originX, dx), WrappingAdd(source.originY, dy), source.width, source.height));
    Blit(source, dx, dy);
    return hasGrown;
}

VectorField VectorField::GetRegion(const RECT& rect)
{
    VectorField region;
    RECT shared = GetZGIRECT();
    if (height < 1 || width < 1 || !IntersectRect(shared, rect))
        return region;
    region.Initialize(shared);
    region.Blit(*this, 0, 0);
    return region;
}

Vector VectorField::Get(vector2dT<float, true> position) const noexcept
{
    const FloatPair origin{static_cast<float>(originX), static_cast<float>(originY)};
    const FloatPair size{static_cast<float>(width), static_cast<float>(height)};
    const FloatPair f = Clamp(LoadPair(position) - origin, size - 2.0F);
    // A size above 2^24 can round upward as a float. 64 bits hold any column then, and the last row stands in for those
    // beyond it.
    const auto ix = static_cast<std::int64_t>(f[0]);
    const auto iy = static_cast<std::int64_t>(f[1]);
    const float tx = f[0] - static_cast<float>(ix);
    const float ty = f[1] - static_cast<float>(iy);
    const std::int64_t last = std::int64_t{height} - 1;
    const Row* lower = rows.data() + std::min(iy, last);
    const Row* upper = lower + (iy < last ? 1 : 0);
    return Interpolate(InterpolateColumns(*lower, ix, tx), InterpolateColumns(*upper, ix, tx), ty);
}

} // namespace ZarnMath
