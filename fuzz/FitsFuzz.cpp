/// @file
/// Cubics and a parabola fitted to points.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include "ZarnMath/Bounds.h"
#include "ZarnMath/FitBezierInternal.h"

#include <algorithm>
#include <stdexcept>

namespace ZarnMath::Fuzzing {

namespace {

constexpr double noFit = std::numeric_limits<double>::max();

/// What a fit is asked for.
struct Task
{
    std::vector<point2d> points;
    std::vector<double> u;
    vector2d t1;
    vector2d t2;
    int iterations;
    double threshold;

    [[nodiscard]] int Count() const noexcept
    {
        return static_cast<int>(points.size());
    }

    /// Points times passes.
    [[nodiscard]] double Size() const noexcept
    {
        return static_cast<double>(points.size() + 1) * (iterations + 1);
    }
};

/// Calls a function that has to raise the length error.
template <typename Call>
void RequireLengthError(Call call)
{
    bool isRaised = false;
    try {
        call();
    } catch (const std::length_error&) {
        isRaised = true;
    }
    Require(isRaised, "a size that there cannot be raises the length error");
}

bool RunFromZeroToOne(const std::vector<double>& u) noexcept
{
    return u.front() == 0.0 && u.back() == 1.0;
}

void CheckParameters(const Task& task)
{
    std::vector<double> u;
    const int count = task.Count();
    if (count < 1) {
        RequireLengthError([&] { Calculate_u(task.points.data(), count, u); });
        return;
    }
    Bounded(
        "Calculate_u", [&] { Calculate_u(task.points.data(), count, u); }, count);
    Require(static_cast<int>(u.size()) == count, "a parameter for each point");
    Require(u.back() == 1.0 && (count == 1 || u.front() == 0.0), "they run from 0 to 1");
    if (AreOrdinary(task.points.data(), count) && count > 1 && u[1] == u[1])
        for (std::size_t i = 1; i + 1 < u.size(); ++i)
            Require(u[i - 1] <= u[i] && u[i] <= 1.0 + 1e-9, "in ascending order");
}

void CheckTangentFit(const Task& task, bool wantsWorst)
{
    const int count = task.Count();
    std::vector<double> u = task.u;
    Guarded<point2d, 4> curve;
    Result<double> worst;
    const double error = Bounded(
        "LeastSquares with tangents",
        [&] {
            return LeastSquares(task.points.data(), u.data(), count, task.t1, task.t2, curve.data(), task.iterations,
                                wantsWorst ? &worst.value : nullptr, task.threshold);
        },
        task.Size());
    Require(curve.IsIntact(), "four points");
    Require(error >= 0.0, "the error is a square");
    if (count < 2)
        Require(error == noFit && curve.IsUntouched(), "there is nothing to fit");
    else
        Require(IsSame(curve[0], task.points.front()) && IsSame(curve[3], task.points.back()), "the ends are exact");
    if (count <= 2)
        Require(AreSame(u, task.u) && worst.IsUntouched(), "the parameters are left alone");
    else
        Require(RunFromZeroToOne(u), "the parameters run from 0 to 1");

    if (count < 1)
        return;
    Guarded<point2d, 4> byLength;
    const double sameError =
        LeastSquares(task.points.data(), count, task.t1, task.t2, byLength.data(), task.iterations);
    Require(byLength.IsIntact() && sameError >= 0.0, "four points, and an error that is a square");
}

void CheckFreeFit(const Task& task, bool wantsWorst)
{
    const int count = task.Count();
    std::vector<double> u = task.u;
    Guarded<point2d, 4> curve;
    Result<double> worst;
    const double error = Bounded(
        "LeastSquares with free ends",
        [&] {
            return LeastSquares(task.points.data(), u.data(), count, curve.data(), task.iterations,
                                wantsWorst ? &worst.value : nullptr);
        },
        task.Size());
    Require(curve.IsIntact() && error >= 0.0, "four points, and an error that is a square");
    if (count < 2)
        Require(error == noFit && curve.IsUntouched(), "there is nothing to fit");
    if (count == 2)
        Require(error == 0.0 && AreSame(u, task.u), "two points have their chord");
    if (count > 2)
        Require(RunFromZeroToOne(u), "the parameters run from 0 to 1");
    if (count > 0)
        (void)LeastSquares(task.points.data(), count, curve.data(), task.iterations);
    else
        RequireLengthError([&] { (void)LeastSquares(task.points.data(), count, curve.data(), task.iterations); });
}

void CheckJointFit(const Task& task, int split)
{
    const int count = task.Count();
    std::vector<double> u = task.u;
    Guarded<point2d, 4> a;
    Guarded<point2d, 4> b;
    if (count >= 5 && (split < 0 || split > count)) {
        RequireLengthError([&] {
            (void)LeastSquares(task.points.data(), u.data(), count, split, task.t1, task.t2, a.data(), b.data(),
                               task.iterations);
        });
        return;
    }
    if (count >= 5 && (split == 0 || split == count))
        return; // neither half may be empty
    const double error = Bounded(
        "LeastSquares of two cubics",
        [&] {
            return LeastSquares(task.points.data(), u.data(), count, split, task.t1, task.t2, a.data(), b.data(),
                                task.iterations);
        },
        task.Size());
    Require(a.IsIntact() && b.IsIntact() && error >= 0.0, "four points each, and an error that is a square");
    if (count < 5)
        Require(error == noFit && a.IsUntouched() && b.IsUntouched(), "there is nothing to fit");
    if (count >= 1)
        (void)LeastSquares(task.points.data(), count, split, task.t1, task.t2, a.data(), b.data(), task.iterations);
}

void CheckSingleSteps(const Task& task, int split)
{
    const int count = task.Count();
    if (count < 1)
        return;
    const point2d* points = task.points.data();
    const double* u = task.u.data();
    Guarded<point2d, 4> curve;
    (void)Bounded(
        "LeastSquaresSingleIteration with tangents",
        [&] { return LeastSquaresSingleIteration(points, u, count, task.t1, task.t2, curve.data()); }, count);
    Require(curve.IsIntact(), "four points");
    Guarded<point2d, 4> freeCurve;
    const bool solved = Bounded(
        "LeastSquaresSingleIteration", [&] { return LeastSquaresSingleIteration(points, u, count, freeCurve.data()); },
        count);
    Require(solved ? freeCurve.IsIntact() : freeCurve.IsUntouched(), "untouched where the system is singular");

    std::vector<double> moved = task.u;
    Result<double> worst;
    const double error = Bounded(
        "Reparameterize_u",
        [&] {
            return Reparameterize_u(points, curve.data(), moved.data(), count, &worst.value,
                                    GetPointsBBox(points, count));
        },
        count);
    Require(error >= 0.0, "the error is a square");
    if (task.u.front() == 0.0)
        Require(moved.front() == 0.0, "a first parameter of 0 is pinned");
    if (task.u.back() == 1.0)
        Require(moved.back() == 1.0, "a last parameter of 1 is pinned");

    if (split < 1 || split >= count)
        return;
    Guarded<point2d, 4> a;
    Guarded<point2d, 4> b;
    if (!LeastSquaresSingleIteration_2Cubics(points, task.t1, task.t2, count, split, u, u + split, a.data(), b.data()))
        Require(a.IsUntouched() && b.IsUntouched(), "untouched where the system is singular");
    Require(a.IsIntact() && b.IsIntact(), "four points each");
}

void CheckParabola(const Task& task)
{
    Appended<double> coefficients;
    const bool made = Bounded(
        "LeastSquares of a parabola",
        [&] { return LeastSquares(task.points.data(), task.points.size(), coefficients.Vector()); },
        static_cast<double>(task.points.size() + 1));
    Require(coefficients.IsAppended() && coefficients.Count() == (made ? 3 : 0), "three numbers are appended, or none");
    Require(!made || task.Count() >= 3, "it takes three points");
}

} // namespace

void FuzzFits(Input& input)
{
    constexpr int mostPoints = 24;
    constexpr int mostPasses = 12;
    const int count = input.Choice(mostPoints + 1);
    Task task;
    task.iterations = 1 + input.Choice(mostPasses);
    const bool wantsWorst = input.Flag();
    const int split = input.Choice(count + 5) - 2;
    task.threshold = input.Flag() ? -1.0 : input.Double();
    task.t1 = input.Vector();
    task.t2 = input.Vector();
    task.points = input.Points(count);
    const bool byLength = input.Flag() && count > 0;
    if (byLength)
        Calculate_u(task.points.data(), count, task.u);
    while (task.u.size() < task.points.size())
        task.u.push_back(input.Parameter());
    CheckParameters(task);
    CheckTangentFit(task, wantsWorst);
    CheckFreeFit(task, wantsWorst);
    CheckJointFit(task, split);
    CheckSingleSteps(task, split);
    CheckParabola(task);
}

} // namespace ZarnMath::Fuzzing
