/// @file
/// A small SVG file in the making, in a plane whose y grows upward, and what an example draws with it.
#pragma once

#include <ZarnMath/ZarnMath.h>

#include <cstdio>
#include <fstream>
#include <stdexcept>
#include <string>
#include <vector>

/// What an example does: draws its picture into that file, and prints a few numbers. It is called by Main.cpp.
void Draw(const std::string& path);

/// Each shape is written as it is drawn; its look is given as SVG attributes.
class Svg
{
public:
    /// @param path where to write
    /// @param view what of the plane is shown
    /// @throws std::runtime_error if the file cannot be written
    Svg(const std::string& path, const ZarnMath::BoundsT<double>& view) : out(path)
    {
        if (!out)
            throw std::runtime_error("cannot write " + path);
        out << "<svg xmlns=\"http://www.w3.org/2000/svg\" viewBox=\"" << view.left << ' ' << -view.top << ' '
            << view.right - view.left << ' ' << view.top - view.bottom << "\">\n<g transform=\"scale(1,-1)\">\n";
        Rectangle(view, "fill='#fbfaf7'");
    }

    Svg(const Svg&) = delete;
    Svg& operator=(const Svg&) = delete;

    ~Svg()
    {
        out << "</g>\n</svg>\n";
    }

    void Polyline(const std::vector<ZarnMath::point2d>& points, const std::string& look)
    {
        Points("polyline", points, "fill='none' " + look);
    }

    void Polygon(const std::vector<ZarnMath::point2d>& points, const std::string& look)
    {
        Points("polygon", points, look);
    }

    void Rectangle(const ZarnMath::BoundsT<double>& box, const std::string& look)
    {
        Polygon({{box.left, box.top}, {box.right, box.top}, {box.right, box.bottom}, {box.left, box.bottom}}, look);
    }

    void Circle(const ZarnMath::point2d& centre, double radius, const std::string& look)
    {
        out << "<circle cx='" << centre.x << "' cy='" << centre.y << "' r='" << radius << "' " << look << "/>\n";
    }

    /// Cubics end to end.
    void Cubics(const std::vector<ZarnMath::CubicBezier::bezier2dT<ZarnMath::point2d>>& curves, const std::string& look)
    {
        out << "<path d='M" << curves.front()[0].x << ' ' << curves.front()[0].y;
        for (const auto& curve : curves)
            out << " C" << curve[1].x << ' ' << curve[1].y << ' ' << curve[2].x << ' ' << curve[2].y << ' '
                << curve[3].x << ' ' << curve[3].y;
        out << "' " << look << "/>\n";
    }

    /// The writing is upright; `at` is the left end of its base line.
    void Text(const ZarnMath::point2d& at, const std::string& words, const std::string& look)
    {
        out << "<text transform='translate(" << at.x << ' ' << at.y << ") scale(1,-1)' font-family='sans-serif' "
            << look << '>' << words << "</text>\n";
    }

private:
    void Points(const std::string& shape, const std::vector<ZarnMath::point2d>& points, const std::string& look)
    {
        out << '<' << shape << " points='";
        for (const ZarnMath::point2d& p : points)
            out << p.x << ',' << p.y << ' ';
        out << "' " << look << "/>\n";
    }

    std::ofstream out;
};
