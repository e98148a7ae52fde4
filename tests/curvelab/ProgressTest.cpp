#include "Progress.h"

#include <gtest/gtest.h>
#include <sstream>

using curvelab::Progress;

TEST(Progress, AQuickRunSaysNothing)
{
    std::ostringstream out;
    double now = 100.0;
    {
        Progress progress(out, true, [&] { return now; });
        progress.Begin("flattening", 3);
        for (int i = 0; i < 3; ++i) {
            now += 0.3;
            progress.Step();
        }
    }
    EXPECT_EQ(out.str(), "");
}

TEST(Progress, ALongRunSaysHowFarItIs)
{
    std::ostringstream out;
    double now = 100.0;
    Progress progress(out, false, [&] { return now; });
    progress.Begin("flattening", 40);
    for (int i = 0; i < 4; ++i) {
        now += 0.4;
        progress.Step();
    }
    EXPECT_EQ(out.str(), "curvelab: flattening, 3 of 40 curves\n");
    now += 5.5;
    progress.Step();
    EXPECT_EQ(out.str(), "curvelab: flattening, 3 of 40 curves\ncurvelab: flattening, 5 of 40 curves\n");
}

TEST(Progress, OnATerminalOneLineIsRewrittenAndEnded)
{
    std::ostringstream out;
    double now = 0.0;
    {
        Progress progress(out, true, [&] { return now; });
        progress.Begin("splitting", 9);
        for (int i = 0; i < 2; ++i) {
            now += 1.1;
            progress.Step();
        }
    }
    EXPECT_EQ(out.str(), "\rcurvelab: splitting, 1 of 9 curves\rcurvelab: splitting, 2 of 9 curves\n");
}
