// The commands that find places on a drawing: crossings, tangents and cusps of offsets.

#include "Program.h"

#include <algorithm>
#include <cmath>
#include <gtest/gtest.h>
#include <numbers>

namespace {

constexpr const char* circle = "<circle cx='300' cy='200' r='150'/>";
constexpr double radius = 50000.0;
constexpr double quarterError = 2.73e-4;

/// The numbers in one coordinate of a list of points, ascending.
std::vector<double> Coordinates(const Numbers& json, const std::string& pointer, int axis)
{
    std::vector<double> values;
    for (std::size_t i = 0; i < json.Size(pointer); ++i)
        values.push_back(json.Number(pointer + "/" + std::to_string(i) + "/" + std::to_string(axis)));
    std::sort(values.begin(), values.end());
    return values;
}

void ExpectAll(const std::vector<double>& values, const std::vector<double>& expected, double tolerance)
{
    ASSERT_EQ(values.size(), expected.size());
    for (std::size_t i = 0; i < values.size(); ++i)
        EXPECT_NEAR(values[i], expected[i], tolerance);
}

} // namespace

TEST(Intersect, TwoCirclesCrossTwice)
{
    // Radii of 50 with centres 60 apart cross 40 above and below the line of the centres; 625 units to one of the file.
    const std::string circles = "<circle cx='50' cy='50' r='50'/><circle cx='110' cy='50' r='50'/>";
    for (const char* option : {"--units=100000", "--integer"}) {
        const Numbers answer = AskCurvelab(circles, {"intersect", option});
        EXPECT_EQ(answer.Number("/answer/crossings"), 2);
        EXPECT_EQ(answer.Number("/answer/selfCrossings"), 0);
        EXPECT_EQ(answer.Number("/answer/contacts"), 0);
        EXPECT_EQ(answer.Number("/answer/pairs"), 28);
        EXPECT_LT(answer.Number("/answer/pairsAsked"), 28);
        const double tolerance = 2.0 * quarterError * 31250.0;
        ExpectAll(Coordinates(answer, "/answer/points", 0), {50000.0, 50000.0}, tolerance);
        ExpectAll(Coordinates(answer, "/answer/points", 1), {6250.0, 56250.0}, tolerance);
    }
}

TEST(Intersect, NeighboursDoNotCrossWhereTheyMeet)
{
    for (const char* closed :
         {"<path d='M0,0 H100 V100 H0 Z'/>", circle, "<path d='M0,0 C0,50 50,100 100,100 S200,50 200,0'/>"}) {
        const Numbers answer = AskCurvelab(closed, {"intersect"});
        EXPECT_EQ(answer.Number("/answer/crossings"), 0) << closed;
        EXPECT_EQ(answer.Number("/answer/contacts"), 0) << closed;
    }
}

TEST(Intersect, APolygonCrossesItself)
{
    const Numbers answer = AskCurvelab("<path d='M0,0 L100,100 L100,0 L0,100 Z'/>", {"intersect"});
    ASSERT_EQ(answer.Number("/answer/crossings"), 1);
    ExpectPoint(answer, "/answer/points/0", 50000.0, 50000.0, 1e-6);
    EXPECT_NEAR(answer.Number("/answer/firstT/0"), 0.5, 1e-9);
    EXPECT_NEAR(answer.Number("/answer/secondT/0"), 0.5, 1e-9);
}

TEST(Intersect, AFigureOfEightCrossesInItsMiddle)
{
    // Two S that share their ends and cross at t = 1/2 of both, where the library's search makes its first cut.
    const Numbers answer = AskCurvelab("<path d='M0,50 C0,-50 200,150 200,50 C200,-50 0,150 0,50 Z'/>", {"intersect"});
    ASSERT_EQ(answer.Number("/answer/crossings"), 1);
    EXPECT_NEAR(answer.Number("/answer/points/0/0"), 50000.0, 1e-3);
    EXPECT_NEAR(answer.Number("/answer/points/0/1"), answer.Number("/drawing/height") / 2.0, 1e-3);
    EXPECT_EQ(answer.Number("/answer/contacts"), 0);
}

