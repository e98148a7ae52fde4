#include "tests/vectors/WMathValues.h"

namespace ZarnMath::Vectors {

namespace {

const std::set<Platform> turns = {Platform::Sin, Platform::Cos};

/// A function that changes a matrix, with arguments of these types after it.
template <typename... Arguments>
void AddUtl(Table& table, const std::string& name, void (*change)(MATRIX*, Arguments...) noexcept,
            std::set<Platform> uses = {})
{
    const auto adapter = [change](Input& in, Output& out) {
        MATRIX m = in.Get<MATRIX>();
        std::tuple<Arguments...> arguments;
        std::apply([&](auto&... each) { in.Into(each...); }, arguments);
        std::apply([&](auto... each) { change(&m, each...); }, arguments);
        out.Add(m);
    };
    table.Add(name, adapter, std::move(uses));
}

/// A member that changes its matrix, with arguments of these types.
template <typename... Arguments>
void AddMember(Table& table, const std::string& name, void (MATRIX::*change)(Arguments...) noexcept,
               std::set<Platform> uses = {})
{
    const auto adapter = [change](Input& in, Output& out) {
        MATRIX m = in.Get<MATRIX>();
        std::tuple<std::remove_cvref_t<Arguments>...> arguments;
        std::apply([&](auto&... each) { in.Into(each...); }, arguments);
        std::apply([&](auto&... each) { (m.*change)(each...); }, arguments);
        out.Add(m);
    };
    table.Add(name, adapter, std::move(uses));
}

template <typename P>
void Apply(Input& in, Output& out)
{
    const MATRIX m = in.Get<MATRIX>();
    out.Add(m(in.Get<P>()));
}

void Multiply(Input& in, Output& out)
{
    const MATRIX a = in.Get<MATRIX>();
    out.Add(a * in.Get<MATRIX>());
}

void Invert(Input& in, Output& out)
{
    MATRIX m = in.Get<MATRIX>();
    const bool result = m.Invert(in.Get<double>());
    out.Add(result, m);
}

void IsIdentity(Input& in, Output& out)
{
    const MATRIX m = in.Get<MATRIX>();
    const bool useTolerance = in.Get<bool>();
    out.Add(m.IsIdentity(useTolerance, in.Get<double>()));
}

void AreEqual(Input& in, Output& out)
{
    const MATRIX a = in.Get<MATRIX>();
    const MATRIX b = in.Get<MATRIX>();
    out.Add(IsEqual(a, b, in.Get<double>()));
}

} // namespace

void AddMatrixAdapters(Table& table)
{
    AddUtl(table, "UTLGetIdentityMatrix", UTLGetIdentityMatrix);
    AddUtl(table, "UTLRotateMatrix", UTLRotateMatrix, turns);
    AddUtl(table, "UTLRotateMatrixAround", UTLRotateMatrixAround, turns);
    AddUtl(table, "UTLTranslateMatrix", UTLTranslateMatrix);
    AddUtl(table, "UTLStretchMatrix", UTLStretchMatrix);
    AddUtl(table, "UTLSkewMatrix", UTLSkewMatrix, {Platform::Tan});
    AddMember(table, "MATRIX::Rotate", &MATRIX::Rotate, turns);
    AddMember(table, "MATRIX::RotateAroundPoint", &MATRIX::RotateAroundPoint, turns);
    AddMember(table, "MATRIX::TransformAroundPoint", &MATRIX::TransformAroundPoint);
    AddMember<const vector2d&>(table, "MATRIX::ScaleMatrix(s)", &MATRIX::ScaleMatrix);
    AddMember<const vector2d&, const point2d&>(table, "MATRIX::ScaleMatrix(s,p)", &MATRIX::ScaleMatrix);
    AddMember(table, "MATRIX::RemoveScaling", &MATRIX::RemoveScaling);
    table.Add("MATRIX::Invert", Invert);
    table.Add("MATRIX::operator()(point2d)", Apply<point2d>);
    table.Add("MATRIX::operator()(vector2d)", Apply<vector2d>);
    table.Add("MATRIX::operator*", Multiply);
    table.Add("MATRIX::IsIdentity", IsIdentity);
    table.Add("IsEqual", AreEqual);
}

} // namespace ZarnMath::Vectors
