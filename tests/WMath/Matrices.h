/// @file
/// Matrices for the tests: compared by bits, and random ones of every class.
#pragma once

#include "tests/Bits.h"
#include "tests/Random.h"

#include "ZarnMath/WMath.h"

#include <ostream>

inline bool HasSameBits(const MATRIX& a, const MATRIX& b)
{
    using ZarnMath::HasSameBits;
    return HasSameBits(a.m11, b.m11) && HasSameBits(a.m12, b.m12) && HasSameBits(a.dx, b.dx) &&
           HasSameBits(a.m21, b.m21) && HasSameBits(a.m22, b.m22) && HasSameBits(a.dy, b.dy);
}

inline void PrintTo(const MATRIX& m, std::ostream* out)
{
    *out << std::setprecision(17) << '(' << m.m11 << ", " << m.m12 << ", " << m.dx << "; " << m.m21 << ", " << m.m22
         << ", " << m.dy << ')';
}

namespace ZarnMath {

inline constexpr MATRIX identity{1.0, 0.0, 0.0, 0.0, 1.0, 0.0};
inline constexpr MATRIX zeroMatrix{0.0, 0.0, 0.0, 0.0, 0.0, 0.0};

/// The fields in order.
inline constexpr double MATRIX::*matrixFields[] = {&MATRIX::m11, &MATRIX::m12, &MATRIX::dx,
                                                   &MATRIX::m21, &MATRIX::m22, &MATRIX::dy};

/// The matrix with one field replaced.
inline MATRIX With(MATRIX m, double MATRIX::*field, double value)
{
    m.*field = value;
    return m;
}

inline std::uint64_t BitsOf(double v)
{
    std::uint64_t bits = 0;
    std::memcpy(&bits, &v, sizeof bits);
    return bits;
}

/// What a linear part may be.
enum class MatrixClass
{
    Identity,
    Turn,
    QuarterTurn,
    Mirror,
    UniformScale,
    Scale,
    ScaleWithMirror,
    Similarity,
    Shear,
    Generic
};

inline constexpr MatrixClass allMatrixClasses[] = {
    MatrixClass::Identity,     MatrixClass::Turn,   MatrixClass::QuarterTurn,     MatrixClass::Mirror,
    MatrixClass::UniformScale, MatrixClass::Scale,  MatrixClass::ScaleWithMirror, MatrixClass::Similarity,
    MatrixClass::Shear,        MatrixClass::Generic};

/// The product of two linear parts, by its definition.
inline MATRIX LinearProduct(const MATRIX& a, const MATRIX& b)
{
    return {a.m11 * b.m11 + a.m12 * b.m21, a.m11 * b.m12 + a.m12 * b.m22, 0.0,
            a.m21 * b.m11 + a.m22 * b.m21, a.m21 * b.m12 + a.m22 * b.m22, 0.0};
}

inline MATRIX LinearTurn(double angle)
{
    return {std::cos(angle), -std::sin(angle), 0.0, std::sin(angle), std::cos(angle), 0.0};
}

inline MATRIX LinearScale(double sx, double sy)
{
    return {sx, 0.0, 0.0, 0.0, sy, 0.0};
}

/// Well conditioned: scales from 0.25 to 4, shears up to 2.
inline MATRIX RandomLinear(RandomSource& random, MatrixClass kind)
{
    const double angle = random.Uniform(-3.2, 3.2);
    const double sx = std::exp2(random.Uniform(-2.0, 2.0));
    const double sy = std::exp2(random.Uniform(-2.0, 2.0));
    const double shear = random.Uniform(-2.0, 2.0);
    const MATRIX turn = LinearTurn(angle);
    switch (kind) {
    case MatrixClass::Identity:
        return identity;
    case MatrixClass::Turn:
        return turn;
    case MatrixClass::QuarterTurn:
        return random.Integer(0, 1) == 0 ? MATRIX{0.0, -1.0, 0.0, 1.0, 0.0, 0.0}
                                         : MATRIX{0.0, 1.0, 0.0, -1.0, 0.0, 0.0};
    case MatrixClass::Mirror:
        return LinearProduct(turn, LinearScale(1.0, -1.0));
    case MatrixClass::UniformScale:
        return LinearScale(sx, sx);
    case MatrixClass::Scale:
        return LinearScale(sx, sy);
    case MatrixClass::ScaleWithMirror:
        return LinearScale(-sx, sy);
    case MatrixClass::Similarity:
        return LinearProduct(turn, LinearScale(sx, sx));
    case MatrixClass::Shear:
        return {1.0, shear, 0.0, 0.0, 1.0, 0.0};
    case MatrixClass::Generic:
        break;
    }
    return LinearProduct(turn, LinearProduct(LinearScale(sx, sy), {1.0, shear, 0.0, 0.0, 1.0, 0.0}));
}

/// With a translation within `extent`.
inline MATRIX RandomMatrix(RandomSource& random, MatrixClass kind, double extent = 100.0)
{
    MATRIX m = RandomLinear(random, kind);
    m.dx = random.Uniform(-extent, extent);
    m.dy = random.Uniform(-extent, extent);
    return m;
}

/// Calls test(random, kind) many times for each class.
template <typename Test>
void ForEachMatrixClass(std::uint64_t seed, Test test, int repetitions = 200)
{
    RandomSource random(seed);
    for (const MatrixClass kind : allMatrixClasses)
        for (int i = 0; i < repetitions; ++i)
            test(random, kind);
}

/// Six random fields that have nothing to do with each other.
inline MATRIX RandomFields(RandomSource& random)
{
    MATRIX m{};
    for (const auto field : matrixFields)
        m.*field = random.Uniform(-1.0, 1.0) * random.Magnitude();
    return m;
}

inline testing::AssertionResult IsNearPoint(const point2d& actual, const point2d& expected, double tolerance)
{
    if (std::fabs(actual.x - expected.x) <= tolerance && std::fabs(actual.y - expected.y) <= tolerance)
        return testing::AssertionSuccess();
    return testing::AssertionFailure() << "got " << testing::PrintToString(actual) << ", expected "
                                       << testing::PrintToString(expected);
}

inline testing::AssertionResult IsNearVector(const vector2d& actual, const vector2d& expected, double tolerance)
{
    return IsNearPoint(AsPoint(actual), AsPoint(expected), tolerance);
}

inline testing::AssertionResult IsNearMatrix(const MATRIX& actual, const MATRIX& expected, double tolerance)
{
    if (IsEqual(actual, expected, tolerance))
        return testing::AssertionSuccess();
    return testing::AssertionFailure() << "got " << testing::PrintToString(actual) << ", expected "
                                       << testing::PrintToString(expected);
}

} // namespace ZarnMath