TEST(Intersect, OneCurveCrossesItself)
{
    // By symmetry the loop 0,0 300,300 -100,300 200,0 crosses on its axis; x(t) = 900*t - 2100*t^2 + 1400*t^3 is 100 where
    // 14*t^2 - 14*t + 2 vanishes, besides t = 1/2, and y = 900*t*(1 - t) is 900/7 there.
    const Numbers answer = AskCurvelab("<path d='M0,0 C300,-300 -100,-300 200,0'/>", {"intersect"});
    ASSERT_EQ(answer.Number("/answer/crossings"), 1);
    EXPECT_EQ(answer.Number("/answer/selfCrossings"), 1);
    EXPECT_EQ(answer.Number("/answer/magnifiedLoops"), 0);
    const double unit = answer.Number("/drawing/height") / 225.0;
    EXPECT_NEAR(answer.Number("/answer/points/0/0"), answer.Number("/drawing/width") / 2.0, unit);
    EXPECT_NEAR(answer.Number("/answer/points/0/1"), 900.0 / 7.0 * unit, unit);
    const double half = std::sqrt(0.25 - 1.0 / 7.0);
    EXPECT_NEAR(answer.Number("/answer/firstT/0"), 0.5 + half, 1e-3);
    EXPECT_NEAR(answer.Number("/answer/secondT/0"), 0.5 - half, 1e-3);
}

TEST(Intersect, FindsALoopThatIsTooSmallForTheLibrary)
{
    const Numbers answer = AskCurvelab("<path d='M0,0 C300,-300 -100,-300 200,0'/>", {"intersect", "--units=20"});
    EXPECT_EQ(answer.Number("/answer/magnifiedLoops"), 1);
    ASSERT_EQ(answer.Number("/answer/selfCrossings"), 1);
    EXPECT_NEAR(answer.Number("/answer/points/0/0"), answer.Number("/drawing/width") / 2.0, 0.01);
}

TEST(Intersect, ParabolasCross)
{
    // y = 400*u*(1 - u) and its mirror image y = 100 - 400*u*(1 - u), with x = 400*u: where u*(1 - u) = 1/8. On this grid
    // none of them has a cubic term, not even by rounding.
    const std::string parabolas = "<path d='M0,0 Q200,-200 400,0 M0,-100 Q200,100 400,-100'/>";
    const Numbers answer = AskCurvelab(parabolas, {"intersect", "--units=120000", "--integer"});
    EXPECT_EQ(answer.Number("/answer/bentPairs"), 1);
    ASSERT_EQ(answer.Number("/answer/crossings"), 2);
    const double half = std::sqrt(1.0 / 4.0 - 1.0 / 8.0);
    ExpectAll(Coordinates(answer, "/answer/points", 0), {120000.0 * (0.5 - half), 120000.0 * (0.5 + half)}, 1.0);
    ExpectAll(Coordinates(answer, "/answer/points", 1), {15000.0, 15000.0}, 1.0);
}

TEST(Intersect, TellsContactsFromCrossings)
{
    // A letter T: the end of the stem lies on the bar.
    const Numbers answer = AskCurvelab("<path d='M0,0 H100 M40,0 V70'/>", {"intersect"});
    EXPECT_EQ(answer.Number("/answer/crossings"), 0);
    ASSERT_EQ(answer.Number("/answer/contacts"), 1);
    ExpectPoint(answer, "/answer/pointsOfContacts/0", 40000.0, 70000.0, 1e-6);
}

TEST(Intersect, AJointOnAnotherCurveIsOnePlace)
{
    // A line through the centre of a circle meets it where two of its quarters join, on either side.
    const Numbers answer = AskCurvelab("<circle cx='100' cy='100' r='50'/><path d='M0,100 H200'/>", {"intersect"});
    EXPECT_EQ(answer.Number("/answer/crossings") + answer.Number("/answer/contacts"), 2);
}

TEST(Intersect, CurvesThatRunTogetherDoNotCross)
{
    const Numbers answer = AskCurvelab(std::string(circle) + circle, {"intersect"});
    EXPECT_EQ(answer.Number("/answer/crossings"), 0);
}

TEST(Tangents, TouchACircleAtItsPolar)
{
    // From twice the radius the tangents touch 60 degrees off.
    const Numbers answer = AskCurvelab(circle, {"tangents", "--to=150000,50000"});
    ASSERT_EQ(answer.Number("/answer/tangents"), 2);
    // The slope of a quarter's radial error is below 1e-2, so that its tangents turn by less than that.
    const double tolerance = 0.01 * radius;
    ExpectAll(Coordinates(answer, "/answer/points", 0), {75000.0, 75000.0}, tolerance);
    const double half = radius * std::sqrt(0.75);
    ExpectAll(Coordinates(answer, "/answer/points", 1), {radius - half, radius + half}, tolerance);
    EXPECT_LT(answer.Number("/answer/largestMiss"), 1e-3);
}

