// The commands that measure a drawing: lengths, areas, boxes and curvature against those of known figures.

#include "Program.h"

#include <algorithm>
#include <cmath>
#include <gtest/gtest.h>
#include <numbers>

namespace {

/// Drawn 100000 units wide, it has this radius and its centre at (radius, radius).
constexpr const char* circle = "<circle cx='300' cy='200' r='150'/>";
constexpr double radius = 50000.0;
/// The arms of the classic cubic for a quarter of the unit circle.
constexpr double kappa = 4.0 / 3.0 * (std::numbers::sqrt2 - 1.0);
/// Such a quarter lies outside the circle by up to this part of the radius, and nowhere inside.
constexpr double quarterError = 2.73e-4;

constexpr const char* square = "<path d='M0,0 H100 V100 H0 Z'/>";

/// P(t) = (t^2 - 0.85*t, t^3 - 0.45*t), times 1000 and with y downward. Cross(P', P'') = 6*(t^2 - 0.85*t + 0.15) vanishes
/// at 1/4 and at 3/5.
constexpr const char* twoInflections = "<path d='M0,0 C-283.3333333333333,150 -233.3333333333333,300 150,-550'/>";

} // namespace

TEST(Curvature, OfACircleIsThatOfItsQuarters)
{
    const Numbers answer = AskCurvelab(circle, {"curvature"});
    // At its ends a quarter has 2/3*Cross(P1 - P0, P2 - P1)/|P1 - P0|^3, and nowhere less. Circles run clockwise.
    const double atEnds = -2.0 / 3.0 * (1.0 - kappa) / (kappa * kappa) / radius;
    ASSERT_EQ(answer.Size("/answer/weakestOfCurve"), 4u);
    for (int i = 0; i < 4; ++i) {
        EXPECT_NEAR(answer.Number("/answer/weakestOfCurve/" + std::to_string(i)), atEnds, 1e-12 / radius);
        EXPECT_NEAR(answer.Number("/answer/strongestOfCurve/" + std::to_string(i)), -1.0 / radius, 0.01 / radius);
    }
    EXPECT_NEAR(answer.Number("/answer/radius"), radius, 0.01 * radius);
    EXPECT_EQ(answer.Number("/answer/inflections"), 0);
    EXPECT_EQ(answer.Number("/answer/straightCurves"), 0);
}

TEST(Curvature, OfASquareThereIsNone)
{
    const Numbers answer = AskCurvelab(square, {"curvature"});
    EXPECT_EQ(answer.Number("/answer/straightCurves"), 4);
    EXPECT_EQ(answer.Number("/answer/strongest"), 0.0);
    EXPECT_EQ(answer.Number("/answer/teeth"), 0);
    EXPECT_EQ(answer.Number("/answer/speedExtremes"), 0);
}

TEST(Curvature, OfAParabolaIsStrongestWhereItIsSlowest)
{
    // y = x^2/100 from x = -100 to 200, with x uniform in t; 250 drawing units to one of the file.
    const Numbers answer = AskCurvelab("<path d='M-100,-100 Q50,200 200,-400'/>", {"curvature"});
    ASSERT_EQ(answer.Number("/answer/speedExtremes"), 1);
    ExpectPoint(answer, "/answer/speedExtremeAt/0", 25000.0, 0.0, 1e-3);
    EXPECT_NEAR(answer.Number("/answer/speedExtremeT/0"), 1.0 / 3.0, 1e-9);
    // The vertex has y'' = 1/50; the teeth stand close enough to it.
    EXPECT_NEAR(answer.Number("/answer/strongest"), 0.02 / 250.0, 1e-3 * 0.02 / 250.0);
    EXPECT_EQ(answer.Number("/answer/inflections"), 0);
}

TEST(Curvature, ListsInflections)
{
    const Numbers answer = AskCurvelab(twoInflections, {"curvature"});
    ASSERT_EQ(answer.Number("/answer/inflections"), 2);
    EXPECT_EQ(answer.Number("/answer/missedInflections"), 0);
    EXPECT_EQ(answer.Number("/answer/strayInflections"), 0);
    const double t = answer.Number("/answer/inflectionT/0"), u = answer.Number("/answer/inflectionT/1");
    EXPECT_NEAR(std::min(t, u), 0.25, 1e-9);
    EXPECT_NEAR(std::max(t, u), 0.6, 1e-9);
}

TEST(Curvature, FindsTheInflectionOfASymmetricS)
{
    // Its quadratic has no leading term, or one of rounding: the middle is the only root, and the closed form loses it.
    const Numbers answer = AskCurvelab("<path d='M0,0 C100,-300 200,300 300,0'/>", {"curvature"});
    ASSERT_EQ(answer.Number("/answer/inflections"), 1);
    EXPECT_EQ(answer.Number("/answer/missedInflections"), 1);
    EXPECT_NEAR(answer.Number("/answer/inflectionT/0"), 0.5, 1e-9);
    EXPECT_NEAR(answer.Number("/answer/inflectionAt/0/0"), 50000.0, 1e-3);
}

