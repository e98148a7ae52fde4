#include "tests/vectors/Table.h"

#include "ZarnMath/TridiagonalMatrix.h"

namespace ZarnMath::Vectors {

namespace {

TridiagonalMatrix ReadMatrix(Input& in)
{
    TridiagonalMatrix matrix;
    const auto n = in.Get<std::uint32_t>();
    for (std::uint32_t i = 0; i < n; ++i) {
        const auto row = in.GetArray<double, 3>();
        matrix.AddRow(row[0], row[1], row[2]);
    }
    return matrix;
}

template <typename T>
void AddFor(Table& table, const std::string& type)
{
    table.Add("TridiagonalMatrix::Solve(" + type + ")", [](Input& in, Output& out) {
        const TridiagonalMatrix matrix = ReadMatrix(in);
        const auto rhs = in.GetVector<T>();
        out.AddVector(matrix.Solve(rhs, in.Get<bool>()));
    });
    const auto addInternal = [&](const std::string& name, auto solve) {
        table.Add("TridiagonalMatrix::" + name + "<" + type + ">", [solve](Input& in, Output& out) {
            const TridiagonalMatrix matrix = ReadMatrix(in);
            const auto rhs = in.GetVector<T>();
            std::vector<T> result{T{}};
            (matrix.*solve)(rhs, result);
            out.AddVector(result);
        });
    };
    addInternal("SolveNonCyclic", &TridiagonalMatrix::SolveNonCyclic<T>);
    addInternal("SolveCyclic", &TridiagonalMatrix::SolveCyclic<T>);
}

} // namespace

void AddTridiagonalMatrixAdapters(Table& table)
{
    AddFor<double>(table, "double");
    AddFor<point2d>(table, "point2d");
}

} // namespace ZarnMath::Vectors
