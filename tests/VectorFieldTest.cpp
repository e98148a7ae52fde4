#include "ZarnMath/VectorField.h"

#include "ZarnMath/Bounds.h"
#include "tests/CountingHeap.h"
#include "tests/DenseRow.h"

#include <cstring>
#include <random>
#include <type_traits>

namespace ZarnMath {
namespace {

using Vector = vector2dT<float, false>;
using Position = vector2dT<float, true>;

constexpr std::int32_t smallest = std::numeric_limits<std::int32_t>::min();
constexpr std::int32_t largest = std::numeric_limits<std::int32_t>::max();
constexpr float nan = std::numeric_limits<float>::quiet_NaN();
constexpr float infinity = std::numeric_limits<float>::infinity();

VectorField FieldOf(int width, int height, int x, int y)
{
    VectorField field;
    field.Initialize(width, height, x, y);
    return field;
}

/// Every cell tells its place in the plane.
VectorField FullField(int width, int height, int x, int y)
{
    VectorField field = FieldOf(width, height, x, y);
    for (int row = y; row < y + height; ++row)
        for (int column = x; column < x + width; ++column)
            field.SetVector(column, row, {static_cast<float>(column), static_cast<float>(row)});
    return field;
}

void ExpectEmpty(const VectorField& field)
{
    EXPECT_TRUE(field.rows.empty());
    EXPECT_EQ(field.rows.capacity(), 0U);
    EXPECT_EQ(field.width, 0);
    EXPECT_EQ(field.height, 0);
    EXPECT_EQ(field.originX, 0);
    EXPECT_EQ(field.originY, 0);
}

void ExpectSize(const VectorField& field, int width, int height, int x, int y)
{
    EXPECT_EQ(field.width, width);
    EXPECT_EQ(field.height, height);
    EXPECT_EQ(field.originX, x);
    EXPECT_EQ(field.originY, y);
    ASSERT_EQ(field.rows.size(), static_cast<std::size_t>(height));
    for (const auto& row : field.rows)
        EXPECT_EQ(row.length, static_cast<std::uint64_t>(width));
}

/// The cells within a rectangle tell their place, and all others are zero.
void ExpectFullWithin(const VectorField& field, const RECT& rect)
{
    const RECT bounds = field.GetZGIRECT();
    for (int y = bounds.bottom; y <= bounds.top; ++y)
        for (int x = bounds.left; x <= bounds.right; ++x) {
            const bool isFull = x >= rect.left && x <= rect.right && y >= rect.bottom && y <= rect.top;
            const Vector expected = isFull ? Vector{static_cast<float>(x), static_cast<float>(y)} : Vector{};
            ASSERT_EQ(field.GetVector(x, y), expected) << x << ", " << y;
        }
}

bool HasSameContent(const VectorField& a, const VectorField& b)
{
    const auto isSame = [](const VectorField::Row& r, const VectorField::Row& s) {
        return r.fill == s.fill && r.start == s.start && r.end == s.end && r.length == s.length && r.data == s.data;
    };
    return a.GetZGIRECT() == b.GetZGIRECT() &&
           std::equal(a.rows.begin(), a.rows.end(), b.rows.begin(), b.rows.end(), isSame);
}

TEST(VectorField, DefaultIsEmpty)
{
    ExpectEmpty(VectorField());
    EXPECT_EQ(VectorField().GetZGIRECT(), (RECT{0, -1, -1, 0}));
}

TEST(VectorField, FieldsStandInOrder)
{
    EXPECT_TRUE((std::is_same_v<decltype(VectorField::rows), std::vector<ZarnUtils::interval_vector<Vector>>>));
    EXPECT_LT(offsetof(VectorField, rows), offsetof(VectorField, width));
    EXPECT_LT(offsetof(VectorField, width), offsetof(VectorField, height));
    EXPECT_LT(offsetof(VectorField, height), offsetof(VectorField, originX));
    EXPECT_LT(offsetof(VectorField, originX), offsetof(VectorField, originY));
    EXPECT_TRUE(std::is_nothrow_move_constructible_v<VectorField>);
    EXPECT_TRUE(std::is_nothrow_move_assignable_v<VectorField>);
}

TEST(VectorField, InitializeSetsSizeAndOrigin)
{
    const VectorField field = FieldOf(4, 3, -2, 5);
    ExpectSize(field, 4, 3, -2, 5);
    for (const auto& row : field.rows) {
        EXPECT_EQ(row.fill, (Vector{0.0F, 0.0F}));
        EXPECT_EQ(row.start, 0U);
        EXPECT_EQ(row.end, 0U);
    }
    EXPECT_EQ(field.GetZGIRECT(), (RECT{-2, 7, 1, 5}));
}

TEST(VectorField, InitializeDiscardsContentAndKeepsTheStorageOfRows)
{
    VectorField field = FullField(4, 8, 0, 0);
    const std::size_t capacity = field.rows.capacity();
    field.Initialize(5, 3, 1, 1);
    ExpectSize(field, 5, 3, 1, 1);
    ExpectFullWithin(field, GetEmptyRect());
    EXPECT_EQ(field.rows.capacity(), capacity);
}

TEST(VectorField, InitializeWithASizeBelowOneEmpties)
{
    constexpr int sizes[][2] = {{0, 3}, {3, 0}, {-1, 3}, {3, -1}, {0, 0}, {smallest, smallest}};
    for (const auto& size : sizes) {
        VectorField field = FullField(4, 3, 7, 7);
        field.Initialize(size[0], size[1], 5, 6);
        ExpectEmpty(field);
    }
}

TEST(VectorField, InitializeFromAnInclusiveRectangle)
{
    VectorField field;
    field.Initialize(RECT{-2, 7, 1, 5});
    ExpectSize(field, 4, 3, -2, 5);
    field.Initialize(RECT{4, 9, 4, 9});
    ExpectSize(field, 1, 1, 4, 9);
}

TEST(VectorField, InitializeFromARectangleInsideOutEmpties)
{
    const RECT rects[] = {GetEmptyRect(),
                          {0, -1, -1, 0},
                          {5, 9, 4, 0},
                          {0, 3, 9, 4},
                          {largest, 5, smallest, 0}, // its width would wrap to 2
                          {0, smallest, 5, largest}};
    for (const RECT& rect : rects) {
        VectorField field = FullField(4, 3, 7, 7);
        field.Initialize(rect);
        ExpectEmpty(field);
    }
}

TEST(VectorField, InitializeFromARectangleOfMoreColumnsThanAnInteger)
{
    VectorField field;
    field.Initialize(RECT{smallest, 1, largest, 0});
    ExpectSize(field, largest, 2, smallest, 0);
    field.Initialize(RECT{-2, 1, largest, 0}); // 2^31 + 2 of them
    ExpectSize(field, largest, 2, -2, 0);
    field.Initialize(RECT{1, 1, largest, 0}); // just as many as fit
    ExpectSize(field, largest, 2, 1, 0);
}

TEST(VectorField, InitializeWithoutMemoryLeavesTheFieldEmpty)
{
    VectorField field = FullField(4, 3, 7, 7);
    {
        const auto scarcity = HeapWatch::WithoutBlocksAbove(1000);
        EXPECT_THROW(field.Initialize(10, 1000, 1, 2), std::bad_alloc);
    }
    EXPECT_TRUE(field.rows.empty());
    EXPECT_EQ(field.GetZGIRECT(), (RECT{0, -1, -1, 0}));
}

TEST(VectorField, CellsAreWrittenAndReadAtTheirPlace)
{
    VectorField field = FieldOf(4, 3, -2, 5);
    field.SetVector(-1, 6, {1.0F, 2.0F});
    EXPECT_EQ(field.rows[1].start, 1U);
    EXPECT_EQ(field.rows[1].end, 2U);
    EXPECT_EQ(field.rows[1].data[0], (Vector{1.0F, 2.0F}));
    EXPECT_EQ(field.GetVector(-1, 6), (Vector{1.0F, 2.0F}));
    EXPECT_EQ(field.GetVector(-1, 5), (Vector{}));
    EXPECT_EQ(field.GetVector(0, 6), (Vector{}));
}

TEST(VectorField, CellsOutsideAreZeroAndCannotBeWritten)
{
    VectorField field = FullField(4, 3, -2, 5);
    const VectorField before = field;
    constexpr int places[][2] = {{-3, 6},       {2, 6},       {0, 4},        {0, 8},
                                 {smallest, 6}, {largest, 6}, {0, smallest}, {0, largest}};
    for (const auto& place : places) {
        EXPECT_EQ(field.GetVector(place[0], place[1]), (Vector{}));
        field.SetVector(place[0], place[1], {9.0F, 9.0F});
    }
    EXPECT_TRUE(HasSameContent(field, before));
    VectorField empty;
    empty.SetVector(0, 0, {1.0F, 1.0F});
    EXPECT_EQ(empty.GetVector(0, 0), (Vector{}));
}

TEST(VectorField, ClearKeepsBoundsAndStorage)
{
    VectorField field = FullField(6, 4, 1, 2);
    field.ClearVectors();
    ExpectSize(field, 6, 4, 1, 2);
    ExpectFullWithin(field, GetEmptyRect());
    for (const auto& row : field.rows) {
        EXPECT_EQ(row.start, 0U);
        EXPECT_EQ(row.end, 0U);
    }
    const auto refill = [&field] {
        for (int x = 1; x <= 6; ++x)
            field.SetVector(x, 3, {1.0F, 1.0F});
    };
    EXPECT_EQ(AllocationsOf(refill), 0);
}

TEST(VectorField, ReboundKeepsWhatOverlapsInPlace)
{
    VectorField field = FullField(6, 5, 0, 0);
    EXPECT_FALSE(field.Rebound({3, 9, 12, 2}));
    ExpectSize(field, 10, 8, 3, 2);
    ExpectFullWithin(field, {3, 4, 5, 2});
    EXPECT_EQ(field.GetVector(5, 4), (Vector{5.0F, 4.0F}));
}

TEST(VectorField, ReboundTellsWhetherAllStayed)
{
    const VectorField field = FullField(6, 5, 0, 0);
    const auto rebounds = [&field](const RECT& rect) {
        VectorField copy = field;
        return copy.Rebound(rect);
    };
    EXPECT_TRUE(rebounds({0, 4, 5, 0}));
    EXPECT_TRUE(rebounds({-1, 5, 6, -1}));
    EXPECT_FALSE(rebounds({1, 4, 5, 0}));
    EXPECT_FALSE(rebounds({0, 3, 5, 0}));
    EXPECT_FALSE(rebounds({0, 4, 4, 0}));
    EXPECT_FALSE(rebounds({0, 4, 5, 1}));
    EXPECT_FALSE(rebounds({20, 30, 30, 20}));
}

TEST(VectorField, ReboundToNothing)
{
    VectorField field = FullField(6, 5, 0, 0);
    EXPECT_FALSE(field.Rebound(GetEmptyRect()));
    ExpectEmpty(field);
    EXPECT_TRUE(field.Rebound(GetEmptyRect())); // nothing was lost
    ExpectEmpty(field);
    EXPECT_TRUE(field.Rebound({0, 3, 3, 0}));
    ExpectSize(field, 4, 4, 0, 0);
}

TEST(VectorField, ReboundWithoutMemoryLeavesTheFieldAsItWas)
{
    VectorField field = FullField(40, 5, 0, 0);
    const VectorField before = field;
    {
        const auto scarcity = HeapWatch::WithoutBlocksAbove(1000);
        EXPECT_THROW(field.Rebound({0, 999, 9, 0}), std::bad_alloc); // no room for the new rows
    }
    EXPECT_TRUE(HasSameContent(field, before));
    {
        const auto scarcity = HeapWatch::WithoutBlocksAbove(300);
        EXPECT_THROW(field.Rebound({0, 3, 99, 0}), std::bad_alloc); // no room for their cells
    }
    EXPECT_TRUE(HasSameContent(field, before));
}

TEST(VectorField, ExtendByARectangleInsideChangesNothing)
{
    VectorField field = FullField(6, 5, 0, 0);
    EXPECT_FALSE(field.Extend({1, 3, 4, 1}));
    EXPECT_FALSE(field.Extend({0, 4, 5, 0}));
    EXPECT_FALSE(field.Extend(GetEmptyRect()));
    EXPECT_FALSE(field.Extend({90, 90, 90, 90})); // of no width: as empty as that
    ExpectSize(field, 6, 5, 0, 0);
    ExpectFullWithin(field, {0, 4, 5, 0});
}

TEST(VectorField, ExtendGrowsToTheUnion)
{
    VectorField field = FullField(6, 5, 0, 0);
    EXPECT_TRUE(field.Extend({-3, 2, 2, -1}));
    ExpectSize(field, 9, 6, -3, -1);
    ExpectFullWithin(field, {0, 4, 5, 0});
}

TEST(VectorField, ExtendOfAnEmptyFieldTakesTheRectangle)
{
    VectorField field;
    EXPECT_TRUE(field.Extend({3, 9, 7, 4}));
    ExpectSize(field, 5, 6, 3, 4);
}

/// Bounds one cell wide are no area to the union of rectangles.
TEST(VectorField, ExtendReplacesBoundsOfOneColumn)
{
    VectorField field = FullField(1, 5, 0, 0);
    EXPECT_TRUE(field.Extend({-2, 6, 3, -1}));
    ExpectSize(field, 6, 8, -2, -1);
    ExpectFullWithin(field, {0, 4, 0, 0});
    field = FullField(1, 5, 0, 0);
    EXPECT_TRUE(field.Extend({10, 16, 13, 11}));
    ExpectSize(field, 4, 6, 10, 11);
    ExpectFullWithin(field, GetEmptyRect());
}

TEST(VectorField, BlitOfASourceWithoutColumnsIsComplete)
{
    VectorField field = FullField(4, 4, 0, 0);
    VectorField source;
    source.height = 7; // as a moved-from field may show
    EXPECT_TRUE(field.Blit(source, 0, 0));
    source.width = 3;
    source.height = -1;
    EXPECT_TRUE(field.Blit(source, 0, 0));
    EXPECT_TRUE(VectorField().Blit(VectorField(), 0, 0));
    ExpectFullWithin(field, {0, 3, 3, 0});
}

/// The height of a source is asked for below 0, not below 1.
TEST(VectorField, BlitOfASourceOfHeightZeroGoesOn)
{
    VectorField field = FullField(4, 4, 0, 0);
    VectorField source;
    source.width = 3;
    EXPECT_TRUE(field.Blit(source, 0, 0));
    EXPECT_TRUE(field.Blit(source, 1, 3));
    EXPECT_FALSE(field.Blit(source, 2, 0));
    EXPECT_FALSE(field.Blit(source, 0, 4));
    EXPECT_FALSE(field.Blit(source, -1, 0));
    EXPECT_FALSE(VectorField().Blit(source, 0, 0));
    ExpectFullWithin(field, {0, 3, 3, 0});
}

TEST(VectorField, BlitIntoAnEmptyFieldIsIncomplete)
{
    VectorField field;
    EXPECT_FALSE(field.Blit(FullField(2, 2, 0, 0), 0, 0));
    ExpectEmpty(field);
}

TEST(VectorField, BlitBesideTheFieldChangesNothing)
{
    VectorField field = FullField(4, 3, 0, 0);
    const VectorField source = FieldOf(2, 2, 0, 0); // would clear
    constexpr int offsets[][2] = {
        {4, 0}, {5, 0}, {0, 3}, {0, 4}, {-2, 0}, {-3, 0}, {0, -2}, {0, -3}, {smallest, smallest}};
    for (const auto& offset : offsets)
        EXPECT_FALSE(field.Blit(source, offset[0], offset[1])) << offset[0] << ", " << offset[1];
    ExpectFullWithin(field, {0, 2, 3, 0});
}

TEST(VectorField, BlitBesideTheWidestField)
{
    VectorField field = FieldOf(largest, 2, 0, 0);
    EXPECT_FALSE(field.Blit(FullField(1, 1, 0, 0), largest, 0));
    EXPECT_TRUE(field.Blit(FullField(1, 1, 0, 0), largest - 1, 0));
}

TEST(VectorField, BlitAtTheLastColumnAndRow)
{
    VectorField field = FieldOf(4, 3, 0, 0);
    const VectorField source = FullField(2, 2, 0, 0);
    EXPECT_FALSE(field.Blit(source, 3, 2));
    EXPECT_EQ(field.rows[2].start, 3U);
    EXPECT_EQ(field.rows[2].end, 4U);
    EXPECT_FALSE(field.Blit(source, -1, -1));
    EXPECT_EQ(field.GetVector(0, 0), (Vector{1.0F, 1.0F}));
    EXPECT_TRUE(field.Blit(source, 2, 1));
    EXPECT_EQ(field.GetVector(3, 2), (Vector{1.0F, 1.0F}));
}

TEST(VectorField, BlitIntoOneCell)
{
    VectorField field = FieldOf(1, 1, 3, 4);
    EXPECT_FALSE(field.Blit(FullField(6, 6, 0, 0), 0, 0));
    EXPECT_EQ(field.GetVector(3, 4), (Vector{3.0F, 4.0F}));
    EXPECT_TRUE(field.Blit(FullField(1, 1, 0, 0), 3, 4));
    EXPECT_EQ(field.GetVector(3, 4), (Vector{0.0F, 0.0F}));
}

TEST(VectorField, BlitOverwritesWithEmptyCellsToo)
{
    VectorField field = FullField(6, 6, 0, 0);
    VectorField source = FieldOf(3, 3, 10, 10);
    source.SetVector(11, 11, {-7.0F, -7.0F});
    EXPECT_TRUE(field.Blit(source, -8, -9)); // onto columns 2 to 4 of rows 1 to 3
    for (int y = 0; y < 6; ++y)
        for (int x = 0; x < 6; ++x) {
            const bool isUnder = x >= 2 && x <= 4 && y >= 1 && y <= 3;
            const Vector kept{static_cast<float>(x), static_cast<float>(y)};
            const Vector expected = !isUnder ? kept : x == 3 && y == 2 ? Vector{-7.0F, -7.0F} : Vector{};
            EXPECT_EQ(field.GetVector(x, y), expected) << x << ", " << y;
        }
}

TEST(VectorField, BlitOffsetsWrap)
{
    VectorField field = FieldOf(4, 4, largest - 1, 0);
    VectorField source = FullField(2, 2, smallest, 0); // its cells tell 0 or 1 less than -2^31
    source.rows[0].data = {{5.0F, 0.0F}, {6.0F, 0.0F}};
    EXPECT_TRUE(field.Blit(source, 0, 0)); // -2^31 is two beyond 2^31 - 2
    EXPECT_EQ(field.rows[0].start, 2U);
    EXPECT_EQ(field.rows[0].data[1], (Vector{6.0F, 0.0F}));
}

TEST(VectorField, BlitOfItselfIsThatOfACopy)
{
    const VectorField source = FullField(4, 4, 0, 0);
    for (int dy = -3; dy <= 3; ++dy)
        for (int dx = -3; dx <= 3; ++dx) {
            VectorField expected = source;
            const bool isComplete = expected.Blit(source, dx, dy);
            VectorField field = source;
            EXPECT_EQ(field.Blit(field, dx, dy), isComplete);
            EXPECT_TRUE(HasSameContent(field, expected)) << dx << ", " << dy;
            expected = source;
            const bool hasGrown = expected.BlitExtend(source, dx, dy);
            field = source;
            EXPECT_EQ(field.BlitExtend(field, dx, dy), hasGrown);
            EXPECT_TRUE(HasSameContent(field, expected)) << dx << ", " << dy;
        }
}

/// Bounds of one column give way to the moved ones, and the source must not go with them.
TEST(VectorField, BlitExtendOfItselfWithOneColumn)
{
    VectorField field = FullField(1, 3, 4, 0);
    EXPECT_TRUE(field.BlitExtend(field, 2, 0));
    ExpectSize(field, 1, 3, 6, 0);
    EXPECT_EQ(field.GetVector(6, 2), (Vector{4.0F, 2.0F}));
}

TEST(VectorField, BlitExtendGrowsToHoldTheMovedSource)
{
    VectorField field = FullField(4, 4, 0, 0);
    EXPECT_TRUE(field.BlitExtend(FullField(3, 2, 0, 0), 5, -6));
    ExpectSize(field, 8, 10, 0, -6);
    EXPECT_EQ(field.GetVector(3, 3), (Vector{3.0F, 3.0F}));
    EXPECT_EQ(field.GetVector(5, -6), (Vector{0.0F, 0.0F}));
    EXPECT_EQ(field.GetVector(7, -5), (Vector{2.0F, 1.0F}));
    EXPECT_FALSE(field.BlitExtend(FullField(3, 2, 0, 0), 5, -6));
}

TEST(VectorField, BlitExtendOfAnEmptyFieldTakesTheMovedBounds)
{
    VectorField field;
    EXPECT_TRUE(field.BlitExtend(FullField(3, 2, 1, 1), 10, 20));
    ExpectSize(field, 3, 2, 11, 21);
    EXPECT_EQ(field.GetVector(13, 22), (Vector{3.0F, 2.0F}));
}

TEST(VectorField, BlitExtendByAnEmptySourceChangesNothing)
{
    VectorField field = FullField(4, 4, 0, 0);
    EXPECT_FALSE(field.BlitExtend(VectorField(), 100, 100));
    ExpectSize(field, 4, 4, 0, 0);
    ExpectFullWithin(field, {0, 3, 3, 0});
    VectorField empty;
    EXPECT_FALSE(empty.BlitExtend(VectorField(), 0, 0));
    ExpectEmpty(empty);
    EXPECT_TRUE(empty.BlitExtend(VectorField(), 5, 5)); // the inside-out bounds moved are other bounds
    ExpectEmpty(empty);
}

TEST(VectorField, RegionIsTheOverlap)
{
    VectorField field = FullField(6, 5, 0, 0);
    const VectorField before = field;
    const VectorField region = field.GetRegion({4, 9, 20, 2});
    ExpectSize(region, 2, 3, 4, 2);
    ExpectFullWithin(region, {4, 4, 5, 2});
    EXPECT_TRUE(HasSameContent(field, before));
    EXPECT_TRUE(HasSameContent(field.GetRegion({-5, 50, 50, -5}), before));
}

TEST(VectorField, RegionOfLessThanTwoCellsIsEmpty)
{
    VectorField field = FullField(6, 5, 0, 0);
    ExpectEmpty(field.GetRegion({5, 9, 20, 2})); // one column
    ExpectEmpty(field.GetRegion({2, 9, 20, 4})); // one row
    ExpectEmpty(field.GetRegion({3, 3, 3, 3}));
    ExpectEmpty(field.GetRegion({6, 9, 20, 2}));
    ExpectEmpty(field.GetRegion(GetEmptyRect()));
    ExpectSize(field.GetRegion({4, 9, 20, 3}), 2, 2, 4, 3);
}

TEST(VectorField, RegionOfAnEmptyFieldIsEmpty)
{
    VectorField field;
    ExpectEmpty(field.GetRegion({-5, 50, 50, -5}));
    VectorField narrow = FullField(1, 5, 0, 0);
    ExpectEmpty(narrow.GetRegion({-5, 50, 50, -5}));
}

TEST(VectorField, MoveConstructionLeavesTheSourceWithoutRows)
{
    VectorField source = FullField(4, 3, 7, 8);
    const Vector* cells = source.rows[0].data.data();
    const VectorField target(std::move(source));
    ExpectSize(target, 4, 3, 7, 8);
    EXPECT_EQ(target.rows[0].data.data(), cells);
    EXPECT_TRUE(source.rows.empty());
    EXPECT_EQ(source.GetZGIRECT(), (RECT{7, 10, 10, 8}));
    EXPECT_EQ(source.width, 4);
    EXPECT_EQ(source.height, 3);
}

TEST(VectorField, MoveAssignmentLeavesTheSourceWithoutRows)
{
    VectorField source = FullField(4, 3, 7, 8);
    VectorField target = FullField(2, 2, 0, 0);
    const Vector* cells = source.rows[0].data.data();
    target = std::move(source);
    ExpectSize(target, 4, 3, 7, 8);
    EXPECT_EQ(target.rows[0].data.data(), cells);
    EXPECT_TRUE(source.rows.empty());
    EXPECT_EQ(source.rows.capacity(), 0U);
    EXPECT_EQ(source.width, 4);
    EXPECT_EQ(source.height, 3);
    EXPECT_EQ(source.originX, 7);
    EXPECT_EQ(source.originY, 8);
}

TEST(VectorField, MovedFromFieldCanBeUsedAgain)
{
    VectorField source = FullField(4, 3, 7, 8);
    VectorField target(std::move(source));
    source.Initialize(2, 2, 1, 1);
    ExpectSize(source, 2, 2, 1, 1);
    source = std::move(target);
    ExpectSize(source, 4, 3, 7, 8);
    target = source;
    EXPECT_TRUE(HasSameContent(target, source));
}

TEST(VectorField, CopyIsIndependent)
{
    const VectorField field = FullField(4, 3, 7, 8);
    VectorField copy = field;
    copy.SetVector(7, 8, {-1.0F, -1.0F});
    ExpectFullWithin(field, {7, 10, 10, 8});
}

TEST(VectorFieldGet, SamplesCellsExactly)
{
    const VectorField field = FullField(6, 5, -2, 3);
    for (int y = 3; y <= 6; ++y)
        for (int x = -2; x <= 2; ++x)
            EXPECT_EQ(field.Get({static_cast<float>(x), static_cast<float>(y)}),
                      (Vector{static_cast<float>(x), static_cast<float>(y)}));
}

TEST(VectorFieldGet, InterpolatesBilinearly)
{
    VectorField field = FieldOf(4, 4, 0, 0);
    field.SetVector(1, 1, {1.0F, 8.0F});
    field.SetVector(2, 1, {3.0F, 16.0F});
    field.SetVector(1, 2, {5.0F, 24.0F});
    field.SetVector(2, 2, {11.0F, 64.0F});
    EXPECT_EQ(field.Get({1.5F, 1.0F}), (Vector{2.0F, 12.0F}));
    EXPECT_EQ(field.Get({1.0F, 1.25F}), (Vector{2.0F, 12.0F}));
    EXPECT_EQ(field.Get({1.25F, 1.5F}), (Vector{4.0F, 22.0F})); // 1.5 and 6.5; 10 and 34
}

TEST(VectorFieldGet, LeftAndBelowSampleTheFirstColumnAndRow)
{
    const VectorField field = FullField(6, 5, 10, 20);
    EXPECT_EQ(field.Get({3.0F, 21.5F}), (Vector{10.0F, 21.5F}));
    EXPECT_EQ(field.Get({11.5F, -7.0F}), (Vector{11.5F, 20.0F}));
    EXPECT_EQ(field.Get({-infinity, -infinity}), (Vector{10.0F, 20.0F}));
}

TEST(VectorFieldGet, LastColumnAndRowCarryNoWeight)
{
    VectorField field = FieldOf(4, 4, 0, 0);
    for (int y = 0; y < 3; ++y)
        for (int x = 0; x < 3; ++x)
            field.SetVector(x, y, {static_cast<float>(x), static_cast<float>(y)});
    for (int i = 0; i < 4; ++i) {
        field.SetVector(3, i, {1e9F, 1e9F});
        field.SetVector(i, 3, {1e9F, 1e9F});
    }
    EXPECT_EQ(field.Get({2.5F, 1.5F}), (Vector{2.0F, 1.5F}));
    EXPECT_EQ(field.Get({3.9F, 1.5F}), (Vector{2.0F, 1.5F}));
    EXPECT_EQ(field.Get({1.5F, 2.5F}), (Vector{1.5F, 2.0F}));
    EXPECT_EQ(field.Get({1.5F, 100.0F}), (Vector{1.5F, 2.0F}));
    EXPECT_EQ(field.Get({infinity, infinity}), (Vector{2.0F, 2.0F}));
    EXPECT_EQ(field.Get({1.75F, 1.5F}), (Vector{1.75F, 1.5F}));
}

TEST(VectorFieldGet, NanTakesTheUpperLimit)
{
    const VectorField field = FullField(6, 5, 0, 0);
    EXPECT_EQ(field.Get({nan, 1.5F}), (Vector{4.0F, 1.5F}));
    EXPECT_EQ(field.Get({1.5F, nan}), (Vector{1.5F, 3.0F}));
    EXPECT_EQ(field.Get({nan, nan}), (Vector{4.0F, 3.0F}));
}

TEST(VectorFieldGet, WidthOfOneReadsTheColumnBeforeTheFirst)
{
    VectorField field = FieldOf(1, 3, 0, 0);
    field.SetVector(0, 0, {5.0F, 6.0F});
    EXPECT_EQ(field.Get({0.5F, 0.0F}), (Vector{0.0F, 0.0F}));
    EXPECT_EQ(field.Get({nan, 0.5F}), (Vector{0.0F, 0.0F}));
    // Below 0 the position is taken to column 0 before the limit is asked.
    EXPECT_EQ(field.Get({-1.0F, 0.0F}), (Vector{5.0F, 6.0F}));
    field.SetVector(0, 0, {infinity, 6.0F});
    EXPECT_TRUE(std::isnan(field.Get({0.5F, 0.0F}).x)) << "column 0 counts with a weight of 0";
}

TEST(VectorFieldGet, SubtractsTheOriginInSinglePrecision)
{
    // 2^25 + 1 is 2^25 as a float, so that the place of column 3 samples column 4; and so for 2^24 + 1.
    VectorField wide = FieldOf(8, 8, 33554433, 0);
    wide.SetVector(33554437, 1, {7.0F, 7.0F});
    EXPECT_EQ(wide.Get({33554436.0F, 1.0F}), (Vector{7.0F, 7.0F}));
    VectorField high = FieldOf(8, 8, 0, 16777217);
    high.SetVector(1, 16777219, {7.0F, 7.0F});
    EXPECT_EQ(high.Get({1.0F, 16777218.0F}), (Vector{7.0F, 7.0F}));
}

TEST(VectorFieldGet, RoundsEachOperationToSinglePrecision)
{
    VectorField field = FieldOf(4, 4, 5, -3);
    field.SetVector(6, -2, {0.1F, 0.0F});
    field.SetVector(7, -2, {3.7F, 0.0F});
    field.SetVector(6, -1, {-2.3F, 0.0F});
    field.SetVector(7, -1, {1.9F, 0.0F});
    const float x = field.Get({6.3F, -1.1F}).x;
    std::uint32_t bits = 0;
    std::memcpy(&bits, &x, sizeof bits);
    EXPECT_EQ(bits, 0xBF516866U); // in double precision it would be ...64
}

TEST(VectorFieldGet, SizesThatRoundUpAsAFloat)
{
    VectorField wide;
    wide.Initialize(largest, 2, 0, 0); // 2147483648 as a float
    wide.SetVector(largest - 1, 0, {9.0F, 9.0F});
    EXPECT_EQ(wide.Get({infinity, 0.0F}), (Vector{0.0F, 0.0F})); // column 2147483648 lies beyond the row
    EXPECT_EQ(wide.Get({0.0F, 0.0F}), (Vector{0.0F, 0.0F}));
    // 2^24 + 3 rounds up by one, and 2 less is the last column itself.
    wide.Initialize(16777219, 2, 0, 0);
    wide.SetVector(16777218, 0, {9.0F, 9.0F});
    EXPECT_EQ(wide.Get({infinity, 0.0F}), (Vector{9.0F, 9.0F}));
}

TEST(VectorFieldGet, NegativeZeroAndSmallestSteps)
{
    const VectorField field = FullField(4, 4, 0, 0);
    EXPECT_EQ(field.Get({-0.0F, -0.0F}), (Vector{0.0F, 0.0F}));
    const float beforeLimit = std::nextafter(2.0F, 0.0F);
    EXPECT_EQ(field.Get({beforeLimit, 0.0F}), (Vector{beforeLimit, 0.0F}));
}

TEST(VectorFieldGet, AllocatesNothing)
{
    const VectorField field = FullField(16, 16, 0, 0);
    float sum = 0.0F;
    const auto sample = [&] {
        for (int i = 0; i < 100; ++i)
            sum += field.Get({static_cast<float>(i) * 0.17F, 3.3F}).x;
    };
    EXPECT_EQ(AllocationsOf(sample), 0);
    EXPECT_GT(sum, 0.0F);
}

/// The field with every cell written down.
struct DenseField
{
    std::vector<Dense::Row<Vector>> rows;
    int width = 0;
    int height = 0;
    int originX = 0;
    int originY = 0;

