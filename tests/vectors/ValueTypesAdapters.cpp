#include "tests/vectors/Table.h"

namespace ZarnMath::Vectors {

namespace {

template <typename T>
void Arithmetic(Input& in, Output& out)
{
    const auto a = in.Get<vector2dT<T, true>>();
    const auto b = in.Get<vector2dT<T, true>>();
    const auto v = in.Get<vector2dT<T, false>>();
    const auto w = in.Get<vector2dT<T, false>>();
    const T s = in.Get<T>();
    out.Add(a - b, a + v, a - v, v + w, v - w, v * s, s * v, v / s);
}

/// A product of two pairs in the four mixtures of points and vectors.
template <typename T, typename Product>
Adapter InAllMixtures(Product product)
{
    return [product](Input& in, Output& out) {
        const auto a = in.Get<vector2dT<T, true>>();
        const auto b = in.Get<vector2dT<T, true>>();
        out.Add(product(a, b), product(a, AsVector(b)), product(AsVector(a), b), product(AsVector(a), AsVector(b)));
    };
}

template <typename T>
void AddFor(Table& table, const std::string& arithmetic, const std::string& suffix)
{
    table.Add(arithmetic, Arithmetic<T>);
    table.Add("Dot" + suffix, InAllMixtures<T>([](const auto& a, const auto& b) { return Dot(a, b); }));
    table.Add("Cross" + suffix, InAllMixtures<T>([](const auto& a, const auto& b) { return Cross(a, b); }));
    table.Add("LengthSquared" + suffix, [](Input& in, Output& out) {
        const auto a = in.Get<vector2dT<T, true>>();
        out.Add(LengthSquared(a), LengthSquared(AsVector(a)));
    });
}

void AddComparisons(Table& table)
{
    table.Add("IsNearZero", [](Input& in, Output& out) { out.Add(IsNearZero(in.Get<double>())); });
    table.Add("IsNearEqual", [](Input& in, Output& out) {
        const auto [a, b] = in.GetArray<double, 2>();
        out.Add(IsNearEqual(a, b));
    });
    table.Add("IsNearEqual(point)", [](Input& in, Output& out) {
        const auto [p, q] = in.GetArray<point2d, 2>();
        out.Add(IsNearEqual(p, q));
    });
    table.Add("IsAtLeast", [](Input& in, Output& out) {
        const auto [a, b] = in.GetArray<double, 2>();
        out.Add(IsAtLeast(a, b));
    });
}

} // namespace

void AddValueTypesAdapters(Table& table)
{
    AddFor<double>(table, "vector2dT<double> arithmetic", "");
    AddFor<float>(table, "vector2dT<float> arithmetic", "<float>");
    AddComparisons(table);
    table.Add("Normalize", [](Input& in, Output& out) { out.Add(Normalize(in.Get<vector2d>())); });
    table.Add("Perpendicular", [](Input& in, Output& out) { out.Add(Perpendicular(in.Get<vector2d>())); });
    table.Add("RoundToInt", [](Input& in, Output& out) { out.Add(RoundToInt(in.Get<double>())); });
    table.Add("point2d2ZGIPOINT<10>", [](Input& in, Output& out) {
        const auto points = in.GetArray<point2d, 10>();
        std::array<POINT, 10> rounded{};
        point2d2ZGIPOINT<10>(rounded.data(), points.data());
        out.AddArray(rounded);
    });
}

} // namespace ZarnMath::Vectors
