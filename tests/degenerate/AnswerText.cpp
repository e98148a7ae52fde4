#include "tests/degenerate/AnswerText.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <limits>
#include <utility>

namespace ZarnMath::Degenerate {

namespace {

constexpr const char* untouched = "-";

/// Where a result is zero but for rounding, its digits are noise.
constexpr double noise = 1e-9;

std::string FourDigits(double value)
{
    if (value == 0.0)
        return "0";
    if (std::fabs(value) < noise)
        return "~0";
    char digits[32];
    std::snprintf(digits, sizeof digits, "%.4g", value);
    return digits;
}

std::string ClassOf(std::int64_t value)
{
    if (value == std::numeric_limits<std::int32_t>::min())
        return "least";
    if (value == std::numeric_limits<std::int32_t>::max())
        return "greatest";
    return "integer";
}

} // namespace

void AnswerText::Add(std::string text, bool isClass)
{
    results.push_back({std::move(text), isClass && detail == Detail::Classes});
}

void AnswerText::Number(double value)
{
    if (value == Catalogue::unwrittenNumber)
        Add(untouched, true);
    else if (std::isnan(value))
        Add("NaN", true);
    else if (std::isinf(value))
        Add(value > 0.0 ? "inf" : "-inf", true);
    else
        Add(detail == Detail::Values ? FourDigits(value) : "finite", true);
}

void AnswerText::Single(float value)
{
    Number(double{value});
}

/// The first one is a count or a choice, which is told as it is.
void AnswerText::Integer(std::int64_t value)
{
    if (value == Catalogue::unwrittenInteger)
        Add(untouched, true);
    else if (detail == Detail::Values || results.empty())
        Add(std::to_string(value));
    else
        Add(ClassOf(value), true);
}

void AnswerText::Flag(bool value)
{
    Add(value ? "true" : "false");
}

void AnswerText::Size(std::uint64_t size)
{
    Add("[" + std::to_string(size) + "]");
}

void AnswerText::LengthError()
{
    Add("length error");
}

std::vector<AnswerText::Result> AnswerText::SortedByClass() const
{
    std::vector<Result> sorted = results;
    for (auto begin = sorted.begin(); begin != sorted.end();) {
        const auto end = std::find_if_not(begin, sorted.end(), [](const Result& result) { return result.isClass; });
        std::sort(begin, end, [](const Result& a, const Result& b) { return a.text < b.text; });
        begin = end == sorted.end() ? end : end + 1;
    }
    return sorted;
}

std::string AnswerText::Text() const
{
    constexpr std::size_t mostRuns = 14;
    const std::vector<Result> sorted = SortedByClass();
    std::string text;
    std::size_t runs = 0;
    for (auto begin = sorted.begin(); begin != sorted.end(); ++runs) {
        if (runs == mostRuns)
            return text + " ...";
        const auto end = std::find_if(begin, sorted.end(), [begin](const Result& result) { return result != *begin; });
        const auto count = end - begin;
        text += (text.empty() ? "" : " ") + begin->text + (count > 1 ? " x" + std::to_string(count) : "");
        begin = end;
    }
    return text.empty() ? "nothing" : text;
}

} // namespace ZarnMath::Degenerate
