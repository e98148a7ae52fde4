#include "tests/vectors/Table.h"

#include "ZarnMath/FitBezierInternal.h"
#include "ZarnMath/SmallMatrix.h"

namespace ZarnMath::Vectors {

namespace {

/// The number of doubles before the next integer.
std::size_t CountDoubles(Input ahead)
{
    std::size_t count = 0;
    while (ahead.Next().kind != Value::Kind::Integer)
        ++count;
    return count;
}

/// Runs of points stand before their number.
void ExpectNumber(Input& in, std::size_t n)
{
    if (in.Get<std::size_t>() != n)
        throw Malformed("another number of points");
}

/// Points and parameters for them, and their number.
struct Run
{
    std::vector<point2d> points;
    std::vector<double> u;

    explicit Run(Input& in)
    {
        const std::size_t n = CountDoubles(in) / 3;
        points = in.GetRun<point2d>(n);
        u = in.GetRun<double>(n);
        ExpectNumber(in, n);
    }

    [[nodiscard]] int Count() const
    {
        return static_cast<int>(points.size());
    }
};

/// Points and their number.
std::vector<point2d> GetPoints(Input& in)
{
    const std::size_t n = CountDoubles(in) / 2;
    auto points = in.GetRun<point2d>(n);
    ExpectNumber(in, n);
    return points;
}

/// A parameter that is given back, or not asked for.
struct WorstParameter
{
    bool isAsked;
    double value;

    explicit WorstParameter(Input& in) : isAsked(in.Get<bool>()), value(in.Get<double>()) {}

