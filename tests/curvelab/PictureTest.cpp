#include "Picture.h"
#include "Markup.h"

#include <algorithm>
#include <cmath>
#include <gtest/gtest.h>
#include <iterator>
#include <libxml/parser.h>
#include <libxml/tree.h>
#include <memory>
#include <sstream>
#include <tuple>

using namespace curvelab;

namespace {

Drawing Square()
{
    Pen pen;
    pen.MoveTo({0.0, 0.0});
    pen.LineTo({100.0, 0.0});
    pen.LineTo({100.0, 100.0});
    pen.LineTo({0.0, 100.0});
    pen.Close();
    Drawing drawing;
    AddShape(drawing, {}, pen.Finish());
    Fit(drawing, 100000.0);
    return drawing;
}

bool IsWellFormed(const std::string& xml)
{
    const std::unique_ptr<xmlDoc, void (*)(xmlDoc*)> document(
        xmlReadMemory(xml.data(), static_cast<int>(xml.size()), nullptr, nullptr, XML_PARSE_NONET | XML_PARSE_NOERROR),
        xmlFreeDoc);
    return document != nullptr;
}

std::size_t Count(const std::string& text, const std::string& part)
{
    std::size_t count = 0;
    for (std::size_t at = text.find(part); at != std::string::npos; at = text.find(part, at + 1))
        ++count;
    return count;
}

/// The numbers in some path data; the letters between them count as blanks.
std::vector<double> NumbersIn(std::string data)
{
    for (char& c : data)
        if (c != '-' && c != '.' && (c < '0' || c > '9'))
            c = ' ';
    std::istringstream stream(data);
    return {std::istream_iterator<double>(stream), {}};
}

/// The path data of a picture, in order.
std::vector<std::string> PathData(const std::string& svg)
{
    const std::string start = " d=\"";
    std::vector<std::string> paths;
    for (std::size_t at = svg.find(start); at != std::string::npos; at = svg.find(start, at + 1)) {
        const std::size_t first = at + start.size();
        paths.push_back(svg.substr(first, svg.find('"', first) - first));
    }
    return paths;
}

double LargestNumber(const std::string& svg)
{
    double largest = 0.0;
    for (const std::string& data : PathData(svg))
        for (const double number : NumbersIn(data))
            largest = std::max(largest, std::abs(number));
    return largest;
}

} // namespace

TEST(Picture, IsWellFormedWhateverTheNameHolds)
{
    Drawing drawing = Square();
    for (const char* name : {"plain", "a<b&\"c\">", "line\nbreak\x01", "\xff\xfe not UTF-8", "\u00e9"}) {
        drawing.name = name;
        EXPECT_TRUE(IsWellFormed(Picture(drawing, "test").Render({}))) << name;
    }
}

TEST(Picture, TurnsTheDrawingUprightOnThePage)
{
    const Drawing drawing = Square();
    Picture picture(drawing, "test");
    // 1000 pixels for 100000 units; the corner (0, 0) is at the bottom left of the page's artwork.
    EXPECT_EQ(picture.PixelsPerUnit(), 0.01);
    picture.AddLayer({}).AddPolyline({{0.0, 0.0}, {0.0, 100000.0}, {100000.0, 100000.0}});
    // The artwork comes first.
    const std::vector<double> p = NumbersIn(PathData(picture.Render({})).at(1));
    ASSERT_EQ(p.size(), 6u);
    EXPECT_DOUBLE_EQ(p[2], p[0]);
    EXPECT_DOUBLE_EQ(p[3], p[1] - 1000.0);
    EXPECT_DOUBLE_EQ(p[4], p[0] + 1000.0);
    EXPECT_DOUBLE_EQ(p[5], p[3]);
}

TEST(Picture, ShowsFactsAndLegend)
{
    const Drawing drawing = Square();
    Picture picture(drawing, "test");
    picture.AddLegend({}, Sample::Dot, "a dot");
    Report report;
    report.Add("length", "the length", 12.5);
    report.AddNumbers("hidden", 99.0);
    const std::string svg = picture.Render(report);
    EXPECT_EQ(Count(svg, ">a dot<"), 1u);
    EXPECT_EQ(Count(svg, ">the length<"), 1u);
    EXPECT_EQ(Count(svg, ">12.5<"), 1u);
    EXPECT_EQ(Count(svg, ">99<"), 0u);
}

TEST(Picture, ACircleWithoutExtentIsNotDrawn)
{
    // Around a point of the drawing that is asked for its nearest one.
    const Drawing drawing = Square();
    for (const double radius : {0.0, 1e-13}) {
        Picture picture(drawing, "test");
        picture.AddLayer({colour::green, 1.0, "", 1.0}).AddCircle({30000.0, 0.0}, radius);
        const std::string svg = picture.Render({});
        EXPECT_TRUE(IsWellFormed(svg));
        EXPECT_EQ(Count(svg.substr(svg.find("</style>")), colour::green), 0u);
    }
}

