#include "Drawing.h"
#include "Failure.h"

#include <gtest/gtest.h>
#include <limits>

using namespace curvelab;

namespace {

Drawing Of(Pen& pen)
{
    Drawing drawing;
    drawing.name = "test";
    AddShape(drawing, {}, pen.Finish());
    return drawing;
}

} // namespace

TEST(Pen, ClosesWithALineWhereOneIsMissing)
{
    Pen pen;
    pen.MoveTo({0.0, 0.0});
    pen.LineTo({10.0, 0.0});
    pen.LineTo({10.0, 10.0});
    pen.Close();
    const std::vector<Contour> contours = pen.Finish();
    ASSERT_EQ(contours.size(), 1u);
    EXPECT_TRUE(contours[0].closed);
    ASSERT_EQ(contours[0].curves.size(), 3u);
    EXPECT_EQ(contours[0].curves[2][3], (point2d{0.0, 0.0}));
}

TEST(Pen, AddsNoClosingLineToAContourThatReturned)
{
    Pen pen;
    pen.MoveTo({0.1, 0.2});
    pen.CubicTo({10.0, 0.0}, {10.0, 10.0}, {0.1, 0.2});
    pen.Close();
    // Short of the start by no more than rounding: the end moves there.
    pen.MoveTo({100.0, 100.0});
    pen.CubicTo({10.0, 0.0}, {10.0, 10.0}, {100.0, 100.0 + 1e-12});
    pen.Close();
    const std::vector<Contour> contours = pen.Finish();
    ASSERT_EQ(contours.size(), 2u);
    EXPECT_EQ(contours[0].curves.size(), 1u);
    EXPECT_EQ(contours[1].curves.size(), 1u);
    EXPECT_EQ(contours[1].curves[0][3], (point2d{100.0, 100.0}));
}

TEST(Pen, AfterClosingGoesOnAtTheStart)
{
    Pen pen;
    pen.MoveTo({5.0, 5.0});
    pen.LineTo({10.0, 5.0});
    pen.Close();
    pen.LineTo({5.0, 20.0});
    const std::vector<Contour> contours = pen.Finish();
    ASSERT_EQ(contours.size(), 2u);
    EXPECT_FALSE(contours[1].closed);
    EXPECT_EQ(contours[1].curves[0][0], (point2d{5.0, 5.0}));
}

TEST(Pen, LeavesOutWhatHasNoLength)
{
    Pen pen;
    pen.MoveTo({5.0, 5.0});
    pen.LineTo({5.0, 5.0});
    pen.Close();
    pen.MoveTo({7.0, 7.0});
    EXPECT_TRUE(pen.Finish().empty());
}

TEST(Fit, PutsTheLargerSideToTheUnits)
{
    Pen pen;
    pen.MoveTo({-30.0, 7.0});
    pen.LineTo({60.0, 7.0});
    pen.LineTo({60.0, 37.0});
    Drawing drawing = Of(pen);
    Fit(drawing, 900.0);
    EXPECT_EQ(drawing.bounds, (Bounds{0.0, 300.0, 900.0, 0.0}));
    EXPECT_EQ(drawing.contours[0].curves[0][0], (point2d{0.0, 0.0}));
    EXPECT_EQ(drawing.contours[0].curves[1][3], (point2d{900.0, 300.0}));
}

TEST(Fit, GoesByTheCurvesAndNotByTheirControlPoints)
{
    Pen pen;
    pen.MoveTo({0.0, 0.0});
    pen.CubicTo({0.0, 400.0}, {100.0, 400.0}, {100.0, 0.0});
    Drawing drawing = Of(pen);
    Fit(drawing, 300.0);
    EXPECT_EQ(drawing.bounds.top, 300.0);
    EXPECT_DOUBLE_EQ(drawing.bounds.right, 100.0);
    EXPECT_DOUBLE_EQ(drawing.contours[0].curves[0][1].y, 400.0);
}

TEST(Fit, RefusesWhatHasNoExtent)
{
    Drawing empty;
    EXPECT_THROW(Fit(empty, 100.0), Failure);

    Pen pen;
    pen.MoveTo({3.0, 3.0});
    pen.CubicTo({3.0, 3.0}, {3.0, 3.0}, {3.0, 3.0});
    Drawing point = Of(pen);
    EXPECT_THROW(Fit(point, 100.0), Failure);

    pen.MoveTo({0.0, 0.0});
    pen.LineTo({std::numeric_limits<double>::infinity(), 0.0});
    Drawing infinite = Of(pen);
    EXPECT_THROW(Fit(infinite, 100.0), Failure);
}

TEST(Fit, ControlPointsStayWithinTheRangeOfIntegers)
{
    // The worst cubic for its own range: its coefficients are those of the Chebyshev polynomial, 5 times the range off.
    Pen pen;
    pen.MoveTo({1.0, 0.0});
    pen.CubicTo({-5.0, 0.0}, {5.0, 0.0}, {-1.0, 0.0});
    Drawing drawing = Of(pen);
    constexpr double largest = 268435456.0;
    Fit(drawing, largest);
    const Cubic& curve = drawing.contours[0].curves[0];
    EXPECT_NEAR(curve[1].x, -2.0 * largest, 1.0);
    EXPECT_NEAR(curve[2].x, 3.0 * largest, 1.0);
    EXPECT_LT(curve[2].x - curve[1].x, 2147483647.0);
}

TEST(Shapes, KeepTheirContoursTogether)
{
    Pen pen;
    Drawing drawing;
    for (int i = 0; i < 3; ++i) {
        if (i != 1) {
            pen.MoveTo({0.0, 0.0});
            pen.LineTo({1.0, 1.0});
            pen.MoveTo({2.0, 0.0});
            pen.LineTo({3.0, 1.0});
        }
        AddShape(drawing, {}, pen.Finish());
    }
    EXPECT_EQ(drawing.shapes.size(), 2u);
    ASSERT_EQ(drawing.contours.size(), 4u);
    EXPECT_EQ(drawing.contours[1].shape, 0u);
    EXPECT_EQ(drawing.contours[2].shape, 1u);
    EXPECT_EQ(CountCurves(drawing), 4u);
}
