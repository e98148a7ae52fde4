#include "tests/vectors/Table.h"

#include "ZarnMath/BezierInternal.h"

namespace ZarnMath::Vectors {

namespace {

using namespace CubicBezier;

void WeightsAndAbscissae(Input& in, Output& out)
{
    const int order = in.Get<int>();
    const double* weights = nullptr;
    const double* abscissae = nullptr;
    GetGaussianQuadratureWeightsAndAbscissae(order, weights, abscissae);
    const auto samples = static_cast<std::size_t>(NormalizeQuadratureOrder(order));
    out.AddRun(weights, samples);
    out.AddRun(abscissae, samples);
}

void LengthOfRange(Input& in, Output& out)
{
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    const int order = in.Get<int>();
    const auto [t0, t1] = in.GetArray<double, 2>();
    out.Add(Length(a, b, c, order, t0, t1));
}

void LengthOfPowerForm(Input& in, Output& out)
{
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    out.Add(Length(a, b, c, in.Get<LengthAccuracy>()));
}

void LengthOfCurve(Input& in, Output& out)
{
    const auto curve = in.GetArray<point2d, 4>();
    out.Add(Length(curve.data(), in.Get<LengthAccuracy>()));
}

template <typename P>
void AddPieces(Table& table, const std::string& suffix)
{
    table.Add("LengthTo" + suffix, [](Input& in, Output& out) {
        const double t = in.Get<double>();
        out.Add(LengthTo(t, in.GetArray<P, 4>().data()));
    });
    table.Add("LengthFrom" + suffix, [](Input& in, Output& out) {
        const double t = in.Get<double>();
        out.Add(LengthFrom(t, in.GetArray<P, 4>().data()));
    });
}

void RelativeLengthParameter(Input& in, Output& out)
{
    const double fraction = in.Get<double>();
    const auto [a, b, c] = in.GetArray<point2d, 3>();
    const double tolerance = in.Get<double>();
    out.Add(GetCurveRelativeLengthParameter(fraction, a, b, c, tolerance, in.Get<LengthAccuracy>()));
}

} // namespace

void AddLengthAdapters(Table& table)
{
    table.Add("GetGaussianQuadratureWeightsAndAbscissae", WeightsAndAbscissae);
    table.Add("Length(range)", LengthOfRange);
    table.Add("Length(accuracy)", LengthOfPowerForm);
    table.Add("Length<point2d>", LengthOfCurve);
    AddPieces<point2d>(table, "");
    AddPieces<POINT>(table, "(POINT)");
    table.Add("GetCurveRelativeLengthParameter", RelativeLengthParameter);
}

} // namespace ZarnMath::Vectors
