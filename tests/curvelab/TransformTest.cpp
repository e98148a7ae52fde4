// The steps of a transform, and what the command says about it.

#include "Failure.h"
#include "Program.h"
#include "TransformSteps.h"

#include <algorithm>
#include <cmath>
#include <gtest/gtest.h>
#include <numbers>

using namespace curvelab;
using ZarnMath::point2d;

namespace {

constexpr point2d middle{40.0, 20.0};

MATRIX Combined(const std::string& text)
{
    return Combine(ReadTransformSteps("--by", text), middle);
}

MATRIX CombinedInWholeUnits(const std::string& text)
{
    return CombineInWholeUnits(ReadTransformSteps("--by", text), middle);
}

void ExpectMatrix(const MATRIX& actual, const MATRIX& expected, double tolerance)
{
    EXPECT_TRUE(ZarnMath::IsEqual(actual, expected, tolerance))
        << actual.m11 << ' ' << actual.m12 << ' ' << actual.dx << "; " << actual.m21 << ' ' << actual.m22 << ' '
        << actual.dy;
}

/// Both ways of combining, which differ by the short constant of the plain-C functions.
void ExpectBoth(const std::string& text, const MATRIX& expected)
{
    SCOPED_TRACE(text);
    ExpectMatrix(Combined(text), expected, 1e-11);
    ExpectMatrix(CombinedInWholeUnits(text), expected, 1e-11);
}

std::string MessageOf(const std::string& text)
{
    try {
        (void)ReadTransformSteps("--by", text);
    } catch (const Failure& failure) {
        return failure.what();
    }
    return "";
}

constexpr const char* circle = "<circle cx='300' cy='200' r='150'/>";

/// Runs `transform` on a circle of radius 50000 about (50000, 50000).
Numbers Ask(const std::string& steps, std::vector<std::string> more = {})
{
    const TemporaryFolder folder;
    std::vector<std::string> arguments = {"transform", folder.WriteSvg(circle), "--by", steps, "--json=-"};
    arguments.insert(arguments.end(), more.begin(), more.end());
    const Outcome outcome = RunCurvelab(arguments, folder.Path());
    EXPECT_EQ(outcome.status, 0) << outcome.err;
    return Numbers(outcome.out);
}

} // namespace

TEST(TransformSteps, EachKind)
{
    const double half = 0.5;
    const double root = std::sqrt(3.0) / 2.0;
    ExpectBoth("move:5,-7", {1, 0, 5, 0, 1, -7});
    ExpectBoth("rotate:90@1,2", {0, -1, 3, 1, 0, 1});
    ExpectBoth("rotate:30@0,0", {root, -half, 0, half, root, 0});
    ExpectBoth("scale:2,3@10,20", {2, 0, -10, 0, 3, -40});
    ExpectBoth("scale:2@0,0", {2, 0, 0, 0, 2, 0});
    ExpectBoth("skew:45,0@0,0", {1, -1, 0, 0, 1, 0});
    ExpectBoth("skew:0,45@0,0", {1, 0, 0, 1, 1, 0});
    ExpectBoth("mirror:0@0,10", {1, 0, 0, 0, -1, 20});
    ExpectBoth("mirror:45@0,0", {0, 1, 0, 1, 0, 0});
    ExpectBoth("mirror:30@0,0", {half, root, 0, root, -half, 0});
    ExpectBoth("matrix:1,2,3,4,5,6", {1, 2, 3, 4, 5, 6});
}

TEST(TransformSteps, WithoutACentreTheMiddleStays)
{
    for (const char* text : {"rotate:33", "scale:2,-3", "skew:10,20", "mirror:77"}) {
        const point2d image = Combined(text)(middle);
        EXPECT_NEAR(image.x, middle.x, 1e-12) << text;
        EXPECT_NEAR(image.y, middle.y, 1e-12) << text;
    }
}

TEST(TransformSteps, ActOneAfterTheOther)
{
    ExpectBoth("move:10,0 scale:2@0,0", {2, 0, 20, 0, 2, 0});
    ExpectBoth("scale:2@0,0 move:10,0", {2, 0, 10, 0, 2, 0});
    ExpectBoth(" rotate:90@0,0\t rotate:-90@0,0 ", {1, 0, 0, 0, 1, 0});
    ExpectBoth("matrix:2,0,0,0,2,0 matrix:1,0,5,0,1,0", {2, 0, 5, 0, 2, 0});
}

