// The commands that make cubics: of offsets, of points and of joints with a kink. And what measures them.

#include "Measure.h"
#include "Program.h"

#include <cmath>
#include <gtest/gtest.h>
#include <numbers>

namespace {

/// Drawn 100000 units wide, it has a radius of 50000 and runs clockwise: what is outside lies to the left.
constexpr const char* circle = "<circle cx='300' cy='200' r='150'/>";
constexpr double radius = 50000.0;
constexpr double quarterError = 2.73e-4;

constexpr const char* square = "<path d='M0,0 H100 V100 H0 Z'/>";

/// The arch 0,0 100,300 200,300 300,0 turned downward in the file, 300 wide: its radius is 50 at the summit.
constexpr const char* arch = "<path d='M0,0 C100,-300 200,-300 300,0'/>";

/// Two sides of 100 that turn by so many degrees.
std::string Kink(double degrees)
{
    const double angle = degrees * std::numbers::pi / 180.0;
    return "<path d='M0,0 H100 L" + Number(100.0 + 100.0 * std::cos(angle)) + "," + Number(100.0 * std::sin(angle)) +
           "'/>";
}

Numbers AskAboutPoints(const std::string& points, std::vector<std::string> arguments)
{
    const TemporaryFolder folder;
    folder.Write("points.txt", points);
    arguments.insert(arguments.begin() + 1, "points.txt");
    arguments.push_back("--json");
    const Outcome outcome = RunCurvelab(arguments, folder.Path());
    EXPECT_EQ(outcome.status, 0) << outcome.err;
    return Numbers(outcome.out);
}

} // namespace

TEST(Track, IsAsFarFromAPointAsTheFootOfTheNormal)
{
    using namespace curvelab;
    const Cubic line = LineAsCubic({0.0, 0.0}, {1000.0, 0.0});
    EXPECT_NEAR(Track(line, 0.0).Distance({123.4, 7.0}), 7.0, 1e-12);
    EXPECT_NEAR(Track(line, 10.0).Distance({123.4, 7.0}), 3.0, 1e-12);
    EXPECT_NEAR(Track(line, -10.0).Distance({123.4, 7.0}), 17.0, 1e-12);
    EXPECT_NEAR(Track(line, 0.0).Distance({1003.0, 4.0}), 5.0, 1e-12);
    // y = x^2 from -2 to 2: the normal at x = 1/2 runs through (0, 3/4).
    const Cubic parabola = QuadraticAsCubic({-2.0, 4.0}, {0.0, -4.0}, {2.0, 4.0});
    const double foot = std::sqrt(0.5);
    const point2d onNormal{0.5 - 0.1 * 2.0 * foot, 0.25 + 0.1 * 2.0 * foot * 0.5 * 2.0};
    EXPECT_NEAR(Track(parabola, 0.0).Distance(onNormal), 0.2, 1e-9);
    EXPECT_NEAR(Track(parabola, 0.05).Distance(onNormal), 0.15, 1e-9);
    EXPECT_NEAR(Track(parabola, -0.05).Distance(onNormal), 0.25, 1e-9);
}

TEST(Track, HasADirectionWhereTheSpeedVanishes)
{
    using namespace curvelab;
    const Track track({{{0.0, 0.0}, {0.0, 0.0}, {2.0, 0.0}, {3.0, 0.0}}}, 5.0);
    const point2d start = track.PointAt(0.0);
    EXPECT_NEAR(start.x, 0.0, 1e-9);
    EXPECT_NEAR(start.y, 5.0, 1e-9);
}

TEST(Turn, IsMeasuredWithoutASign)
{
    using namespace curvelab;
    const Cubic along = LineAsCubic({0.0, 0.0}, {10.0, 0.0});
    EXPECT_NEAR(TurnBetween(along, LineAsCubic({10.0, 0.0}, {11.0, 1.0})), 45.0, 1e-12);
    EXPECT_NEAR(TurnBetween(along, LineAsCubic({10.0, 0.0}, {11.0, -1.0})), 45.0, 1e-12);
    EXPECT_NEAR(TurnBetween(along, LineAsCubic({10.0, 0.0}, {0.0, 0.0})), 180.0, 1e-12);
    EXPECT_EQ(TurnBetween(along, LineAsCubic({10.0, 0.0}, {20.0, 0.0})), 0.0);
    // Handles of no length: the direction is that of the next control point.
    const Cubic held{{{10.0, 0.0}, {10.0, 0.0}, {10.0, 5.0}, {20.0, 5.0}}};
    EXPECT_NEAR(TurnBetween(along, held), 90.0, 1e-12);
}

