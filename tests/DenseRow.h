/// @file
/// What `interval_vector` is measured against: every cell stored, and the run told by its rules alone.
#pragma once

#include "ZarnUtils/interval_vector.h"

#include <algorithm>
#include <cstdint>
#include <utility>
#include <vector>

#include <gtest/gtest.h>

namespace ZarnMath::Dense {

/// A row of which each cell is written down, with the run [start, end) that the sparse row must show.
template <typename T>
struct Row
{
    T fill;
    std::vector<T> cells;
    std::int64_t start = 0;
    std::int64_t end = 0;

    Row(T fillValue, std::int64_t length) : fill(fillValue), cells(static_cast<std::size_t>(length), fillValue) {}

    [[nodiscard]] std::int64_t Length() const
    {
        return static_cast<std::int64_t>(cells.size());
    }

    [[nodiscard]] T At(std::int64_t i) const
    {
        return i >= 0 && i < Length() ? cells[static_cast<std::size_t>(i)] : fill;
    }

    bool Extend(std::int64_t from, std::int64_t to)
    {
        if (from == to)
            return false;
        if (start == end) {
            start = end = from;
            if (from >= to)
                return false;
        }
        if (start <= from && to <= end)
            return false;
        const std::int64_t stored = end - start;
        if (from < start)
            start -= std::min(std::max(start - from, stored / 2), start);
        end = std::max(end, to);
        return true;
    }

    void Clear(std::int64_t from, std::int64_t to)
    {
        for (std::int64_t i = std::max<std::int64_t>(from, 0); i < std::min(to, Length()); ++i)
            cells[static_cast<std::size_t>(i)] = fill;
        if (from >= to || start == end || to <= start || end <= from)
            return;
        if (from <= start && end <= to)
            start = end = 0;
        else if (from <= start)
            start = to;
        else if (end <= to)
            end = from;
    }

    void Set(std::int64_t i, const T& value)
    {
        Extend(i, i + 1);
        cells[static_cast<std::size_t>(i)] = value;
    }

    /// Cell by cell: what lies under the other's length takes the other's cell if that is in its run, else this fill.
    void Blit(const Row& other, std::int64_t offset)
    {
        const std::pair<std::int64_t, std::int64_t> before{std::max(start, offset),
                                                           std::min(other.start + offset, end)};
        const std::pair<std::int64_t, std::int64_t> behind{std::max(other.end + offset, start),
                                                           std::min(other.Length() + offset, end)};
        Clear(before.first, before.second);
        Clear(behind.first, behind.second);
        const std::int64_t low = std::max<std::int64_t>(other.start + offset, 0);
        const std::int64_t high = std::min(other.end + offset, Length());
        if (low < high)
            Extend(low, high);
        for (std::int64_t i = 0; i < other.Length(); ++i)
            if (i + offset >= 0 && i + offset < Length())
                cells[static_cast<std::size_t>(i + offset)] = i >= other.start && i < other.end ? other.At(i) : fill;
    }
};

/// The whole state of a sparse row beside that of the model: every cell as it reads, and the run.
template <typename T>
void ExpectSame(const ZarnUtils::interval_vector<T>& row, const Row<T>& model)
{
    ASSERT_EQ(row.length, static_cast<std::uint64_t>(model.Length()));
    ASSERT_EQ(row.start, static_cast<std::uint64_t>(model.start));
    ASSERT_EQ(row.end, static_cast<std::uint64_t>(model.end));
    ASSERT_LE(row.end, row.length);
    ASSERT_EQ(row.data.size(), row.end - row.start);
    ASSERT_TRUE(row.fill == model.fill);
    for (std::int64_t i = 0; i < model.Length() + 2; ++i)
        ASSERT_TRUE(row[static_cast<std::uint64_t>(i)] == model.At(i)) << "cell " << i;
}

} // namespace ZarnMath::Dense
