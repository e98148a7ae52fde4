#include "Numbers.h"
#include "Failure.h"

#include <gtest/gtest.h>

using namespace curvelab;

namespace {

std::string MessageOf(const std::string& text)
{
    try {
        static_cast<void>(ReadNumber("--option", text));
    } catch (const Failure& failure) {
        return failure.what();
    }
    return "";
}

} // namespace

TEST(Numbers, AreReadWhole)
{
    EXPECT_EQ(ReadNumber("--x", "12.5"), 12.5);
    EXPECT_EQ(ReadNumber("--x", "-3e2"), -300.0);
    EXPECT_EQ(ReadNumber("--x", "+.5"), 0.5);
    EXPECT_EQ(ReadNumber("--x", "0.1"), 0.1);
}

TEST(Numbers, WhatIsNoNumberIsNamed)
{
    for (const char* text : {"", "abc", "1.5x", " 1", "1 ", "1,5", "0x10", "--1", "+-1", "++1", "+", "."})
        EXPECT_EQ(MessageOf(text), std::string("--option: \"") + text + "\" is not a number");
}

TEST(Numbers, WhatIsNotFiniteIsNamed)
{
    for (const char* text : {"nan", "NaN", "-nan", "inf", "-inf", "Infinity"})
        EXPECT_EQ(MessageOf(text), std::string("--option: \"") + text + "\" is not a finite number");
    EXPECT_EQ(MessageOf("1e400"), "--option: \"1e400\" is out of the range of numbers");
}

TEST(Numbers, BoundsBelongToTheRange)
{
    EXPECT_EQ(ReadNumberWithin("--x", "0", 0.0, 1.0), 0.0);
    EXPECT_EQ(ReadNumberWithin("--x", "1", 0.0, 1.0), 1.0);
    EXPECT_THROW(static_cast<void>(ReadNumberWithin("--x", "1.0000001", 0.0, 1.0)), Failure);
    EXPECT_THROW(static_cast<void>(ReadNumberWithin("--x", "-1e-300", 0.0, 1.0)), Failure);
    EXPECT_EQ(ReadWhole("--x", "2047", 1, 2047), 2047);
    EXPECT_THROW(static_cast<void>(ReadWhole("--x", "2048", 1, 2047)), Failure);
    EXPECT_THROW(static_cast<void>(ReadWhole("--x", "0", 1, 2047)), Failure);
    EXPECT_THROW(static_cast<void>(ReadWhole("--x", "12.0", 1, 2047)), Failure);
    EXPECT_THROW(static_cast<void>(ReadWhole("--x", "99999999999999999999", 1, 2047)), Failure);
    EXPECT_EQ(ReadNonNegative("--x", "0"), 0.0);
    EXPECT_THROW(static_cast<void>(ReadNonNegative("--x", "-1e-9")), Failure);
}

TEST(Numbers, PointsHaveTwoCoordinates)
{
    const ZarnMath::point2d expected{-1.5, 2e3};
    EXPECT_EQ(ReadPoint("--to", "-1.5,2e3"), expected);
    for (const char* text : {"", "1", "1;2", "1,", ",2", "1,2,3", "nan,0", "0,inf"})
        EXPECT_THROW(static_cast<void>(ReadPoint("--to", text)), Failure) << text;
}

TEST(Numbers, AreWrittenShort)
{
    EXPECT_EQ(FormatNumber(0.0), "0");
    EXPECT_EQ(FormatNumber(100000.0), "100000");
    EXPECT_EQ(FormatNumber(0.25), "0.25");
    EXPECT_EQ(FormatNumber(2.0 / 3.0), "0.666667");
    EXPECT_EQ(FormatNumber(12345.678, 3), "1.23e+04");
}
