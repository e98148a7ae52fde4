#include "SvgReader.h"
#include "Failure.h"
#include "Program.h"
#include "SvgTree.h"

#include <cmath>
#include <gtest/gtest.h>

using namespace curvelab;

namespace {

Drawing Read(const std::string& content)
{
    const TemporaryFolder folder;
    return ReadSvg(folder.WriteSvg(content));
}

Drawing ReadPath(const std::string& data)
{
    return Read("<path d=\"" + data + "\"/>");
}

void ExpectPoint(const point2d& p, double x, double y)
{
    EXPECT_NEAR(p.x, x, 1e-9);
    EXPECT_NEAR(p.y, y, 1e-9);
}

/// Where the curves of the only contour end, in the file's coordinates (y downward).
std::vector<point2d> Stops(const Drawing& drawing)
{
    EXPECT_EQ(drawing.contours.size(), 1u);
    std::vector<point2d> stops;
    if (drawing.contours.empty())
        return stops;
    for (const Cubic& curve : drawing.contours[0].curves) {
        if (stops.empty())
            stops.push_back({curve[0].x, -curve[0].y});
        stops.push_back({curve[3].x, -curve[3].y});
    }
    return stops;
}

void ExpectStops(const Drawing& drawing, const std::vector<point2d>& expected)
{
    const std::vector<point2d> stops = Stops(drawing);
    ASSERT_EQ(stops.size(), expected.size());
    for (std::size_t i = 0; i < stops.size(); ++i)
        ExpectPoint(stops[i], expected[i].x, expected[i].y);
}

/// The control points of the n-th curve of the only contour, in the file's coordinates.
void ExpectCurve(const Drawing& drawing, std::size_t n, const std::vector<point2d>& expected)
{
    ASSERT_EQ(drawing.contours.size(), 1u);
    ASSERT_GT(drawing.contours[0].curves.size(), n);
    for (std::size_t i = 0; i < 4; ++i)
        ExpectPoint(drawing.contours[0].curves[n][i], expected[i].x, -expected[i].y);
}

Bounds BoundsOf(const Drawing& drawing)
{
    Bounds bounds = NoBounds();
    for (const Contour& contour : drawing.contours)
        for (const Cubic& curve : contour.curves)
            Include(bounds, curve);
    return bounds;
}

/// Compares bounds with those in the file's coordinates.
void ExpectBounds(const Drawing& drawing, double left, double top, double right, double bottom, double tolerance = 1e-9)
{
    const Bounds bounds = BoundsOf(drawing);
    EXPECT_NEAR(bounds.left, left, tolerance);
    EXPECT_NEAR(bounds.right, right, tolerance);
    EXPECT_NEAR(bounds.top, -top, tolerance);
    EXPECT_NEAR(bounds.bottom, -bottom, tolerance);
}

std::string MessageFor(const std::string& file)
{
    try {
        static_cast<void>(ReadSvg(file));
    } catch (const Failure& failure) {
        return failure.what();
    }
    return "";
}

constexpr const char* unitLine = "<path d=\"M0,0 L10,0\"/>";

} // namespace

TEST(SvgPath, LinesInAllTheirCommands)
{
    ExpectStops(ReadPath("M10,20 L30,40 l5,-5 H50 h10 V0 v7"),
                {{10, 20}, {30, 40}, {35, 35}, {50, 35}, {60, 35}, {60, 0}, {60, 7}});
    // Further pairs after a move are lines of the same kind.
    ExpectStops(ReadPath("M1,2 3,4 5,6"), {{1, 2}, {3, 4}, {5, 6}});
    ExpectStops(ReadPath("m1,2 3,4 5,6"), {{1, 2}, {4, 6}, {9, 12}});
}

TEST(SvgPath, CubicsAndTheirSmoothForms)
{
    const Drawing absolute = ReadPath("M0,0 C1,2 3,4 5,6 S7,8 9,10");
    ExpectCurve(absolute, 0, {{0, 0}, {1, 2}, {3, 4}, {5, 6}});
    ExpectCurve(absolute, 1, {{5, 6}, {7, 8}, {7, 8}, {9, 10}});
    const Drawing relative = ReadPath("M10,10 c1,2 3,4 5,6 s7,9 9,10");
    ExpectCurve(relative, 0, {{10, 10}, {11, 12}, {13, 14}, {15, 16}});
    ExpectCurve(relative, 1, {{15, 16}, {17, 18}, {22, 25}, {24, 26}});
    // Smooth after something else: the first control point is the current point.
    ExpectCurve(ReadPath("M3,4 S7,8 9,10"), 0, {{3, 4}, {3, 4}, {7, 8}, {9, 10}});
    ExpectCurve(ReadPath("M3,4 Q0,0 5,5 S7,8 9,10"), 1, {{5, 5}, {5, 5}, {7, 8}, {9, 10}});
}

