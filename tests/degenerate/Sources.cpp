#include "tests/degenerate/Sources.h"

#include <algorithm>
#include <limits>

namespace ZarnMath::Degenerate {

using Catalogue::Coefficients;
using Catalogue::CurveOf;

namespace {

using Numbers = std::numeric_limits<double>;
using Integers = std::numeric_limits<std::int32_t>;

} // namespace

const std::array<Special, 9> specials = {{
    {"NaN", false, Numbers::quiet_NaN(), 0},
    {"+inf", false, Numbers::infinity(), 0},
    {"-inf", false, -Numbers::infinity(), 0},
    {"+0", false, 0.0, 0},
    {"-0", false, -0.0, 0},
    {"smallest", false, Numbers::denorm_min(), 0},
    {"largest", false, Numbers::max(), 0},
    {"least integer", true, 0.0, Integers::min()},
    {"greatest integer", true, 0.0, Integers::max()},
}};

CurveOf<POINT> CoincidentSource::IntegerCubic()
{
    const CurveOf<POINT> distinct = OrdinarySource::IntegerCubic();
    CurveOf<POINT> curve = distinct;
    if (curves++ == degenerateCurve)
        for (std::size_t i = 0; i < 4; ++i)
            curve[i] = distinct[static_cast<std::size_t>(partition[i])];
    return curve;
}

double SpecialSource::Number()
{
    return Replaced(OrdinarySource::Number(), Numbered("number"));
}

float SpecialSource::Single()
{
    return static_cast<float>(Replaced(double{OrdinarySource::Single()}, Numbered("number")));
}

std::int32_t SpecialSource::Integer()
{
    return Replaced(OrdinarySource::Integer(), Numbered("integer"));
}

double SpecialSource::Coordinate()
{
    return Replaced(OrdinarySource::Coordinate(), Numbered("coordinate"));
}

double SpecialSource::Parameter()
{
    return Replaced(OrdinarySource::Parameter(), Numbered("t"));
}

double SpecialSource::Angle(double turn)
{
    return Replaced(OrdinarySource::Angle(turn), Numbered("angle"));
}

std::int32_t SpecialSource::IntegerAngle()
{
    return Replaced(OrdinarySource::IntegerAngle(), Numbered("angle"));
}

double SpecialSource::Tolerance()
{
    return Replaced(OrdinarySource::Tolerance(), Numbered("tolerance"));
}

double SpecialSource::Distance()
{
    return Replaced(OrdinarySource::Distance(), Numbered("distance"));
}

point2d SpecialSource::Point()
{
    point2d point = {OrdinarySource::Coordinate(), OrdinarySource::Coordinate()};
    Replace(point, "point");
    return point;
}

POINT SpecialSource::IntegerPoint()
{
    POINT point = {OrdinarySource::Integer(), OrdinarySource::Integer()};
    Replace(point, "point");
    return point;
}

vector2d SpecialSource::Vector()
{
    vector2d vector = {OrdinarySource::Coordinate(), OrdinarySource::Coordinate()};
    Replace(vector, "vector");
    return vector;
}

CurveOf<point2d> SpecialSource::UnreplacedCubic()
{
    CurveOf<point2d> curve;
    std::ranges::transform(CoincidentSource::IntegerCubic(), curve.begin(), [](const POINT& p) {
        return point2d{double(p.x), double(p.y)};
    });
    return curve;
}

CurveOf<point2d> SpecialSource::Cubic()
{
    CurveOf<point2d> curve = UnreplacedCubic();
    ReplaceControlPoints(curve);
    return curve;
}

CurveOf<POINT> SpecialSource::IntegerCubic()
{
    CurveOf<POINT> curve = CoincidentSource::IntegerCubic();
    ReplaceControlPoints(curve);
    return curve;
}

Coefficients SpecialSource::PowerForm()
{
    Coefficients form = Catalogue::ToPowerForm(UnreplacedCubic());
    Replace(form.a, "a");
    Replace(form.b, "b");
    Replace(form.c, "c");
    Replace(form.d, "d");
    return form;
}

double SpecialSource::Replaced(double value, const std::string& name)
{
    return IsPlaceOf(false, name) ? special.number : value;
}

std::int32_t SpecialSource::Replaced(std::int32_t value, const std::string& name)
{
    return IsPlaceOf(true, name) ? special.integer : value;
}

bool SpecialSource::IsPlaceOf(bool isInteger, const std::string& name)
{
    if (isInteger != special.isInteger)
        return false;
    if (IsCounting())
        names.push_back(name);
    return places++ == specialPlace;
}

/// The names are asked for once a function, and the numbers a thousand times.
bool SpecialSource::IsCounting() const noexcept
{
    return specialPlace < 0;
}

/// The name with a number behind it, from the second draw of that name on.
std::string SpecialSource::Numbered(const char* name)
{
    if (!IsCounting())
        return {};
    const int count = ++draws[name];
    return count == 1 ? name : name + std::to_string(count);
}

template <typename P>
void SpecialSource::Replace(P& point, const char* name)
{
    const std::string numbered = Numbered(name);
    point.x = Replaced(point.x, numbered + ".x");
    point.y = Replaced(point.y, numbered + ".y");
}

/// After the curve is drawn.
template <typename P>
void SpecialSource::ReplaceControlPoints(CurveOf<P>& curve)
{
    constexpr const char* pointNames[2][4] = {{"P0", "P1", "P2", "P3"}, {"Q0", "Q1", "Q2", "Q3"}};
    for (std::size_t i = 0; i < 4; ++i)
        Replace(curve[i], pointNames[Curves() == 1 ? 0 : 1][i]);
}

} // namespace ZarnMath::Degenerate