TEST(Length, OfASquareIsFourSides)
{
    const Numbers answer = AskCurvelab(square, {"length", "--spacing=25000"});
    EXPECT_NEAR(answer.Number("/answer/length"), 400000.0, 1e-6);
    EXPECT_NEAR(answer.Number("/answer/polylineLength"), 400000.0, 1e-6);
    ASSERT_EQ(answer.Number("/answer/points"), 16);
    // From the upper left corner to the right, and around.
    for (int i = 0; i < 16; ++i) {
        const double along = 25000.0 * (i % 4);
        const double x[] = {along, 100000.0, 100000.0 - along, 0.0};
        const double y[] = {100000.0, 100000.0 - along, 0.0, along};
        ExpectPoint(answer, "/answer/marks/" + std::to_string(i), x[i / 4], y[i / 4], 0.05);
    }
    EXPECT_LT(answer.Number("/answer/largestUnevenness"), 0.1);
}

TEST(Length, OfAnOpenLineIncludesBothEnds)
{
    const Numbers answer = AskCurvelab("<path d='M0,0 H400'/>", {"length", "--spacing=25000"});
    ASSERT_EQ(answer.Number("/answer/points"), 5);
    for (int i = 0; i < 5; ++i)
        ExpectPoint(answer, "/answer/marks/" + std::to_string(i), 25000.0 * i, 0.0, 0.05);
    // What is left at the end is shorter than a step.
    EXPECT_EQ(AskCurvelab("<path d='M0,0 H400'/>", {"length", "--spacing=30000"}).Number("/answer/points"), 4);
    EXPECT_EQ(AskCurvelab("<path d='M0,0 H400'/>", {"length", "--spacing=1e9"}).Number("/answer/points"), 1);
}

TEST(Length, OfACircleIsItsCircumference)
{
    const Numbers answer = AskCurvelab(circle, {"length", "--spacing=40000"});
    const double around = 2.0 * std::numbers::pi * radius;
    EXPECT_GT(answer.Number("/answer/length"), around);
    EXPECT_NEAR(answer.Number("/answer/length"), around, quarterError * around);
    // The polyline of 4096 chords to a quarter is too short by (pi/2/4096)^2/24 of the length.
    EXPECT_LT(answer.Number("/answer/largestDifference"), 1e-8 * around);
    EXPECT_LT(answer.Number("/answer/largestUnevenness"), 0.1);
    ASSERT_EQ(answer.Number("/answer/points"), 8);
    for (int i = 1; i < 8; ++i) {
        const std::string here = "/answer/marks/" + std::to_string(i),
                          before = "/answer/marks/" + std::to_string(i - 1);
        const double dx = answer.Number(here + "/0") - answer.Number(before + "/0");
        const double dy = answer.Number(here + "/1") - answer.Number(before + "/1");
        EXPECT_NEAR(std::hypot(dx, dy), 2.0 * radius * std::sin(0.4), 2.0 * quarterError * radius);
    }
}

TEST(Length, CountsEveryContour)
{
    const Numbers answer =
        AskCurvelab("<path d='M0,0 H100 M0,30 H50'/>", {"length", "--spacing=10000", "--integer", "--units=1000000"});
    EXPECT_EQ(answer.Size("/answer/lengthOfContour"), 2u);
    EXPECT_NEAR(answer.Number("/answer/lengthOfContour/0"), 1000000.0, 1e-5);
    EXPECT_NEAR(answer.Number("/answer/lengthOfContour/1"), 500000.0, 1e-5);
    EXPECT_EQ(answer.Number("/answer/points"), 101 + 51);
}

TEST(Area, OfASquareHasTheSignOfItsDirection)
{
    const Numbers clockwise = AskCurvelab(square, {"area"});
    EXPECT_NEAR(clockwise.Number("/answer/area"), 1e10, 1.0);
    EXPECT_NEAR(clockwise.Number("/answer/polygonArea"), 1e10, 1.0);
    EXPECT_EQ(clockwise.Number("/answer/clockwise"), 1);
    EXPECT_EQ(clockwise.Number("/answer/counterClockwise"), 0);
    const Numbers reversed = AskCurvelab("<path d='M0,0 V100 H100 V0 Z'/>", {"area", "--integer"});
    EXPECT_NEAR(reversed.Number("/answer/area"), -1e10, 1.0);
    EXPECT_EQ(reversed.Number("/answer/clockwise"), 0);
    EXPECT_EQ(reversed.Number("/answer/counterClockwise"), 1);
}

TEST(Area, OfACircleIsThatOfItsQuarters)
{
    const Numbers answer = AskCurvelab(circle, {"area"});
    // The sector of a quarter with arms k has (10 + 12*k - 3*k^2)/20, by the cross products of its control points.
    const double exact = radius * radius * (10.0 + 12.0 * kappa - 3.0 * kappa * kappa) / 5.0;
    EXPECT_NEAR(answer.Number("/answer/area"), exact, 1e-11 * exact);
    EXPECT_NEAR(answer.Number("/answer/area"), std::numbers::pi * radius * radius, 2.0 * quarterError * exact);
    // Of a quarter turn in n chords the segments have (pi/2/n)^2/6 of the area.
    EXPECT_LT(answer.Number("/answer/largestDifference"), 3e-8 * exact);
}