TEST(SvgPath, QuadraticsAreRaised)
{
    const Drawing drawing = ReadPath("M0,0 Q30,60 90,0 T180,0 q3,6 9,0 t9,0");
    ExpectCurve(drawing, 0, {{0, 0}, {20, 40}, {50, 40}, {90, 0}});
    // The reflected control point is (150, -60).
    ExpectCurve(drawing, 1, {{90, 0}, {130, -40}, {160, -40}, {180, 0}});
    ExpectCurve(drawing, 2, {{180, 0}, {182, 4}, {185, 4}, {189, 0}});
    // Reflected about (189, 0) from (183, 6): (195, -6).
    ExpectCurve(drawing, 3, {{189, 0}, {193, -4}, {196, -4}, {198, 0}});
}

TEST(SvgPath, ArcsInBothForms)
{
    // Sweep flag 1 turns clockwise on the page: from the left over the top.
    ExpectStops(ReadPath("M-10,0 A10,10 0 0 1 10,0"), {{-10, 0}, {0, -10}, {10, 0}});
    ExpectStops(ReadPath("M5,5 a10,10 0 0 0 20,0"), {{5, 5}, {15, 15}, {25, 5}});
    // Flags may stand without separators, and further arcs may follow.
    ExpectStops(ReadPath("M-10,0a10 10 0 0120 0 10 10 0 01-20 0"), {{-10, 0}, {0, -10}, {10, 0}, {0, 10}, {-10, 0}});
    ExpectStops(ReadPath("M0,0 A0,5 0 0 1 10,10"), {{0, 0}, {10, 10}});
}

TEST(SvgPath, ClosingReturnsToTheStart)
{
    const Drawing drawing = ReadPath("M10,10 h10 v10 z l-5,0 Z M0,0 h1");
    ASSERT_EQ(drawing.contours.size(), 3u);
    EXPECT_TRUE(drawing.contours[0].closed);
    EXPECT_EQ(drawing.contours[0].curves.size(), 3u);
    EXPECT_TRUE(drawing.contours[1].closed);
    ExpectPoint(drawing.contours[1].curves[0][0], 10, -10);
    EXPECT_FALSE(drawing.contours[2].closed);
    EXPECT_EQ(drawing.shapes.size(), 1u);
}

TEST(SvgPath, NumbersMayTouch)
{
    ExpectStops(ReadPath("M1.5.5-3-4e0L.5-.5 1e1,1E+1-1e-1+2"), {{1.5, .5}, {-3, -4}, {.5, -.5}, {10, 10}, {-.1, 2}});
    ExpectStops(ReadPath("M1.,2.L3.,4."), {{1, 2}, {3, 4}});
}

TEST(SvgPath, WhatBreaksOffIsReadUpToThere)
{
    ExpectStops(ReadPath("M0,0 L10,0 L20,nonsense"), {{0, 0}, {10, 0}});
    EXPECT_TRUE(ReadPath("L10,0").contours.empty());
    EXPECT_TRUE(Read("<path/><path d=''/>").contours.empty());
}

TEST(SvgShapes, AreTheirOutlines)
{
    ExpectBounds(Read("<rect x='10' y='20' width='30' height='40'/>"), 10, 20, 40, 60);
    const Drawing round = Read("<rect x='10' y='20' width='30' height='40' rx='5' ry='8'/>");
    ExpectBounds(round, 10, 20, 40, 60);
    EXPECT_EQ(CountCurves(round), 8u);
    ExpectBounds(Read("<circle cx='50' cy='60' r='10'/>"), 40, 50, 60, 70);
    EXPECT_EQ(CountCurves(Read("<circle r='10'/>")), 4u);
    ExpectBounds(Read("<ellipse cx='5' cy='6' rx='20' ry='10'/>"), -15, -4, 25, 16);
    ExpectStops(Read("<line x1='1' y1='2' x2='3' y2='4'/>"), {{1, 2}, {3, 4}});
    ExpectStops(Read("<polyline points='1,2 3,4 5-6'/>"), {{1, 2}, {3, 4}, {5, -6}});
    ExpectStops(Read("<polygon points='1,2 3,4 5,6'/>"), {{1, 2}, {3, 4}, {5, 6}, {1, 2}});
}

