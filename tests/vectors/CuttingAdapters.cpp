#include "tests/vectors/Table.h"

#include "ZarnMath/Bezier.h"

namespace ZarnMath::Vectors {

namespace {

using namespace CubicBezier;

template <typename P>
using Cubic = std::array<P, 4>;

template <typename P>
Cubic<P> GetCubic(Input& in)
{
    return in.GetArray<P, 4>();
}

template <typename P>
void SplitAtT(Input& in, Output& out)
{
    const double t = in.Get<double>();
    const Cubic<P> curve = GetCubic<P>(in);
    Cubic<P> left{};
    Cubic<P> right{};
    Split(t, curve.data(), left.data(), right.data());
    out.AddArray(left);
    out.AddArray(right);
}

template <typename P>
void SplitAtTInPlace(Input& in, Output& out)
{
    const double t = in.Get<double>();
    Cubic<P> curve = GetCubic<P>(in);
    Cubic<P> right{};
    Split(t, curve.data(), curve.data(), right.data());
    out.AddArray(curve);
    out.AddArray(right);
}

template <typename P>
void SplitInHalf(Input& in, Output& out)
{
    const Cubic<P> curve = GetCubic<P>(in);
    Cubic<P> left{};
    Cubic<P> right{};
    Split(curve.data(), left.data(), right.data());
    out.AddArray(left);
    out.AddArray(right);
}

template <typename P>
void SplitToSeven(Input& in, Output& out)
{
    const double t = in.Get<double>();
    const Cubic<P> curve = GetCubic<P>(in);
    std::array<P, 7> pieces{};
    Split(t, curve.data(), pieces.data());
    out.AddArray(pieces);
}

template <typename P>
void SplitToTen(Input& in, Output& out)
{
    const double t0 = in.Get<double>();
    const double t1 = in.Get<double>();
    const Cubic<P> curve = GetCubic<P>(in);
    std::array<P, 10> pieces{};
    Split(t0, t1, curve.data(), pieces.data());
    out.AddArray(pieces);
}

/// `LeftOf` or `RightOf`, into another array and into the curve itself.
template <typename P>
void AddPiece(Table& table, const std::string& name, void (*cut)(double, const P*, P*) noexcept)
{
    table.Add(name, [cut](Input& in, Output& out) {
        const double t = in.Get<double>();
        const Cubic<P> curve = GetCubic<P>(in);
        Cubic<P> piece{};
        cut(t, curve.data(), piece.data());
        out.AddArray(piece);
    });
    table.Add(name + " in place", [cut](Input& in, Output& out) {
        const double t = in.Get<double>();
        Cubic<P> curve = GetCubic<P>(in);
        cut(t, curve.data(), curve.data());
        out.AddArray(curve);
    });
}

template <typename P>
void CutSubsection(Input& in, Output& out)
{
    const double t0 = in.Get<double>();
    const double t1 = in.Get<double>();
    const Cubic<P> curve = GetCubic<P>(in);
    Cubic<P> piece{};
    Subsection(t0, t1, curve.data(), piece.data());
    out.AddArray(piece);
}

template <typename P>
void AddFor(Table& table, const std::string& type)
{
    table.Add("Split(t) " + type, SplitAtT<P>);
    table.Add("Split(t) " + type + " in place", SplitAtTInPlace<P>);
    table.Add("Split(half) " + type, SplitInHalf<P>);
    table.Add("Split(t, seven) " + type, SplitToSeven<P>);
    table.Add("Split(t0, t1, ten) " + type, SplitToTen<P>);
    table.Add("Subsection " + type, CutSubsection<P>);
    AddPiece<P>(table, "LeftOf " + type, LeftOf);
    AddPiece<P>(table, "RightOf " + type, RightOf);
}

} // namespace

void AddCuttingAdapters(Table& table)
{
    AddFor<point2d>(table, "point2d");
    AddFor<POINT>(table, "POINT");
}

} // namespace ZarnMath::Vectors
