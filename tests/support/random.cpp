#include "support/random.hpp"

#include <algorithm>
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

/// A number of so many bytes of the script, or one of the generator.
std::uint64_t Random::choose(int byteCount)
{
    if (script_.empty()) return next();
    std::uint64_t number = 0;
    for (; byteCount > 0 && !script_.empty(); --byteCount) {
        number = number << 8 | script_.front();
        script_ = script_.subspan(1);
    }
    return number;
}

int Random::between(int low, int high)
{
    const auto count = static_cast<std::uint64_t>(static_cast<std::int64_t>(high) - low + 1);
    const std::uint64_t number = choose(count <= 0x100 ? 1 : count <= 0x10000 ? 2 : 4);
    return static_cast<int>(low + static_cast<std::int64_t>(number % count));
}

double Random::real(double low, double high)
{
    const bool scripted = !script_.empty();
    const std::uint64_t number = choose(3);
    const double unit = scripted ? static_cast<double>(number) / 0xffffff : static_cast<double>(number >> 11) * 0x1p-53;
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

void Random::read(std::span<u8> bytes)
{
    const std::size_t count = std::min(bytes.size(), script_.size());
    std::copy_n(script_.begin(), count, bytes.begin());
    script_ = script_.subspan(count);
    fill(bytes.subspan(count));
}

std::uint64_t seedOf(std::string_view subject, int number)
{
    std::uint64_t hash = 0xcbf29ce484222325;
    for (const char c : subject) hash = (hash ^ static_cast<unsigned char>(c)) * 0x100000001b3;
    return hash + static_cast<std::uint64_t>(number) * 0x632be59bd9b4e019;
}

} // namespace support
