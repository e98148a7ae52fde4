#include "ZarnMath/ValueTypes.h"
#include "tests/DenseRow.h"

#include <random>

namespace ZarnMath {
namespace {

using Ints = ZarnUtils::interval_vector<int>;

constexpr std::int64_t smallestOffset = std::numeric_limits<std::int64_t>::min();
constexpr std::int64_t largestOffset = std::numeric_limits<std::int64_t>::max();

/// A row with a run of the cells from `start` on.
Ints RowOf(int fill, std::uint64_t length, std::uint64_t start, std::vector<int> cells)
{
    Ints row(fill, length);
    row.start = start;
    row.end = start + cells.size();
    row.data = std::move(cells);
    return row;
}

void ExpectRun(const Ints& row, std::uint64_t start, const std::vector<int>& cells)
{
    EXPECT_EQ(row.start, start);
    EXPECT_EQ(row.end, start + cells.size());
    EXPECT_EQ(row.data, cells);
}

/// Ten cells 0 to 9.
std::vector<int> Ten()
{
    return {0, 1, 2, 3, 4, 5, 6, 7, 8, 9};
}

TEST(IntervalVector, NewOneReadsAsFill)
{
    const Ints row(7, 10);
    EXPECT_EQ(row.fill, 7);
    EXPECT_EQ(row.length, 10U);
    ExpectRun(row, 0, {});
    for (std::uint64_t i = 0; i < 12; ++i)
        EXPECT_EQ(row[i], 7);
    EXPECT_EQ(row[~std::uint64_t{0}], 7);
}

TEST(IntervalVector, ReadsTheRunAndFillOutside)
{
    const Ints row = RowOf(-1, 10, 3, {30, 40});
    EXPECT_EQ(row[2], -1);
    EXPECT_EQ(row[3], 30);
    EXPECT_EQ(row[4], 40);
    EXPECT_EQ(row[5], -1);
    EXPECT_EQ(row[10], -1);
    EXPECT_EQ(row[~std::uint64_t{0}], -1);
}

TEST(IntervalVector, EmptyRunAtAnotherIndexReadsAsFill)
{
    Ints row(7, 10);
    row.start = row.end = 4;
    for (std::uint64_t i = 0; i < 10; ++i)
        EXPECT_EQ(row[i], 7);
}

TEST(IntervalVector, ExtendOfAnEmptyRun)
{
    Ints row(7, 10);
    EXPECT_TRUE(row.extend(3, 5));
    ExpectRun(row, 3, {7, 7});
    EXPECT_FALSE(row.extend(3, 5));
    ExpectRun(row, 3, {7, 7});
}

TEST(IntervalVector, ExtendByNothingChangesNothing)
{
    Ints row(7, 10);
    EXPECT_FALSE(row.extend(0, 0));
    EXPECT_FALSE(row.extend(5, 5));
    ExpectRun(row, 0, {});
    row = RowOf(7, 10, 3, {1});
    EXPECT_FALSE(row.extend(8, 8));
    ExpectRun(row, 3, {1});
}

TEST(IntervalVector, ExtendWithEndsOutOfOrderMovesAnEmptyRunOnly)
{
    Ints row(7, 10);
    EXPECT_FALSE(row.extend(6, 2));
    ExpectRun(row, 6, {});
    EXPECT_TRUE(row.extend(1, 2));
    ExpectRun(row, 1, {7});
}

TEST(IntervalVector, ExtendWithinTheRunIsCovered)
{
    Ints row = RowOf(7, 20, 4, Ten());
    EXPECT_FALSE(row.extend(4, 14));
    EXPECT_FALSE(row.extend(5, 6));
    EXPECT_FALSE(row.extend(13, 14));
    ExpectRun(row, 4, Ten());
}

TEST(IntervalVector, GrowthAtTheFrontOvershootsByHalfOfTheRun)
{
    Ints row = RowOf(-1, 200, 100, Ten());
    EXPECT_TRUE(row.extend(99, 105));
    ExpectRun(row, 95, {-1, -1, -1, -1, -1, 0, 1, 2, 3, 4, 5, 6, 7, 8, 9});
}

TEST(IntervalVector, GrowthAtTheFrontStopsAtIndexZero)
{
    Ints row = RowOf(-1, 200, 4, Ten());
    EXPECT_TRUE(row.extend(3, 4));
    ExpectRun(row, 0, {-1, -1, -1, -1, 0, 1, 2, 3, 4, 5, 6, 7, 8, 9});
}

TEST(IntervalVector, GrowthAtTheFrontTakesTheRequestWhereThatIsMore)
{
    Ints row = RowOf(-1, 200, 100, {1, 2});
    EXPECT_TRUE(row.extend(97, 98));
    ExpectRun(row, 97, {-1, -1, -1, 1, 2});
}

TEST(IntervalVector, GrowthAtTheBackIsExact)
{
    Ints row = RowOf(-1, 200, 100, Ten());
    EXPECT_TRUE(row.extend(112, 113));
    ExpectRun(row, 100, {0, 1, 2, 3, 4, 5, 6, 7, 8, 9, -1, -1, -1});
}

TEST(IntervalVector, GrowthAtBothEnds)
{
    Ints row = RowOf(-1, 200, 100, {5});
    EXPECT_TRUE(row.extend(98, 103));
    ExpectRun(row, 98, {-1, -1, 5, -1, -1});
}

TEST(IntervalVector, StorageGrowsByHalfOfItsCapacity)
{
    Ints row(0, 1000);
    row.extend(100, 110); // 10 + 0 * 3 / 2
    EXPECT_EQ(row.data.capacity(), 10U);
    row.extend(110, 111); // 1 + 10 * 3 / 2
    EXPECT_EQ(row.data.capacity(), 16U);
    row.extend(111, 116); // fits
    EXPECT_EQ(row.data.capacity(), 16U);
    row.extend(116, 117); // 1 + 16 * 3 / 2
    EXPECT_EQ(row.data.capacity(), 25U);
    row.extend(99, 126); // below 1, above 9, and 25 * 3 / 2
    EXPECT_EQ(row.data.capacity(), 47U);
    EXPECT_EQ(row.start, 92U); // half of 17 cells
    EXPECT_EQ(row.end, 126U);
}

TEST(IntervalVector, StorageIsBoundedByTheLength)
{
    Ints row(0, 20);
    row.extend(4, 14);
    EXPECT_EQ(row.data.capacity(), 10U);
    row.extend(4, 19); // 5 + 15 is just the length
    EXPECT_EQ(row.data.capacity(), 20U);
    Ints tight(0, 12);
    tight.extend(2, 12);
    tight.extend(1, 12); // 1 + 15 is beyond it
    EXPECT_EQ(tight.data.capacity(), 12U);
    EXPECT_EQ(tight.start, 0U);
}

TEST(IntervalVector, StorageThatHoldsTheCellsBelowIsEnough)
{
    Ints row(0, 1000);
    row.extend(500, 520);
    row.clear_section(500, 510); // 10 cells in a capacity of 20
    row.extend(500, 515);        // 10 below, none above
    EXPECT_EQ(row.start, 500U);
    EXPECT_EQ(row.end, 520U);
    EXPECT_EQ(row.data.capacity(), 20U);
}

/// The overshoot can pass a capacity that held the request.
TEST(IntervalVector, OvershootAtTheFrontStaysWithinTheLength)
{
    Ints row(0, 150);
    row.extend(49, 150);
    row.clear_section(49, 50); // 100 cells in a capacity of 101
    ASSERT_EQ(row.data.capacity(), 101U);
    row.extend(49, 50); // overshoots by 50, but only 50 cells are there
    EXPECT_EQ(row.start, 0U);
    EXPECT_EQ(row.end, 150U);
    EXPECT_EQ(row.data.capacity(), 150U);
}

TEST(IntervalVector, SetGrowsTheRunAndStores)
{
    Ints row(7, 10);
    row.set(3, 30);
    row.set(5, 50);
    ExpectRun(row, 3, {30, 7, 50});
    row.set(4, 40);
    ExpectRun(row, 3, {30, 40, 50});
    row.set(0, 1);
    ExpectRun(row, 0, {1, 7, 7, 30, 40, 50});
    row.set(9, 90);
    ExpectRun(row, 0, {1, 7, 7, 30, 40, 50, 7, 7, 7, 90});
}

TEST(IntervalVector, StoredCellMayEqualFill)
{
    Ints row(7, 10);
    row.set(4, 7);
    ExpectRun(row, 4, {7});
}

TEST(IntervalVector, ClearInsideLeavesTheRunInOnePiece)
{
    Ints row = RowOf(-1, 20, 2, {2, 3, 4, 5, 6, 7});
    row.clear_section(4, 6);
    ExpectRun(row, 2, {2, 3, -1, -1, 6, 7});
}

TEST(IntervalVector, ClearAtTheFrontShortensTheRun)
{
    Ints row = RowOf(-1, 20, 2, {2, 3, 4, 5, 6, 7});
    row.clear_section(0, 4);
    ExpectRun(row, 4, {4, 5, 6, 7});
    row.clear_section(4, 5);
    ExpectRun(row, 5, {5, 6, 7});
}

TEST(IntervalVector, ClearAtTheBackShortensTheRun)
{
    Ints row = RowOf(-1, 20, 2, {2, 3, 4, 5, 6, 7});
    row.clear_section(6, 20);
    ExpectRun(row, 2, {2, 3, 4, 5});
    row.clear_section(5, 6);
    ExpectRun(row, 2, {2, 3, 4});
}

TEST(IntervalVector, ClearOfTheWholeRunKeepsTheCapacity)
{
    Ints row = RowOf(-1, 20, 2, {2, 3, 4, 5, 6, 7});
    const std::size_t capacity = row.data.capacity();
    row.clear_section(2, 8);
    ExpectRun(row, 0, {});
    EXPECT_EQ(row.data.capacity(), capacity);
    row = RowOf(-1, 20, 2, {2, 3, 4});
    row.clear_section(0, 20);
    ExpectRun(row, 0, {});
}

TEST(IntervalVector, ClearBesideTheRunDoesNothing)
{
    Ints row = RowOf(-1, 20, 4, {4, 5, 6});
    row.clear_section(7, 9); // end equal to the beginning of the section
    row.clear_section(1, 4); // start equal to the end of the section
    row.clear_section(5, 5);
    row.clear_section(10, 12);
    row.clear_section(0, 1);
    ExpectRun(row, 4, {4, 5, 6});
}

TEST(IntervalVector, ClearWithEndsOutOfOrderDoesNothing)
{
    Ints row = RowOf(-1, 20, 4, {4, 5, 6, 7});
    for (std::uint64_t from = 0; from < 20; ++from)
        for (std::uint64_t to = 0; to <= from; ++to)
            row.clear_section(from, to);
    ExpectRun(row, 4, {4, 5, 6, 7});
}

TEST(IntervalVector, ClearOfAnEmptyRunLeavesItsIndex)
{
    Ints row(7, 10);
    row.start = row.end = 4;
    row.clear_section(0, 10);
    EXPECT_EQ(row.start, 4U);
    EXPECT_EQ(row.end, 4U);
}

TEST(IntervalVector, BlitOverwritesAndDoesNotMerge)
{
    Ints row = RowOf(-1, 12, 1, {1, 2, 3, 4, 5, 6, 7, 8, 9});
    const Ints other = RowOf(-2, 6, 2, {20, 30});
    row.fast_blit_from_another(other, 3);
    // Cells 3 to 8 lie under the other one; of these 5 and 6 lie under its run.
    ExpectRun(row, 1, {1, 2, -1, -1, 20, 30, -1, -1, 9});
    ExpectRun(other, 2, {20, 30});
}

TEST(IntervalVector, BlitOfAnEmptyRunClearsUnderItsLength)
{
    Ints row = RowOf(-1, 20, 2, {2, 3, 4, 5, 6, 7, 8, 9});
    row.fast_blit_from_another(Ints(-2, 3), 4);
    ExpectRun(row, 2, {2, 3, -1, -1, -1, 7, 8, 9});
    row.fast_blit_from_another(Ints(-2, 4), 0);
    ExpectRun(row, 4, {-1, -1, -1, 7, 8, 9});
    row.fast_blit_from_another(Ints(-2, 5), 8);
    ExpectRun(row, 4, {-1, -1, -1, 7});
    Ints elsewhere(-2, 20);
    elsewhere.start = elsewhere.end = 6;
    row.fast_blit_from_another(elsewhere, 0);
    EXPECT_EQ(row.start, row.end);
    for (std::uint64_t i = 0; i < 20; ++i)
        EXPECT_EQ(row[i], -1);
}

TEST(IntervalVector, BlitWithANegativeOffsetClipsAtIndexZero)
{
    Ints row(-1, 10);
    row.fast_blit_from_another(RowOf(-2, 10, 2, {2, 3, 4, 5, 6}), -5);
    ExpectRun(row, 0, {5, 6});
}

TEST(IntervalVector, BlitClipsAtTheLength)
{
    Ints row(-1, 10);
    row.fast_blit_from_another(RowOf(-2, 10, 2, {2, 3, 4, 5, 6}), 5);
    ExpectRun(row, 7, {2, 3, 4});
}

TEST(IntervalVector, BlitOfARunThatMissesStillClears)
{
    Ints row = RowOf(-1, 10, 0, Ten());
    row.fast_blit_from_another(RowOf(-2, 10, 0, {1, 2}), -2); // the run ends at cell 0, the length at cell 8
    ExpectRun(row, 8, {8, 9});
    row = RowOf(-1, 10, 0, Ten());
    row.fast_blit_from_another(RowOf(-2, 10, 8, {1, 2}), 2); // the run begins at the length
    ExpectRun(row, 0, {0, 1});
    row = RowOf(-1, 10, 0, Ten());
    row.fast_blit_from_another(RowOf(-2, 10, 0, {1, 2}), -10); // nothing lies over this one
    ExpectRun(row, 0, Ten());
    row.fast_blit_from_another(RowOf(-2, 10, 0, {1, 2}), 10);
    ExpectRun(row, 0, Ten());
}

TEST(IntervalVector, BlitFindsItsBoundsBeforeAnythingChanges)
{
    // The first clear takes the front of the run; the second one still goes by where the run ended.
    Ints row = RowOf(-1, 10, 2, {2, 3, 4, 5, 6, 7});
    row.fast_blit_from_another(RowOf(-2, 10, 4, {40, 50}), 0);
    ExpectRun(row, 4, {40, 50});
}

TEST(IntervalVector, BlitWithTheFarthestOffsets)
{
    Ints row = RowOf(-1, 10, 0, Ten());
    const Ints other = RowOf(-2, 10, 1, {1, 2});
    for (const std::int64_t offset : {smallestOffset, smallestOffset + 10, largestOffset - 10, largestOffset})
        row.fast_blit_from_another(other, offset);
    ExpectRun(row, 0, Ten());
}

TEST(IntervalVector, BlitOfItselfIsThatOfACopy)
{
    for (std::int64_t offset = -12; offset <= 12; ++offset) {
        Ints row = RowOf(-1, 12, 3, {3, 4, 5, 6, 7, 8});
        Ints expected = row;
        expected.fast_blit_from_another(Ints(row), offset);
        row.fast_blit_from_another(row, offset);
        ExpectRun(row, expected.start, expected.data);
    }
}

TEST(IntervalVector, CopyCopiesAllFields)
{
    const Ints row = RowOf(-1, 12, 3, {3, 4, 5});
    Ints copy = row;
    EXPECT_EQ(copy.fill, -1);
    EXPECT_EQ(copy.length, 12U);
    ExpectRun(copy, 3, {3, 4, 5});
    copy.set(3, 99);
    ExpectRun(row, 3, {3, 4, 5});
}

TEST(IntervalVector, LengthsBeyond32Bits)
{
    Ints row(0, std::uint64_t{1} << 40);
    row.set(std::uint64_t{1} << 39, 5);
    row.set((std::uint64_t{1} << 39) - 1, 4);
    EXPECT_EQ(row.start, (std::uint64_t{1} << 39) - 1);
    EXPECT_EQ(row.data, (std::vector<int>{4, 5}));
    Ints other(0, std::uint64_t{1} << 40);
    other.fast_blit_from_another(row, -(std::int64_t{1} << 38));
    EXPECT_EQ(other.start, (std::uint64_t{1} << 38) - 1);
    EXPECT_EQ(other.data, (std::vector<int>{4, 5}));
}

template <typename T>
T RandomCell(std::mt19937& engine)
{
    const int number = static_cast<int>(engine() % 5);
    if constexpr (std::is_same_v<T, int>)
        return number;
    else
        return {static_cast<float>(number), static_cast<float>(number) - 2.5F};
}

/// A sparse row and its model, driven together.
template <typename T>
struct Twin
{
    ZarnUtils::interval_vector<T> row;
    Dense::Row<T> model;

