#include "ZarnMath/Bezier/Pair.h"
#include "ZarnMath/Bezier/Polynomial.h"
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/FitBezierInternal.h"
#include "ZarnMath/RootFinder.h"

#include <algorithm>

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
struct TrialCurve
{
    CubicBezier::PowerForm f;
    double k5;
    double k4;
    double k3;
    double bc;
    double cc;

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

/// The roots of the stationarity of two points near their parameters, by Newton's method as long as its steps shrink.
///
/// Each operation of Newton's method waits for the one before, and points do not depend on each other.
class NearRoots
{
public:
    NearRoots(const TrialCurve& trial, const point2d& p, const point2d& q, double pStart, double qStart) noexcept
        : curve(trial), start{pStart, qStart}, t(start)
    {
        const auto& [a, b, c, d] = curve.f;
        const Pair x = d.x - Pair{p.x, q.x};
        const Pair y = d.y - Pair{p.y, q.y};
        k2 = 3.0 * (curve.bc + (x * a.x + y * a.y));
        k1 = curve.cc + 2.0 * (x * b.x + y * b.y);
        k0 = x * c.x + y * c.y;
    }

    /// Those whose search goes on. A NaN is not among them.
    [[nodiscard]] const PairMask& Open() const noexcept
    {
        return isOpen;
    }

    void Step() noexcept
    {
        const auto& [f, k5, k4, k3, bc, cc] = curve;
        // A slope of 0 makes a step that is infinite or NaN, and does not shrink.
        const Pair slope = k1 + t * (2.0 * k2 + t * (3.0 * k3 + t * (4.0 * k4 + 5.0 * k5 * t)));
        const Pair next = t - (t * (k1 + t * (k2 + t * (k3 + t * (k4 + k5 * t)))) + k0) / slope;
        const Pair step = Absolute(t - next);
        t = isOpen ? next : t;
        hasConverged |= isOpen & (step < newtonTolerance);
        isOpen &= (step >= newtonTolerance) & (step < previous);
        previous = step;
    }

    /// @param[out] root where the search of that half has ended
    /// @return whether it has converged to a place that can be trusted
    [[nodiscard]] bool HasFound(int half, double& root) const noexcept
    {
        root = t[half];
        return hasConverged[half] != 0 && root <= 1.0 && root >= 0.0 &&
               std::fabs(root - start[half]) < longestTrustedMove;
    }

private:
    const TrialCurve& curve;
    Pair k2;
    Pair k1;
    Pair k0;
    Pair start;
    Pair t;
    Pair previous = Both(1.0);
    PairMask hasConverged{};
    PairMask isOpen = ~hasConverged;
};

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
void MoveToClosestRoot(const TrialCurve& curve, const point2d& p, double& u, WorstPoint& worst) noexcept
{
    double roots[6];
    const int count = RootFinder::FindRoots<5>(curve.Stationarity(p).c, roots, false);
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

/// Moves the parameters of up to four points, which is as many as Newton's method takes in the time of one.
void MoveFour(const TrialCurve& curve, const point2d* points, double* u, int count, WorstPoint& worst) noexcept
{
    const auto search = [=, &curve](int i) {
        const int k = std::min(i, count - 1); // the last point stands in for one that is missing
        const int l = std::min(i + 1, count - 1);
        return NearRoots(curve, points[k], points[l], u[k], u[l]);
    };
    NearRoots pairs[2] = {search(0), search(2)};
    for (int budget = newtonPasses; budget > 0 && IsAny(pairs[0].Open() | pairs[1].Open()); --budget)
        for (NearRoots& pair : pairs)
            pair.Step();
    for (int i = 0; i < count; ++i) {
        double root;
        if (pairs[i / 2].HasFound(i % 2, root)) {
            u[i] = root;
            worst.Report(curve.DistanceSquared(root, points[i]), root);
        } else {
            MoveToClosestRoot(curve, points[i], u[i], worst);
        }
    }
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
    for (int i = first; i < end; i += 4)
        MoveFour(curve, points + i, u + i, std::min(4, end - i), worst);
    return std::max(worst.error, curve.OvershootSquared(bounds));
}

} // namespace ZarnMath
