// The program on good input: its numbers against those that geometry gives.

#include "Program.h"

#include <cmath>
#include <gtest/gtest.h>
#include <numbers>

namespace {

constexpr const char* circle = "<circle cx='300' cy='200' r='150'/>";
/// The classic cubic for a quarter circle lies outside it by up to 2.73e-4 of the radius.
constexpr double circleError = 2.73e-4 * 50000.0;
constexpr double centre = 50000.0;

} // namespace

TEST(Program, DescribesTheDrawing)
{
    const Numbers json = AskCurvelab("<rect x='5' y='5' width='30' height='15'/><circle cx='20' cy='10' r='2'/>",
                                     {"split", "--units=600"});
    EXPECT_EQ(json.Text("/command"), "split");
    EXPECT_EQ(json.Number("/drawing/units"), 600.0);
    EXPECT_EQ(json.Number("/drawing/width"), 600.0);
    EXPECT_EQ(json.Number("/drawing/height"), 300.0);
    EXPECT_FALSE(json.Truth("/drawing/integer"));
    EXPECT_EQ(json.Number("/drawing/shapes"), 2);
    EXPECT_EQ(json.Number("/drawing/contours"), 2);
    EXPECT_EQ(json.Number("/drawing/curves"), 8);
}

TEST(Flatten, ALineHasNoDeviation)
{
    const Numbers answer = AskCurvelab("<path d='M10,10 L310,410'/>", {"flatten", "--tolerance=1"});
    EXPECT_EQ(answer.Number("/answer/curves"), 1);
    EXPECT_LT(answer.Number("/answer/largestDeviation"), 1e-9);
    EXPECT_GE(answer.Number("/answer/segments"), 2);
}

TEST(Flatten, TheDeviationOfACircleIsItsSagitta)
{
    for (const double tolerance : {2000.0, 200.0, 20.0, 2.0}) {
        const Numbers answer = AskCurvelab(circle, {"flatten", "--tolerance", Number(tolerance), "--max-lines=2047"});
        ASSERT_EQ(answer.Number("/answer/curves"), 4);
        const double deviation = answer.Number("/answer/largestDeviation");
        EXPECT_GT(deviation, 0.0);
        EXPECT_LE(deviation, tolerance);
        // By symmetry each quarter is cut alike, into equal parameter steps, which are nearly equal angles: at its ends
        // it runs by 5.5 percent faster than on average (3*0.5523 to pi/2), so the largest sagitta is up to 11.3 percent
        // larger than that of equal angles.
        EXPECT_EQ(answer.Number("/answer/fewestSegments"), answer.Number("/answer/mostSegments"));
        const double angle = std::numbers::pi / 2.0 / answer.Number("/answer/mostSegments");
        const double sagitta = 50000.0 * (1.0 - std::cos(angle / 2.0));
        EXPECT_NEAR(deviation, sagitta, 0.12 * sagitta);
        ExpectPoint(answer, "/answer/largestDeviationAt", centre, centre, 50000.0 + circleError);
    }
}

TEST(Flatten, TheBudgetEndsTheSubdivision)
{
    // Two lines for each quarter: chords of 45 degrees, whatever the tolerance.
    const Numbers answer = AskCurvelab(circle, {"flatten", "--tolerance=0", "--max-lines=2"});
    EXPECT_EQ(answer.Number("/answer/segments"), 8);
    EXPECT_NEAR(answer.Number("/answer/largestDeviation"), 50000.0 * (1.0 - std::cos(std::numbers::pi / 8.0)),
                circleError);
    // One line: chords of a quarter turn.
    const Numbers chords = AskCurvelab(circle, {"flatten", "--tolerance=5", "--max-lines=1"});
    EXPECT_EQ(chords.Number("/answer/segments"), 4);
    EXPECT_NEAR(chords.Number("/answer/largestDeviation"), 50000.0 * (1.0 - std::sqrt(0.5)), circleError);
}

TEST(Flatten, IntegersRoundEachVertexOnce)
{
    const Numbers exact = AskCurvelab(circle, {"flatten", "--tolerance=3", "--units=1000"});
    const Numbers whole = AskCurvelab(circle, {"flatten", "--tolerance=3", "--units=1000", "--integer"});
    EXPECT_EQ(whole.Number("/answer/curves"), 4);
    EXPECT_NE(whole.Number("/answer/largestDeviation"), exact.Number("/answer/largestDeviation"));
    EXPECT_LE(whole.Number("/answer/largestDeviation"), 3.0 + std::sqrt(0.5));
}

TEST(Split, CutsALineWhereItSays)
{
    const Numbers answer = AskCurvelab("<path d='M0,0 H400'/>", {"split", "--at=0.25"});
    EXPECT_EQ(answer.Number("/answer/pieces"), 2);
    EXPECT_EQ(answer.Number("/answer/largestGap"), 0.0);
    ExpectPoint(answer, "/answer/cuts/0", 25000.0, 0.0, 1e-9);
    EXPECT_FALSE(answer.Has("/answer/largestRounding"));
}

