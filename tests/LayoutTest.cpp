#include "ZarnMath/Layout.h"

#include "tests/Bits.h"

#include <random>
#include <type_traits>

namespace ZarnMath {
namespace {

using Box = BoundsT<double>;

constexpr Box frame{0.0, 100.0, 200.0, 0.0};

constexpr int bottom = 0;
constexpr int top = 1;
constexpr int left = 0;
constexpr int right = 1;
constexpr int centre = 2;

constexpr LayoutMeasure Absolute(double value)
{
    return {LayoutUnit::Absolute, value};
}

constexpr LayoutMeasure Relative(double value)
{
    return {LayoutUnit::Relative, value};
}

/// Nothing is given, which aligns left and bottom.
Layout Nothing()
{
    return {};
}

Layout Horizontal(LayoutMeasure width, int align)
{
    Layout layout{};
    layout.width = width;
    layout.horizontalAlign = align;
    return layout;
}

Layout Vertical(LayoutMeasure height, int align)
{
    Layout layout{};
    layout.height = height;
    layout.verticalAlign = align;
    return layout;
}

void ExpectHorizontal(const Box& box, double expectedLeft, double expectedRight)
{
    EXPECT_EQ(box.left, expectedLeft);
    EXPECT_EQ(box.right, expectedRight);
}

void ExpectVertical(const Box& box, double expectedTop, double expectedBottom)
{
    EXPECT_EQ(box.top, expectedTop);
    EXPECT_EQ(box.bottom, expectedBottom);
}

TEST(Layout, FieldsStandInOrder)
{
    struct KindAndValue
    {
        std::int32_t kind;
        double value;
    };

    constexpr std::size_t measure = sizeof(KindAndValue); // 16, or 12 where a double may stand at any multiple of 4
    EXPECT_EQ(sizeof(LayoutMeasure), measure);
    EXPECT_LT(offsetof(LayoutMeasure, kind), offsetof(LayoutMeasure, value));
    EXPECT_EQ(offsetof(Layout, width), 0U);
    EXPECT_EQ(offsetof(Layout, height), measure);
    EXPECT_EQ(offsetof(Layout, minWidth), 2 * measure);
    EXPECT_EQ(offsetof(Layout, minHeight), 3 * measure);
    EXPECT_EQ(offsetof(Layout, leftMargin), 4 * measure);
    EXPECT_EQ(offsetof(Layout, rightMargin), 5 * measure);
    EXPECT_EQ(offsetof(Layout, topMargin), 6 * measure);
    EXPECT_EQ(offsetof(Layout, bottomMargin), 7 * measure);
    EXPECT_EQ(offsetof(Layout, verticalAlign), 8 * measure);
    EXPECT_EQ(offsetof(Layout, horizontalAlign), 8 * measure + 4U);
    EXPECT_EQ(static_cast<int>(LayoutUnit::None), 0);
    EXPECT_EQ(static_cast<int>(LayoutUnit::Absolute), 1);
    EXPECT_EQ(static_cast<int>(LayoutUnit::Relative), 2);
    EXPECT_TRUE((std::is_same_v<std::underlying_type_t<LayoutUnit>, std::int32_t>));
}

TEST(Layout, NothingGivenIsTheFrame)
{
    EXPECT_EQ(LayoutObject(frame, Nothing()), frame);
    for (int vertical = -1; vertical <= 3; ++vertical)
        for (int horizontal = -1; horizontal <= 3; ++horizontal) {
            Layout layout = Nothing();
            layout.verticalAlign = vertical;
            layout.horizontalAlign = horizontal;
            EXPECT_EQ(LayoutObject(frame, layout), frame);
        }
    EXPECT_EQ(LayoutObject({5.0, -7.0, -5.0, 7.0}, Nothing()), (Box{5.0, -7.0, -5.0, 7.0}));
}

TEST(Layout, NumbersOfMeasuresNotGivenDoNotCount)
{
    Layout layout = Nothing();
    for (LayoutMeasure* measure : {&layout.width, &layout.minWidth, &layout.leftMargin, &layout.rightMargin,
                                   &layout.height, &layout.minHeight, &layout.topMargin, &layout.bottomMargin})
        measure->value = 500.0;
    EXPECT_EQ(LayoutObject(frame, layout), frame);
}

TEST(Layout, GivenWidth)
{
    ExpectHorizontal(LayoutObject(frame, Horizontal(Absolute(50.0), left)), 0.0, 50.0);
    ExpectHorizontal(LayoutObject(frame, Horizontal(Absolute(50.0), right)), 150.0, 200.0);
    ExpectHorizontal(LayoutObject(frame, Horizontal(Absolute(50.0), centre)), 75.0, 125.0);
    ExpectHorizontal(LayoutObject(frame, Horizontal(Relative(0.25), right)), 150.0, 200.0);
}

TEST(Layout, GivenHeight)
{
    ExpectVertical(LayoutObject(frame, Vertical(Relative(0.5), top)), 100.0, 50.0);
    ExpectVertical(LayoutObject(frame, Vertical(Relative(0.5), bottom)), 50.0, 0.0);
    ExpectVertical(LayoutObject(frame, Vertical(Relative(0.5), centre)), 75.0, 25.0);
    ExpectVertical(LayoutObject(frame, Vertical(Absolute(30.0), top)), 100.0, 70.0);
    ExpectVertical(LayoutObject(frame, Vertical(Absolute(30.0), bottom)), 30.0, 0.0);
    ExpectVertical(LayoutObject(frame, Vertical(Absolute(30.0), centre)), 65.0, 35.0);
}

TEST(Layout, GivenSizeOfAnUnknownAlignmentKeepsTheEdges)
{
    for (const int align : {-1, 3, 1000, -2147483647}) {
        Layout layout = Horizontal(Absolute(50.0), align);
        layout.height = Absolute(50.0);
        layout.verticalAlign = align;
        layout.leftMargin = layout.topMargin = Absolute(7.0);
        EXPECT_EQ(LayoutObject(frame, layout), frame);
    }
}

TEST(Layout, MarginsMoveAGivenSize)
{
    Layout layout = Horizontal(Absolute(50.0), left);
    layout.height = Absolute(20.0);
    layout.leftMargin = Absolute(1.0);
    layout.rightMargin = Absolute(2.0);
    layout.topMargin = Absolute(3.0);
    layout.bottomMargin = Absolute(4.0);
    EXPECT_EQ(LayoutObject(frame, layout), (Box{1.0, 24.0, 51.0, 4.0}));
    layout.horizontalAlign = right;
    layout.verticalAlign = top;
    EXPECT_EQ(LayoutObject(frame, layout), (Box{148.0, 97.0, 198.0, 77.0}));
    layout.horizontalAlign = layout.verticalAlign = centre; // margins are not used
    EXPECT_EQ(LayoutObject(frame, layout), (Box{75.0, 60.0, 125.0, 40.0}));
}

TEST(Layout, MarginsNarrowAStretch)
{
    Layout layout = Nothing();
    layout.leftMargin = Absolute(10.0);
    layout.rightMargin = Relative(0.25);
    layout.topMargin = Absolute(10.0);
    layout.bottomMargin = Relative(0.25);
    EXPECT_EQ(LayoutObject(frame, layout), (Box{10.0, 90.0, 150.0, 25.0}));
}

TEST(Layout, MarginsMayCross)
{
    Layout layout = Nothing();
    layout.leftMargin = layout.rightMargin = Absolute(150.0);
    ExpectHorizontal(LayoutObject(frame, layout), 150.0, 50.0);
}

/// A frame that is 40 wide and 20 high between its margins.
Layout Narrow(LayoutMeasure minimum, int horizontal, int vertical)
{
    Layout layout{};
    layout.leftMargin = Absolute(100.0);
    layout.rightMargin = Absolute(60.0);
    layout.topMargin = Absolute(30.0);
    layout.bottomMargin = Absolute(50.0);
    layout.minWidth = layout.minHeight = minimum;
    layout.horizontalAlign = horizontal;
    layout.verticalAlign = vertical;
    return layout;
}

TEST(Layout, MinimumWidensAStretch)
{
    EXPECT_EQ(LayoutObject(frame, Narrow(Absolute(50.0), left, bottom)), (Box{100.0, 100.0, 150.0, 50.0}));
    EXPECT_EQ(LayoutObject(frame, Narrow(Absolute(50.0), right, top)), (Box{90.0, 70.0, 140.0, 20.0}));
    EXPECT_EQ(LayoutObject(frame, Narrow(Relative(0.5), right, top)), (Box{40.0, 70.0, 140.0, 20.0}));
    EXPECT_EQ(LayoutObject(frame, Narrow(Absolute(50.0), 3, -1)), (Box{100.0, 70.0, 140.0, 50.0}));
}

TEST(Layout, StretchAboveItsMinimumKeepsItsMargins)
{
    const Box between{100.0, 70.0, 140.0, 50.0};
    for (int align = -1; align <= 3; ++align) {
        EXPECT_EQ(LayoutObject(frame, Narrow(Absolute(10.0), align, align)), between);
        EXPECT_EQ(LayoutObject(frame, Narrow(Absolute(20.0), align, align)), between);
    }
    EXPECT_EQ(LayoutObject(frame, Narrow(Absolute(40.0), left, bottom)), (Box{100.0, 90.0, 140.0, 50.0}));
    EXPECT_EQ(LayoutObject(frame, Narrow(Absolute(40.0), centre, bottom)).left, 100.0); // just enough is enough
    EXPECT_EQ(LayoutObject(frame, Narrow(Absolute(Above(40.0)), left, bottom)).right, Above(40.0) + 100.0);
}

/// A minimum of 0 is not below 0, and every height of a normal frame, measured downward, is below it.
TEST(Layout, MinimumHeightOfZeroFlattens)
{
    EXPECT_EQ(LayoutObject(frame, Narrow(Absolute(0.0), left, bottom)), (Box{100.0, 50.0, 140.0, 50.0}));
    EXPECT_EQ(LayoutObject(frame, Narrow(Relative(0.0), left, top)), (Box{100.0, 70.0, 140.0, 70.0}));
    EXPECT_EQ(LayoutObject(frame, Narrow(Absolute(0.0), left, centre)), (Box{100.0, -50.0, 140.0, -50.0}));
    EXPECT_EQ(LayoutObject(frame, Narrow(Absolute(0.0), left, 3)), (Box{100.0, 70.0, 140.0, 50.0}));
}

/// The extent of the frame places it, and not where the frame lies.
TEST(Layout, CentredMinimumForgetsWhereTheFrameIs)
{
    Layout layout = Nothing();
    layout.minWidth = layout.minHeight = Absolute(200.0);
    layout.horizontalAlign = layout.verticalAlign = centre;
    const Box placed = LayoutObject({1000.0, 1100.0, 1100.0, 1000.0}, layout);
    ExpectHorizontal(placed, -50.0, 150.0);
    ExpectVertical(placed, 50.0, -150.0); // (-100 + 200) / 2, and 200 below it
}

TEST(Layout, CentredMinimumHasNoMargins)
{
    Layout layout = Narrow(Absolute(80.0), centre, centre);
    EXPECT_EQ(LayoutObject(frame, layout), (Box{60.0, -10.0, 140.0, -90.0}));
    layout.leftMargin.value = 120.0;
    layout.bottomMargin.value = 70.0;
    EXPECT_EQ(LayoutObject(frame, layout), (Box{60.0, -10.0, 140.0, -90.0}));
}

TEST(Layout, MinimumHasNoEffectOnAGivenSize)
{
    Layout layout = Horizontal(Absolute(50.0), left);
    layout.minWidth = layout.minHeight = Absolute(80.0);
    layout.height = Absolute(20.0);
    EXPECT_EQ(LayoutObject(frame, layout), (Box{0.0, 20.0, 50.0, 0.0}));
}

/// A minimum below 0 is one in the direction of a frame that is inside out.
TEST(Layout, NegativeMinimumComparesTheOtherWay)
{
    Layout layout = Nothing();
    layout.minWidth = Absolute(50.0);
    ExpectHorizontal(LayoutObject({30.0, 0.0, 0.0, 0.0}, layout), 30.0, -20.0); // -30 is above -50
    ExpectHorizontal(LayoutObject({60.0, 0.0, 0.0, 0.0}, layout), 60.0, 0.0);
    layout.minWidth = Absolute(-50.0);
    ExpectHorizontal(LayoutObject(frame, layout), 0.0, -50.0); // 200 is above -50
    // A minimum of 0 is not below 0: a height between margins that cross is above it, a width below.
    layout = Nothing();
    layout.minWidth = layout.minHeight = Absolute(0.0);
    layout.leftMargin = Absolute(250.0);
    layout.topMargin = Absolute(120.0);
    EXPECT_EQ(LayoutObject(frame, layout), (Box{250.0, -20.0, 250.0, 0.0}));
}

TEST(Layout, InsideOutFrameMirrorsItsLengths)
{
    const Box insideOut{200.0, 0.0, 0.0, 100.0};
    Layout layout = Horizontal(Absolute(50.0), left);
    layout.height = Absolute(20.0);
    layout.verticalAlign = top;
    layout.leftMargin = layout.topMargin = Absolute(5.0);
    EXPECT_EQ(LayoutObject(insideOut, layout), (Box{195.0, 5.0, 145.0, 25.0}));
}

TEST(Layout, FrameWithoutExtentHasNoLengths)
{
    Layout layout = Horizontal(Absolute(50.0), left);
    layout.leftMargin = Absolute(5.0);
    layout.height = Absolute(20.0);
    EXPECT_EQ(LayoutObject({7.0, 3.0, 7.0, 3.0}, layout), (Box{7.0, 3.0, 7.0, 3.0}));
}

TEST(Layout, UnknownKindIsGivenWithTheDefault)
{
    const LayoutMeasure unknown{static_cast<LayoutUnit>(7), 50.0};
    // As a width, that of the frame; the object does not stretch but is placed.
    Layout layout = Horizontal(unknown, left);
    layout.leftMargin = Absolute(10.0);
    ExpectHorizontal(LayoutObject(frame, layout), 10.0, 210.0);
    // As a margin or a minimum, 0.
    layout = Nothing();
    layout.leftMargin = unknown;
    layout.minWidth = unknown;
    ExpectHorizontal(LayoutObject(frame, layout), 0.0, 200.0);
    layout.leftMargin = Absolute(250.0);
    ExpectHorizontal(LayoutObject(frame, layout), 250.0, 250.0);
}

/// The middle is found from the left edge, but from the bottom one.
TEST(Layout, CentresRoundFromTheirOwnEdge)
{
    const double size = 0.1;
    const Box box{0.3, 0.7, 1.1, 0.3};
    Layout layout = Horizontal(Absolute(size), centre);
    layout.height = Absolute(size);
    layout.verticalAlign = centre;
    const Box placed = LayoutObject(box, layout);
    EXPECT_TRUE(SameBits(placed.left, (0.3 + 1.1 - size) * 0.5));
    EXPECT_TRUE(SameBits(placed.right, size + (0.3 + 1.1 - size) * 0.5));
    EXPECT_TRUE(SameBits(placed.bottom, (0.7 + 0.3 + -size) * 0.5));
    EXPECT_TRUE(SameBits(placed.top, (0.7 + 0.3 + -size) * 0.5 - -size));
}

TEST(Layout, NanGoesThrough)
{
    ExpectHorizontal(LayoutObject(frame, Horizontal(Absolute(50.0), left)), 0.0, 50.0);
    EXPECT_TRUE(std::isnan(LayoutObject(frame, Horizontal(Absolute(nan), left)).right));
    // The sign of an extent that is NaN is 0.
    EXPECT_EQ(LayoutObject({3.0, 1.0, nan, 0.0}, Horizontal(Absolute(50.0), left)).right, 3.0);
}

TEST(LayoutTransformation, OfTheFrameItselfIsTheIdentity)
{
    const MATRIX matrix = GetLayoutTransformation(frame, frame, Nothing());
    EXPECT_EQ(matrix, (MATRIX{1.0, 0.0, 0.0, 0.0, 1.0, 0.0}));
}

TEST(LayoutTransformation, ScalesFirstAndMovesAfterwards)
{
    // From 10 by 5 at (20, 30) to 200 by 100 at the origin.
    const MATRIX matrix = GetLayoutTransformation(frame, {20.0, 35.0, 30.0, 30.0}, Nothing());
    EXPECT_EQ(matrix, (MATRIX{20.0, 0.0, -400.0, 0.0, 20.0, -600.0}));
    EXPECT_EQ(matrix(point2d{20.0, 30.0}), (point2d{0.0, 0.0}));
    EXPECT_EQ(matrix(point2d{30.0, 35.0}), (point2d{200.0, 100.0}));
}

TEST(LayoutTransformation, TakesTheObjectOntoItsPlace)
{
    std::mt19937 engine(11);
    std::uniform_real_distribution<double> number(-100.0, 100.0);
    std::uniform_int_distribution<int> code(0, 2);
    const auto measure = [&] { return LayoutMeasure{static_cast<LayoutUnit>(code(engine)), number(engine) / 50.0}; };
    for (int i = 0; i < 3000; ++i) {
        const Box box{number(engine), number(engine), number(engine), number(engine)};
        const Box object{number(engine), number(engine) + 300.0, number(engine) + 300.0, number(engine)};
        const Layout layout{measure(), measure(), measure(), measure(),    measure(),
                            measure(), measure(), measure(), code(engine), code(engine)};
        const Box place = LayoutObject(box, layout);
        const MATRIX matrix = GetLayoutTransformation(box, object, layout);
        const point2d leftBottom = matrix(point2d{object.left, object.bottom});
        const point2d rightTop = matrix(point2d{object.right, object.top});
        ASSERT_NEAR(leftBottom.x, place.left, 1e-10);
        ASSERT_NEAR(leftBottom.y, place.bottom, 1e-10);
        ASSERT_NEAR(rightTop.x, place.right, 1e-10);
        ASSERT_NEAR(rightTop.y, place.top, 1e-10);
        EXPECT_EQ(matrix.m12, 0.0);
        EXPECT_EQ(matrix.m21, 0.0);
    }
}

TEST(LayoutTransformation, ObjectWithoutSizeGivesWhatTheArithmeticGives)
{
    const MATRIX point = GetLayoutTransformation(frame, {5.0, 5.0, 5.0, 5.0}, Nothing());
    EXPECT_EQ(point.m11, infinity);
    EXPECT_EQ(point.m22, infinity);
    const MATRIX both = GetLayoutTransformation({1.0, 1.0, 1.0, 1.0}, {5.0, 5.0, 5.0, 5.0}, Nothing());
    EXPECT_TRUE(std::isnan(both.m11));
}

} // namespace
} // namespace ZarnMath
