#include "ZarnMath/SmallMatrix.h"

#include "tests/Bits.h"
#include "tests/Random.h"

#include <gtest/gtest.h>

namespace ZarnMath {
namespace {

using Matrix6 = matrix<6, 6, double>;

template <unsigned long R, unsigned long C>
matrix<R, C, double> Make(const double (&elements)[R][C])
{
    matrix<R, C, double> m;
    for (unsigned long i = 0; i < R; ++i)
        for (unsigned long j = 0; j < C; ++j)
            m(i, j) = elements[i][j];
    return m;
}

Matrix6 Filled(double value)
{
    Matrix6 m;
    for (unsigned long i = 0; i < 6; ++i)
        for (unsigned long j = 0; j < 6; ++j)
            m(i, j) = value;
    return m;
}

Matrix6 Identity()
{
    Matrix6 m;
    for (unsigned long i = 0; i < 6; ++i)
        m(i, i) = 1.0;
    return m;
}

testing::AssertionResult AreSame(const Matrix6& a, const Matrix6& b)
{
    return SameBits(&a(0, 0), &b(0, 0), 36);
}

TEST(SmallMatrix, IsZeroAtFirst)
{
    EXPECT_TRUE(AreSame(Matrix6(), Filled(0.0)));
    static_assert(sizeof(Matrix6) == 36 * sizeof(double));
}

TEST(SmallMatrix, LeavesTheInverseBesideTheIdentity)
{
    auto m = Make<2, 4>({{2.0, 1.0, 1.0, 0.0}, {4.0, 4.0, 0.0, 1.0}});
    ASSERT_TRUE(m.GaussJordenEliminate());
    const double expected[2][4] = {{1.0, 0.0, 1.0, -0.25}, {0.0, 1.0, -1.0, 0.5}};
    for (unsigned long i = 0; i < 2; ++i)
        for (unsigned long j = 0; j < 4; ++j)
            EXPECT_EQ(m(i, j), expected[i][j]) << i << ' ' << j;
}

TEST(SmallMatrix, ColumnOfZerosIsSingular)
{
    auto first = Make<2, 2>({{0.0, 1.0}, {0.0, 1.0}});
    EXPECT_FALSE(first.GaussJordenEliminate());
    auto below = Make<3, 3>({{1.0, 5.0, 1.0}, {0.0, 0.0, 2.0}, {0.0, 0.0, 3.0}}); // not zero above the diagonal
    EXPECT_FALSE(below.GaussJordenEliminate());
    auto equalRows = Make<2, 2>({{3.0, 1.0}, {3.0, 1.0}});
    EXPECT_FALSE(equalRows.GaussJordenEliminate());
}

TEST(SmallMatrix, ColumnOfZerosAndNanIsSingular)
{
    auto m = Make<3, 3>({{0.0, 1.0, 0.0}, {nan, 0.0, 1.0}, {-0.0, 1.0, 1.0}});
    EXPECT_FALSE(m.GaussJordenEliminate());
}

TEST(SmallMatrix, NumberIsPreferredToNan)
{
    auto m = Make<2, 2>({{nan, 1.0}, {4.0, 2.0}});
    EXPECT_FALSE(m.GaussJordenEliminate()); // the rest is NaN
    EXPECT_EQ(m(0, 0), 1.0);                // the second row, scaled
}

TEST(SmallMatrix, TopmostOfEqualPivotsIsKept)
{
    auto m = Make<2, 4>({{1.0, 2.0, 1.0, 0.0}, {-1.0, 1.0, 0.0, 1.0}});
    ASSERT_TRUE(m.GaussJordenEliminate());
    constexpr double r = 1.0 / 3.0;
    EXPECT_EQ(m(0, 2), 1.0 - 2.0 * r); // with the rows exchanged it were r
    EXPECT_NE(1.0 - 2.0 * r, r);
    EXPECT_EQ(m(0, 3), -2.0 * r);
}

TEST(SmallMatrix, LargestPivotIsTaken)
{
    auto m = Make<2, 4>({{1e-20, 1.0, 1.0, 0.0}, {-1.0, 1.0, 0.0, 1.0}});
    ASSERT_TRUE(m.GaussJordenEliminate());
    EXPECT_EQ(m(0, 2), 1.0); // without an exchange all digits of it are lost
    EXPECT_EQ(m(0, 3), -1.0);
    EXPECT_EQ(m(1, 2), 1.0);
}

TEST(SmallMatrix, TinyPivotIsAccepted)
{
    auto m = Make<1, 2>({{1e-300, 3.0}});
    ASSERT_TRUE(m.GaussJordenEliminate());
    EXPECT_EQ(m(0, 1), 3.0 * (1.0 / 1e-300));
}

TEST(SmallMatrix, RowIsMultipliedByTheReciprocal)
{
    auto m = Make<1, 2>({{3.0, 5.0}});
    ASSERT_TRUE(m.GaussJordenEliminate());
    EXPECT_EQ(m(0, 1), 5.0 * (1.0 / 3.0));
    EXPECT_NE(m(0, 1), 5.0 / 3.0);
}

TEST(SmallMatrix, RowIsSubtractedZeroTimesToo)
{
    auto m = Make<2, 3>({{1.0, 0.0, 7.0}, {0.0, 1.0, infinity}});
    ASSERT_TRUE(m.GaussJordenEliminate());
    EXPECT_TRUE(std::isnan(m(0, 2)));
}

TEST(SmallMatrix, InverseOfTheIdentity)
{
    Matrix6 inverse = Filled(77.0);
    EXPECT_TRUE(Identity().GetInverse(inverse));
    EXPECT_TRUE(AreSame(inverse, Identity()));
}

TEST(SmallMatrix, NoInverseLeavesTheResult)
{
    Matrix6 m = Identity();
    for (unsigned long j = 0; j < 6; ++j)
        m(4, j) = m(1, j);
    Matrix6 inverse = Filled(77.0);
    EXPECT_FALSE(m.GetInverse(inverse));
    EXPECT_TRUE(AreSame(inverse, Filled(77.0)));
}

TEST(SmallMatrix, ResultMayBeTheMatrixItself)
{
    Matrix6 m = Identity();
    m(2, 2) = 4.0;
    m(0, 5) = 3.0;
    EXPECT_TRUE(m.GetInverse(m));
    EXPECT_EQ(m(2, 2), 0.25);
    EXPECT_EQ(m(0, 5), -3.0);
}

TEST(SmallMatrixProperties, ProductWithTheInverseIsTheIdentity)
{
    RandomSource random(1);
    for (int n = 0; n < 2000; ++n) {
        Matrix6 m;
        for (unsigned long i = 0; i < 6; ++i)
            for (unsigned long j = 0; j < 6; ++j)
                m(i, j) = random.Uniform(-1.0, 1.0) + (i == j ? 3.0 : 0.0);
        const Matrix6 before = m;
        Matrix6 inverse;
        ASSERT_TRUE(m.GetInverse(inverse));
        EXPECT_TRUE(AreSame(m, before));
        for (unsigned long i = 0; i < 6; ++i)
            for (unsigned long j = 0; j < 6; ++j) {
                double product = 0.0;
                for (unsigned long k = 0; k < 6; ++k)
                    product += m(i, k) * inverse(k, j);
                EXPECT_NEAR(product, i == j ? 1.0 : 0.0, 1e-11) << n;
            }
    }
}

} // namespace
} // namespace ZarnMath
