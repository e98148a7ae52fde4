#include "tests/Sentinels.h"
#include "tests/WMath/Matrices.h"

#include "ZarnMath/WMathInternal.h"

#include <string>
#include <vector>

namespace ZarnMath {

namespace {

/// The tolerance of the table: a power of two, so that the sums and squares at its edge are exact.
constexpr double t = 0x1p-20;

/// The predicates that hold, each by a letter.
///
/// R skewed or rotated, M ... or mirrored, A scaled or skewed or rotated, N non-uniformly scaled or skewed or rotated,
/// S scaled, X mirrored, O orthogonal, 1 orthonormal, U uniform orthogonal, P orthonormal and axis aligned, Z zero,
/// I identity.
std::string Classify(const MATRIX& m, double tolerance)
{
    std::string letters;
    const auto add = [&](char letter, bool holds) {
        if (holds)
            letters += letter;
    };
    add('R', m.IsSkewedOrRotated(tolerance));
    add('M', m.IsSkewedOrRotatedOrMirrored(tolerance));
    add('A', m.IsScaledOrSkewedOrRotated(tolerance));
    add('N', m.IsNonUniformScaledOrSkewedOrRotated(tolerance));
    add('S', m.IsScaled(tolerance));
    add('X', m.IsMirrored());
    add('O', m.IsOrthogonal(tolerance));
    add('1', m.IsOrthonormal(tolerance));
    add('U', m.IsUniformOrthogonal(tolerance));
    add('P', m.IsOrthonormalAxisAligned(tolerance));
    add('Z', IsZero(m, tolerance));
    add('I', m.IsIdentity(true, tolerance));
    return letters;
}

struct Row
{
    const char* name;
    MATRIX m;
    const char* letters;
};

constexpr double tiny = 0x1p-1074;
constexpr double aboveT = t * (1.0 + DBL_EPSILON);
constexpr double belowT = t * (1.0 - DBL_EPSILON / 2.0);
constexpr double onePlus = 1.0 + t;                   // off 1 by t
constexpr double onePlusMore = onePlus + DBL_EPSILON; // by the next double above it
constexpr double oneMinus = 1.0 - t;
constexpr double oneMinusMore = oneMinus - DBL_EPSILON / 2.0;
constexpr double root = 0x1p-10;            // its square is t
constexpr double rootMore = root + 0x1p-42; // 1 + its square is the second double above 1 + t
constexpr double rootAbove =
    root + 0x1p-62; // the next double: its square is above t, 1 + its square is not above 1 + t
constexpr double c45 = 0.70710678118654757;

/// Linear part only; the translation is 0.
constexpr MATRIX L(double m11, double m12, double m21, double m22)
{
    return {m11, m12, 0.0, m21, m22, 0.0};
}

const Row rows[] = {
    {"identity", L(1, 0, 0, 1), "O1UPI"},
    {"translation", {1, 0, 5, 0, 1, -7}, "O1UP"},
    {"half turn", L(-1, 0, 0, -1), "MANO1UP"},
    {"quarter turn", L(0, -1, 1, 0), "RMANO1UP"},
    {"three quarter turn", L(0, 1, -1, 0), "RMANO1UP"},
    {"quarter turn with translation", {0, -1, 5, 1, 0, -7}, "RMANO1UP"},
    {"swap of x and y", L(0, 1, 1, 0), "RMANXO1UP"},
    {"swap of x and -y", L(0, -1, -1, 0), "RMANXO1UP"},
    {"mirror in the x axis", L(1, 0, 0, -1), "MANXO1UP"},
    {"mirror in the y axis", L(-1, 0, 0, 1), "MANXO1UP"},
    {"mirror in a slanted axis", L(0.6, 0.8, 0.8, -0.6), "RMANXO1U"},
    {"turn by 45 degrees", L(c45, -c45, c45, c45), "RMANO1U"},
    {"turn of 3-4-5", L(0.6, -0.8, 0.8, 0.6), "RMANO1U"},
    {"uniform scale up", L(2, 0, 0, 2), "ASOU"},
    {"uniform scale down", L(0.5, 0, 0, 0.5), "ASOU"},
    {"uniform negative scale", L(-2, 0, 0, -2), "MANSOU"},
    {"non-uniform scale", L(3, 0, 0, 2), "ANSO"},
    {"scale along y", L(1, 0, 0, 2), "ANSO"},
    {"scale with mirror", L(2, 0, 0, -2), "MANSXOU"},
    {"turn with scale", L(1.2, -1.6, 1.6, 1.2), "RMANSOU"},
    {"perpendicular rows, slanted columns", L(1.2, -1.6, 0.8, 0.6), "RMANS"},
    {"perpendicular columns, slanted rows", L(1.2, -0.8, 1.6, 0.6), "RMANSO"},
    {"shear of x", L(1, 1, 0, 1), "RMANS"},
    {"shear of y", L(1, 0, 1, 1), "RMANS"},

    {"zero", L(0, 0, 0, 0), "MANSOUZ"},
    {"zero with translation", {0, 0, 5, 0, 0, 0}, "MANSOU"},
    {"projection on x", L(1, 0, 0, 0), "MANSO"},
    {"projection on y", L(0, 0, 0, 1), "MANSO"},
    {"projection on x with -0", L(1, 0, 0, -0.0), "MANSO"},
    {"almost a projection on x", L(1, 0, 0, tiny), "ANSO"},
    {"almost a projection on x, mirrored", L(1, 0, 0, -tiny), "MANSXO"},
    {"m22 = 0 the only reason to be mirrored", L(t, 0, 0, 0), "MASOUZ"},
    {"m22 just above 0", L(t, 0, 0, tiny), "ASOUZ"},
    {"m11 = 0 the only reason to be non-uniform", L(0, 0, 0, t), "MANSOUZ"},
    {"m11 just above 0", L(tiny, 0, 0, t), "ASOUZ"},
    {"rank one", L(1, 2, 2, 4), "RMANS"},

    {"m12 below the tolerance", L(1, belowT, 0, 1), "O1UPI"},
    {"m12 at the tolerance", L(1, t, 0, 1), "O1UPI"},
    {"m12 above the tolerance", L(1, aboveT, 0, 1), "RMAN"},
    {"-m12 at the tolerance", L(1, -t, 0, 1), "O1UPI"},
    {"-m12 above the tolerance", L(1, -aboveT, 0, 1), "RMAN"},
    {"m21 below the tolerance", L(1, 0, belowT, 1), "O1UPI"},
    {"m21 at the tolerance", L(1, 0, t, 1), "O1UPI"},
    {"m21 above the tolerance", L(1, 0, aboveT, 1), "RMAN"},
    {"m11 at 1 + t", L(onePlus, 0, 0, 1), "OPI"},
    {"m11 above 1 + t", L(onePlusMore, 0, 0, 1), "ANSO"},
    {"m11 at 1 - t", L(oneMinus, 0, 0, 1), "OPI"},
    {"m11 below 1 - t", L(oneMinusMore, 0, 0, 1), "ANSO"},
    {"m22 at 1 + t", L(1, 0, 0, onePlus), "OPI"},
    {"m22 above 1 + t", L(1, 0, 0, onePlusMore), "ANSO"},
    {"m22 at 1 - t", L(1, 0, 0, oneMinus), "OPI"},
    {"m22 below 1 - t", L(1, 0, 0, oneMinusMore), "ANSO"},
    {"half turn at the tolerance", L(-onePlus, 0, 0, -1), "MANOP"},
    {"half turn above the tolerance", L(-onePlusMore, 0, 0, -1), "MANSO"},
    {"quarter turn at the tolerance", L(0, -onePlus, 1, 0), "RMANOP"},
    {"quarter turn above the tolerance", L(0, -onePlusMore, 1, 0), "RMANSO"},
    {"quarter turn with diagonal at the tolerance", L(t, -1, 1, t), "RMANO1UP"},
    {"quarter turn with m11 above the tolerance", L(aboveT, -1, 1, t), "RMANO1U"},
    {"quarter turn with m22 above the tolerance", L(t, -1, 1, aboveT), "RMANO1U"},
    {"squared columns at 1 + t", L(1, -root, root, 1), "RMANO1U"},
    {"squared columns above 1 + t", L(1, -rootMore, rootMore, 1), "RMANOU"},
    {"squared columns that differ by t", L(root, 0, 0, 0), "MANSOU"},
    {"squared columns that differ by more", L(rootAbove, 0, 0, 0), "MANSO"},
    {"factors that differ by t", L(2, 0, 0, 2 + t), "ASO"},
    {"factors that differ by more", L(2, 0, 0, 2 + t + 0x1p-51), "ANSO"},
    {"all fields at the tolerance", {t, t, t, t, t, t}, "ASOUZ"},
    {"dx above the tolerance of zero", {t, t, aboveT, t, t, t}, "ASOU"},
    {"dy above the tolerance of zero", {t, t, t, t, t, aboveT}, "ASOU"},
    {"m12 above the tolerance of zero", {t, aboveT, t, t, t, t}, "RMANSXOU"},
    {"dx at the tolerance of the identity", {1, 0, t, 0, 1, -t}, "O1UPI"},
    {"dx above the tolerance of the identity", {1, 0, aboveT, 0, 1, 0}, "O1UP"},

    {"NaN in m11", L(nan, 0, 0, 1), "MANS"},
    {"NaN in m12", L(1, nan, 0, 1), "RMANS"},
    {"NaN in m21", L(1, 0, nan, 1), "RMANS"},
    {"NaN in m22", L(1, 0, 0, nan), "MANS"},
    {"NaN in dx", {1, 0, nan, 0, 1, 0}, "O1UP"},
    {"NaN in dy", {1, 0, 0, 0, 1, nan}, "O1UP"},
    {"zero with NaN in dx", {0, 0, nan, 0, 0, 0}, "MANSOU"},
    {"zero with NaN in dy", {0, 0, 0, 0, 0, nan}, "MANSOU"},
    {"quarter turn with NaN in m11", L(nan, -1, 1, 0), "RMANS"},
    {"infinite m11", L(infinity, 0, 0, 1), "ANS"},
};

TEST(Classification, TruthTable)
{
    for (const Row& row : rows)
        EXPECT_EQ(Classify(row.m, t), row.letters) << row.name;
}

TEST(Classification, ToleranceNaNPutsEverythingOutOfTolerance)
{
    EXPECT_EQ(Classify(identity, nan), "RMANS");
    EXPECT_EQ(Classify(zeroMatrix, nan), "RMANS");
}

TEST(Classification, ToleranceZero)
{
    EXPECT_EQ(Classify(identity, 0.0), "O1UPI");
    EXPECT_EQ(Classify(L(1, tiny, 0, 1), 0.0), "RMAN");
    EXPECT_TRUE(IsZero({-0.0, -0.0, -0.0, -0.0, -0.0, -0.0}, 0.0));
    for (const auto field : matrixFields)
        EXPECT_FALSE(IsZero(With(zeroMatrix, field, tiny), 0.0));
}

TEST(Classification, IsZeroLooksAtEveryField)
{
    for (const auto field : matrixFields) {
        EXPECT_TRUE(IsZero(With(zeroMatrix, field, -t), t));
        EXPECT_FALSE(IsZero(With(zeroMatrix, field, aboveT), t));
        EXPECT_FALSE(IsZero(With(zeroMatrix, field, -aboveT), t));
        EXPECT_FALSE(IsZero(With(zeroMatrix, field, nan), infinity));
    }
}

TEST(Classification, ScaledAndOrthonormalReadTheSameToleranceDifferently)
{
    // The length is off by t, its square by more than 2t.
    EXPECT_FALSE(L(onePlus, 0, 0, onePlus).IsScaled(t));
    EXPECT_FALSE(L(onePlus, 0, 0, onePlus).IsOrthonormal(t));
    EXPECT_TRUE(L(onePlus, 0, 0, onePlus).IsOrthonormal(3.0 * t));
}

TEST(Classification, MaximumScale)
{
    EXPECT_EQ(identity.GetMaximumMatrixVectorScale(), 1.0);
    EXPECT_EQ(L(3, 0, 0, 2).GetMaximumMatrixVectorScale(), 3.0);
    EXPECT_EQ(L(2, 0, 0, -3).GetMaximumMatrixVectorScale(), 3.0);
    EXPECT_EQ(zeroMatrix.GetMaximumMatrixVectorScale(), 0.0);
    EXPECT_NEAR(L(1, 1, 0, 1).GetMaximumMatrixVectorScale(), 1.618033988749895, 1e-15);
    EXPECT_TRUE(std::isnan(L(1, nan, 0, 1).GetMaximumMatrixVectorScale()));
}

TEST(Classification, MaximumScaleGroupsAsStated)
{
    RandomSource random(1);
    for (int i = 0; i < 1000; ++i) {
        const MATRIX m = RandomFields(random);
        const double s = m.m11 * m.m11 + m.m21 * m.m21;
        const double h = ((s + m.m12 * m.m12) + m.m22 * m.m22) * 0.5;
        const double g = ((s - m.m12 * m.m12) - m.m22 * m.m22) * 0.5;
        const double f = m.m11 * m.m12 + m.m21 * m.m22;
        EXPECT_EQ(m.GetMaximumMatrixVectorScale(), std::sqrt(h + std::sqrt(f * f + g * g)));
    }
}

TEST(Classification, MaximumScaleBoundsEveryVectorAndIsReached)
{
    ForEachMatrixClass(
        2,
        [](RandomSource& random, MatrixClass kind) {
            const MATRIX m = RandomMatrix(random, kind);
            const double most = m.GetMaximumMatrixVectorScale();
            double reached = 0.0;
            for (int i = 0; i < 1000; ++i) {
                const vector2d image = m(vector2d{std::cos(i * 0.00314159), std::sin(i * 0.00314159)});
                reached = std::fmax(reached, std::hypot(image.x, image.y));
            }
            EXPECT_LE(reached, most * (1.0 + 1e-12));
            EXPECT_GE(reached, most * (1.0 - 1e-4));
        },
        10);
}

struct Centre
{
    bool isFound;
    point2d p;
};

Centre CentreOf(MATRIX m)
{
    const MATRIX before = m;
    Centre centre{false, sentinel<point2d>};
    centre.isFound = m.GetCenterOfTransformation(centre.p);
    EXPECT_TRUE(SameBits(m, before));
    return centre;
}

void ExpectNoCentre(const MATRIX& m)
{
    const Centre centre = CentreOf(m);
    EXPECT_FALSE(centre.isFound);
    EXPECT_TRUE(SameBits(centre.p, point2d{0.0, 0.0}));
}

TEST(Centre, NoneInIdentityAndTranslation)
{
    ExpectNoCentre(identity);
    ExpectNoCentre({1, 0, 5, 0, 1, 0});
    ExpectNoCentre({1, 0, 0, 0, -1, 0}); // a whole line of them
    ExpectNoCentre(L(nan, 0, 0, 2));
}

TEST(Centre, OfAQuarterTurn)
{
    MATRIX m = identity;
    m.RotateAroundPoint(1.5707963267948966, {1.0, 1.0});
    const Centre centre = CentreOf(m);
    EXPECT_TRUE(centre.isFound);
    EXPECT_TRUE(IsNearPoint(centre.p, {1.0, 1.0}, 1e-15));
}

TEST(Centre, OfAScale)
{
    const Centre centre = CentreOf({2, 0, -3, 0, 2, -4});
    EXPECT_TRUE(centre.isFound);
    EXPECT_TRUE(SameBits(centre.p, point2d{3.0, 4.0}));
}

TEST(Centre, NeedsADeterminantAboveTheTolerance)
{
    const double edge = 1.0 + 0x1p-26; // (m - 1)^2 is DBL_EPSILON
    ExpectNoCentre({edge, 0, 1, 0, edge, 1});
    const Centre centre = CentreOf({Above(edge), 0, 1, 0, edge, 1});
    EXPECT_TRUE(centre.isFound);
    EXPECT_NEAR(centre.p.y, -0x1p26, 1.0);
}

TEST(Centre, StaysInPlace)
{
    ForEachMatrixClass(3, [](RandomSource& random, MatrixClass kind) {
        const MATRIX m = RandomMatrix(random, kind);
        const Centre centre = CentreOf(m);
        if (centre.isFound) {
            EXPECT_TRUE(IsNearPoint(m(centre.p), centre.p, 1e-9 * (1.0 + std::hypot(centre.p.x, centre.p.y))));
        }
    });
}

struct Line
{
    bool isFound;
    point2d p0;
    point2d p1;
};

Line LineOf(MATRIX m)
{
    const MATRIX before = m;
    Line line{false, sentinel<point2d>, {9.9, -9.9}};
    line.isFound = m.GetLineOfTransformation(line.p0, line.p1);
    EXPECT_TRUE(SameBits(m, before));
    return line;
}

testing::AssertionResult HasNoLine(const MATRIX& m)
{
    const Line line = LineOf(m);
    if (line.isFound)
        return testing::AssertionFailure() << "found one";
    if (!HasSameBits(line.p0, sentinel<point2d>) || !HasSameBits(line.p1, point2d{9.9, -9.9}))
        return testing::AssertionFailure() << "an output was written";
    return testing::AssertionSuccess();
}

testing::AssertionResult HasLine(const MATRIX& m, const point2d& p0, const point2d& p1)
{
    const Line line = LineOf(m);
    if (!line.isFound)
        return testing::AssertionFailure() << "found none";
    if (!(line.p0 == p0 && line.p1 == p1))
        return testing::AssertionFailure()
               << "through " << testing::PrintToString(line.p0) << " and " << testing::PrintToString(line.p1);
    return testing::AssertionSuccess();
}

/// The matrix whose change M - I has the rows (a, b) and (c, d).
MATRIX FromChange(double a, double b, double dx, double c, double d, double dy)
{
    return {a + 1.0, b, dx, c, d + 1.0, dy};
}

TEST(FixedLine, NoneWhereASinglePointOrNothingStays)
{
    EXPECT_TRUE(HasNoLine(identity));
    EXPECT_TRUE(HasNoLine({1, 0, 5, 0, 1, 0}));
    EXPECT_TRUE(HasNoLine({1, 0, 0, 0, 1, 5}));
    EXPECT_TRUE(HasNoLine({2, 0, -3, 0, 2, -4}));
    EXPECT_TRUE(HasNoLine({0, -1, 2, 1, 0, 0}));
}

TEST(FixedLine, OfTheMirrorsInTheAxes)
{
    EXPECT_TRUE(HasLine({1, 0, 0, 0, -1, 0}, {0, 0}, {1, 0}));
    EXPECT_TRUE(HasLine({-1, 0, 0, 0, 1, 0}, {0, 0}, {0, 1}));
    EXPECT_TRUE(HasLine({1, 0, 0, 0, -1, 6}, {0, 3}, {1, 3}));
    EXPECT_TRUE(HasLine({-1, 0, 8, 0, 1, 0}, {4, 0}, {4, 1}));
    EXPECT_TRUE(HasLine({0, 1, 0, 1, 0, 0}, {0, 0}, {1, 1}));
}

TEST(FixedLine, IsSolvedAlongTheSmallerCoefficient)
{
    EXPECT_TRUE(HasLine(FromChange(1, 2, 4, 1, 2, 4), {0, -2}, {1, -2.5}));
    EXPECT_TRUE(HasLine(FromChange(1, -2, 4, 1, -2, 4), {0, 2}, {1, 2.5}));
    EXPECT_TRUE(HasLine(FromChange(2, 1, 4, 2, 1, 4), {-2, 0}, {-2.5, 1}));
    // Equal magnitudes: solved for x.
    EXPECT_TRUE(HasLine(FromChange(1, 1, 3, 1, 1, 3), {-3, 0}, {-4, 1}));
    EXPECT_TRUE(HasLine(FromChange(1, -1, 3, 1, -1, 3), {-3, 0}, {-2, 1}));
    EXPECT_TRUE(HasLine(FromChange(-1, 1, 3, 1, -1, -3), {3, 0}, {4, 1}));
}

TEST(FixedLine, EquationsMayDifferByTheWiderTolerance)
{
    EXPECT_EQ(BitsOf(fixedLineTolerance), 0x3EB0C6F7A0B5ED8DU);
    // The constants: dy - 0*dx.
    EXPECT_TRUE(HasLine(FromChange(1, 0, 0, 0, 0, 1e-06), {0, 0}, {0, 1}));
    EXPECT_TRUE(HasLine(FromChange(1, 0, 0, 0, 0, -1e-06), {0, 0}, {0, 1}));
    EXPECT_TRUE(HasNoLine(FromChange(1, 0, 0, 0, 0, Above(1e-06))));
    EXPECT_TRUE(HasNoLine(FromChange(1, 0, 0, 0, 0, Below(-1e-06))));
    // The coefficients of y: 0 - b*(-1), with a determinant of 2^-40*b.
    EXPECT_TRUE(HasLine(FromChange(0x1p-40, 1e-06, 0, -0x1p-40, 0, 0), {0, 0}, {1, -0x1p-40 / 1e-06}));
    EXPECT_TRUE(HasNoLine(FromChange(0x1p-40, Above(1e-06), 0, -0x1p-40, 0, 0)));
}

TEST(FixedLine, DeterminantMayBeUpToTheTolerance)
{
    EXPECT_TRUE(HasLine(FromChange(0x1p-26, 0, 0, 0, 0x1p-26, 0), {0, 0}, {0, 1}));
    EXPECT_TRUE(HasNoLine(FromChange(0x1p-26, 0, 0, 0, 0x1p-26 + 0x1p-52, 0)));
}

TEST(FixedLine, WhereOnlyTheSecondRowHasX)
{
    // The second equation alone has a line, x = -dy, and it is refused.
    EXPECT_TRUE(HasNoLine(FromChange(0, 0, 0, 1, 0, 5)));
    // A first equation of noise is solved all the same: y = -dx/b.
    EXPECT_TRUE(HasLine(FromChange(0, 0x1p-53, 0, 1, 0, 5), {0, 0}, {1, 0}));
    EXPECT_TRUE(HasLine(FromChange(0, 0x1p-53, 1e-06, 1, 0, 5), {0, -1e-06 * 0x1p53}, {1, -1e-06 * 0x1p53}));
    EXPECT_TRUE(HasNoLine(FromChange(0, 0x1p-53, Above(1e-06), 1, 0, 5)));
    // |b| = |a|
    EXPECT_TRUE(HasNoLine(FromChange(-0x1p-53, 0x1p-53, 0, 1, 0, 5)));
    EXPECT_TRUE(HasNoLine(FromChange(-0x1p-53, -0x1p-53, 0, 1, 0, 5)));
    EXPECT_TRUE(HasLine(FromChange(-0x1p-53, 0x1p-52, 0, 1, 0, 5), {0, 0}, {1, 0.5}));
}

TEST(FixedLine, CoefficientOfXAtTheTolerance)
{
    // a at the tolerance does not lead: the first equation, all noise, counts as void and the second decides.
    EXPECT_TRUE(HasLine(FromChange(0x1p-52, 0, 0, 0, 1, -3), {0, 3}, {1, 3}));
    // One place above, it leads, and the second equation, which is no multiple of it, denies.
    EXPECT_TRUE(HasNoLine(FromChange(0x1p-51, 0, 0, 0, 0.25, -3)));
    // c at the tolerance does not lead either.
    EXPECT_TRUE(HasLine(FromChange(0, 0, 0, 0x1p-52, 1, -3), {0, 3}, {1, 3}));
    EXPECT_TRUE(HasNoLine(FromChange(0, 0, 0, Above(0x1p-52), 1, -3)));
}

TEST(FixedLine, WhereTheFirstRowIsVoid)
{
    EXPECT_TRUE(HasLine(FromChange(0, 0, 0, 0, 2, 4), {0, -2}, {1, -2}));
    EXPECT_TRUE(HasLine(FromChange(0, 0x1p-52, 0x1p-52, 0, 2, 4), {0, -2}, {1, -2}));
    EXPECT_TRUE(HasNoLine(FromChange(0, Above(0x1p-52), 0, 0, 0.5, 4)));
    EXPECT_TRUE(HasNoLine(FromChange(0, 0, Above(0x1p-52), 0, 0.5, 4)));
    // |d| = |c|
    EXPECT_TRUE(HasNoLine(FromChange(0, 0, 0, 0x1p-53, -0x1p-53, 4)));
    EXPECT_TRUE(HasLine(FromChange(0, 0, 0, 0x1p-53, 0x1p-52, 0), {0, 0}, {1, -0.5}));
}

TEST(FixedLine, WhereTheSecondRowIsVoid)
{
    EXPECT_TRUE(HasLine(FromChange(0, 1, 3, 0, 0, 0), {0, -3}, {1, -3}));
    EXPECT_TRUE(HasLine(FromChange(0, 1, 3, 0, 0x1p-52, 0x1p-52), {0, -3}, {1, -3}));
    EXPECT_TRUE(HasNoLine(FromChange(0, 1, 3, 0, 0x1p-51, 0)));
    EXPECT_TRUE(HasNoLine(FromChange(0, 1, 3, 0, 0, Above(0x1p-52))));
    EXPECT_TRUE(HasLine(FromChange(-0x1p-53, 1, 0, 0, 0, 0), {0, 0}, {1, 0x1p-53}));
}

TEST(FixedLine, NaNAmongTheCoefficientsOfXLeadsNowhere)
{
    EXPECT_TRUE(HasNoLine(FromChange(nan, 0, 0, 0, 0, 0)));
    EXPECT_TRUE(HasNoLine(FromChange(nan, 0, 0, 1, 0, 0)));
    EXPECT_TRUE(HasNoLine(FromChange(0, 0, 0, nan, 1, 0)));
}

TEST(FixedLine, OfMirrorsAndScalesAlongOneDirectionStaysInPlace)
{
    RandomSource random(4);
    int found = 0;
    for (int i = 0; i < 2000; ++i) {
        const double angle = random.Uniform(-3.2, 3.2);
        const double factor = i % 2 == 0 ? -1.0 : random.Uniform(0.25, 4.0);
        const point2d through = random.Point(10.0);
        const MATRIX linear =
            LinearProduct(LinearTurn(angle), LinearProduct(LinearScale(1.0, factor), LinearTurn(-angle)));
        MATRIX m = identity;
        m.TransformAroundPoint(linear, through);
        const Line line = LineOf(m);
        if (!line.isFound)
            continue; // a rounded determinant above the tolerance leaves a single point
        ++found;
        const vector2d along{std::cos(angle), std::sin(angle)};
        EXPECT_TRUE(IsNearPoint(m(line.p0), line.p0, 1e-9 * (1.0 + std::hypot(line.p0.x, line.p0.y))));
        EXPECT_TRUE(IsNearPoint(m(line.p1), line.p1, 1e-9 * (1.0 + std::hypot(line.p1.x, line.p1.y))));
        EXPECT_NEAR(Cross(along, line.p1 - line.p0), 0.0, 1e-9);
        EXPECT_TRUE(std::fabs(line.p1.x - line.p0.x) == 1.0 || std::fabs(line.p1.y - line.p0.y) == 1.0);
    }
    EXPECT_GT(found, 1000);
}

} // namespace

} // namespace ZarnMath