    double* Pointer()
    {
        return isAsked ? &value : nullptr;
    }
};

template <unsigned long R, unsigned long C>
matrix<R, C, double> GetMatrix(Input& in)
{
    matrix<R, C, double> m;
    for (unsigned long i = 0; i < R; ++i)
        for (unsigned long j = 0; j < C; ++j)
            m(i, j) = in.Get<double>();
    return m;
}

template <unsigned long R, unsigned long C>
void AddMatrix(Output& out, const matrix<R, C, double>& m)
{
    for (unsigned long i = 0; i < R; ++i)
        for (unsigned long j = 0; j < C; ++j)
            out.Add(m(i, j));
}

template <unsigned long R, unsigned long C>
void Eliminate(Input& in, Output& out)
{
    auto m = GetMatrix<R, C>(in);
    const bool result = m.GaussJordenEliminate();
    out.Add(result);
    if (result)
        AddMatrix(out, m);
}

void Inverse(Input& in, Output& out)
{
    const auto m = GetMatrix<6, 6>(in);
    auto inverse = GetMatrix<6, 6>(in);
    out.Add(m.GetInverse(inverse));
    AddMatrix(out, inverse);
    AddMatrix(out, m);
}

void ChordLengths(Input& in, Output& out)
{
    const auto n = in.Get<std::size_t>();
    const auto points = in.GetRun<point2d>(n);
    auto u = in.GetVector<double>();
    Calculate_u(points.data(), static_cast<int>(n), u);
    out.AddVector(u);
}

void Reparameterize(Input& in, Output& out)
{
    const std::size_t n = (CountDoubles(in) - 8) / 3;
    const auto points = in.GetRun<point2d>(n);
    const auto bezier = in.GetArray<point2d, 4>();
    auto u = in.GetRun<double>(n);
    ExpectNumber(in, n);
    WorstParameter worst(in);
    const auto bounds = in.Get<BoundsT<double>>();
    const int count = static_cast<int>(n);
    out.Add(Reparameterize_u(points.data(), bezier.data(), u.data(), count, worst.Pointer(), bounds));
    out.AddRun(u.data(), n);
    out.Add(worst.value);
}

void TangentSolve(Input& in, Output& out)
{
    const Run run(in);
    const auto [t1, t2] = in.GetArray<vector2d, 2>();
    auto bezier = in.GetArray<point2d, 4>();
    out.Add(LeastSquaresSingleIteration(run.points.data(), run.u.data(), run.Count(), t1, t2, bezier.data()));
    out.AddArray(bezier);
}

void FreeSolve(Input& in, Output& out)
{
    const Run run(in);
    auto bezier = in.GetArray<point2d, 4>();
    out.Add(LeastSquaresSingleIteration(run.points.data(), run.u.data(), run.Count(), bezier.data()));
    out.AddArray(bezier);
}

void TangentDriver(Input& in, Output& out)
{
    Run run(in);
    const auto [t1, t2] = in.GetArray<vector2d, 2>();
    auto bezier = in.GetArray<point2d, 4>();
    const int iterations = in.Get<int>();
    WorstParameter worst(in);
    const double threshold = in.Get<double>();
    out.Add(LeastSquares(run.points.data(), run.u.data(), run.Count(), t1, t2, bezier.data(), iterations,
                         worst.Pointer(), threshold));
    out.AddRun(run.u.data(), run.u.size());
    out.AddArray(bezier);
    out.Add(worst.value);
}

void FreeDriver(Input& in, Output& out)
{
    Run run(in);
    auto bezier = in.GetArray<point2d, 4>();
    const int iterations = in.Get<int>();
    WorstParameter worst(in);
    out.Add(LeastSquares(run.points.data(), run.u.data(), run.Count(), bezier.data(), iterations, worst.Pointer()));
    out.AddRun(run.u.data(), run.u.size());
    out.AddArray(bezier);
    out.Add(worst.value);
}

void TangentWrapper(Input& in, Output& out)
{
    const auto points = GetPoints(in);
    const auto [t1, t2] = in.GetArray<vector2d, 2>();
    auto bezier = in.GetArray<point2d, 4>();
    const int iterations = in.Get<int>();
    out.Add(LeastSquares(points.data(), static_cast<int>(points.size()), t1, t2, bezier.data(), iterations));
    out.AddArray(bezier);
}

void FreeWrapper(Input& in, Output& out)
{
    const auto points = GetPoints(in);
    auto bezier = in.GetArray<point2d, 4>();
    const int iterations = in.Get<int>();
    out.Add(LeastSquares(points.data(), static_cast<int>(points.size()), bezier.data(), iterations));
    out.AddArray(bezier);
}

void Parabola(Input& in, Output& out)
{
    const auto points = GetPoints(in);
    auto coefficients = in.GetVector<double>();
    out.Add(LeastSquares(points.data(), static_cast<unsigned long>(points.size()), coefficients));
    out.AddVector(coefficients);
}

void JointSolve(Input& in, Output& out)
{
    const std::size_t n = (CountDoubles(in) - 4) / 2;
    const auto points = in.GetRun<point2d>(n);
    const auto [t1, t2] = in.GetArray<vector2d, 2>();
    ExpectNumber(in, n);
    const auto split = in.Get<std::size_t>();
    const auto u1 = in.GetRun<double>(split);
    const auto u2 = in.GetRun<double>(n - split);
    auto a = in.GetArray<point2d, 4>();
    auto b = in.GetArray<point2d, 4>();
    out.Add(LeastSquaresSingleIteration_2Cubics(points.data(), t1, t2, static_cast<int>(n), static_cast<int>(split),
                                                u1.data(), u2.data(), a.data(), b.data()));
    out.AddArray(a);
    out.AddArray(b);
}

void JointDriver(Input& in, Output& out)
{
    Run run(in);
    const int split = in.Get<int>();
    const auto [t1, t2] = in.GetArray<vector2d, 2>();
    auto a = in.GetArray<point2d, 4>();
    auto b = in.GetArray<point2d, 4>();
    const int iterations = in.Get<int>();
    out.Add(LeastSquares(run.points.data(), run.u.data(), run.Count(), split, t1, t2, a.data(), b.data(), iterations));
    out.AddRun(run.u.data(), run.u.size());
    out.AddArray(a);
    out.AddArray(b);
}

void JointWrapper(Input& in, Output& out)
{
    const auto points = GetPoints(in);
    const int split = in.Get<int>();
    const auto [t1, t2] = in.GetArray<vector2d, 2>();
    auto a = in.GetArray<point2d, 4>();
    auto b = in.GetArray<point2d, 4>();
    const int iterations = in.Get<int>();
    out.Add(
        LeastSquares(points.data(), static_cast<int>(points.size()), split, t1, t2, a.data(), b.data(), iterations));
    out.AddArray(a);
    out.AddArray(b);
}

} // namespace

void AddFitBezierAdapters(Table& table)
{
    table.Add("matrix<3,6>::GaussJordenEliminate", Eliminate<3, 6>);
    table.Add("matrix<4,8>::GaussJordenEliminate", Eliminate<4, 8>);
    table.Add("matrix<6,12>::GaussJordenEliminate", Eliminate<6, 12>);
    table.Add("matrix<6,6>::GetInverse", Inverse);
    table.Add("Calculate_u", ChordLengths);
    table.Add("Reparameterize_u", Reparameterize);
    for (const std::string inputs : {"", ", dyadic"}) {
        table.Add("LeastSquaresSingleIteration(tangents)" + inputs, TangentSolve);
        table.Add("LeastSquaresSingleIteration(free)" + inputs, FreeSolve);
        table.Add("LeastSquaresSingleIteration_2Cubics" + inputs, JointSolve);
    }
    for (const std::string inputs : {"", ", dyadic, one pass"}) {
        table.Add("LeastSquares(tangents, driver)" + inputs, TangentDriver);
        table.Add("LeastSquares(free, driver)" + inputs, FreeDriver);
        table.Add("LeastSquares(two cubics, driver)" + inputs, JointDriver);
    }
    table.Add("LeastSquares(tangents, wrapper)", TangentWrapper);
    table.Add("LeastSquares(free, wrapper)", FreeWrapper);
    table.Add("LeastSquares(two cubics, wrapper)", JointWrapper);
    table.Add("LeastSquares(parabola)", Parabola);
}

} // namespace ZarnMath::Vectors
