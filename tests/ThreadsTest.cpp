// What may be done from several threads at once, done at once: the thread sanitizer has to stay silent.
#include "ZarnMath/Bounds.h"
#include "ZarnMath/Random.h"
#include "ZarnMath/TridiagonalMatrix.h"
#include "ZarnMath/VectorField.h"

#include "tests/catalogue/Catalogue.h"
#include "tests/catalogue/OrdinarySource.h"
#include "tests/catalogue/RecordingSink.h"

#include <gtest/gtest.h>

#include <atomic>
#include <thread>

namespace ZarnMath {
namespace {

constexpr int threads = 4;

/// Runs the same work in several threads that start together.
template <typename Work>
void RunTogether(Work work)
{
    std::atomic<int> waiting{threads};
    std::vector<std::thread> running;
    for (int i = 0; i < threads; ++i)
        running.emplace_back([&, i] {
            --waiting;
            while (waiting > 0)
                std::this_thread::yield();
            work(i);
        });
    for (std::thread& thread : running)
        thread.join();
}

VectorField MakeField()
{
    VectorField field;
    field.Initialize(32, 32, -16, -16);
    for (int i = -16; i < 16; ++i)
        field.SetVector(i, -i / 2, {static_cast<float>(i), 1.0F});
    return field;
}

// The two things that are made on first use come first, before any thread has them.

TEST(Threads, DrawAtOnce)
{
    std::atomic<int> outside{0};
    RunTogether([&](int) {
        for (int i = 0; i < 1000; ++i) {
            const int die = Random::Generate(1, 6);
            const double number = Random::Generate(2.0, 3.0);
            if (die < 1 || die > 6 || number < 2.0 || number > 3.0)
                ++outside;
        }
    });
    EXPECT_EQ(outside, 0);
}

TEST(Threads, AskForTheUnitSquareAtOnce)
{
    std::atomic<const BoundsT<double>*> first{nullptr};
    std::atomic<int> different{0};
    RunTogether([&](int) {
        const BoundsT<double>* mine = &IdentityBounds();
        const BoundsT<double>* expected = nullptr;
        if (!first.compare_exchange_strong(expected, mine) && expected != mine)
            ++different;
        if (*mine != BoundsT<double>{0.0, 1.0, 1.0, 0.0})
            ++different;
    });
    EXPECT_EQ(different, 0);
}

TEST(Threads, SampleOneField)
{
    const VectorField field = MakeField();
    const vector2dT<float, false> expected = field.Get({3.5F, -1.25F});
    std::atomic<int> different{0};
    RunTogether([&](int) {
        for (int i = 0; i < 1000; ++i)
            if (field.Get({3.5F, -1.25F}) != expected || field.GetZGIRECT() != RECT{-16, 15, 15, -16})
                ++different;
    });
    EXPECT_EQ(different, 0);
}

TEST(Threads, BlitFromOneField)
{
    const VectorField source = MakeField();
    std::atomic<int> different{0};
    RunTogether([&](int i) {
        VectorField own;
        own.BlitExtend(source, i, -i);
        if (own.GetVector(4 + i, -2 - i) != vector2dT<float, false>{4.0F, 1.0F})
            ++different;
    });
    EXPECT_EQ(different, 0);
}

TEST(Threads, SolveOnOneMatrix)
{
    TridiagonalMatrix matrix;
    for (int i = 0; i < 100; ++i)
        matrix.AddRow(1.0, 4.0, 1.0);
    const std::vector<double> rhs(100, 6.0);
    std::atomic<int> different{0};
    RunTogether([&](int) {
        for (int i = 0; i < 50; ++i)
            for (const double x : matrix.Solve(rhs, true))
                if (!(x > 1.0 - 1e-12 && x < 1.0 + 1e-12))
                    ++different;
    });
    EXPECT_EQ(different, 0);
}

/// What every function of the catalogue says, one after the other.
Catalogue::Record CallAll(const std::vector<Catalogue::Function>& functions)
{
    Catalogue::RecordingSink sink;
    for (const Catalogue::Function& function : functions)
        for (const unsigned firstCall : {0U, 1U, 2U}) {
            Catalogue::OrdinarySource source(firstCall != 2, firstCall);
            (*function.call)(source, sink);
        }
    return sink.Taken();
}

TEST(Threads, CallEveryFunctionAtOnce)
{
    const std::vector<Catalogue::Function> functions = Catalogue::ListFunctions();
    Catalogue::Record records[threads];
    RunTogether([&](int i) { records[i] = CallAll(functions); });
    const Catalogue::Record alone = CallAll(functions);
    EXPECT_GT(alone.size(), functions.size());
    for (const Catalogue::Record& record : records)
        EXPECT_EQ(record, alone);
}

} // namespace
} // namespace ZarnMath
