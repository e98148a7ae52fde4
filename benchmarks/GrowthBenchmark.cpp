// What takes n of something, over four decades of n: 10^2 to 10^6 points, rows, segments or cells. The fits, the batches of
// points and the tridiagonal solve have programs of their own, with the same numbers.

#include "ZarnMath/BezierToLines.h"
#include "ZarnMath/Bounds.h"
#include "ZarnMath/FitBezierInternal.h"
#include "ZarnMath/FitLine.h"
#include "ZarnMath/Line.h"
#include "ZarnMath/TridiagonalMatrix.h"
#include "ZarnMath/VectorField.h"
#include "ZarnMath/WMath3D.h"
#include "tests/FitBezier/Runs.h"

#include <benchmark/benchmark.h>

namespace ZarnMath {
namespace {

/// Times call(subject, n) for the subject that make(n) gives.
template <typename Make, typename Call>
void Add(const char* name, Make make, Call call)
{
    const auto run = [make, call](benchmark::State& state) mutable {
        const auto n = static_cast<int>(state.range(0));
        auto subject = make(n);
        for (auto _ : state) {
            if constexpr (std::is_void_v<decltype(call(subject, n))>)
                call(subject, n);
            else
                benchmark::DoNotOptimize(call(subject, n));
            benchmark::ClobberMemory();
        }
    };
    benchmark::RegisterBenchmark(name, run)->RangeMultiplier(10)->Range(100, 1000000);
}

template <typename P>
std::vector<P> Points(int n)
{
    RandomSource random(5);
    std::vector<P> points(static_cast<std::size_t>(n));
    for (P& p : points)
        if constexpr (std::is_same_v<P, POINT3D>)
            p = {random.Integer(-1000, 1000), random.Integer(-1000, 1000), random.Integer(1, 1000)};
        else if constexpr (std::is_same_v<P, POINT>)
            p = random.IntegerPoint(10000);
        else
            p = random.Point(10000.0);
    return points;
}

/// On a line, so that all of them are looked at.
template <typename P>
std::vector<P> Collinear(int n)
{
    std::vector<P> points = Points<P>(n);
    for (P& p : points)
        p.y = 2 * p.x + 1;
    return points;
}

template <typename P>
std::vector<P> RoomForSegments(int n)
{
    return std::vector<P>(static_cast<std::size_t>(n) + 1);
}

constexpr point2d centre{512.25, -300.5};
const MATRIX turn = ConstructRotateAroundMatrix(0.3, centre);
constexpr RECT farAway{50000, 60000, 60000, 50000};

void AddPoints()
{
    Add("GetPointsBBox<point2d>", Points<point2d>, [](auto& p, int n) { return GetPointsBBox(p.data(), n); });
    Add("GetPointsBBox<POINT>", Points<POINT>, [](auto& p, int n) { return GetPointsBBox(p.data(), n); });
    Add("GetPointsBBoxInPlace", Points<POINT>, [box = RECT{}](auto& p, int n) mutable {
        GetPointsBBox(p.data(), n, box);
        return box;
    });
    Add("UnionPointsWithRect", Points<POINT>, [](auto& p, int n) {
        RECT box = GetEmptyRect();
        UnionPointsWithRect(box, p.data(), n);
        return box;
    });
    Add("GetTransformedPointsBBox<point2d>", Points<point2d>,
        [](auto& p, int) { return GetTransformedPointsBBox(p.data(), p.size(), turn); });
    Add("GetTransformedPointsBBox<POINT>", Points<POINT>,
        [](auto& p, int) { return GetTransformedPointsBBox(p.data(), p.size(), turn); });
    Add("IsAnyPointInRect", Points<POINT>, [](auto& p, int) { return IsAnyPointInRect(p.data(), p.size(), farAway); });
    Add("GetLeastSquaresLines", Points<point2d>, [](auto& p, int n) {
        std::pair<point2d, vector2d> line;
        GetLeastSquaresLines(p.data(), n, line.first, line.second);
        return line;
    });
    Add("AreCollinear<point2d>", Collinear<point2d>,
        [](auto& p, int) { return AreCollinear(p.data(), p.size(), 1.0); });
    Add("AreCollinear<POINT>", Collinear<POINT>, [](auto& p, int) { return AreCollinear(p.data(), p.size(), 1.0); });
    Add("ReflectAcross", Points<POINT>, [](auto& p, int) { ReflectAcross({300, 400}, {10, 20}, p.data(), p.size()); });
    Add("Degrees::RotatePoints", Points<POINT>,
        [](auto& p, int) { Degrees::RotatePoints(p.data(), p.size(), 17.0, centre); });
    Add("UTLTransformPoint", Points<POINT>, [](auto& p, int n) { UTLTransformPoint(p.data(), &turn, n); });
    Add("MTHTransform3DPoints", Points<POINT3D>, [](auto& p, int n) {
        const MATRIX3D quarterTurn{{{0, -65536, 0, 0}, {65536, 0, 0, 0}, {0, 0, 65536, 0}}};
        MTHTransform3DPoints(p.data(), &quarterTurn, n);
    });
    Add("MTHPerspective3DProjection", Points<POINT3D>, [out = std::vector<POINT>()](auto& p, int n) mutable {
        const POINT3D viewpoint{10, 20, -500};
        out.resize(p.size());
        return MTHPerspective3DProjection(p.data(), out.data(), n, &viewpoint);
    });
}

constexpr Cubic arch = {{{0.0, 0.0}, {100.0, 300.0}, {200.0, 300.0}, {300.0, 0.0}}};
constexpr IntegerCubic integerArch = {{{0, 0}, {100, 300}, {200, 300}, {300, 0}}};

PointRun NoisyArch(int n)
{
    RandomSource random(7);
    return NoisyRun(random, arch, static_cast<std::size_t>(n), 1.0);
}

void AddCurves()
{
    Add("BezierToLines<point2d>", RoomForSegments<point2d>,
        [](auto& out, int n) { BezierToLines(arch.data(), out.data(), n); });
    Add("BezierToLines<POINT>", RoomForSegments<POINT>,
        [](auto& out, int n) { BezierToLines(integerArch.data(), out.data(), n); });
    Add("Reparameterize_u", NoisyArch, [](PointRun& run, int n) {
        return Reparameterize_u(run.points.data(), arch.data(), run.u.data(), n, nullptr, {-1.0, 400.0, 400.0, -1.0});
    });
    Add(
        "TridiagonalMatrix::AddRow", [](int) { return 0; },
        [](int, int n) {
            TridiagonalMatrix matrix;
            for (int i = 0; i < n; ++i)
                matrix.AddRow(1.0, 4.0, 1.0);
            return matrix;
        });
}

/// Calls f(x, y) for the cells of a field, row by row.
template <typename F>
void ForEachCell(const VectorField& field, F f)
{
    for (int y = 0; y < field.height; ++y)
        for (int x = 0; x < field.width; ++x)
            f(x, y);
}

void Write(VectorField& field)
{
    ForEachCell(field, [&](int x, int y) { field.SetVector(x, y, {static_cast<float>(x), static_cast<float>(y)}); });
}

/// Of about n cells, as many rows as columns, all of them written.
VectorField Field(int n)
{
    const int columns = static_cast<int>(std::sqrt(n));
    VectorField field;
    field.Initialize(columns, n / columns, 0, 0);
    Write(field);
    return field;
}

void AddFields()
{
    Add(
        "VectorField, written cell by cell", [](int n) { return n; }, [](int, int n) { return Field(n); });
    Add("VectorField, written anew", Field, [](VectorField& field, int) {
        field.ClearVectors();
        Write(field);
    });
    Add("VectorField, read cell by cell", Field, [](VectorField& field, int) {
        vector2dT<float, false> sum{};
        ForEachCell(field, [&](int x, int y) { sum = sum + field.GetVector(x, y); });
        return sum;
    });
    Add("VectorField::Get along scanlines", Field, [](VectorField& field, int) {
        vector2dT<float, false> sum{};
        ForEachCell(field, [&](int x, int y) {
            sum = sum + field.Get({static_cast<float>(x) + 0.25F, static_cast<float>(y) + 0.5F});
        });
        return sum;
    });
    Add("VectorField, copied", Field, [](VectorField& field, int) { return VectorField(field); });
    Add("VectorField::GetRegion", Field, [](VectorField& field, int) { return field.GetRegion(field.GetZGIRECT()); });
    Add("VectorField::Rebound", Field, [isWider = false](VectorField& field, int) mutable {
        const RECT bounds = field.GetZGIRECT();
        isWider = !isWider;
        return field.Rebound({bounds.left, bounds.top, bounds.right + (isWider ? 1 : -1), bounds.bottom});
    });
    Add("VectorField::Blit", Field, [target = VectorField()](VectorField& field, int) mutable {
        if (target.width != field.width)
            target = field;
        return target.Blit(field, 1, 1);
    });
    Add("VectorField::BlitExtend", Field, [](VectorField& field, int) {
        VectorField target;
        target.BlitExtend(field, 3, 3);
        return target;
    });
}

[[maybe_unused]] const bool areAdded = [] {
    AddPoints();
    AddCurves();
    AddFields();
    return true;
}();

} // namespace
} // namespace ZarnMath
