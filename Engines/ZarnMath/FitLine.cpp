#include "ZarnMath/FitLine.h"

#include "ZarnMath/Bounds.h"

namespace ZarnMath {

namespace {

vector2d LongerAxis(const BoundsT<double>& box) noexcept
{
    if (box.right - box.left > box.top - box.bottom)
        return {1.0, 0.0};
    return {0.0, 1.0};
}

} // namespace

void GetLeastSquaresLines(const point2d* points, int count, point2d& point, vector2d& direction) noexcept
{
    if (count < 2)
        return;
    double sumX = 0.0;
    double sumY = 0.0;
    double sumXY = 0.0;
    double sumXX = 0.0;
    double sumYY = 0.0;
    for (int i = 0; i < count; ++i) {
        const auto [x, y] = points[i];
        sumY += y;
        sumX += x;
        sumXY += y * x;
        sumXX += x * x;
        sumYY += y * y;
    }
    GetLeastSquaresLines(sumX, sumY, sumXY, sumXX, sumYY, points, count, point, direction);
}

void GetLeastSquaresLines(double sumX, double sumY, double sumXY, double sumXX, double sumYY, const point2d* points,
                          int count, point2d& point, vector2d& direction) noexcept
{
    const double n = count;
    const double mx = sumX / n;
    const double my = sumY / n;
    const double sxy = mx * my * n + (sumXY - my * sumX - mx * sumY);
    if (sxy == 0.0) {
        direction = LongerAxis(GetPointsBBox(points, count));
        point = {mx, my};
        return;
    }
    // The larger eigenvalue of the scatter matrix has the eigenvector (g, w).
    const double d = mx * mx * n + (sumXX - 2.0 * mx * sumX) - (my * my * n + (sumYY - 2.0 * my * sumY));
    const double w = sxy + sxy;
    const double g = d + std::sqrt(d * d + sxy * (sxy * 4.0));
    point = {(mx * w - my * g) / w, 0.0};
    direction = {g / w, 1.0};
}

} // namespace ZarnMath
