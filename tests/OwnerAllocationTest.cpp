// What owns memory of its own, and what a change of it leaves behind when memory runs out.
#include "ZarnMath/TridiagonalMatrix.h"
#include "ZarnMath/VectorField.h"

#include "tests/CountingHeap.h"

#include <gtest/gtest.h>

namespace ZarnMath {
namespace {

using Vector = vector2dT<float, false>;
using Row = VectorField::Row;

/// Makes a change to a copy of an owner, with each allocation failing in turn.
///
/// @param given  the owner before the change
/// @param change the change
/// @param check  what holds of the owner after each failure
/// @return the number of times that the change failed
template <typename Owner, typename Change, typename Check>
long FailEveryAllocationOf(const Owner& given, Change change, Check check)
{
    long failures = 0;
    const auto call = [&] {
        Owner owner(given);
        // Somebody may look at it: a compiler may leave out an allocation that nobody can see.
        [[maybe_unused]] const Owner* const volatile shown = &owner;
        try {
            change(owner);
        } catch (const std::bad_alloc&) {
            ++failures;
            check(owner);
            throw;
        }
    };
    FailEveryAllocation(call, [] {});
    return failures;
}

/// @name Rows
/// @{

constexpr std::uint64_t rowLength = 100;

/// A row whose cells [from, to) tell their index.
Row RowOf(std::uint64_t from, std::uint64_t to)
{
    Row row(Vector{}, rowLength);
    for (std::uint64_t i = from; i < to; ++i)
        row.set(i, {static_cast<float>(i), 1.0F});
    return row;
}

bool IsSound(const Row& row)
{
    return row.start <= row.end && row.end <= row.length && row.data.size() == row.end - row.start;
}

/// Whether two rows read alike at the cells [from, to).
bool ReadAlike(const Row& a, const Row& b, std::uint64_t from = 0, std::uint64_t to = rowLength)
{
    for (std::uint64_t i = from; i < to; ++i)
        if (a[i] != b[i])
            return false;
    return a.length == b.length;
}

template <typename Change>
void ExpectRowIsKept(const Row& given, Change change)
{
    EXPECT_EQ(FailEveryAllocationOf(given, change,
                                    [&](const Row& row) {
                                        EXPECT_TRUE(IsSound(row));
                                        EXPECT_TRUE(ReadAlike(row, given));
                                    }),
              1);
}

TEST(RowAllocation, FailedWriteKeepsAllCells)
{
    ExpectRowIsKept(Row(Vector{}, rowLength), [](Row& row) { row.set(50, {7.0F, 7.0F}); });
    ExpectRowIsKept(RowOf(40, 60), [](Row& row) { row.set(10, {7.0F, 7.0F}); });
    ExpectRowIsKept(RowOf(40, 60), [](Row& row) { row.set(90, {7.0F, 7.0F}); });
}

TEST(RowAllocation, FailedGrowthKeepsAllCells)
{
    ExpectRowIsKept(RowOf(40, 60), [](Row& row) { row.extend(0, rowLength); });
    ExpectRowIsKept(RowOf(40, 41), [](Row& row) { row.extend(39, 41); });
}

TEST(RowAllocation, FailedAssignmentKeepsAllCells)
{
    const Row longer = RowOf(5, 95);
    ExpectRowIsKept(RowOf(40, 60), [&](Row& row) { row = longer; });
    ExpectRowIsKept(Row(Vector{}, rowLength), [&](Row& row) { row = longer; });
}

TEST(RowAllocation, FailedBlitKeepsTheCellsAround)
{
    Row source(Vector{}, 30);
    source.set(3, {1.0F, 2.0F});
    source.set(20, {3.0F, 4.0F});
    const Row given = RowOf(45, 50);
    const auto check = [&](const Row& row) {
        EXPECT_TRUE(IsSound(row));
        EXPECT_TRUE(ReadAlike(row, given, 0, 40));
        EXPECT_TRUE(ReadAlike(row, given, 70, rowLength));
    };
    EXPECT_EQ(FailEveryAllocationOf(
                  given, [&](Row& row) { row.fast_blit_from_another(source, 40); }, check),
              1);
}

TEST(RowAllocation, FailedBlitOntoItselfKeepsAllCells)
{
    // The copy alone: what a row clears for it makes room for it.
    ExpectRowIsKept(RowOf(40, 60), [](Row& row) { row.fast_blit_from_another(row, 10); });
}

/// @}
/// @name Fields
/// @{

constexpr RECT fieldBounds{-2, 9, 7, 4};

/// Every cell of a diagonal band tells its place in the plane, so that rows begin and end at different columns.
VectorField BandedField()
{
    VectorField field;
    field.Initialize(fieldBounds);
    for (int y = fieldBounds.bottom; y <= fieldBounds.top; ++y)
        for (int x = y - 6; x <= y - 2; ++x)
            field.SetVector(x, y, {static_cast<float>(x), static_cast<float>(y)});
    return field;
}

bool IsSound(const VectorField& field)
{
    for (const Row& row : field.rows)
        if (!IsSound(row) || row.length != static_cast<std::uint64_t>(field.width))
            return false;
    return field.rows.size() == static_cast<std::size_t>(field.height);
}

bool IsSame(const VectorField& a, const VectorField& b)
{
    if (a.GetZGIRECT() != b.GetZGIRECT() || a.rows.size() != b.rows.size())
        return false;
    for (std::size_t y = 0; y < a.rows.size(); ++y)
        if (!ReadAlike(a.rows[y], b.rows[y], 0, static_cast<std::uint64_t>(a.width)))
            return false;
    return true;
}

template <typename Change>
long FailEveryAllocationOfField(Change change)
{
    const VectorField given = BandedField();
    return FailEveryAllocationOf(given, change, [&](const VectorField& field) {
        EXPECT_TRUE(IsSound(field));
        EXPECT_TRUE(IsSame(field, given));
    });
}

TEST(FieldAllocation, FailedReboundKeepsTheField)
{
    EXPECT_EQ(FailEveryAllocationOfField([](VectorField& field) { field.Rebound({-9, 20, 30, 2}); }), 7);
    EXPECT_EQ(FailEveryAllocationOfField([](VectorField& field) { field.Rebound({0, 7, 3, 5}); }), 4);
}

TEST(FieldAllocation, FailedExtensionKeepsTheField)
{
    EXPECT_EQ(FailEveryAllocationOfField([](VectorField& field) { field.Extend({0, 12, 30, 0}); }), 7);
}

TEST(FieldAllocation, FailedWriteKeepsTheField)
{
    EXPECT_EQ(FailEveryAllocationOfField([](VectorField& field) { field.SetVector(-2, 9, {7.0F, 7.0F}); }), 1);
}

TEST(FieldAllocation, FailedAssignmentKeepsTheField)
{
    VectorField narrow;
    narrow.Initialize(2, 6, 0, 0);
    for (int y = 0; y < 6; ++y)
        narrow.SetVector(y % 2, y, {1.0F, 1.0F});
    EXPECT_EQ(FailEveryAllocationOfField([&](VectorField& field) { field = narrow; }), 7);
    VectorField large;
    large.Initialize(20, 20, 0, 0);
    large.SetVector(3, 3, {1.0F, 1.0F});
    EXPECT_EQ(FailEveryAllocationOfField([&](VectorField& field) { field = large; }), 2);
}

TEST(FieldAllocation, FailedRegionKeepsTheField)
{
    EXPECT_EQ(FailEveryAllocationOfField([](VectorField& field) {
                  static_cast<void>(field.GetRegion({0, 8, 5, 5}));
              }),
              5);
}

TEST(FieldAllocation, FailedInitialisationLeavesTheFieldEmpty)
{
    const auto check = [](const VectorField& field) { EXPECT_TRUE(IsSame(field, VectorField())); };
    const auto initialize = [](VectorField& field) { field.Initialize(3, 50, 1, 2); };
    EXPECT_EQ(FailEveryAllocationOf(BandedField(), initialize, check), 1);
}

TEST(FieldAllocation, FailedBlitKeepsBoundsAndTheCellsAround)
{
    VectorField source;
    source.Initialize(8, 3, 0, 0);
    for (int y = 0; y < 3; ++y)
        for (int x = 0; x < 8; ++x)
            source.SetVector(x, y, {100.0F, 100.0F});
    const VectorField given = BandedField();
    const auto check = [&](const VectorField& field) {
        EXPECT_TRUE(IsSound(field));
        EXPECT_EQ(field.GetZGIRECT(), fieldBounds);
        for (int y = fieldBounds.bottom; y <= fieldBounds.top; ++y)
            for (int x = fieldBounds.left; x <= fieldBounds.right; ++x)
                if (x < -1 || x > 6 || y < 5 || y > 7) {
                    EXPECT_EQ(field.GetVector(x, y), given.GetVector(x, y)) << x << ", " << y;
                }
    };
    EXPECT_EQ(FailEveryAllocationOf(
                  given, [&](VectorField& field) { field.Blit(source, -1, 5); }, check),
              3);
}

TEST(FieldAllocation, FailedBlitOntoItselfLeavesItSound)
{
    const auto check = [](const VectorField& field) {
        EXPECT_TRUE(IsSound(field));
        EXPECT_EQ(field.GetZGIRECT(), fieldBounds);
    };
    EXPECT_GE(FailEveryAllocationOf(
                  BandedField(), [](VectorField& field) { field.Blit(field, 3, 1); }, check),
              8);
}

TEST(FieldAllocation, FailedExtensionWithABlitLeavesItSound)
{
    VectorField source;
    source.Initialize(3, 3, 6, 8);
    source.SetVector(6, 8, {1.0F, 1.0F});
    source.SetVector(8, 10, {1.0F, 1.0F});
    const auto isSoundWithin = [](const RECT& united) {
        return [united](const VectorField& field) {
            EXPECT_TRUE(IsSound(field));
            EXPECT_TRUE(field.GetZGIRECT() == fieldBounds || field.GetZGIRECT() == united);
        };
    };
    const auto take = [&](VectorField& field) { field.BlitExtend(source, 0, 0); };
    EXPECT_EQ(FailEveryAllocationOf(BandedField(), take, isSoundWithin({-2, 10, 8, 4})),
              8); // the rows, six of them filled again, and one that the source reaches first
    const auto takeItself = [](VectorField& field) { field.BlitExtend(field, 3, 1); };
    EXPECT_GE(FailEveryAllocationOf(BandedField(), takeItself, isSoundWithin({-2, 10, 10, 4})), 8);
}

/// @}
/// @name Matrices
/// @{

TridiagonalMatrix MatrixOf(int rows)
{
    TridiagonalMatrix matrix;
    for (int i = 0; i < rows; ++i)
        matrix.AddRow(1.0, 4.0, 1.0);
    return matrix;
}

TEST(MatrixAllocation, FailedRowIsNotAdded)
{
    const TridiagonalMatrix given = MatrixOf(4);
    const std::vector<double> rhs{1.0, 2.0, 3.0, 4.0};
    const std::vector<double> solution = given.Solve(rhs, false);
    const auto check = [&](const TridiagonalMatrix& matrix) { EXPECT_EQ(matrix.Solve(rhs, false), solution); };
    const auto append = [](TridiagonalMatrix& matrix) { matrix.AddRow(1.0, 0.0, 1.0); };
    EXPECT_EQ(FailEveryAllocationOf(given, append, check), 1);
}

template <typename T>
long AllocationsOfSolve(const std::vector<T>& rhs, bool cyclic)
{
    const TridiagonalMatrix matrix = MatrixOf(static_cast<int>(rhs.size()));
    return FailEveryAllocation([&] { static_cast<void>(matrix.Solve(rhs, cyclic)); }, [] {});
}

TEST(MatrixAllocation, FailedSolveLeaksNothing)
{
    const std::vector<double> numbers(5, 1.0);
    const std::vector<point2d> points(5, point2d{1.0, 2.0});
    // The solution, and a work vector for each elimination.
    EXPECT_EQ(AllocationsOfSolve(numbers, false), 2);
    EXPECT_EQ(AllocationsOfSolve(points, false), 2);
    EXPECT_EQ(AllocationsOfSolve(numbers, true), 3);
    EXPECT_EQ(AllocationsOfSolve(points, true), 3);
}

/// @}

} // namespace
} // namespace ZarnMath