TEST(Tangents, OfAParabolaTouchSymmetrically)
{
    // y = x^2 from -2 to 2, 25000 units to one: the tangents through (0, -1) touch at x = -1 and 1.
    for (const char* option : {"--units=100000", "--integer"}) {
        const Numbers answer =
            AskCurvelab("<path d='M-200,-400 Q0,400 200,-400'/>", {"tangents", "--to", "50000,-25000", option});
        const double tolerance = option == std::string("--integer") ? 2.0 : 1e-3;
        ExpectAll(Coordinates(answer, "/answer/points", 0), {25000.0, 75000.0}, tolerance);
        ExpectAll(Coordinates(answer, "/answer/points", 1), {25000.0, 25000.0}, tolerance);
        EXPECT_EQ(answer.Number("/answer/curvesWithTangent"), 1);
    }
}

TEST(Tangents, ThereAreNoneFromWithinOrToLines)
{
    EXPECT_EQ(AskCurvelab(circle, {"tangents", "--to=50000,60000"}).Number("/answer/tangents"), 0);
    EXPECT_EQ(
        AskCurvelab("<path d='M0,0 H100 V100 H0 Z'/>", {"tangents", "--to=-7000,250000"}).Number("/answer/tangents"),
        0);
}

namespace {

/// Half axes of 50000 and 25000; its radius of curvature goes from b^2/a = 12500 to a^2/b = 100000.
constexpr const char* ellipse = "<ellipse cx='100' cy='100' rx='100' ry='50'/>";

} // namespace

TEST(Cusps, OfAnEllipseLieOnItsEvolute)
{
    constexpr double a = 50000.0, b = 25000.0, distance = 30000.0;
    // Ellipses run clockwise: the inner side is on the right.
    const Numbers answer = AskCurvelab(ellipse, {"cusps", "--distance", Number(-distance)});
    ASSERT_EQ(answer.Number("/answer/cusps"), 4);
    EXPECT_EQ(answer.Number("/answer/curvesWithCusp"), 4);
    EXPECT_EQ(answer.Number("/answer/turns"), 4);
    EXPECT_LT(answer.Number("/answer/largestRadiusError"), 1e-3);
    // The radius (a^2*s^2 + b^2*c^2)^(3/2)/(a*b) equals the distance at this sine s; the centre of curvature there is
    // ((a^2 - b^2)/a*c^3, (a^2 - b^2)/b*s^3). The quarters' radii are off by up to 2 percent, which moves it by less than
    // 2 percent of a.
    const double squared = (std::pow(a * b * distance, 2.0 / 3.0) - b * b) / (a * a - b * b);
    const double x = (a * a - b * b) / a * std::pow(1.0 - squared, 1.5);
    const double y = (a * a - b * b) / b * std::pow(squared, 1.5);
    ExpectAll(Coordinates(answer, "/answer/points", 0), {a - x, a - x, a + x, a + x}, 0.02 * a);
    ExpectAll(Coordinates(answer, "/answer/points", 1), {b - y, b - y, b + y, b + y}, 0.02 * a);
}

TEST(Cusps, ThereAreNoneOutsideOrNearOrFar)
{
    for (const char* distance : {"30000", "-10000", "-110000", "0"}) {
        const Numbers answer = AskCurvelab(ellipse, {"cusps", "--distance", distance});
        EXPECT_EQ(answer.Number("/answer/cusps"), 0) << distance;
        EXPECT_EQ(answer.Number("/answer/turns"), 0) << distance;
    }
}

TEST(Cusps, OfLinesThereAreNone)
{
    const Numbers answer = AskCurvelab("<path d='M0,0 H100 V100 H0 Z'/>", {"cusps", "--distance=-1000", "--integer"});
    EXPECT_EQ(answer.Number("/answer/cusps"), 0);
    EXPECT_EQ(answer.Number("/answer/curves"), 4);
}

TEST(Program, DrawsEveryCommand)
{
    const TemporaryFolder folder;
    const std::string file = folder.WriteSvg(circle);
    const std::vector<std::vector<std::string>> commands = {{"curvature"},
                                                            {"length", "--spacing=700"},
                                                            {"bounds"},
                                                            {"intersect"},
                                                            {"tangents", "--to=-9,-9"},
                                                            {"area"},
                                                            {"cusps", "--distance=-20000"},
                                                            {"offset", "--distance=900"},
                                                            {"fit", "--tolerance=90"},
                                                            {"smooth"}};
    for (std::vector<std::string> command : commands) {
        command.insert(command.begin() + 1, file);
        command.insert(command.end(), {"-o", "picture.svg"});
        const Outcome outcome = RunCurvelab(command, folder.Path());
        EXPECT_EQ(outcome.status, 0) << outcome.err;
        EXPECT_NE(ContentOf(folder.Path() / "picture.svg").find("curvelab " + command.front()), std::string::npos);
        EXPECT_FALSE(outcome.out.empty());
    }
}
