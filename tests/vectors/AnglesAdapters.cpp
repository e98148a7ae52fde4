#include "tests/vectors/WMathValues.h"

namespace ZarnMath::Vectors {

namespace {

const std::set<Platform> turns = {Platform::Sin, Platform::Cos};
const std::set<Platform> measures = {Platform::Acos};
const std::set<Platform> directions = {Platform::Atan2};

/// A function from arguments of these types to one value.
template <typename Result, typename... Arguments>
void AddFunction(Table& table, const std::string& name, Result (*function)(Arguments...) noexcept,
                 std::set<Platform> uses = {})
{
    const auto adapter = [function](Input& in, Output& out) {
        std::tuple<std::remove_cvref_t<Arguments>...> arguments;
        std::apply([&](auto&... each) { in.Into(each...); }, arguments);
        out.Add(std::apply(function, arguments));
    };
    table.Add(name, adapter, std::move(uses));
}

/// A constant member of a matrix from one value to another.
template <typename Result, typename Argument>
void AddMember(Table& table, const std::string& name, Result (MATRIX::*member)(Argument) const noexcept,
               std::set<Platform> uses = {})
{
    const auto adapter = [member](Input& in, Output& out) {
        const MATRIX m = in.Get<MATRIX>();
        out.Add((m.*member)(in.Get<std::remove_cvref_t<Argument>>()));
    };
    table.Add(name, adapter, std::move(uses));
}

using OfVectors = double (*)(const vector2d&, const vector2d&) noexcept;
using OfPoints = double (*)(const point2d&, const point2d&, const point2d&) noexcept;
using ToVector = vector2d (*)(double) noexcept;
using ToVectorOfLength = vector2d (*)(double, double) noexcept;

void AddRadians(Table& table)
{
    using namespace Radians;
    AddFunction(table, "Radians::NormalizeAngle", NormalizeAngle);
    AddFunction(table, "Radians::NormalizeFineAngle", NormalizeFineAngle);
    AddFunction(table, "Radians::AngleToVector(angle)", static_cast<ToVector>(AngleToVector), turns);
    AddFunction(table, "Radians::AngleToVector(angle,length)", static_cast<ToVectorOfLength>(AngleToVector), turns);
    AddFunction(table, "Radians::VectorToAngle", VectorToAngle, directions);
    AddFunction(table, "Radians::GetAngle(vectors)", static_cast<OfVectors>(GetAngle), measures);
    AddFunction(table, "Radians::GetAngle(points)", static_cast<OfPoints>(GetAngle), measures);
    AddFunction(table, "Radians::GetFineAngle", GetFineAngle, measures);
    AddFunction(table, "Radians::RotatePoint", RotatePoint, turns);
    AddFunction(table, "Radians::Constrain", Constrain);
    AddFunction(table, "Radians::GetQuadrant", GetQuadrant);
}

void AddDegrees(Table& table)
{
    using namespace Degrees;
    AddFunction(table, "Degrees::NormalizeAngle", NormalizeAngle);
    AddFunction(table, "Degrees::AngleToVector(angle)", static_cast<ToVector>(AngleToVector), turns);
    AddFunction(table, "Degrees::AngleToVector(angle,length)", static_cast<ToVectorOfLength>(AngleToVector), turns);
    AddFunction(table, "Degrees::VectorToAngle", VectorToAngle, directions);
    AddFunction(table, "Degrees::GetAngle(vectors)", static_cast<OfVectors>(GetAngle), measures);
    AddFunction(table, "Degrees::GetAngle(points)", static_cast<OfPoints>(GetAngle), measures);
    AddFunction(table, "Degrees::GetFineAngle", GetFineAngle, measures);
    AddFunction(table, "Degrees::RotatePoint", RotatePoint, turns);
    AddFunction(table, "Degrees::GetRotatedSize", GetRotatedSize, turns);
}

} // namespace

void AddAnglesAdapters(Table& table)
{
    AddRadians(table);
    AddDegrees(table);
    AddFunction(table, "KELDANGLE::NormalizeAngle", KELDANGLE::NormalizeAngle);
    AddFunction(table, "KELDANGLE::VectorToAngle", KELDANGLE::VectorToAngle, directions);
    AddFunction(table, "KELDANGLE::GetAngle", KELDANGLE::GetAngle, measures);
    AddFunction(table, "KELDANGLE::GetFineAngle", KELDANGLE::GetFineAngle, measures);
    const std::set<Platform> turnsAndDirections = {Platform::Sin, Platform::Cos, Platform::Atan2};
    AddMember(table, "MATRIX::GetTransformedRadians", &MATRIX::GetTransformedRadians, turnsAndDirections);
    AddMember(table, "MATRIX::GetUntransformedRadians", &MATRIX::GetUntransformedRadians, turnsAndDirections);
    AddMember(table, "MATRIX::GetUntransformedVector", &MATRIX::GetUntransformedVector);
}

} // namespace ZarnMath::Vectors
