// Random numbers that are the same on every platform.
#pragma once

#include "pyxcc/types.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace support
{

/// The SplitMix64 generator. Choices are made by the bytes of a script first, as long as there are any.
class Random
{
public:
    explicit Random(std::uint64_t seed, std::span<const u8> script = {}) : state_(seed), script_(script) {}

    std::uint64_t next();

    /// Both ends included.
    int between(int low, int high);

    double real(double low, double high);

    bool oneIn(int count) { return between(1, count) == 1; }

    template <class Choices> auto pick(const Choices& choices)
    {
        return choices[between(0, static_cast<int>(std::size(choices)) - 1)];
    }

    /// Any bytes, none of which is of the script.
    void fill(std::span<u8> bytes);

    /// Bytes of the script, and then any.
    void read(std::span<u8> bytes);

    /// What is left of the script.
    std::span<const u8> script() const { return script_; }

private:
    std::uint64_t choose(int byteCount);

    std::uint64_t state_;
    std::span<const u8> script_;
};

/// A seed for the case of that number in a test on that subject.
std::uint64_t seedOf(std::string_view subject, int number);

} // namespace support
