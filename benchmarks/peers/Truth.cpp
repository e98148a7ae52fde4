#include "benchmarks/peers/Truth.h"

#include "benchmarks/peers/GslLength.h"
#include "tests/census/BruteForce.h"

#include <algorithm>

namespace ZarnMath::Peers {

using CubicBezier::PowerForm;

double TrueDistance(const Cubic& curve, const point2d& q)
{
    const PowerForm form = CubicBezier::ToPowerForm(curve.data());
    return std::sqrt(LengthSquared(CubicBezier::Evaluate(form, Census::FindNearest(curve, q)) - q));
}

double TrueLength(const Cubic& curve)
{
    static const GslLength length;
    return length(CubicBezier::ToPowerForm(curve.data()), 1e-10);
}

Box TrueBox(const Cubic& curve)
{
    constexpr int samples = 20000;
    const PowerForm form = CubicBezier::ToPowerForm(curve.data());
    Box box{curve[0].x, curve[0].y, curve[0].x, curve[0].y};
    for (int i = 1; i <= samples; ++i) {
        const point2d p = CubicBezier::Evaluate(form, static_cast<double>(i) / samples);
        box = {std::min(box.left, p.x), std::min(box.bottom, p.y), std::max(box.right, p.x), std::max(box.top, p.y)};
    }
    return box;
}

} // namespace ZarnMath::Peers
