/// @file
/// The answer of a call as a reader sees it.
#pragma once

#include "tests/catalogue/Sink.h"

#include <string>

namespace ZarnMath::Degenerate {

/// How much of a number is told.
enum class Detail
{
    Values, ///< four digits, which are the same on every machine
    Classes ///< NaN, an infinity or finite; for an integer whether it is an extreme one
};

/// Collects results: `true`, `false`, a number, `[n]` before the n elements of a vector, and `-` for an output that the
/// call left alone. The returned value comes first.
class AnswerText : public Catalogue::Sink
{
public:
    explicit AnswerText(Detail howMuch) noexcept : detail(howMuch) {}

    void Number(double value) override;
    void Single(float value) override;
    void Integer(std::int64_t value) override;
    void Flag(bool value) override;
    void Size(std::uint64_t size) override;
    void LengthError() override;

    /// All results, with a count where one comes several times in a row. Of a long list the beginning. Classes of numbers
    /// that follow each other are sorted: what counts is how many there are of each.
    [[nodiscard]] std::string Text() const;

private:
    struct Result
    {
        std::string text;
        bool isClass = false;

        bool operator==(const Result&) const = default;
    };

    void Add(std::string text, bool isClass = false);
    [[nodiscard]] std::vector<Result> SortedByClass() const;

    Detail detail;
    std::vector<Result> results;
};

} // namespace ZarnMath::Degenerate
