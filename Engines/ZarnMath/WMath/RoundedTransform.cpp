#include "ZarnMath/WMath/Batches.h"

namespace ZarnMath {

namespace {

/// `RoundToInt` and then the limits, the other way about: rounding keeps the order of numbers and leaves the limits, which
/// are whole numbers, where they are. NaN gives 0; a -0.0 may lose either half.
std::int32_t RoundWithin(double v, const CoordinateRange& range) noexcept
{
    const double number = v == v ? v : 0.0;
    const double raised = number > range.smallest ? number : range.smallest;
    const double within = raised < range.largest ? raised : range.largest;
    return static_cast<std::int32_t>(within + std::copysign(0.5, within));
}

} // namespace

void TransformRounded(POINT* points, std::uint64_t count, const MATRIX& m, CoordinateRange range) noexcept
{
    ForEachPoint(points, count, m, [range](const POINT& p, const MATRIX& fixed) {
        const point2d image = Image(fixed, ToPoint2d(p));
        return POINT{RoundWithin(image.x, range), RoundWithin(image.y, range)};
    });
}

} // namespace ZarnMath
