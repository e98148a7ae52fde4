#include "ZarnMath/Circle.h"

#include "tests/Sentinels.h"
#include "tests/WMath/Matrices.h"

#include "ZarnMath/Bounds.h"
#include "ZarnMath/CircleInternal.h"

#include <cfloat>

namespace ZarnMath {

namespace {

constexpr double quarterPi = 0.78539816339744828;
constexpr double halfPi = 1.5707963267948966;

static_assert(noexcept(GetNormalOnTransformedCircle(identity, point2d{})));
static_assert(noexcept(GetTransformedCircleBBox(identity, 1.0, point2d{})));

struct Ellipse
{
    double major = sentinel<double>;
    double minor = sentinel<double>;
    double angle = sentinel<double>;
};

Ellipse Params(const MATRIX& m)
{
    Ellipse e;
    GetTransformedCircleParams(m, e.major, e.minor, &e.angle);
    Ellipse lengths;
    GetTransformedCircleAxisLengths(m, lengths.major, lengths.minor);
    EXPECT_TRUE(SameBits(lengths.major, e.major));
    EXPECT_TRUE(SameBits(lengths.minor, e.minor));
    Ellipse withoutAngle;
    GetTransformedCircleParams(m, withoutAngle.major, withoutAngle.minor, nullptr);
    EXPECT_TRUE(SameBits(withoutAngle.major, e.major));
    EXPECT_TRUE(SameBits(withoutAngle.minor, e.minor));
    return e;
}

struct Axes
{
    vector2d major = sentinel<vector2d>;
    vector2d minor = sentinel<vector2d>;
};

Axes AxesOf(const MATRIX& m)
{
    Axes axes;
    GetTransformedCircleAxes(m, axes.major, axes.minor);
    return axes;
}

void ExpectEllipse(const MATRIX& m, double major, double minor, double angle)
{
    const Ellipse e = Params(m);
    EXPECT_EQ(e.major, major);
    EXPECT_EQ(e.minor, minor);
    EXPECT_EQ(e.angle, angle);
}

TEST(CircleParams, OfAlignedRows)
{
    ExpectEllipse(identity, 1.0, 1.0, halfPi);
    ExpectEllipse({3, 0, 50, 0, 2, 60}, 3.0, 2.0, 0.0);
    ExpectEllipse({2, 0, 50, 0, 3, 60}, 3.0, 2.0, halfPi);
    ExpectEllipse({0, -3, 0, 2, 0, 0}, 3.0, 2.0, 0.0);
}

TEST(CircleParams, OfAMirrorArePositive)
{
    ExpectEllipse({1, 0, 0, 0, -1, 0}, 1.0, 1.0, halfPi);
    ExpectEllipse({-3, 0, 0, 0, 2, 0}, 3.0, 2.0, 0.0);
}

TEST(CircleParams, OfTheZeroMatrixAreNaN)
{
    const Ellipse e = Params(zeroMatrix);
    EXPECT_TRUE(std::isnan(e.major));
    EXPECT_TRUE(std::isnan(e.minor));
    EXPECT_EQ(e.angle, halfPi);
}

TEST(CircleParams, OfASingularMatrixHaveNoMajorAxis)
{
    const Ellipse e = Params({1, 2, 0, 2, 4, 0});
    EXPECT_TRUE(std::isnan(e.major)); // 0 / sqrt(25 - 25)
    EXPECT_EQ(e.minor, 0.0);
}

TEST(CircleParams, RowsCountAsAlignedUpToTheTolerance)
{
    // The product of the rows is m12.
    EXPECT_EQ(Params({1, DBL_EPSILON, 0, 0, 1, 0}).angle, halfPi);
    EXPECT_EQ(Params({1, -DBL_EPSILON, 0, 0, 1, 0}).angle, halfPi);
    EXPECT_EQ(Params({1, Above(DBL_EPSILON), 0, 0, 1, 0}).angle, -quarterPi);
    EXPECT_EQ(Params({1, -Above(DBL_EPSILON), 0, 0, 1, 0}).angle, quarterPi);
}

TEST(CircleParams, RowsOfEqualLengthTurnByAQuarterEitherWay)
{
    // Along (1, 1) the factor is 1.5, and 0.5 across; yet the angle is that of (1, -1) where the rows agree.
    const Ellipse agreeing = Params({1, 0.5, 0, 0.5, 1, 0});
    EXPECT_EQ(agreeing.angle, -quarterPi);
    EXPECT_NEAR(agreeing.major, 1.5, 1e-15);
    EXPECT_NEAR(agreeing.minor, 0.5, 1e-15);
    EXPECT_EQ(Params({1, -0.5, 0, -0.5, 1, 0}).angle, quarterPi);
}

TEST(CircleParams, ByTheirFormula)
{
    EXPECT_EQ(BitsOf(1.4142135623730951), 0x3FF6A09E667F3BCDU);
    RandomSource random(1);
    for (int i = 0; i < 2000; ++i) {
        const MATRIX m = RandomFields(random);
        const double det = m.m11 * m.m22 - m.m21 * m.m12;
        const double P = m.m22 * m.m22 + m.m21 * m.m21;
        const double Q = m.m11 * m.m11 + m.m12 * m.m12;
        const double R = m.m11 * m.m21 + m.m22 * m.m12;
        if (std::fabs(R) <= DBL_EPSILON)
            continue;
        const double e = P - Q;
        const double f = -R - R;
        const double D = std::sqrt(e * e + f * f);
        const double g = det * 1.4142135623730951;
        const Ellipse ellipse = Params(m);
        EXPECT_TRUE(SameBits(ellipse.major, std::fabs(g / std::sqrt((P + Q) - D))));
        EXPECT_TRUE(SameBits(ellipse.minor, std::fabs(g / std::sqrt((P + Q) + D))));
        EXPECT_TRUE(SameBits(ellipse.angle, std::atan(f / e) * 0.5 + (P > Q ? halfPi : 0.0)));
    }
}

TEST(CircleAxes, OfTheIdentity)
{
    const Axes axes = AxesOf(identity);
    EXPECT_TRUE(SameBits(axes.major, vector2d{std::cos(halfPi), 1.0}));
    EXPECT_TRUE(SameBits(axes.minor, vector2d{-1.0, std::cos(halfPi)}));
}

TEST(CircleAxes, MinorIsMajorTurnedToTheLeft)
{
    const Axes axes = AxesOf({3, 0, 0, 0, 2, 0});
    EXPECT_TRUE(SameBits(axes.major, vector2d{3.0, 0.0}));
    EXPECT_TRUE(SameBits(axes.minor, vector2d{-0.0, 2.0}));
}

TEST(CircleAxes, OfAVerySmallEllipse)
{
    // Its squared length is at most DBL_EPSILON: the minor axis is (b, major.x).
    const double edge = 0x1p-26;
    Axes axes = AxesOf({edge, 0, 0, 0, edge * 0.5, 0});
    EXPECT_TRUE(SameBits(axes.major, vector2d{edge, 0.0}));
    EXPECT_TRUE(SameBits(axes.minor, vector2d{edge * 0.5, edge}));
    axes = AxesOf({edge * 1.5, 0, 0, 0, edge * 0.5, 0});
    EXPECT_TRUE(SameBits(axes.major, vector2d{edge * 1.5, 0.0}));
    EXPECT_TRUE(SameBits(axes.minor, vector2d{-0.0, edge * 0.5}));
}

TEST(CircleAxes, OfASingularMatrix)
{
    const Axes axes = AxesOf({1, 2, 0, 2, 4, 0});
    EXPECT_TRUE(SameBits(axes.major, vector2d{nan, nan}));
    EXPECT_TRUE(SameBits(axes.minor, vector2d{0.0, nan}));
}

TEST(CircleAxes, ArePerpendicularAndAsLongAsTheMatrixStretches)
{
    ForEachMatrixClass(2, [](RandomSource& random, MatrixClass kind) {
        const MATRIX m = RandomMatrix(random, kind);
        const Axes axes = AxesOf(m);
        const double major = std::hypot(axes.major.x, axes.major.y);
        const double minor = std::hypot(axes.minor.x, axes.minor.y);
        EXPECT_NEAR(Dot(axes.major, axes.minor), 0.0, 1e-12 * major * minor);
        EXPECT_NEAR(major, m.GetMaximumMatrixVectorScale(), 1e-6 * major); // cancels where the axes are nearly equal
        EXPECT_NEAR(major * minor, std::fabs(m.m11 * m.m22 - m.m21 * m.m12), 1e-6 * major * minor);
        EXPECT_GE(major, minor * (1.0 - 1e-6));
    });
}

TEST(CircleAxes, LieOnTheEllipse)
{
    ForEachMatrixClass(3, [](RandomSource& random, MatrixClass kind) {
        MATRIX m = RandomMatrix(random, kind);
        const Axes axes = AxesOf(m);
        ASSERT_TRUE(m.Invert(DBL_EPSILON));
        EXPECT_NEAR(LengthSquared(m(axes.major)), 1.0, 1e-6);
        EXPECT_NEAR(LengthSquared(m(axes.minor)), 1.0, 1e-6);
    });
}

TEST(CircleNormal, OfSimpleMatrices)
{
    EXPECT_TRUE(SameBits(GetNormalOnTransformedCircle(identity, {3.0, 4.0}), vector2d{3.0, 4.0}));
    // The transpose times the image, over the determinant: (2*2*3, 4) / 2.
    EXPECT_EQ(GetNormalOnTransformedCircle({2, 0, 0, 0, 1, 0}, {3.0, 4.0}), (vector2d{6.0, 2.0}));
    // The translation counts: the image is (13, 4).
    EXPECT_EQ(GetNormalOnTransformedCircle({1, 0, 10, 0, 1, 0}, {3.0, 4.0}), (vector2d{13.0, 4.0}));
}

TEST(CircleNormal, FollowsAMirror)
{
    EXPECT_EQ(GetNormalOnTransformedCircle({1, 0, 0, 0, -1, 0}, {3.0, 4.0}), (vector2d{3.0, 4.0}));
    EXPECT_EQ(GetNormalOnTransformedCircle({0, 1, 0, 1, 0, 0}, {3.0, 4.0}), (vector2d{3.0, 4.0}));
}

TEST(CircleNormal, OfASingularMatrixIsTheImage)
{
    // The tangent (-22, 11) at the image (11, 22) is not carried back.
    EXPECT_EQ(GetNormalOnTransformedCircle({1, 2, 0, 2, 4, 0}, {3.0, 4.0}), (vector2d{11.0, 22.0}));
    // Mirrored, if ever so little.
    const MATRIX mirrored{1, 0, 0, 0, -0x1p-60, 0};
    EXPECT_EQ(GetNormalOnTransformedCircle(mirrored, {3.0, 0.0}), (vector2d{-3.0, 0.0}));
}

TEST(CircleNormal, IsTheTransposeTimesTheImage)
{
    ForEachMatrixClass(4, [](RandomSource& random, MatrixClass kind) {
        const MATRIX m = RandomMatrix(random, kind);
        const point2d p = random.Point(10.0);
        const point2d q = m(p);
        const double det = std::fabs(m.m11 * m.m22 - m.m21 * m.m12);
        const vector2d expected = vector2d{m.m11 * q.x + m.m21 * q.y, m.m12 * q.x + m.m22 * q.y} / det;
        EXPECT_TRUE(IsNearVector(GetNormalOnTransformedCircle(m, p), expected, 1e-9));
    });
}

TEST(PointWithNormal, KeepsItsSign)
{
    EXPECT_TRUE(SameBits(FindPointOnEllipseThatHasNormal({1.0, 0.0}, 2.0, 1.0), point2d{-1.0, -0.0}));
    EXPECT_TRUE(SameBits(FindPointOnEllipseThatHasNormal({0.0, -3.0}, 2.0, 1.0), point2d{-0.0, 1.0}));
}

TEST(PointWithNormal, OfNothingIsNaN)
{
    EXPECT_TRUE(SameBits(FindPointOnEllipseThatHasNormal({0.0, 0.0}, 2.0, 1.0), point2d{nan, nan}));
    EXPECT_TRUE(SameBits(FindPointOnEllipseThatHasNormal({1.0, 2.0}, 0.0, 0.0), point2d{nan, nan}));
}

TEST(PointWithNormal, GroupsTheSquareFirst)
{
    // a*a overflows before the small component can help; a*(a*n.x) would not.
    EXPECT_TRUE(SameBits(FindPointOnEllipseThatHasNormal({1e-100, 0.0}, 1e160, 1.0).x, -0.0));
}

TEST(PointWithNormal, IsWhereTheEllipseHasIt)
{
    RandomSource random(5);
    for (int i = 0; i < 1000; ++i) {
        const vector2d n = random.Point(10.0) - point2d{};
        const double a = random.Uniform(0.1, 5.0);
        const double b = random.Uniform(0.1, 5.0);
        const point2d p = FindPointOnEllipseThatHasNormal(n, a, b);
        EXPECT_NEAR(LengthSquared(p), 1.0, 1e-12); // on the unit circle
        // Scaled onto the ellipse, its gradient (x/a^2, y/b^2) = (p.x/a, p.y/b) points against n.
        const vector2d gradient{p.x / a, p.y / b};
        EXPECT_NEAR(Cross(gradient, n), 0.0, 1e-9 * std::sqrt(LengthSquared(gradient) * LengthSquared(n)));
        EXPECT_LT(Dot(gradient, n), 0.0);
    }
}

TEST(CircleBox, OfTheIdentity)
{
    const BoundsT<double> box = GetTransformedCircleBBox(identity, 2.0, {1.0, 1.0});
    EXPECT_EQ(box, (BoundsT<double>{-1.0, 3.0, 3.0, -1.0}));
}

TEST(CircleBox, OfATurnIsThatOfTheIdentity)
{
    for (double r = -7.0; r < 7.0; r += 0.1) {
        MATRIX m = identity;
        m.Rotate(r);
        const BoundsT<double> box = GetTransformedCircleBBox(m, 2.0, {1.0, 1.0});
        EXPECT_NEAR(box.left, -1.0, 1e-14);
        EXPECT_NEAR(box.top, 3.0, 1e-14);
        EXPECT_NEAR(box.right, 3.0, 1e-14);
        EXPECT_NEAR(box.bottom, -1.0, 1e-14);
    }
}

TEST(CircleBox, IgnoresTheTranslationAndDoesNotMoveTheCentre)
{
    const MATRIX m{2, 1, 0, -1, 3, 0};
    EXPECT_EQ(GetTransformedCircleBBox(With(m, &MATRIX::dx, 100.0), 2.0, {1.0, 1.0}),
              GetTransformedCircleBBox(m, 2.0, {1.0, 1.0}));
    const BoundsT<double> box = GetTransformedCircleBBox(m, 2.0, {5.0, 7.0});
    EXPECT_NEAR((box.left + box.right) * 0.5, 5.0, 1e-14);
    EXPECT_NEAR((box.top + box.bottom) * 0.5, 7.0, 1e-14);
}

TEST(CircleBox, OfRadiusZeroIsTheCentre)
{
    EXPECT_EQ(GetTransformedCircleBBox({2, 1, 0, -1, 3, 0}, 0.0, {5.0, 7.0}), (BoundsT<double>{5.0, 7.0, 5.0, 7.0}));
}

TEST(CircleBox, OfASingularMatrixIsFlat)
{
    const BoundsT<double> box = GetTransformedCircleBBox({3, 4, 0, 0, 0, 0}, 1.0, {0.0, 0.0});
    EXPECT_NEAR(box.left, -5.0, 1e-14);
    EXPECT_NEAR(box.right, 5.0, 1e-14);
    EXPECT_EQ(box.top, 0.0);
    EXPECT_EQ(box.bottom, 0.0);
}

TEST(CircleBox, FarFromTheIntegers)
{
    EXPECT_EQ(GetTransformedCircleBBox(identity, 1.0, {1e12, 1e12}),
              (BoundsT<double>{1e12 - 1.0, 1e12 + 1.0, 1e12 + 1.0, 1e12 - 1.0}));
    EXPECT_EQ(GetTransformedCircleBBox(identity, 1.0, {-1e12, -1e12}),
              (BoundsT<double>{-1e12 - 1.0, -1e12 + 1.0, -1e12 + 1.0, -1e12 - 1.0}));
}

TEST(CircleBox, EachCoefficientAtTheTolerance)
{
    // A radius that makes the tolerance count.
    const double radius = 0x1p52;
    const double eps = DBL_EPSILON;
    const point2d origin{0.0, 0.0};
    // m12 within it is taken for 0: the extent along x is looked for where it is 0.
    EXPECT_EQ(GetTransformedCircleBBox({0, eps, 0, 1, 0, 0}, radius, origin).right, 0.0);
    EXPECT_EQ(GetTransformedCircleBBox({0, Above(eps), 0, 1, 0, 0}, radius, origin).right, 1.0 + eps);
    // m22 likewise.
    EXPECT_EQ(GetTransformedCircleBBox({1, 0, 0, 0, eps, 0}, radius, origin).top, 0.0);
    EXPECT_EQ(GetTransformedCircleBBox({1, 0, 0, 0, Above(eps), 0}, radius, origin).top, 1.0 + eps);
    // m11 within it: a quarter turn is taken for the extreme, which then lies beyond, at sqrt(5).
    EXPECT_NEAR(GetTransformedCircleBBox({eps, 2 * eps, 0, 0, 0, 0}, radius, origin).right, 2.0, 1e-14);
    EXPECT_NEAR(GetTransformedCircleBBox({Above(eps), 2 * eps, 0, 0, 0, 0}, radius, origin).right, std::sqrt(5.0),
                1e-14);
    // m21 likewise.
    EXPECT_NEAR(GetTransformedCircleBBox({0, 0, 0, eps, 2 * eps, 0}, radius, origin).top, 2.0, 1e-14);
    EXPECT_NEAR(GetTransformedCircleBBox({0, 0, 0, Above(eps), 2 * eps, 0}, radius, origin).top, std::sqrt(5.0), 1e-14);
}

TEST(CircleBox, PassesOverNaNInTheFirstPoint)
{
    // inf - inf first, then inf: the right side takes it, the left side stays where it was seeded.
    const BoundsT<double> box = GetTransformedCircleBBox({-infinity, 0, 0, 0, 1, 0}, 1.0, {infinity, 0.0});
    EXPECT_EQ(box.right, infinity);
    EXPECT_EQ(BitsOf(box.left), 0x7FEFFFFFFFFFFFFFU);
    EXPECT_EQ(box.top, 1.0);
    EXPECT_EQ(box.bottom, -1.0);
    const BoundsT<double> nothing = GetTransformedCircleBBox(identity, 1.0, {nan, nan});
    EXPECT_EQ(BitsOf(nothing.left), 0x7FEFFFFFFFFFFFFFU);
    EXPECT_EQ(BitsOf(nothing.top), 0xFFEFFFFFFFFFFFFFU);
    EXPECT_EQ(BitsOf(nothing.right), 0xFFEFFFFFFFFFFFFFU);
    EXPECT_EQ(BitsOf(nothing.bottom), 0x7FEFFFFFFFFFFFFFU);
}

TEST(CircleBox, AgainstDenseSamples)
{
    ForEachMatrixClass(
        6,
        [](RandomSource& random, MatrixClass kind) {
            const MATRIX m = RandomMatrix(random, kind);
            const double radius = random.Uniform(0.1, 10.0);
            const point2d centre = random.Point(100.0);
            const BoundsT<double> box = GetTransformedCircleBBox(m, radius, centre);
            BoundsT<double> sampled{infinity, -infinity, -infinity, infinity};
            for (int i = 0; i < 2000; ++i) {
                const point2d p = centre + m(Radians::AngleToVector(i * 0.0031415926, radius));
                sampled = {std::fmin(sampled.left, p.x), std::fmax(sampled.top, p.y), std::fmax(sampled.right, p.x),
                           std::fmin(sampled.bottom, p.y)};
            }
            const double slack =
                1e-5 * radius * m.GetMaximumMatrixVectorScale(); // a sample may miss by 1 - cos(pi/2000)
            EXPECT_NEAR(box.left, sampled.left, slack);
            EXPECT_NEAR(box.top, sampled.top, slack);
            EXPECT_NEAR(box.right, sampled.right, slack);
            EXPECT_NEAR(box.bottom, sampled.bottom, slack);
            EXPECT_LE(box.left, sampled.left + 1e-11);
            EXPECT_GE(box.top, sampled.top - 1e-11);
        },
        20);
}

} // namespace

} // namespace ZarnMath