    [[nodiscard]] RECT Bounds() const
    {
        return {originX, originY + height - 1, originX + width - 1, originY};
    }

    void Initialize(int columns, int lines, int x, int y)
    {
        *this = {};
        if (columns < 1 || lines < 1)
            return;
        rows.assign(static_cast<std::size_t>(lines), Dense::Row<Vector>(Vector{}, columns));
        width = columns;
        height = lines;
        originX = x;
        originY = y;
    }

    void Initialize(const RECT& rect)
    {
        Initialize(rect.right - rect.left + 1, rect.top - rect.bottom + 1, rect.left, rect.bottom);
    }

    [[nodiscard]] Dense::Row<Vector>& RowAt(int y)
    {
        return rows[static_cast<std::size_t>(y - originY)];
    }

    void Set(int x, int y, const Vector& value)
    {
        RowAt(y).Set(x - originX, value);
    }

    void Clear()
    {
        for (auto& row : rows)
            row.Clear(row.start, row.end);
    }

    bool Blit(const DenseField& source, int dx, int dy)
    {
        if (source.width < 1)
            return true;
        if (width < 1)
            return false;
        const RECT to{source.originX + dx, source.originY + source.height - 1 + dy,
                      source.originX + source.width - 1 + dx, source.originY + dy};
        const RECT own = Bounds();
        if (to.left > own.right || to.bottom > own.top)
            return false;
        for (int y = to.bottom; y <= to.top; ++y)
            if (y >= own.bottom && y <= own.top)
                RowAt(y).Blit(source.rows[static_cast<std::size_t>(y - to.bottom)], to.left - originX);
        return to.left >= own.left && to.right <= own.right && to.bottom >= own.bottom && to.top <= own.top;
    }

