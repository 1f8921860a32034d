// The rounding mode of the vector float unit, saved and restored.
#include "frame/rounding_mode.hpp"

#include <gtest/gtest.h>
#include <immintrin.h>

#include <array>
#include <thread>

using namespace pyxcc::frame;

namespace
{

constexpr u32 exceptionFlags = 0x3f; ///< which operations may raise at any time
constexpr u32 flushToZero = 0x8000;
constexpr std::array<u32, 4> modes = {0x0000, 0x2000, 0x4000, 0x6000}; ///< nearest, down, up, towards zero

u32 word() { return _mm_getcsr() & ~exceptionFlags; }

int toInteger(float value)
{
    const volatile float hidden = value; // no conversion at compile time
    return _mm_cvtss_si32(_mm_set_ss(hidden));
}

class RoundMode : public testing::Test
{
protected:
    ~RoundMode() override { _mm_setcsr(before_); }

private:
    u32 before_ = _mm_getcsr();
};

TEST_F(RoundMode, SetsTheFieldAndNothingElse)
{
    for (const u32 other : {0U, flushToZero}) {
        for (const u32 from : modes) {
            for (const u32 to : modes) {
                const u32 start = (_mm_getcsr() & ~(roundingField | flushToZero)) | from | other;
                _mm_setcsr(start);
                EXPECT_EQ(saveRoundMode(to), start);
                EXPECT_EQ(word(), ((start & ~roundingField) | to) & ~exceptionFlags);
            }
        }
    }
}

TEST_F(RoundMode, RestoresTheWordThatWasSaved)
{
    for (const u32 from : modes) {
        for (const u32 to : modes) {
            _mm_setcsr((_mm_getcsr() & ~roundingField) | from);
            const u32 start = word();
            restoreRoundMode(saveRoundMode(to));
            EXPECT_EQ(word(), start);
        }
    }
}

TEST_F(RoundMode, DecidesHowFloatsBecomeIntegers)
{
    const std::array<std::array<int, 2>, 4> expected = {{{2, -2}, {2, -3}, {3, -2}, {2, -2}}};
    for (std::size_t i = 0; i < modes.size(); ++i) {
        saveRoundMode(modes[i]);
        EXPECT_EQ(toInteger(2.5F), expected[i][0]) << i;
        EXPECT_EQ(toInteger(-2.5F), expected[i][1]) << i;
    }
    saveRoundMode(roundNearest);
    EXPECT_EQ(toInteger(0.5F), 0);
    EXPECT_EQ(toInteger(1.5F), 2);
}

TEST_F(RoundMode, BelongsToTheThread)
{
    saveRoundMode(modes[1]);
    std::jthread([] { saveRoundMode(modes[2]); }).join();
    EXPECT_EQ(word() & roundingField, modes[1]);
}

} // namespace