TEST(Offset, OfACircleIsACircle)
{
    for (const double distance : {20000.0, -20000.0}) {
        const Numbers answer = AskCurvelab(circle, {"offset", "--distance", Number(distance)});
        EXPECT_EQ(answer.Number("/answer/offsets"), 4);
        EXPECT_EQ(answer.Number("/answer/stretches"), 4);
        EXPECT_EQ(answer.Number("/answer/cubics"), 4);
        EXPECT_EQ(answer.Number("/answer/cusps"), 0);
        EXPECT_EQ(answer.Number("/answer/changes"), 0);
        EXPECT_EQ(answer.Number("/answer/notNear"), 0);
        // The quarter and the fit of its offset are each out by less than the classic cubic.
        const double deviation = answer.Number("/answer/largestDeviation");
        EXPECT_GT(deviation, 0.0);
        EXPECT_LT(deviation, quarterError * (radius + std::abs(radius + distance)));
    }
}

TEST(Offset, IsCutUntilItIsNear)
{
    double cubics = 0.0;
    for (const double tolerance : {50.0, 1.0, 0.02}) {
        const Numbers answer = AskCurvelab(circle, {"offset", "--distance=30000", "--tolerance", Number(tolerance)});
        EXPECT_GT(answer.Number("/answer/cubics"), cubics);
        cubics = answer.Number("/answer/cubics");
        EXPECT_EQ(answer.Number("/answer/stretches"), 4);
        EXPECT_EQ(answer.Number("/answer/notNear"), 0);
        // The library judges by samples; between them the fit may be somewhat farther.
        EXPECT_LT(answer.Number("/answer/largestDeviation"), 1.5 * tolerance);
    }
    const Numbers never = AskCurvelab(arch, {"offset", "--distance=30000", "--tolerance=0"});
    EXPECT_EQ(never.Number("/answer/cubics"), 64);
    EXPECT_EQ(never.Number("/answer/notNear"), 64);
}

TEST(Offset, LosesItsFold)
{
    const Numbers answer = AskCurvelab(arch, {"offset", "--distance=-100", "--units=300", "--tolerance=0.5"});
    EXPECT_EQ(answer.Number("/answer/stretches"), 2);
    ASSERT_EQ(answer.Number("/answer/cusps"), 2);
    ASSERT_EQ(answer.Number("/answer/changes"), 2);
    // x = 300*t, and the cusps are where 50*(1 + 36*(t - 1/2)^2)^(3/2) is 100.
    const double half = std::sqrt((std::pow(2.0, 2.0 / 3.0) - 1.0) / 36.0);
    ExpectPoint(answer, "/answer/changePoints/0", 300.0 * (0.5 - half), 225.0 - 900.0 * half * half, 1e-3);
    ExpectPoint(answer, "/answer/changePoints/1", 300.0 * (0.5 + half), 225.0 - 900.0 * half * half, 1e-3);
    EXPECT_LT(answer.Number("/answer/largestDeviation"), 0.75);
}

TEST(Offset, OfACurveThatIsTooTightIsLeftOut)
{
    const Numbers answer = AskCurvelab(circle, {"offset", "--distance=-60000"});
    EXPECT_EQ(answer.Number("/answer/cubics"), 0);
    EXPECT_EQ(answer.Number("/answer/dropped"), 4);
    EXPECT_EQ(answer.Number("/answer/largestDeviation"), 0.0);
}