    bool Rebound(const RECT& rect)
    {
        DenseField rebound;
        rebound.Initialize(rect);
        const bool isComplete = rebound.Blit(*this, 0, 0);
        *this = rebound;
        return isComplete;
    }

    bool Extend(const RECT& rect)
    {
        RECT united = Bounds();
        UnionRect(united, rect);
        if (united == Bounds())
            return false;
        Rebound(united);
        return true;
    }

    bool BlitExtend(const DenseField& source, int dx, int dy)
    {
        RECT moved = source.Bounds();
        TranslateRect(moved, dx, dy);
        const bool hasGrown = Extend(moved);
        Blit(source, dx, dy);
        return hasGrown;
    }

    [[nodiscard]] DenseField Region(const RECT& rect) const
    {
        DenseField region;
        RECT shared = Bounds();
        if (width >= 1 && IntersectRect(shared, rect)) {
            region.Initialize(shared);
            region.Blit(*this, 0, 0);
        }
        return region;
    }

    [[nodiscard]] Vector Cell(int column, int row) const
    {
        return rows[static_cast<std::size_t>(row)].At(column);
    }

    /// The same sum of four cells, written out.
    [[nodiscard]] Vector Get(const Position& position) const
    {
        const auto clamp = [](float v, int size) {
            const float limit = static_cast<float>(size) - 2.0F;
            return v < 0.0F ? 0.0F : v > limit ? limit : v;
        };
        const float fx = clamp(position.x - static_cast<float>(originX), width);
        const float fy = clamp(position.y - static_cast<float>(originY), height);
        const int ix = static_cast<int>(fx);
        const int iy = static_cast<int>(fy);
        const float tx = fx - static_cast<float>(ix);
        const float ty = fy - static_cast<float>(iy);
        const auto mix = [](float a, float b, float t) { return a + (b - a) * t; };
        const auto sample = [&](float Vector::*part) {
            const float lower = mix(Cell(ix, iy).*part, Cell(ix + 1, iy).*part, tx);
            const float upper = mix(Cell(ix, iy + 1).*part, Cell(ix + 1, iy + 1).*part, tx);
            return mix(lower, upper, ty);
        };
        return {sample(&Vector::x), sample(&Vector::y)};
    }
};

/// A field and its model, driven together.
struct Twin
{
    VectorField field;
    DenseField model;
};

void ExpectSame(const Twin& twin)
{
    ASSERT_EQ(twin.field.width, twin.model.width);
    ASSERT_EQ(twin.field.height, twin.model.height);
    ASSERT_EQ(twin.field.originX, twin.model.originX);
    ASSERT_EQ(twin.field.originY, twin.model.originY);
    ASSERT_EQ(twin.field.GetZGIRECT(), twin.model.Bounds());
    ASSERT_EQ(twin.field.rows.size(), twin.model.rows.size());
    for (std::size_t i = 0; i < twin.model.rows.size(); ++i)
        ASSERT_NO_FATAL_FAILURE(Dense::ExpectSame(twin.field.rows[i], twin.model.rows[i])) << "row " << i;
}

/// Random places, small enough to meet one another.
class Places
{
public:
    explicit Places(unsigned seed) : engine(seed) {}