TEST(Split, CutsAQuarterInItsMiddle)
{
    const Numbers answer = AskCurvelab(circle, {"split", "--at=0.5"});
    ASSERT_EQ(answer.Size("/answer/cuts"), 4u);
    EXPECT_EQ(answer.Number("/answer/largestGap"), 0.0);
    // The construction's factor is chosen so that the middle lies on the circle, at 45 degrees.
    const double diagonal = 50000.0 * std::sqrt(0.5);
    for (int i = 0; i < 4; ++i) {
        const std::string cut = "/answer/cuts/" + std::to_string(i);
        EXPECT_NEAR(std::abs(answer.Number(cut + "/0") - centre), diagonal, 1e-6);
        EXPECT_NEAR(std::abs(answer.Number(cut + "/1") - centre), diagonal, 1e-6);
    }
}

TEST(Split, IntegersAreRoundedOnce)
{
    const Numbers answer = AskCurvelab(circle, {"split", "--at=0.3", "--integer", "--units=1000"});
    EXPECT_EQ(answer.Number("/answer/largestGap"), 0.0);
    EXPECT_GT(answer.Number("/answer/largestRounding"), 0.0);
    EXPECT_LE(answer.Number("/answer/largestRounding"), std::sqrt(0.5) + 1e-12);
    const double x = answer.Number("/answer/cuts/0/0");
    EXPECT_EQ(x, std::round(x));
}

TEST(Closest, OnACircleItIsTheRadialPoint)
{
    for (const double degrees : {20.0, 77.0, 123.0, 200.0, 311.0}) {
        const double c = std::cos(degrees * std::numbers::pi / 180.0), s = std::sin(degrees * std::numbers::pi / 180.0);
        for (const double radius : {80000.0, 20000.0}) {
            const std::string to = Number(centre + radius * c) + "," + Number(centre + radius * s);
            const Numbers answer = AskCurvelab(circle, {"closest", "--to", to});
            EXPECT_NEAR(answer.Number("/answer/distance"), std::abs(radius - 50000.0), circleError);
            // The foot's direction differs as the curve's slope does from the circle's: its radial error comes and goes
            // within 1/6 of the quarter, so the slope is below 1e-2.
            ExpectPoint(answer, "/answer/point", centre + 50000.0 * c, centre + 50000.0 * s,
                        0.01 * std::abs(radius - 50000.0));
            EXPECT_EQ(answer.Truth("/answer/isFoot"), true);
            // Circles run clockwise on the page, and so in the plane: what is outside lies to the left.
            EXPECT_EQ(answer.Text("/answer/side"), radius > 50000.0 ? "left" : "right");
        }
    }
}

TEST(Closest, OnALineItIsTheFootOfThePerpendicular)
{
    const std::string line = "<path d='M0,0 H400'/>";
    const Numbers above = AskCurvelab(line, {"closest", "--to=30000,4000"});
    ExpectPoint(above, "/answer/point", 30000.0, 0.0, 1e-6);
    EXPECT_NEAR(above.Number("/answer/distance"), 4000.0, 1e-9);
    EXPECT_NEAR(above.Number("/answer/t"), 0.3, 1e-9);
    EXPECT_EQ(above.Text("/answer/side"), "left");
    EXPECT_EQ(above.Truth("/answer/isFoot"), true);
    EXPECT_EQ(above.Number("/answer/curvesWithFoot"), 1);
    const Numbers below = AskCurvelab(line, {"closest", "--to", "30000,-4000"});
    EXPECT_EQ(below.Text("/answer/side"), "right");
}

TEST(Closest, BeyondALineItIsItsEnd)
{
    const std::string line = "<path d='M0,0 H400'/>";
    const Numbers after = AskCurvelab(line, {"closest", "--to=103000,4000"});
    ExpectPoint(after, "/answer/point", 100000.0, 0.0, 0.0);
    EXPECT_EQ(after.Number("/answer/distance"), 5000.0);
    EXPECT_EQ(after.Number("/answer/t"), 1.0);
    EXPECT_EQ(after.Text("/answer/side"), "none");
    EXPECT_EQ(after.Truth("/answer/isFoot"), false);
    EXPECT_EQ(after.Number("/answer/curvesWithFoot"), 0);
    const Numbers before = AskCurvelab(line, {"closest", "--to", "-3000,-4000", "--integer"});
    EXPECT_EQ(before.Number("/answer/distance"), 5000.0);
    EXPECT_EQ(before.Number("/answer/t"), 0.0);
}