TEST(Picture, EveryColourHasOneForTheDark)
{
    const Drawing drawing = Square();
    Picture picture(drawing, "test");
    for (const char* stroke : {colour::ink, colour::blue, colour::orange, colour::green, colour::paper}) {
        picture.AddLayer({stroke, 1.0, "", 1.0}).AddDot({0.0, 0.0});
        picture.AddLegend({stroke, 1.0, "", 1.0}, Sample::Dot, stroke);
    }
    picture.SetLens({{0.0, 0.0}, 1000.0, "a corner"});
    const std::string svg = picture.Render({});
    const std::string style = svg.substr(svg.find("<style>"), svg.find("</style>") - svg.find("<style>"));
    const std::string drawn = svg.substr(svg.find("</style>"));
    EXPECT_NE(style.find("@media (prefers-color-scheme:dark)"), std::string::npos);
    std::size_t colours = 0;
    for (const std::string property : {"fill", "stroke"}) {
        const std::string start = ' ' + property + "=\"#";
        for (std::size_t at = drawn.find(start); at != std::string::npos; at = drawn.find(start, at + 1)) {
            const std::string rule = '[' + drawn.substr(at + 1, start.size() + 6) + "]{" + property + ":#";
            EXPECT_NE(style.find(rule), std::string::npos) << rule;
            ++colours;
        }
    }
    EXPECT_GE(colours, 20u);
}

TEST(Picture, ShowsItsScale)
{
    // A bar of 200 pixels at most: 20000 of 100000 units, and 2 of 16.
    for (const auto& [units, shown, pixels] :
         std::vector<std::tuple<double, std::string, double>>{{100000.0, "20000 units", 200.0},
                                                              {16.0, "2 units", 125.0},
                                                              {6.0, "1 unit", 1000.0 / 6.0},
                                                              {1.0, "0.2 units", 200.0}}) {
        Drawing drawing = Square();
        Fit(drawing, units);
        const std::string svg = Picture(drawing, "test").Render({});
        EXPECT_EQ(Count(svg, '>' + shown + '<'), 1u) << shown;
        // The bar comes after the artwork: M left y H right.
        const std::vector<double> bar = NumbersIn(PathData(svg).at(1));
        ASSERT_GE(bar.size(), 3u);
        EXPECT_NEAR(bar[2] - bar[0], pixels, 2e-3);
    }
}

TEST(Picture, AFigureBringsNoTitleAndNamesItsParts)
{
    const Drawing drawing = Square();
    Picture picture(drawing, "test");
    picture.AddLegend({}, Sample::Dot, "a dot");
    picture.SetLens({{0.0, 0.0}, 1000.0, "a corner"});
    const std::string svg = picture.RenderFigure("first");
    EXPECT_TRUE(IsWellFormed(svg));
    EXPECT_EQ(Count(svg, "<style"), 0u);
    EXPECT_EQ(Count(svg, "curvelab test"), 0u);
    EXPECT_EQ(Count(svg, ">a dot<"), 1u);
    EXPECT_EQ(Count(svg, " id=\""), 2u);
    EXPECT_EQ(Count(svg, " id=\"first-"), 2u);
    EXPECT_EQ(Count(svg, "url(#first-"), 2u);
}

TEST(Picture, ALongNameLeavesRoomForTheTitle)
{
    Drawing drawing = Square();
    drawing.name = "a/" + std::string(300, 'x') + "\u00e9\u00e9\u00e9.svg";
    const std::string svg = Picture(drawing, "test").Render({});
    EXPECT_TRUE(IsWellFormed(svg));
    EXPECT_EQ(Count(svg, "\u2026"), 1u);
    EXPECT_EQ(Count(svg, "\u00e9.svg<"), 1u);
    EXPECT_EQ(Count(svg, std::string(150, 'x')), 0u);
}

TEST(Markup, ShortensWithoutCuttingACharacter)
{
    EXPECT_EQ(Shortened("short", 5), "short");
    EXPECT_EQ(Shortened("a long name", 9), "a l\u2026ame");
    for (std::size_t most = 3; most < 14; ++most) {
        const std::string cut = Shortened("\u00e9\u00e9\u00e9\u00e9\u00e9\u00e9\u00e9", most);
        EXPECT_LE(cut.size(), most);
        EXPECT_EQ(Escaped(cut).find('?'), std::string::npos) << cut;
    }
}

TEST(Picture, MakesRoomForPointsOutside)
{
    const Drawing drawing = Square();
    Picture picture(drawing, "test");
    picture.MakeRoomFor({300000.0, 50000.0});
    EXPECT_DOUBLE_EQ(picture.PixelsPerUnit(), 1000.0 / 300000.0);
}

TEST(Picture, UnderTheLensCoordinatesStaySmall)
{
    // A quarter of a million times: the square's sides would be 250 million pixels long.
    const Drawing drawing = Square();
    Picture picture(drawing, "test");
    picture.AddLayer({}).AddCircle({50000.0, 0.0}, 40000.0);
    picture.SetLens({{50000.0, 0.0}, picture.LensRadius(250000.0), "near the middle of a side"});
    const std::string svg = picture.Render({});
    EXPECT_TRUE(IsWellFormed(svg));
    EXPECT_EQ(Count(svg, "clip-path=\"url(#lens)\""), 1u);
    EXPECT_LT(LargestNumber(svg), 5000.0);
}
