#include "ZarnMath/FitLine.h"

#include <gtest/gtest.h>

#include <random>
#include <vector>

namespace ZarnMath {
namespace {

constexpr point2d untouchedPoint{77.0, -77.0};
constexpr vector2d untouchedDirection{-7.0, 7.0};

struct Line
{
    point2d point = untouchedPoint;
    vector2d direction = untouchedDirection;
};

Line Fit(const std::vector<point2d>& points)
{
    Line line;
    GetLeastSquaresLines(points.data(), static_cast<int>(points.size()), line.point, line.direction);
    return line;
}

/// The sum of the squared distances from a line.
double Residual(const std::vector<point2d>& points, const Line& line)
{
    double sum = 0.0;
    for (const point2d& p : points) {
        const double distance = Cross(line.direction, p - line.point);
        sum += distance * distance / LengthSquared(line.direction);
    }
    return sum;
}

TEST(FitLine, HorizontalPointsOfWholeCoordinates)
{
    const Line line = Fit({{0.0, 5.0}, {1.0, 5.0}, {5.0, 5.0}});
    EXPECT_EQ(line.point, (point2d{2.0, 5.0}));
    EXPECT_EQ(line.direction, (vector2d{1.0, 0.0}));
}

TEST(FitLine, VerticalPoints)
{
    const Line line = Fit({{5.0, 0.0}, {5.0, 1.0}, {5.0, 5.0}});
    EXPECT_EQ(line.point, (point2d{5.0, 2.0}));
    EXPECT_EQ(line.direction, (vector2d{0.0, 1.0}));
}

TEST(FitLine, CoincidentPointsGiveTheVertical)
{
    const Line line = Fit({{3.0, 4.0}, {3.0, 4.0}, {3.0, 4.0}});
    EXPECT_EQ(line.point, (point2d{3.0, 4.0}));
    EXPECT_EQ(line.direction, (vector2d{0.0, 1.0}));
}

TEST(FitLine, BoxDecidesBetweenPrincipalAxes)
{
    const Line wide = Fit({{0.0, 0.0}, {4.0, 0.0}, {4.0, 2.0}, {0.0, 2.0}});
    EXPECT_EQ(wide.point, (point2d{2.0, 1.0}));
    EXPECT_EQ(wide.direction, (vector2d{1.0, 0.0}));
    const Line square = Fit({{0.0, 0.0}, {2.0, 0.0}, {2.0, 2.0}, {0.0, 2.0}});
    EXPECT_EQ(square.point, (point2d{1.0, 1.0}));
    EXPECT_EQ(square.direction, (vector2d{0.0, 1.0}));
}

TEST(FitLine, DiagonalCrossesTheAxisAtTheOrigin)
{
    const Line line = Fit({{0.0, 0.0}, {1.0, 1.0}, {2.0, 2.0}});
    EXPECT_EQ(line.direction.y, 1.0);
    EXPECT_EQ(line.point.y, 0.0);
    EXPECT_NEAR(line.direction.x, 1.0, 1e-15);
    EXPECT_NEAR(line.point.x, 0.0, 1e-15);
}

TEST(FitLine, PointIsTheCrossingWithTheAxisAndNotTheCentroid)
{
    const Line line = Fit({{10.0, 5.0}, {12.0, 6.0}, {16.0, 8.0}}); // x = 2*y
    EXPECT_NEAR(line.point.x, 0.0, 1e-12);
    EXPECT_EQ(line.point.y, 0.0);
    EXPECT_NEAR(line.direction.x, 2.0, 1e-13);
    EXPECT_EQ(line.direction.y, 1.0);
}

TEST(FitLine, FewerThanTwoPointsLeaveTheResults)
{
    for (const int count : {1, 0, -3}) {
        const point2d point{1.0, 2.0};
        Line line;
        GetLeastSquaresLines(&point, count, line.point, line.direction);
        EXPECT_EQ(line.point, untouchedPoint);
        EXPECT_EQ(line.direction, untouchedDirection);
    }
}

TEST(FitLine, TwoPoints)
{
    const Line line = Fit({{1.0, 1.0}, {4.0, 2.0}}); // x = -2 + 3*y
    EXPECT_NEAR(line.point.x, -2.0, 1e-14);
    EXPECT_NEAR(line.direction.x, 3.0, 1e-14);
}

TEST(FitLine, MixedMomentHasNoTolerance)
{
    const Line line = Fit({{0.0, 0.0}, {1e-9, 1e-9}, {2e-9, 2e-9}});
    EXPECT_NEAR(line.direction.x, 1.0, 1e-12);
}

TEST(FitLine, FractionalHorizontalPointsGiveAHugeDirection)
{
    const Line line = Fit({{0.0, 0.7}, {1.0, 0.7}, {3.0, 0.7}}); // the mixed moment rounds to 2^-51
    EXPECT_GT(line.direction.x, 1e16);
    EXPECT_EQ(line.direction.y, 1.0);
}

TEST(FitLine, SumsWithoutPointsGiveNan)
{
    Line line;
    GetLeastSquaresLines(0.0, 0.0, 0.0, 0.0, 0.0, nullptr, 0, line.point, line.direction);
    EXPECT_TRUE(std::isnan(line.point.x));
    EXPECT_EQ(line.point.y, 0.0);
    EXPECT_TRUE(std::isnan(line.direction.x));
    EXPECT_EQ(line.direction.y, 1.0);
}

TEST(FitLine, SumsLookAtThePointsOnlyWhereTheMixedMomentVanishes)
{
    Line line;
    GetLeastSquaresLines(3.0, 3.0, 5.0, 5.0, 5.0, nullptr, 3, line.point, line.direction);
    EXPECT_NEAR(line.direction.x, 1.0, 1e-15);
    const point2d tall[3] = {{0.0, 0.0}, {1.0, 9.0}, {0.0, 0.0}};
    GetLeastSquaresLines(6.0, 15.0, 30.0, 26.0, 75.0, tall, 3, line.point, line.direction);
    EXPECT_EQ(line.point, (point2d{2.0, 5.0}));
    EXPECT_EQ(line.direction, (vector2d{0.0, 1.0}));
    const point2d wide[3] = {{0.0, 0.0}, {9.0, 1.0}, {0.0, 0.0}};
    GetLeastSquaresLines(6.0, 15.0, 30.0, 26.0, 75.0, wide, 3, line.point, line.direction);
    EXPECT_EQ(line.direction, (vector2d{1.0, 0.0}));
}

TEST(FitLine, ResultMayBeOneOfThePoints)
{
    point2d points[3] = {{0.0, 5.0}, {1.0, 5.0}, {5.0, 5.0}};
    vector2d direction{};
    GetLeastSquaresLines(points, 3, points[0], direction);
    EXPECT_EQ(points[0], (point2d{2.0, 5.0}));
    EXPECT_EQ(direction, (vector2d{1.0, 0.0}));
}

TEST(FitLineProperties, NoOtherLineIsNearerInSquares)
{
    std::mt19937 engine(1);
    std::uniform_real_distribution<double> coordinate(-100.0, 100.0);
    std::normal_distribution<double> nudge(0.0, 0.05);
    for (int n = 0; n < 2000; ++n) {
        std::vector<point2d> points(static_cast<std::size_t>(3 + n % 8));
        for (point2d& p : points)
            p = {coordinate(engine), coordinate(engine)};
        const Line line = Fit(points);
        const double least = Residual(points, line);
        for (int k = 0; k < 5; ++k) {
            Line other = line;
            other.point.x += nudge(engine) * 20.0;
            other.direction.x += nudge(engine);
            EXPECT_GE(Residual(points, other), least * (1.0 - 1e-9)) << n;
        }
    }
}

TEST(FitLineProperties, PointsOfALineFindItAgain)
{
    std::mt19937 engine(2);
    std::uniform_real_distribution<double> coordinate(-100.0, 100.0);
    for (int n = 0; n < 2000; ++n) {
        const double slope = coordinate(engine) / 10.0;
        const double crossing = coordinate(engine);
        std::vector<point2d> points(static_cast<std::size_t>(2 + n % 8));
        for (point2d& p : points) {
            const double y = coordinate(engine);
            p = {crossing + slope * y, y};
        }
        if (std::fabs(points[0].y - points[1].y) < 10.0)
            continue;
        const Line line = Fit(points);
        EXPECT_NEAR(line.direction.x, slope, 1e-9) << n;
        EXPECT_NEAR(line.point.x, crossing, 1e-7) << n;
    }
}

} // namespace
} // namespace ZarnMath
