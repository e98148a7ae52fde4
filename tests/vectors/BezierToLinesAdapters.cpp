#include "tests/vectors/Table.h"

#include "ZarnMath/BezierToLinesInternal.h"

#include <algorithm>

namespace ZarnMath::Vectors {

namespace {

/// The output policy of a point type.
template <typename P>
using ConvertFor = std::conditional_t<std::is_same_v<P, POINT>, FastConvert, DirectConvert>;

void LooseBounds(Input& in, Output& out)
{
    const auto curve = in.GetArray<point2d, 4>();
    int minX = 0;
    int minY = 0;
    int maxX = 0;
    int maxY = 0;
    CubicBezier::GetLooseBounds<point2d, int>(curve.data(), minX, minY, maxX, maxY);
    out.Add(minX, minY, maxX, maxY);
}

void LinesOfRect(Input& in, Output& out)
{
    const RECT bounds = in.Get<RECT>();
    out.Add(CalculateNumBezierLines(bounds, in.Get<int>()));
}

template <typename P>
void LinesOfCurve(Input& in, Output& out)
{
    const auto curve = in.GetArray<P, 4>();
    out.Add(CalculateNumBezierLines(curve.data(), in.Get<int>()));
}

template <typename P>
void RecursionDepth(Input& in, Output& out)
{
    const auto curve = in.GetArray<P, 4>();
    const double tolerance = in.Get<double>();
    int minDepth = 0;
    int maxDepth = 0;
    CalculateRecursionDepth<P>(curve.data(), tolerance, in.Get<int>(), minDepth, maxDepth);
    out.Add(minDepth, maxDepth);
}

/// The uniform walk, by the exported function or by the template under it.
template <typename P, bool ByTemplate>
void Uniform(Input& in, Output& out)
{
    const auto curve = in.GetArray<P, 4>();
    const int lines = in.Get<int>();
    std::vector<P> points(static_cast<std::size_t>(lines) + 1);
    if constexpr (ByTemplate) {
        ConvertFor<P> output{points.data()};
        BezierToLines<P, ConvertFor<P>>(curve.data(), lines, output);
    } else {
        BezierToLines(curve.data(), points.data(), lines);
    }
    out.AddRun(points.data(), points.size());
}

/// The adaptive walk, by the exported function or by the template under it.
template <typename P, bool ByTemplate>
void Adaptive(Input& in, Output& out)
{
    const auto curve = in.GetArray<P, 4>();
    const double tolerance = in.Get<double>();
    const int maxLines = in.Get<int>();
    std::vector<P> points(static_cast<std::size_t>(std::max(maxLines, 0)) + 1);
    int n;
    if constexpr (ByTemplate) {
        ConvertFor<P> output{points.data()};
        n = AdaptiveBezierToLines<P, ConvertFor<P>>(curve.data(), tolerance, maxLines, output);
    } else {
        n = AdaptiveBezierToLines(curve.data(), points.data(), tolerance, maxLines);
    }
    out.Add(n);
    if (maxLines >= 1)
        out.AddRun(points.data(), static_cast<std::size_t>(n) + 1);
}

template <typename P>
void AddFor(Table& table, const std::string& type)
{
    table.Add("CalculateNumBezierLines" + type, LinesOfCurve<P>);
    table.Add("CalculateRecursionDepth" + type, RecursionDepth<P>);
    table.Add("BezierToLines" + type, Uniform<P, false>);
    table.Add("BezierToLines<P,C>" + type, Uniform<P, true>);
    table.Add("AdaptiveBezierToLines" + type, Adaptive<P, false>);
    table.Add("AdaptiveBezierToLines<P,C>" + type, Adaptive<P, true>);
}

} // namespace

void AddBezierToLinesAdapters(Table& table)
{
    table.Add("GetLooseBounds<point2d,int>", LooseBounds);
    table.Add("CalculateNumBezierLines(RECT)", LinesOfRect);
    AddFor<point2d>(table, "(point2d)");
    AddFor<POINT>(table, "(POINT)");
}

} // namespace ZarnMath::Vectors
