#include "ZarnMath/BezierInternal.h"

namespace ZarnMath::CubicBezier {

namespace {

// The nodes and weights of Gauss-Legendre quadrature on [-1, 1], all orders one after the other, each from the most
// negative node to the most positive one. They are deliberately short: the exact values rounded to 15 decimal places at
// orders 2, 4 and 8, to 14 at order 16, and to 8 at the others, but for the weights of order 3, which are full doubles, and
// the nodes +-0.23861918 of order 6, which are cut. The short ones show in lengths at the level of 1e-08.

// clang-format off
constexpr double adAbscissae[61] = {
    // 2
    -0.577350269189626, 0.577350269189626,
    // 3
    -0.77459667, 0.0, 0.77459667,
    // 4
    -0.861136311594053, -0.339981043584856, 0.339981043584856, 0.861136311594053,
    // 5
    -0.90617985, -0.53846931, 0.0, 0.53846931, 0.90617985,
    // 6
    -0.93246951, -0.66120939, -0.23861918, 0.23861918, 0.66120939, 0.93246951,
    // 7
    -0.94910791, -0.74153119, -0.40584515, 0.0, 0.40584515, 0.74153119, 0.94910791,
    // 8
    -0.960289856497536, -0.796666477413627, -0.525532409916329, -0.18343464249565, 0.18343464249565,
    0.525532409916329, 0.796666477413627, 0.960289856497536,
    // 10
    -0.97390653, -0.86506337, -0.67940957, -0.43339539, -0.14887434, 0.14887434, 0.43339539, 0.67940957, 0.86506337,
    0.97390653,
    // 16
    -0.98940093499165, -0.94457502307323, -0.86563120238783, -0.755404408355, -0.61787624440264, -0.45801677765723,
    -0.28160355077926, -0.09501250983764, 0.09501250983764, 0.28160355077926, 0.45801677765723, 0.61787624440264,
    0.755404408355, 0.86563120238783, 0.94457502307323, 0.98940093499165,
};

/// The weights, at the same indices as their nodes.
constexpr double adWeights[61] = {
    // 2
    1.0, 1.0,
    // 3
    0.5555555555555556, 0.8888888888888888, 0.5555555555555556,
    // 4
    0.347854845137454, 0.652145154862546, 0.652145154862546, 0.347854845137454,
    // 5
    0.23692689, 0.47862867, 0.56888889, 0.47862867, 0.23692689,
    // 6
    0.17132449, 0.36076157, 0.46791393, 0.46791393, 0.36076157, 0.17132449,
    // 7
    0.12948497, 0.27970539, 0.38183005, 0.41795918, 0.38183005, 0.27970539, 0.12948497,
    // 8
    0.101228536290376, 0.222381034453374, 0.313706645877887, 0.362683783378362, 0.362683783378362, 0.313706645877887,
    0.222381034453374, 0.101228536290376,
    // 10
    0.06667134, 0.14945135, 0.21908636, 0.26926672, 0.29552422, 0.29552422, 0.26926672, 0.21908636, 0.14945135,
    0.06667134,
    // 16
    0.02715245941175, 0.06225352393865, 0.09515851168249, 0.12462897125553, 0.14959598881658, 0.169156519395,
    0.18260341504492, 0.18945061045507, 0.18945061045507, 0.18260341504492, 0.169156519395, 0.14959598881658,
    0.12462897125553, 0.09515851168249, 0.06225352393865, 0.02715245941175,
};
// clang-format on

/// The index of an order's first element in both tables, and -1 for an order that does not exist.
constexpr int firstOfOrder[18] = {-1, -1, 0, 2, 5, 9, 14, 20, 27, -1, 35, -1, -1, -1, -1, -1, 45, 0};

} // namespace

int NormalizeQuadratureOrder(int order) noexcept
{
    if (order < 2)
        return 2;
    if (order > 10)
        return 16;
    return order == 9 ? 10 : order;
}

void GetGaussianQuadratureWeightsAndAbscissae(int order, const double*& weights, const double*& abscissae) noexcept
{
    const int first = firstOfOrder[NormalizeQuadratureOrder(order)];
    weights = adWeights + first;
    abscissae = adAbscissae + first;
}

} // namespace ZarnMath::CubicBezier
