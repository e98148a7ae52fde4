// A matrix on an array of points, in place, beside Eigen, a loop written by hand for this very processor, and a copy of the
// same bytes. The time is that of a point.
// Eigen truncates to integers, which is less work than to round and to saturate.

#include "benchmarks/PointBatches.h"
#include "benchmarks/EigenPoints.h"
#include "benchmarks/WideKernels.h"
#include "benchmarks/peers/Questions.h"

#include <cstring>

namespace ZarnMath::Peers {
namespace {

using namespace Benchmarks;

#if defined(__x86_64__)

/// The kernel written by hand; its points have to be those of the library, bit for bit.
template <typename P>
void AddByHand(Question& question, std::vector<P>& points)
{
    if (!HasWideKernels())
        return;
    auto byHand = MakePoints<P>(points.size());
    auto byLibrary = byHand;
    TransformByHand(TurnMatrix(), byHand.data(), byHand.size());
    TurnMatrix().TransformPoints(byLibrary.data(), byLibrary.size());
    const bool isSame = std::memcmp(byHand.data(), byLibrary.data(), byHand.size() * sizeof(P)) == 0;
    const auto pass = [&points, m = TurnMatrix()] {
        TransformByHand(m, points.data(), points.size());
        benchmark::ClobberMemory();
    };
    question.AddPass("by hand", "AVX2", pass, {{"same bits", isSame ? 1.0 : 0.0}});
}

#else

template <typename P>
void AddByHand(Question& /*question*/, std::vector<P>& /*points*/)
{}

#endif

template <typename P>
void AskForBatch(const std::string& name, std::size_t count)
{
    auto points = MakePoints<P>(count);
    std::vector<P> copy(count);
    Question question(name + ", " + std::to_string(count), count);
    question.AddPass("ZarnMath", "", [&, m = TurnMatrix()] {
        m.TransformPoints(points.data(), points.size());
        benchmark::ClobberMemory();
    });
    question.AddPass("Eigen", "", [&, affine = ToEigen(TurnMatrix())] {
        TransformByEigen(affine, points.data(), points.size());
        benchmark::ClobberMemory();
    });
    AddByHand(question, points);
    question.AddPass("memcpy", "", [&] {
        std::memcpy(copy.data(), points.data(), count * sizeof(P));
        benchmark::ClobberMemory();
    });
    question.Ask();
}

} // namespace

void AskForPointBatches()
{
    for (const std::size_t count : {std::size_t{4096}, std::size_t{4000000}}) {
        AskForBatch<point2d>("points through a matrix", count);
        AskForBatch<POINT>("integer points through a matrix", count);
    }
}

} // namespace ZarnMath::Peers
