#include "ZarnMath/Bezier/Polynomial.h"
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/FitBezierInternal.h"
#include "ZarnMath/RootFinder.h"

#include <algorithm>
#include <optional>

namespace ZarnMath {

namespace {

using CubicBezier::Polynomial;

/// A root that Newton's method finds farther away than this from where it started may be that of another branch.
constexpr double longestTrustedMove = 0.02;
constexpr double newtonTolerance = 1e-5;
constexpr int newtonPasses = 200;

double Square(double x) noexcept
{
    return x * x;
}

/// A cubic, with what of the stationarity of the distance does not depend on the point.
class TrialCurve
{
public:
    explicit TrialCurve(const point2d* bezier) noexcept
        : f(CubicBezier::ToPowerForm(bezier)), k5(3.0 * Dot(f.a, f.a)), k4(5.0 * Dot(f.b, f.a)),
          k3(4.0 * Dot(f.c, f.a) + 2.0 * Dot(f.b, f.b)), bc(Dot(f.b, f.c)), cc(Dot(f.c, f.c))
    {}

    /// (B(t) - p) . B'(t), half the derivative of the squared distance.
    [[nodiscard]] Polynomial<5> Stationarity(const point2d& p) const noexcept
    {
        const vector2d q = f.d - p;
        return {{k5, k4, k3, 3.0 * (bc + Dot(q, f.a)), cc + 2.0 * Dot(q, f.b), Dot(q, f.c)}};
    }

    [[nodiscard]] double DistanceSquared(double t, const point2d& p) const noexcept
    {
        return LengthSquared(CubicBezier::Evaluate(f, t) - p);
    }

    /// The largest square by which the curve exceeds a box on one side.
    [[nodiscard]] double OvershootSquared(const BoundsT<double>& box) const noexcept;

private:
    CubicBezier::PowerForm f;
    double k5;
    double k4;
    double k3;
    double bc;
    double cc;
};

double TrialCurve::OvershootSquared(const BoundsT<double>& box) const noexcept
{
    double minX = 0.0;
    double minY = 0.0;
    double maxX = 0.0;
    double maxY = 0.0;
    CubicBezier::GetTightBounds(f.a, f.b, f.c, f.d, minX, minY, maxX, maxY);
    double largest = 0.0;
    if (minX < box.left)
        largest = std::max(largest, Square(box.left - minX));
    if (minY < box.bottom)
        largest = std::max(largest, Square(box.bottom - minY));
    if (maxX > box.right)
        largest = std::max(largest, Square(maxX - box.right));
    if (maxY > box.top)
        largest = std::max(largest, Square(maxY - box.top));
    return largest;
}

/// The root of the stationarity near `start`, by Newton's method as long as its steps shrink.
std::optional<double> FindNearRoot(const Polynomial<5>& polynomial, double start) noexcept
{
    const auto& [k5, k4, k3, k2, k1, k0] = polynomial.c;
    double t = start;
    double previous = 1.0;
    for (int budget = newtonPasses;; --budget) {
        const double slope = k1 + t * (2.0 * k2 + t * (3.0 * k3 + t * (4.0 * k4 + 5.0 * k5 * t)));
        if (slope == 0.0)
            return std::nullopt;
        const double next = t - (t * (k1 + t * (k2 + t * (k3 + t * (k4 + k5 * t)))) + k0) / slope;
        const double step = std::fabs(t - next);
        if (step < newtonTolerance) {
            if (next <= 1.0 && next >= 0.0 && std::fabs(next - start) < longestTrustedMove)
                return next;
            return std::nullopt;
        }
        if (budget < 2 || !(step < previous))
            return std::nullopt;
        previous = step;
        t = next;
    }
}

/// The largest squared distance, and the parameter that it is found at.
struct WorstPoint
{
    double error;
    double* parameter;

    void Report(double distanceSquared, double t) noexcept
    {
        if (!(distanceSquared > error))
            return;
        error = distanceSquared;
        if (parameter != nullptr)
            *parameter = t;
    }
};

/// Moves a parameter to that of the closest stationary point in (0, 1); without any it stays, and the point does not
/// count.
void MoveToClosestRoot(const TrialCurve& curve, const Polynomial<5>& stationarity, const point2d& p, double& u,
                       WorstPoint& worst) noexcept
{
    double roots[6];
    const int count = RootFinder::FindRoots<5>(stationarity.c, roots, false);
    if (count == 0)
        return;
    double best = std::numeric_limits<double>::max();
    for (int i = 0; i < count; ++i) {
        const double distanceSquared = curve.DistanceSquared(roots[i], p);
        if (distanceSquared < best) {
            best = distanceSquared;
            u = roots[i];
        }
    }
    worst.Report(best, u);
}

} // namespace

void Calculate_u(const point2d* points, int count, std::vector<double>& u)
{
    u.resize(static_cast<std::size_t>(count));
    std::vector<double> lengths(static_cast<std::size_t>(count - 1));
    double total = 0.0;
    for (std::size_t i = 0; i < lengths.size(); ++i) {
        lengths[i] = std::sqrt(LengthSquared(points[i] - points[i + 1]));
        total += lengths[i];
    }
    u.front() = 0.0;
    if (count >= 3) {
        const double scale = 1.0 / total;
        for (std::size_t i = 0; i + 1 < lengths.size(); ++i)
            u[i + 1] = u[i] + scale * lengths[i];
    }
    u.back() = 1.0;
}

double Reparameterize_u(const point2d* points, const point2d* bezier, double* u, int count, double* worst_u,
                        const BoundsT<double>& bounds) noexcept
{
    const TrialCurve curve(bezier);
    const int first = u[0] == 0.0 ? 1 : 0;
    const int end = u[count - 1] == 1.0 ? count - 1 : count;
    WorstPoint worst{0.0, worst_u};
    for (int i = first; i < end; ++i) {
        const Polynomial<5> stationarity = curve.Stationarity(points[i]);
        if (const auto root = FindNearRoot(stationarity, u[i])) {
            u[i] = *root;
            worst.Report(curve.DistanceSquared(*root, points[i]), *root);
        } else {
            MoveToClosestRoot(curve, stationarity, points[i], u[i], worst);
        }
    }
    return std::max(worst.error, curve.OvershootSquared(bounds));
}

} // namespace ZarnMath
