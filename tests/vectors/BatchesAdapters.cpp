#include "tests/vectors/WMathValues.h"

namespace ZarnMath::Vectors {

namespace {

/// The functions are handed a stretch of a longer buffer, whose ends have to stay.
template <typename P>
void AddTransform(Table& table, const std::string& name, void (MATRIX::*transform)(P*, unsigned long) const noexcept)
{
    table.Add(name, [transform](Input& in, Output& out) {
        const MATRIX m = in.Get<MATRIX>();
        auto buffer = in.GetVector<P>();
        const auto start = in.Get<std::uint32_t>();
        (m.*transform)(buffer.data() + start, in.Get<unsigned long>());
        out.AddRun(buffer.data(), buffer.size());
    });
}

void TransformBySignedCount(Input& in, Output& out)
{
    auto buffer = in.GetVector<POINT>();
    const auto start = in.Get<std::uint32_t>();
    const MATRIX m = in.Get<MATRIX>();
    UTLTransformPoint(buffer.data() + start, &m, in.Get<std::int64_t>());
    out.AddRun(buffer.data(), buffer.size());
}

void AddRotation(Table& table, const std::string& name,
                 void (*rotate)(POINT*, unsigned long, double, const point2d&) noexcept)
{
    const auto adapter = [rotate](Input& in, Output& out) {
        auto buffer = in.GetVector<POINT>();
        const auto start = in.Get<std::uint32_t>();
        const auto count = in.Get<unsigned long>();
        const double angle = in.Get<double>();
        rotate(buffer.data() + start, count, angle, in.Get<point2d>());
        out.AddRun(buffer.data(), buffer.size());
    };
    table.Add(name, adapter, {Platform::Sin, Platform::Cos});
}

template <typename P>
void Translate(Input& in, Output& out)
{
    auto buffer = in.GetVector<P>();
    const auto start = in.Get<std::uint32_t>();
    const auto count = in.Get<unsigned long>();
    TranslatePoints(buffer.data() + start, count, in.Get<P>());
    out.AddRun(buffer.data(), buffer.size());
}

} // namespace

void AddBatchesAdapters(Table& table)
{
    AddTransform<POINT>(table, "MATRIX::TransformPoints(POINT)", &MATRIX::TransformPoints);
    AddTransform<point2d>(table, "MATRIX::TransformPoints(point2d)", &MATRIX::TransformPoints);
    AddTransform<POINT>(table, "MATRIX::TransformPointsWithRangeCheck", &MATRIX::TransformPointsWithRangeCheck);
    table.Add("UTLTransformPoint", TransformBySignedCount);
    AddRotation(table, "Radians::RotatePoints", Radians::RotatePoints);
    AddRotation(table, "Degrees::RotatePoints", Degrees::RotatePoints);
    table.Add("TranslatePoints(POINT)", Translate<POINT>);
    table.Add("TranslatePoints(point2d)", Translate<point2d>);
}

} // namespace ZarnMath::Vectors
