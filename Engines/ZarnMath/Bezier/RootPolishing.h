/// @file
/// Newton's method on several roots of one polynomial at once. Internal.
///
/// Each step of Horner's rule waits for the one before, so that a single root leaves most of the processor idle. Roots
/// that are isolated already do not depend on each other and fill that time. Every one of them takes the very steps of
/// `FindSolutionNewtonsMethod_Guaranteed`.
#pragma once

#include "ZarnMath/RootFinder.h"

namespace ZarnMath::RootFinder {

/// A bracket with a single sign change: its root has a place among the roots before it is polished.
struct Crossing
{
    double start; ///< where the chord of the polygon's leg meets zero
    double lower;
    double upper;
    int place;
};

/// Two crossings on their way, in the two halves of a pair.
struct CrossingPair
{
    Pair start;
    Pair lower;
    Pair upper;
    Pair t;
    Pair previous;
    Pair root;
    PairMask isOpen;

    CrossingPair() = default;

    CrossingPair(const Crossing& first, const Crossing& second) noexcept
        : start{first.start, second.start}, lower{first.lower, second.lower}, upper{first.upper, second.upper},
          t(start), previous(Both(1.0)), root(start), isOpen(t == t)
    {}

    /// Closes the halves in the mask, with a value that counts where it lies strictly within the bounds.
    void Close(PairMask which, Pair value) noexcept
    {
        const PairMask counts = isOpen & which & (lower < value) & (value < upper);
        root = counts ? value : root;
        isOpen &= ~which;
    }

    /// Takes the next iterate, or closes. A crossing that has been closed goes on idly: its root stands.
    void Advance(Pair value, Pair slope) noexcept
    {
        const Pair next = t - value / slope;
        const Pair delta = Absolute(t - next);
        const PairMask hasSlope = slope != Both(0.0);
        const PairMask hasConverged = delta < Both(rootTolerance);
        Close(~hasSlope, start);
        Close(hasConverged, next);
        Close(delta >= previous, t);
        Close(delta != delta, start);
        previous = delta;
        t = next;
    }
};

/// A polynomial and its derivative, each coefficient in both halves of a pair.
template <int N>
struct PairedPolynomial
{
    Pair value[N + 1];
    Pair slope[N];

    explicit PairedPolynomial(const double* c) noexcept
    {
        const Derivative<N> derivative(c);
#pragma GCC unroll 16
        for (int i = 0; i < N; ++i) {
            value[i] = Both(c[i]);
            slope[i] = Both(derivative.c[i]);
        }
        value[N] = Both(c[N]);
    }
};

/// One step of Newton's method on each of the crossings.
template <int N, int Pairs>
[[gnu::always_inline]] inline void AdvanceTogether(const PairedPolynomial<N>& p, CrossingPair* pairs) noexcept
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
            value[k] = p.value[i] + pairs[k].t * value[k];
            slope[k] = p.slope[i] + pairs[k].t * slope[k];
        }
    }
#pragma GCC unroll 4
    for (int k = 0; k < Pairs; ++k)
        pairs[k].Advance(p.value[N] + pairs[k].t * value[k], slope[k]);
}

/// Polishes `count` crossings, 2*Pairs - 1 or more, and at most 2*Pairs of them.
template <int N, int Pairs>
void PolishTogether(const double* c, const Crossing* crossings, int count, double* roots) noexcept
{
    const PairedPolynomial<N> polynomial(c);
    CrossingPair pairs[Pairs];
    PairMask isOpen{};
#pragma GCC unroll 4
    for (int k = 0; k < Pairs; ++k) {
        pairs[k] = CrossingPair(crossings[2 * k], crossings[2 * k + 1 < count ? 2 * k + 1 : 2 * k]);
        isOpen |= pairs[k].isOpen;
    }
    for (int stepsLeft = 100; stepsLeft > 0 && IsAny(isOpen); --stepsLeft) {
        AdvanceTogether<N, Pairs>(polynomial, pairs);
        isOpen = pairs[0].isOpen | pairs[Pairs - 1].isOpen;
    }
#pragma GCC unroll 4
    for (int k = 0; k < Pairs; ++k) {
        pairs[k].Close(pairs[k].isOpen, pairs[k].t);
        roots[crossings[2 * k].place] = pairs[k].root[0];
        if (2 * k + 1 < count)
            roots[crossings[2 * k + 1].place] = pairs[k].root[1];
    }
}

/// Polishes all crossings, four at a time; the roots go to their places.
template <int N>
void Polish(const double* c, const Crossing* crossings, int count, double* roots) noexcept
{
    for (; count > 2; crossings += 4, count -= 4)
        PolishTogether<N, 2>(c, crossings, count, roots);
    if (count == 2)
        PolishTogether<N, 1>(c, crossings, count, roots);
    if (count == 1)
        roots[crossings->place] = FindSolutionNewtonsMethod_Guaranteed<N>(c, crossings->start, crossings->lower,
                                                                          crossings->upper, rootTolerance);
}

} // namespace ZarnMath::RootFinder