TEST(SvgShapes, WithoutSizeDrawNothing)
{
    EXPECT_TRUE(Read("<rect x='1' y='2'/><rect width='5'/><rect width='-5' height='3'/><circle/><circle r='-1'/>"
                     "<ellipse rx='3'/><line/><rect width='junk' height='3'/>")
                    .contours.empty());
}

TEST(SvgShapes, LengthsHaveUnits)
{
    ExpectBounds(Read("<rect width='1in' height='72pt'/>"), 0, 0, 96, 96);
    ExpectBounds(Read("<rect width='50%' height='25%'/>"), 0, 0, 500, 250);
}

TEST(SvgTransforms, EachFunctionMovesAsItSays)
{
    const double s = std::sqrt(0.5);
    const auto endOf = [](const std::string& transform) {
        return Stops(Read("<path d='M0,0 L10,0' transform='" + transform + "'/>"))[1];
    };
    ExpectPoint(endOf("translate(3,4)"), 13, 4);
    ExpectPoint(endOf("translate(3)"), 13, 0);
    ExpectPoint(endOf("scale(2,5)"), 20, 0);
    ExpectPoint(endOf("scale(3)"), 30, 0);
    ExpectPoint(endOf("rotate(45)"), 10 * s, 10 * s);
    ExpectPoint(endOf("rotate(90,10,10)"), 20, 10);
    ExpectPoint(endOf("skewY(45)"), 10, 10);
    ExpectPoint(endOf("skewX(45) rotate(90)"), 10, 10);
    ExpectPoint(endOf("matrix(1,2,3,4,5,6)"), 15, 26);
    ExpectPoint(endOf("translate(100,0) rotate(90), scale(2)"), 100, 20);
}

TEST(SvgTransforms, NumbersMayTouch)
{
    ExpectStops(Read("<path d='M0,0 L10,0' transform='translate(-1-1)'/>"), {{-1, -1}, {9, -1}});
    ExpectStops(Read("<path d='M0,0 L10,0' transform='translate(.5.25)scale(2)'/>"), {{.5, .25}, {20.5, .25}});
    ExpectStops(Read("<path d='M0,0 L10,0' transform='matrix(1 0 0 1-3-4)'/>"), {{-3, -4}, {7, -4}});
}

TEST(SvgTransforms, NestFromTheOutsideIn)
{
    ExpectStops(Read("<g transform='translate(100,0)'><g transform='scale(2)'><g transform='rotate(90)'>"
                     "<path d='M0,0 L10,0' transform='translate(1,0)'/></g></g></g>"),
                {{100, 2}, {100, 22}});
    // A group's transform ends with it.
    const Drawing after = Read(std::string("<g transform='scale(7)'/>") + unitLine);
    ExpectStops(after, {{0, 0}, {10, 0}});
}

TEST(SvgViewports, ScaleTheirContent)
{
    ExpectStops(
        Read(std::string("<svg x='100' y='50' width='200' height='200' viewBox='0 0 20 20'>") + unitLine + "</svg>"),
        {{100, 50}, {200, 50}});
    // Fitted in the middle: 20 x 10 units in 200 x 200.
    ExpectStops(Read(std::string("<svg width='200' height='200' viewBox='0 0 20 10'>") + unitLine + "</svg>"),
                {{0, 50}, {100, 50}});
    ExpectStops(Read(std::string("<svg width='200' height='400' viewBox='0 0 20 20' preserveAspectRatio='none'>"
                                 "<path d='M0,0 L10,10'/></svg>")),
                {{0, 0}, {100, 200}});
    EXPECT_TRUE(Read(std::string("<svg width='0' height='10'>") + unitLine + "</svg>").contours.empty());
}

