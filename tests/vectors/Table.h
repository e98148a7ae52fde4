/// @file
/// Which adapter serves which function of the vectors, and which of the platform's functions it goes through.
#pragma once

#include "tests/vectors/Vectors.h"

#include <functional>
#include <map>
#include <set>
#include <string>

namespace ZarnMath::Vectors {

/// The functions of the platform's mathematical library that are not rounded the same everywhere.
enum class Platform
{
    Sin,
    Cos,
    Tan,
    Atan,
    Atan2,
    Acos,
    Exp,
    Log,
    Pow
};

/// The name of the function in a file.
std::string NameOf(Platform function);

/// Takes the inputs of a case, calls a function, and puts its results into the output.
using Adapter = std::function<void(Input&, Output&)>;

/// The adapters by the name that a file gives the function.
class Table
{
public:
    struct Entry
    {
        Adapter adapter;
        std::set<Platform> uses;
    };

    /// @param name    the function as it stands in a file
    /// @param adapter calls it
    /// @param uses    the platform's functions that its result goes through
    /// @throws std::logic_error if the name is there already
    void Add(const std::string& name, Adapter adapter, std::set<Platform> uses = {});

    /// The entry of that name, or null.
    [[nodiscard]] const Entry* Find(const std::string& name) const;

    [[nodiscard]] const std::map<std::string, Entry>& Entries() const
    {
        return entries;
    }

private:
    std::map<std::string, Entry> entries;
};

/// All adapters.
Table MakeTable();

/// @name One function a unit, in <Unit>Adapters.cpp
/// @{
void AddAnglesAdapters(Table& table);
void AddBatchesAdapters(Table& table);
void AddBezierOffsetAdapters(Table& table);
void AddBezierToLinesAdapters(Table& table);
void AddBoundsAdapters(Table& table);
void AddCircleAdapters(Table& table);
void AddClassificationAdapters(Table& table);
void AddClosestPointAdapters(Table& table);
void AddConstructorsAdapters(Table& table);
void AddCurvatureAdapters(Table& table);
void AddCuttingAdapters(Table& table);
void AddDecompositionAdapters(Table& table);
void AddExtentsAdapters(Table& table);
void AddFitBezierAdapters(Table& table);
void AddIntersectionAdapters(Table& table);
void AddIntervalVectorAdapters(Table& table);
void AddLayoutAdapters(Table& table);
void AddLengthAdapters(Table& table);
void AddLineAdapters(Table& table);
void AddMatrixAdapters(Table& table);
void AddNumericAdapters(Table& table);
void AddPlatformAdapters(Table& table);
void AddRootFinderAdapters(Table& table);
void AddSelfIntersectionAdapters(Table& table);
void AddTransformedBoundsAdapters(Table& table);
void AddTridiagonalMatrixAdapters(Table& table);
void AddValueTypesAdapters(Table& table);
void AddVectorFieldAdapters(Table& table);
void AddWMath3DAdapters(Table& table);
/// @}

/// Runs one case.
///
/// @return what differs, in words, or what made the case impossible; nothing if all is as recorded
std::optional<std::string> RunCase(const Case& recorded, const Adapter& adapter, const Comparison& comparison);

/// The platform's functions of which a recorded result differs here in any bit.
std::set<Platform> FindDifferingFunctions(const std::vector<Case>& platformCases, const Table& table);

/// How the outputs of a function are compared: by bits, unless it uses a function that differs here.
Comparison ComparisonFor(const Table::Entry& entry, const std::set<Platform>& differing, bool zeroSignCounts);

} // namespace ZarnMath::Vectors
