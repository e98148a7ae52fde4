#include "tests/catalogue/Draws.h"

namespace ZarnMath::Catalogue {

namespace {

constexpr int mostRows = 8;

TridiagonalMatrix DrawMatrix(Source& in, int rows)
{
    TridiagonalMatrix matrix;
    for (int i = 0; i < rows; ++i) {
        const vector3dT<double> row = in.Vector3();
        matrix.AddRow(row.x, row.y, row.z);
    }
    return matrix;
}

/// A row cannot be read back: the solution tells what was added.
void AddRowAndSolve(Source& in, Sink& out)
{
    const TridiagonalMatrix matrix = DrawMatrix(in, 2);
    out.Put(matrix.Solve(std::vector<double>{in.Number(), in.Number()}, false));
}

template <typename T>
void Solve(Source& in, Sink& out)
{
    const bool isCyclic = in.Flag();
    const int rows = in.Count(isCyclic ? 2 : 1, mostRows);
    const TridiagonalMatrix matrix = DrawMatrix(in, rows);
    std::vector<T> rightSide;
    for (int i = 0; i < rows; ++i) {
        if constexpr (std::is_same_v<T, double>)
            rightSide.push_back(in.Number());
        else
            rightSide.push_back(in.Point());
    }
    out.Put(matrix.Solve(rightSide, isCyclic));
}

} // namespace

void AddTridiagonalMatrix(std::vector<Function>& list)
{
    Family family(list, "TridiagonalMatrix");
    family.AddBody("TridiagonalMatrix::AddRow(double, double, double)", AddRowAndSolve);
    family.AddBody("TridiagonalMatrix::Solve(const vector<double>&, bool) const", Solve<double>);
    family.AddBody("TridiagonalMatrix::Solve(const vector<point2d>&, bool) const", Solve<point2d>);
}

} // namespace ZarnMath::Catalogue
