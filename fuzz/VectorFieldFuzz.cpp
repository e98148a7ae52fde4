/// @file
/// The sparse vector and the vector field, held against dense models.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include "ZarnMath/Bounds.h"
#include "ZarnMath/VectorField.h"

#include <algorithm>
#include <utility>

namespace ZarnMath::Fuzzing {

namespace {

using Sparse = ZarnUtils::interval_vector<int>;
using Vector = vector2dT<float, false>;

/// @name The sparse vector
/// @{

constexpr int mostCells = 200;

struct SparseWithModel
{
    Sparse sparse;
    std::vector<int> cells;

    SparseWithModel(int fill, int length)
        : sparse(fill, static_cast<std::uint64_t>(length)), cells(static_cast<std::size_t>(length), fill)
    {}

    void Check() const
    {
        Require(sparse.start <= sparse.end && sparse.end <= sparse.length, "the run lies within the length");
        Require(sparse.data.size() == sparse.end - sparse.start, "it holds its cells");
        Require(sparse.data.capacity() <= sparse.length, "storage is never beyond the length");
        for (std::size_t i = 0; i < cells.size(); ++i)
            Require(sparse[i] == cells[i], "every cell reads as it was written");
        Require(sparse[sparse.length] == sparse.fill && sparse[~std::uint64_t{0}] == sparse.fill,
                "beyond the length it reads as its fill");
    }

    void Set(std::uint64_t i, int value)
    {
        if (i >= cells.size())
            return;
        sparse.set(i, value);
        cells[i] = value;
    }

    void Clear(std::uint64_t from, std::uint64_t to)
    {
        sparse.clear_section(from, to);
        for (std::uint64_t i = from; i < std::min<std::uint64_t>(to, cells.size()); ++i)
            cells[i] = sparse.fill;
    }

    void Blit(const SparseWithModel& other, std::int64_t offset)
    {
        const std::vector<int> source = other.cells;
        const Sparse run = other.sparse;
        Bounded("interval_vector::fast_blit_from_another",
                [&] { sparse.fast_blit_from_another(other.sparse, offset); });
        if (offset <= -mostCells || offset >= mostCells)
            return; // nothing of the other one lands here
        for (std::size_t i = 0; i < cells.size(); ++i) {
            const std::int64_t from = static_cast<std::int64_t>(i) - offset;
            const auto place = static_cast<std::uint64_t>(from);
            if (from >= 0 && place < source.size())
                cells[i] = run.start <= place && place < run.end ? source[place] : sparse.fill;
        }
    }
};

/// Mostly small, but any 64 bits occur.
std::uint64_t ReadIndex(Input& input)
{
    if (input.Choice(8) != 0)
        return input.Byte() % (mostCells + 2);
    const auto high = static_cast<std::uint32_t>(input.Int());
    return std::uint64_t{high} << 32 | static_cast<std::uint32_t>(input.Int());
}

void FuzzSparse(Input& input)
{
    SparseWithModel pair[2] = {{input.Byte(), input.Byte() % mostCells}, {input.Byte(), input.Byte() % mostCells}};
    for (int step = 0; step < 60 && input.HasMore(); ++step) {
        const int which = input.Choice(2);
        SparseWithModel& target = pair[which];
        switch (input.Choice(6)) {
        case 0: {
            const std::uint64_t i = ReadIndex(input);
            target.Set(i, input.Byte());
            break;
        }
        case 1: {
            const std::uint64_t from = ReadIndex(input);
            target.Clear(from, ReadIndex(input));
            break;
        }
        case 2: {
            const std::uint64_t from = std::min(ReadIndex(input), target.sparse.length);
            const std::uint64_t to = std::min(ReadIndex(input), target.sparse.length);
            const Sparse before = target.sparse;
            const bool hasChanged = target.sparse.extend(from, to);
            Require(hasChanged || target.sparse.data == before.data, "where nothing changes nothing is stored");
            Require(from >= to || (target.sparse.start <= from && to <= target.sparse.end), "the run covers the cells");
            break;
        }
        case 3:
            target.Blit(pair[1 - which], static_cast<std::int64_t>(ReadIndex(input) - mostCells / 2));
            break;
        case 4:
            target.Blit(target, static_cast<std::int64_t>(ReadIndex(input) - mostCells / 2));
            break;
        default:
            target.Blit(pair[1 - which], static_cast<std::int8_t>(input.Byte()));
            break;
        }
        target.Check();
    }
}

/// @}
/// @name The field near the origin, with a dense model
/// @{

constexpr int mostSide = 40;

struct Model
{
    int x = 0;
    int y = 0;
    int width = 0;
    int height = 0;
    std::vector<Vector> cells;

    void Initialize(int columns, int lines, int left, int bottom)
    {
        *this = {};
        if (columns < 1 || lines < 1)
            return;
        x = left;
        y = bottom;
        width = columns;
        height = lines;
        cells.resize(static_cast<std::size_t>(width * height));
    }

    [[nodiscard]] bool IsInside(int px, int py) const noexcept
    {
        return px >= x && px < x + width && py >= y && py < y + height;
    }

