// The reader and the comparison of vectors: what they accept, and that they find what is wrong.
#include "tests/vectors/Table.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <sstream>

namespace ZarnMath::Vectors {

namespace {

constexpr double nan = std::numeric_limits<double>::quiet_NaN();

std::vector<Case> ReadText(const std::string& text)
{
    std::istringstream stream(text);
    return ReadCases(stream);
}

Case CaseOf(const std::string& inputs, const std::string& outputs)
{
    return ReadText("F\t" + inputs + "\t" + outputs).at(0);
}

/// Whether values that a function gave differ from the outputs of a line.
template <typename... T>
bool Differs(const std::string& outputs, const Comparison& comparison, const T&... actual)
{
    Output out;
    out.Add(actual...);
    return FindMismatch(CaseOf("", outputs), out.Values(), comparison).has_value();
}

TEST(VectorReader, TakesALineApart)
{
    const auto cases = ReadText("F<3>(a, b)\td3ff0000000000000 i-7\tf40400000 nan\nG\t\t\n");
    ASSERT_EQ(cases.size(), 2u);
    EXPECT_EQ(cases[0].line, 1);
    EXPECT_EQ(cases[0].name, "F<3>(a, b)");
    EXPECT_EQ(cases[0].inputs.size(), 2u);
    EXPECT_EQ(cases[0].outputs.size(), 2u);
    EXPECT_EQ(cases[1].line, 2);
    EXPECT_TRUE(cases[1].inputs.empty());
    EXPECT_TRUE(cases[1].outputs.empty());
}

TEST(VectorReader, ReadsEachKindOfValue)
{
    Input in(CaseOf("d3ff8000000000000 f40400000 i-7 i4294967295 i18446744073709551615 i1 nan nan", "").inputs);
    EXPECT_EQ(in.Get<double>(), 1.5);
    EXPECT_EQ(in.Get<float>(), 3.0f);
    EXPECT_EQ(in.Get<int>(), -7);
    EXPECT_EQ(in.Get<std::uint32_t>(), 4294967295u);
    EXPECT_EQ(in.Get<std::uint64_t>(), 18446744073709551615u);
    EXPECT_TRUE(in.Get<bool>());
    EXPECT_TRUE(std::isnan(in.Get<double>()));
    EXPECT_TRUE(std::isnan(in.Get<float>()));
    EXPECT_NO_THROW(in.ExpectEnd());
}

TEST(VectorReader, ReadsCompoundValuesInFieldOrder)
{
    Input in(CaseOf("i1 i2 i3 i4 d3ff0000000000000 d4000000000000000 i2 i5 i6", "").inputs);
    EXPECT_EQ(in.Get<RECT>(), (RECT{1, 2, 3, 4}));
    EXPECT_EQ(in.Get<point2d>(), (point2d{1.0, 2.0}));
    EXPECT_EQ(in.GetVector<int>(), (std::vector<int>{5, 6}));
}

TEST(VectorReader, RejectsMalformedLines)
{
    const std::string lines[] = {
        "F\td3ff0000000000000",       // no outputs
        "F\t\t\t",                    // a field too many
        "\t\t",                       // no name
        "",                           // nothing
        "F\td3ff\t",                  // a double of four digits
        "F\td3ff00000000000000\t",    // of seventeen
        "F\td3ff000000000000g\t",     // a letter that is no digit
        "F\tf4040000\t",              // a float of seven digits
        "F\ti\t",                     // no digits
        "F\ti1.5\t",                  // no integer
        "F\ti18446744073709551616\t", // beyond 64 bits
        "F\tx1\t",                    // no such type
        "F\ti1  i2\t",                // two blanks
        "F\ti1 \t",                   // a blank at the end
        "F\tNaN\t",                   // another spelling
    };
    for (const std::string& line : lines)
        EXPECT_THROW(ReadText("G\ti1\ti1\n" + line + "\n"), Malformed) << line;
}

TEST(VectorReader, NamesTheLineOfAMalformedValue)
{
    try {
        ReadText("F\ti1\ti1\nF\ti1\tq\n");
        FAIL() << "nothing was thrown";
    } catch (const Malformed& trouble) {
        EXPECT_NE(std::string(trouble.what()).find("line 2"), std::string::npos) << trouble.what();
    }
}

TEST(VectorInput, RejectsAnotherType)
{
    const auto read = [](const std::string& value, auto type) {
        Input in(CaseOf(value, "").inputs);
        return in.Get<decltype(type)>();
    };
    EXPECT_THROW(read("i1", 0.0), Malformed);
    EXPECT_THROW(read("f3f800000", 0.0), Malformed);
    EXPECT_THROW(read("d3ff0000000000000", 0.0f), Malformed);
    EXPECT_THROW(read("d3ff0000000000000", 0), Malformed);
    EXPECT_THROW(read("nan", 0), Malformed);
    EXPECT_THROW(read("i2147483648", std::int32_t{}), Malformed);
    EXPECT_THROW(read("i-1", std::uint32_t{}), Malformed);
    EXPECT_THROW(read("i2", false), Malformed);
    EXPECT_THROW(read("i-1", false), Malformed);
}

TEST(VectorInput, IsTakenWhole)
{
    const Case recorded = CaseOf("i1 i2", "i3");
    const auto addTwo = [](Input& in, Output& out) { out.Add(in.Get<int>() + in.Get<int>()); };
    const auto takeOne = [](Input& in, Output& out) { out.Add(in.Get<int>() + 2); };
    const auto takeThree = [](Input& in, Output& out) { out.Add(in.Get<int>() + in.Get<int>() + in.Get<int>()); };
    EXPECT_EQ(RunCase(recorded, addTwo, {}), std::nullopt);
    EXPECT_NE(RunCase(recorded, takeOne, {}), std::nullopt);
    EXPECT_NE(RunCase(recorded, takeThree, {}), std::nullopt);
}

TEST(VectorComparison, FindsASingleWrongBit)
{
    EXPECT_FALSE(Differs("d3ff0000000000000", {}, 1.0));
    EXPECT_TRUE(Differs("d3ff0000000000000", {}, std::nextafter(1.0, 2.0)));
    EXPECT_FALSE(Differs("f3f800000", {}, 1.0f));
    EXPECT_TRUE(Differs("f3f800000", {}, std::nextafter(1.0f, 2.0f)));
    EXPECT_FALSE(Differs("i5", {}, 5));
    EXPECT_TRUE(Differs("i5", {}, 4));
}

TEST(VectorComparison, TellsTypesApart)
{
    EXPECT_TRUE(Differs("i1", {}, 1.0));
    EXPECT_TRUE(Differs("d3ff0000000000000", {}, 1.0f));
    EXPECT_TRUE(Differs("f3f800000", {}, 1.0));
}

TEST(VectorComparison, TakesAnyNaNForAnyOther)
{
    EXPECT_FALSE(Differs("nan", {}, nan));
    EXPECT_FALSE(Differs("nan", {}, -nan));
    EXPECT_FALSE(Differs("nan", {}, std::numeric_limits<float>::quiet_NaN()));
    EXPECT_FALSE(Differs("d7ff8000000000000", {}, -nan));
    EXPECT_TRUE(Differs("nan", {}, 1.0));
    EXPECT_TRUE(Differs("nan", {}, 1));
    EXPECT_TRUE(Differs("d3ff0000000000000", {}, nan));
}

TEST(VectorComparison, CountsTheSignOfAZeroUnlessToldNotTo)
{
    const Comparison withoutSign{false, 0};
    EXPECT_TRUE(Differs("d0000000000000000", {}, -0.0));
    EXPECT_TRUE(Differs("d8000000000000000", {}, 0.0));
    EXPECT_FALSE(Differs("d8000000000000000", {}, -0.0));
    EXPECT_FALSE(Differs("d0000000000000000", withoutSign, -0.0));
    EXPECT_FALSE(Differs("f80000000", withoutSign, 0.0f));
    EXPECT_TRUE(Differs("d3ff0000000000000", withoutSign, -1.0));
    EXPECT_TRUE(Differs("d0000000000000000", withoutSign, 5e-324));
}

TEST(VectorComparison, FindsMissingAndSurplusOutputs)
{
    EXPECT_FALSE(Differs("i1 i2", {}, 1, 2));
    EXPECT_TRUE(Differs("i1 i2", {}, 1));
    EXPECT_TRUE(Differs("i1 i2", {}, 1, 2, 3));
    EXPECT_TRUE(Differs("", {}, 1));
    EXPECT_FALSE(Differs("", {}));
}

TEST(VectorComparison, SaysWhichOutputDiffers)
{
    Output out;
    out.Add(1, 2.5);
    const auto mismatch = FindMismatch(CaseOf("", "i1 d4008000000000000"), out.Values(), {});
    ASSERT_TRUE(mismatch.has_value());
    EXPECT_EQ(*mismatch, "output 1 of 2: expected d4008000000000000 (3), got d4004000000000000 (2.5)");
}

TEST(VectorComparison, AllowsUnitsInTheLastPlaceWhereAsked)
{
    const Comparison fourUnits{true, 4};
    const double unit = std::numeric_limits<double>::epsilon();
    EXPECT_FALSE(Differs("d3ff0000000000000", fourUnits, 1.0 + 4.0 * unit));
    EXPECT_TRUE(Differs("d3ff0000000000000", fourUnits, 1.0 + 5.0 * unit));
    EXPECT_FALSE(Differs("f3f800000", fourUnits, 1.0f + 4.0f * std::numeric_limits<float>::epsilon()));
    EXPECT_TRUE(Differs("f3f800000", fourUnits, 1.0f + 5.0f * std::numeric_limits<float>::epsilon()));
    EXPECT_FALSE(Differs("d0000000000000000", fourUnits, -0.0));
    EXPECT_TRUE(Differs("d3ff0000000000000", fourUnits, nan));
    EXPECT_TRUE(Differs("d7ff0000000000000", fourUnits, std::numeric_limits<double>::max()));
    // Next to a large number a small one carries that one's rounding.
    EXPECT_FALSE(Differs("d4130000000000000 d3ff0000000000000", fourUnits, 1048576.0, 1.0 + 1048576.0 * unit));
}

TEST(VectorComparison, AllowsNoOtherTruthValueWhereUnitsAreAllowed)
{
    const Comparison fourUnits{true, 4};
    EXPECT_TRUE(Differs("i1", fourUnits, 0));
    EXPECT_TRUE(Differs("i0", fourUnits, 1));
    EXPECT_FALSE(Differs("i45000000", fourUnits, 44999999));
    EXPECT_TRUE(Differs("i45000000", fourUnits, 44999998));
}

/// A table of which `rotate` goes through a sine that is one unit off, and `scale` through nothing.
Table TableWithInexactSine()
{
    Table table;
    const auto sine = [](double x) { return std::nextafter(x, 2.0); };
    table.Add("sin", [sine](Input& in, Output& out) { out.Add(sine(in.Get<double>())); }, {Platform::Sin});
    table.Add("cos", [](Input& in, Output& out) { out.Add(in.Get<double>()); }, {Platform::Cos});
    table.Add("rotate", [sine](Input& in, Output& out) { out.Add(sine(in.Get<double>())); }, {Platform::Sin});
    table.Add("scale", [](Input& in, Output& out) { out.Add(in.Get<double>()); });
    return table;
}

TEST(VectorPlatform, FindsTheFunctionsThatDiffer)
{
    const auto cases = ReadText("sin\td3ff0000000000000\td3ff0000000000000\n"
                                "cos\td3ff0000000000000\td3ff0000000000000\n");
    EXPECT_EQ(FindDifferingFunctions(cases, TableWithInexactSine()), std::set<Platform>{Platform::Sin});
}

TEST(VectorPlatform, LoosensOnlyWhatUsesADifferingFunction)
{
    const Table table = TableWithInexactSine();
    const Case rotated = ReadText("rotate\td3ff0000000000000\td3ff0000000000000").at(0);
    const Table::Entry& rotate = *table.Find("rotate");
    const Table::Entry& scale = *table.Find("scale");
    const std::set<Platform> differing = {Platform::Sin};
    EXPECT_NE(RunCase(rotated, rotate.adapter, ComparisonFor(rotate, {}, true)), std::nullopt);
    EXPECT_EQ(RunCase(rotated, rotate.adapter, ComparisonFor(rotate, differing, true)), std::nullopt);
    EXPECT_GT(ComparisonFor(rotate, differing, true).units, 0);
    EXPECT_EQ(ComparisonFor(scale, differing, true).units, 0);
}

TEST(VectorTable, TakesOneAdapterAName)
{
    Table table;
    const auto adapter = [](Input&, Output&) {};
    table.Add("F", adapter);
    EXPECT_THROW(table.Add("F", adapter), std::logic_error);
    EXPECT_NE(table.Find("F"), nullptr);
    EXPECT_EQ(table.Find("G"), nullptr);
}

} // namespace

} // namespace ZarnMath::Vectors
