// Random numbers that are the same on every platform.
#pragma once

#include "pyxcc/types.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace support
{

/// The SplitMix64 generator.
class Random
{
public:
    explicit Random(std::uint64_t seed) : state_(seed) {}

    std::uint64_t next();

    /// Both ends included.
    int between(int low, int high);

    double real(double low, double high);

    bool oneIn(int count) { return between(1, count) == 1; }

    template <class Choices> auto pick(const Choices& choices)
    {
        return choices[between(0, static_cast<int>(std::size(choices)) - 1)];
    }

    void fill(std::span<u8> bytes);

private:
    std::uint64_t state_;
};

/// A seed for the case of that number in a test on that subject.
std::uint64_t seedOf(std::string_view subject, int number);

} // namespace support