TEST(Offset, OfALineIsALine)
{
    const Numbers answer = AskCurvelab(square, {"offset", "--distance=3000", "--sides=2", "--tolerance=1e-6"});
    EXPECT_EQ(answer.Number("/answer/sides"), 2);
    EXPECT_EQ(answer.Number("/answer/cubics"), 8);
    EXPECT_LT(answer.Number("/answer/largestDeviation"), 1e-6);
}

TEST(Offset, PassesOverPoints)
{
    const Numbers answer = AskCurvelab("<path d='M0,0 C0,0 0,0 0,0 L100,0'/>", {"offset", "--distance=3000"});
    EXPECT_EQ(answer.Number("/answer/pointCurves"), 1);
    EXPECT_EQ(answer.Number("/answer/cubics"), 1);
}

TEST(Fit, OfASquareIsFourLines)
{
    const Numbers answer = AskCurvelab(square, {"fit", "--tolerance=1e-3", "--spacing=10000"});
    EXPECT_EQ(answer.Number("/answer/points"), 40);
    EXPECT_EQ(answer.Number("/answer/corners"), 4);
    EXPECT_EQ(answer.Number("/answer/cubics"), 4);
    EXPECT_LT(answer.Number("/answer/largestDeviation"), 1e-6);
}

TEST(Fit, OfACircleIsALoopWithoutCorners)
{
    double cubics = 0.0;
    for (const double tolerance : {500.0, 50.0, 5.0}) {
        const Numbers answer = AskCurvelab(circle, {"fit", "--tolerance", Number(tolerance)});
        EXPECT_EQ(answer.Number("/answer/corners"), 0);
        EXPECT_NEAR(answer.Number("/answer/points"), 2.0 * std::numbers::pi * radius / 500.0, 4.0);
        EXPECT_GE(answer.Number("/answer/cubics"), cubics);
        cubics = answer.Number("/answer/cubics");
        EXPECT_LE(answer.Number("/answer/largestDeviation"), tolerance);
        for (std::size_t i = 0; i < answer.Size("/answer/joints"); ++i) {
            const std::string joint = "/answer/joints/" + std::to_string(i);
            EXPECT_NEAR(std::hypot(answer.Number(joint + "/0") - radius, answer.Number(joint + "/1") - radius), radius,
                        quarterError * radius);
        }
    }
    EXPECT_GE(cubics, 4.0);
    EXPECT_LE(cubics, 16.0); // a thousand points of 5 units' tolerance
}

TEST(Fit, OfPointsOfOneCubicIsOneCubic)
{
    const Numbers answer = AskCurvelab(arch, {"fit", "--tolerance=0.5", "--units=300", "--spacing=3"});
    EXPECT_EQ(answer.Number("/answer/cubics"), 1);
    EXPECT_LT(answer.Number("/answer/largestDeviation"), 0.5);
}

TEST(Fit, SeesThroughNoise)
{
    const std::vector<std::string> plain{"fit", "--tolerance=700", "--noise=300", "--reach=15"};
    std::vector<std::string> reseeded = plain;
    reseeded.emplace_back("--seed=2");
    const Numbers answer = AskCurvelab(circle, plain);
    EXPECT_LE(answer.Number("/answer/largestDeviation"), 700.0);
    EXPECT_GT(answer.Number("/answer/largestDeviation"), 200.0);
    EXPECT_LE(answer.Number("/answer/cubics"), 12);
    EXPECT_EQ(AskCurvelab(circle, plain).Number("/answer/largestDeviation"), answer.Number("/answer/largestDeviation"));
    EXPECT_NE(AskCurvelab(circle, reseeded).Number("/answer/largestDeviation"),
              answer.Number("/answer/largestDeviation"));
}

TEST(Fit, TakesTheCornersThatItIsTold)
{
    const std::string kink = Kink(10.0);
    EXPECT_EQ(AskCurvelab(kink, {"fit", "--tolerance=100", "--corner=11"}).Number("/answer/corners"), 2);
    EXPECT_EQ(AskCurvelab(kink, {"fit", "--tolerance=100", "--corner=9"}).Number("/answer/corners"), 3);
}

