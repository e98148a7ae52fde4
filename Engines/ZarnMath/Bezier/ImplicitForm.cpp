#include "ZarnMath/Bezier/Polynomial.h"
#include "ZarnMath/Bezier/PowerForm.h"
#include "ZarnMath/BezierInternal.h"

namespace ZarnMath::CubicBezier {

namespace {

/// The coefficients of f(x, y), each named after its monomial.
struct ImplicitForm
{
    double xxx, yyy, xxy, xyy;
    double xx, yy, xy;
    double x, y;
    double one;
};

/// The Bezout determinant of x(t) - x and y(t) - y, expanded by powers of x and y.
///
/// Written with U = Da + a.y*x - a.x*y, V = Db + b.y*x - b.x*y and W = Dc + c.y*x - c.x*y, it is
///
///     | AB    AC       U |
///     | AC    U + BC   V | = AB*((U + BC)*W - V^2) - AC*(AC*W - U*V) + U*(AC*V - (U + BC)*U).
///     | U     V        W |
///
/// The terms of second order in x and y collect in g, those of first order in e1 (with U), e2 (with V) and e3 (with W).
ImplicitForm ToImplicitForm(const point2d& a, const point2d& b, const point2d& c, const point2d& d) noexcept
{
    const double ab = Cross(a, b);
    const double ac = Cross(a, c);
    const double bc = Cross(b, c);
    const double da = Cross(a, d);
    const double db = Cross(b, d);
    const double dc = Cross(c, d);

    const double g = 3.0 * da + bc;
    const double e1 = ab * dc + 2.0 * ac * db - 3.0 * (da * da) - 2.0 * bc * da;
    const double e2 = 2.0 * (ac * da - ab * db);
    const double e3 = ab * (da + bc) - ac * ac;

    return {
        .xxx = -(a.y * a.y * a.y),
        .yyy = a.x * a.x * a.x,
        .xxy = 3.0 * a.x * (a.y * a.y),
        .xyy = -3.0 * (a.x * a.x) * a.y,
        .xx = ab * (a.y * c.y - b.y * b.y) + 2.0 * ac * a.y * b.y - g * (a.y * a.y),
        .yy = ab * (a.x * c.x - b.x * b.x) + 2.0 * ac * a.x * b.x - g * (a.x * a.x),
        .xy = ab * (2.0 * b.x * b.y - a.x * c.y - a.y * c.x) - 2.0 * ac * (a.x * b.y + a.y * b.x) + 2.0 * g * a.x * a.y,
        .x = a.y * e1 + b.y * e2 + c.y * e3,
        .y = -(a.x * e1 + b.x * e2 + c.x * e3),
        .one = ab * (da + bc) * dc - ab * (db * db) - ac * ac * dc + 2.0 * ac * da * db - da * da * da - bc * (da * da),
    };
}

/// f(x(t), y(t)), arranged as x*(...) + y*(...) + K1, so that no product is of a higher degree than it has to be.
Polynomial<9> Substitute(const ImplicitForm& k, const Polynomial<3>& x, const Polynomial<3>& y) noexcept
{
    const Polynomial<6> xx = x * x;
    const Polynomial<6> xy = x * y;
    const Polynomial<6> yy = y * y;
    const Polynomial<6> withX = k.xxx * xx + k.xxy * xy + (k.xx * x + k.xy * y) + Polynomial<0>{{k.x}};
    const Polynomial<6> withY = k.yyy * yy + k.xyy * xy + k.yy * y + Polynomial<0>{{k.y}};
    return x * withX + y * withY + Polynomial<0>{{k.one}};
}

} // namespace

void ConvertBezierToImplicit(const point2d& a, const point2d& b, const point2d& c, const point2d& d, double& Kxxx,
                             double& Kyyy, double& Kxxy, double& Kxyy, double& Kxx, double& Kyy, double& Kxy,
                             double& Kx, double& Ky, double& K1) noexcept
{
    const ImplicitForm k = ToImplicitForm(a, b, c, d);
    Kxxx = k.xxx;
    Kyyy = k.yyy;
    Kxxy = k.xxy;
    Kxyy = k.xyy;
    Kxx = k.xx;
    Kyy = k.yy;
    Kxy = k.xy;
    Kx = k.x;
    Ky = k.y;
    K1 = k.one;
}

void GetBezierIntersectionPolynomial(const point2d& a1, const point2d& b1, const point2d& c1, const point2d& d1,
                                     const point2d& a2, const point2d& b2, const point2d& c2, const point2d& d2,
                                     double* polynomial) noexcept
{
    const Polynomial<9> p = Substitute(ToImplicitForm(a1, b1, c1, d1), Polynomial<3>{{a2.x, b2.x, c2.x, d2.x}},
                                       Polynomial<3>{{a2.y, b2.y, c2.y, d2.y}});
    for (int i = 0; i <= 9; ++i)
        polynomial[i] = p.c[i];
}

} // namespace ZarnMath::CubicBezier
