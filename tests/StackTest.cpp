// How much of a thread's stack the recursive searches take, measured on a stack that was painted before.
#include "ZarnMath/BezierInternal.h"
#include "ZarnMath/BezierOffset.h"
#include "ZarnMath/RootFinder.h"

#include "tests/Random.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstddef>
#include <pthread.h>
#include <vector>

#if defined(__has_feature)
#if __has_feature(address_sanitizer) || __has_feature(thread_sanitizer) || __has_feature(memory_sanitizer)
#define ZARNMATH_HAS_SANITIZER
#endif
#endif
#if defined(__SANITIZE_ADDRESS__) || defined(__SANITIZE_THREAD__)
#define ZARNMATH_HAS_SANITIZER
#endif

namespace ZarnMath {
namespace {

/// What docs/memory.md promises.
constexpr std::size_t mostBytes = 512 * 1024;
/// The same for a search of a curve against itself: nine levels.
constexpr std::size_t mostBytesOfHalving = 16 * 1024;

/// The part of a thread's stack that a call reaches.
class PaintedStack
{
public:
    PaintedStack()
    {
        void* block = nullptr;
        if (posix_memalign(&block, alignment, size) == 0)
            stack = static_cast<unsigned char*>(block);
        std::fill_n(stack, size, paint);
    }

    PaintedStack(const PaintedStack&) = delete;
    PaintedStack& operator=(const PaintedStack&) = delete;

    ~PaintedStack()
    {
        std::free(stack);
    }

    template <typename Call>
    void Run(Call& call)
    {
        pthread_attr_t attributes;
        ASSERT_EQ(pthread_attr_init(&attributes), 0);
        ASSERT_EQ(pthread_attr_setstack(&attributes, stack, size), 0);
        const auto enter = [](void* argument) -> void* {
            (*static_cast<Call*>(argument))();
            return nullptr;
        };
        pthread_t thread;
        ASSERT_EQ(pthread_create(&thread, &attributes, enter, &call), 0);
        ASSERT_EQ(pthread_join(thread, nullptr), 0);
        ASSERT_EQ(pthread_attr_destroy(&attributes), 0);
    }

    /// It grows downward: what was reached lies at the upper end.
    [[nodiscard]] std::size_t Reached() const
    {
        const unsigned char* const begin = stack;
        const unsigned char* const end = begin + size;
        return static_cast<std::size_t>(end - std::find_if(begin, end, [](unsigned char c) { return c != paint; }));
    }

private:
    static constexpr std::size_t alignment = 64 * 1024;
    static constexpr std::size_t size = 1024 * 1024;
    static constexpr unsigned char paint = 0xA5;

    unsigned char* stack = nullptr;
};

/// The bytes of stack below the caller that a call takes.
template <typename Call>
std::size_t StackOf(Call call)
{
    call(); // so that what the loader does once is done
    auto nothing = [] {};
    PaintedStack idle;
    idle.Run(nothing);
    PaintedStack used;
    used.Run(call);
    return used.Reached() - idle.Reached();
}

/// Two roots next to 0 below a huge last ordinate: a cut at the last sign change takes off least, all the way down.
template <int N>
std::size_t StackOfDeepestSearch()
{
    return StackOf([] {
        double c[N + 1]{};
        c[0] = 1e300;
        c[N - 1] = -1.0;
        c[N] = 1e-30;
        double roots[N + 1];
        RootFinder::FindRoots<N>(c, roots, true);
    });
}

class Stack : public testing::Test
{
protected:
    void SetUp() override
    {
#ifdef ZARNMATH_HAS_SANITIZER
        GTEST_SKIP() << "a sanitizer widens every frame";
#endif
    }
};

TEST_F(Stack, PaintShowsWhatACallReaches)
{
    const std::size_t bytes = StackOf([] {
        volatile unsigned char block[100'000];
        for (std::size_t i = 0; i < sizeof block; i += 1000)
            block[i] = 1;
        static_cast<void>(block[0]);
    });
    EXPECT_GT(bytes, 99'000U);
    EXPECT_LT(bytes, 110'000U);
}

TEST_F(Stack, DeepestSearchForRoots)
{
    const std::size_t shallow = StackOfDeepestSearch<3>();
    const std::size_t deep = StackOfDeepestSearch<12>();
    RecordProperty("cubic", static_cast<int>(shallow));
    RecordProperty("degree12", static_cast<int>(deep));
    EXPECT_LE(deep, mostBytes);
    EXPECT_GT(deep, 100'000U); // 416 levels of two polygons each are more than that
    EXPECT_LT(shallow, deep / 4);
}

TEST_F(Stack, CuspsOfACurveThatIsHugeAtItsEnd)
{
    // Straight and of unit speed at the start, it bends away at once: two cusps next to t = 0, and far above them the
    // sixth power of the speed.
    const std::size_t bytes = StackOf([] {
        double parameters[13];
        CubicBezier::FindAllOffsetCusp({1e50, 0.0}, {0.0, 0.0}, {0.0, 1.0}, 1.0, parameters);
    });
    RecordProperty("cusps", static_cast<int>(bytes));
    EXPECT_GT(bytes, 20'000U);
    EXPECT_LE(bytes, mostBytes);
}

TEST_F(Stack, SearchOfACurveAgainstItself)
{
    std::size_t most = 0;
    RandomSource random(20260705);
    for (int i = 0; i < 8; ++i) {
        const Cubic loop = random.Curve(Shape::Loop, 1e5);
        most = std::max(most, StackOf([&loop] {
                            double first;
                            double second;
                            point2d point;
                            CubicBezier::FindBezierSelfIntersection(loop.data(), first, second, point);
                        }));
    }
    RecordProperty("halving", static_cast<int>(most));
    EXPECT_GT(most, 9 * 4 * sizeof(Cubic)); // four halves a level
    EXPECT_LE(most, mostBytesOfHalving);
}

} // namespace
} // namespace ZarnMath
