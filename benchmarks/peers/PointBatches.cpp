// A matrix on an array of points, in place, beside a copy of the same bytes and beside Eigen. The time is that of a point.
// Eigen truncates to integers, which is less work than to round and to saturate.

#include "ZarnMath/WMath.h"
#include "benchmarks/peers/Questions.h"

#include <Eigen/Geometry>

#include <cstring>

namespace ZarnMath::Peers {
namespace {

/// A turn about a point, so that coordinates stay where they are however often it is applied.
MATRIX Matrix()
{
    return ConstructRotateAroundMatrix(0.3, {512.25, -300.5});
}

Eigen::Affine2d EigenMatrix()
{
    const MATRIX m = Matrix();
    Eigen::Affine2d affine;
    affine.matrix() << m.m11, m.m12, m.dx, m.m21, m.m22, m.dy, 0.0, 0.0, 1.0;
    return affine;
}

template <typename P>
std::vector<P> MakePoints(std::size_t count)
{
    using Coordinate = decltype(P::x);
    std::vector<P> points(count);
    for (std::size_t i = 0; i < count; ++i)
        points[i] = {static_cast<Coordinate>(i * 37 % 20011) - 10000, static_cast<Coordinate>(i * 91 % 30011) - 15000};
    return points;
}

template <typename P>
void TransformByEigen(const Eigen::Affine2d& affine, std::vector<P>& points)
{
    using Coordinate = decltype(P::x);
    Eigen::Map<Eigen::Matrix<Coordinate, 2, Eigen::Dynamic>> map(&points[0].x, 2,
                                                                 static_cast<Eigen::Index>(points.size()));
    for (Eigen::Index i = 0; i < map.cols(); ++i)
        map.col(i) = (affine * Eigen::Vector2d(map.col(i).template cast<double>())).template cast<Coordinate>();
}

template <typename P>
void AskForBatch(const std::string& name, std::size_t count)
{
    auto points = MakePoints<P>(count);
    std::vector<P> copy(count);
    Question question(name + ", " + std::to_string(count), count);
    question.AddPass("ZarnMath", "", [&, m = Matrix()] {
        m.TransformPoints(points.data(), points.size());
        benchmark::ClobberMemory();
    });
    question.AddPass("Eigen", "", [&, affine = EigenMatrix()] {
        TransformByEigen(affine, points);
        benchmark::ClobberMemory();
    });
    question.AddPass("memcpy", "", [&] {
        std::memcpy(copy.data(), points.data(), count * sizeof(P));
        benchmark::ClobberMemory();
    });
    question.Ask();
}

} // namespace

void AskForPointBatches()
{
    for (const std::size_t count : {std::size_t{4096}, std::size_t{4000000}}) {
        AskForBatch<point2d>("points through a matrix", count);
        AskForBatch<POINT>("integer points through a matrix", count);
    }
}

} // namespace ZarnMath::Peers
