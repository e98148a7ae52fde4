// Angles and directions, in the three units. Most of the time goes into the machine's own sines and arc tangents.

#include "ZarnMath/WMath.h"
#include "benchmarks/Inputs.h"

namespace ZarnMath::Benchmarks {
namespace {

const auto radians = Inputs([](RandomSource& random) { return random.Uniform(-10.0, 10.0); });
const auto degrees = Inputs([](RandomSource& random) { return random.Uniform(-720.0, 720.0); });
const auto millionths = Inputs([](RandomSource& random) { return random.Integer(-720000000, 720000000); });
const auto points = Inputs([](RandomSource& random) { return random.Point(1000.0); });
const auto vectors = Inputs([](RandomSource& random) { return AsVector(random.Point(1000.0)); });
const auto sizes = Inputs([](RandomSource& random) { return SIZE{random.Integer(1, 1000), random.Integer(1, 1000)}; });
const std::vector<vector2d> otherVectors(vectors.rbegin(), vectors.rend());

constexpr point2d centre{512.25, -300.5};
constexpr point2d corner{-3.0, 4.0};

[[maybe_unused]] const bool areAdded = [] {
    Add("Radians::NormalizeAngle", Radians::NormalizeAngle, radians);
    Add("Radians::NormalizeFineAngle", Radians::NormalizeFineAngle, radians);
    Add(
        "Radians::AngleToVector", [](double a) { return Radians::AngleToVector(a); }, radians);
    Add(
        "Radians::AngleToVector of a length", [](double a) { return Radians::AngleToVector(a, 7.5); }, radians);
    Add("Radians::VectorToAngle", Radians::VectorToAngle, vectors);
    Add(
        "Radians::GetAngle", [](auto& a, auto& b) { return Radians::GetAngle(a, b); }, vectors, otherVectors);
    Add(
        "Radians::GetAngle at a vertex", [](auto& p) { return Radians::GetAngle(p, corner, centre); }, points);
    Add("Radians::GetFineAngle", Radians::GetFineAngle, vectors, otherVectors);
    Add(
        "Radians::RotatePoint", [](auto& p, double a) { return Radians::RotatePoint(p, a, centre); }, points, radians);
    Add(
        "Radians::Constrain", [](double a) { return Radians::Constrain(a, 8, 0.1); }, radians);
    Add("Radians::GetQuadrant", Radians::GetQuadrant, radians);

    Add("Degrees::NormalizeAngle", Degrees::NormalizeAngle, degrees);
    Add(
        "Degrees::AngleToVector", [](double a) { return Degrees::AngleToVector(a); }, degrees);
    Add(
        "Degrees::AngleToVector of a length", [](double a) { return Degrees::AngleToVector(a, 7.5); }, degrees);
    Add("Degrees::VectorToAngle", Degrees::VectorToAngle, vectors);
    Add(
        "Degrees::GetAngle", [](auto& a, auto& b) { return Degrees::GetAngle(a, b); }, vectors, otherVectors);
    Add(
        "Degrees::GetAngle at a vertex", [](auto& p) { return Degrees::GetAngle(p, corner, centre); }, points);
    Add("Degrees::GetFineAngle", Degrees::GetFineAngle, vectors, otherVectors);
    Add(
        "Degrees::RotatePoint", [](auto& p, double a) { return Degrees::RotatePoint(p, a, centre); }, points, degrees);
    Add("Degrees::GetRotatedSize", Degrees::GetRotatedSize, sizes, degrees);

    Add("KELDANGLE::NormalizeAngle", KELDANGLE::NormalizeAngle, millionths);
    Add("KELDANGLE::VectorToAngle", KELDANGLE::VectorToAngle, vectors);
    Add(
        "KELDANGLE::GetAngle", [](auto& p) { return KELDANGLE::GetAngle(p, corner, centre); }, points);
    Add(
        "KELDANGLE::GetFineAngle", [](auto& p) { return KELDANGLE::GetFineAngle(p, corner, centre); }, points);
    return true;
}();

} // namespace
} // namespace ZarnMath::Benchmarks
