/// @file
/// Results as bytes: the same results give the same bytes on every machine.
#pragma once

#include "tests/catalogue/Sink.h"

#include <cstring>
#include <string>

namespace ZarnMath::Digest {

/// Most significant byte first, and every NaN as one, since processors differ in the sign of 0/0. Integers and sizes take
/// 32 bits, which holds all that the library returns.
class ByteSink final : public Catalogue::Sink
{
public:
    void Number(double value) override
    {
        std::uint64_t bits = 0x7FF8000000000000;
        if (value == value)
            std::memcpy(&bits, &value, sizeof bits);
        Append(bits, 8);
    }

    void Single(float value) override
    {
        std::uint32_t bits = 0x7FC00000;
        if (value == value)
            std::memcpy(&bits, &value, sizeof bits);
        Append(bits, 4);
    }

    void Integer(std::int64_t value) override
    {
        Append(static_cast<std::uint64_t>(value), 4);
    }

    void Flag(bool value) override
    {
        Append(value ? 1 : 0, 1);
    }

    void Size(std::uint64_t size) override
    {
        Append(size, 4);
    }

    void LengthError() override
    {
        Append(0xEE, 1);
    }

    std::string bytes;

private:
    void Append(std::uint64_t value, int size)
    {
        for (int shift = 8 * (size - 1); shift >= 0; shift -= 8)
            bytes.push_back(static_cast<char>(static_cast<unsigned char>(value >> shift)));
    }
};

} // namespace ZarnMath::Digest