TEST(SvgUse, DrawsWhatItRefersTo)
{
    ExpectStops(Read("<defs><path id='a' d='M0,0 L10,0'/></defs><use href='#a' x='5' y='6'/>"), {{5, 6}, {15, 6}});
    ExpectStops(Read("<use xlink:href='#a' x='5' transform='scale(2)'/><defs><path id='a' d='M0,0 L10,0'/></defs>"),
                {{10, 0}, {30, 0}});
    ExpectStops(Read("<symbol id='s' viewBox='0 0 10 10'><path d='M0,0 L10,0'/></symbol>"
                     "<use href='#s' x='100' width='50' height='50'/>"),
                {{100, 0}, {150, 0}});
    // Of references to references.
    EXPECT_EQ(
        Read("<defs><path id='a' d='M0,0 L10,0'/><g id='b'><use href='#a'/><use href='#a' y='5'/></g>"
             "<g id='c'><use href='#b'/><use href='#b' y='20'/></g></defs><use href='#c'/><use href='#c' y='50'/>")
            .contours.size(),
        8u);
}

TEST(SvgUse, LeavesOutWhatContainsItself)
{
    EXPECT_EQ(Read("<g id='a'><path d='M0,0 L10,0'/><use href='#a'/></g>").contours.size(), 1u);
    EXPECT_EQ(Read("<defs><g id='a'><path d='M0,0 L10,0'/><use href='#b'/></g><g id='b'><use href='#a'/></g></defs>"
                   "<use href='#a'/>")
                  .contours.size(),
              1u);
    EXPECT_TRUE(Read("<use href='#nowhere'/><use/><use href='other.svg#a'/>").contours.empty());
}

TEST(SvgUse, MultiplyingReferencesAreRefused)
{
    std::string content = "<defs><path id='r0' d='M0,0 L10,0'/>";
    for (int i = 1; i <= 30; ++i) {
        const std::string use = "<use href='#r" + std::to_string(i - 1) + "'/>";
        content += "<g id='r" + std::to_string(i) + "'>" + use + use + "</g>";
    }
    const TemporaryFolder folder;
    const std::string file = folder.WriteSvg(content + "</defs><use href='#r30'/>");
    EXPECT_NE(MessageFor(file).find("references multiply"), std::string::npos);
}

TEST(SvgReader, PassesOverWhatIsNotDrawn)
{
    const std::string hidden = "<path d='M0,0 L99,99'/>";
    for (const char* container : {"defs", "clipPath", "symbol", "mask", "marker", "pattern", "text", "metadata"})
        EXPECT_TRUE(Read(std::string("<") + container + ">" + hidden + "</" + container + ">").contours.empty())
            << container;
    EXPECT_TRUE(Read("<g display='none'>" + hidden + "</g>").contours.empty());
    EXPECT_TRUE(Read("<g style='fill:red; display : none !important'>" + hidden + "</g>").contours.empty());
    EXPECT_TRUE(Read("<g visibility='hidden'>" + hidden + "</g>").contours.empty());
    EXPECT_EQ(Read("<g visibility='hidden'><path visibility='visible' d='M0,0 L1,1'/></g>").contours.size(), 1u);
}

TEST(SvgReader, PassesOverWhatItDoesNotKnow)
{
    const Drawing drawing = Read(
        "<style>.a { fill: var(--x); } @media print { * { display: none } }</style>"
        "<linearGradient id='g'><stop offset='0' stop-color='oklch(50% 0 0)'/></linearGradient>"
        "<sodipodi:namedview xmlns:sodipodi='http://example.org/s' pagecolor='#fff'><sodipodi:x/></sodipodi:namedview>"
        "<unknown><path d='M0,0 L5,5'/></unknown><foreignObject><div "
        "xmlns='http://www.w3.org/1999/xhtml'/></foreignObject>"
        "<path class='a b' style='fill:url(#g);-vendor-thing:1;mix-blend-mode:multiply' fill='currentColour' d='M0,0 "
        "L10,0'"
        " transform='translate(1' stroke-width='thick' data-x='y' onclick='z()'/>"
        "<text x='1' y='2'>words</text><image href='x.png'/><script>1 &lt; 2</script>");
    ExpectStops(drawing, {{0, 0}, {10, 0}});
}

TEST(SvgReader, GoesThroughLinksAndSwitches)
{
    ExpectStops(Read(std::string("<a href='#'>") + unitLine + "</a>"), {{0, 0}, {10, 0}});
    ExpectStops(Read(std::string("<switch><foreignObject/><g>") + unitLine + "</g><path d='M5,5 L6,6'/></switch>"),
                {{0, 0}, {10, 0}});
}