TEST(Area, OfAHoleIsSubtracted)
{
    const Numbers answer = AskCurvelab("<path d='M0,0 H100 V100 H0 Z M20,20 V80 H80 V20 Z'/>", {"area"});
    EXPECT_NEAR(answer.Number("/answer/area"), (1.0 - 0.36) * 1e10, 1.0);
    EXPECT_EQ(answer.Number("/answer/clockwise"), 1);
    EXPECT_EQ(answer.Number("/answer/counterClockwise"), 1);
}

TEST(Area, OfAFigureOfEightCancels)
{
    const Numbers answer = AskCurvelab("<path d='M0,0 L100,100 L100,0 L0,100 Z'/>", {"area"});
    EXPECT_EQ(answer.Number("/answer/closedContours"), 1);
    EXPECT_NEAR(answer.Number("/answer/area"), 0.0, 1.0);
}

TEST(Area, LeavesOpenContoursOut)
{
    const Numbers answer = AskCurvelab("<path d='M0,0 H100 V100 H0 Z M0,0 C0,50 50,100 100,100'/>", {"area"});
    EXPECT_EQ(answer.Number("/answer/closedContours"), 1);
    EXPECT_EQ(answer.Number("/answer/openContours"), 1);
    EXPECT_NEAR(answer.Number("/answer/area"), 1e10, 1.0);
}

TEST(Bounds, OfAnArchAreTight)
{
    // y = 3*t*(1 - t) of the height of its control points has its maximum, three quarters, in the middle.
    const Numbers answer = AskCurvelab("<path d='M0,0 C0,-100 100,-100 100,0'/>", {"bounds"});
    ExpectPoint(answer, "/answer/lowerLeft", 0.0, 0.0, 1e-9);
    ExpectPoint(answer, "/answer/upperRight", 100000.0, 75000.0, 1e-9);
    EXPECT_NEAR(answer.Number("/answer/controlHeight"), 100000.0, 1e-9);
    EXPECT_EQ(answer.Number("/answer/extremesOfX"), 0);
    ASSERT_EQ(answer.Number("/answer/extremesOfY"), 1);
    ExpectPoint(answer, "/answer/pointsOfExtremeY/0", 50000.0, 75000.0, 1e-6);
    EXPECT_LT(answer.Number("/answer/largestExcess"), 1e-9);
}

TEST(Bounds, HoldBothExtremesOfX)
{
    // x of 0, 1, -1, 0 is 3*t - 9*t^2 + 6*t^3, with extremes of sqrt(3)/6 on either side.
    const Numbers answer = AskCurvelab("<path d='M0,0 C1,-1 -1,-2 0,-3'/>", {"bounds"});
    EXPECT_EQ(answer.Number("/answer/extremesOfX"), 2);
    EXPECT_NEAR(answer.Number("/answer/width"), 100000.0 / 3.0 * std::numbers::sqrt3 / 3.0, 1e-6);
    EXPECT_NEAR(answer.Number("/answer/height"), 100000.0, 1e-6);
    EXPECT_NEAR(answer.Number("/answer/controlWidth"), 200000.0 / 3.0, 1e-6);
}

TEST(Bounds, AreThoseOfEachContour)
{
    const Numbers answer = AskCurvelab("<path d='M0,0 H100 V40 H0 Z'/><circle cx='50' cy='70' r='30'/>", {"bounds"});
    ASSERT_EQ(answer.Size("/answer/lowerLeftOfContour"), 2u);
    ExpectPoint(answer, "/answer/lowerLeftOfContour/0", 0.0, 60000.0, 1e-6);
    ExpectPoint(answer, "/answer/upperRightOfContour/0", 100000.0, 100000.0, 1e-6);
    ExpectPoint(answer, "/answer/lowerLeftOfContour/1", 20000.0, 0.0, 1e-6);
    ExpectPoint(answer, "/answer/upperRightOfContour/1", 80000.0, 60000.0, 1e-6);
    EXPECT_EQ(answer.Size("/answer/lowerLeftOfCurve"), 8u);
}

TEST(Bounds, OfIntegersAreThoseOfRoundedControlPoints)
{
    // Control points at a height of 7.7 units are rounded to 8, and the arch is three quarters of that.
    const std::string arch = "<path d='M0,0 C0,-77 100,-77 100,0'/>";
    EXPECT_NEAR(AskCurvelab(arch, {"bounds", "--units=10"}).Number("/answer/height"), 0.75 * 7.7, 1e-12);
    EXPECT_EQ(AskCurvelab(arch, {"bounds", "--units=10", "--integer"}).Number("/answer/height"), 6.0);
}
