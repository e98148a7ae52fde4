// What stands beside the curves: ramps, splines, fields, space; and the layers of the library.

#include "docs/figures/Figures.h"

#include <cmath>

namespace ZarnMath::Figures {

void Ramps(const std::string& path)
{
    Figure figure(path, {-0.12, 1.12, 2.55, -0.16});
    std::vector<point2d> bias[3];
    std::vector<point2d> gain[3];
    for (int i = 0; i <= 64; ++i) {
        const double x = i / 64.0;
        for (int k = 0; k < 3; ++k) {
            bias[k].push_back({x, Bias(x, 0.2 + 0.3 * k)});
            gain[k].push_back({x + 1.4, Gain(x, -0.6 + 0.6 * k)});
        }
    }
    figure.Box({0.0, 1.0, 1.0, 0.0}, "faint");
    figure.Box({1.4, 1.0, 2.4, 0.0}, "faint");
    const Look looks[] = {"curve", "ink", "answer"};
    for (int k = 0; k < 3; ++k) {
        figure.Polyline(bias[k], looks[k]);
        figure.Polyline(gain[k], looks[k]);
    }
    const double special = 2.0 / 3.0;
    figure.Dot({1.4 + special, Gain(special, -0.6)}, "curve");
    figure.Label({0.5, 0.0}, Beside::Below, "Bias: 0.2, 0.5, 0.8");
    figure.Label({1.9, 0.0}, Beside::Below, "Gain: -0.6, 0, 0.6");
}

void Spline(const std::string& path)
{
    Figure figure(path, {-20.0, 170.0, 340.0, -30.0});
    //! [spline]
    const std::vector<point2d> points = {{0, 20}, {60, 130}, {150, 40}, {230, 130}, {320, 60}};
    // The tangents D of a spline that is straight at both ends:
    // D[i-1] + 4 D[i] + D[i+1] = 3 (P[i+1] - P[i-1]), and 2 D + D' = 3 (P' - P) at the ends.
    TridiagonalMatrix matrix;
    std::vector<point2d> rhs;
    const std::size_t last = points.size() - 1;
    for (std::size_t i = 0; i <= last; ++i) {
        matrix.AddRow(1.0, i == 0 || i == last ? 2.0 : 4.0, 1.0);
        rhs.push_back(AsPoint((points[i < last ? i + 1 : i] - points[i > 0 ? i - 1 : i]) * 3.0));
    }
    const std::vector<point2d> tangents = matrix.Solve(rhs, false);
    //! [spline]
    for (std::size_t i = 0; i < last; ++i) {
        const Cubic piece = {{points[i], points[i] + AsVector(tangents[i]) / 3.0,
                              points[i + 1] - AsVector(tangents[i + 1]) / 3.0, points[i + 1]}};
        figure.Curve(piece, i % 2 == 0 ? "curve" : "answer");
    }
    for (const point2d& p : points)
        figure.Dot(p, "ink");
}

void Field(const std::string& path)
{
    Figure figure(path, {-1.0, 9.0, 17.0, -1.0});
    //! [field]
    VectorField field;
    field.Initialize(RECT{0, 8, 16, 0});
    for (int y = 2; y <= 6; ++y) {
        for (int x = 3; x <= 12; ++x)
            field.SetVector(x, y, {0.4f * static_cast<float>(4 - y), 0.25f * static_cast<float>(x - 8)});
    }
    const vector2dT<float, false> between = field.Get({5.5f, 4.5f});
    //! [field]
    figure.Box({0.0, 8.0, 16.0, 0.0}, "faint");
    for (int y = 0; y <= 8; ++y) {
        for (int x = 0; x <= 16; ++x) {
            const vector2dT<float, false> v = field.GetVector(x, y);
            const point2d from{static_cast<double>(x), static_cast<double>(y)};
            const vector2d step{static_cast<double>(v.x), static_cast<double>(v.y)};
            if (v.x == 0.0f && v.y == 0.0f)
                figure.Box({from.x - 0.04, from.y + 0.04, from.x + 0.04, from.y - 0.04}, "faint");
            else
                figure.Arrow(from, from + step * 0.7, "curve");
        }
    }
    const point2d place{5.5, 4.5};
    figure.Arrow(place, place + vector2d{static_cast<double>(between.x), static_cast<double>(between.y)}, "answer");
}

void Projection(const std::string& path)
{
    Figure figure(path, {-150.0, 100.0, 150.0, -90.0}, 400.0);
    //! [projection]
    POINT3D corners[8];
    for (int i = 0; i < 8; ++i)
        corners[i] = {(i & 1) * 100 - 50, (i & 2) * 50 - 50, (i & 4) * 25 - 50};
    const double h = 0.45; // half the angle
    const Quaternion turn{0.3 * std::sin(h), 0.954 * std::sin(h), 0.0, std::cos(h)};
    MATRIX3D m;
    VECT_QuaternionToMat(&turn, &m);
    MTHTransform3DPoints(corners, &m, 8);
    const POINT3D eye{0, 0, 400};
    POINT images[8];
    MTHPerspective3DProjection(corners, images, 8, &eye);
    //! [projection]
    for (int i = 0; i < 8; ++i) {
        for (const int bit : {1, 2, 4}) {
            if ((i & bit) == 0)
                figure.Segment(ToPoint2d(images[i]), ToPoint2d(images[i | bit]), "curve");
        }
    }
    for (const POINT& p : images)
        figure.Dot(ToPoint2d(p), "answer");
}

void Layers(const std::string& path)
{
    Figure figure(path, {0.0, 330.0, 480.0, 0.0});
    const auto box = [&figure](double left, int row, double right, const char* words, Look look) {
        const double bottom = 10.0 + 54.0 * row;
        figure.Box({left, bottom + 38.0, right, bottom}, look);
        figure.Label({(left + right) / 2.0, bottom + 19.0}, Beside::On, words);
    };
    box(8.0, 0, 472.0, "value types, tolerances, rounding", "ink");
    box(8.0, 1, 115.0, "root finder", "answer filled");
    box(125.0, 1, 195.0, "boxes", "curve");
    box(205.0, 1, 355.0, "matrices, angles", "curve");
    box(365.0, 1, 472.0, "fit of a line", "curve");
    box(8.0, 2, 115.0, "power form", "answer filled");
    box(125.0, 2, 195.0, "fields", "curve");
    box(205.0, 2, 355.0, "images of boxes", "curve");
    box(365.0, 2, 472.0, "lines", "curve");
    box(8.0, 3, 472.0, "one cubic: cutting, length, nearest point, extents", "answer filled");
    box(8.0, 4, 115.0, "flattening", "curve");
    box(125.0, 4, 235.0, "crossings", "curve");
    box(245.0, 4, 472.0, "fits of cubics", "curve");
    box(245.0, 5, 472.0, "offsets", "curve");
}

} // namespace ZarnMath::Figures
