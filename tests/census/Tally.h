/// @file
/// Counts by row and column, and the Markdown table that shows them.
#pragma once

#include <ostream>
#include <string>
#include <vector>

namespace ZarnMath::Census {

/// Where the curves of a case come from.
enum class Placement
{
    Free,  ///< any shape at any place and angle
    OnGrid ///< control points on a square grid; of eight curves three are symmetric and one is a raised parabola
};

inline constexpr Placement placements[] = {Placement::Free, Placement::OnGrid};

/// The counts of one family of questions. Rows stand in the order in which they are named.
class Tally
{
public:
    Tally(std::string name, std::vector<std::string> labels) : title(std::move(name))
    {
        for (std::string& label : labels)
            rows.push_back({std::move(label), {}});
    }

    /// @throws std::out_of_range if there is no such row
    void Count(std::size_t row, Placement placement, int n = 1)
    {
        rows.at(row).counts[static_cast<std::size_t>(placement)] += n;
    }

    friend std::ostream& operator<<(std::ostream& out, const Tally& tally)
    {
        out << "### " << tally.title << "\n\n| | free | on a grid |\n|---|---:|---:|\n";
        for (const Row& row : tally.rows)
            out << "| " << row.label << " | " << row.counts[0] << " | " << row.counts[1] << " |\n";
        return out << '\n';
    }

private:
    struct Row
    {
        std::string label;
        int counts[2];
    };

    std::string title;
    std::vector<Row> rows;
};

} // namespace ZarnMath::Census