    Twin(T fill, std::int64_t length) : row(fill, static_cast<std::uint64_t>(length)), model(fill, length) {}

    void Set(std::int64_t i, const T& value)
    {
        row.set(static_cast<std::uint64_t>(i), value);
        model.Set(i, value);
    }

    void Extend(std::int64_t from, std::int64_t to)
    {
        EXPECT_EQ(row.extend(static_cast<std::uint64_t>(from), static_cast<std::uint64_t>(to)), model.Extend(from, to));
    }

    void Clear(std::int64_t from, std::int64_t to)
    {
        row.clear_section(static_cast<std::uint64_t>(from), static_cast<std::uint64_t>(to));
        model.Clear(from, to);
    }

    void Blit(const Twin& other, std::int64_t offset)
    {
        row.fast_blit_from_another(other.row, offset);
        model.Blit(other.model, offset);
    }
};

template <typename T>
void Step(Twin<T>& twin, const Twin<T>& other, std::mt19937& engine)
{
    const std::int64_t length = twin.model.Length();
    const auto below = [&engine](std::int64_t n) {
        return static_cast<std::int64_t>(engine() % static_cast<std::uint64_t>(n));
    };
    const std::int64_t from = below(length);
    switch (engine() % 8) {
    case 0:
    case 1:
        return twin.Set(from, RandomCell<T>(engine));
    case 2:
        return twin.Extend(from, from + below(std::min<std::int64_t>(length - from, 6) + 1));
    case 3:
        return twin.Clear(from, below(length + 5));
    case 4:
        return twin.Clear(twin.model.start, twin.model.start + below(4));
    case 5:
        return twin.Clear(twin.model.end - std::min(below(4), twin.model.end), twin.model.end + below(3));
    default:
        return twin.Blit(other, below(2 * length + 3) - length - 1);
    }
}

template <typename T>
void RunSequences(unsigned seed)
{
    std::mt19937 engine(seed);
    for (int sequence = 0; sequence < 400; ++sequence) {
        Twin<T> twin(RandomCell<T>(engine), 1 + engine() % 40);
        Twin<T> other(RandomCell<T>(engine), 1 + engine() % 40);
        for (int step = 0; step < 60; ++step) {
            Step(twin, other, engine);
            Step(other, twin, engine);
            ASSERT_NO_FATAL_FAILURE(Dense::ExpectSame(twin.row, twin.model)) << sequence << ", " << step;
            ASSERT_NO_FATAL_FAILURE(Dense::ExpectSame(other.row, other.model)) << sequence << ", " << step;
            ASSERT_LE(twin.row.data.capacity(), twin.row.length);
        }
    }
}

TEST(IntervalVector, IntegersBehaveAsADenseRow)
{
    RunSequences<int>(1);
}

TEST(IntervalVector, VectorsBehaveAsADenseRow)
{
    RunSequences<vector2dT<float, false>>(2);
}

} // namespace
} // namespace ZarnMath
