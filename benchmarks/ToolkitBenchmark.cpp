// Numbers, layout, and space: the small functions that belong to no curve.

#include "ZarnMath/Layout.h"
#include "ZarnMath/Numeric.h"
#include "ZarnMath/Random.h"
#include "ZarnMath/WMath3D.h"
#include "benchmarks/Inputs.h"

namespace ZarnMath::Benchmarks {
namespace {

using Vector = vector3dT<double>;

const auto numbers = Inputs([](RandomSource& random) { return random.Uniform(-100.0, 100.0); });
const auto shares = Inputs([](RandomSource& random) { return random.Uniform(0.01, 0.99); });
const auto integers = Inputs([](RandomSource& random) { return random.Integer(1, 1000000); });
const std::vector<double> otherShares(shares.rbegin(), shares.rend());
const std::vector<int> otherIntegers(integers.rbegin(), integers.rend());
const auto vectors = Inputs([](RandomSource& random) {
    const double z = random.Uniform(-1.0, 1.0);
    const double angle = random.Uniform(-3.0, 3.0);
    const double radius = std::sqrt(1.0 - z * z);
    return Vector{radius * std::cos(angle), radius * std::sin(angle), z};
});
const std::vector<Vector> otherVectors(vectors.rbegin(), vectors.rend());
const auto turns = Inputs([i = std::size_t{0}](RandomSource&) mutable {
    Quaternion turn;
    turn.RotationCreate(vectors[i], otherVectors[i]);
    ++i;
    return turn;
});
const std::vector<Quaternion> otherTurns(turns.rbegin(), turns.rend());
const auto matrices = Inputs([i = std::size_t{0}](RandomSource&) mutable {
    MATRIX3D m;
    MTHGet3DIdentityMatrix(&m);
    VECT_QuaternionToMat(&turns[i++], &m);
    return m;
});
const auto frames = Inputs([](RandomSource& random) {
    const double left = random.Uniform(-100.0, 100.0);
    const double bottom = random.Uniform(-100.0, 100.0);
    return BoundsT<double>{left, bottom + random.Uniform(50.0, 500.0), left + random.Uniform(50.0, 500.0), bottom};
});
constexpr Layout layout{{LayoutUnit::Relative, 0.5},
                        {LayoutUnit::Absolute, 40.0},
                        {},
                        {},
                        {LayoutUnit::Absolute, 5.0},
                        {},
                        {LayoutUnit::Relative, 0.1},
                        {},
                        1,
                        2};

[[maybe_unused]] const bool areAdded = [] {
    Add(
        "Gaussian", [](double x) { return Gaussian(x, 1.0, 30.0); }, numbers);
    Add("CubeRoot", CubeRoot, numbers);
    Add("GCD", GCD, integers, otherIntegers);
    Add("Bias", Bias, shares, otherShares);
    Add("Gain", Gain, shares, otherShares);
    Add(
        "GetLinearBlendFactor",
        [](int step) { return GetLinearBlendFactor(static_cast<unsigned long>(step), 1000000); }, integers);
    Add(
        "GetLogarithmicBlendFactor", [](double x) { return GetLogarithmicBlendFactor(x, 10.0); }, shares);
    Add(
        "GetBiasGainBlendFactor", [](double x, double gain) { return GetBiasGainBlendFactor(x, gain, 0.3); }, shares,
        otherShares);
    Add("Random::Generate<double>", [] { return Random::Generate(0.0, 1.0); });
    Add("Random::Generate<int>", [] { return Random::Generate(1, 6); });

    Add(
        "LayoutObject", [](auto& frame) { return LayoutObject(frame, layout); }, frames);
    Add(
        "GetLayoutTransformation",
        [](auto& frame) {
            return GetLayoutTransformation(frame, BoundsT<double>{0.0, 10.0, 10.0, 0.0}, layout);
        },
        frames);

    Add(
        "Quaternion*Quaternion", [](auto& a, auto& b) { return a * b; }, turns, otherTurns);
    Add("Quaternion::Rotate", Changing([](Vector& v, auto& q) { q.Rotate(v); }), vectors, turns);
    Add("Quaternion::RotateQuick", Changing([](Vector& v, auto& q) { q.RotateQuick(v); }), vectors, turns);
    Add("Quaternion::RotationCreate", Changing([](Quaternion& q, auto& a, auto& b) { q.RotationCreate(a, b); }), turns,
        vectors, otherVectors);
    Add("Quaternion::ForceZeros", Changing([](Quaternion& q) { q.ForceZeros(); }), turns);
    Add("Quaternion::Interpolate",
        Changing([](Quaternion& a, auto& b, double t) { Quaternion::Interpolate(a, b, t, a); }), turns, otherTurns,
        shares);
    Add("MTHGet3DIdentityMatrix", Changing([](MATRIX3D& m) { MTHGet3DIdentityMatrix(&m); }), matrices);
    Add("MTHTranslate3DMatrix", Changing([](MATRIX3D& m) { MTHTranslate3DMatrix(&m, 1, 2, 3); }), matrices);
    Add("VECT_QuaternionToMat", Changing([](MATRIX3D& m, auto& q) { VECT_QuaternionToMat(&q, &m); }), matrices, turns);
    Add("VECT_MatToQuaternion", Changing([](Quaternion& q, auto& m) { VECT_MatToQuaternion(&m, &q); }), turns,
        matrices);
    return true;
}();

} // namespace
} // namespace ZarnMath::Benchmarks
