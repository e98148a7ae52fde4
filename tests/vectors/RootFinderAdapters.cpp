#include "tests/vectors/Table.h"

#include "ZarnMath/RootFinder.h"

namespace ZarnMath::Vectors {

namespace {

using namespace RootFinder;

template <int N>
using Polygon = std::array<vector2d, N + 1>;

template <int N>
Polygon<N> GetPolygon(Input& in)
{
    return in.GetArray<vector2d, N + 1>();
}

template <int N>
std::array<double, N + 1> GetCoefficients(Input& in)
{
    return in.GetArray<double, N + 1>();
}

template <int N, int M>
void Convert(Input& in, Output& out)
{
    const auto c = GetCoefficients<N>(in);
    auto polygon = GetPolygon<N>(in);
    PolynomialToBernsteinT<N, M>::Convert(c.data(), polygon.data());
    out.AddArray(polygon);
}

template <int N>
void CountCrossings(Input& in, Output& out)
{
    const auto polygon = GetPolygon<N>(in);
    int lastCrossing = in.Get<int>();
    const int count = CrossingCount<N>(polygon.data(), lastCrossing);
    out.Add(count, lastCrossing);
}

/// The two pieces of a cut, with the ends that stand before it.
template <int N, bool InTheMiddle>
void Split(Input& in, Output& out)
{
    const auto polygon = GetPolygon<N>(in);
    Polygon<N> left{};
    Polygon<N> right{};
    left[0] = polygon[0];
    right[N] = polygon[N];
    if constexpr (InTheMiddle)
        SplitBezierT<N>::Split(polygon.data() + 1, left.data(), right.data());
    else
        SplitBezierT<N>::Split(polygon.data() + 1, in.Get<double>(), left.data(), right.data());
    out.AddArray(left);
    out.AddArray(right);
}

template <int N>
void Newton(Input& in, Output& out)
{
    const auto c = GetCoefficients<N>(in);
    auto [start, tolerance, root] = in.GetArray<double, 3>();
    const bool converged = FindSolutionNewtonsMethod<N>(c.data(), start, tolerance, root);
    out.Add(converged, root);
}

template <int N>
void GuaranteedNewton(Input& in, Output& out)
{
    const auto c = GetCoefficients<N>(in);
    const auto [start, lower, upper, tolerance] = in.GetArray<double, 4>();
    out.Add(FindSolutionNewtonsMethod_Guaranteed<N>(c.data(), start, lower, upper, tolerance));
}

template <int N>
void Solve(Input& in, Output& out)
{
    const auto polygon = GetPolygon<N>(in);
    const auto c = GetCoefficients<N>(in);
    int count = in.Get<int>();
    std::array<double, 3 * N + 4> roots{};
    for (std::size_t i = 0; i < static_cast<std::size_t>(count); ++i)
        roots.at(i) = -77.0 - static_cast<double>(i);
    SolvePolynomial_BezierDivide_NewtonsMethod<N>(polygon.data(), c.data(), roots.data(), count);
    out.Add(count);
    out.AddRun(roots.data(), static_cast<std::size_t>(count));
}

template <int N>
void Find(Input& in, Output& out)
{
    const auto c = GetCoefficients<N>(in);
    const bool includeEndpoints = in.Get<bool>();
    std::array<double, N + 1> roots{};
    const int count = FindRoots<N>(c.data(), roots.data(), includeEndpoints);
    out.Add(count);
    out.AddRun(roots.data(), static_cast<std::size_t>(count));
}

template <int N>
void AddForDegree(Table& table)
{
    const std::string degree = "<" + std::to_string(N) + ">";
    table.Add("CrossingCount" + degree, CountCrossings<N>);
    table.Add("FindSolutionNewtonsMethod" + degree, Newton<N>);
    table.Add("FindSolutionNewtonsMethod_Guaranteed" + degree, GuaranteedNewton<N>);
    table.Add("FindRoots" + degree, Find<N>);
    if constexpr (N > 2) {
        table.Add("PolynomialToBernsteinT<" + std::to_string(N) + ",0>::Convert", Convert<N, 0>);
        table.Add("SplitBezierT" + degree + "::Split(t)", Split<N, false>);
        table.Add("SplitBezierT" + degree + "::Split(middle)", Split<N, true>);
        table.Add("SolvePolynomial_BezierDivide_NewtonsMethod" + degree, Solve<N>);
    }
}

template <int... Offset>
void AddForDegreesFromTwo(Table& table, std::integer_sequence<int, Offset...>)
{
    (AddForDegree<2 + Offset>(table), ...);
}

} // namespace

void AddRootFinderAdapters(Table& table)
{
    AddForDegreesFromTwo(table, std::make_integer_sequence<int, 11>{});
    table.Add("PolynomialToBernsteinT<9,3>::Convert", Convert<9, 3>);
    table.Add("PolynomialToBernsteinT<11,8>::Convert", Convert<11, 8>);
    table.Add("PolynomialToBernsteinT<12,9>::Convert", Convert<12, 9>);
}

} // namespace ZarnMath::Vectors
