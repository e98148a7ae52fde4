/// @file
/// Roots of polynomials of every degree, and what the search is made of.

#include "fuzz/Oracles.h"
#include "fuzz/Targets.h"
#include "fuzz/Work.h"

#include "ZarnMath/RootFinder.h"

#include <algorithm>
#include <string>

namespace ZarnMath::Fuzzing {

namespace {

using namespace RootFinder;

template <int N>
struct Names
{
    static inline const std::string find = "FindRoots<" + std::to_string(N) + ">";
    static inline const std::string solve = "SolvePolynomial<" + std::to_string(N) + ">";
};

/// A polynomial without the zeros at both ends of its coefficients, which have no part in its other roots.
struct Stripped
{
    const double* first;
    const double* last;

    Stripped(const double* c, int degree) noexcept : first(c), last(c + degree)
    {
        while (last - first > 2 && *first == 0.0)
            ++first;
        while (last - first > 2 && *last == 0.0)
            --last;
    }

    [[nodiscard]] double At(double t) const noexcept
    {
        double value = *first;
        for (const double* c = first + 1; c <= last; ++c)
            value = *c + t * value;
        return value;
    }
};

/// Only a double root may lie beyond the unit interval: one at which the polynomial is small.
template <int N>
bool IsInUnitOrDouble(const double* c, double root) noexcept
{
    return IsInUnit(root) || std::fabs(Stripped(c, N).At(root)) < rootTolerance;
}

template <int N>
void CheckRoots(const double* c, bool includeEndpoints)
{
    Guarded<double, N + 1> roots;
    const int count = Bounded(Names<N>::find, [&] { return FindRoots<N>(c, roots.data(), includeEndpoints); });
    Require(0 <= count && count <= N + 1, "at most N + 1 roots");
    if (!includeEndpoints)
        Require(count <= N, "at most N roots within the interval");
    // A polynomial that is really quadratic may leave a root in element 0 although none counts.
    Require(roots.IsUntouchedFrom(std::max(count, 1)), "no more is written than the count says");
    if (!AreOrdinary(c, N + 1))
        return;
    for (int i = 0; i < count; ++i)
        Require(IsInUnitOrDouble<N>(c, roots[i]), "roots are in the unit interval");
    Guarded<double, N + 1> again;
    Require(FindRoots<N>(c, again.data(), includeEndpoints) == count && AreSame(&again[0], &roots[0], N + 1),
            "the same input gives the same bits");
}

template <int N>
void CheckParts(const double* c, const vector2d* polygon, int initialCount, double t)
{
    Result<int> last;
    const int changes = CrossingCount<N>(polygon, last.value);
    Require(0 <= changes && changes <= N, "at most as many changes of sign as legs");
    Require(changes > 0 ? 0 <= last.value && last.value < N : last.IsUntouched(), "the last change is one of the legs");

    vector2d left[N + 1];
    vector2d right[N + 1];
    left[0] = polygon[0];
    right[N] = polygon[N];
    SplitBezierT<N>::Split(polygon + 1, t, left, right);
    Require(IsSame(left[N], right[0]), "the two halves meet");

    double root = guard<double>;
    if (!FindSolutionNewtonsMethod<N>(c, t, rootTolerance, root))
        Require(IsSame(root, guard<double>), "without convergence nothing is written");
    const double kept = FindSolutionNewtonsMethod_Guaranteed<N>(c, t, 0.0, 1.0, rootTolerance);
    Require(IsInside(kept) || IsSame(kept, t), "the iteration ends within the bounds, or where it began");

    Guarded<double, N + 1> roots;
    for (int i = 0; i < initialCount; ++i)
        roots.data()[i] = i;
    int count = initialCount;
    Bounded(Names<N>::solve, [&] { SolvePolynomial_BezierDivide_NewtonsMethod<N>(polygon, c, roots.data(), count); });
    Require(initialCount <= count && count <= N, "the search stops once the array holds N");
    for (int i = 0; i < initialCount; ++i)
        Require(roots[i] == i, "roots are appended");
    Require(roots.IsUntouchedFrom(count), "no more is written than the count says");
}

/// (t - r) times the polynomial; with these even the random ones have roots in the interval, and clusters of them.
void MultiplyByRoot(double* c, int degree, double r) noexcept
{
    for (int i = degree; i > 0; --i)
        c[i] -= r * c[i - 1];
}

template <int N>
void FuzzDegree(Input& input)
{
    const bool includeEndpoints = input.Flag();
    double c[N + 1];
    if (input.Flag()) {
        std::fill_n(c, N + 1, 0.0);
        c[0] = input.Double();
        for (int i = 1; i <= N; ++i)
            MultiplyByRoot(c, i, input.Parameter());
        c[input.Choice(N + 1)] += std::ldexp(1.0, -input.Byte());
    } else {
        for (double& coefficient : c)
            coefficient = input.Double();
    }
    CheckRoots<N>(c, includeEndpoints);
    if constexpr (N > 2) {
        vector2d polygon[N + 1];
        PolynomialToBernsteinT<N, 0>::Convert(c, polygon);
        if (input.Flag())
            for (vector2d& p : polygon)
                p.y = input.Double();
        CheckParts<N>(c, polygon, input.Choice(N), input.Parameter());
    }
}

} // namespace

void FuzzRootFinder(Input& input)
{
    constexpr void (*degrees[])(Input&) = {FuzzDegree<2>,  FuzzDegree<3>,  FuzzDegree<4>, FuzzDegree<5>,
                                           FuzzDegree<6>,  FuzzDegree<7>,  FuzzDegree<8>, FuzzDegree<9>,
                                           FuzzDegree<10>, FuzzDegree<11>, FuzzDegree<12>};
    degrees[input.Choice(static_cast<int>(std::size(degrees)))](input);
}

} // namespace ZarnMath::Fuzzing
