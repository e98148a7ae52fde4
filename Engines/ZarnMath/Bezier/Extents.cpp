#include "ZarnMath/Bezier/PowerForm.h"
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/RootFinder.h"

namespace ZarnMath::CubicBezier {

namespace {

/// The roots of A*t^2 + B*t + C on the unit interval, as a range.
struct QuadraticRoots
{
    double t[2];
    int count;

    QuadraticRoots(double A, double B, double C, bool includeEndpoints) noexcept
    {
        const double c[3] = {A, B, C};
        count = RootFinder::FindQuadraticRoots(c, t, includeEndpoints);
    }

    [[nodiscard]] const double* begin() const noexcept
    {
        return t;
    }

    [[nodiscard]] const double* end() const noexcept
    {
        return t + count;
    }
};

QuadraticRoots VerticalTangents(const DerivativeForm& f) noexcept
{
    return {f.u.x, f.v.x, f.w.x, false};
}

QuadraticRoots HorizontalTangents(const DerivativeForm& f) noexcept
{
    return {f.u.y, f.v.y, f.w.y, false};
}

void Append(const QuadraticRoots& roots, std::vector<double>& parameters)
{
    parameters.insert(parameters.end(), roots.begin(), roots.end());
}

/// Least and greatest coordinates.
struct Extremes
{
    point2d least;
    point2d greatest;

    void Include(const point2d& p) noexcept
    {
        if (p.x > greatest.x)
            greatest.x = p.x;
        if (p.y > greatest.y)
            greatest.y = p.y;
        if (p.x < least.x)
            least.x = p.x;
        if (p.y < least.y)
            least.y = p.y;
    }
};

} // namespace

void GetVerticalTangents(const point2d& a, const point2d& b, const point2d& c, std::vector<double>& parameters)
{
    Append(VerticalTangents(ToDerivativeForm(a, b, c)), parameters);
}

void GetHorizontalTangents(const point2d& a, const point2d& b, const point2d& c, std::vector<double>& parameters)
{
    Append(HorizontalTangents(ToDerivativeForm(a, b, c)), parameters);
}

void GetParallels(const point2d& a, const point2d& b, const point2d& c, const vector2d& direction,
                  std::vector<double>& parameters, bool& allParallel)
{
    const double A = Cross(direction, a) * 3.0;
    const double B = Cross(direction, b) * 2.0;
    const double C = Cross(direction, c);
    allParallel = IsNearZero(A) && IsNearZero(B) && IsNearZero(C);
    if (!allParallel)
        Append({A, B, C, true}, parameters);
}

double GetAreaUnderBezier(const point2d& a, const point2d& b, const point2d& c, const point2d& d) noexcept
{
    constexpr double third = 1.0 / 3.0;
    const double X3 = a.x * 3.0;
    const double X2 = b.x + b.x;
    return a.x * a.y * 0.5 + ((X2 * a.y + b.y * X3) * 0.2 + (((c.x * d.y + (c.x * c.y + d.y * X2) * 0.5) +
                                                              (c.x * b.y + c.y * X2 + d.y * X3) * third) +
                                                             ((X2 * b.y + c.x * a.y) + c.y * X3) * 0.25));
}

template <typename T>
void GetTightBounds(const point2d& a, const point2d& b, const point2d& c, const point2d& d, T& minX, T& minY, T& maxX,
                    T& maxY) noexcept
{
    const PowerForm f{a, b, c, d};
    const DerivativeForm derivative = ToDerivativeForm(a, b, c);
    const point2d start = Evaluate(f, 0.0);
    Extremes box{start, start};
    for (const double t : VerticalTangents(derivative))
        box.Include(Evaluate(f, t));
    for (const double t : HorizontalTangents(derivative))
        box.Include(Evaluate(f, t));
    box.Include(Evaluate(f, 1.0));
    minX = box.least.x;
    minY = box.least.y;
    maxX = box.greatest.x;
    maxY = box.greatest.y;
}

template void GetTightBounds<double>(const point2d&, const point2d&, const point2d&, const point2d&, double&, double&,
                                     double&, double&) noexcept;

point2d MapToBezier(const point2d* bezier, double t, double offset, double scale) noexcept
{
    const PowerForm f = ToPowerForm(bezier);
    const vector2d n = Normalize(SafeBezierTangent(t, f.a, f.b, f.c, f.d));
    return Evaluate(f, t) + Perpendicular(n) * (offset * scale);
}

} // namespace ZarnMath::CubicBezier
