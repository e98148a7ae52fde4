// Roots in (0, 1) of polynomials from random Bernstein coefficients in [-1, 1]. lib2geom takes the Bernstein coefficients
// themselves; GSL finds all complex roots, of which the real ones in the interval are kept.

#include "ZarnMath/RootFinder.h"
#include "benchmarks/peers/Questions.h"
#include "benchmarks/peers/Truth.h"

#include <2geom/bezier.h>
#include <gsl/gsl_poly.h>

#include <memory>

namespace ZarnMath::Peers {
namespace {

using namespace Benchmarks;

/// The search for the right answers takes longer than all that is measured: the first polynomials have to do.
constexpr std::ptrdiff_t comparedPolynomials = 500;

/// Roots that are not found, or are not near one that was.
struct Comparison
{
    double found = 0.0;
    double missed = 0.0;
    double largestError = 0.0;

    template <typename Roots>
    void Compare(const std::vector<double>& truth, const Roots& roots)
    {
        constexpr double near = 1e-5;
        found += static_cast<double>(std::size(roots));
        for (const double expected : truth) {
            double error = 1.0;
            for (const double root : roots)
                error = std::min(error, std::fabs(root - expected));
            if (error < near)
                largestError = std::max(largestError, error);
            else
                missed += 1.0;
        }
    }

    [[nodiscard]] Measures Report(std::size_t polynomials) const
    {
        return {{"roots each", found / static_cast<double>(polynomials)},
                {"missed", missed},
                {"largest error", largestError}};
    }
};

template <int N>
struct Roots
{
    std::array<double, N> values;
    int count;

    [[nodiscard]] const double* begin() const
    {
        return values.data();
    }

    [[nodiscard]] const double* end() const
    {
        return values.data() + count;
    }

    [[nodiscard]] std::size_t size() const
    {
        return static_cast<std::size_t>(count);
    }
};

template <int N>
Roots<N> SolveByGsl(const std::array<double, N + 1>& risingPowers, gsl_poly_complex_workspace* workspace)
{
    constexpr double realEnough = 1e-7;
    std::array<double, 2 * N> complexRoots;
    Roots<N> roots{{}, 0};
    if (gsl_poly_complex_solve(risingPowers.data(), N + 1, workspace, complexRoots.data()) != 0)
        return roots;
    for (std::size_t i = 0; i < complexRoots.size(); i += 2)
        if (complexRoots[i] > 0.0 && complexRoots[i] < 1.0 && std::fabs(complexRoots[i + 1]) < realEnough)
            roots.values[static_cast<std::size_t>(roots.count++)] = complexRoots[i];
    return roots;
}

template <int N, typename Find>
Roots<N> Collect(const std::array<double, N + 1>& c, Find find)
{
    // One more than the roots that can be: the finder may note one twice before it compares.
    double room[N + 1];
    Roots<N> roots;
    roots.count = find(c.data(), room, false);
    std::copy_n(room, roots.count, roots.values.begin());
    return roots;
}

template <int N>
Roots<N> FindRoots(const std::array<double, N + 1>& fallingPowers)
{
    return Collect<N>(fallingPowers, RootFinder::FindRoots<N>);
}

template <int N>
Roots<N> FindRootsPlainly(const std::array<double, N + 1>& fallingPowers)
{
    return Collect<N>(fallingPowers, Literal::FindRoots<N>);
}

template <int N>
void AskForRootsOfDegree()
{
    const auto polygons = RandomPolygons<N>();
    const auto truths = TrueRoots<N>({polygons.begin(), polygons.begin() + comparedPolynomials});
    Question question("roots of degree " + std::to_string(N), polygons.size());
    const auto add = [&](const char* library, const char* setting, auto answer) {
        Comparison comparison;
        for (std::size_t i = 0; i < truths.size(); ++i)
            comparison.Compare(truths[i], answer(i));
        question.Add(library, setting, answer, comparison.Report(truths.size()));
    };

    std::vector<std::array<double, N + 1>> fallingPowers;
    std::vector<std::array<double, N + 1>> risingPowers;
    std::vector<Geom::Bezier> beziers;
    for (const auto& polygon : polygons) {
        fallingPowers.push_back(ToFallingPowers<N>(polygon));
        risingPowers.push_back(fallingPowers.back());
        std::reverse(risingPowers.back().begin(), risingPowers.back().end());
        beziers.emplace_back(std::vector<double>(polygon.begin(), polygon.end()));
    }

    add("ZarnMath", "", [&](std::size_t i) { return FindRoots<N>(fallingPowers[i]); });
    add("ZarnMath", "plain form", [&](std::size_t i) { return FindRootsPlainly<N>(fallingPowers[i]); });
    add("lib2geom", "", [&](std::size_t i) { return beziers[i].roots(); });
    const std::unique_ptr<gsl_poly_complex_workspace, decltype(&gsl_poly_complex_workspace_free)> workspace(
        gsl_poly_complex_workspace_alloc(N + 1), gsl_poly_complex_workspace_free);
    add("GSL", "", [&](std::size_t i) { return SolveByGsl<N>(risingPowers[i], workspace.get()); });
    question.Ask();
}

template <int N>
bool CrossesOnce(const Ordinates<N>& polygon)
{
    int changes = 0;
    for (std::size_t i = 0; i < N; ++i)
        changes += polygon[i] * polygon[i + 1] < 0.0 ? 1 : 0;
    return changes == 1;
}

/// Polygons with one change of sign: each has one root, which is polished without a cut. There are enough of them for no
/// branch to be known by heart.
template <int N>
void AskForRootOfOneCrossing()
{
    std::vector<std::array<double, N + 1>> polynomials;
    for (const auto& polygon : RandomPolygons<N>(10 * corpusSize))
        if (CrossesOnce<N>(polygon))
            polynomials.push_back(ToFallingPowers<N>(polygon));
    Question question("one crossing, degree " + std::to_string(N), polynomials.size());
    question.Add("ZarnMath", "", [&](std::size_t i) { return FindRoots<N>(polynomials[i]); });
    question.Add("ZarnMath", "plain form", [&](std::size_t i) { return FindRootsPlainly<N>(polynomials[i]); });
    question.Ask();
}

template <int... Degrees>
void AskForRootsOfDegrees(std::integer_sequence<int, Degrees...> /*from 0 on*/)
{
    (AskForRootsOfDegree<Degrees + 3>(), ...);
}

} // namespace

void AskForRoots()
{
    AskForRootsOfDegrees(std::make_integer_sequence<int, 10>());
    AskForRootOfOneCrossing<3>();
    AskForRootOfOneCrossing<5>();
    AskForRootOfOneCrossing<9>();
}

} // namespace ZarnMath::Peers