TEST(TransformSteps, WholeUnitsRoundCentresAndMoves)
{
    ExpectMatrix(CombinedInWholeUnits("move:1.4,1.6"), {1, 0, 1, 0, 1, 2}, 0.0);
    ExpectMatrix(CombinedInWholeUnits("scale:2@0.6,-0.6"), {2, 0, -1, 0, 2, 1}, 0.0);
}

TEST(TransformSteps, MistakesAreNamed)
{
    struct Mistake
    {
        const char* text;
        std::vector<std::string> named;
    };

    const Mistake mistakes[] = {{"", {"no step"}},
                                {"spin:3", {"spin:3", "rotate"}},
                                {"rotate", {"rotate", "colon"}},
                                {"rotate:", {"rotate:", "number"}},
                                {"rotate:1,2", {"rotate:1,2", "2 values", "takes 1"}},
                                {"scale:1,2,3", {"3 values", "takes 2"}},
                                {"move:1", {"1 values", "takes 2"}},
                                {"move:1,2@3,4", {"move:1,2@3,4", "centre"}},
                                {"rotate:x", {"rotate:x", "\"x\""}},
                                {"rotate:3@1", {"rotate:3@1", "\"1\"", "X,Y"}},
                                {"rotate:3@1,z", {"\"z\""}},
                                {"rotate:3@1e10,0", {"rotate:3@1e10,0", "farther"}},
                                {"rotate:2001", {"\"2001\"", "2000"}},
                                {"skew:90,0", {"\"90\"", "89"}},
                                {"scale:nan", {"\"nan\"", "finite"}},
                                {"rotate:30 bend:1", {"bend:1"}}};
    for (const Mistake& mistake : mistakes) {
        const std::string message = MessageOf(mistake.text);
        EXPECT_EQ(message.rfind("--by", 0), 0u) << mistake.text;
        for (const std::string& part : mistake.named)
            EXPECT_NE(message.find(part), std::string::npos) << part << " is not in: " << message;
    }
}

TEST(Transform, TellsTheParts)
{
    const Numbers answer = Ask("scale:2,3 rotate:30");
    EXPECT_NEAR(answer.Number("/answer/rotation"), 30.0, 1e-12);
    EXPECT_NEAR(answer.Number("/answer/scaleX"), 2.0, 1e-12);
    EXPECT_NEAR(answer.Number("/answer/scaleY"), 3.0, 1e-12);
    EXPECT_NEAR(answer.Number("/answer/skew"), 0.0, 1e-12);
    EXPECT_NEAR(answer.Number("/answer/determinant"), 6.0, 1e-12);
    EXPECT_NEAR(answer.Number("/answer/major"), 3.0, 1e-12);
    EXPECT_NEAR(answer.Number("/answer/minor"), 2.0, 1e-12);
    EXPECT_NEAR(answer.Number("/answer/largestStretch"), 3.0, 1e-12);
    EXPECT_LT(answer.Number("/answer/recomposed"), 1e-14);
    EXPECT_LT(answer.Number("/answer/backError"), 1e-9);
    EXPECT_TRUE(answer.Truth("/answer/isOrthogonal"));
    EXPECT_TRUE(answer.Truth("/answer/isScaled"));
    EXPECT_FALSE(answer.Truth("/answer/isUniformOrthogonal"));
    EXPECT_FALSE(answer.Truth("/answer/isMirrored"));
    EXPECT_FALSE(answer.Has("/answer/largestRounding"));
}

TEST(Transform, FindsTheFixedPoint)
{
    const Numbers answer = Ask("rotate:90@10000,20000 scale:3@10000,20000");
    EXPECT_NEAR(answer.Number("/answer/fixedPoint/0"), 10000.0, 1e-9);
    EXPECT_NEAR(answer.Number("/answer/fixedPoint/1"), 20000.0, 1e-9);
    EXPECT_FALSE(answer.Truth("/answer/hasFixedLine"));
}

TEST(Transform, FindsTheFixedLine)
{
    const Numbers answer = Ask("mirror:0@0,30000");
    EXPECT_TRUE(answer.Truth("/answer/hasFixedLine"));
    ASSERT_EQ(answer.Size("/answer/fixedLine"), 2u);
    EXPECT_NEAR(answer.Number("/answer/fixedLine/0/1"), 30000.0, 1e-9);
    EXPECT_NEAR(answer.Number("/answer/fixedLine/1/1"), 30000.0, 1e-9);
    EXPECT_TRUE(answer.Truth("/answer/isMirrored"));
    EXPECT_TRUE(answer.Truth("/answer/isOrthonormalAxisAligned"));
}

