// A cube on its way from one orientation to another, by the arc between two quaternions, seen in perspective.
#include "picture/Svg.h"

#include <algorithm>

using namespace ZarnMath;

namespace {

constexpr int steps = 6;
constexpr std::int32_t half = 850;
constexpr POINT3D viewpoint{0, 2500, 16000};

constexpr POINT3D corners[8] = {{-half, -half, -half}, {half, -half, -half}, {half, half, -half}, {-half, half, -half},
                                {-half, -half, half},  {half, -half, half},  {half, half, half},  {-half, half, half}};

/// Counter-clockwise as seen from outside.
constexpr std::size_t faces[6][4] = {{0, 3, 2, 1}, {4, 5, 6, 7}, {0, 1, 5, 4},
                                     {2, 3, 7, 6}, {1, 2, 6, 5}, {0, 4, 7, 3}};
constexpr vector3dT<double> normals[6] = {{0, 0, -1}, {0, 0, 1}, {0, -1, 0}, {0, 1, 0}, {1, 0, 0}, {-1, 0, 0}};
constexpr const char* colours[6] = {"#8a5a9c", "#d08a3a", "#4c7a34", "#1f4e79", "#a33b20", "#5b6673"};

/// The corners on the plane of projection. The matrix of a quaternion turns points by its inverse, hence the conjugate.
std::vector<point2d> Project(const Quaternion& q, const POINT3D& place)
{
    const Quaternion conjugate{-q.x, -q.y, -q.z, q.w};
    MATRIX3D matrix{};
    VECT_QuaternionToMat(&conjugate, &matrix);
    MTHTranslate3DMatrix(&matrix, place.x, place.y, place.z);
    POINT3D points[8];
    std::copy(corners, corners + 8, points);
    MTHTransform3DPoints(points, &matrix, 8);
    POINT images[8];
    MTHPerspective3DProjection(points, images, 8, &viewpoint);
    std::vector<point2d> projected;
    for (const POINT& image : images)
        projected.push_back(ToPoint2d(image));
    return projected;
}

/// The faces that look at the viewpoint: those of a convex body hide the others. One that looks up is the lightest.
void DrawCube(Svg& picture, const Quaternion& q, const POINT3D& place)
{
    const std::vector<point2d> points = Project(q, place);
    for (int i = 0; i < 6; ++i) {
        std::vector<point2d> face;
        for (const std::size_t corner : faces[i])
            face.push_back(points[corner]);
        if (Cross(face[1] - face[0], face[2] - face[0]) <= 0.0)
            continue;
        vector3dT<double> normal = normals[i];
        q.Rotate(normal);
        const double paint = 0.75 - 0.2 * normal.y - 0.15 * normal.x;
        picture.Polygon(face, std::string("fill='") + colours[i] + "' fill-opacity='" + std::to_string(paint) +
                                  "' stroke='#1d2530' stroke-width='24' stroke-linejoin='round'");
    }
}

} // namespace

void Draw(const std::string& path)
{
    Svg picture(path, {-11500.0, 4200.0, 11500.0, -4600.0});
    Quaternion from{};
    Quaternion to{};
    from.RotationCreate({0.0, 0.0, 1.0}, {0.28, -0.0, 0.96}); // by twice the angle between unit vectors
    to.RotationCreate({0.6, 0.64, -0.48}, {0.0, 0.6, 0.8});
    for (int i = 0; i <= steps; ++i) {
        const double t = static_cast<double>(i) / steps;
        Quaternion q{};
        Quaternion::Interpolate(from, to, t, q);
        const double along = 2.0 * t - 1.0;
        const double near = 1.0 - along * along;
        DrawCube(picture, q,
                 {RoundToInt(9300.0 * along), RoundToInt(1500.0 - 3200.0 * near), RoundToInt(2500.0 * near)});
        std::printf("t = %.3f: (%8.5f, %8.5f, %8.5f; %8.5f), squared length %.15f\n", t, q.x, q.y, q.z, q.w,
                    q.x * q.x + q.y * q.y + q.z * q.z + q.w * q.w);
    }
}