TEST(Fit, ReadsPoints)
{
    // Points of y = x^2/20, with a remark, a comma, and a second polyline that is closed.
    std::string points = "# a parabola\n";
    for (int i = -10; i <= 10; ++i)
        points += std::to_string(i) + (i % 2 == 0 ? " " : ", ") + Number(i * i / 20.0) + "\n";
    points += "\n0 0\n10 0\n0 10 # the last side closes it\n0 0\n";
    const Numbers answer = AskAboutPoints(points, {"fit", "--tolerance=0.5", "--units=100", "--spacing=0"});
    EXPECT_EQ(answer.Number("/drawing/contours"), 2);
    EXPECT_EQ(answer.Number("/drawing/curves"), 20 + 3);
    EXPECT_EQ(answer.Number("/answer/points"), 21 + 3);
    EXPECT_EQ(answer.Number("/answer/cubics"), 1 + 3);
    EXPECT_LT(answer.Number("/answer/largestDeviation"), 0.5);
}

TEST(Fit, PassesOverPoints)
{
    const Numbers answer =
        AskCurvelab("<path d='M0,0 C0,0 0,0 0,0 L100,0 M50,50 C50,50 50,50 50,50'/>", {"fit", "--tolerance=10"});
    EXPECT_EQ(answer.Number("/answer/cubics"), 1);
    EXPECT_EQ(answer.Number("/answer/corners"), 2);
    // All ends of these loops are one point.
    const Numbers loops = AskCurvelab("<path d='M0,0 C90,90 -90,90 0,0 C90,90 -90,90 0,0 C90,90 -90,90 0,0'/>",
                                      {"fit", "--tolerance=10", "--spacing=0", "--corner=180"});
    EXPECT_EQ(loops.Number("/answer/cubics"), 0);
}

TEST(Smooth, TakesOutAKink)
{
    const Numbers answer = AskCurvelab(Kink(10.0), {"smooth"});
    EXPECT_EQ(answer.Number("/answer/joints"), 1);
    EXPECT_EQ(answer.Number("/answer/smoothed"), 1);
    EXPECT_NEAR(answer.Number("/answer/largestTurnBefore"), 10.0, 1e-9);
    EXPECT_LT(answer.Number("/answer/largestTurnAfter"), 1e-9);
    // The kink is half a side's 5 degrees away from the chord of the two stretches.
    const double side = 100000.0 / (1.0 + std::cos(10.0 * std::numbers::pi / 180.0));
    EXPECT_GT(answer.Number("/answer/largestMove"), 0.0);
    EXPECT_LT(answer.Number("/answer/largestMove"), 0.5 * side * std::sin(5.0 * std::numbers::pi / 180.0));
}

TEST(Smooth, KeepsCornersAndWhatIsSmooth)
{
    const Numbers corners = AskCurvelab(square, {"smooth"});
    EXPECT_EQ(corners.Number("/answer/joints"), 4);
    EXPECT_EQ(corners.Number("/answer/corners"), 4);
    EXPECT_EQ(corners.Number("/answer/smoothed"), 0);
    const Numbers smooth = AskCurvelab(circle, {"smooth"});
    EXPECT_EQ(smooth.Number("/answer/smoothBefore"), 4);
    EXPECT_EQ(smooth.Number("/answer/smoothed"), 0);
    EXPECT_EQ(AskCurvelab(Kink(10.0), {"smooth", "--corner=9"}).Number("/answer/corners"), 1);
    EXPECT_EQ(AskCurvelab("<path d='M0,0 H100'/>", {"smooth"}).Number("/answer/joints"), 0);
}

TEST(Smooth, MendsACoarseGrid)
{
    const Numbers answer = AskCurvelab("<ellipse cx='60' cy='40' rx='57' ry='33' transform='rotate(17)'/>",
                                       {"smooth", "--units=40", "--integer"});
    EXPECT_GT(answer.Number("/answer/smoothed"), 0);
    EXPECT_EQ(answer.Number("/answer/refused"), 0);
    EXPECT_GT(answer.Number("/answer/largestTurnBefore"), 0.1);
    EXPECT_LT(answer.Number("/answer/largestTurnAfter"), 1e-6);
    EXPECT_LT(answer.Number("/answer/largestMove"), 1.0);
}
