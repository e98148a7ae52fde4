#include "Picture.h"

#include <algorithm>
#include <cmath>
#include <gtest/gtest.h>
#include <iterator>
#include <libxml/parser.h>
#include <libxml/tree.h>
#include <memory>
#include <sstream>

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
