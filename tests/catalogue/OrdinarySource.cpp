#include "tests/catalogue/OrdinarySource.h"

#include <algorithm>

namespace ZarnMath::Catalogue {

namespace {

template <typename T, std::size_t N>
const T& Take(const std::array<T, N>& list, unsigned& next)
{
    return list[next++ % N];
}

constexpr std::array<std::int32_t, 7> coordinates = {150, 90, 260, 40, -30, 170, 310};
constexpr std::array<double, 3> parameters = {0.25, 0.625, 0.875};

/// They cross each other, and none is symmetric.
constexpr std::array<CurveOf<POINT>, 3> curves = {{
    {{{10, 20}, {110, 320}, {230, -70}, {310, 150}}},
    {{{20, 200}, {90, -150}, {220, 260}, {330, -20}}},
    {{{300, 40}, {-80, 210}, {380, 230}, {0, 60}}},
}};

} // namespace

// Each of these draws by itself and not through another: a source that replaces one leaves the others as they are.

double OrdinarySource::Number()
{
    return Take(coordinates, next) / 64.0;
}

float OrdinarySource::Single()
{
    return static_cast<float>(Take(coordinates, next)) / 64.0F;
}

std::int32_t OrdinarySource::Integer()
{
    return Take(coordinates, next);
}

bool OrdinarySource::Flag()
{
    return flags;
}

int OrdinarySource::Count(int low, int high)
{
    return std::clamp(4, low, high);
}

double OrdinarySource::Coordinate()
{
    return Take(coordinates, next);
}

double OrdinarySource::Parameter()
{
    return Take(parameters, next);
}

double OrdinarySource::Angle(double turn)
{
    return Take(parameters, next) * turn;
}

std::int32_t OrdinarySource::IntegerAngle()
{
    return Take(coordinates, next) * 1'000'000;
}

double OrdinarySource::Tolerance()
{
    return 0.5;
}

double OrdinarySource::Distance()
{
    return 20.0;
}

CurveOf<point2d> OrdinarySource::Cubic()
{
    const CurveOf<POINT> integers = IntegerCubic();
    CurveOf<point2d> curve;
    std::transform(integers.begin(), integers.end(), curve.begin(), [](const POINT& p) { return ToPoint2d(p); });
    return curve;
}

CurveOf<POINT> OrdinarySource::IntegerCubic()
{
    return Take(curves, next);
}

} // namespace ZarnMath::Catalogue