TEST(SvgReader, KnowsHowShapesAreFilled)
{
    const Drawing drawing = Read("<g fill='none'><path d='M0,0 L1,1'/><path style='fill:red' d='M0,0 L1,1'/></g>"
                                 "<path fill-rule='evenodd' d='M0,0 L1,1'/>");
    ASSERT_EQ(drawing.shapes.size(), 3u);
    EXPECT_FALSE(drawing.shapes[0].filled);
    EXPECT_TRUE(drawing.shapes[1].filled);
    EXPECT_TRUE(drawing.shapes[2].filled);
    EXPECT_TRUE(drawing.shapes[2].evenOdd);
}

TEST(SvgReader, TakesElementsWithoutNamespaceAsSvg)
{
    const TemporaryFolder folder;
    EXPECT_EQ(ReadSvg(folder.Write("a.svg", std::string("<svg><g>") + unitLine + "</g></svg>")).contours.size(), 1u);
    EXPECT_EQ(
        ReadSvg(folder.Write("b.svg", "<s:svg xmlns:s='http://www.w3.org/2000/svg'><s:path d='M0,0 L1,1'/></s:svg>"))
            .contours.size(),
        1u);
}

TEST(SvgReader, SaysWhatIsWrongAndWhere)
{
    const TemporaryFolder folder;
    const std::string broken = folder.Write("broken.svg", "<svg xmlns='http://www.w3.org/2000/svg'>\n<g>\n</svg>\n");
    EXPECT_EQ(MessageFor(broken).rfind(broken + ": line 3: not well-formed XML: ", 0), 0u) << MessageFor(broken);
    const std::string other = folder.Write("page.html", "<html><body/></html>");
    EXPECT_EQ(MessageFor(other), other + ": not an SVG drawing, the root element is <html>");
    const std::string missing = (folder.Path() / "missing.svg").string();
    EXPECT_EQ(MessageFor(missing), missing + ": cannot be read: No such file or directory");
    EXPECT_NE(MessageFor(folder.Write("empty.svg", "")), "");
    EXPECT_NE(MessageFor(folder.Write("noise.svg", std::string("\x89PNG\r\n\x1a\n\0\0", 10))), "");
}

TEST(SvgReader, ReadsNoOtherFile)
{
    const TemporaryFolder folder;
    const std::string secret = folder.Write("secret.txt", "M0,0 L77,0");
    const std::string file =
        folder.Write("entity.svg", "<!DOCTYPE svg [<!ENTITY e SYSTEM \"file://" + secret +
                                       "\"><!ENTITY i \"M0,0 L10,0\">]><svg xmlns='http://www.w3.org/2000/svg'>"
                                       "<path d='&i;'/><g>&e;</g></svg>");
    ExpectStops(ReadSvg(file), {{0, 0}, {10, 0}});
}

TEST(SvgTree, NumbersAreSetApart)
{
    EXPECT_EQ(SeparateNumbers("translate(-1-1)"), "translate(-1 -1)");
    EXPECT_EQ(SeparateNumbers("1.5.5.5"), "1.5 .5 .5");
    EXPECT_EQ(SeparateNumbers("1e-5-2E+3"), "1e-5 -2E+3");
    EXPECT_EQ(SeparateNumbers("1.e3"), "1.0e3");
    EXPECT_EQ(SeparateNumbers("M1,2l-3+4z"), "M1,2l-3 +4z");
    EXPECT_EQ(SeparateNumbers("M 1 , -2"), "M 1 , -2");
    EXPECT_EQ(SeparateNumbers("a1 1 0 01.5.5"), "a1 1 0 01.5 .5");
    EXPECT_EQ(SeparateNumbers(""), "");
}

TEST(SvgReader, TheDrawingsOfThisProjectAreRead)
{
    const std::string folder = CURVELAB_DRAWINGS;
    EXPECT_GT(CountCurves(ReadSvg(folder + "/nautilus.svg")), 100u);
    // Twelve lights of 4 + 8 curves of glass and 4 of its disc, among others.
    EXPECT_GT(CountCurves(ReadSvg(folder + "/rose-window.svg")), 12u * 14u);
}
