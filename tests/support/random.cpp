#include "support/random.hpp"

#include <cstring>

namespace support
{

std::uint64_t Random::next()
{
    std::uint64_t z = state_ += 0x9e3779b97f4a7c15;
    z = (z ^ (z >> 30)) * 0xbf58476d1ce4e5b9;
    z = (z ^ (z >> 27)) * 0x94d049bb133111eb;
    return z ^ (z >> 31);
}

int Random::between(int low, int high)
{
    const auto count = static_cast<std::uint64_t>(static_cast<std::int64_t>(high) - low + 1);
    return static_cast<int>(low + static_cast<std::int64_t>(next() % count));
}

double Random::real(double low, double high)
{
    const double unit = static_cast<double>(next() >> 11) * 0x1p-53;
    return low + unit * (high - low);
}

void Random::fill(std::span<u8> bytes)
{
    while (!bytes.empty()) {
        const std::uint64_t word = next();
        const std::size_t count = std::min(bytes.size(), sizeof word);
        std::memcpy(bytes.data(), &word, count);
        bytes = bytes.subspan(count);
    }
}

std::uint64_t seedOf(std::string_view subject, int number)
{
    std::uint64_t hash = 0xcbf29ce484222325;
    for (const char c : subject) hash = (hash ^ static_cast<unsigned char>(c)) * 0x100000001b3;
    return hash + static_cast<std::uint64_t>(number) * 0x632be59bd9b4e019;
}

} // namespace support
