/// @file
/// The results of catalogued calls, kept.
#pragma once

#include "tests/catalogue/Sink.h"

#include <bit>
#include <cmath>

namespace ZarnMath::Catalogue {

/// One number a result: bits, with one NaN for all.
using Record = std::vector<std::uint64_t>;

class RecordingSink : public Sink
{
public:
    void Number(double value) override
    {
        record.push_back(std::isnan(value) ? ~std::uint64_t{0} : std::bit_cast<std::uint64_t>(value));
    }

    void Single(float value) override
    {
        Number(value);
    }

    void Integer(std::int64_t value) override
    {
        record.push_back(static_cast<std::uint64_t>(value));
    }

    void Flag(bool value) override
    {
        record.push_back(value ? 1 : 0);
    }

    void Size(std::uint64_t size) override
    {
        record.push_back(size);
    }

    void LengthError() override
    {
        record.push_back(~std::uint64_t{1});
    }

    [[nodiscard]] const Record& Taken() const noexcept
    {
        return record;
    }

private:
    Record record;
};

} // namespace ZarnMath::Catalogue