TEST(Closest, AFootInTheMiddleOfASymmetricArchIsNotLost)
{
    // The arch 0,0 100,300 200,300 300,0 turned downward in the file; its apex (150, 225) is the foot of every point of its
    // axis that lies above it, at t = 1/2.
    const std::string arch = "<path d='M0,0 C100,-300 200,-300 300,0'/>";
    for (const char* integer : {"--units=300", "--integer"}) {
        const bool isWhole = std::string(integer) == "--integer";
        const double unit = isWhole ? 1000.0 / 3.0 : 1.0;
        const Numbers answer =
            AskCurvelab(arch, {"closest", "--to", Number(150.0 * unit) + "," + Number(300.0 * unit), integer});
        ExpectPoint(answer, "/answer/point", 150.0 * unit, 225.0 * unit, 1.0);
        EXPECT_NEAR(answer.Number("/answer/distance"), 75.0 * unit, 1.0);
        EXPECT_NEAR(answer.Number("/answer/t"), 0.5, 1e-6);
        EXPECT_EQ(answer.Text("/answer/side"), "left");
        EXPECT_TRUE(answer.Truth("/answer/isFoot"));
    }
}

TEST(Closest, NothingIsNearerThanTheNearest)
{
    // In the directions of the joints of a circle's quarters, of their middles and of the quarters between.
    for (int eighth = 0; eighth < 16; ++eighth) {
        const double angle = eighth * std::numbers::pi / 8.0;
        const std::string to =
            Number(centre + 90000.0 * std::cos(angle)) + "," + Number(centre + 90000.0 * std::sin(angle));
        EXPECT_NEAR(AskCurvelab(circle, {"closest", "--to", to}).Number("/answer/distance"), 40000.0, circleError)
            << angle;
    }
}

TEST(Closest, TakesTheNearestOfAllCurves)
{
    // Three lines at heights 0, 30000 and 60000 of a drawing 100000 wide.
    const std::string lines = "<path d='M0,60 H100 M0,30 H100 M0,0 H100'/>";
    for (const auto& [height, curve] :
         std::vector<std::pair<double, int>>{{1000, 0}, {16000, 1}, {44000, 1}, {46000, 2}}) {
        const Numbers answer = AskCurvelab(lines, {"closest", "--to", "70000," + Number(height)});
        EXPECT_EQ(answer.Number("/answer/curve"), curve);
        EXPECT_NEAR(answer.Number("/answer/distance"), std::abs(height - 30000.0 * curve), 1e-6);
        EXPECT_EQ(answer.Number("/answer/curvesWithFoot"), 3);
    }
}

TEST(Program, WritesPictureNumbersAndSummary)
{
    const TemporaryFolder folder;
    const std::string file = folder.WriteSvg(circle);
    const Outcome both =
        RunCurvelab({"flatten", file, "--tolerance", "50", "-o", "p.svg", "--json", "n.json"}, folder.Path());
    EXPECT_EQ(both.status, 0);
    EXPECT_EQ(both.out, "");
    EXPECT_EQ(folder.Names(), (std::vector<std::string>{"drawing.svg", "n.json", "p.svg"}));
    EXPECT_EQ(ContentOf(folder.Path() / "p.svg").rfind("<svg ", 0), 0u);
    EXPECT_EQ(Numbers(ContentOf(folder.Path() / "n.json")).Text("/command"), "flatten");

    const Outcome summary = RunCurvelab({"flatten", file, "--tolerance", "50"}, folder.Path());
    EXPECT_EQ(summary.status, 0);
    EXPECT_NE(summary.out.find("largest true deviation"), std::string::npos);
    EXPECT_EQ(folder.Names().size(), 3u);
}

TEST(Program, SetsText)
{
    for (const std::string font : {CURVELAB_CUBIC_FONT, CURVELAB_QUADRATIC_FONT}) {
        if (font.empty())
            GTEST_SKIP() << "a font is not installed";
        const TemporaryFolder folder;
        const Outcome outcome = RunCurvelab(
            {"split", "--text", "Ampersand &", "--font", font, "--json", "-o", "picture.svg"}, folder.Path());
        ASSERT_EQ(outcome.status, 0) << outcome.err;
        const Numbers json(outcome.out);
        EXPECT_EQ(json.Number("/drawing/width"), 100000.0);
        EXPECT_EQ(json.Number("/drawing/shapes"), 10);
        EXPECT_EQ(json.Number("/answer/largestGap"), 0.0);
    }
}

TEST(Program, ExplainsItself)
{
    const TemporaryFolder folder;
    const Outcome all = RunCurvelab({"--help"}, folder.Path());
    EXPECT_EQ(all.status, 0);
    for (const char* command :
         {"flatten", "split", "closest", "curvature", "length", "bounds", "intersect", "tangents", "area", "cusps"}) {
        EXPECT_NE(all.out.find(command), std::string::npos);
        const Outcome one = RunCurvelab({command, "--help"}, folder.Path());
        EXPECT_EQ(one.status, 0);
        EXPECT_NE(one.out.find("--units"), std::string::npos);
        EXPECT_NE(one.out.find("y grows upward"), std::string::npos);
    }
    EXPECT_NE(RunCurvelab({"flatten", "--help"}, folder.Path()).out.find("SQUARED"), std::string::npos);
}
