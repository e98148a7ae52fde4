/// @file
/// Arrays of points in the types of Eigen, where they stand.
#pragma once

#include "ZarnMath/ValueTypes.h"

#include <Eigen/Geometry>

namespace ZarnMath::Benchmarks {

[[nodiscard]] inline Eigen::Affine2d ToEigen(const MATRIX& m)
{
    Eigen::Affine2d affine;
    affine.matrix() << m.m11, m.m12, m.dx, m.m21, m.m22, m.dy, 0.0, 0.0, 1.0;
    return affine;
}

template <typename P>
using EigenPoints = Eigen::Map<Eigen::Matrix<decltype(P::x), 2, Eigen::Dynamic>>;

template <typename P>
EigenPoints<P> ToEigen(P* points, std::size_t count)
{
    return {&points->x, 2, static_cast<Eigen::Index>(count)};
}

/// A product of fixed size for each point, which Eigen evaluates without a temporary. Integers go through doubles and
/// are truncated, which is less work than to round and to saturate.
template <typename P>
void TransformByEigen(const Eigen::Affine2d& affine, P* points, std::size_t count)
{
    auto map = ToEigen(points, count);
    for (Eigen::Index i = 0; i < map.cols(); ++i)
        map.col(i) = (affine * Eigen::Vector2d(map.col(i).template cast<double>())).template cast<decltype(P::x)>();
}

} // namespace ZarnMath::Benchmarks
