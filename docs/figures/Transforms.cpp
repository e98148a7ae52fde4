// Matrices: what the columns are, and in which order a product acts.

#include "docs/figures/Figures.h"

#include <utility>

namespace ZarnMath::Figures {

namespace {

/// A flag: no turn and no mirror takes it to itself.
std::vector<point2d> Flag()
{
    return {{0.0, 0.0}, {0.0, 60.0}, {40.0, 48.0}, {0.0, 34.0}};
}

std::vector<point2d> Transformed(std::vector<point2d> points, const MATRIX& m)
{
    m.TransformPoints(points.data(), points.size());
    return points;
}

} // namespace

void MatrixColumns(const std::string& path)
{
    Figure figure(path, {-50.0, 190.0, 330.0, -40.0});
    const double unit = 80.0; // of the picture
    const MATRIX m{1.25, 0.5, 1.0, 0.35, 1.1, 0.35};
    const auto place = [&](const point2d& p) { return point2d{p.x * unit, p.y * unit}; };
    const point2d corners[] = {{0, 0}, {1, 0}, {1, 1}, {0, 1}};
    std::vector<point2d> square;
    std::vector<point2d> image;
    for (const point2d& p : corners) {
        square.push_back(place(p));
        image.push_back(place(m(p)));
    }
    figure.Axes({0.0, 0.0}, 310.0, 175.0);
    figure.Polygon(square, "faint filled");
    figure.Polygon(image, "curve filled");
    figure.Arrow({0.0, 0.0}, image[0], "ink");
    figure.Arrow(image[0], image[1], "answer");
    figure.Arrow(image[0], image[3], "other");
    figure.Label({45.0, 14.0}, Beside::Below, "(dx, dy)");
    figure.Label({190.0, 36.0}, Beside::Right, "(m11, m21)", "answer");
    figure.Label({100.0, 95.0}, Beside::Left, "(m12, m22)", "other");
    figure.Label({220.0, 144.0}, Beside::Above, "image of the unit square", "curve");
}

void MatrixOrder(const std::string& path)
{
    Figure figure(path, {-90.0, 175.0, 270.0, -35.0}, 440.0);
    //! [order]
    const MATRIX move = ConstructTranslationMatrix({110.0, 0.0});
    const MATRIX turn = ConstructRotationMatrix(1.0); // radians, counter-clockwise
    const MATRIX turnThenMove = move * turn;          // the right-hand operand acts first
    const MATRIX moveThenTurn = turn * move;
    //! [order]
    figure.Axes({0.0, 0.0}, 250.0, 160.0);
    figure.Polygon(Flag(), "ink filled");
    figure.Polygon(Transformed(Flag(), turnThenMove), "curve filled");
    figure.Polygon(Transformed(Flag(), moveThenTurn), "answer filled");
    figure.Label({130.0, 0.0}, Beside::Below, "move * turn", "curve");
    figure.Label({75.0, 110.0}, Beside::Right, "turn * move", "answer");
}

void MapModes(const std::string& path)
{
    Figure figure(path, {-10.0, 130.0, 470.0, -40.0});
    const BoundsT<double> from{0.0, 1.0, 1.0, 0.0};
    const std::pair<MapMode, const char*> modes[] = {
        {MapStretch, "MapStretch"}, {MapFit, "MapFit"}, {MapFill, "MapFill"}};
    double left = 30.0;
    for (const auto& [mode, name] : modes) {
        //! [modes]
        const BoundsT<double> to{left, 80.0, left + 110.0, 20.0};
        const MATRIX m = ConstructRectTransformMatrix(from, to, mode);
        const BoundsT<double> image = GetTransformedBBox(from, m);
        //! [modes]
        figure.Box(image, "answer filled");
        figure.Box(to, "ink dashed");
        figure.Label({left + 55.0, -12.0}, Beside::Below, name);
        left += 160.0;
    }
}

void EllipseAxes(const std::string& path)
{
    Figure figure(path, {-170.0, 110.0, 170.0, -110.0}, 440.0);
    //! [ellipse]
    const MATRIX m{1.4, 0.5, 0.0, 0.3, 0.9, 0.0};
    vector2d major;
    vector2d minor;
    GetTransformedCircleAxes(m, major, minor);
    const BoundsT<double> box = GetTransformedCircleBBox(m, 80.0, {0.0, 0.0});
    //! [ellipse]
    std::vector<point2d> ellipse;
    for (int i = 0; i < 96; ++i)
        ellipse.push_back(m(point2d{} + Degrees::AngleToVector(i * 3.75, 80.0)));
    figure.Circle({0.0, 0.0}, 80.0, "faint");
    figure.Box(box, "ink dashed");
    figure.Polygon(ellipse, "curve filled");
    figure.Arrow({0.0, 0.0}, point2d{} + major * 80.0, "answer");
    figure.Arrow({0.0, 0.0}, point2d{} + minor * 80.0, "other");
    figure.Label(point2d{} + major * 45.0, Beside::Left, "major", "answer");
    figure.Label(point2d{} + minor * 45.0, Beside::Left, "minor", "other");
}

void BoxesOfTheSame(const std::string& path)
{
    Figure figure(path, {-115.0, 110.0, 125.0, -105.0}, 400.0);
    //! [boxes]
    const std::vector<point2d> points = {{-70, -20}, {-30, 40}, {60, 50}, {75, -10}, {0, -45}};
    const MATRIX turn = ConstructRotationMatrix(0.5);
    const BoundsT<double> ofPoints = GetTransformedPointsBBox(points.data(), points.size(), turn);
    const BoundsT<double> box = GetPointsBBox(points.data(), static_cast<int>(points.size()));
    const BoundsT<double> ofCorners = GetTransformedBBox(box, turn);
    //! [boxes]
    point2d corners[4];
    GetRectCorners(box, corners);
    figure.Polygon(Transformed({corners, corners + 4}, turn), "faint");
    figure.Polygon(Transformed(points, turn), "curve filled");
    figure.Box(ofPoints, "answer dashed");
    figure.Box(ofCorners, "other dashed");
    figure.Label({0.0, ofCorners.top}, Beside::Above, "box of the points", "answer");
    figure.Label({0.0, ofCorners.bottom}, Beside::Below, "box of the corners of their box", "other");
}

} // namespace ZarnMath::Figures
