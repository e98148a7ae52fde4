#include "tests/vectors/Table.h"

#include <algorithm>

namespace ZarnMath::Vectors {

namespace {

/// A few roundings of a last place that differs, carried through a short formula.
constexpr int unitsForDifferingPlatform = 16;

} // namespace

std::string NameOf(Platform function)
{
    constexpr const char* names[] = {"sin", "cos", "tan", "atan", "atan2", "acos", "exp", "log", "pow"};
    return names[static_cast<std::size_t>(function)];
}

void Table::Add(const std::string& name, Adapter adapter, std::set<Platform> uses)
{
    if (!entries.try_emplace(name, Entry{std::move(adapter), std::move(uses)}).second)
        throw std::logic_error("two adapters for " + name);
}

const Table::Entry* Table::Find(const std::string& name) const
{
    const auto found = entries.find(name);
    return found == entries.end() ? nullptr : &found->second;
}

Table MakeTable()
{
    Table table;
    AddAnglesAdapters(table);
    AddBatchesAdapters(table);
    AddBezierOffsetAdapters(table);
    AddBezierToLinesAdapters(table);
    AddBoundsAdapters(table);
    AddCircleAdapters(table);
    AddClassificationAdapters(table);
    AddClosestPointAdapters(table);
    AddConstructorsAdapters(table);
    AddCurvatureAdapters(table);
    AddCuttingAdapters(table);
    AddDecompositionAdapters(table);
    AddExtentsAdapters(table);
    AddFitBezierAdapters(table);
    AddIntersectionAdapters(table);
    AddIntervalVectorAdapters(table);
    AddLayoutAdapters(table);
    AddLengthAdapters(table);
    AddLineAdapters(table);
    AddMatrixAdapters(table);
    AddNumericAdapters(table);
    AddPlatformAdapters(table);
    AddRootFinderAdapters(table);
    AddSelfIntersectionAdapters(table);
    AddTransformedBoundsAdapters(table);
    AddTridiagonalMatrixAdapters(table);
    AddValueTypesAdapters(table);
    AddVectorFieldAdapters(table);
    AddWMath3DAdapters(table);
    return table;
}

std::optional<std::string> RunCase(const Case& recorded, const Adapter& adapter, const Comparison& comparison)
{
    Input in(recorded.inputs);
    Output out;
    try {
        adapter(in, out);
        in.ExpectEnd();
    } catch (const TooWide&) {
        throw;
    } catch (const std::exception& trouble) {
        return trouble.what();
    }
    return FindMismatch(recorded, out.Values(), comparison);
}

std::set<Platform> FindDifferingFunctions(const std::vector<Case>& platformCases, const Table& table)
{
    std::set<Platform> differing;
    for (const Case& recorded : platformCases) {
        const Table::Entry* entry = table.Find(recorded.name);
        if (entry && RunCase(recorded, entry->adapter, {}))
            differing.insert(entry->uses.begin(), entry->uses.end());
    }
    return differing;
}

Comparison ComparisonFor(const Table::Entry& entry, const std::set<Platform>& differing, bool zeroSignCounts)
{
    const bool isAffected =
        std::any_of(entry.uses.begin(), entry.uses.end(), [&](Platform f) { return differing.contains(f); });
    return {zeroSignCounts, isAffected ? unitsForDifferingPlatform : 0};
}

} // namespace ZarnMath::Vectors