    [[nodiscard]] Vector& At(int px, int py)
    {
        return cells[static_cast<std::size_t>((py - y) * width + px - x)];
    }

    void Blit(Model source, int dx, int dy)
    {
        for (int py = source.y; py < source.y + source.height; ++py)
            for (int px = source.x; px < source.x + source.width; ++px)
                if (IsInside(px + dx, py + dy))
                    At(px + dx, py + dy) = source.At(px, py);
    }

    /// Whether a field moved lies within.
    [[nodiscard]] bool Holds(const Model& source, int dx, int dy) const noexcept
    {
        return source.x + dx >= x && source.y + dy >= y && source.x + dx + source.width <= x + width &&
               source.y + dy + source.height <= y + height;
    }
};

void CheckRows(const VectorField& field)
{
    Require(field.rows.size() == static_cast<std::size_t>(field.height), "a row for each line");
    for (const VectorField::Row& row : field.rows) {
        Require(row.length == static_cast<std::uint64_t>(field.width), "every row has the width");
        Require(row.start <= row.end && row.end <= row.length && row.data.size() == row.end - row.start,
                "its run lies within");
    }
}

struct FieldWithModel
{
    VectorField field;
    Model model;

    void CheckBounds() const
    {
        CheckRows(field);
        Require(field.width == model.width && field.height == model.height && field.originX == model.x &&
                    field.originY == model.y,
                "the bounds are as asked for");
    }

    void CheckCells()
    {
        for (int py = model.y - 1; py <= model.y + model.height; ++py) {
            for (int px = model.x - 1; px <= model.x + model.width; ++px) {
                const Vector expected = model.IsInside(px, py) ? model.At(px, py) : Vector{};
                Require(IsSame(field.GetVector(px, py), expected), "every cell reads as it was written");
            }
        }
    }

    void Rebound(const RECT& rect)
    {
        Model rebound;
        rebound.Initialize(rect.right - rect.left + 1, rect.top - rect.bottom + 1, rect.left, rect.bottom);
        const bool hadCells = model.width > 0;
        const bool isComplete = Bounded(
            "VectorField::Rebound", [&] { return field.Rebound(rect); },
            field.height + 1 + std::max(0, rect.top - rect.bottom + 1));
        Require(isComplete == (!hadCells || (rebound.width > 0 && rebound.Holds(model, 0, 0))),
                "whether all of the old bounds lay inside");
        rebound.Blit(model, 0, 0);
        model = rebound;
    }

