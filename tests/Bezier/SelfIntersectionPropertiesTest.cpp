// What holds of every crossing of a curve with itself, on thousands of curves of all shapes and sizes. Where a known
// loss breaks a rule, the loss is named, counted, and kept rare.
#include "ZarnMath/Bezier.h"

#include "tests/Bezier/CurveMeasures.h"

#include <gtest/gtest.h>

namespace ZarnMath::CubicBezier {

namespace {

constexpr std::uint64_t seed = 20261120;

Cubic Reversed(const Cubic& c)
{
    return {c[3], c[2], c[1], c[0]};
}

/// The two parameters at which the polynomial passes one point, wherever they lie; NaN where they are not real.
///
/// P(s) = P(t) with s unlike t means a*(s^2 + s*t + t^2) + b*(s + t) + c = 0. Crossed with a and with b, this gives
/// s + t = -AC/AB and s*t = (s + t)^2 - BC/AB.
struct DoublePoint
{
    double discriminant;
    double early;
    double late;

    explicit DoublePoint(const PowerForm& f)
    {
        const double ab = Cross(f.a, f.b);
        const double sum = -Cross(f.a, f.c) / ab;
        const double product = sum * sum - Cross(f.b, f.c) / ab;
        discriminant = sum * sum - 4.0 * product;
        early = (sum - std::sqrt(discriminant)) * 0.5;
        late = (sum + std::sqrt(discriminant)) * 0.5;
    }
};

TEST(SelfIntersectionProperties, IsDetectedWhereTheDoublePointIsOnTheCurve)
{
    RandomSource random(seed);
    int loops = 0;
    int marginal = 0;
    int straight = 0;
    for (int i = 0; i < 20000; ++i) {
        const Cubic curve = random.Curve(i % 2 == 0 ? Shape::Loop : random.AnyShape(), random.Magnitude());
        const PowerForm f = ToPowerForm(curve.data());
        // On a straight curve the rounding of the cross products decides.
        if (!(std::fabs(Cross(f.a, f.b)) > 1e-10 * std::sqrt(LengthSquared(f.a) * LengthSquared(f.b)))) {
            ++straight;
            continue;
        }
        const DoublePoint expected(f);
        double late[2];
        double early[2];
        const bool detected = DoesBezierSelfIntersect(curve.data(), late[0], late[1], early[0], early[1], true);
        // The limits are a cusp, and a passage through an end.
        const bool isReal = expected.discriminant > 0.0;
        const double margin = std::min(expected.early, 1.0 - expected.late);
        if (!(std::fabs(expected.discriminant) > 1e-6) || (isReal && !(std::fabs(margin) > 1e-6))) {
            ++marginal;
            continue;
        }
        ASSERT_EQ(detected, isReal && margin > 0.0) << i;
        if (!detected)
            continue;
        ++loops;
        ASSERT_TRUE(0.0 <= early[0] && early[0] <= early[1] && early[1] <= 1.0);
        ASSERT_TRUE(0.0 <= late[0] && late[0] <= late[1] && late[1] <= 1.0);
        ASSERT_TRUE(early[0] < expected.early && expected.early < early[1]) << i;
        ASSERT_TRUE(late[0] < expected.late && expected.late < late[1]) << i;
    }
    RecordProperty("loops", loops);
    RecordProperty("marginal", marginal);
    RecordProperty("straight", straight);
    EXPECT_GT(loops, 5000);
    EXPECT_LT(marginal, 2500);
    EXPECT_LT(straight, 5000);
}

TEST(SelfIntersectionProperties, IsReversedWithTheCurve)
{
    RandomSource random(seed);
    int loops = 0;
    for (int i = 0; i < 10000; ++i) {
        const Cubic curve = random.Curve(Shape::Loop, random.Magnitude());
        double late[2];
        double early[2];
        double reversedLate[2];
        double reversedEarly[2];
        const bool detected = DoesBezierSelfIntersect(curve.data(), late[0], late[1], early[0], early[1], true);
        ASSERT_EQ(DoesBezierSelfIntersect(Reversed(curve).data(), reversedLate[0], reversedLate[1], reversedEarly[0],
                                          reversedEarly[1], true),
                  detected);
        if (!detected)
            continue;
        ++loops;
        for (int k = 0; k < 2; ++k) {
            ASSERT_NEAR(reversedLate[k], 1.0 - early[1 - k], 1e-9);
            ASSERT_NEAR(reversedEarly[k], 1.0 - late[1 - k], 1e-9);
        }
    }
    EXPECT_GT(loops, 5000);
}

TEST(SelfIntersectionProperties, IsFoundAtTheDoublePoint)
{
    RandomSource random(seed);
    int found = 0;
    int smallLoops = 0;
    int smallPieces = 0;
    for (int i = 0; i < 10000; ++i) {
        const Cubic curve = random.Curve(Shape::Loop, std::pow(10.0, random.Uniform(1.0, 7.0)));
        const DoublePoint expected(ToPowerForm(curve.data()));
        double late[2];
        double early[2];
        double first = -77.0;
        double second = -77.0;
        point2d point{};
        const bool detected = DoesBezierSelfIntersect(curve.data(), late[0], late[1], early[0], early[1], true);
        const bool isFound = FindBezierSelfIntersection(curve.data(), first, second, point);
        if (!isFound) {
            // The pieces are halved seven times, and have to stay above one unit.
            const double lateSize = Distance(At(curve, late[0]), At(curve, late[1]));
            const double earlySize = Distance(At(curve, early[0]), At(curve, early[1]));
            smallPieces += detected ? 1 : 0;
            ASSERT_TRUE(!detected || std::min(lateSize, earlySize) < 1000.0) << i;
            continue;
        }
        ASSERT_TRUE(detected);
        ++found;
        // A chord of 2^-8 of each piece stands for the curve.
        const double size = Size(curve);
        ASSERT_GT(first, second);
        ASSERT_NEAR(first, expected.late, 1e-4) << i;
        ASSERT_NEAR(second, expected.early, 1e-4) << i;
        ASSERT_LT(Distance(At(curve, first), point), 1e-9 * size);
        ASSERT_LT(Distance(At(curve, second), point), 1e-3 * size);
        smallLoops += size < 1000.0 ? 1 : 0;
    }
    RecordProperty("found", found);
    RecordProperty("foundBelow1000Units", smallLoops);
    RecordProperty("detectedButTooSmall", smallPieces);
    EXPECT_GT(found, 3000);
    EXPECT_GT(smallPieces, 1000);
}

} // namespace

} // namespace ZarnMath::CubicBezier
