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

CurveOf<point2d> SpecialSource::Cubic()
{
    const CurveOf<POINT> integers = OrdinarySource::IntegerCubic();
    CurveOf<point2d> curve;
    std::ranges::transform(integers, curve.begin(), [](const POINT& p) { return point2d{double(p.x), double(p.y)}; });
    ReplaceControlPoints(curve);
    return curve;
}

CurveOf<POINT> SpecialSource::IntegerCubic()
{
    CurveOf<POINT> curve = OrdinarySource::IntegerCubic();
    ReplaceControlPoints(curve);
    return curve;
}

Coefficients SpecialSource::PowerForm()
{
    const CurveOf<POINT> integers = OrdinarySource::IntegerCubic();
    CurveOf<point2d> curve;
    std::ranges::transform(integers, curve.begin(), [](const POINT& p) { return point2d{double(p.x), double(p.y)}; });
    Coefficients form = Catalogue::ToPowerForm(curve);
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
    names.push_back(name);
    return specialPlace == static_cast<int>(names.size()) - 1;
}

/// The name with a number behind it, from the second of that name on.
std::string SpecialSource::Numbered(const std::string& name) const
{
    const auto isSame = [&name](const std::string& other) { return other.starts_with(name); };
    const auto before = std::ranges::count_if(names, isSame);
    return before == 0 ? name : name + std::to_string(before + 1);
}

template <typename P>
void SpecialSource::Replace(P& point, const std::string& name)
{
    const auto isSame = [&name](const std::string& other) { return other.starts_with(name) && other.ends_with(".x"); };
    const auto before = std::ranges::count_if(names, isSame);
    const std::string numbered = before == 0 ? name : name + std::to_string(before + 1);
    point.x = Replaced(point.x, numbered + ".x");
    point.y = Replaced(point.y, numbered + ".y");
}

template <typename P>
void SpecialSource::ReplaceControlPoints(CurveOf<P>& curve)
{
    const std::string letter = curves++ == 0 ? "P" : "Q";
    for (std::size_t i = 0; i < 4; ++i)
        Replace(curve[i], letter + std::to_string(i));
}

} // namespace ZarnMath::Degenerate