TEST(Transform, MeasuresTheImage)
{
    // The circle becomes an ellipse with half axes 100000 and 50000, turned by 45 degrees.
    const Numbers answer = Ask("scale:2,1 rotate:45");
    const double side = 2.0 * std::sqrt((100000.0 * 100000.0 + 50000.0 * 50000.0) / 2.0);
    EXPECT_NEAR(answer.Number("/answer/width"), side, 3e-4 * side);
    EXPECT_NEAR(answer.Number("/answer/height"), side, 3e-4 * side);
    EXPECT_EQ(answer.Size("/answer/matrix"), 6u);
    EXPECT_NEAR(answer.Number("/answer/matrix/0"), std::numbers::sqrt2, 1e-12);
}

TEST(Transform, SingularHasNoPartsAndNoWayBack)
{
    const TemporaryFolder folder;
    const Outcome outcome =
        RunCurvelab({"transform", folder.WriteSvg(circle), "--by", "scale:1,0", "-o", "flat.svg"}, folder.Path());
    EXPECT_EQ(outcome.status, 0) << outcome.err;
    EXPECT_NE(outcome.out.find("scale along y          \u2013"), std::string::npos) << outcome.out;
    EXPECT_NE(outcome.out.find("back by the inverse    \u2013"), std::string::npos) << outcome.out;
    EXPECT_EQ(ContentOf(folder.Path() / "flat.svg").find("nan "), std::string::npos);
    const Numbers answer = Ask("scale:1,0");
    EXPECT_EQ(answer.Number("/answer/height"), 0.0);
    EXPECT_EQ(answer.Number("/answer/determinant"), 0.0);
}

TEST(Transform, WholeUnitsAreRoundedOnce)
{
    const Numbers answer = Ask("rotate:30 skew:5,10", {"--integer", "--units=1000"});
    EXPECT_GT(answer.Number("/answer/largestRounding"), 0.0);
    EXPECT_LE(answer.Number("/answer/largestRounding"), std::sqrt(0.5) + 1e-12);
    const double width = answer.Number("/answer/width");
    EXPECT_NEAR(width, 1000.0, 300.0);
}

TEST(Transform, ToleranceDecidesTheKind)
{
    EXPECT_FALSE(Ask("scale:1.001").Truth("/answer/isOrthonormal"));
    EXPECT_TRUE(Ask("scale:1.001", {"--tolerance=0.01"}).Truth("/answer/isOrthonormal"));
}

TEST(Transform, DrawsTheAnswer)
{
    const TemporaryFolder folder;
    const Outcome outcome = RunCurvelab(
        {"transform", folder.WriteSvg(circle), "--by", "rotate:30@50000,0", "-o", "picture.svg"}, folder.Path());
    EXPECT_EQ(outcome.status, 0) << outcome.err;
    const std::string picture = ContentOf(folder.Path() / "picture.svg");
    for (const char* text : {"the image", "circles", "their images and axes", "fixed point"})
        EXPECT_NE(picture.find(text), std::string::npos) << text;
    EXPECT_EQ(picture.find("fixed line"), std::string::npos);
}

TEST(Transform, RefusesWhatNoPictureHolds)
{
    const TemporaryFolder folder;
    const std::string drawing = folder.WriteSvg(circle);
    const std::vector<std::string> before = folder.Names();
    for (const std::vector<std::string>& arguments :
         {std::vector<std::string>{"transform", drawing, "--by", "scale:1000000 scale:1000000"},
          {"transform", drawing, "--by", "move:999999999,0 move:999999999,0 move:999999999,0", "--integer"},
          {"transform", drawing, "--by", "spin:3"},
          {"transform", drawing, "--by", "scale:2", "--tolerance", "-1"},
          {"transform", drawing}}) {
        const Outcome outcome = RunCurvelab(arguments, folder.Path());
        EXPECT_EQ(outcome.status, 2);
        EXPECT_EQ(outcome.out, "");
        EXPECT_EQ(std::count(outcome.err.begin(), outcome.err.end(), '\n'), 1) << outcome.err;
        EXPECT_NE(outcome.err.find(arguments.back() == "-1" ? "--tolerance" : "--by"), std::string::npos)
            << outcome.err;
    }
    EXPECT_EQ(folder.Names(), before);
}
