#include "TextReader.h"
#include "Failure.h"
#include "Program.h"

#include <gtest/gtest.h>

using namespace curvelab;

namespace {

const std::string cubicFont = CURVELAB_CUBIC_FONT;
const std::string quadraticFont = CURVELAB_QUADRATIC_FONT;

std::string MessageFor(const std::string& text, const std::string& font)
{
    try {
        static_cast<void>(ReadText(text, font));
    } catch (const Failure& failure) {
        return failure.what();
    }
    return "";
}

Bounds BoundsOf(const Drawing& drawing)
{
    Bounds bounds = NoBounds();
    for (const Contour& contour : drawing.contours)
        for (const Cubic& curve : contour.curves)
            Include(bounds, curve);
    return bounds;
}

/// One font of each kind of outline.
class Text : public testing::TestWithParam<std::string>
{
protected:
    void SetUp() override
    {
        if (GetParam().empty())
            GTEST_SKIP() << "the font is not installed";
    }
};

} // namespace

TEST_P(Text, ContoursAreClosedChains)
{
    const Drawing drawing = ReadText("Ampersand & \u00e9\u00df", GetParam());
    EXPECT_GT(drawing.shapes.size(), 10u);
    for (const Contour& contour : drawing.contours) {
        EXPECT_TRUE(contour.closed);
        EXPECT_EQ(contour.curves.front()[0], contour.curves.back()[3]);
        for (std::size_t i = 1; i < contour.curves.size(); ++i)
            EXPECT_EQ(contour.curves[i - 1][3], contour.curves[i][0]);
    }
}

TEST_P(Text, LettersHaveTheirCounters)
{
    EXPECT_EQ(ReadText("l", GetParam()).contours.size(), 1u);
    EXPECT_EQ(ReadText("o", GetParam()).contours.size(), 2u);
    EXPECT_EQ(ReadText("B", GetParam()).contours.size(), 3u);
    EXPECT_EQ(ReadText("B", GetParam()).shapes.size(), 1u);
}

TEST_P(Text, RunsToTheRightAndStandsUpright)
{
    const Bounds o = BoundsOf(ReadText("o", GetParam()));
    const Bounds l = BoundsOf(ReadText("l", GetParam()));
    const Bounds both = BoundsOf(ReadText("oo", GetParam()));
    EXPECT_GT(l.top, o.top);
    EXPECT_GT(both.right, 1.8 * o.right);
    EXPECT_EQ(both.left, o.left);
    // Blanks advance and draw nothing.
    EXPECT_GT(BoundsOf(ReadText("o o", GetParam())).right, both.right);
    EXPECT_TRUE(ReadText("  ", GetParam()).contours.empty());
    EXPECT_TRUE(ReadText("", GetParam()).contours.empty());
}

TEST_P(Text, NamesACharacterThatTheFontLacks)
{
    EXPECT_EQ(MessageFor("a\U0010FFFD", GetParam()), "--text: " + GetParam() + " has no character U+10FFFD");
    EXPECT_EQ(MessageFor("ab\xff", GetParam()), "--text: byte 3 is not UTF-8");
    EXPECT_EQ(MessageFor("a\xc3", GetParam()), "--text: byte 2 is not UTF-8");
}

INSTANTIATE_TEST_SUITE_P(Cubic, Text, testing::Values(cubicFont));
INSTANTIATE_TEST_SUITE_P(Quadratic, Text, testing::Values(quadraticFont));

TEST(Fonts, OutlinesOfEachKindAreRecognised)
{
    if (cubicFont.empty() || quadraticFont.empty())
        GTEST_SKIP() << "a font is not installed";
    // A raised quadratic has no cubic term: P3 - 3*P2 + 3*P1 - P0 = 0.
    const auto hasCubicTerm = [](const std::string& font) {
        for (const Contour& contour : ReadText("o", font).contours)
            for (const Cubic& curve : contour.curves)
                if (const point2d a = ToPowerForm(curve).a; std::abs(a.x) + std::abs(a.y) > 1e-6)
                    return true;
        return false;
    };
    EXPECT_TRUE(hasCubicTerm(cubicFont));
    EXPECT_FALSE(hasCubicTerm(quadraticFont));
}

TEST(Fonts, WhatIsNoFontIsNamed)
{
    const TemporaryFolder folder;
    const std::string missing = (folder.Path() / "missing.otf").string();
    EXPECT_EQ(MessageFor("a", missing), "--font: " + missing + ": cannot be read");
    const std::string other = folder.Write("text.otf", "no font at all");
    EXPECT_EQ(MessageFor("a", other), "--font: " + other + ": is not a font");
}
