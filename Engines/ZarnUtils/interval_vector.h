/// @file
/// A vector of fixed length that stores one contiguous run of its cells. Every other cell reads as one fill value.
///
/// @code
///   0         start          end               length
///   | fill ... |  data[0] ... | ... fill ...     |
/// @endcode
#pragma once

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <utility>
#include <vector>

namespace ZarnUtils {

/// The sparse vector. Its memory is proportional to the span of cells that was ever written, not to its length.
///
/// Invariants: `data` holds `end - start` cells, and start <= end <= length. The run is empty where start == end, at any
/// index. A stored cell may equal `fill`: only a clear that reaches an end of the run shrinks it.
///
/// Indices are not checked against `length`. Several threads may read at once; changing needs exclusive access. The
/// exceptions of the growing vector pass through. A moved-from vector may only be assigned to or destroyed.
template <typename T>
struct interval_vector
{
    T fill;                  ///< what a cell outside the run reads as, and what a new cell of the run holds
    std::uint64_t start = 0; ///< index of the first stored cell
    std::uint64_t end = 0;   ///< one past the last stored cell
    std::uint64_t length;    ///< number of cells, stored or not; fixed from the construction on
    std::vector<T> data;     ///< cell i stands in data[i - start]

    /// A vector with nothing stored.
    ///
    /// @param fillValue what every cell reads as
    /// @param cells     the length
    interval_vector(T fillValue, std::uint64_t cells) : fill(std::move(fillValue)), length(cells) {}

    interval_vector(const interval_vector&) = default;
    interval_vector(interval_vector&&) noexcept = default;
    interval_vector& operator=(interval_vector&&) noexcept = default;
    ~interval_vector() = default;

    /// Copies another vector. The cells come first: if there is no memory for them, the run still fits those that stand.
    interval_vector& operator=(const interval_vector& other)
    {
        data = other.data;
        fill = other.fill;
        start = other.start;
        end = other.end;
        length = other.length;
        return *this;
    }

    /// Cell i, or `fill` outside the run; beyond the length too. One comparison serves both ends of the run: the
    /// difference of an index below it wraps to beyond any size.
    [[nodiscard]] const T& operator[](std::uint64_t i) const noexcept
    {
        return i - start < end - start ? data[position(i)] : fill;
    }

    /// Stores one cell, growing the run by `extend` where it does not reach it.
    ///
    /// @param i     the cell, below the length
    /// @param value what it reads as from now on
    void set(std::uint64_t i, const T& value)
    {
        extend(i, i + 1);
        data[position(i)] = value;
    }

    /// Makes the run cover the cells [from, to). New cells hold `fill`.
    ///
    /// At the front the run grows by at least half of its size, as far as there is room, since an insertion there moves
    /// all cells; at the back by what was asked for. Storage grows by half its capacity or by the need, whichever is
    /// more, and never beyond the length.
    ///
    /// @param from, to the cells, to <= length; from == to changes nothing. Where from > to, an empty run moves to from,
    ///                 and a stored one reaches at least down to from and up to `to`
    /// @return whether the run changed
    bool extend(std::uint64_t from, std::uint64_t to)
    {
        if (from == to)
            return false;
        if (start == end) {
            start = end = from;
            if (from >= to)
                return false;
        } else if (start <= from && end >= to) {
            return false;
        }
        const std::uint64_t above = to >= end ? to - end : 0;
        const std::uint64_t below = start >= from ? start - from : 0;
        reserve_for(below + above);
        if (start > from)
            grow_front(below, above);
        if (end < to)
            grow_back(to);
        return true;
    }

    /// Makes the cells [from, to) read as `fill`.
    ///
    /// A section that covers the run empties it, start and end then being 0, and keeps its capacity. One that reaches an
    /// end of the run shortens it. One strictly inside is overwritten: the run stays in one piece.
    ///
    /// @param from, to the cells, of any range; from >= to changes nothing
    void clear_section(std::uint64_t from, std::uint64_t to)
    {
        if (from >= to || start == end || start >= to || end <= from)
            return;
        if (start >= from && end <= to) {
            data.clear();
            start = end = 0;
            return;
        }
        const std::uint64_t low = std::max(start, from);
        const std::uint64_t high = std::min(end, to);
        if (start >= from) {
            data.erase(data.begin(), data.begin() + distance_to(high));
            start = high;
        } else if (end <= to) {
            data.erase(data.begin() + distance_to(low), data.end());
            end = low;
        } else {
            std::fill(data.begin() + distance_to(low), data.begin() + distance_to(high), fill);
        }
    }

    /// Copies the whole of another vector onto this one: its cell i lands on cell i + offset, where that exists.
    ///
    /// The cells under the other's length but outside its run are cleared, and so read as the fill value of this vector.
    ///
    /// @param other  the source; this vector itself counts as a copy of it
    /// @param offset of any sign
    void fast_blit_from_another(const interval_vector& other, std::int64_t offset)
    {
        if (this == &other)
            return fast_blit_from_another(interval_vector(other), offset);
        const auto shifted = [offset](std::uint64_t i) {
            return static_cast<std::int64_t>(i + static_cast<std::uint64_t>(offset));
        };
        const auto first = static_cast<std::int64_t>(start);
        const auto last = static_cast<std::int64_t>(end);
        clear_between(std::max(first, offset), std::min(shifted(other.start), last));
        clear_between(std::max(shifted(other.end), first), std::min(shifted(other.length), last));

        const std::int64_t low = std::max<std::int64_t>(shifted(other.start), 0);
        const std::int64_t high = std::min(shifted(other.end), static_cast<std::int64_t>(length));
        if (high <= low)
            return;
        extend(static_cast<std::uint64_t>(low), static_cast<std::uint64_t>(high));
        const auto source = other.data.begin() + other.distance_to(static_cast<std::uint64_t>(low - offset));
        std::copy_n(source, high - low, data.begin() + distance_to(static_cast<std::uint64_t>(low)));
    }

private:
    [[nodiscard]] std::size_t position(std::uint64_t i) const noexcept
    {
        return static_cast<std::size_t>(i - start);
    }

    [[nodiscard]] std::ptrdiff_t distance_to(std::uint64_t i) const noexcept
    {
        return static_cast<std::ptrdiff_t>(i - start);
    }

    /// Room for so many more cells: one reallocation, to at least one and a half of the capacity, within the length.
    void reserve_for(std::uint64_t need)
    {
        const std::uint64_t capacity = data.capacity();
        if (capacity >= data.size() + need)
            return;
        const std::uint64_t grown = std::min(length, need + capacity * 3 / 2);
        if (capacity < grown)
            data.reserve(static_cast<std::size_t>(grown));
    }

    /// Grows by what is asked for below the run, or by half of its size; where that does not fit either, room is made by
    /// the same rule, since the vector's own growth could pass the length.
    void grow_front(std::uint64_t below, std::uint64_t above)
    {
        const std::uint64_t half = data.size() / 2;
        const std::uint64_t grown = std::min(std::max(below, half), start);
        reserve_for(grown + above);
        data.insert(data.begin(), static_cast<std::size_t>(grown), fill);
        start -= grown;
    }

    void grow_back(std::uint64_t to)
    {
        data.resize(position(to), fill);
        end = to;
    }

    void clear_between(std::int64_t low, std::int64_t high)
    {
        if (low < high)
            clear_section(static_cast<std::uint64_t>(low), static_cast<std::uint64_t>(high));
    }
};

} // namespace ZarnUtils