    int Between(int low, int high)
    {
        return std::uniform_int_distribution<int>(low, high)(engine);
    }

    /// Sometimes inside out, one cell wide or one cell high.
    RECT Rect()
    {
        const int left = Between(-8, 8);
        const int bottom = Between(-8, 8);
        return {left, bottom + Between(-2, 9), left + Between(-2, 9), bottom};
    }

    Vector Cell()
    {
        return {static_cast<float>(Between(-9, 9)), static_cast<float>(Between(-9, 9)) * 0.1F};
    }

    Position Beside(const RECT& bounds)
    {
        const auto within = [this](int low, int high) {
            return std::uniform_real_distribution<float>(static_cast<float>(low) - 2.0F,
                                                         static_cast<float>(high) + 2.0F)(engine);
        };
        return {within(bounds.left, bounds.right), within(bounds.bottom, bounds.top)};
    }

private:
    std::mt19937 engine;
};

void Write(Twin& twin, Places& places)
{
    const RECT bounds = twin.model.Bounds();
    for (int i = 0; i < 4 && twin.model.width > 0; ++i) {
        const int x = places.Between(bounds.left, bounds.right);
        const int y = places.Between(bounds.bottom, bounds.top);
        const Vector value = places.Cell();
        twin.field.SetVector(x, y, value);
        twin.model.Set(x, y, value);
    }
}

void Sample(const Twin& twin, Places& places)
{
    for (int i = 0; i < 8 && twin.model.width > 1 && twin.model.height > 1; ++i) {
        const Position position = places.Beside(twin.model.Bounds());
        ASSERT_EQ(twin.field.Get(position), twin.model.Get(position));
    }
}

/// One operation on both; the results have to agree as well.
void Step(Twin& twin, const Twin& other, Places& places)
{
    const RECT rect = places.Rect();
    const int dx = places.Between(-10, 10);
    const int dy = places.Between(-10, 10);
    switch (places.Between(0, 11)) {
    case 0:
        twin.field.Initialize(rect.right - rect.left, rect.top - rect.bottom, dx, dy);
        twin.model.Initialize(rect.right - rect.left, rect.top - rect.bottom, dx, dy);
        break;
    case 1:
        twin.field.Initialize(rect);
        twin.model.Initialize(rect);
        break;
    case 2:
        twin.field.ClearVectors();
        twin.model.Clear();
        break;
    case 3:
        ASSERT_EQ(twin.field.Rebound(rect), twin.model.Rebound(rect));
        break;
    case 4:
        ASSERT_EQ(twin.field.Extend(rect), twin.model.Extend(rect));
        break;
    case 5:
    case 6:
        ASSERT_EQ(twin.field.Blit(other.field, dx, dy), twin.model.Blit(other.model, dx, dy));
        break;
    case 7:
        ASSERT_EQ(twin.field.BlitExtend(other.field, dx / 3, dy / 3),
                  twin.model.BlitExtend(other.model, dx / 3, dy / 3));
        break;
    case 8:
        twin.field = twin.field.GetRegion(rect);
        twin.model = twin.model.Region(rect);
        break;
    case 9:
        twin.field = other.field;
        twin.model = other.model;
        break;
    default:
        Write(twin, places);
    }
    Sample(twin, places);
}

TEST(VectorField, BehavesAsADenseField)
{
    Places places(3);
    for (int sequence = 0; sequence < 60; ++sequence) {
        Twin twin;
        Twin other;
        for (int step = 0; step < 200; ++step) {
            ASSERT_NO_FATAL_FAILURE(Step(twin, other, places)) << sequence << ", " << step;
            ASSERT_NO_FATAL_FAILURE(Step(other, twin, places)) << sequence << ", " << step;
            ASSERT_NO_FATAL_FAILURE(ExpectSame(twin)) << sequence << ", " << step;
            ASSERT_NO_FATAL_FAILURE(ExpectSame(other)) << sequence << ", " << step;
        }
    }
}

} // namespace
} // namespace ZarnMath
