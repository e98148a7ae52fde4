/// @file
/// Newton's method on several roots of one polynomial at once. Internal.
///
/// Each step of Horner's rule waits for the one before, so that a single root leaves most of the processor idle. Roots
/// that are isolated already do not depend on each other and fill that time. A branch on whether a root has been found
/// would make the processor wait too: nearly all need three or four steps, so that the first four are taken blindly, and
/// the iterate that `FindSolutionNewtonsMethod_Guaranteed` would have ended with is picked afterwards.
#pragma once

#include "ZarnMath/RootFinder.h"

#include <algorithm>

namespace ZarnMath::RootFinder {

/// A bracket with a single sign change: its root has a place among the roots before it is polished.
struct Crossing
{
    double start; ///< where the chord of the polygon's leg meets zero
    double lower;
    double upper;
    int place;
};

/// Two roots on their way, in the two halves of a pair.
class RootPair
{
public:
    /// More steps than these are left to the plain method.
    static constexpr int mostSteps = 8;

    RootPair() = default;

    RootPair(double first, double second) noexcept
        : t{first, second}, length(Both(1.0)), isShrinking(t == t), longSteps{}
    {}

    /// The last iterate.
    [[nodiscard]] const Pair& Last() const noexcept
    {
        return t;
    }

    /// Takes an iterate down. The search ends at the first step below the tolerance; those before it have to shrink.
    void Append(int step, const Pair& next) noexcept
    {
        const Pair tolerance = Both(rootTolerance);
        const Pair nextLength = Absolute(t - next);
        isShrinking &= nextLength < (length > tolerance ? length : tolerance);
        longSteps -= nextLength >= tolerance;
        length = nextLength;
        t = next;
        iterates[step] = next;
    }

    /// Whether a root has not converged yet. False for NaN.
    [[nodiscard]] PairMask IsOpen() const noexcept
    {
        return length >= Both(rootTolerance);
    }

    /// @param[out] root where the search of that half has ended
    /// @return whether it has, in the ordinary course
    [[nodiscard]] bool HasConverged(int half, double& root) const noexcept
    {
        if (isShrinking[half] == 0 || !(length[half] < rootTolerance))
            return false;
        root = iterates[longSteps[half]][half];
        return true;
    }

private:
    Pair t;
    Pair length;          ///< of the step to the last iterate
    PairMask isShrinking; ///< no step that was long has been longer than the one before
    PairMask longSteps;   ///< how many were not below the tolerance
    Pair iterates[mostSteps];
};

/// A polynomial and its derivative, each coefficient in both halves of a pair.
template <int N>
struct PairedPolynomial
{
    Pair value[N + 1];
    Pair slope[N];

    explicit PairedPolynomial(const double* c) noexcept
    {
#pragma GCC unroll 16
        for (int i = 0; i < N; ++i) {
            value[i] = Both(c[i]);
            slope[i] = value[i] * Both(N - i);
        }
        value[N] = Both(c[N]);
    }
};

/// One step of Newton's method on each of the roots.
template <int N, int Pairs>
[[gnu::always_inline]] inline void StepTogether(const PairedPolynomial<N>& p, int step, RootPair* pairs) noexcept
{
    Pair value[Pairs];
    Pair slope[Pairs];
#pragma GCC unroll 4
    for (int k = 0; k < Pairs; ++k) {
        value[k] = p.value[0];
        slope[k] = p.slope[0];
    }
#pragma GCC unroll 16
    for (int i = 1; i < N; ++i) {
#pragma GCC unroll 4
        for (int k = 0; k < Pairs; ++k) {
            value[k] = p.value[i] + pairs[k].Last() * value[k];
            slope[k] = p.slope[i] + pairs[k].Last() * slope[k];
        }
    }
#pragma GCC unroll 4
    for (int k = 0; k < Pairs; ++k) {
        const Pair t = pairs[k].Last();
        pairs[k].Append(step, t - (p.value[N] + t * value[k]) / slope[k]);
    }
}

/// Polishes `count` crossings, more than 2*Pairs - 2 and at most 2*Pairs.
template <int N, int Pairs>
void PolishTogether(const double* c, const Crossing* crossings, int count, double* roots) noexcept
{
    constexpr int blindSteps = 4;
    const PairedPolynomial<N> polynomial(c);
    RootPair pairs[Pairs];
#pragma GCC unroll 4
    for (int k = 0; k < Pairs; ++k)
        pairs[k] = RootPair(crossings[2 * k].start, crossings[std::min(2 * k + 1, count - 1)].start);
#pragma GCC unroll 4
    for (int step = 0; step < blindSteps; ++step)
        StepTogether<N, Pairs>(polynomial, step, pairs);
    for (int step = blindSteps; step < RootPair::mostSteps; ++step) {
        if (!IsAny(pairs[0].IsOpen() | pairs[Pairs - 1].IsOpen()))
            break;
        StepTogether<N, Pairs>(polynomial, step, pairs);
    }
    for (int i = 0; i < count; ++i) {
        const auto& [start, lower, upper, place] = crossings[i];
        double& root = roots[place];
        if (!pairs[i / 2].HasConverged(i % 2, root) || !(lower < root && root < upper)) [[unlikely]]
            root = FindSolutionNewtonsMethod_Guaranteed<N>(c, start, lower, upper, rootTolerance);
    }
}

/// Polishes all crossings, four at a time; the roots go to their places. Alone and of a high degree, a root is left to the
/// plain method: a step too many would take longer than the branch.
template <int N>
void Polish(const double* c, const Crossing* crossings, int count, double* roots) noexcept
{
    constexpr int highestBlindDegree = 5;
    for (; count > 2; crossings += 4, count -= 4)
        PolishTogether<N, 2>(c, crossings, std::min(count, 4), roots);
    if (N > highestBlindDegree && count == 1) {
        const auto& [start, lower, upper, place] = crossings[0];
        roots[place] = FindSolutionNewtonsMethod_Guaranteed<N>(c, start, lower, upper, rootTolerance);
    } else if (count > 0) {
        PolishTogether<N, 1>(c, crossings, count, roots);
    }
}

} // namespace ZarnMath::RootFinder