    /// Extends the model as the field has been, which follows `UnionRect`.
    void Follow()
    {
        Model grown;
        grown.Initialize(field.width, field.height, field.originX, field.originY);
        grown.Blit(model, 0, 0);
        model = grown;
    }
};

RECT ReadRect(Input& input)
{
    const int left = static_cast<std::int8_t>(input.Byte());
    const int bottom = static_cast<std::int8_t>(input.Byte());
    const int width = input.Choice(mostSide + 3) - 2;
    return {left, bottom + input.Choice(mostSide + 3) - 3, left + width - 1, bottom};
}

void Fill(FieldWithModel& target, Input& input)
{
    for (int count = input.Choice(12); count > 0; --count) {
        const int x = target.field.originX + input.Choice(mostSide + 2) - 1;
        const int y = target.field.originY + input.Choice(mostSide + 2) - 1;
        const Vector value{static_cast<float>(input.Byte()), static_cast<float>(input.Byte())};
        target.field.SetVector(x, y, value);
        if (target.model.IsInside(x, y))
            target.model.At(x, y) = value;
    }
}

void CheckSamples(FieldWithModel& target, Input& input)
{
    const VectorField& field = target.field;
    if (field.height < 2)
        return;
    const auto x = static_cast<float>(static_cast<std::int16_t>(input.Byte() | input.Byte() << 8)) / 64.0F;
    const auto y = static_cast<float>(static_cast<std::int16_t>(input.Byte() | input.Byte() << 8)) / 64.0F;
    const Vector sample = field.Get({x, y});
    Require(0.0F <= sample.x && sample.x <= 255.01F && 0.0F <= sample.y && sample.y <= 255.01F,
            "an interpolated vector lies between its neighbours");
    const int column = field.originX + input.Choice(mostSide);
    const int row = field.originY + input.Choice(mostSide);
    if (column < field.originX + field.width - 1 && row < field.originY + field.height - 1)
        Require(IsSame(field.Get({static_cast<float>(column), static_cast<float>(row)}), field.GetVector(column, row)),
                "at a cell the sample is the cell");
}

/// Whether the bounds of a field and a rectangle have another union than these bounds.
bool UnionGrows(const VectorField& field, const RECT& rect)
{
    RECT united = field.GetZGIRECT();
    UnionRect(united, rect);
    return !(united == field.GetZGIRECT());
}

void ChangeBlocks(FieldWithModel& target, FieldWithModel& other, Input& input)
{
    const int dx = static_cast<std::int8_t>(input.Byte());
    const int dy = static_cast<std::int8_t>(input.Byte());
    FieldWithModel& source = input.Flag() ? target : other;
    const Model sourceModel = source.model;
    const double size = 1.0 + source.field.height + target.field.height;
    switch (input.Choice(3)) {
    case 0: {
        const bool fitted = Bounded(
            "VectorField::Blit", [&] { return target.field.Blit(source.field, dx, dy); }, size);
        Require(fitted ==
                    (sourceModel.width < 1 || (target.model.width > 0 && target.model.Holds(sourceModel, dx, dy))),
                "whether it fitted whole");
        target.model.Blit(sourceModel, dx, dy);
        break;
    }
    case 1: {
        if (std::max(target.field.height, target.field.width) > 100)
            return;
        RECT moved = source.field.GetZGIRECT();
        TranslateRect(moved, dx, dy);
        const bool grows = UnionGrows(target.field, moved);
        Require(target.field.BlitExtend(source.field, dx, dy) == grows, "whether the bounds grow");
        target.Follow();
        target.model.Blit(sourceModel, dx, dy);
        break;
    }
    default: {
        const RECT rect = ReadRect(input);
        FieldWithModel region;
        region.field = Bounded(
            "VectorField::GetRegion", [&] { return target.field.GetRegion(rect); }, size);
        region.Follow();
        region.model.Blit(target.model, 0, 0);
        region.CheckBounds();
        region.CheckCells();
        break;
    }
    }
}

void FuzzNearOrigin(Input& input)
{
    FieldWithModel fields[2];
    for (int step = 0; step < 40 && input.HasMore(); ++step) {
        const int which = input.Choice(2);
        FieldWithModel& target = fields[which];
        FieldWithModel& other = fields[1 - which];
        switch (input.Choice(8)) {
        case 0: {
            const RECT rect = ReadRect(input);
            target.field.Initialize(rect);
            target.model.Initialize(rect.right - rect.left + 1, rect.top - rect.bottom + 1, rect.left, rect.bottom);
            break;
        }
        case 1:
            target.Rebound(ReadRect(input));
            break;
        case 2: {
            const RECT rect = ReadRect(input);
            const bool grows = UnionGrows(target.field, rect);
            Require(target.field.Extend(rect) == grows, "whether the bounds grow");
            target.Follow();
            break;
        }
        case 3:
            target.field.ClearVectors();
            std::fill(target.model.cells.begin(), target.model.cells.end(), Vector{});
            break;
        case 4:
            target.field = std::move(other.field);
            target.model = other.model;
            other.field.Initialize(0, 0, 0, 0);
            other.model = {};
            break;
        case 5:
            CheckSamples(target, input);
            break;
        case 6:
            ChangeBlocks(target, other, input);
            break;
        default:
            Fill(target, input);
            break;
        }
        target.CheckBounds();
    }
    for (FieldWithModel& field : fields) // all of the cells, once: what goes wrong on the way does not heal
        field.CheckCells();
}

/// @}

/// Anywhere in the plane, as wide as there are integers. Only one of two fields holds anything, so that no span of cells
/// between two distant ones has to be stored.
void FuzzFarAway(Input& input)
{
    constexpr int mostLines = 60;
    const int x = input.Int();
    const int y = input.Int();
    VectorField source;
    source.Initialize(input.Int(), input.Choice(mostLines), x, y);
    CheckRows(source);
    const int base = input.Int();
    for (int count = input.Choice(10); count > 0; --count) {
        const auto column = static_cast<int>(static_cast<unsigned>(base) + input.Byte());
        const auto row = static_cast<int>(static_cast<unsigned>(source.originY) + input.Byte() % mostLines);
        if (column >= base)
            source.SetVector(column, row, {1.0F, 2.0F});
    }
    CheckRows(source);

    VectorField target;
    const int left = input.Int();
    const int bottom = input.Int();
    target.Initialize(input.Int(), input.Choice(mostLines), left, bottom);
    const int dx = input.Int();
    const int dy = input.Int();
    target.Blit(source, dx, dy);
    CheckRows(target);
    (void)target.GetZGIRECT();

    const auto height = static_cast<int>(static_cast<unsigned>(input.Choice(mostLines)) - 2U);
    const auto top = static_cast<int>(static_cast<unsigned>(bottom) + static_cast<unsigned>(height));
    const RECT rect{left, top, input.Int(), bottom};
    if (std::int64_t{top} - bottom < mostLines) {
        source.Rebound(rect);
        CheckRows(source);
        CheckRows(source.GetRegion(target.GetZGIRECT()));
    }
    for (int i = 0; i < 4; ++i) {
        const double px = input.Double();
        const double py = input.Double();
        constexpr double limit = 3e38;
        const vector2dT<float, true> place{static_cast<float>(std::clamp(px, -limit, limit)),
                                           static_cast<float>(std::clamp(py, -limit, limit))};
        if (source.height >= 2)
            (void)Bounded("VectorField::Get", [&] { return source.Get(place); });
    }
}

} // namespace

void FuzzVectorField(Input& input)
{
    switch (input.Choice(3)) {
    case 0:
        FuzzSparse(input);
        break;
    case 1:
        FuzzNearOrigin(input);
        break;
    default:
        FuzzFarAway(input);
        break;
    }
}

} // namespace ZarnMath::Fuzzing
